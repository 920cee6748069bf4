// The file stays the user's. For any file the reader accepts: written back without an edit it is
// the input, byte for byte; an edit changes only the lines of its own key, and its undoing gives
// the input again; what is written reads back as the bindings that were saved.
#include "hotkeysentries.h"
#include "hotkeysmodel.h"
#include "keyforms.h"

#include <QCryptographicHash>

#include <cstdlib>

namespace {

QStringList listing(const HotkeysModel& model)
{
    QStringList rows;
    for (const Binding* row : model.rows()) {
        if (row->isCommand() || !row->key.isEmpty())
            rows << QString::number(row->function) + QLatin1Char('|') + row->command + QLatin1Char('|') +
                        QString::fromLatin1(keyIdentity(row->fileKey));
    }
    // Reading orders commands by their keys; what counts is which rows there are.
    rows += model.disabledKeys();
    rows.sort();
    return rows;
}

QByteArray written(HotkeysModel& model)
{
    QByteArray bytes;
    QString reason;
    if (!model.toBytes(false, &bytes, &reason))
        std::abort(); // every edit below can be written
    return bytes;
}

// The bytes without the [ShortCutKeys] lines of the keys named.
QByteArray without(const QByteArray& bytes, const QVector<QByteArray>& identities)
{
    const HotkeysLines lines(bytes);
    QByteArray rest = bytes;
    for (int i = lines.lines().size() - 1; i >= 0; --i) {
        const HotkeysLine& line = lines.lines().at(i);
        if (line.kind == HotkeysLine::Entry && lines.isHotkeysSection(line.section) &&
            identities.contains(keyIdentity(line.key)))
            rest.remove(line.start, line.end - line.start);
    }
    return rest;
}

// The edit of a row changed no line but those of its key before and after, a keyless command's
// placeholder included (a last line may have gained its line end), and the result reads back as
// what the model holds.
void checkEdit(const QByteArray& input, HotkeysModel& model, const QByteArray& identity, BindingId row)
{
    const QByteArray output = written(model);
    const QVector<QByteArray> keys{identity, keyIdentity(model.find(row)->fileKey)};
    const QByteArray before = without(input, keys);
    const QByteArray after = without(output, keys);
    if (after != before && after != before + '\n')
        std::abort();
    HotkeysModel again;
    if (!again.loadBytes(output, QByteArray(), false) || listing(again) != listing(model))
        std::abort();
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    const QByteArray input(reinterpret_cast<const char*>(data), int(size));
    if (input.contains('\0'))
        return 0; // refused before it is read
    HotkeysModel model;
    if (!model.loadBytes(input, QByteArray(), false))
        return 0;
    if (written(model) != input)
        std::abort();

    // Edits chosen by the input itself, each undone by its opposite.
    const QByteArray digest = QCryptographicHash::hash(input, QCryptographicHash::Sha1);
    const int function = int(uchar(digest.at(0))) % HotkeysModel::functionNames().size();

    // A free key set, then unset.
    const QByteArray freeKey = "Ctrl|Alt|Shift|Super|F35";
    if (!model.holderOfFileKey(freeKey)) {
        HotkeysModel edited = model;
        const BindingId row = edited.rowForFunction(HotkeysModel::functionNames().at(function));
        edited.setFileKey(row, freeKey);
        checkEdit(input, edited, keyIdentity(freeKey), row);
        if (!edited.removeRow(row))
            edited.clearKey(row);
        if (written(edited) != input)
            std::abort();
    }

    // A bound row's key cleared; a command changed, then changed back.
    QVector<const Binding*> bound;
    for (const Binding* row : model.rows()) {
        if (!row->key.isEmpty() && isKeyIdentity(keyIdentity(row->fileKey)))
            bound << row;
    }
    if (!bound.isEmpty()) {
        const Binding* row = bound.at(int(uchar(digest.at(1))) % bound.size());
        HotkeysModel edited = model;
        edited.clearKey(row->id);
        checkEdit(input, edited, keyIdentity(row->fileKey), row->id);
    }
    if (!model.commands().isEmpty()) {
        const Binding& row = model.commands().at(int(uchar(digest.at(2))) % model.commands().size());
        HotkeysModel edited = model;
        edited.setCommand(row.id, QStringLiteral("fuzz-command --changed"));
        checkEdit(input, edited, keyIdentity(row.fileKey), row.id);
        edited.setCommand(row.id, row.command);
        if (written(edited) != input)
            std::abort();
    }
    return 0;
}
