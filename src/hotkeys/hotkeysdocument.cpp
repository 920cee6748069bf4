#include "hotkeysdocument.h"

#include "hotkeysfile.h"
#include "zemini.h"

struct HotkeysDocument::Private
{
    // UTF-8 storage on, multiple keys off, multi-line values off.
    ZemIni ini{true, false, false};

    Private() { ini.SetSpaces(false); }
};

HotkeysDocument::HotkeysDocument() : d(std::make_unique<Private>()) {}

HotkeysDocument::~HotkeysDocument() = default;

bool HotkeysDocument::load(const QByteArray& bytes)
{
    d = std::make_unique<Private>();
    if (d->ini.LoadData(bytes.constData(), size_t(bytes.size())) < 0)
        return false;
    ZemIni::TNamesDepend keys;
    return d->ini.GetAllKeys(hotkeysSection, keys);
}

QVector<HotkeysEntry> HotkeysDocument::entries() const
{
    ZemIni::TNamesDepend keys;
    QVector<HotkeysEntry> result;
    if (!d->ini.GetAllKeys(hotkeysSection, keys))
        return result;
    result.reserve(int(keys.size()));
    for (const ZemIni::Entry& key : keys)
        result.append({QByteArray(key.pItem), QByteArray(d->ini.GetValue(hotkeysSection, key.pItem, ""))});
    return result;
}
