#include "keysconfform.h"

#include "hotkeysdocument.h"
#include "hotkeysfile.h"
#include "zemkeyserver.h"

#include <QKeySequence>
#include <QRegularExpression>
#include <QSaveFile>
#include <QSet>
#include <QTreeWidget>
#include <QTreeWidgetItemIterator>

#include <cstdio>

namespace {

// The file form of a stored key: its first key as the key server names it, or the stored text
// itself when the key server cannot name it.
QString fileKeyOf(const QString& storedKey)
{
    const QKeySequence sequence = QKeySequence::fromString(storedKey, QKeySequence::NativeText);
    QString keyString = ZemKeyServer::KeyQtToKeyStringX(sequence.isEmpty() ? 0 : sequence[0]);
    if (keyString.isEmpty())
        keyString = storedKey;
    return toFileKey(keyString);
}

void setOrComplain(HotkeysDocument& document, const QString& key, const QString& value)
{
    if (!document.setValue(key, value))
        std::fputs("zem-admin-hotkeys: Can't set value\n", stderr);
}

} // namespace

bool KeysConfForm::saveFile()
{
    if (!modified)
        return true;
    if (currentFile.isEmpty())
        return false;
    const bool userFile = currentFile == userHotkeysFilePath();

    // Keyless commands are stored under placeholder keys; a number that a row already carries
    // from an earlier save is not given out again, or the second entry would replace the first.
    static const QRegularExpression placeholderKey(QStringLiteral("^None([0-9]+)$"));
    QSet<int> placeholdersInUse;
    for (QTreeWidgetItemIterator it(keysTree); *it; ++it) {
        const QRegularExpressionMatch match = placeholderKey.match(itemKey(*it));
        if (match.hasMatch())
            placeholdersInUse.insert(match.captured(1).toInt());
    }
    int placeholder = 0;

    // The whole document is made in memory; the file is replaced only once it is complete.
    HotkeysDocument document;
    for (QTreeWidgetItemIterator it(keysTree); *it; ++it) {
        QTreeWidgetItem* row = *it;
        if (userFile && row->text(3) != userSource)
            continue;
        if (itemKey(row).isEmpty()) {
            if (row->text(2) != QLatin1String("ExecCommand"))
                continue;
            while (placeholdersInUse.contains(placeholder))
                ++placeholder;
            placeholdersInUse.insert(placeholder);
            setItemKey(row, QStringLiteral("None%1").arg(placeholder));
            row->setText(3, userSource);
        }
        // Quoting every command line keeps one that begins or ends with a quote intact.
        const QString action = row->text(2).contains(QLatin1String("ZEMWM_"))
                                   ? row->text(2)
                                   : QLatin1Char('"') + row->text(0) + QLatin1Char('"');
        setOrComplain(document, fileKeyOf(itemKey(row)), action);
    }
    for (const QString& key : qAsConst(disabledKeys))
        setOrComplain(document, fileKeyOf(key), QStringLiteral("\"Disable\""));

    const QByteArray bytes = document.toBytes();
    QSaveFile file(currentFile);
    if (bytes.isEmpty() || !file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size() ||
        !file.commit()) {
        std::fprintf(stderr, "zem-admin-hotkeys: Can't save file %s\n",
                     currentFile.toLocal8Bit().constData());
        return false;
    }
    return true;
}
