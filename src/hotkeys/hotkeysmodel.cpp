#include "hotkeysmodel.h"

#include "functioncatalogue.h"
#include "hotkeysentries.h"
#include "hotkeysfile.h"
#include "hotkeyspatch.h"
#include "keyforms.h"

#include <QCoreApplication>
#include <QHash>
#include <QRegularExpression>
#include <QSet>

#include <algorithm>

namespace {

const QString disableValue = QStringLiteral("Disable");

// Its messages, translated in a context of their own.
struct HotkeysFile
{
    Q_DECLARE_TR_FUNCTIONS(HotkeysFile)
};

const QHash<QString, int>& functionIndex()
{
    static const QHash<QString, int> index = [] {
        QHash<QString, int> result;
        const QStringList& names = HotkeysModel::functionNames();
        for (int i = 0; i < names.size(); ++i)
            result.insert(names.at(i), i);
        return result;
    }();
    return index;
}

const std::shared_ptr<const HotkeysEntries>& emptyFile()
{
    static const std::shared_ptr<const HotkeysEntries> empty = [] {
        auto entries = std::make_shared<HotkeysEntries>();
        entries->read(emptyHotkeysFile);
        return entries;
    }();
    return empty;
}

std::shared_ptr<const EntryOrigin> originOf(const HotkeysEntries& file, const KeyEntry& entry,
                                            const QString& action, bool editedFile)
{
    auto origin = std::make_shared<EntryOrigin>();
    origin->rawValue = entry.value;
    origin->readAction = action;
    origin->editedFile = editedFile;
    if (entry.counting >= 0) {
        origin->lineNumber = file.lines().lines().at(entry.counting).number;
        if (editedFile)
            origin->line = entry.counting;
    }
    return origin;
}

// Why a value of the editor's making cannot stand in the file; empty when it can.
QString unwritableValue(const QByteArray& value)
{
    const auto isBlank = [](char c) { return c == ' ' || c == '\t'; };
    if (value.contains('\n') || value.contains('\r') || value.contains('\0') ||
        (!value.isEmpty() && (isBlank(value.front()) || isBlank(value.back()))))
        return HotkeysFile::tr("The action \"%1\" cannot be written to a hotkeys file")
            .arg(printableText(QString::fromLocal8Bit(value)));
    return QString();
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
    auto mainFile = std::make_shared<HotkeysEntries>();
    HotkeysEntries systemFile;
    if (!mainFile->read(bytes))
        return false;
    if (withSystem && !systemFile.read(systemBytes)) {
        if (systemFailed)
            *systemFailed = true;
        return false;
    }

    HotkeysModel fresh;
    fresh.lastId = lastId;
    for (auto& rows : fresh.functionRows)
        rows.first().id = ++fresh.lastId;
    fresh.base = mainFile;

    QSet<QByteArray> boundKeys;
    QSet<QByteArray> disabledKeys;
    QHash<int, QVector<Binding>> furtherRows;
    const auto addEntries = [&](const HotkeysEntries& file, BindingSource source) {
        const bool edited = source == BindingSource::User;
        for (const KeyEntry& entry : file.entries()) {
            const QString key = fromFileKey(QString::fromLocal8Bit(entry.key));
            const QString value = unquoted(QString::fromLocal8Bit(entry.value));
            const bool isKey = isKeyIdentity(entry.identity);
            const QByteArray fileKey =
                entry.counting >= 0 ? file.lines().lines().at(entry.counting).key : entry.key;
            const auto origin = originOf(file, entry, value, edited);
            if (!edited && isKey && value != disableValue) {
                // Kept whether or not the user's file hides it: freeing the key brings it back.
                fresh.systemKeys.insert(entry.identity);
                const int function = functionIndex().value(value, -1);
                if (function >= 0)
                    fresh.systemBindings[function].append(
                        Binding{0, function, QString(), key, fileKey, source, origin, false});
                else if (!value.startsWith(QLatin1String("ZEMWM_")))
                    fresh.systemCommands.append(Binding{0, -1, value, key, fileKey, source, origin, false});
            }
            // Whoever bound the key first keeps it: the user's file before the system one.
            if (isKey && boundKeys.contains(entry.identity))
                continue;

            if (value.startsWith(QLatin1String("ZEMWM_"))) {
                const int function = functionIndex().value(value, -1);
                if (function < 0) {
                    // A function of a newer window manager: not shown, but never lost.
                    if (edited)
                        fresh.kept.append({fileKey, origin});
                    continue;
                }
                Binding& first = fresh.functionRows[function].first();
                // The first row is taken by the first entry read, keyless or not.
                if (first.source == BindingSource::Unset) {
                    first.key = key;
                    first.fileKey = fileKey;
                    first.source = source;
                    first.origin = origin;
                } else {
                    furtherRows[function].append(
                        Binding{++fresh.lastId, function, QString(), key, fileKey, source, origin, false});
                }
            } else if (value == disableValue) {
                if (!isKey) {
                    // A disabled placeholder switches nothing off; it is kept as it stands.
                    if (edited)
                        fresh.kept.append({fileKey, origin});
                    continue;
                }
                if (!disabledKeys.contains(entry.identity)) {
                    disabledKeys.insert(entry.identity);
                    fresh.disabled.append({key, fileKey, origin});
                }
            } else {
                fresh.commandRows.append(
                    Binding{++fresh.lastId, -1, value, key, fileKey, source, origin, false});
            }
            if (isKey)
                boundKeys.insert(entry.identity);
        }
    };
    addEntries(*mainFile, BindingSource::User);
    if (withSystem)
        addEntries(systemFile, BindingSource::System);

    // A function's further rows follow its first row, the one read last nearest to it.
    for (auto it = furtherRows.cbegin(); it != furtherRows.cend(); ++it)
        std::copy(it->crbegin(), it->crend(), std::back_inserter(fresh.functionRows[it.key()]));

    *this = std::move(fresh);
    return true;
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

QVector<Binding> HotkeysModel::systemRowsOf(int function) const
{
    const QVector<Binding> read = systemBindings.value(function);
    QVector<Binding> rows;
    for (const Binding& binding : read) {
        const Binding* holder = find(holderOfFileKey(binding.fileKey));
        if (!holder || holder->function == function)
            rows.append(binding);
    }
    // As loading arranges them: the first read first, the others after it, the last read nearest.
    if (rows.size() > 2)
        std::reverse(rows.begin() + 1, rows.end());
    return rows;
}

bool HotkeysModel::differsFromSystem(int function) const
{
    const QVector<Binding> expected = systemRowsOf(function);
    const QVector<Binding>& rows = functionRows.at(function);
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

bool HotkeysModel::canRevert(BindingId id) const
{
    const Binding* row = find(id);
    if (!row)
        return false;
    if (!row->isCommand())
        return differsFromSystem(row->function);
    const auto given = std::find_if(systemCommands.cbegin(), systemCommands.cend(),
                                    [&](const Binding& b) { return b.command == row->command; });
    return given != systemCommands.cend() &&
           (row->source != BindingSource::System || keyIdentity(row->fileKey) != keyIdentity(given->fileKey));
}

QStringList HotkeysModel::revert(BindingId id, BindingId* focus)
{
    Binding* row = findMutable(id);
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
        *focus = functionRows.at(function).first().id;
    return held;
}

void HotkeysModel::giveBackOrKeepOff(const Binding& freed)
{
    const QByteArray identity = keyIdentity(freed.fileKey);
    if (freed.key.isEmpty() || holderOfFileKey(freed.fileKey))
        return;
    // The row the system file gives the key to, where it has none now (a Reassign took it).
    const auto giveTo = [&](Binding* row, const Binding& given) {
        row->key = given.key;
        row->fileKey = given.fileKey;
        row->source = BindingSource::System;
        row->origin = given.origin;
        row->keyRecorded = false;
        enable(given.fileKey);
    };
    for (auto it = systemBindings.cbegin(); it != systemBindings.cend(); ++it) {
        for (const Binding& given : *it) {
            if (keyIdentity(given.fileKey) != identity)
                continue;
            for (Binding& row : functionRows[it.key()]) {
                if (row.key.isEmpty()) {
                    giveTo(&row, given);
                    return;
                }
            }
        }
    }
    for (const Binding& given : qAsConst(systemCommands)) {
        if (keyIdentity(given.fileKey) != identity)
            continue;
        for (Binding& row : commandRows) {
            if (row.key.isEmpty() && row.command == given.command) {
                giveTo(&row, given);
                return;
            }
        }
    }
    keepFreedKeyOff(freed);
}

QStringList HotkeysModel::revertFunction(int function)
{
    QVector<Binding>& rows = functionRows[function];
    const QVector<Binding> old = rows;
    rows.clear();
    QStringList heldElsewhere;
    for (const Binding& binding : systemBindings.value(function)) {
        if (holderOfFileKey(binding.fileKey)) {
            heldElsewhere << binding.key;
            continue;
        }
        rows.append(Binding{++lastId, function, QString(), binding.key, binding.fileKey,
                            BindingSource::System, binding.origin, false});
        enable(binding.fileKey);
    }
    if (rows.size() > 2)
        std::reverse(rows.begin() + 1, rows.end());
    if (rows.isEmpty())
        rows.append(Binding{++lastId, function, QString(), QString(), QByteArray(), BindingSource::Unset,
                            nullptr, false});
    for (const Binding& row : old)
        giveBackOrKeepOff(row);
    return heldElsewhere;
}

QStringList HotkeysModel::revertCommand(Binding* row)
{
    const Binding old = *row;
    QStringList heldElsewhere;
    for (const Binding& given : qAsConst(systemCommands)) {
        if (given.command != row->command)
            continue;
        if (holderOfFileKey(given.fileKey, row->id)) {
            heldElsewhere << given.key;
            continue;
        }
        row->key = given.key;
        row->fileKey = given.fileKey;
        row->source = BindingSource::System;
        row->origin = given.origin;
        row->keyRecorded = false;
        enable(given.fileKey);
        giveBackOrKeepOff(old);
        return QStringList();
    }
    return heldElsewhere;
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
    const int function = functionIndex().value(name, -1);
    if (function < 0)
        return 0;
    for (const Binding& row : functionRows.at(function)) {
        if (row.key.isEmpty())
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

void HotkeysModel::assignPlaceholders(bool userFile)
{
    static const QRegularExpression placeholder(QStringLiteral("none([0-9]+)$"));
    QSet<int> inUse;
    const auto note = [&](const QByteArray& fileKey) {
        const QRegularExpressionMatch match = placeholder.match(QString::fromLatin1(foldedKey(fileKey)));
        if (match.hasMatch())
            inUse.insert(match.captured(1).toInt());
    };
    for (const Binding* row : rows())
        note(row->fileKey);
    for (const Kept& entry : qAsConst(kept))
        note(entry.fileKey);
    for (const KeyEntry& entry : base->entries())
        note(entry.key);

    int next = 0;
    for (Binding& row : commandRows) {
        if (!row.fileKey.isEmpty() || (userFile && row.source != BindingSource::User))
            continue;
        while (inUse.contains(next))
            ++next;
        inUse.insert(next);
        row.key = QStringLiteral("None%1").arg(next);
        row.fileKey = toFileKey(row.key).toLocal8Bit();
        row.source = BindingSource::User;
    }
}

bool HotkeysModel::toBytes(bool userFile, QByteArray* bytes, QString* reason)
{
    assignPlaceholders(userFile);
    const int commandRank = functionNames().size();

    // What the file is to mean: one entry per key, in the order of the rows.
    QVector<QByteArray> order;
    QHash<QByteArray, WantedEntry> wanted;
    const auto want = [&](const QByteArray& fileKey, WantedEntry entry, bool replace) {
        const QByteArray identity = keyIdentity(fileKey);
        const auto it = wanted.find(identity);
        if (it == wanted.end()) {
            order.append(identity);
            wanted.insert(identity, entry);
        } else if (replace) {
            // As the reader sets a value: the key keeps its place and takes the new value.
            it->value = entry.value;
            it->rank = entry.rank;
            it->keyProblem = entry.keyProblem;
            it->valueProblem = entry.valueProblem;
        }
    };
    for (const Binding* row : rows()) {
        if ((userFile && row->source != BindingSource::User) || row->fileKey.isEmpty())
            continue;
        const QString action = row->isCommand() ? row->command : functionNames().at(row->function);
        const EntryOrigin* origin = row->origin.get();
        WantedEntry entry{row->fileKey, QByteArray(), row->isCommand() ? commandRank : row->function,
                          QString(), QString()};
        if (origin && action == origin->readAction) {
            entry.value = origin->rawValue;
        } else if (row->isCommand()) {
            entry.value = '"' + row->command.toLocal8Bit() + '"';
            entry.valueProblem = commandProblem(row->command);
        } else {
            entry.value = action.toLocal8Bit();
        }
        if (entry.valueProblem.isEmpty())
            entry.valueProblem = unwritableValue(entry.value);
        if (origin && origin->editedFile)
            entry.fromLine = origin->line;
        const bool placeholder = !isKeyIdentity(keyIdentity(row->fileKey));
        if (!isWritableFileKey(row->fileKey) ||
            (row->keyRecorded && !placeholder && !readsBackAsWritten(row->key)))
            entry.keyProblem = HotkeysFile::tr("The key \"%1\" cannot be written to a hotkeys file")
                                   .arg(printableText(QString::fromLocal8Bit(row->fileKey)));
        want(row->fileKey, entry, true);
    }
    for (const DisabledKey& key : qAsConst(disabled)) {
        const EntryOrigin* origin = key.origin.get();
        WantedEntry entry{key.fileKey, "\"Disable\"", commandRank + 1, QString(), QString()};
        if (origin && origin->readAction == disableValue)
            entry.value = origin->rawValue;
        if (!isWritableFileKey(key.fileKey))
            entry.keyProblem = HotkeysFile::tr("The key \"%1\" cannot be written to a hotkeys file")
                                   .arg(printableText(QString::fromLocal8Bit(key.fileKey)));
        want(key.fileKey, entry, true);
    }
    // What was read but not shown stays, unless a shown binding took its key since.
    for (const Kept& entry : qAsConst(kept))
        want(entry.fileKey, WantedEntry{entry.fileKey, entry.origin->rawValue, -1, QString(), QString()},
             false);

    return HotkeysPatch(*base, order, wanted).apply(bytes, reason);
}
