#pragma once

#include <QByteArray>
#include <QHash>
#include <QSet>
#include <QString>
#include <QVector>

class HotkeysEntries;

// One entry a file is to hold, as the bindings want it.
struct WantedEntry
{
    QByteArray key;
    QByteArray value;
    int rank = -1;        // where a new line goes: catalogue order, commands, disabled keys; -1 none
    QString keyProblem;   // why the key cannot start a new line; empty when it can
    QString valueProblem; // why the value cannot be written; empty when it can
    int fromLine = -1;    // the line of the file read that the binding was read from
};

// Writes what the bindings want into the file they were read from, changing only the lines of
// the keys whose meaning changed: a key's line that counts is rewritten in place and its other
// lines go; a key no longer wanted loses its lines; a binding given a key the file does not hold
// keeps its own line; any other new key gets a new line among the entries of its rank.
// Everything else comes back byte for byte.
class HotkeysPatch
{
public:
    HotkeysPatch(const HotkeysEntries& file, const QVector<QByteArray>& order,
                 const QHash<QByteArray, WantedEntry>& wanted);

    // False, with the reason, when a line that must be written cannot be.
    bool apply(QByteArray* bytes, QString* reason);

    // Where a new line goes among the section's entries, from its value.
    static int rankOf(const QByteArray& value);

private:
    bool plan(QString* reason);
    // Each new line with the line it follows (a section header when none precedes it).
    QHash<int, QVector<const WantedEntry*>> placeNewLines() const;
    QByteArray render(const QHash<int, QVector<const WantedEntry*>>& following) const;

    const HotkeysEntries& file;
    const QVector<QByteArray>& order;
    const QHash<QByteArray, WantedEntry>& wanted;
    QSet<int> removed;
    QHash<int, QByteArray> rewritten;       // lines with a new value
    QHash<int, const WantedEntry*> rekeyed; // lines with a new key and value
    QVector<const WantedEntry*> added;
};
