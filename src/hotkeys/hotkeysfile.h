#pragma once

#include <QString>

// The one section of a hotkeys file.
inline constexpr char hotkeysSection[] = "ShortCutKeys";
// What a newly created hotkeys file holds.
inline constexpr char emptyHotkeysFile[] = "[ShortCutKeys]\n";

// The user's own hotkeys file, which is shown merged with the system one.
QString userHotkeysFilePath();
// The system-wide hotkeys file that supplies every user's defaults.
QString systemHotkeysFilePath();

// X key-string form ("Ctrl+Alt+T") to the key of a file entry ("Ctrl|Alt|t", "None|F5").
QString toFileKey(const QString& keyString);
// The key of a file entry to the stored key (QKeySequence portable text); empty for the
// placeholder keys of keyless commands. Text that cannot be converted is kept as it is.
QString fromFileKey(const QString& fileKey);
