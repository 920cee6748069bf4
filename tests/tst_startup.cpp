// Start-up as the user meets it: the real program in its own process on a private X server,
// with its message boxes answered by key presses, and its exit statuses.
#include "testenvironment.h"
#include "xwindows.h"

#include <QDir>
#include <QElapsedTimer>
#include <QProcess>
#include <QtTest>

namespace {

const QString mainWindowTitle = QStringLiteral("Zem hotkeys editor - %1");
const QByteArray systemFile = "[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\nCtrl|Alt|t=\"x-terminal-emulator\"\n";
const QByteArray usageText = "Usage: zem-admin-hotkeys filepath - open/create file as hotkeys coll\n\n";

// One run of the editor.
class Editor
{
public:
    Editor(const QProcessEnvironment& environment, const QStringList& arguments)
    {
        process.setProcessEnvironment(environment);
        process.start(QStringLiteral(ZEM_EDITOR_BINARY), arguments);
    }
    ~Editor()
    {
        if (process.state() != QProcess::NotRunning) {
            process.kill();
            process.waitForFinished(5000);
        }
    }
    bool finished(int timeoutMs = 10000)
    {
        return process.state() == QProcess::NotRunning || process.waitForFinished(timeoutMs);
    }
    bool running() { return !process.waitForFinished(0) && process.state() == QProcess::Running; }
    QString describe()
    {
        return QStringLiteral("state %1, exit %2, said: %3")
            .arg(process.state())
            .arg(exitCode())
            .arg(QString::fromLocal8Bit(process.readAllStandardError()));
    }
    int exitCode() const { return process.exitStatus() == QProcess::NormalExit ? process.exitCode() : -1; }
    QByteArray standardOutput() { return process.readAllStandardOutput(); }
    QByteArray standardError() { return process.readAllStandardError(); }

private:
    QProcess process;
};

} // namespace

class TestStartup : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase();
    void init();

    void usage_data();
    void usage();
    void userFileChosen_data();
    void userFileChosen();
    void missingNamedFile_data();
    void missingNamedFile();
    void existingNamedFile();
    void uncreatableFile();
    void unloadableFile_data();
    void unloadableFile();
    void secondStartShowsTheFirst_data();
    void secondStartShowsTheFirst();
    void staleInstanceIsTakenOver();
    void otherDisplayRunsItsOwn();

private:
    QProcessEnvironment environmentFor(const QByteArray& display) const;
    QString userFile() const { return caseDir + QLatin1String("/user/keyshortcutrc"); }
    // Waits for the main window, closes it as a user would, and expects exit status 0.
    void expectMainWindowThenClose(Editor& editor, const QString& fileName);

    std::unique_ptr<PrivateXServer> server;
    std::unique_ptr<XConnection> x;
    QTemporaryDir scratch;
    QString caseDir;
};

void TestStartup::initTestCase()
{
    QVERIFY(QFileInfo(QStringLiteral(ZEM_EDITOR_BINARY)).isExecutable());
    server = std::make_unique<PrivateXServer>();
    QVERIFY2(!server->displayName().isEmpty(), "Xvfb did not start");
    x = std::make_unique<XConnection>(server->displayName());
    QVERIFY(x->isOpen());
}

void TestStartup::init()
{
    // Every case gets its own directories, so "created" and "nothing created" mean this case.
    static int counter = 0;
    caseDir = scratch.filePath(QStringLiteral("case %1 ключ").arg(++counter));
    QVERIFY(QDir().mkpath(caseDir + QLatin1String("/system")));
    QVERIFY(QDir().mkpath(caseDir + QLatin1String("/config")));
    QVERIFY(writeFile(caseDir + QLatin1String("/system/keyshortcutrc"), systemFile));
}

QProcessEnvironment TestStartup::environmentFor(const QByteArray& display) const
{
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("DISPLAY"), QString::fromLocal8Bit(display));
    environment.insert(QStringLiteral("QT_QPA_PLATFORM"), QStringLiteral("xcb"));
    environment.insert(QStringLiteral("XDG_CONFIG_HOME"), caseDir + QLatin1String("/config"));
    environment.insert(QStringLiteral("ZEM_USER_DIR"), caseDir + QLatin1String("/user"));
    environment.insert(QStringLiteral("ZEM_SYSTEM_DIR"), caseDir + QLatin1String("/system"));
    environment.remove(QStringLiteral("ZEM_SESSION_SUFFIX"));
    return environment;
}

void TestStartup::expectMainWindowThenClose(Editor& editor, const QString& fileName)
{
    const unsigned long window = x->waitForWindow(QRegularExpression::escape(mainWindowTitle.arg(fileName)));
    QVERIFY2(window,
             qPrintable(QStringLiteral("no main window; the editor said: ") + editor.standardError()));
    x->requestClose(window);
    QVERIFY(editor.finished());
    QCOMPARE(editor.exitCode(), 0);
}

void TestStartup::usage_data()
{
    QTest::addColumn<QStringList>("arguments");
    QTest::newRow("--help") << QStringList{"--help"};
    QTest::newRow("-h") << QStringList{"-h"};
    QTest::newRow("-h then a file") << QStringList{"-h", "/tmp/somefile"};
}

void TestStartup::usage()
{
    QFETCH(QStringList, arguments);
    Editor editor(environmentFor(server->displayName()), arguments);
    QVERIFY(editor.finished());
    QCOMPARE(editor.exitCode(), 1);
    QCOMPARE(editor.standardOutput(), usageText);
    // It stopped before choosing a file: nothing was created, no window was made.
    QVERIFY(!QFileInfo::exists(userFile()));
    QCOMPARE(x->findWindow(QStringLiteral("Zem hotkeys editor.*")), 0ul);
}

void TestStartup::userFileChosen_data()
{
    QTest::addColumn<QStringList>("arguments");
    QTest::newRow("no argument") << QStringList();
    QTest::newRow("unexpanded %f") << QStringList{"%f"};
    QTest::newRow("two arguments are ignored") << QStringList{"/tmp/a-file", "/tmp/another"};
    QTest::newRow("-h in second place has no effect") << QStringList{"/tmp/a-file", "-h"};
}

void TestStartup::userFileChosen()
{
    QFETCH(QStringList, arguments);
    Editor editor(environmentFor(server->displayName()), arguments);
    expectMainWindowThenClose(editor, QStringLiteral("keyshortcutrc"));
    // The missing user's file was made silently, holding the section header alone.
    QCOMPARE(readFile(userFile()), QByteArray("[ShortCutKeys]\n"));
    QVERIFY(!QFileInfo::exists(QStringLiteral("/tmp/a-file")));
    const QByteArray said = editor.standardError();
    QVERIFY2(said.contains("files " + QFile::encodeName(userFile()) + ' ' +
                           QFile::encodeName(caseDir + QLatin1String("/system/keyshortcutrc")) + '\n'),
             said.constData());
}

void TestStartup::missingNamedFile_data()
{
    QTest::addColumn<QString>("key");
    QTest::addColumn<bool>("created");
    QTest::newRow("No") << "n" << false;
    QTest::newRow("box closed with Escape") << "Escape" << false;
    QTest::newRow("Yes") << "Return" << true;
}

void TestStartup::missingNamedFile()
{
    QFETCH(QString, key);
    QFETCH(bool, created);
    const QString path = caseDir + QString::fromUtf8("/my keys; $(touch pwned) ключи.rc");
    Editor editor(environmentFor(server->displayName()), {path});

    const unsigned long box = x->waitForWindow(QStringLiteral("Warning"));
    QVERIFY2(box, "no question about creating the file");
    QVERIFY(x->pressKey(box, key));
    if (!created) {
        QVERIFY(editor.finished());
        QCOMPARE(editor.exitCode(), 2);
        QVERIFY(!QFileInfo::exists(path));
        QVERIFY(!QFileInfo::exists(userFile()));
        return;
    }
    expectMainWindowThenClose(editor, QFileInfo(path).fileName());
    QCOMPARE(readFile(path), QByteArray("[ShortCutKeys]\n"));
    // A file of its own is shown alone: the user's file is neither needed nor made.
    QVERIFY(!QFileInfo::exists(userFile()));
}

void TestStartup::existingNamedFile()
{
    const QString path = caseDir + QLatin1String("/other.rc");
    const QByteArray content = "[ShortCutKeys]\nAlt|x=ZEMWM_CLOSE\n";
    QVERIFY(writeFile(path, content));
    QVERIFY(QFile::remove(caseDir + QLatin1String("/system/keyshortcutrc")));
    Editor editor(environmentFor(server->displayName()), {path});
    expectMainWindowThenClose(editor, QStringLiteral("other.rc"));
    QCOMPARE(readFile(path), content);
}

void TestStartup::uncreatableFile()
{
    const QString path = caseDir + QLatin1String("/no such dir/keys.rc");
    Editor editor(environmentFor(server->displayName()), {path});
    const unsigned long question = x->waitForWindow(QStringLiteral("Warning"));
    QVERIFY(question);
    QVERIFY(x->pressKey(question, QStringLiteral("Return")));
    const unsigned long box = x->waitForWindow(QStringLiteral("Attention"));
    QVERIFY2(box, "no message about the file that cannot be made");
    QVERIFY(x->pressKey(box, QStringLiteral("Return")));
    QVERIFY(editor.finished());
    QCOMPARE(editor.exitCode(), 3);
}

void TestStartup::unloadableFile_data()
{
    QTest::addColumn<QString>("argument");   // relative to the case directory; empty: none
    QTest::addColumn<QByteArray>("content"); // of that file, or of the user's file
    QTest::addColumn<QByteArray>("system");  // the system file; null: missing

    QTest::newRow("named file without section") << "bad.rc" << QByteArray("[Other]\na=b\n") << systemFile;
    QTest::newRow("named empty file") << "empty.rc" << QByteArray("") << systemFile;
    QTest::newRow("named directory") << "system" << QByteArray() << systemFile;
    QTest::newRow("user's file without section") << "" << QByteArray("Alt|x=ZEMWM_CLOSE\n") << systemFile;
    QTest::newRow("system file missing") << "" << QByteArray("[ShortCutKeys]\n") << QByteArray();
    QTest::newRow("system file without section")
        << "" << QByteArray("[ShortCutKeys]\n") << QByteArray("x=y\n");
}

void TestStartup::unloadableFile()
{
    QFETCH(QString, argument);
    QFETCH(QByteArray, content);
    QFETCH(QByteArray, system);

    const QString systemPath = caseDir + QLatin1String("/system/keyshortcutrc");
    if (system.isNull())
        QVERIFY(QFile::remove(systemPath));
    else
        QVERIFY(writeFile(systemPath, system));
    const QString path = argument.isEmpty() ? userFile() : caseDir + QLatin1Char('/') + argument;
    if (!QFileInfo(path).isDir())
        QVERIFY(writeFile(path, content));

    Editor editor(environmentFor(server->displayName()),
                  argument.isEmpty() ? QStringList() : QStringList{path});
    const unsigned long box = x->waitForWindow(QStringLiteral("Attention"));
    QVERIFY2(box, "no message about the file that cannot be read");
    QVERIFY(x->pressKey(box, QStringLiteral("Return")));
    QVERIFY(editor.finished());
    QCOMPARE(editor.exitCode(), 4);
    if (!QFileInfo(path).isDir())
        QCOMPARE(readFile(path), content);
    QVERIFY(!editor.standardError().contains("files "));
}

void TestStartup::secondStartShowsTheFirst_data()
{
    QTest::addColumn<QStringList>("arguments");
    QTest::newRow("no argument") << QStringList();
    QTest::newRow("--help") << QStringList{"--help"};
    QTest::newRow("a file name") << QStringList{"/tmp/never-made.rc"};
}

void TestStartup::secondStartShowsTheFirst()
{
    QFETCH(QStringList, arguments);
    // A display of this case's own: the focus test must not see other cases' key presses.
    PrivateXServer display;
    QVERIFY(!display.displayName().isEmpty());
    XConnection screen(display.displayName());

    Editor first(environmentFor(display.displayName()), {});
    const unsigned long window = screen.waitForWindow(QStringLiteral("Zem hotkeys editor - keyshortcutrc"));
    QVERIFY(window);
    QVERIFY(screen.focusedWindow() != window);

    QElapsedTimer clock;
    clock.start();
    Editor second(environmentFor(display.displayName()), arguments);
    QVERIFY(second.finished(5000));
    QCOMPARE(second.exitCode(), 0);
    QVERIFY2(clock.elapsed() < 1000, qPrintable(QStringLiteral("took %1 ms").arg(clock.elapsed())));
    QCOMPARE(second.standardOutput(), QByteArray());
    QVERIFY(!QFileInfo::exists(QStringLiteral("/tmp/never-made.rc")));

    // "show" raised and activated the running window.
    QTRY_COMPARE_WITH_TIMEOUT(screen.focusedWindow(), window, 5000);
    QVERIFY2(first.running(), qPrintable(first.describe()));
    screen.requestClose(window);
    QVERIFY(first.finished());
    QCOMPARE(first.exitCode(), 0);
}

void TestStartup::staleInstanceIsTakenOver()
{
    {
        Editor crashed(environmentFor(server->displayName()), {});
        QVERIFY(x->waitForWindow(QStringLiteral("Zem hotkeys editor - keyshortcutrc")));
        // Leaves its lock and socket behind, as a crash would.
    }
    Editor editor(environmentFor(server->displayName()), {});
    expectMainWindowThenClose(editor, QStringLiteral("keyshortcutrc"));
}

void TestStartup::otherDisplayRunsItsOwn()
{
    PrivateXServer other;
    QVERIFY(!other.displayName().isEmpty());
    XConnection otherScreen(other.displayName());

    Editor here(environmentFor(server->displayName()), {});
    QVERIFY(x->waitForWindow(QStringLiteral("Zem hotkeys editor - keyshortcutrc")));
    Editor there(environmentFor(other.displayName()), {});
    const unsigned long window =
        otherScreen.waitForWindow(QStringLiteral("Zem hotkeys editor - keyshortcutrc"));
    QVERIFY2(window, "the editor on the other display did not start its own window");
    QVERIFY2(here.running(), qPrintable(here.describe()));
    otherScreen.requestClose(window);
    QVERIFY(there.finished());
    QCOMPARE(there.exitCode(), 0);
    expectMainWindowThenClose(here, QStringLiteral("keyshortcutrc"));
}

ZEM_TEST_MAIN(TestStartup)
#include "tst_startup.moc"
