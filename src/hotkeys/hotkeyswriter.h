#pragma once

#include "hotkeysmodel.h"
#include "hotkeyspatch.h"

#include <QHash>
#include <QVector>

// Writing: what a model's bindings want the file to hold, one entry per key (the rows, then the
// disabled keys, then what was read but not shown), with the reasons an entry cannot be
// written; the patch then changes only the lines whose meaning changed.
class HotkeysWriter
{
public:
    explicit HotkeysWriter(HotkeysModel* model);

    // Keyless commands are given placeholder keys first (only the user's rows when userFile).
    bool write(bool userFile, QByteArray* bytes, QString* reason);

private:
    void assignPlaceholders(bool userFile);
    void want(const QByteArray& fileKey, const WantedEntry& entry, bool replace);
    WantedEntry wantedOf(const Binding& row) const;

    HotkeysModel* model;
    QVector<QByteArray> order;
    QHash<QByteArray, WantedEntry> wanted;
};
