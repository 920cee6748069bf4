#include "zemcore.h"

#include <QByteArray>
#include <QDir>
#include <QFileInfo>
#include <QGuiApplication>
#include <QIcon>
#include <QLibraryInfo>
#include <QLocale>
#include <QTranslator>

namespace {

QString environmentPath(const char* name)
{
    return QString::fromLocal8Bit(qgetenv(name));
}

QString withoutTrailingSlash(QString path)
{
    while (path.size() > 1 && path.endsWith(QLatin1Char('/')))
        path.chop(1);
    return path;
}

// A directory of the installation the running program belongs to, found from where the program
// is, so that an installation works under whatever prefix it was put; the system configuration
// of a program in /usr/bin is /etc. `fallback` where there is no such directory (a build tree).
QString besideProgram(const QString& fromBin, const QString& fallback)
{
    const QString bin = QCoreApplication::instance() ? QCoreApplication::applicationDirPath() : QString();
    if (bin.isEmpty())
        return fallback;
    QString dir = QDir::cleanPath(bin + QLatin1Char('/') + fromBin);
    if (QDir::cleanPath(bin + QLatin1String("/..")) == QLatin1String("/usr") &&
        dir.startsWith(QLatin1String("/usr/etc/")))
        dir = dir.mid(4);
    return QFileInfo(dir).isDir() ? dir : fallback;
}

QString userConfigDir()
{
    QString dir = environmentPath("ZEM_USER_DIR");
    if (!dir.isEmpty())
        return dir;
    QString base = environmentPath("XDG_CONFIG_HOME");
    if (base.isEmpty())
        base = QDir::homePath() + QLatin1String("/.config");
    return base + QLatin1String("/zem");
}

void installTranslator(QTranslator* translator, const QString& name, const QString& directory)
{
    if (translator->load(QLocale(), name, QStringLiteral("_"), directory))
        QCoreApplication::installTranslator(translator);
    else
        delete translator;
}

// Outside a desktop session Qt knows no icon theme, and every themed icon of the editor would be
// blank; fall back on a complete theme that is installed.
void useInstalledIconTheme()
{
    if (!QIcon::fallbackThemeName().isEmpty() && QIcon::fallbackThemeName() != QLatin1String("hicolor"))
        return;
    for (const char* theme : {"breeze", "Adwaita", "oxygen", "Tango"}) {
        for (const QString& base : QIcon::themeSearchPaths()) {
            if (QFileInfo::exists(base + QLatin1Char('/') + QLatin1String(theme) +
                                  QLatin1String("/index.theme"))) {
                QIcon::setFallbackThemeName(QLatin1String(theme));
                return;
            }
        }
    }
}

} // namespace

void zemInit(const char* version, const char* displayName)
{
    QCoreApplication::setOrganizationName(QStringLiteral("zem"));
    QCoreApplication::setApplicationName(QStringLiteral("zem-admin-hotkeys"));
    QCoreApplication::setApplicationVersion(QString::fromUtf8(version));
    // The display name is kept out of Qt's hands: Qt would append it to every window title,
    // and the editor's titles already say what they are.
    Q_UNUSED(displayName)
    QGuiApplication::setDesktopFileName(QStringLiteral("zem-admin-hotkeys"));

    QCoreApplication* app = QCoreApplication::instance();
    if (!app)
        return;
    useInstalledIconTheme();
    zemInstallTranslations();
}

void zemInstallTranslations()
{
    QCoreApplication* app = QCoreApplication::instance();
    if (!app)
        return;
    // Qt's own catalogue translates the standard buttons of the message boxes.
    installTranslator(new QTranslator(app), QStringLiteral("qtbase"),
                      QLibraryInfo::location(QLibraryInfo::TranslationsPath));
    installTranslator(new QTranslator(app), QStringLiteral("zem-admin-hotkeys"),
                      besideProgram(QStringLiteral(ZEM_TRANSLATIONS_FROM_BIN), QString()));
}

const std::string& GetZemDir(ZemDir which)
{
    // Answered anew on every call, so that a changed environment is seen; the caller may keep
    // the reference until the next call for the same directory.
    static std::string systemDir;
    static std::string userDir;

    if (which == ZEM_USER_CONFIG_DIR) {
        const QString dir = withoutTrailingSlash(userConfigDir());
        QDir().mkpath(dir);
        userDir = dir.toUtf8().toStdString();
        return userDir;
    }

    QString dir = environmentPath("ZEM_SYSTEM_DIR");
    if (dir.isEmpty())
        dir = besideProgram(QStringLiteral(ZEM_SYSTEM_DIR_FROM_BIN), QStringLiteral(ZEM_BUILD_SYSTEM_DIR));
    systemDir = withoutTrailingSlash(dir).toUtf8().toStdString();
    return systemDir;
}

std::string zemSessionConfigSuffix(WhatZemSession)
{
    return qgetenv("ZEM_SESSION_SUFFIX").toStdString();
}
