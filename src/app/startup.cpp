#include "startup.h"

#include <QByteArray>
#include <QIcon>
#include <QString>

#include <X11/Xlib.h>

#include <cstring>

QIcon editorWindowIcon()
{
    for (const char* name : {"preferences-desktop-keyboard-khotkeys", "preferences-desktop-keyboard"}) {
        const QIcon icon = QIcon::fromTheme(QLatin1String(name));
        if (!icon.isNull())
            return icon;
    }
    // The editor's own, from the icon theme where it is installed, else from the program itself.
    return QIcon::fromTheme(QStringLiteral("zem-admin-hotkeys"),
                            QIcon(QStringLiteral(":/icons/zem-admin-hotkeys.svg")));
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
