// Load, save, load: the bindings come back the same, every entry nobody edited keeps its bytes,
// and saving what was read back writes the very same file.
#include "hotkeysmodel.h"

#include <cstdlib>

namespace {

QStringList listing(const HotkeysModel& model)
{
    QStringList rows;
    for (const Binding* row : model.rows()) {
        if (row->isCommand() || !row->key.isEmpty())
            rows << QString::number(row->function) + QLatin1Char('|') + row->command + QLatin1Char('|') +
                        row->key;
    }
    return rows + model.disabledKeys();
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    const QByteArray bytes(reinterpret_cast<const char*>(data), int(size));
    if (bytes.contains('\0'))
        return 0; // refused before it is read
    HotkeysModel model;
    if (!model.loadBytes(bytes, QByteArray(), false))
        return 0;
    QByteArray first;
    QString reason;
    if (!model.toBytes(false, &first, &reason))
        std::abort(); // nothing was edited, so everything can be written back
    for (const Binding* row : model.rows()) {
        if (row->origin && !first.contains(row->origin->line))
            std::abort();
    }

    HotkeysModel again;
    if (!again.loadBytes(first, QByteArray(), false) || listing(again) != listing(model))
        std::abort();
    QByteArray second;
    if (!again.toBytes(false, &second, &reason) || second != first)
        std::abort();
    return 0;
}
