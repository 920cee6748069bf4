#pragma once

#include <QStringList>

class QTextStream;

// The administrator's command line, zem-hotkeys: lists, checks, sets and unsets bindings of a
// hotkeys file and hands it to the window manager, with the editor's own rules for reading
// and writing files. Runs one command and gives its exit status; what it says goes to `out`
// and `err`. What scripts read (list fields, "error:", "warning:", JSON) is never translated.
int runHotkeysCommand(const QStringList& arguments, QTextStream& out, QTextStream& err);

// Exit statuses beside 0.
enum HotkeysCommandStatus {
    CheckWarnings = 1, // check: warnings only
    Failed = 2,        // check: errors; any other command: it could not be done
    KeyTaken = 3,      // set: another binding holds the key
    UsageError = 64,
};
