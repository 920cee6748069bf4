#include "startup.h"

#include <QByteArray>
#include <QIcon>
#include <QString>

#include <X11/Xlib.h>

#include <cstring>

QIcon editorWindowIcon()
{
    const QIcon icon = QIcon::fromTheme(QStringLiteral("preferences-desktop-keyboard-khotkeys"));
    return icon.isNull() ? QIcon::fromTheme(QStringLiteral("preferences-desktop-keyboard")) : icon;
}

QString singleInstanceId()
{
    return QString::fromLocal8Bit(qgetenv("DISPLAY")) + QLatin1String("zem-admin-hotkeys");
}

QByteArray displayToOpen(int argc, char** argv)
{
    const QByteArray platform = qgetenv("QT_QPA_PLATFORM");
    if (!platform.isEmpty() && !platform.startsWith("xcb"))
        return QByteArray();
    QByteArray name = qgetenv("DISPLAY");
    for (int i = 1; i + 1 < argc; ++i) {
        if (std::strcmp(argv[i], "-display") == 0)
            name = argv[i + 1];
    }
    if (Display* display = XOpenDisplay(name.isEmpty() ? nullptr : name.constData())) {
        XCloseDisplay(display);
        return QByteArray();
    }
    return name.isNull() ? QByteArray("") : name;
}
