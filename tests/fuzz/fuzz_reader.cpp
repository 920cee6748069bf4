// The line model and the INI reader must agree on every entry of [ShortCutKeys], whatever the
// bytes: the line model decides what is written back, the reader what it means.
#include "hotkeysdocument.h"
#include "hotkeysfile.h"
#include "keyforms.h"
#include "hotkeyslines.h"

#include <QMap>

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
    return 0;
}
