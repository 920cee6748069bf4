#include "startup.h"

#include <QIcon>
#include <QString>

QIcon editorWindowIcon()
{
    const QIcon icon = QIcon::fromTheme(QStringLiteral("preferences-desktop-keyboard-khotkeys"));
    return icon.isNull() ? QIcon::fromTheme(QStringLiteral("preferences-desktop-keyboard")) : icon;
}

QString singleInstanceId()
{
    return QString::fromLocal8Bit(qgetenv("DISPLAY")) + QLatin1String("zem-admin-hotkeys");
}
