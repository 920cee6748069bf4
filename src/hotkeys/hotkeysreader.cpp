#include "hotkeysreader.h"

#include "functioncatalogue.h"
#include "hotkeysentries.h"
#include "keyforms.h"

#include <algorithm>
#include <iterator>

namespace {

const QString disableValue = QStringLiteral("Disable");

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

} // namespace

HotkeysReader::HotkeysReader(HotkeysModel* into) : into(into) {}

bool HotkeysReader::merge(const QByteArray& bytes, const QByteArray& systemBytes, bool withSystem,
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
    // Row ids go on from the model's, so that no id of an undo step is met again.
    fresh.lastId = into->lastId;
    for (auto& rows : fresh.functionRows)
        rows.first().id = ++fresh.lastId;
    fresh.base = mainFile;

    addEntries(*mainFile, BindingSource::User);
    if (withSystem)
        addEntries(systemFile, BindingSource::System);
    // A function's further rows follow its first row, the one read last nearest to it.
    for (auto it = furtherRows.cbegin(); it != furtherRows.cend(); ++it)
        std::copy(it->crbegin(), it->crend(), std::back_inserter(fresh.functionRows[it.key()]));
    *into = std::move(fresh);
    return true;
}

void HotkeysReader::noteSystemBinding(const Binding& binding, const QByteArray& identity)
{
    fresh.systemKeys.insert(identity);
    if (binding.function >= 0)
        fresh.systemBindings[binding.function].append(binding);
    else if (!binding.command.startsWith(QLatin1String("ZEMWM_")))
        fresh.systemCommands.append(binding);
}

void HotkeysReader::addFunction(int function, const Binding& binding)
{
    Binding& first = fresh.functionRows[function].first();
    // The first row is taken by the first entry read, keyless or not.
    if (first.source == BindingSource::Unset) {
        const BindingId id = first.id;
        first = binding;
        first.id = id;
    } else {
        furtherRows[function].append(binding);
        furtherRows[function].last().id = ++fresh.lastId;
    }
}

void HotkeysReader::addEntries(const HotkeysEntries& file, BindingSource source)
{
    const bool edited = source == BindingSource::User;
    for (const KeyEntry& entry : file.entries()) {
        const QString key = fromFileKey(QString::fromLocal8Bit(entry.key));
        const QString value = unquoted(QString::fromLocal8Bit(entry.value));
        const bool isKey = isKeyIdentity(entry.identity);
        const QByteArray fileKey =
            entry.counting >= 0 ? file.lines().lines().at(entry.counting).key : entry.key;
        const int function = catalogueFunctionIndex(value);
        const Binding binding{0,       function, function < 0 ? value : QString(),     key,
                              fileKey, source,   originOf(file, entry, value, edited), false};
        if (!edited && isKey && value != disableValue)
            noteSystemBinding(binding, entry.identity);
        // Whoever bound the key first keeps it: the user's file before the system one.
        if (isKey && boundKeys.contains(entry.identity))
            continue;
        const bool unknownFunction = function < 0 && value.startsWith(QLatin1String("ZEMWM_"));
        if (unknownFunction || (value == disableValue && !isKey)) {
            // A function of a newer window manager, or a disabled placeholder: not shown, and
            // never lost.
            if (edited)
                fresh.kept.append({fileKey, binding.origin});
            continue;
        }
        if (function >= 0) {
            addFunction(function, binding);
        } else if (value == disableValue) {
            if (!disabledKeys.contains(entry.identity)) {
                disabledKeys.insert(entry.identity);
                fresh.disabled.append({key, fileKey, binding.origin});
            }
        } else {
            fresh.commandRows.append(binding);
            fresh.commandRows.last().id = ++fresh.lastId;
        }
        if (isKey)
            boundKeys.insert(entry.identity);
    }
}
