#pragma once

#include <QByteArray>
#include <QString>

// The one section of a hotkeys file.
inline constexpr char hotkeysSection[] = "ShortCutKeys";
// What a newly created hotkeys file holds.
inline constexpr char emptyHotkeysFile[] = "[ShortCutKeys]\n";
// Larger files are no hotkeys files; refusing them early keeps a stray path from eating memory.
inline constexpr qint64 largestHotkeysFile = 16 * 1024 * 1024;

// The user's own hotkeys file, which is shown merged with the system one.
QString userHotkeysFilePath();
// The system-wide hotkeys file that supplies every user's defaults.
QString systemHotkeysFilePath();

// Why a command line cannot be bound: it is empty or blank, or holds a control character (which
// the file cannot hold, or which would reach a terminal); empty when it can be.
QString commandProblem(const QString& command);
// The text with every control character (Unicode class Cc, U+2028 and U+2029) written as \xNN
// or \u{NNNN}, so that what a file holds cannot drive a terminal it is printed to.
QString printableText(const QString& text);

// The one line that tells the window manager to read the file again, carrying the path's bytes
// exactly; empty, with the reason, when the path holds control characters (a line break would
// start a command of its own), cannot be carried as the bytes it names, or would make the line
// longer than the window manager takes.
QByteArray reloadCommandFor(const QString& path, QString* reason);
// Whether a file name survives the trip to bytes and back: names that are not valid in the
// locale's encoding cannot be opened as given.
bool isFaithfulFileName(const QByteArray& name);

// Reads a whole hotkeys file; refuses anything but a regular file of at most
// largestHotkeysFile bytes without NUL bytes, before reading it whole. On failure `reason`
// says why, in the system's words where it has them.
bool readHotkeysFile(const QString& path, QByteArray* bytes, QString* reason);
