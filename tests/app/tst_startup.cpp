// Start-up as the user meets it: the real program in a process of its own, its boxes answered by
// key presses through xdotool, its exit statuses, what it prints and what it leaves on disk.
#include "testenvironment.h"

#include <QCryptographicHash>
#include <QElapsedTimer>
#include <QProcess>
#include <QtTest>

#include <sys/mount.h>

class TestStartup : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void exitStatus_data();
    void exitStatus();
    void secondStartShowsTheFirst_data();
    void secondStartShowsTheFirst();

private:
    QProcessEnvironment environment() const;
    // Waits for a window of that exact title and presses the key in it.
    static bool answer(const QString& title, const char* key);

    QTemporaryDir scratch;
    QString dir;
};

void TestStartup::init()
{
    // Every case has directories of its own, blanks and Cyrillic in their names.
    static int counter = 0;
    dir = scratch.filePath(QStringLiteral("case %1 ключ").arg(++counter));
    QVERIFY(writeFile(dir + QLatin1String("/system/keyshortcutrc"), "[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\n"));
    QVERIFY(QDir().mkpath(dir + QLatin1String("/user")));
    QVERIFY(QDir().mkpath(dir + QLatin1String("/run")));
    QVERIFY(QFile::setPermissions(dir + QLatin1String("/run"),
                                  QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
}

QProcessEnvironment TestStartup::environment() const
{
    QProcessEnvironment env = QProcessEnvironment::systemEnvironment();
    env.insert(QStringLiteral("XDG_CONFIG_HOME"), dir + QLatin1String("/config"));
    env.insert(QStringLiteral("ZEM_USER_DIR"), dir + QLatin1String("/user"));
    env.insert(QStringLiteral("ZEM_SYSTEM_DIR"), dir + QLatin1String("/system"));
    env.insert(QStringLiteral("QT_QPA_PLATFORM"), QStringLiteral("xcb"));
    env.insert(QStringLiteral("XDG_RUNTIME_DIR"), dir + QLatin1String("/run"));
    return env;
}

bool TestStartup::answer(const QString& title, const char* key)
{
    QProcess search;
    search.start(QStringLiteral("timeout"),
                 QStringLiteral("10 xdotool search --sync --onlyvisible --name").split(' ')
                     << QLatin1Char('^') + title + QLatin1Char('$'));
    if (!search.waitForFinished(15000) || search.exitCode() != 0)
        return false;
    const QString window =
        QString::fromLatin1(search.readAllStandardOutput()).section(QLatin1Char('\n'), 0, 0);
    return QProcess::execute(QStringLiteral("xdotool"),
                             QStringLiteral("windowfocus --sync %1 key %2").arg(window, key).split(' ')) == 0;
}

void TestStartup::exitStatus_data()
{
    QTest::addColumn<QString>("setup"); // what the case prepares
    QTest::addColumn<QStringList>("arguments");
    QTest::addColumn<QString>("box"); // title of the box answered with Return or Escape
    QTest::addColumn<int>("status");
    QTest::addColumn<QString>("said"); // part of what it prints

    QTest::newRow("usage, without a display too")
        << "nodisplay" << QStringList{"-h", "x"} << "" << 1
        << "Usage: zem-admin-hotkeys filepath - open/create file as hotkeys coll\n\n";
    QTest::newRow("the version, without a display")
        << "nodisplay" << QStringList{"--version"} << "" << 0 << "zem-admin-hotkeys 2.8.16\n";
    QTest::newRow("anything else without a display, in one line")
        << "nodisplay" << QStringList() << "" << 5 << "zem-admin-hotkeys: cannot open the X display \"\"\n";
    QTest::newRow("a missing named file, not created")
        << "" << QStringList{"@/new.rc"} << "Warning Escape" << 2 << "";
    QTest::newRow("the user's file on a full disk: none is left behind")
        << "full" << QStringList() << "Attention Return" << 3 << "No space left on device";
    QTest::newRow("no section") << "junk" << QStringList{"@/junk.rc"} << "Attention Return" << 4
                                << "junk.rc: No [ShortCutKeys] section";
    QTest::newRow("the system file missing is the one named")
        << "nosystem" << QStringList() << "Attention Return" << 4 << "system/keyshortcutrc: No such file";
}

void TestStartup::exitStatus()
{
    QFETCH(QString, setup);
    QFETCH(QStringList, arguments);
    QFETCH(QString, box);
    QFETCH(int, status);
    QFETCH(QString, said);

    for (QString& argument : arguments)
        argument.replace(QLatin1Char('@'), dir);
    if (setup == QLatin1String("junk"))
        QVERIFY(writeFile(dir + QLatin1String("/junk.rc"), "a=b\n"));
    if (setup == QLatin1String("nosystem"))
        QVERIFY(QFile::remove(dir + QLatin1String("/system/keyshortcutrc")));
    const QString userDir = dir + QLatin1String("/user");
    if (setup == QLatin1String("full")) {
        // The user's directory on a filesystem with no room left.
        if (::mount("tmpfs", QFile::encodeName(userDir).constData(), "tmpfs", 0, "size=4k") != 0)
            QSKIP("No tmpfs can be mounted here");
        QFile filler(userDir + QLatin1String("/.filler"));
        QVERIFY(filler.open(QIODevice::WriteOnly));
        while (filler.write(QByteArray(4096, 'x')) > 0 && filler.flush()) {
        }
    }
    const auto unmount = qScopeGuard([&] {
        if (setup == QLatin1String("full"))
            ::umount2(QFile::encodeName(userDir).constData(), MNT_DETACH);
    });
    QProcess editor;
    QProcessEnvironment env = environment();
    if (setup == QLatin1String("nodisplay"))
        env.remove(QStringLiteral("DISPLAY"));
    editor.setProcessEnvironment(env);
    editor.start(QStringLiteral(ZEM_EDITOR_BINARY), arguments);
    for (const QString& step : box.split(QLatin1Char('|'), Qt::SkipEmptyParts))
        QVERIFY2(answer(step.section(QLatin1Char(' '), 0, 0), qPrintable(step.section(QLatin1Char(' '), 1))),
                 qPrintable(step));
    QVERIFY(editor.waitForFinished(15000));
    QCOMPARE(editor.exitCode(), status);
    const QString output =
        QString::fromLocal8Bit(editor.readAllStandardOutput() + editor.readAllStandardError());
    QVERIFY2(output.contains(said), qPrintable(output));
    // Nothing is created but the user's file, and only when it can be written whole.
    QCOMPARE(QFile::exists(dir + QLatin1String("/user/keyshortcutrc")), setup == QLatin1String("nosystem"));
    QCOMPARE(QDir(userDir).entryList({QStringLiteral(".keyshortcutrc*")}, QDir::Files | QDir::Hidden),
             QStringList());
}

void TestStartup::secondStartShowsTheFirst_data()
{
    QTest::addColumn<QString>("place"); // where lock and socket can go
    QTest::newRow("the runtime directory") << "runtime";
    QTest::newRow("no runtime directory, TMPDIR a file") << "tmpfile";
    QTest::newRow("no runtime directory, TMPDIR too long for a socket") << "tmplong";
    QTest::newRow("a lock that cannot be made: the editor starts all the same") << "planted";
}

void TestStartup::secondStartShowsTheFirst()
{
    QFETCH(QString, place);
    QProcessEnvironment env = environment();
    if (place != QLatin1String("runtime") && place != QLatin1String("planted"))
        env.remove(QStringLiteral("XDG_RUNTIME_DIR"));
    if (place == QLatin1String("tmpfile")) {
        QVERIFY(writeFile(dir + QLatin1String("/tmpfile"), "x"));
        env.insert(QStringLiteral("TMPDIR"), dir + QLatin1String("/tmpfile"));
    } else if (place == QLatin1String("tmplong")) {
        env.insert(QStringLiteral("TMPDIR"), dir + QLatin1Char('/') + QString(120, QLatin1Char('t')));
        QVERIFY(QDir().mkpath(env.value(QStringLiteral("TMPDIR"))));
    } else if (place == QLatin1String("planted")) {
        const QByteArray id = qgetenv("DISPLAY") + "zem-admin-hotkeys";
        const QString name =
            QString::fromLatin1(QCryptographicHash::hash(id, QCryptographicHash::Sha1).toHex().left(16));
        QVERIFY(
            QDir().mkpath(dir + QLatin1String("/run/zem-admin-hotkeys-") + name + QLatin1String(".lock")));
    }
    QProcess first;
    first.setProcessEnvironment(env);
    first.start(QStringLiteral(ZEM_EDITOR_BINARY), QStringList());
    // A missing user's file is created without a question.
    QVERIFY(answer(QStringLiteral("Zem hotkeys editor - keyshortcutrc"), "Tab"));
    QCOMPARE(readFile(dir + QLatin1String("/user/keyshortcutrc")), QByteArray("[ShortCutKeys]\n"));
    if (place == QLatin1String("planted")) {
        first.terminate();
        QVERIFY(first.waitForFinished(5000));
        QVERIFY(first.readAllStandardError().contains("cannot make the instance lock"));
        return;
    }

    QProcess second;
    second.setProcessEnvironment(env);
    QElapsedTimer clock;
    clock.start();
    // Given a file, the second start says that the running editor was brought forward instead.
    second.start(QStringLiteral(ZEM_EDITOR_BINARY), {dir + QLatin1String("/other.rc")});
    QVERIFY(second.waitForFinished(5000));
    QCOMPARE(second.exitCode(), 0);
    QVERIFY2(clock.elapsed() < 3000, "the second start waited for nothing");
    const QByteArray said = second.readAllStandardError();
    QVERIFY2(said.contains("brought forward") && said.count("zem-admin-hotkeys: ") == 1, said);
    first.terminate();
    QVERIFY(first.waitForFinished(5000));
}

ZEM_TEST_MAIN(TestStartup)
#include "tst_startup.moc"
