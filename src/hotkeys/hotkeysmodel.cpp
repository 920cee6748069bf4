#include "hotkeysmodel.h"

#include "functioncatalogue.h"
#include "hotkeysentries.h"
#include "hotkeysfile.h"
#include "hotkeysreader.h"
#include "hotkeysrevert.h"
#include "hotkeyswriter.h"
#include "keyforms.h"

#include <QCoreApplication>
#include <QHash>
#include <QSet>

#include <algorithm>

namespace {

// Its messages, translated in a context of their own.
struct HotkeysFile
{
    Q_DECLARE_TR_FUNCTIONS(HotkeysFile)
};

const std::shared_ptr<const HotkeysEntries>& emptyFile()
{
    static const std::shared_ptr<const HotkeysEntries> empty = [] {
        auto entries = std::make_shared<HotkeysEntries>();
        entries->read(emptyHotkeysFile);
        return entries;
    }();
    return empty;
}

} // namespace

HotkeysModel::HotkeysModel() : functionRows(functionNames().size()), base(emptyFile())
{
    for (int f = 0; f < functionRows.size(); ++f)
        functionRows[f].append(
            Binding{++lastId, f, QString(), QString(), QByteArray(), BindingSource::Unset, nullptr, false});
}

const QStringList& HotkeysModel::functionNames()
{
    return catalogueFunctionNames();
}

bool HotkeysModel::load(const QString& path, const QString& systemPath, QString* failedPath, QString* reason)
{
    QByteArray bytes;
    QByteArray systemBytes;
    const auto fail = [&](const QString& which, const QString& why) {
        *failedPath = which;
        *reason = why;
        return false;
    };
    if (!readHotkeysFile(path, &bytes, reason))
        return fail(path, *reason);
    // Editing the user's file needs the system file it is merged with.
    if (!systemPath.isEmpty() && !readHotkeysFile(systemPath, &systemBytes, reason))
        return fail(systemPath, *reason);
    bool systemFailed = false;
    if (!loadBytes(bytes, systemBytes, !systemPath.isEmpty(), &systemFailed))
        return fail(systemFailed ? systemPath : path, HotkeysFile::tr("No [ShortCutKeys] section"));
    return true;
}

bool HotkeysModel::loadBytes(const QByteArray& bytes, const QByteArray& systemBytes, bool withSystem,
                             bool* systemFailed)
{
    return HotkeysReader(this).merge(bytes, systemBytes, withSystem, systemFailed);
}

QVector<const Binding*> HotkeysModel::rows() const
{
    QVector<const Binding*> result;
    result.reserve(functionRows.size() + commandRows.size());
    for (const auto& rows : functionRows) {
        for (const Binding& row : rows)
            result.append(&row);
    }
    for (const Binding& row : commandRows)
        result.append(&row);
    return result;
}

const Binding* HotkeysModel::find(BindingId id) const
{
    return const_cast<HotkeysModel*>(this)->findMutable(id);
}

Binding* HotkeysModel::findMutable(BindingId id)
{
    for (auto& rows : functionRows) {
        for (Binding& row : rows) {
            if (row.id == id)
                return &row;
        }
    }
    for (Binding& row : commandRows) {
        if (row.id == id)
            return &row;
    }
    return nullptr;
}

QStringList HotkeysModel::disabledKeys() const
{
    QStringList keys;
    for (const DisabledKey& key : disabled)
        keys << key.key;
    return keys;
}

QByteArray HotkeysModel::disabledFileKey(const QString& key) const
{
    for (const DisabledKey& d : disabled) {
        if (d.key == key)
            return d.fileKey;
    }
    return ::fileKeyOf(key).toLocal8Bit();
}

QByteArray HotkeysModel::fileKeyOf(const Binding& binding) const
{
    return binding.fileKey.isEmpty() && !binding.key.isEmpty() ? ::fileKeyOf(binding.key).toLocal8Bit()
                                                               : binding.fileKey;
}

bool HotkeysModel::isDisabled(const QString& key) const
{
    return !key.isEmpty() && isDisabledFileKey(::fileKeyOf(key).toLocal8Bit());
}

bool HotkeysModel::isDisabledFileKey(const QByteArray& fileKey) const
{
    const QByteArray identity = keyIdentity(fileKey);
    return std::any_of(disabled.cbegin(), disabled.cend(),
                       [&](const DisabledKey& d) { return keyIdentity(d.fileKey) == identity; });
}

const QByteArray& HotkeysModel::readBytes() const
{
    return base->bytes();
}

BindingId HotkeysModel::holderOf(const QString& key, BindingId except) const
{
    if (key.isEmpty())
        return 0;
    return holderOfFileKey(::fileKeyOf(key).toLocal8Bit(), except);
}

BindingId HotkeysModel::holderOfFileKey(const QByteArray& fileKey, BindingId except) const
{
    if (fileKey.isEmpty())
        return 0;
    const QByteArray identity = keyIdentity(fileKey);
    for (const Binding* row : rows()) {
        if (row->id != except && !row->key.isEmpty() && keyIdentity(fileKeyOf(*row)) == identity)
            return row->id;
    }
    return 0;
}

void HotkeysModel::keepFreedKeyOff(const Binding& row)
{
    if (row.key.isEmpty())
        return;
    const QByteArray fileKey = fileKeyOf(row);
    if (isDisabledFileKey(fileKey) || holderOfFileKey(fileKey, row.id))
        return;
    // Otherwise the system file's binding of the key would answer to it again after saving.
    if (row.source == BindingSource::System || systemKeys.contains(keyIdentity(fileKey)))
        disabled.append({row.key, fileKey, row.origin});
}

void HotkeysModel::enable(const QByteArray& fileKey)
{
    // A combination in use again is no longer disabled.
    const QByteArray identity = keyIdentity(fileKey);
    disabled.erase(std::remove_if(disabled.begin(), disabled.end(),
                                  [&](const DisabledKey& d) { return keyIdentity(d.fileKey) == identity; }),
                   disabled.end());
}

void HotkeysModel::assignKey(Binding* row, const QString& key, const QByteArray& fileKey, bool recorded)
{
    const Binding before = *row;
    row->key = key;
    row->fileKey = fileKey;
    row->keyRecorded = recorded;
    row->source = BindingSource::User;
    enable(fileKey);
    if (keyIdentity(before.fileKey) != keyIdentity(fileKey))
        keepFreedKeyOff(before);
}

void HotkeysModel::setKey(BindingId id, const QString& key)
{
    if (Binding* row = findMutable(id))
        assignKey(row, key, key.isEmpty() ? QByteArray() : ::fileKeyOf(key).toLocal8Bit(), true);
}

void HotkeysModel::setFileKey(BindingId id, const QByteArray& fileKey)
{
    if (Binding* row = findMutable(id))
        assignKey(row, fromFileKey(QString::fromLocal8Bit(fileKey)), fileKey, false);
}

void HotkeysModel::clearKey(BindingId id)
{
    Binding* row = findMutable(id);
    if (!row)
        return;
    keepFreedKeyOff(*row);
    row->key.clear();
    row->fileKey.clear();
    row->source = BindingSource::User;
}

void HotkeysModel::reassign(BindingId holder, BindingId target)
{
    Binding* from = findMutable(holder);
    Binding* to = findMutable(target);
    if (!from || !to)
        return;
    const Binding moved = *from;
    // The key stays in use, so nothing is to be switched off for it.
    from->key.clear();
    from->fileKey.clear();
    from->source = BindingSource::User;
    assignKey(to, moved.key, fileKeyOf(moved), moved.keyRecorded);
}

bool HotkeysModel::canRevert(BindingId id) const
{
    return HotkeysRevert(const_cast<HotkeysModel*>(this)).canRevert(id);
}

QStringList HotkeysModel::revert(BindingId id, BindingId* focus)
{
    return HotkeysRevert(this).revert(id, focus);
}

void HotkeysModel::setCommand(BindingId id, const QString& command)
{
    Binding* row = findMutable(id);
    if (!row || !row->isCommand())
        return;
    row->command = command;
    row->source = BindingSource::User;
}

BindingId HotkeysModel::addCommand(const QString& command)
{
    commandRows.append(
        Binding{++lastId, -1, command, QString(), QByteArray(), BindingSource::User, nullptr, false});
    return lastId;
}

BindingId HotkeysModel::rowForFunction(const QString& name)
{
    const int function = catalogueFunctionIndex(name);
    if (function < 0)
        return 0;
    // A row without a key that stands on a line of the file (a keyless entry read) keeps that
    // line: the key goes to a row of its own.
    for (const Binding& row : functionRows.at(function)) {
        if (row.key.isEmpty() && row.fileKey.isEmpty())
            return row.id;
    }
    return cloneRow(functionRows.at(function).last().id);
}

BindingId HotkeysModel::cloneRow(BindingId id)
{
    const auto cloneIn = [&](QVector<Binding>& rows) -> BindingId {
        for (int i = 0; i < rows.size(); ++i) {
            if (rows.at(i).id == id) {
                Binding copy{++lastId,
                             rows.at(i).function,
                             rows.at(i).command,
                             QString(),
                             QByteArray(),
                             BindingSource::User,
                             nullptr,
                             false};
                rows.insert(i + 1, copy);
                return copy.id;
            }
        }
        return 0;
    };
    const Binding* row = find(id);
    if (!row)
        return 0;
    return row->isCommand() ? cloneIn(commandRows) : cloneIn(functionRows[row->function]);
}

bool HotkeysModel::removeRow(BindingId id)
{
    const Binding* row = find(id);
    if (!row)
        return false;
    QVector<Binding>& rows = row->isCommand() ? commandRows : functionRows[row->function];
    if (!row->isCommand() && rows.size() < 2)
        return false;
    keepFreedKeyOff(*row);
    rows.erase(std::find_if(rows.begin(), rows.end(), [&](const Binding& b) { return b.id == id; }));
    return true;
}

bool HotkeysModel::toBytes(bool userFile, QByteArray* bytes, QString* reason)
{
    return HotkeysWriter(this).write(userFile, bytes, reason);
}
