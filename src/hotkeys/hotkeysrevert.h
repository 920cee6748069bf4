#pragma once

#include "hotkeysmodel.h"

// Reverting to what the system file gives: a function's rows become the system file's, a
// command row takes the system's key for its command line, and a key this frees goes back to
// the row without a key the system file gives it to (where a Reassign took it), else is
// switched off as any freed key.
class HotkeysRevert
{
public:
    explicit HotkeysRevert(HotkeysModel* model);

    bool canRevert(BindingId id) const;
    QStringList revert(BindingId id, BindingId* focus);

private:
    // The system file's rows of the function, as loading arranges them, less the keys that rows
    // of other functions hold.
    QVector<Binding> systemRowsOf(int function) const;
    bool differsFromSystem(int function) const;
    QStringList revertFunction(int function);
    QStringList revertCommand(Binding* row);
    void giveBackOrKeepOff(const Binding& freed);
    // The row gets the key the system file gives, as the system's.
    void takeSystemKey(Binding* row, const Binding& given);

    HotkeysModel* model;
};
