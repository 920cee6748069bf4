#pragma once

#include <QByteArray>
#include <QVector>

#include <memory>

// An entry of the [ShortCutKeys] section as the INI reader gives it: key and value bytes,
// trimmed, the value of the last line of that key.
struct HotkeysEntry
{
    QByteArray key;
    QByteArray value;
};

// What the entries of a hotkeys file mean, as the window manager's INI reader reads them:
// UTF-8 storage (a leading byte-order mark is skipped), one value per key, no multi-line
// values, keys compared without regard to ASCII case, a later line of a key overriding an
// earlier one. Only the [ShortCutKeys] section is looked at.
class HotkeysDocument
{
public:
    HotkeysDocument();
    ~HotkeysDocument();
    Q_DISABLE_COPY(HotkeysDocument)

    // False when the bytes hold no [ShortCutKeys] section.
    bool load(const QByteArray& bytes);
    // The entries, ordered by key with ASCII case ignored.
    QVector<HotkeysEntry> entries() const;

private:
    struct Private;
    std::unique_ptr<Private> d;
};
