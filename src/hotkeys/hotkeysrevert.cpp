#include "hotkeysrevert.h"

#include "keyforms.h"

#include <algorithm>

HotkeysRevert::HotkeysRevert(HotkeysModel* model) : model(model) {}

QVector<Binding> HotkeysRevert::systemRowsOf(int function) const
{
    const QVector<Binding> read = model->systemBindings.value(function);
    QVector<Binding> rows;
    for (const Binding& binding : read) {
        const Binding* holder = model->find(model->holderOfFileKey(binding.fileKey));
        if (!holder || holder->function == function)
            rows.append(binding);
    }
    // As loading arranges them: the first read first, the others after it, the last read nearest.
    if (rows.size() > 2)
        std::reverse(rows.begin() + 1, rows.end());
    return rows;
}

bool HotkeysRevert::differsFromSystem(int function) const
{
    const QVector<Binding> expected = systemRowsOf(function);
    const QVector<Binding>& rows = model->functionRows.at(function);
    if (expected.isEmpty())
        return rows.size() != 1 || !rows.first().key.isEmpty();
    if (rows.size() != expected.size())
        return true;
    for (int i = 0; i < rows.size(); ++i) {
        if (rows.at(i).source != BindingSource::System ||
            keyIdentity(rows.at(i).fileKey) != keyIdentity(expected.at(i).fileKey))
            return true;
    }
    return false;
}

bool HotkeysRevert::canRevert(BindingId id) const
{
    const Binding* row = model->find(id);
    if (!row)
        return false;
    if (!row->isCommand())
        return differsFromSystem(row->function);
    const auto given = std::find_if(model->systemCommands.cbegin(), model->systemCommands.cend(),
                                    [&](const Binding& b) { return b.command == row->command; });
    return given != model->systemCommands.cend() &&
           (row->source != BindingSource::System || keyIdentity(row->fileKey) != keyIdentity(given->fileKey));
}

QStringList HotkeysRevert::revert(BindingId id, BindingId* focus)
{
    Binding* row = model->findMutable(id);
    if (!row)
        return QStringList();
    if (row->isCommand()) {
        if (focus)
            *focus = id;
        return revertCommand(row);
    }
    const int function = row->function;
    const QStringList held = revertFunction(function);
    if (focus)
        *focus = model->functionRows.at(function).first().id;
    return held;
}

void HotkeysRevert::takeSystemKey(Binding* row, const Binding& given)
{
    row->key = given.key;
    row->fileKey = given.fileKey;
    row->source = BindingSource::System;
    row->origin = given.origin;
    row->keyRecorded = false;
    model->enable(given.fileKey);
}

void HotkeysRevert::giveBackOrKeepOff(const Binding& freed)
{
    const QByteArray identity = keyIdentity(freed.fileKey);
    if (freed.key.isEmpty() || model->holderOfFileKey(freed.fileKey))
        return;
    // The row the system file gives the key to, where it has none now (a Reassign took it).
    for (auto it = model->systemBindings.cbegin(); it != model->systemBindings.cend(); ++it) {
        for (const Binding& given : *it) {
            if (keyIdentity(given.fileKey) != identity)
                continue;
            for (Binding& row : model->functionRows[it.key()]) {
                if (row.key.isEmpty()) {
                    takeSystemKey(&row, given);
                    return;
                }
            }
        }
    }
    for (const Binding& given : qAsConst(model->systemCommands)) {
        if (keyIdentity(given.fileKey) != identity)
            continue;
        for (Binding& row : model->commandRows) {
            if (row.key.isEmpty() && row.command == given.command) {
                takeSystemKey(&row, given);
                return;
            }
        }
    }
    model->keepFreedKeyOff(freed);
}

QStringList HotkeysRevert::revertFunction(int function)
{
    QVector<Binding>& rows = model->functionRows[function];
    const QVector<Binding> old = rows;
    rows.clear();
    QStringList heldElsewhere;
    for (const Binding& binding : model->systemBindings.value(function)) {
        if (model->holderOfFileKey(binding.fileKey)) {
            heldElsewhere << binding.key;
            continue;
        }
        rows.append(Binding{++model->lastId, function, QString(), binding.key, binding.fileKey,
                            BindingSource::System, binding.origin, false});
        model->enable(binding.fileKey);
    }
    if (rows.size() > 2)
        std::reverse(rows.begin() + 1, rows.end());
    if (rows.isEmpty())
        rows.append(Binding{++model->lastId, function, QString(), QString(), QByteArray(),
                            BindingSource::Unset, nullptr, false});
    for (const Binding& row : old)
        giveBackOrKeepOff(row);
    return heldElsewhere;
}

QStringList HotkeysRevert::revertCommand(Binding* row)
{
    const Binding old = *row;
    QStringList heldElsewhere;
    for (const Binding& given : qAsConst(model->systemCommands)) {
        if (given.command != row->command)
            continue;
        if (model->holderOfFileKey(given.fileKey, row->id)) {
            heldElsewhere << given.key;
            continue;
        }
        takeSystemKey(row, given);
        giveBackOrKeepOff(old);
        return QStringList();
    }
    return heldElsewhere;
}
