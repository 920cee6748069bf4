#include "hotkeysmodel.h"

#include "functioncatalogue.h"
#include "hotkeysdocument.h"
#include "hotkeysfile.h"
#include "hotkeyslines.h"

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

QByteArray withLineEnd(QByteArray bytes)
{
    if (!bytes.isEmpty() && !bytes.endsWith('\n') && !bytes.endsWith('\r'))
        bytes += '\n';
    return bytes;
}

// The line of each key that the reader takes: the last one in a [ShortCutKeys] section.
QHash<QByteArray, int> lastLineOfKeys(const HotkeysLines& lines)
{
    QHash<QByteArray, int> last;
    for (int i = 0; i < lines.lines().size(); ++i) {
        const HotkeysLine& line = lines.lines().at(i);
        if (line.kind == HotkeysLine::Entry && lines.isHotkeysSection(line.section))
            last.insert(foldedKey(line.key), i);
    }
    return last;
}

// What an entry was read as, when the lines and the reader agree on it.
std::shared_ptr<const EntryOrigin> originOf(const HotkeysLines& lines, const QHash<QByteArray, int>& last,
                                            const HotkeysEntry& entry, const QString& key,
                                            const QString& action, bool editedFile)
{
    const int i = last.value(foldedKey(entry.key), -1);
    if (i < 0 || lines.lines().at(i).value != entry.value)
        return nullptr;
    const HotkeysLine& line = lines.lines().at(i);
    auto origin = std::make_shared<EntryOrigin>();
    origin->leading = lines.span(lines.leadingStart(i), line.start);
    // A key written twice in other letter case is read with the spelling of its first line and
    // the value of its last; the line is then composed from the two.
    if (line.key == entry.key)
        origin->line = lines.span(line.start, line.end);
    origin->rawKey = entry.key;
    origin->rawValue = line.value;
    origin->readKey = key;
    origin->readAction = action;
    origin->lineNumber = line.number;
    origin->editedFile = editedFile;
    return origin;
}

// Why a line of the editor's making would not read back as this key and value; empty when it
// would. Keys read from a file are written as they were read and need no check; placeholders
// are read back as no key, as they should.
QString unwritable(const QString& storedKey, const QByteArray& key, bool keyFromFile, const QByteArray& value)
{
    static const QRegularExpression placeholder(QStringLiteral("^None[0-9]+$"));
    if (!keyFromFile &&
        !(placeholder.match(storedKey).hasMatch() ? isWritableFileKey(key) : readsBackAsWritten(storedKey)))
        return HotkeysFile::tr("The key \"%1\" cannot be written to a hotkeys file")
            .arg(QString::fromLocal8Bit(key));
    const auto isBlank = [](char c) { return c == ' ' || c == '\t'; };
    if (value.contains('\n') || value.contains('\r') || value.contains('\0') ||
        (!value.isEmpty() && (isBlank(value.front()) || isBlank(value.back()))))
        return HotkeysFile::tr("The action \"%1\" cannot be written to a hotkeys file")
            .arg(QString::fromLocal8Bit(value));
    return QString();
}

} // namespace

HotkeysModel::HotkeysModel() : functionRows(functionNames().size()), sectionHeader(emptyHotkeysFile)
{
    for (int f = 0; f < functionRows.size(); ++f)
        functionRows[f].append(Binding{++lastId, f, QString(), QString(), BindingSource::Unset, nullptr});
}

const QStringList& HotkeysModel::functionNames()
{
    static const QStringList names = [] {
        QStringList result;
        for (const WmFunctionEntry& entry : buildWmFunctionTable()) {
            if (entry.code != 0 && entry.keyName)
                result << QString::fromLatin1(entry.keyName);
        }
        return result;
    }();
    return names;
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
    HotkeysDocument mainDocument;
    HotkeysDocument systemDocument;
    if (!mainDocument.load(bytes))
        return false;
    if (withSystem && !systemDocument.load(systemBytes)) {
        if (systemFailed)
            *systemFailed = true;
        return false;
    }

    HotkeysModel fresh;
    fresh.lastId = lastId;
    for (auto& rows : fresh.functionRows)
        rows.first().id = ++fresh.lastId;

    const HotkeysLines lines(bytes);
    const QVector<HotkeysLine>& all = lines.lines();
    int header = -1;
    const auto firstSection = std::find_if(
        all.cbegin(), all.cend(), [](const HotkeysLine& line) { return line.kind == HotkeysLine::Section; });
    if (firstSection != all.cend())
        fresh.beforeSection =
            withLineEnd(lines.span(lines.textStart(), lines.leadingStart(int(firstSection - all.cbegin()))));
    for (int i = 0; i < all.size(); ++i) {
        if (all.at(i).kind != HotkeysLine::Section)
            continue;
        const int runEnd = [&] {
            for (int j = i + 1; j < all.size(); ++j) {
                if (all.at(j).kind == HotkeysLine::Section)
                    return lines.leadingStart(j);
            }
            return all.last().end;
        }();
        if (header < 0 && !lines.isHotkeysSection(i)) {
            fresh.otherSections += withLineEnd(lines.span(lines.leadingStart(i), runEnd));
        } else if (header < 0) {
            header = i;
            fresh.sectionHeader = lines.span(lines.leadingStart(i), all.at(i).end);
            fresh.sectionHeader = withLineEnd(fresh.sectionHeader);
        } else if (lines.isHotkeysSection(i)) {
            // A second [ShortCutKeys]: its entries join the first; what stands above it stays.
            fresh.sectionEnd += withLineEnd(lines.span(lines.leadingStart(i), all.at(i).start));
        } else {
            fresh.otherSections += withLineEnd(lines.span(lines.leadingStart(i), runEnd));
        }
    }
    fresh.afterLast = lines.trailing();
    if (header < 0)
        fresh.sectionHeader = emptyHotkeysFile;

    const QHash<QByteArray, int> lastLine = lastLineOfKeys(lines);
    const HotkeysLines systemLines(systemBytes);
    const QHash<QByteArray, int> systemLastLine = lastLineOfKeys(systemLines);

    QSet<QString> boundKeys;
    QHash<int, QVector<Binding>> furtherRows;
    const auto addEntries = [&](const HotkeysDocument& document, BindingSource source) {
        const bool edited = source == BindingSource::User;
        for (const HotkeysEntry& entry : document.entries()) {
            const QString key = fromFileKey(QString::fromLocal8Bit(entry.key));
            const QString value = unquoted(QString::fromLocal8Bit(entry.value));
            if (!edited && !key.isEmpty() && value != disableValue) {
                // Kept whether or not the user's file hides it: freeing the key brings it back.
                fresh.systemKeys.insert(key.toLower());
                const int function = functionIndex().value(value, -1);
                if (function >= 0)
                    fresh.systemBindings[function].append(
                        Binding{0, function, QString(), key, source,
                                originOf(systemLines, systemLastLine, entry, key, value, false)});
            }
            // Whoever bound the key first keeps it: the user's file before the system one.
            if (!key.isEmpty() && boundKeys.contains(key.toLower()))
                continue;
            auto origin = edited ? originOf(lines, lastLine, entry, key, value, true)
                                 : originOf(systemLines, systemLastLine, entry, key, value, false);

            if (value.startsWith(QLatin1String("ZEMWM_"))) {
                const int function = functionIndex().value(value, -1);
                if (function < 0) {
                    // A function of a newer window manager: not shown, but never lost.
                    if (edited && origin)
                        fresh.kept.append({foldedKey(origin->rawKey), origin});
                    continue;
                }
                Binding& first = fresh.functionRows[function].first();
                if (first.key.isEmpty()) {
                    first.key = key;
                    first.source = source;
                    first.origin = origin;
                } else {
                    furtherRows[function].append(
                        Binding{++fresh.lastId, function, QString(), key, source, origin});
                }
            } else if (value == disableValue) {
                if (key.isEmpty()) {
                    // A disabled placeholder switches nothing off; it is kept as it stands.
                    if (edited && origin)
                        fresh.kept.append({foldedKey(origin->rawKey), origin});
                    continue;
                }
                if (!fresh.isDisabled(key))
                    fresh.disabled.append({key, origin});
            } else {
                fresh.commandRows.append(Binding{++fresh.lastId, -1, value, key, source, origin});
            }
            if (!key.isEmpty())
                boundKeys.insert(key.toLower());
        }
    };
    addEntries(mainDocument, BindingSource::User);
    if (withSystem)
        addEntries(systemDocument, BindingSource::System);

    // What is kept unseen is written back in the order of the file.
    std::stable_sort(fresh.kept.begin(), fresh.kept.end(), [](const Kept& a, const Kept& b) {
        return a.origin->lineNumber < b.origin->lineNumber;
    });

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
            return writtenKey(d.key, d.origin.get());
    }
    return ::fileKeyOf(key).toLocal8Bit();
}

bool HotkeysModel::isDisabled(const QString& key) const
{
    return std::any_of(disabled.cbegin(), disabled.cend(),
                       [&](const DisabledKey& d) { return d.key == key; });
}

QByteArray HotkeysModel::writtenKey(const QString& key, const EntryOrigin* origin) const
{
    if (origin && key == origin->readKey && !origin->rawKey.isEmpty())
        return origin->rawKey;
    return ::fileKeyOf(key).toLocal8Bit();
}

BindingId HotkeysModel::holderOf(const QString& key, BindingId except) const
{
    if (key.isEmpty())
        return 0;
    const QString lower = key.toLower();
    const QByteArray fileKey = foldedKey(::fileKeyOf(key).toLocal8Bit());
    for (const Binding* row : rows()) {
        if (row->id == except || row->key.isEmpty())
            continue;
        if (row->key.toLower() == lower || foldedKey(writtenKey(row->key, row->origin.get())) == fileKey)
            return row->id;
    }
    return 0;
}

void HotkeysModel::keepFreedKeyOff(const Binding& row)
{
    if (row.key.isEmpty() || isDisabled(row.key) || holderOf(row.key, row.id))
        return;
    // Otherwise the system file's binding of the key would answer to it again after saving.
    if (row.source == BindingSource::System || systemKeys.contains(row.key.toLower()))
        disabled.append({row.key, row.origin});
}

void HotkeysModel::enable(const QString& key)
{
    // A combination in use again is no longer disabled.
    disabled.erase(
        std::remove_if(disabled.begin(), disabled.end(), [&](const DisabledKey& d) { return d.key == key; }),
        disabled.end());
}

void HotkeysModel::setKey(BindingId id, const QString& key)
{
    Binding* row = findMutable(id);
    if (!row)
        return;
    const Binding before = *row;
    row->key = key;
    row->source = BindingSource::User;
    enable(key);
    if (before.key != key)
        keepFreedKeyOff(before);
}

void HotkeysModel::clearKey(BindingId id)
{
    Binding* row = findMutable(id);
    if (!row)
        return;
    keepFreedKeyOff(*row);
    row->key.clear();
    row->source = BindingSource::User;
}

void HotkeysModel::reassign(BindingId holder, BindingId target)
{
    Binding* from = findMutable(holder);
    if (!from || !findMutable(target))
        return;
    const QString key = from->key;
    // The key stays in use, so nothing is to be switched off for it.
    from->key.clear();
    from->source = BindingSource::User;
    setKey(target, key);
}

QVector<Binding> HotkeysModel::systemRowsOf(int function) const
{
    const QVector<Binding> read = systemBindings.value(function);
    QVector<Binding> rows;
    for (const Binding& binding : read) {
        const Binding* holder = find(holderOf(binding.key));
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
        if (rows.at(i).source != BindingSource::System || rows.at(i).key != expected.at(i).key)
            return true;
    }
    return false;
}

QStringList HotkeysModel::revertToSystem(int function)
{
    QVector<Binding>& rows = functionRows[function];
    const QVector<Binding> old = rows;
    rows.clear();
    for (const Binding& row : old)
        keepFreedKeyOff(row);
    QStringList heldElsewhere;
    for (const Binding& binding : systemBindings.value(function)) {
        if (holderOf(binding.key)) {
            heldElsewhere << binding.key;
            continue;
        }
        rows.append(
            Binding{++lastId, function, QString(), binding.key, BindingSource::System, binding.origin});
        enable(binding.key);
    }
    if (rows.size() > 2)
        std::reverse(rows.begin() + 1, rows.end());
    if (rows.isEmpty())
        rows.append(Binding{++lastId, function, QString(), QString(), BindingSource::Unset, nullptr});
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
    commandRows.append(Binding{++lastId, -1, command, QString(), BindingSource::User, nullptr});
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
                Binding copy{++lastId,  rows.at(i).function, rows.at(i).command,
                             QString(), BindingSource::User, nullptr};
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
    static const QRegularExpression placeholder(QStringLiteral("None([0-9]+)$"));
    QSet<int> inUse;
    const auto note = [&](const QString& key) {
        const QRegularExpressionMatch match = placeholder.match(key);
        if (match.hasMatch())
            inUse.insert(match.captured(1).toInt());
    };
    for (const Binding* row : rows()) {
        note(row->key);
        if (row->origin)
            note(QString::fromLocal8Bit(row->origin->rawKey));
    }
    for (const Kept& entry : qAsConst(kept))
        note(QString::fromLocal8Bit(entry.origin->rawKey));

    int next = 0;
    for (Binding& row : commandRows) {
        if (!row.key.isEmpty() || (userFile && row.source != BindingSource::User))
            continue;
        // A keyless command read from this file keeps the placeholder it was read under.
        if (row.origin && row.origin->editedFile && row.origin->readKey.isEmpty())
            continue;
        while (inUse.contains(next))
            ++next;
        inUse.insert(next);
        row.key = QStringLiteral("None%1").arg(next);
        row.source = BindingSource::User;
    }
}

bool HotkeysModel::toBytes(bool userFile, QByteArray* bytes, QString* reason)
{
    assignPlaceholders(userFile);

    struct Line
    {
        QByteArray key;
        QByteArray value;
        QByteArray leading;
        QByteArray verbatim;
        bool keyFromFile = false;
        QString storedKey;
    };
    QVector<Line> out;
    QHash<QByteArray, int> written;
    // As the reader sets a value: a key that is already there keeps its place and takes the new
    // value.
    const auto put = [&](Line line) {
        const QByteArray folded = foldedKey(line.key);
        const auto it = written.constFind(folded);
        if (it == written.cend()) {
            written.insert(folded, out.size());
            out.append(std::move(line));
            return;
        }
        Line& earlier = out[*it];
        earlier.value = line.value;
        earlier.verbatim.clear();
    };

    for (const Binding* row : rows()) {
        if (userFile && row->source != BindingSource::User)
            continue;
        const EntryOrigin* origin = row->origin.get();
        const QString action = row->isCommand() ? row->command : functionNames().at(row->function);
        const bool keyKept = origin && row->key == origin->readKey;
        const bool actionKept = origin && action == origin->readAction;
        const bool untouched = keyKept && actionKept && origin->editedFile;
        if (row->key.isEmpty() && !(row->isCommand() && keyKept) && !untouched)
            continue;
        Line line;
        line.key = writtenKey(row->key, origin);
        line.keyFromFile = keyKept && !origin->rawKey.isEmpty();
        line.storedKey = row->key;
        if (actionKept)
            line.value = origin->rawValue;
        else if (row->isCommand())
            line.value = '"' + row->command.toLocal8Bit() + '"';
        else
            line.value = action.toLocal8Bit();
        if (origin && origin->editedFile) {
            line.leading = origin->leading;
            if (untouched)
                line.verbatim = origin->line;
        }
        put(line);
    }
    for (const DisabledKey& key : qAsConst(disabled)) {
        const EntryOrigin* origin = key.origin.get();
        Line line;
        line.key = writtenKey(key.key, origin);
        line.keyFromFile = origin && key.key == origin->readKey;
        line.storedKey = key.key;
        line.value = "\"Disable\"";
        if (origin && origin->editedFile && origin->readAction == disableValue &&
            key.key == origin->readKey) {
            line.leading = origin->leading;
            line.verbatim = origin->line;
        }
        put(line);
    }
    // What was read but not shown follows, unless a shown binding took its key since.
    for (const Kept& entry : qAsConst(kept)) {
        if (!written.contains(entry.foldedKey))
            put({entry.origin->rawKey, entry.origin->rawValue, entry.origin->leading, entry.origin->line,
                 true, QString()});
    }

    QByteArray result = beforeSection + sectionHeader;
    for (const Line& line : qAsConst(out)) {
        result += line.leading;
        if (!line.verbatim.isEmpty()) {
            result += withLineEnd(line.verbatim);
            continue;
        }
        const QString problem = unwritable(line.storedKey, line.key, line.keyFromFile, line.value);
        if (!problem.isEmpty()) {
            *reason = problem;
            return false;
        }
        result += line.key + '=' + line.value + '\n';
    }
    result += sectionEnd + otherSections + afterLast;
    // No byte-order mark is written, not even one that stood inside the file and came first.
    if (result.startsWith("\xEF\xBB\xBF"))
        result.remove(0, 3);
    *bytes = result;
    return true;
}
