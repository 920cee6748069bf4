#pragma once

#include <string>

// Which well-known directory GetZemDir() answers for.
enum ZemDir {
    ZEM_SYSTEM_CONFIG_DIR = 0, // system-wide configuration, holds the system hotkeys file
    ZEM_USER_CONFIG_DIR = 2,   // the user's configuration, holds the user's hotkeys file
};

// Which session's configuration suffix zemSessionConfigSuffix() answers for.
enum WhatZemSession {
    ZEM_CURRENT_SESSION = 0,
};

// Names the application and organisation (so that QSettings() finds the editor's own store),
// sets the version and desktop entry name, and installs the translations for the current locale.
// Call once, after the application object exists.
void zemInit(const char* version, const char* displayName);
// The translations for the current locale, Qt's and the programs' own, found beside the
// installed program; zemInit installs them, a program without widgets calls this alone.
void zemInstallTranslations();

// A UTF-8 path without a trailing "/". The user's directory is created when it is missing,
// so that the first start of a new account can write its hotkeys file there.
const std::string& GetZemDir(ZemDir which);

// Appended to configuration file names; empty unless the session asks for its own files.
std::string zemSessionConfigSuffix(WhatZemSession which);
