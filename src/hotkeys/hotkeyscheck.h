#pragma once

#include <QString>
#include <QVector>

// One thing worth telling about a line of a hotkeys file (line 0: the file as a whole).
struct Finding
{
    QString path;
    int line = 0;
    bool error = false; // an error, else a warning
    QString code;       // what kind of finding, in words scripts may rely on: "duplicate-key"...
    QString text;       // the finding in the user's words, control characters escaped
};

// What is worth telling about a hotkeys file: a file that cannot be read or holds no
// [ShortCutKeys] section, a key that cannot be read, a function the window manager does not
// have (errors); a line of a key that does not count, a command whose program is not installed,
// a single character without Ctrl, Alt or Meta (warnings). In the order of the lines.
QVector<Finding> checkHotkeysFile(const QString& path);
