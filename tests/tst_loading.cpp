// Loading hotkeys files into the binding tree: the user's file merged with the system one, any
// other file alone, and files that cannot be loaded.
#include "formfixture.h"
#include "keysconfform.h"
#include "stderrcapture.h"
#include "testenvironment.h"

#include <QAction>
#include <QDir>
#include <QTreeWidget>
#include <QTreeWidgetItemIterator>
#include <QtTest>

namespace {

enum class Opened { AsUserFile, AsOtherFile, ByDoubledSlash, BySymbolicLink };

} // namespace

Q_DECLARE_METATYPE(Opened)

class TestLoading : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void merge_data();
    void merge();
    void furtherRowsFollowTheFirst();
    void displayTextOfStoredKeys();
    void failureChangesNothing_data();
    void failureChangesNothing();
    void loadClearsModified();

private:
    QString userPath() const { return QString::fromLocal8Bit(qgetenv("ZEM_USER_DIR")) + "/keyshortcutrc"; }
    QString systemPath() const
    {
        return QString::fromLocal8Bit(qgetenv("ZEM_SYSTEM_DIR")) + "/keyshortcutrc";
    }
    QTemporaryDir scratch;
};

void TestLoading::init()
{
    QFile::remove(userPath());
    QFile::remove(systemPath());
}

void TestLoading::merge_data()
{
    QTest::addColumn<QByteArray>("userFile");   // entries after the section line
    QTest::addColumn<QByteArray>("systemFile"); // likewise
    QTest::addColumn<Opened>("opened");
    QTest::addColumn<QStringList>("rows");
    QTest::addColumn<QStringList>("disabled");

    const auto open = Opened::AsUserFile;
    QTest::newRow("empty user file shows the system bindings")
        << QByteArray() << QByteArray("Alt|F4=ZEMWM_CLOSE\nCtrl|Alt|t=\"xterm\"\n") << open
        << QStringList{"ZEMWM_CLOSE=Alt+F4@system", "cmd:xterm=Ctrl+Alt+T@system"} << QStringList();
    QTest::newRow("other file is shown alone") << QByteArray() << QByteArray("Alt|F4=ZEMWM_CLOSE\n")
                                               << Opened::AsOtherFile << QStringList() << QStringList();
    QTest::newRow("user's key wins, system's binding of it shown nowhere")
        << QByteArray("Alt|F4=ZEMWM_KILL\n") << QByteArray("Alt|F4=ZEMWM_CLOSE\n") << open
        << QStringList{"ZEMWM_KILL=Alt+F4@user"} << QStringList();
    QTest::newRow("one function, a key from each file")
        << QByteArray("Alt|F5=ZEMWM_CLOSE\n") << QByteArray("Alt|F4=ZEMWM_CLOSE\n") << open
        << QStringList{"ZEMWM_CLOSE=Alt+F5@user", "ZEMWM_CLOSE=Alt+F4@system"} << QStringList();
    QTest::newRow("latest further row nearest the first")
        << QByteArray("Alt|F5=ZEMWM_CLOSE\nAlt|F6=ZEMWM_CLOSE\n") << QByteArray("Alt|F4=ZEMWM_CLOSE\n")
        << open
        << QStringList{"ZEMWM_CLOSE=Alt+F5@user", "ZEMWM_CLOSE=Alt+F4@system", "ZEMWM_CLOSE=Alt+F6@user"}
        << QStringList();
    QTest::newRow("Disable in the user's file")
        << QByteArray("Alt|F4=\"Disable\"\n") << QByteArray("Alt|F4=ZEMWM_CLOSE\n") << open << QStringList()
        << QStringList{"Alt+F4"};
    QTest::newRow("Disable in the system file, unquoted")
        << QByteArray() << QByteArray("Ctrl|q=Disable\nAlt|F4=ZEMWM_CLOSE\n") << open
        << QStringList{"ZEMWM_CLOSE=Alt+F4@system"} << QStringList{"Ctrl+Q"};
    QTest::newRow("Disable in both files listed once")
        << QByteArray("Ctrl|q=\"Disable\"\n") << QByteArray("Ctrl|q=\"Disable\"\n") << open << QStringList()
        << QStringList{"Ctrl+Q"};
    // In key order: "None1" sorts before "None|None0".
    QTest::newRow("keyless commands under placeholders")
        << QByteArray("None|None0=\"xterm\"\nNone1=\"xclock\"\nNone|None12=\"xeyes\"\n") << QByteArray()
        << open << QStringList{"cmd:xclock=@user", "cmd:xterm=@user", "cmd:xeyes=@user"} << QStringList();
    QTest::newRow("keyless entries do not block each other")
        << QByteArray("None|None0=ZEMWM_LOCK\n") << QByteArray("None|None0=\"xterm\"\n") << open
        << QStringList{"ZEMWM_LOCK=@user", "cmd:xterm=@system"} << QStringList();
    QTest::newRow("keys differing by case across the files")
        << QByteArray("Alt|x=ZEMWM_CLOSE\n") << QByteArray("ALT|X=ZEMWM_KILL\n") << open
        << QStringList{"ZEMWM_CLOSE=Alt+X@user"} << QStringList();
    QTest::newRow("keys differing by None| in one file: the first in key order wins")
        << QByteArray("None|F5=ZEMWM_RESTART\nF5=ZEMWM_LOCK\n") << QByteArray() << open
        << QStringList{"ZEMWM_LOCK=F5@user"} << QStringList();
    QTest::newRow("keys differing by None| across the files")
        << QByteArray("F5=ZEMWM_LOCK\n") << QByteArray("None|F5=ZEMWM_RESTART\n") << open
        << QStringList{"ZEMWM_LOCK=F5@user"} << QStringList();
    QTest::newRow("command line Disable is a disabled key")
        << QByteArray("Ctrl|d=\"Disable\"\nCtrl|e=\"Disable now\"\n") << QByteArray() << open
        << QStringList{"cmd:Disable now=Ctrl+E@user"} << QStringList{"Ctrl+D"};
    QTest::newRow("unknown function dropped, its key stays free")
        << QByteArray("Alt|u=ZEMWM_NO_SUCH_THING\n") << QByteArray("Alt|u=ZEMWM_CLOSE\n") << open
        << QStringList{"ZEMWM_CLOSE=Alt+U@system"} << QStringList();
    QTest::newRow("quotes inside a command kept")
        << QByteArray("Ctrl|t=\"sh -c \"echo hi\"\"\n") << QByteArray() << open
        << QStringList{"cmd:sh -c \"echo hi\"=Ctrl+T@user"} << QStringList();
    QTest::newRow("unconvertible key kept as read")
        << QByteArray("Ctrl|NoSuchKey=ZEMWM_CLOSE\n") << QByteArray() << open
        << QStringList{"ZEMWM_CLOSE=Ctrl+NoSuchKey@user"} << QStringList();
    QTest::newRow("user's file by a doubled slash is another file")
        << QByteArray("Alt|F5=ZEMWM_CLOSE\n") << QByteArray("Alt|F4=ZEMWM_KILL\n") << Opened::ByDoubledSlash
        << QStringList{"ZEMWM_CLOSE=Alt+F5@user"} << QStringList();
    QTest::newRow("user's file by a symbolic link is another file")
        << QByteArray("Alt|F5=ZEMWM_CLOSE\n") << QByteArray("Alt|F4=ZEMWM_KILL\n") << Opened::BySymbolicLink
        << QStringList{"ZEMWM_CLOSE=Alt+F5@user"} << QStringList();
}

void TestLoading::merge()
{
    QFETCH(QByteArray, userFile);
    QFETCH(QByteArray, systemFile);
    QFETCH(Opened, opened);
    QFETCH(QStringList, rows);
    QFETCH(QStringList, disabled);

    QVERIFY(writeFile(systemPath(), "[ShortCutKeys]\n" + systemFile));
    QString path = userPath();
    QString mergedWith = systemPath();
    switch (opened) {
    case Opened::AsUserFile:
        break;
    case Opened::AsOtherFile:
        path = scratch.filePath(QStringLiteral("other file.rc"));
        mergedWith.clear();
        break;
    case Opened::ByDoubledSlash:
        path = QFileInfo(userPath()).path() + QLatin1String("//keyshortcutrc");
        mergedWith.clear();
        break;
    case Opened::BySymbolicLink:
        path = scratch.filePath(QStringLiteral("link to user file"));
        QFile::remove(path);
        QVERIFY(QFile::link(userPath(), path));
        mergedWith.clear();
        break;
    }
    QVERIFY(writeFile(opened == Opened::BySymbolicLink ? userPath() : path, "[ShortCutKeys]\n" + userFile));

    KeysConfForm form;
    StderrCapture capture;
    QVERIFY(form.loadFile(path));
    QCOMPARE(capture.finish(),
             "files " + QFile::encodeName(path) + ' ' + QFile::encodeName(mergedWith) + '\n');
    QCOMPARE(boundRows(form.findChild<QTreeWidget*>(QStringLiteral("keysTree"))), rows);
    QCOMPARE(form.disabledKeyList(), disabled);
    QCOMPARE(KeysConfForm::editedFile(), path);
    QCOMPARE(form.windowTitle(), QStringLiteral("Zem hotkeys editor - ") + QFileInfo(path).fileName());
}

void TestLoading::furtherRowsFollowTheFirst()
{
    FormFixture f;
    QVERIFY(f.openFile(scratch.filePath(QStringLiteral("rows.rc")),
                       "Alt|F4=ZEMWM_CLOSE\nAlt|F5=ZEMWM_CLOSE\nAlt|F6=ZEMWM_LOWER\n"));
    QTreeWidgetItem* first = f.row("ZEMWM_CLOSE");
    QTreeWidgetItem* further = f.row("ZEMWM_CLOSE", 1);
    QVERIFY(first && further && !f.row("ZEMWM_CLOSE", 2));
    QTreeWidgetItem* parent = first->parent();
    QCOMPARE(further->parent(), parent);
    QCOMPARE(parent->indexOfChild(further), parent->indexOfChild(first) + 1);
    QCOMPARE(further->text(0), first->text(0));
    // The row that was there before the extra one still follows it.
    QCOMPARE(parent->child(parent->indexOfChild(further) + 1)->text(2),
             QStringLiteral("ZEMWM_CLOSE_COMBINED"));
}

void TestLoading::displayTextOfStoredKeys()
{
    FormFixture f;
    QVERIFY(f.openFile(scratch.filePath(QStringLiteral("display.rc")),
                       "Ctrl|Alt|t=ZEMWM_CLOSE\nhash=ZEMWM_KILL\n"));
    QTreeWidgetItem* close = f.row("ZEMWM_CLOSE");
    QCOMPARE(close->text(1), QKeySequence(QStringLiteral("Ctrl+Alt+T")).toString(QKeySequence::NativeText));
    QCOMPARE(KeysConfForm::itemKey(close), QStringLiteral("Ctrl+Alt+T"));

    KeysConfForm::setItemKey(close, QStringLiteral("#not a key"));
    QCOMPARE(close->text(1), QStringLiteral("#not a key"));
    KeysConfForm::setItemKey(close, QString());
    QVERIFY(close->text(1).isEmpty());
    QVERIFY(KeysConfForm::itemKey(close).isEmpty());
}

void TestLoading::failureChangesNothing_data()
{
    QTest::addColumn<QString>("which"); // what is wrong

    QTest::newRow("empty path") << "empty path";
    QTest::newRow("missing file") << "missing";
    QTest::newRow("no section") << "no section";
    QTest::newRow("empty file") << "empty file";
    QTest::newRow("a directory") << "directory";
    QTest::newRow("user's file, system file missing") << "no system file";
    QTest::newRow("user's file, system file without section") << "system without section";
}

void TestLoading::failureChangesNothing()
{
    QFETCH(QString, which);
    const QString good = scratch.filePath(QStringLiteral("good.rc"));
    QVERIFY(writeFile(good, "[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\nCtrl|q=\"Disable\"\nAlt|x=\"xterm\"\n"));
    KeysConfForm form;
    QVERIFY(form.loadFile(good));
    auto* tree = form.findChild<QTreeWidget*>(QStringLiteral("keysTree"));
    QTreeWidgetItem* commands = KeysConfForm::commandGroup();
    const QStringList rowsBefore = boundRows(tree);
    form.fileChanged();

    QString path = scratch.filePath(QStringLiteral("bad.rc"));
    QVERIFY(writeFile(systemPath(), "[ShortCutKeys]\n"));
    if (which == "empty path") {
        path.clear();
    } else if (which == "missing") {
        path = scratch.filePath(QStringLiteral("no such file"));
    } else if (which == "no section") {
        QVERIFY(writeFile(path, "[Other]\nAlt|F4=ZEMWM_CLOSE\n"));
    } else if (which == "empty file") {
        QVERIFY(writeFile(path, ""));
    } else if (which == "directory") {
        path = scratch.path();
    } else {
        path = userPath();
        QVERIFY(writeFile(path, "[ShortCutKeys]\n"));
        if (which == "no system file")
            QVERIFY(QFile::remove(systemPath()));
        else
            QVERIFY(writeFile(systemPath(), "a=b\n"));
    }

    StderrCapture capture;
    QVERIFY(!form.loadFile(path));
    QCOMPARE(capture.finish(), QByteArray());
    QCOMPARE(boundRows(tree), rowsBefore);
    QCOMPARE(KeysConfForm::commandGroup(), commands);
    QCOMPARE(form.disabledKeyList(), QStringList{"Ctrl+Q"});
    QCOMPARE(KeysConfForm::editedFile(), good);
    QCOMPARE(form.windowTitle(), QStringLiteral("Zem hotkeys editor - good.rc"));
    QVERIFY(KeysConfForm::isModified());
}

void TestLoading::loadClearsModified()
{
    const QString path = scratch.filePath(QStringLiteral("plain.rc"));
    QVERIFY(writeFile(path, "[ShortCutKeys]\n"));
    KeysConfForm form;
    form.fileChanged();
    auto* save = form.findChild<QAction*>(QStringLiteral("fileSaveAction"));
    auto* apply = form.findChild<QAction*>(QStringLiteral("fileApplyAction"));
    QVERIFY(save->isEnabled() && apply->isEnabled());
    QVERIFY(form.loadFile(path));
    QVERIFY(!KeysConfForm::isModified());
    QVERIFY(!save->isEnabled());
    QVERIFY(!apply->isEnabled());
}

ZEM_TEST_MAIN(TestLoading)
#include "tst_loading.moc"
