#include "hotkeyswriter.h"

#include "hotkeysentries.h"
#include "hotkeysfile.h"
#include "keyforms.h"

#include <QCoreApplication>
#include <QRegularExpression>
#include <QSet>

namespace {

// Its messages, translated in a context of their own.
struct HotkeysFile
{
    Q_DECLARE_TR_FUNCTIONS(HotkeysFile)
};

const QString disableValue = QStringLiteral("Disable");

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

QString unwritableKey(const QByteArray& key)
{
    return HotkeysFile::tr("The key \"%1\" cannot be written to a hotkeys file")
        .arg(printableText(QString::fromLocal8Bit(key)));
}

} // namespace

HotkeysWriter::HotkeysWriter(HotkeysModel* model) : model(model) {}

void HotkeysWriter::assignPlaceholders(bool userFile)
{
    static const QRegularExpression placeholder(QStringLiteral("none([0-9]+)$"));
    QSet<int> inUse;
    const auto note = [&](const QByteArray& fileKey) {
        const QRegularExpressionMatch match = placeholder.match(QString::fromLatin1(foldedKey(fileKey)));
        if (match.hasMatch())
            inUse.insert(match.captured(1).toInt());
    };
    for (const Binding* row : model->rows())
        note(row->fileKey);
    for (const HotkeysModel::Kept& entry : qAsConst(model->kept))
        note(entry.fileKey);
    for (const KeyEntry& entry : model->base->entries())
        note(entry.key);

    int next = 0;
    for (Binding& row : model->commandRows) {
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

void HotkeysWriter::want(const QByteArray& fileKey, const WantedEntry& entry, bool replace)
{
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
}

WantedEntry HotkeysWriter::wantedOf(const Binding& row) const
{
    const int commandRank = HotkeysModel::functionNames().size();
    const QString action = row.isCommand() ? row.command : HotkeysModel::functionNames().at(row.function);
    const EntryOrigin* origin = row.origin.get();
    WantedEntry entry{row.fileKey, QByteArray(), row.isCommand() ? commandRank : row.function, QString(),
                      QString()};
    // An action nobody changed keeps the bytes it was written in.
    if (origin && action == origin->readAction) {
        entry.value = origin->rawValue;
    } else if (row.isCommand()) {
        entry.value = '"' + row.command.toLocal8Bit() + '"';
        entry.valueProblem = commandProblem(row.command);
    } else {
        entry.value = action.toLocal8Bit();
    }
    if (entry.valueProblem.isEmpty())
        entry.valueProblem = unwritableValue(entry.value);
    if (origin && origin->editedFile)
        entry.fromLine = origin->line;
    // A recorded key the key server cannot name would read back as another key.
    const bool placeholder = !isKeyIdentity(keyIdentity(row.fileKey));
    if (!isWritableFileKey(row.fileKey) || (row.keyRecorded && !placeholder && !readsBackAsWritten(row.key)))
        entry.keyProblem = unwritableKey(row.fileKey);
    return entry;
}

bool HotkeysWriter::write(bool userFile, QByteArray* bytes, QString* reason)
{
    assignPlaceholders(userFile);
    for (const Binding* row : model->rows()) {
        if ((!userFile || row->source == BindingSource::User) && !row->fileKey.isEmpty())
            want(row->fileKey, wantedOf(*row), true);
    }
    const int disabledRank = HotkeysModel::functionNames().size() + 1;
    for (const DisabledKey& key : qAsConst(model->disabled)) {
        const EntryOrigin* origin = key.origin.get();
        WantedEntry entry{key.fileKey, "\"Disable\"", disabledRank, QString(), QString()};
        if (origin && origin->readAction == disableValue)
            entry.value = origin->rawValue;
        if (!isWritableFileKey(key.fileKey))
            entry.keyProblem = unwritableKey(key.fileKey);
        want(key.fileKey, entry, true);
    }
    // What was read but not shown stays, unless a shown binding took its key since.
    for (const HotkeysModel::Kept& entry : qAsConst(model->kept))
        want(entry.fileKey, WantedEntry{entry.fileKey, entry.origin->rawValue, -1, QString(), QString()},
             false);
    return HotkeysPatch(*model->base, order, wanted).apply(bytes, reason);
}
