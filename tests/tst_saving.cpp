// Writing the tree back to the hotkeys file: the exact bytes, the round trip through loading,
// and that a save that cannot be completed leaves the old file as it was.
#include "formfixture.h"
#include "stderrcapture.h"
#include "testenvironment.h"

#include <QDir>
#include <QRandomGenerator>
#include <QTreeWidget>
#include <QtTest>

#include <sys/stat.h>

class TestSaving : public QObject
{
    Q_OBJECT

private slots:
    void cleanup();

    void writtenBytes_data();
    void writtenBytes();
    void placeholdersStayDistinctAcrossSaves();
    void unmodifiedWritesNothing();
    void roundTrip_data();
    void roundTrip();
    void failedSaveKeepsOldFile_data();
    void failedSaveKeepsOldFile();
    void immutableFile();
    void permissionsAndLinksSurvive();
    void shellCharactersInPath();

private:
    QString otherPath(const QString& name) const { return scratch.filePath(name); }
    FormFixture f;
    QTemporaryDir scratch;
};

void TestSaving::cleanup()
{
    f.reset();
}

void TestSaving::writtenBytes_data()
{
    QTest::addColumn<bool>("userFile");
    QTest::addColumn<QByteArray>("entries"); // of the opened file
    QTest::addColumn<QByteArray>("system");  // of the system file
    QTest::addColumn<QString>("edit");       // what is done before saving
    QTest::addColumn<QByteArray>("written"); // after "[ShortCutKeys]\n"

    QTest::newRow("user's file: user rows and disabled keys only")
        << true << QByteArray("Alt|F5=ZEMWM_LOCK\nCtrl|Alt|t=\"xterm\"\n")
        << QByteArray("Alt|F4=ZEMWM_CLOSE\nCtrl|k=ZEMWM_KILL\nCtrl|Alt|c=\"xclock\"\n") << "clear ZEMWM_CLOSE"
        << QByteArray("Alt|F5=ZEMWM_LOCK\nCtrl|Alt|t=\"xterm\"\nAlt|F4=\"Disable\"\n");
    QTest::newRow("user's file: a system row given a new key becomes the user's")
        << true << QByteArray() << QByteArray("Alt|F4=ZEMWM_CLOSE\nCtrl|k=ZEMWM_KILL\n")
        << "key ZEMWM_KILL Ctrl+Alt+K" << QByteArray("Ctrl|Alt|k=ZEMWM_KILL\n");
    QTest::newRow("other file: every bound row")
        << false << QByteArray("Alt|F4=ZEMWM_CLOSE\nAlt|F5=ZEMWM_CLOSE\nCtrl|Alt|t=\"xterm\"\n")
        << QByteArray() << "" << QByteArray("Alt|F4=ZEMWM_CLOSE\nAlt|F5=ZEMWM_CLOSE\nCtrl|Alt|t=\"xterm\"\n");
    QTest::newRow("keyless commands under placeholders")
        << false << QByteArray("None|None7=\"xterm\"\nNone|None9=\"xclock\"\n") << QByteArray() << ""
        << QByteArray("None|None0=\"xterm\"\nNone|None1=\"xclock\"\n");
    QTest::newRow("multi-key sequence written with its first key")
        << false << QByteArray() << QByteArray() << "key ZEMWM_LOCK Ctrl+A, B"
        << QByteArray("Ctrl|a=ZEMWM_LOCK\n");
    QTest::newRow("disabled key replaces a set key in place")
        << false << QByteArray("Alt|F4=ZEMWM_CLOSE\nAlt|F5=ZEMWM_LOCK\nCtrl|q=\"Disable\"\n") << QByteArray()
        << "key ZEMWM_CLOSE Ctrl+Q" << QByteArray("Ctrl|q=\"Disable\"\nAlt|F5=ZEMWM_LOCK\n");
    QTest::newRow("same key twice in other case: the later row replaces the earlier line")
        << false << QByteArray("Alt|F4=ZEMWM_CLOSE\nAlt|F5=ZEMWM_LOCK\n") << QByteArray()
        << "key ZEMWM_LOCK alt+f4" << QByteArray("Alt|F4=ZEMWM_LOCK\n");
    QTest::newRow("key the key server cannot name")
        << false << QByteArray("Ctrl|NoSuchKey=ZEMWM_CLOSE\n") << QByteArray() << ""
        << QByteArray("Ctrl|NoSuchKey=ZEMWM_CLOSE\n");
    QTest::newRow("command beginning and ending with quotes stays whole")
        << false << QByteArray("Ctrl|t=\"\"quoted\" arg\"\n") << QByteArray() << ""
        << QByteArray("Ctrl|t=\"\"quoted\" arg\"\n");
    QTest::newRow("command line Disable reads back as a disabled key")
        << false << QByteArray() << QByteArray() << "command Disable"
        << QByteArray("None|None0=\"Disable\"\n");
    QTest::newRow("non-ascii command") << false << QByteArray("Ctrl|e=\"echo Grüße ключ\"\n") << QByteArray()
                                       << "" << QByteArray("Ctrl|e=\"echo Grüße ключ\"\n");
    QTest::newRow("keypad, space and calculator")
        << false
        << QByteArray("None|KP_1=ZEMWM_CLOSE\nCtrl|space=ZEMWM_LOCK\nNone|XF86Calculator=\"xcalc\"\n")
        << QByteArray() << ""
        << QByteArray("None|KP_1=ZEMWM_CLOSE\nCtrl|space=ZEMWM_LOCK\nNone|XF86Calculator=\"xcalc\"\n");
}

void TestSaving::writtenBytes()
{
    QFETCH(bool, userFile);
    QFETCH(QByteArray, entries);
    QFETCH(QByteArray, system);
    QFETCH(QString, edit);
    QFETCH(QByteArray, written);

    const QString path = userFile ? FormFixture::userPath() : otherPath(QStringLiteral("saved.rc"));
    QVERIFY(userFile ? f.openUserFile(entries, system) : f.openFile(path, entries));

    const QStringList words = edit.split(QLatin1Char(' '));
    if (words.first() == "clear") {
        f.select(f.row(words.at(1)));
        f.form()->opt_nokeys_checked();
    } else if (words.first() == "key") {
        // Stored directly: some of these keys are ones the conflict check would refuse.
        QTreeWidgetItem* row = f.row(words.at(1));
        QVERIFY(row);
        KeysConfForm::setItemKey(row, words.mid(2).join(' '));
        row->setText(3, QStringLiteral("user"));
    } else if (words.first() == "command") {
        new QTreeWidgetItem(KeysConfForm::commandGroup(), {words.at(1), QString(), "ExecCommand", "user"});
    }
    f.form()->fileChanged();

    StderrCapture capture;
    QVERIFY(f.form()->saveFile());
    QCOMPARE(capture.finish(), QByteArray());
    QCOMPARE(readFile(path), "[ShortCutKeys]\n" + written);
}

void TestSaving::placeholdersStayDistinctAcrossSaves()
{
    const QString path = otherPath(QStringLiteral("placeholders.rc"));
    QVERIFY(f.openFile(path, "None|None0=\"xterm\"\nNone|None1=\"xclock\"\n"));
    f.form()->fileChanged();
    QVERIFY(f.form()->saveFile());
    QCOMPARE(KeysConfForm::itemKey(f.row("cmd:xterm")), QStringLiteral("None0"));
    QCOMPARE(KeysConfForm::itemKey(f.row("cmd:xclock")), QStringLiteral("None1"));
    QCOMPARE(f.row("cmd:xterm")->text(1), QStringLiteral("None0"));

    // A keyless command added after the first save must not take over None0.
    new QTreeWidgetItem(KeysConfForm::commandGroup(), {"xeyes", QString(), "ExecCommand", "user"});
    f.form()->fileChanged();
    QVERIFY(f.form()->saveFile());
    QCOMPARE(readFile(path), QByteArray("[ShortCutKeys]\nNone|None0=\"xterm\"\nNone|None1=\"xclock\"\n"
                                        "None|None2=\"xeyes\"\n"));
    QVERIFY(f.form()->loadFile(path));
    QCOMPARE(KeysConfForm::commandGroup()->childCount(), 3);
}

void TestSaving::unmodifiedWritesNothing()
{
    const QString path = otherPath(QStringLiteral("untouched.rc"));
    const QByteArray content = "; a comment\n[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\n[Other]\nx=y\n";
    QVERIFY(writeFile(path, content));
    KeysConfForm form;
    QVERIFY(form.init(path));
    QVERIFY(form.saveFile());
    QCOMPARE(readFile(path), content);

    form.fileChanged();
    QVERIFY(form.saveFile()); // the whole file is rebuilt from the tree
    QCOMPARE(readFile(path), QByteArray("[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\n"));
}

void TestSaving::roundTrip_data()
{
    QTest::addColumn<quint32>("seed");
    for (quint32 seed = 1; seed <= 12; ++seed)
        QTest::addRow("generated file %u", seed) << seed;
}

void TestSaving::roundTrip()
{
    QFETCH(quint32, seed);
    QRandomGenerator random(seed);
    const QStringList functions{
        "ZEMWM_CLOSE", "ZEMWM_KILL",          "ZEMWM_LOCK",           "ZEMWM_TOGGLE_PAGER",
        "ZEMWM_MOVE",  "ZEMWM_TOGGLE_BORDER", "ZEMWM_NEXT_WALLPAPER", "ZEMWM_NO_SUCH_FUNCTION"};
    const QStringList modifiers{
        "None|", "Ctrl|", "Alt|", "Shift|", "Super|", "Ctrl|Alt|", "Ctrl|Shift|Super|"};
    const QStringList keys{"a",      "z",     "5",      "F1",   "F12",
                           "Escape", "space", "Print",  "KP_3", "XF86AudioMute",
                           "comma",  "Left",  "Delete", "Tab"};
    QByteArray entries;
    for (int i = 0; i < 40; ++i) {
        const QString key =
            modifiers.at(random.bounded(modifiers.size())) + keys.at(random.bounded(keys.size()));
        QString value;
        switch (random.bounded(4)) {
        case 0:
            value = QStringLiteral("\"Disable\"");
            break;
        case 1:
            value = QStringLiteral("\"cmd %1 --x \"q\" ключ\"").arg(i);
            break;
        default:
            value = functions.at(random.bounded(functions.size()));
        }
        entries += (key + QLatin1Char('=') + value + QLatin1Char('\n')).toUtf8();
        if (random.bounded(6) == 0)
            entries += QStringLiteral("None|None%1=\"keyless %1\"\n").arg(i).toUtf8();
    }

    const QString path = otherPath(QStringLiteral("round-%1.rc").arg(seed));
    QVERIFY(f.openFile(path, entries));
    QStringList before = f.boundRows();
    QStringList disabledBefore = f.form()->disabledKeyList();
    f.form()->fileChanged();
    QVERIFY(f.form()->saveFile());
    QVERIFY(f.form()->loadFile(path));
    QStringList after = f.boundRows();
    QStringList disabledAfter = f.form()->disabledKeyList();

    // Placeholders carry no meaning; the order of entries is the file's key order.
    for (QStringList* rows : {&before, &after}) {
        for (QString& row : *rows)
            row.replace(QRegularExpression(QStringLiteral("=None[0-9]+@")), QStringLiteral("=@"));
        rows->sort();
    }
    disabledBefore.sort();
    disabledAfter.sort();
    QCOMPARE(after, before);
    QCOMPARE(disabledAfter, disabledBefore);
}

void TestSaving::failedSaveKeepsOldFile_data()
{
    QTest::addColumn<QString>("how");
    QTest::newRow("file replaced by a directory") << "directory";
    QTest::newRow("directory vanished") << "vanished";
}

void TestSaving::failedSaveKeepsOldFile()
{
    QFETCH(QString, how);
    const QString dir = otherPath(QStringLiteral("failing ") + how);
    const QString path = dir + QLatin1String("/keys.rc");
    QVERIFY(QDir().mkpath(dir));
    QVERIFY(f.openFile(path, "Alt|F4=ZEMWM_CLOSE\n"));
    f.select(f.row("ZEMWM_LOCK"));
    f.form()->setKey(QKeySequence(QStringLiteral("Ctrl+L")));

    if (how == "directory") {
        QVERIFY(QFile::remove(path));
        QVERIFY(QDir().mkpath(path));
    } else if (how == "vanished") {
        QVERIFY(QDir(dir).removeRecursively());
    }

    StderrCapture capture;
    QVERIFY(!f.form()->saveFile());
    QCOMPARE(capture.finish(), "zem-admin-hotkeys: Can't save file " + QFile::encodeName(path) + '\n');
    // Nothing was made in the file's place.
    if (how == "directory")
        QVERIFY(QFileInfo(path).isDir());
    else
        QVERIFY(!QFileInfo::exists(dir));
}

void TestSaving::immutableFile()
{
    const QString path = otherPath(QStringLiteral("immutable.rc"));
    QVERIFY(f.openFile(path, "Alt|F4=ZEMWM_CLOSE\n"));
    const QByteArray old = readFile(path);
    QProcess chattr;
    chattr.start(QStringLiteral("chattr"), {QStringLiteral("+i"), path});
    if (!chattr.waitForFinished(5000) || chattr.exitCode() != 0)
        QSKIP("this file system cannot make a file immutable");
    f.form()->fileChanged();
    StderrCapture capture;
    const bool saved = f.form()->saveFile();
    QProcess::execute(QStringLiteral("chattr"), {QStringLiteral("-i"), path});
    QVERIFY(!saved);
    QVERIFY(capture.finish().startsWith("zem-admin-hotkeys: Can't save file "));
    QCOMPARE(readFile(path), old);
    // No half-written temporary file is left beside it.
    QCOMPARE(QDir(scratch.path()).entryList({"immutable*"}, QDir::Files | QDir::Hidden),
             QStringList{"immutable.rc"});
}

void TestSaving::permissionsAndLinksSurvive()
{
    const QString target = otherPath(QStringLiteral("target.rc"));
    const QString link = otherPath(QStringLiteral("link.rc"));
    QVERIFY(writeFile(target, "[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\n"));
    QVERIFY(QFile::setPermissions(target,
                                  QFileDevice::ReadOwner | QFileDevice::WriteOwner | QFileDevice::ReadGroup));
    QVERIFY(QFile::link(target, link));

    QVERIFY(f.openFile(link, "Alt|F4=ZEMWM_CLOSE\n"));
    f.form()->fileChanged();
    QVERIFY(f.form()->saveFile());
    QVERIFY(QFileInfo(link).isSymLink());
    QCOMPARE(QFileInfo(link).symLinkTarget(), target);
    QCOMPARE(readFile(target), QByteArray("[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\n"));
    struct stat info = {};
    QCOMPARE(::stat(QFile::encodeName(target).constData(), &info), 0);
    QCOMPARE(info.st_mode & 07777, mode_t(0640));
}

void TestSaving::shellCharactersInPath()
{
    const QString dir = otherPath(QStringLiteral("a dir; $(touch pwned) `touch pwned2` 'q' \"dq\""));
    QVERIFY(QDir().mkpath(dir));
    const QString path = dir + QLatin1String("/keys & more.rc");
    QVERIFY(f.openFile(path, "Alt|F4=ZEMWM_CLOSE\n"));
    f.form()->fileChanged();
    QVERIFY(f.form()->saveFile());
    QCOMPARE(readFile(path), QByteArray("[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\n"));
    QCOMPARE(QDir(dir).entryList(QDir::Files), QStringList{"keys & more.rc"});
    QVERIFY(!QFileInfo::exists(QStringLiteral("pwned")));
}

ZEM_TEST_MAIN(TestSaving)
#include "tst_saving.moc"
