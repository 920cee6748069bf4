#pragma once

#include <QByteArray>
#include <QString>

// The spellings of a key combination, in one place:
// - the file form, as the hotkeys file holds it: "Ctrl|Alt|t", "None|F5", "None|None0" for a
//   keyless command (a placeholder);
// - the stored form, QKeySequence portable text, as the editor shows and records it: "Ctrl+Alt+T";
// - the X key-string form of the key server, joined by "+": "Ctrl+Alt+t";
// - the typed form, as a user writes it: any of the above, modifiers in any order.
// Two file keys name one key when their modifiers are the same and their key names, read
// ignoring ASCII letter case, name the same keysym (keyIdentity).

// X key-string form ("Ctrl+Alt+T") to the key of a file entry ("Ctrl|Alt|t", "None|F5").
QString toFileKey(const QString& keyString);
// The key of a file entry to the stored key (QKeySequence portable text); empty for the
// placeholder keys of keyless commands. Text that cannot be converted is kept as it is, and
// `readable` (when given) says whether the key server could read it.
QString fromFileKey(const QString& fileKey, bool* readable = nullptr);
// The file key a stored key is written under: its first key as the key server names it, or the
// stored text itself when the key server cannot name it.
QString fileKeyOf(const QString& storedKey);
// The file key a typed key names, written with X's name of the keysym asked for; empty when the
// text names no key. "|" and "+" after a separator, or alone, are the key itself.
QByteArray fileKeyFromTyped(const QString& text);
// The stored key a typed key names; empty when it names none.
QString keyFromUserText(const QString& text);

// What the window manager compares of a file key: its modifiers and keysym ("k:..."); for a key
// that names no keysym, its text without letter case ("t:..."); for a placeholder or no key,
// its text too ("p:..."), as no two keyless entries are one key.
QByteArray keyIdentity(const QByteArray& fileKey);
// Whether the identity is that of a real key, not of a placeholder.
bool isKeyIdentity(const QByteArray& identity);

// A key or value without its enclosing double quotes; text that does not both begin and end
// with one is taken whole, so an unclosed quote loses nothing.
QString unquoted(const QString& text);
QByteArray unquoted(const QByteArray& text);
// Whether a key of the editor's making reads back as written: not empty, on one line, no "=",
// no blank at either end, and not looking like a comment, a section or a quoted key.
bool isWritableFileKey(const QByteArray& key);
// Whether the stored key is written under a file key that reads back as the same key. Not so
// for a few keys the key server cannot name (a keypad "|" would be written "Num||").
bool readsBackAsWritten(const QString& storedKey);
// ASCII letters lower-cased, as the file compares keys.
QByteArray foldedKey(const QByteArray& key);
