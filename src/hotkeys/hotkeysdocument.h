#pragma once

#include <QByteArray>
#include <QString>
#include <QVector>

#include <memory>

struct HotkeysEntry
{
    QString key;   // as written in the file, decoded
    QString value; // as written, decoded; empty when the line has none
};

// One hotkeys file as an INI document, always set up the same way: UTF-8 storage (a leading
// byte-order mark is skipped), one value per key, no multi-line values, no spaces around "=",
// keys compared without regard to ASCII case. Text crosses into and out of it in the local
// 8-bit encoding. Only the [ShortCutKeys] section is read or written.
class HotkeysDocument
{
public:
    HotkeysDocument();
    ~HotkeysDocument();
    Q_DISABLE_COPY(HotkeysDocument)

    // Reads the file; false when it cannot be read or lacks the [ShortCutKeys] section.
    bool load(const QString& path);
    // Starts over with a document holding only an empty [ShortCutKeys] section.
    void clear();

    // The entries of the section, ordered by key with ASCII case ignored.
    QVector<HotkeysEntry> entries() const;
    // Sets an entry; an existing key (in any case) keeps its place and takes the new value.
    bool setValue(const QString& key, const QString& value);
    // The document as the window manager reads it, without a byte-order mark.
    QByteArray toBytes() const;

private:
    struct Private;
    std::unique_ptr<Private> d;
};
