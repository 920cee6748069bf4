#pragma once

#include "hotkeyslines.h"

#include <QByteArray>
#include <QHash>
#include <QVector>

// One key of a file's [ShortCutKeys] section, however many lines name it.
struct KeyEntry
{
    QByteArray identity; // keyIdentity of the key
    QByteArray key;      // the key as the reader gives it: the spelling its text was first met in
    QByteArray value;    // the value that counts
    int counting = -1;   // the line that counts (index into lines()); -1 if the lines lack it
    QVector<int> others; // the lines of the same key that do not count, in file order
};

// The entries of a hotkeys file as the loader takes them, one per key: of lines with the same
// key text (ASCII letter case ignored) the last counts, with its value; of several spellings of
// one key (F5 and None|F5, Prior and Page_Up) the first the loader meets, in the reader's order
// of key texts. Lines stay where they are in lines(), for writing back and for messages.
class HotkeysEntries
{
public:
    // False when the bytes hold no [ShortCutKeys] section.
    bool read(const QByteArray& bytes);

    const HotkeysLines& lines() const { return lineModel; }
    const QByteArray& bytes() const { return lineModel.bytes(); }
    // In the order the loader meets them.
    const QVector<KeyEntry>& entries() const { return keys; }
    // The entry of a key identity; null when the file does not name that key.
    const KeyEntry* find(const QByteArray& identity) const;

private:
    HotkeysLines lineModel{QByteArray()};
    QVector<KeyEntry> keys;
    QHash<QByteArray, int> index; // identity -> entry
};
