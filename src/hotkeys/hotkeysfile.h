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

// X key-string form ("Ctrl+Alt+T") to the key of a file entry ("Ctrl|Alt|t", "None|F5").
QString toFileKey(const QString& keyString);
// The key of a file entry to the stored key (QKeySequence portable text); empty for the
// placeholder keys of keyless commands. Text that cannot be converted is kept as it is, and
// `readable` (when given) says whether the key server could read it.
QString fromFileKey(const QString& fileKey, bool* readable = nullptr);
// The file key a stored key is written under: its first key as the key server names it, or the
// stored text itself when the key server cannot name it.
QString fileKeyOf(const QString& storedKey);
// A key or value without its enclosing double quotes; text that does not both begin and end
// with one is taken whole, so an unclosed quote loses nothing.
QString unquoted(const QString& text);
// Whether a key of the editor's making reads back as written: not empty, on one line, no "=",
// no blank at either end, and not looking like a comment, a section or a quoted key.
bool isWritableFileKey(const QByteArray& key);
// Whether the stored key is written under a file key that reads back as the same file key. Not
// so for a few keys the key server cannot name (a keypad "|" would be written "Num||").
bool readsBackAsWritten(const QString& storedKey);
// ASCII letters lower-cased, as the file compares keys.
QByteArray foldedKey(const QByteArray& key);

// The one line that tells the window manager to read the file again; empty when the path holds
// control characters (a line break would start a command of its own) or the line would be
// longer than the window manager takes.
QByteArray reloadCommandFor(const QString& path);

// Reads a whole hotkeys file; refuses anything but a regular file of at most
// largestHotkeysFile bytes without NUL bytes, before reading it whole. On failure `reason`
// says why, in the system's words where it has them.
bool readHotkeysFile(const QString& path, QByteArray* bytes, QString* reason);

// Replaces the file with the bytes, or leaves it exactly as it was: the bytes go to a new file
// beside it, every write, the flush to disk and the close are checked, and only then does the
// new file take the old one's name. Permissions and owner are kept; a symbolic link stays a
// link and its target is replaced. On failure `reason` says why, in the system's words.
bool writeFileSafely(const QString& path, const QByteArray& bytes, QString* reason);
