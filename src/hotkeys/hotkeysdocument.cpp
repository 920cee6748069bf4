#include "hotkeysdocument.h"

#include "hotkeysfile.h"
#include "zemini.h"

#include <QFile>
#include <QFileInfo>

#include <string>

struct HotkeysDocument::Private
{
    // UTF-8 storage on, multiple keys off, multi-line values off.
    ZemIni ini{true, false, false};

    Private() { ini.SetSpaces(false); }
};

HotkeysDocument::HotkeysDocument() : d(std::make_unique<Private>())
{
    clear();
}

HotkeysDocument::~HotkeysDocument() = default;

bool HotkeysDocument::load(const QString& path)
{
    d = std::make_unique<Private>();
    if (path.isEmpty())
        return false;
    // Only regular files: a directory would be parsed as garbage, a device such as /dev/zero
    // would never end, and opening a named pipe would wait for a writer.
    if (!QFileInfo(path).isFile())
        return false;
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        return false;
    const QByteArray bytes = file.readAll();
    if (file.error() != QFileDevice::NoError)
        return false;
    if (d->ini.LoadData(bytes.constData(), size_t(bytes.size())) < 0)
        return false;
    ZemIni::TNamesDepend keys;
    return d->ini.GetAllKeys(hotkeysSection, keys);
}

void HotkeysDocument::clear()
{
    d = std::make_unique<Private>();
    d->ini.SetValue(hotkeysSection, nullptr, nullptr);
}

QVector<HotkeysEntry> HotkeysDocument::entries() const
{
    ZemIni::TNamesDepend keys;
    QVector<HotkeysEntry> result;
    if (!d->ini.GetAllKeys(hotkeysSection, keys))
        return result;
    result.reserve(int(keys.size()));
    for (const ZemIni::Entry& key : keys) {
        const char* value = d->ini.GetValue(hotkeysSection, key.pItem, nullptr);
        result.append({QString::fromLocal8Bit(key.pItem), QString::fromLocal8Bit(value)});
    }
    return result;
}

bool HotkeysDocument::setValue(const QString& key, const QString& value)
{
    return d->ini.SetValue(hotkeysSection, key.toLocal8Bit().constData(), value.toLocal8Bit().constData(),
                           nullptr, false) >= 0;
}

QByteArray HotkeysDocument::toBytes() const
{
    std::string out;
    if (d->ini.Save(out, false) < 0)
        return QByteArray();
    return QByteArray(out.data(), int(out.size()));
}
