#include "hotkeysentries.h"

#include "hotkeysdocument.h"
#include "keyforms.h"

#include <QHash>

#include <algorithm>

bool HotkeysEntries::read(const QByteArray& bytes)
{
    HotkeysDocument document;
    if (!document.load(bytes))
        return false;
    lineModel = HotkeysLines(bytes);
    keys.clear();
    index.clear();

    QHash<QByteArray, QVector<int>> linesOfText;
    const QVector<HotkeysLine>& all = lineModel.lines();
    for (int i = 0; i < all.size(); ++i) {
        if (all.at(i).kind == HotkeysLine::Entry && lineModel.isHotkeysSection(all.at(i).section))
            linesOfText[foldedKey(all.at(i).key)].append(i);
    }
    for (const HotkeysEntry& entry : document.entries()) {
        QVector<int> lines = linesOfText.value(foldedKey(entry.key));
        const QByteArray identity = keyIdentity(entry.key);
        const auto known = index.constFind(identity);
        if (known != index.cend()) {
            keys[*known].others += lines;
            continue;
        }
        KeyEntry key{identity, entry.key, entry.value, -1, {}};
        if (!lines.isEmpty())
            key.counting = lines.takeLast();
        key.others = lines;
        index.insert(identity, keys.size());
        keys.append(key);
    }
    for (KeyEntry& key : keys)
        std::sort(key.others.begin(), key.others.end());
    return true;
}

const KeyEntry* HotkeysEntries::find(const QByteArray& identity) const
{
    const auto it = index.constFind(identity);
    return it == index.cend() ? nullptr : &keys.at(*it);
}
