#pragma once

#include "hotkeysmodel.h"

#include <QHash>
#include <QSet>

struct KeyEntry;

// Reading and merging: the entries of the edited file, and of the system file when it is the
// user's own, become a model's rows, disabled keys and kept entries. Of two entries for one key
// the user's file wins over the system file, and within a file the first the loader meets.
class HotkeysReader
{
public:
    explicit HotkeysReader(HotkeysModel* into);

    // False when a file is no hotkeys file; then systemFailed says whether it was the system file,
    // and the model is unchanged.
    bool merge(const QByteArray& bytes, const QByteArray& systemBytes, bool withSystem, bool* systemFailed);

private:
    void addEntries(const HotkeysEntries& file, BindingSource source);
    // The system file's bindings, kept whether or not the user's file hides them: freeing a key
    // brings them back.
    void noteSystemBinding(const Binding& binding, const QByteArray& identity);
    void addFunction(int function, const Binding& binding);

    HotkeysModel* into;
    HotkeysModel fresh;
    QSet<QByteArray> boundKeys;
    QSet<QByteArray> disabledKeys;
    QHash<int, QVector<Binding>> furtherRows;
};
