#include "hotkeysfile.h"

#include "zemcore.h"
#include "zemkeyserver.h"

#include <QRegularExpression>

namespace {

QString hotkeysFileIn(ZemDir dir)
{
    return QString::fromStdString(GetZemDir(dir)) + QLatin1String("/keyshortcutrc") +
           QString::fromStdString(zemSessionConfigSuffix(ZEM_CURRENT_SESSION));
}

} // namespace

QString userHotkeysFilePath()
{
    return hotkeysFileIn(ZEM_USER_CONFIG_DIR);
}

QString systemHotkeysFilePath()
{
    return hotkeysFileIn(ZEM_SYSTEM_CONFIG_DIR);
}

QString toFileKey(const QString& keyString)
{
    QString key = keyString;
    const int lastPlus = key.lastIndexOf(QLatin1Char('+'));
    if (lastPlus < 0) {
        if (key.size() == 1)
            key = key.toLower();
        return QLatin1String("None|") + key;
    }
    const QString keyPart = key.mid(lastPlus + 1);
    if (keyPart.size() == 1)
        key = key.left(lastPlus + 1) + keyPart.toLower();
    key.replace(QLatin1Char('+'), QLatin1Char('|'));
    return key;
}

QString fromFileKey(const QString& fileKey)
{
    static const QRegularExpression placeholder(QStringLiteral("None[0-9]+"));

    QString key = fileKey;
    if (key.startsWith(QLatin1Char('"')))
        key = key.mid(1, key.size() - 2);
    key.replace(QLatin1Char('|'), QLatin1Char('+'));
    key.remove(QStringLiteral("None+"));
    key.remove(placeholder);

    if (key == QLatin1String("XF86Calculator"))
        return QStringLiteral("Calculator");
    const QString converted = ZemKeyServer::KeyStringXToQt(key);
    return converted.isEmpty() ? key : converted;
}
