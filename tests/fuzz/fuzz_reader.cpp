// The line model and the INI reader must agree on every entry of [ShortCutKeys], whatever the
// bytes: the line model decides what is written back, the reader what it means.
#include "hotkeysdocument.h"
#include "hotkeysentries.h"
#include "hotkeysfile.h"
#include "hotkeyslines.h"
#include "keyforms.h"

#include <QMap>

#include <algorithm>
#include <cstdlib>

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    const QByteArray bytes(reinterpret_cast<const char*>(data), int(size));
    HotkeysDocument document;
    const bool hasSection = document.load(bytes);
    QMap<QByteArray, QByteArray> read;
    for (const HotkeysEntry& entry : document.entries())
        read.insert(foldedKey(entry.key), entry.value);

    const HotkeysLines lines(bytes);
    QMap<QByteArray, QByteArray> scanned;
    bool sectionSeen = false;
    for (int i = 0; i < lines.lines().size(); ++i) {
        const HotkeysLine& line = lines.lines().at(i);
        sectionSeen |= lines.isHotkeysSection(i);
        if (line.kind == HotkeysLine::Entry && lines.isHotkeysSection(line.section))
            scanned.insert(foldedKey(line.key), line.value);
        // Lines follow each other and stay inside the bytes.
        if (line.start < lines.leadingStart(i) || line.end < line.start || line.end > bytes.size())
            std::abort();
    }
    if (hasSection != sectionSeen || read != scanned)
        std::abort();

    // Every line of the section belongs to one key, and exactly one line of each key counts.
    HotkeysEntries entries;
    if (entries.read(bytes) != hasSection)
        std::abort();
    QVector<int> owned;
    for (const KeyEntry& entry : entries.entries()) {
        if (entry.counting < 0)
            std::abort();
        owned << entry.counting << entry.others;
    }
    std::sort(owned.begin(), owned.end());
    QVector<int> inSection;
    for (int i = 0; i < entries.lines().lines().size(); ++i) {
        const HotkeysLine& line = entries.lines().lines().at(i);
        if (line.kind == HotkeysLine::Entry && entries.lines().isHotkeysSection(line.section))
            inSection << i;
    }
    if (hasSection && owned != inSection)
        std::abort();
    return 0;
}
