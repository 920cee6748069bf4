// zem-hotkeys as an administrator runs it: a process of its own on small files, no display but
// for apply; what it prints, its exit statuses and the bytes it writes.
#include <QProcess>
#include <QStandardPaths>
#include <QTemporaryDir>
#include <QtTest>

#include <X11/Xlib.h>

#include <memory>
#include <unistd.h>
#include <vector>

class TestCli : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void check_data();
    void check();
    void list();
    void edit_data();
    void edit();
    void concurrentWriters();
    void anotherAccountsFile();
    void applyAndUsage();

private:
    // Runs zem-hotkeys; gives its exit status and fills what it printed.
    // A launcher (a program and its arguments) runs it, as another account for example.
    int run(const QStringList& arguments, bool display = false, const QStringList& launcher = {});
    QProcessEnvironment environment(bool display) const;
    void write(const QString& name, const QByteArray& entries);
    QByteArray read(const QString& name) const;

    QTemporaryDir dir;
    QByteArray out;
    QByteArray err;
    int lastStatus = -1;
};

void TestCli::init()
{
    write(QStringLiteral("system/keyshortcutrc"), "Alt|F4=ZEMWM_CLOSE\nCtrl|Alt|t=\"sh -c true\"\n");
    write(QStringLiteral("user/keyshortcutrc"), "Alt|F5=ZEMWM_LOCK\nCtrl|q=\"Disable\"\n");
}

void TestCli::write(const QString& name, const QByteArray& entries)
{
    QDir().mkpath(QFileInfo(dir.filePath(name)).path());
    QFile file(dir.filePath(name));
    QVERIFY(file.open(QIODevice::WriteOnly) &&
            file.write(entries.startsWith('!') ? entries.mid(1) : "[ShortCutKeys]\n" + entries) > 0);
}

QByteArray TestCli::read(const QString& name) const
{
    QFile file(dir.filePath(name));
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

QProcessEnvironment TestCli::environment(bool display) const
{
    QProcessEnvironment env = QProcessEnvironment::systemEnvironment();
    env.insert(QStringLiteral("ZEM_USER_DIR"), dir.filePath(QStringLiteral("user")));
    env.insert(QStringLiteral("ZEM_SYSTEM_DIR"), dir.filePath(QStringLiteral("system")));
    env.insert(QStringLiteral("LANG"), QStringLiteral("C.UTF-8"));
    if (!display)
        env.remove(QStringLiteral("DISPLAY"));
    return env;
}

int TestCli::run(const QStringList& arguments, bool display, const QStringList& launcher)
{
    QProcess process;
    process.setProcessEnvironment(environment(display));
    if (launcher.isEmpty())
        process.start(QStringLiteral(ZEM_CLI_BINARY), arguments);
    else
        process.start(launcher.first(),
                      launcher.mid(1) + QStringList{QStringLiteral(ZEM_CLI_BINARY)} + arguments);
    process.waitForFinished(10000);
    out = process.readAllStandardOutput();
    err = process.readAllStandardError();
    lastStatus = process.exitStatus() == QProcess::NormalExit ? process.exitCode() : -1;
    return lastStatus;
}

void TestCli::check_data()
{
    QTest::addColumn<QByteArray>("entries");
    QTest::addColumn<QByteArray>("findings"); // the lines printed, the file's path taken out
    QTest::addColumn<int>("status");

    QTest::newRow("nothing to say") << QByteArray("Alt|F4=ZEMWM_CLOSE\nCtrl|t=\"sh -c true\"\n")
                                    << QByteArray() << 0;
    QTest::newRow("no section") << QByteArray("!a=b\n")
                                << QByteArray(":0: error: no [ShortCutKeys] section\n") << 2;
    QTest::newRow("an unknown function")
        << QByteArray("Alt|u=ZEMWM_NOPE\n")
        << QByteArray(":2: error: ZEMWM_NOPE is no function of the window manager\n") << 2;
    QTest::newRow("a key the key server cannot read")
        << QByteArray("Ctrl|Bogus=ZEMWM_CLOSE\n")
        << QByteArray(":2: error: the key Ctrl|Bogus cannot be read\n") << 2;
    QTest::newRow("one key on several lines: each line that does not count is named")
        << QByteArray("Alt|x=ZEMWM_CLOSE\nALT|X=ZEMWM_LOCK\nCtrl|Prior=ZEMWM_EXIT\nCtrl|Page_Up=ZEMWM_EXIT\n")
        << QByteArray(":2: warning: the key Alt|x does not count: line 3 binds the same key\n"
                      ":4: warning: the key Ctrl|Prior does not count: line 5 binds the same key\n")
        << 1;
    QTest::newRow("control characters are shown, not sent to the terminal")
        << QByteArray("Alt|u=ZEMWM_\x1b[2J\n")
        << QByteArray(":2: error: ZEMWM_\\x1b[2J is no function of the window manager\n") << 2;
    QTest::newRow("a program that is not there, on PATH or by path")
        << QByteArray("Alt|a=\"no-such-program -x\"\nAlt|b=\"/no/such/dir/prog\"\n")
        << QByteArray(":2: warning: the program of \"no-such-program -x\" is not installed\n"
                      ":3: warning: the program of \"/no/such/dir/prog\" is not installed\n")
        << 1;
    QTest::newRow("one character alone swallows typing")
        << QByteArray("None|q=ZEMWM_CLOSE\n")
        << QByteArray(":2: warning: the key None|q alone takes a character from typing\n") << 1;
}

void TestCli::check()
{
    QFETCH(QByteArray, entries);
    QFETCH(QByteArray, findings);
    QFETCH(int, status);
    write(QStringLiteral("f.rc"), entries);
    QCOMPARE(run({QStringLiteral("check"), dir.filePath(QStringLiteral("f.rc"))}), status);
    QCOMPARE(out.replace(QFile::encodeName(dir.filePath(QStringLiteral("f.rc"))), ""), findings);
}

void TestCli::list()
{
    // The user's file over the system file, as the editor shows them, then the disabled keys.
    QCOMPARE(run({QStringLiteral("list")}), 0);
    QVERIFY(out.startsWith("Alt|F4\tZEMWM_CLOSE\tsystem\n"));
    QVERIFY(
        out.endsWith("Alt|F5\tZEMWM_LOCK\tuser\nCtrl|Alt|t\tsh -c true\tsystem\nCtrl|q\tDisable\tuser\n"));
    QCOMPARE(out.count('\n'), 4);
    QCOMPARE(run({QStringLiteral("--json"), QStringLiteral("list"),
                  dir.filePath(QStringLiteral("user/keyshortcutrc"))}),
             0);
    const QJsonArray entries = QJsonDocument::fromJson(out).array();
    QCOMPARE(entries.size(), 2);
    QCOMPARE(entries.at(0).toObject(), (QJsonObject{{"key", "Alt|F5"},
                                                    {"shown", "Alt+F5"},
                                                    {"function", "ZEMWM_LOCK"},
                                                    {"command", QJsonValue()},
                                                    {"action", "lock screen"},
                                                    {"source", "user"}}));
}

void TestCli::edit_data()
{
    QTest::addColumn<QStringList>("arguments");
    QTest::addColumn<int>("status");
    QTest::addColumn<QByteArray>("written"); // the user's file afterwards, its section line left out

    const QByteArray untouched = "Alt|F5=ZEMWM_LOCK\nCtrl|q=\"Disable\"\n";
    QTest::newRow("set a free key, options last, the command as given")
        << QStringList{"set", "alt+ctrl+k", " xterm  -e top ", "--file", "user/keyshortcutrc"} << 0
        << QByteArray("Alt|F5=ZEMWM_LOCK\nCtrl|Alt|k=\"xterm  -e top\"\nCtrl|q=\"Disable\"\n");
    QTest::newRow("set, then unset a free key: the file as it was")
        << QStringList{"set", "Super+KP_Equal", "xclock", "&&", "unset", "super+kp_equal"} << 0 << untouched;
    QTest::newRow("a key is written as the keysym asked for")
        << QStringList{"set", "Ctrl+Alt+|", "xclock"} << 0
        << QByteArray("Alt|F5=ZEMWM_LOCK\nCtrl|Alt|bar=\"xclock\"\nCtrl|q=\"Disable\"\n");
    QTest::newRow("an empty command") << QStringList{"set", "Alt+F9", " "} << 2 << untouched;
    QTest::newRow("a control character in a command")
        << QStringList{"set", "Alt+F9", "xterm\n-e rm"} << 2 << untouched;
    QTest::newRow("--file= without a name")
        << QStringList{"set", "Alt+F9", "xclock", "--file="} << 64 << untouched;
    QTest::newRow("set a key another binding holds")
        << QStringList{"set", "Alt|F4", "ZEMWM_EXIT"} << 3 << untouched;
    QTest::newRow("--force takes it over, the system binding switched off")
        << QStringList{"--force", "set", "Alt+F4", "ZEMWM_EXIT"} << 0
        << QByteArray("Alt|F5=ZEMWM_LOCK\nAlt|F4=ZEMWM_EXIT\nCtrl|q=\"Disable\"\n");
    QTest::newRow("an unknown function") << QStringList{"set", "Alt+F9", "ZEMWM_NOPE"} << 2 << untouched;
    QTest::newRow("an unreadable key") << QStringList{"set", "Ctrl+Bogus", "ZEMWM_EXIT"} << 2 << untouched;
    QTest::newRow("unset a system key: it stays off")
        << QStringList{"unset", "Ctrl+Alt+T"} << 0 << QByteArray(untouched + "Ctrl|Alt|t=\"Disable\"\n");
    QTest::newRow("unset a key nobody holds") << QStringList{"unset", "Ctrl+Alt+Y"} << 2 << untouched;
}

void TestCli::edit()
{
    QFETCH(QStringList, arguments);
    QFETCH(int, status);
    QFETCH(QByteArray, written);
    for (QString& argument : arguments) {
        if (argument.startsWith(QLatin1String("user/")))
            argument = dir.filePath(argument);
    }
    // Commands joined by "&&" run one after the other; the status is the last one's.
    for (int from = 0; from <= arguments.size(); from = arguments.indexOf(QStringLiteral("&&"), from) + 1) {
        const int to = arguments.indexOf(QStringLiteral("&&"), from);
        if (run(arguments.mid(from, to < 0 ? -1 : to - from)) != 0 || to < 0)
            break;
    }
    QCOMPARE(lastStatus, status);
    QCOMPARE(read(QStringLiteral("user/keyshortcutrc")), "[ShortCutKeys]\n" + written);
    QCOMPARE(err.isEmpty(), status == 0);
}

void TestCli::concurrentWriters()
{
    // Several zem-hotkeys set at the same moment on one file, round after round: every change
    // is there afterwards, none lost to a writer that read before another wrote.
    const int writers = 3;
    for (int round = 0; round < 50; ++round) {
        write(QStringLiteral("user/keyshortcutrc"), "Alt|F5=ZEMWM_LOCK\n");
        std::vector<std::unique_ptr<QProcess>> processes;
        for (int w = 0; w < writers; ++w) {
            processes.push_back(std::make_unique<QProcess>());
            processes.back()->setProcessEnvironment(environment(false));
            processes.back()->start(QStringLiteral(ZEM_CLI_BINARY),
                                    {QStringLiteral("set"), QStringLiteral("Ctrl+Alt+F%1").arg(w + 1),
                                     QStringLiteral("xclock -%1").arg(w)});
        }
        for (auto& process : processes) {
            QVERIFY(process->waitForFinished(10000));
            QVERIFY2(process->exitCode() == 0, process->readAllStandardError());
        }
        const QByteArray file = read(QStringLiteral("user/keyshortcutrc"));
        for (int w = 0; w < writers; ++w)
            QVERIFY2(
                file.contains(QStringLiteral("Ctrl|Alt|F%1=\"xclock -%2\"").arg(w + 1).arg(w).toLatin1()),
                qPrintable(QStringLiteral("round %1:\n%2").arg(round).arg(QString::fromLatin1(file))));
    }
}

void TestCli::anotherAccountsFile()
{
    // Run as another account, on root's file in a directory it may read: refused with the reason,
    // the file untouched.
    if (::geteuid() != 0 || QStandardPaths::findExecutable(QStringLiteral("setpriv")).isEmpty())
        QSKIP("needs root and setpriv");
    QVERIFY(QFile::setPermissions(dir.path(), QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner |
                                                  QFile::ReadOther | QFile::ExeOther));
    const QString path = dir.filePath(QStringLiteral("roots.rc"));
    write(QStringLiteral("roots.rc"), "Alt|F5=ZEMWM_LOCK\n");
    const QByteArray before = read(QStringLiteral("roots.rc"));
    QCOMPARE(run({QStringLiteral("set"), QStringLiteral("Alt+F6"), QStringLiteral("ZEMWM_EXIT"),
                  QStringLiteral("--file"), path},
                 false,
                 {QStringLiteral("setpriv"), QStringLiteral("--reuid=65534"), QStringLiteral("--regid=65534"),
                  QStringLiteral("--clear-groups")}),
             2);
    QVERIFY2(err.contains("belongs to another account"), err);
    QCOMPARE(read(QStringLiteral("roots.rc")), before);
}

void TestCli::applyAndUsage()
{
    // Held open so that the X server keeps the property, as the window manager's connection does.
    Display* display = XOpenDisplay(nullptr);
    QVERIFY(display);
    const auto close = qScopeGuard([display] { XCloseDisplay(display); });
    QProcess::execute(QStringLiteral("xprop"), QStringLiteral("-root -remove _ZEMWM_COMMAND").split(' '));
    QCOMPARE(run({QStringLiteral("apply")}, true), 0);
    QProcess xprop;
    xprop.start(QStringLiteral("xprop"), QStringLiteral("-root -notype _ZEMWM_COMMAND").split(' '));
    QVERIFY(xprop.waitForFinished());
    QVERIFY(xprop.readAllStandardOutput().contains(
        "ZEMWM_UPDATE_VAL SCKeysFile " +
        QFile::encodeName(dir.filePath(QStringLiteral("user/keyshortcutrc")))));
    QProcess::execute(QStringLiteral("xprop"), QStringLiteral("-root -remove _ZEMWM_COMMAND").split(' '));
    // Nothing is sent for a file that is missing or no hotkeys file, or whose name cannot be
    // sent as it is.
    write(QStringLiteral("not.rc"), "!a=b\n");
    const QString tooLong = QLatin1Char('/') + QString(5000, QLatin1Char('x'));
    for (const QString& file :
         {dir.filePath(QStringLiteral("missing.rc")), dir.filePath(QStringLiteral("not.rc")), tooLong}) {
        QCOMPARE(run({QStringLiteral("apply"), file}, true), 2);
        QVERIFY(err.startsWith("zem-hotkeys: "));
    }
    QVERIFY(err.contains("too long"));
    // A byte that is no UTF-8, given as it stands.
    QCOMPARE(run({}, true,
                 {QStringLiteral("sh"), QStringLiteral("-c"),
                  QStringLiteral("exec \"$0\" apply \"$(printf 'bad\\377')\"")}),
             2);
    QVERIFY2(err.contains("not valid in the locale's encoding"), err);
    xprop.start(QStringLiteral("xprop"), QStringLiteral("-root -notype _ZEMWM_COMMAND").split(' '));
    QVERIFY(xprop.waitForFinished());
    QVERIFY(xprop.readAllStandardOutput().contains("not found"));
    QCOMPARE(run({QStringLiteral("apply")}), 2);
    QVERIFY(err.startsWith("zem-hotkeys: "));
    QCOMPARE(run({}), 64);
    QVERIFY(err.startsWith("Usage: zem-hotkeys") && out.isEmpty());
    QCOMPARE(run({QStringLiteral("--help")}), 0);
    QVERIFY(out.startsWith("Usage: zem-hotkeys") && err.isEmpty());
}

QTEST_GUILESS_MAIN(TestCli)
#include "tst_cli.moc"
