// The project's stand-in for the desktop platform libraries: directories, initialisation, the
// window-manager command channel and the Help menu.
#include "hotkeysfile.h"
#include "startup.h"
#include "stderrcapture.h"
#include "testenvironment.h"
#include "xwindows.h"
#include "zemcore.h"
#include "zemhelpmenu.h"
#include "zemwmcommand.h"

#include <QAction>
#include <QDir>
#include <QIcon>
#include <QImage>
#include <QSettings>
#include <QX11Info>
#include <QtTest>

#include <X11/Xlib.h>

namespace {

// Sets or unsets environment variables for one test and puts them back afterwards.
class EnvironmentOverride
{
public:
    void set(const char* name, const QByteArray& value)
    {
        remember(name);
        if (value.isNull())
            qunsetenv(name);
        else
            qputenv(name, value);
    }
    ~EnvironmentOverride()
    {
        for (auto it = saved.cbegin(); it != saved.cend(); ++it) {
            if (it.value().isNull())
                qunsetenv(it.key().constData());
            else
                qputenv(it.key().constData(), it.value());
        }
    }

private:
    void remember(const char* name)
    {
        if (!saved.contains(name))
            saved.insert(name, qEnvironmentVariableIsSet(name) ? qgetenv(name) : QByteArray());
    }
    QMap<QByteArray, QByteArray> saved;
};

QString dirOf(ZemDir which)
{
    return QString::fromStdString(GetZemDir(which));
}

} // namespace

class TestPlatform : public QObject
{
    Q_OBJECT

private slots:
    void userDirectory_data();
    void userDirectory();
    void userDirectoryIsCreated();
    void systemDirectory_data();
    void systemDirectory();
    void hotkeysFileLocations();
    void initNamesTheSettingsStore();
    void commandReachesRootWindow();
    void commandWithoutDisplay();
    void helpMenu();
    void windowIconFallback_data();
    void windowIconFallback();
    void instanceIdFollowsTheDisplay();

private:
    QTemporaryDir scratch;
};

void TestPlatform::userDirectory_data()
{
    QTest::addColumn<QByteArray>("zemUserDir");
    QTest::addColumn<QByteArray>("xdgConfigHome");
    QTest::addColumn<QString>("expected"); // relative to the scratch directory; "~" is $HOME

    QTest::newRow("ZEM_USER_DIR wins") << QByteArray("zem-user") << QByteArray("xdg") << "zem-user";
    QTest::newRow("trailing slashes dropped") << QByteArray("zem-user//") << QByteArray() << "zem-user";
    QTest::newRow("XDG_CONFIG_HOME next") << QByteArray() << QByteArray("xdg") << "xdg/zem";
    QTest::newRow("then the home directory") << QByteArray() << QByteArray() << "~/.config/zem";
    QTest::newRow("blanks and non-ascii") << QByteArray("my конфиг dir") << QByteArray() << "my конфиг dir";
}

void TestPlatform::userDirectory()
{
    QFETCH(QByteArray, zemUserDir);
    QFETCH(QByteArray, xdgConfigHome);
    QFETCH(QString, expected);

    const QString base = scratch.filePath(QString::fromLatin1(QTest::currentDataTag()).replace(' ', '_'));
    const auto inBase = [&](const QByteArray& relative) {
        return relative.isNull() ? QByteArray() : QFile::encodeName(base + QLatin1Char('/')) + relative;
    };
    EnvironmentOverride environment;
    environment.set("ZEM_USER_DIR", inBase(zemUserDir));
    environment.set("XDG_CONFIG_HOME", inBase(xdgConfigHome));
    environment.set("HOME", QFile::encodeName(base + QLatin1String("/home")));

    QString want = expected.startsWith(QLatin1Char('~')) ? base + QLatin1String("/home") + expected.mid(1)
                                                         : base + QLatin1Char('/') + expected;
    QCOMPARE(dirOf(ZEM_USER_CONFIG_DIR), want);
}

void TestPlatform::userDirectoryIsCreated()
{
    const QString dir = scratch.filePath(QStringLiteral("brand/new/account/zem"));
    EnvironmentOverride environment;
    environment.set("ZEM_USER_DIR", QFile::encodeName(dir));
    QVERIFY(!QFileInfo::exists(dir));
    QCOMPARE(dirOf(ZEM_USER_CONFIG_DIR), dir);
    QVERIFY(QFileInfo(dir).isDir());
}

void TestPlatform::systemDirectory_data()
{
    QTest::addColumn<QByteArray>("zemSystemDir");
    QTest::addColumn<QString>("expected");

    QTest::newRow("ZEM_SYSTEM_DIR") << QByteArray("/opt/zem/etc") << "/opt/zem/etc";
    QTest::newRow("trailing slash dropped") << QByteArray("/opt/zem/etc/") << "/opt/zem/etc";
    QTest::newRow("root stays root") << QByteArray("/") << "/";
}

void TestPlatform::systemDirectory()
{
    QFETCH(QByteArray, zemSystemDir);
    QFETCH(QString, expected);
    EnvironmentOverride environment;
    environment.set("ZEM_SYSTEM_DIR", zemSystemDir);
    QCOMPARE(dirOf(ZEM_SYSTEM_CONFIG_DIR), expected);
}

void TestPlatform::hotkeysFileLocations()
{
    EnvironmentOverride environment;
    environment.set("ZEM_USER_DIR", QByteArray("/home/u/.config/zem"));
    environment.set("ZEM_SYSTEM_DIR", QByteArray("/etc/zem"));
    environment.set("ZEM_SESSION_SUFFIX", QByteArray());
    QCOMPARE(userHotkeysFilePath(), QStringLiteral("/home/u/.config/zem/keyshortcutrc"));
    QCOMPARE(systemHotkeysFilePath(), QStringLiteral("/etc/zem/keyshortcutrc"));
    QCOMPARE(QString::fromStdString(zemSessionConfigSuffix(ZEM_CURRENT_SESSION)), QString());

    environment.set("ZEM_SESSION_SUFFIX", QByteArray("-kiosk"));
    QCOMPARE(userHotkeysFilePath(), QStringLiteral("/home/u/.config/zem/keyshortcutrc-kiosk"));
    QCOMPARE(systemHotkeysFilePath(), QStringLiteral("/etc/zem/keyshortcutrc-kiosk"));
}

void TestPlatform::initNamesTheSettingsStore()
{
    zemInit("2.8.16", "Zem hotkeys editor");
    QCOMPARE(QCoreApplication::applicationName(), QStringLiteral("zem-admin-hotkeys"));
    QCOMPARE(QCoreApplication::organizationName(), QStringLiteral("zem"));
    QCOMPARE(QCoreApplication::applicationVersion(), QStringLiteral("2.8.16"));
    QCOMPARE(QGuiApplication::desktopFileName(), QStringLiteral("zem-admin-hotkeys"));

    // Even outside a desktop session the editor's themed icons are found.
    QVERIFY(!QIcon::fromTheme(QStringLiteral("edit-delete")).isNull());
    QVERIFY(!QIcon::fromTheme(QStringLiteral("document-save")).isNull());

    QSettings settings;
    QCOMPARE(settings.fileName(), QString::fromLocal8Bit(qgetenv("XDG_CONFIG_HOME")) +
                                      QLatin1String("/zem/zem-admin-hotkeys.conf"));
}

void TestPlatform::commandReachesRootWindow()
{
    Display* display = QX11Info::display();
    QVERIFY2(display, "this test needs an X server");
    XConnection observer;
    QVERIFY(observer.isOpen());
    observer.deleteRootProperty("_ZEMWM_COMMAND");

    const QByteArray path = QString::fromUtf8("/home/u/my keys/ключи").toLocal8Bit();
    const QByteArray first = "ZEMWM_UPDATE_VAL SCKeysFile " + path + "\n";
    SendCommandToWM(display, first.constData());
    QTRY_COMPARE(observer.rootProperty("_ZEMWM_COMMAND"), first);

    // A second command before the window manager took the first is appended, not lost.
    SendCommandToWM(display, "ZEMWM_UPDATE_VAL SCKeysFile /tmp/b\n");
    QTRY_COMPARE(observer.rootProperty("_ZEMWM_COMMAND"), first + "ZEMWM_UPDATE_VAL SCKeysFile /tmp/b\n");
    observer.deleteRootProperty("_ZEMWM_COMMAND");
}

void TestPlatform::commandWithoutDisplay()
{
    StderrCapture capture;
    SendCommandToWM(nullptr, "ZEMWM_UPDATE_VAL SCKeysFile /tmp/x\n");
    const QByteArray said = capture.finish();
    QVERIFY2(said.startsWith("zem-admin-hotkeys: ") && said.endsWith('\n') && said.count('\n') == 1,
             said.constData());
}

void TestPlatform::helpMenu()
{
    QWidget window;
    auto* menu = new ZemHelpMenu(&window);
    QCOMPARE(menu->parentWidget(), &window);
    QCOMPARE(menu->title(), QStringLiteral("&Help"));
    QStringList texts;
    for (QAction* action : menu->actions())
        texts << action->text();
    QCOMPARE(texts, (QStringList{"About Zem hotkeys editor", "About Qt"}));
}

void TestPlatform::windowIconFallback_data()
{
    QTest::addColumn<QStringList>("themeIcons");
    QTest::addColumn<QString>("chosen"); // empty: no icon at all

    QTest::newRow("hotkeys icon") << QStringList{"preferences-desktop-keyboard-khotkeys",
                                                 "preferences-desktop-keyboard"}
                                  << "preferences-desktop-keyboard-khotkeys";
    QTest::newRow("keyboard icon as fallback")
        << QStringList{"preferences-desktop-keyboard"} << "preferences-desktop-keyboard";
    QTest::newRow("neither") << QStringList() << "";
}

void TestPlatform::windowIconFallback()
{
    QFETCH(QStringList, themeIcons);
    QFETCH(QString, chosen);

    // A theme of the test's own, holding just the icons of this row; Qt keeps the themes it
    // has read, so every row has a theme of another name.
    static int rowNumber = 0;
    const QString themeName = QStringLiteral("testtheme%1").arg(++rowNumber);
    const QString base = scratch.filePath(QStringLiteral("icons"));
    QVERIFY(writeFile(base + "/" + themeName + "/index.theme",
                      "[Icon Theme]\nName=test\nDirectories=apps\n\n[apps]\nSize=48\nType=Fixed\n"));
    QVERIFY(QDir().mkpath(base + "/" + themeName + "/apps"));
    for (const QString& name : themeIcons) {
        QImage image(48, 48, QImage::Format_ARGB32);
        image.fill(Qt::blue);
        QVERIFY(image.save(base + "/" + themeName + "/apps/" + name + ".png"));
    }
    const QStringList searchPaths = QIcon::themeSearchPaths();
    const QString theme = QIcon::themeName();
    const QString fallback = QIcon::fallbackThemeName();
    QIcon::setThemeSearchPaths({base});
    QIcon::setThemeName(themeName);
    QIcon::setFallbackThemeName(themeName);
    // A themed icon is looked up when it is first used, so it is looked at before the real
    // theme comes back.
    const QIcon icon = editorWindowIcon();
    const bool isNull = icon.isNull();
    const QString name = icon.name();
    QIcon::setThemeSearchPaths(searchPaths);
    QIcon::setThemeName(theme);
    QIcon::setFallbackThemeName(fallback);

    QCOMPARE(isNull, chosen.isEmpty());
    QCOMPARE(name, chosen);
}

void TestPlatform::instanceIdFollowsTheDisplay()
{
    EnvironmentOverride environment;
    environment.set("DISPLAY", QByteArray(":7.0"));
    QCOMPARE(singleInstanceId(), QStringLiteral(":7.0zem-admin-hotkeys"));
    environment.set("DISPLAY", QByteArray());
    QCOMPARE(singleInstanceId(), QStringLiteral("zem-admin-hotkeys"));
}

ZEM_TEST_MAIN(TestPlatform)
#include "tst_platform.moc"
