// The file commands as the user drives them, with every question and file dialog answered.
#include "formfixture.h"
#include "modalanswerer.h"
#include "testenvironment.h"
#include "xwindows.h"

#include <QAction>
#include <QDir>
#include <QTreeWidget>
#include <QtTest>

Q_DECLARE_METATYPE(QMessageBox::StandardButton)

class TestFileCommands : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void modifiedStateTable();
    void saveAgainWritesNothing();
    void unsavedChangesQuestion_data();
    void unsavedChangesQuestion();
    void failedSaveInQuestionStops();
    void failedSaveKeepsEdits();
    void exitQuits_data();
    void exitQuits();
    void openLoadsTheFile();
    void openUnreadableFileChangesNothing();
    void newFileCopiesThePrevious();
    void saveAs_data();
    void saveAs();
    void saveDialogCannotCreate();
    void restoreCopiesTheSystemFile();
    void restoreOffersSaveAsFirst();
    void apply_data();
    void apply();
    void applyWithFailedSave();

private:
    void edit(); // one real edit: a key for ZEMWM_LOCK
    bool savedActionsEnabled() const
    {
        return f.action("fileSaveAction")->isEnabled() && f.action("fileApplyAction")->isEnabled();
    }
    bool savedActionsDisabled() const
    {
        return !f.action("fileSaveAction")->isEnabled() && !f.action("fileApplyAction")->isEnabled();
    }

    FormFixture f;
    QTemporaryDir scratch;
    QString path; // the file opened at the start of each test
};

void TestFileCommands::init()
{
    path = scratch.filePath(QStringLiteral("start %1.rc").arg(QTest::currentTestFunction()));
    QVERIFY(f.openFile(path, "Alt|F4=ZEMWM_CLOSE\n"));
}

void TestFileCommands::cleanup()
{
    f.reset();
}

void TestFileCommands::edit()
{
    f.select(f.row("ZEMWM_LOCK"));
    f.form()->setKey(QKeySequence(QStringLiteral("Ctrl+Alt+L")));
    QVERIFY(KeysConfForm::isModified());
}

void TestFileCommands::modifiedStateTable()
{
    QVERIFY(!KeysConfForm::isModified());
    QVERIFY(savedActionsDisabled());

    edit();
    QVERIFY(savedActionsEnabled());

    f.form()->fileSave();
    QVERIFY(!KeysConfForm::isModified());
    QVERIFY(savedActionsEnabled()); // Save leaves the actions as they were

    edit();
    f.form()->fileApply();
    QVERIFY(!KeysConfForm::isModified());
    QVERIFY(savedActionsDisabled());

    const QString other = scratch.filePath(QStringLiteral("other.rc"));
    QVERIFY(writeFile(other, "[ShortCutKeys]\nAlt|F5=ZEMWM_KILL\n"));
    ModalAnswerer answerer({}, {other});
    f.form()->fileOpen();
    QVERIFY(KeysConfForm::isModified()); // an opened file counts as modified
    QVERIFY(savedActionsEnabled());
}

void TestFileCommands::saveAgainWritesNothing()
{
    edit();
    f.form()->fileSave();
    const QByteArray saved = readFile(path);
    QVERIFY(writeFile(path, saved + "; touched behind the editor's back\n"));
    f.form()->fileSave();
    QCOMPARE(readFile(path), saved + "; touched behind the editor's back\n");
}

void TestFileCommands::unsavedChangesQuestion_data()
{
    QTest::addColumn<QString>("command");
    QTest::addColumn<QMessageBox::StandardButton>("answer");
    QTest::addColumn<bool>("goesOn"); // the file dialog was shown
    QTest::addColumn<bool>("saved");

    for (const char* command : {"New", "Open"}) {
        QTest::addRow("%s, Cancel", command) << command << QMessageBox::Cancel << false << false;
        QTest::addRow("%s, No", command) << command << QMessageBox::No << true << false;
        QTest::addRow("%s, Yes", command) << command << QMessageBox::Yes << true << true;
    }
}

void TestFileCommands::unsavedChangesQuestion()
{
    QFETCH(QString, command);
    QFETCH(QMessageBox::StandardButton, answer);
    QFETCH(bool, goesOn);
    QFETCH(bool, saved);

    const QByteArray before = readFile(path);
    edit();
    ModalAnswerer answerer({answer}, {QString()}); // the file dialog, if any, is cancelled
    if (command == "New")
        f.form()->fileNew();
    else
        f.form()->fileOpen();

    QCOMPARE(answerer.titles(), QStringList{"Save ?"});
    QCOMPARE(answerer.last().text, QStringLiteral("Save previous changes?"));
    QCOMPARE(answerer.fileDialogs().size(), goesOn ? 1 : 0);
    QCOMPARE(readFile(path) != before, saved);
    QCOMPARE(KeysConfForm::isModified(), !saved);
    QCOMPARE(KeysConfForm::editedFile(), path);
    QCOMPARE(KeysConfForm::itemKey(f.row("ZEMWM_LOCK")), QStringLiteral("Ctrl+Alt+L"));
    if (goesOn) {
        QCOMPARE(answerer.fileDialogs().first().caption, QStringLiteral("Select hotkeys file"));
        QCOMPARE(answerer.fileDialogs().first().directory, QFileInfo(FormFixture::userPath()).absolutePath());
        QCOMPARE(answerer.fileDialogs().first().forSaving, command == "New");
    }
}

void TestFileCommands::failedSaveInQuestionStops()
{
    edit();
    QVERIFY(QFile::remove(path));
    QVERIFY(QDir().mkpath(path)); // the file became a directory: saving must fail
    {
        ModalAnswerer answerer({QMessageBox::Yes, QMessageBox::Ok}, {scratch.filePath("never.rc")});
        f.form()->fileNew();
        QCOMPARE(answerer.titles(), (QStringList{"Save ?", "Error"}));
        QCOMPARE(answerer.boxes().at(1).text, QStringLiteral("Can't save in file ") + path + QStringLiteral("\nIs a directory"));
        QCOMPARE(answerer.fileDialogs().size(), 0); // New stopped
        QVERIFY(KeysConfForm::isModified());
        QCOMPARE(KeysConfForm::itemKey(f.row("ZEMWM_LOCK")), QStringLiteral("Ctrl+Alt+L"));
    }

    // Closing the window stops as well.
    ModalAnswerer again({QMessageBox::Yes, QMessageBox::Ok});
    f.form()->show();
    QVERIFY(!f.form()->close());
    QVERIFY(f.form()->isVisible());
}

void TestFileCommands::failedSaveKeepsEdits()
{
    edit();
    QVERIFY(QFile::remove(path));
    QVERIFY(QDir().mkpath(path));
    ModalAnswerer answerer;
    f.form()->fileSave();
    QCOMPARE(answerer.titles(), QStringList{"Error"});
    QCOMPARE(answerer.last().text, QStringLiteral("Can't save in file ") + path + QStringLiteral("\nIs a directory"));
    QVERIFY(KeysConfForm::isModified());
    QVERIFY(savedActionsEnabled());
}

void TestFileCommands::exitQuits_data()
{
    QTest::addColumn<bool>("modified");
    QTest::addColumn<QMessageBox::StandardButton>("answer");
    QTest::addColumn<bool>("quits");

    QTest::newRow("nothing to save") << false << QMessageBox::Cancel << true;
    QTest::newRow("Cancel stays") << true << QMessageBox::Cancel << false;
    QTest::newRow("No quits without saving") << true << QMessageBox::No << true;
    QTest::newRow("Yes saves and quits") << true << QMessageBox::Yes << true;
}

void TestFileCommands::exitQuits()
{
    QFETCH(bool, modified);
    QFETCH(QMessageBox::StandardButton, answer);
    QFETCH(bool, quits);

    const QByteArray before = readFile(path);
    if (modified)
        edit();
    // As in the program, the window is shown: closing the last box must not end the loop.
    f.form()->show();
    ModalAnswerer answerer({answer});
    bool timedOut = false;
    QTimer limit;
    limit.setSingleShot(true);
    connect(&limit, &QTimer::timeout, qApp, [&] {
        timedOut = true;
        qApp->quit();
    });
    limit.start(1500);
    QTimer::singleShot(0, f.form(), [this] { f.action("fileExitAction")->trigger(); });
    qApp->exec();
    QCOMPARE(!timedOut, quits);
    QCOMPARE(answerer.count(), modified ? 1 : 0);
    QCOMPARE(readFile(path) != before, answer == QMessageBox::Yes);
}

void TestFileCommands::openLoadsTheFile()
{
    const QString other = scratch.filePath(QStringLiteral("other keys.rc"));
    QVERIFY(writeFile(other, "[ShortCutKeys]\nAlt|F5=ZEMWM_KILL\n"));
    ModalAnswerer answerer({}, {other});
    f.form()->fileOpen();
    QCOMPARE(KeysConfForm::editedFile(), other);
    QCOMPARE(f.form()->windowTitle(), QStringLiteral("Zem hotkeys editor - other keys.rc"));
    QCOMPARE(f.boundRows(), QStringList{"ZEMWM_KILL=Alt+F5@user"});
}

void TestFileCommands::openUnreadableFileChangesNothing()
{
    edit();
    const QString bad = scratch.filePath(QStringLiteral("not hotkeys.txt"));
    QVERIFY(writeFile(bad, "just text\n"));
    const QStringList rows = f.boundRows();
    ModalAnswerer answerer({QMessageBox::No, QMessageBox::Ok}, {bad});
    f.form()->fileOpen();
    QCOMPARE(answerer.titles(), (QStringList{"Save ?", "Attention"}));
    QCOMPARE(answerer.last().text, QStringLiteral("Can't parse file:\n") + bad + QStringLiteral("\nNo [ShortCutKeys] section"));
    QCOMPARE(KeysConfForm::editedFile(), path);
    QCOMPARE(f.form()->windowTitle(), QStringLiteral("Zem hotkeys editor - ") + QFileInfo(path).fileName());
    QVERIFY(KeysConfForm::isModified());
    QCOMPARE(f.boundRows(), rows);

    // A later Save writes the file that is shown, not the one that could not be read.
    f.form()->fileSave();
    QCOMPARE(readFile(bad), QByteArray("just text\n"));
    QCOMPARE(readFile(path), QByteArray("[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\nCtrl|Alt|l=ZEMWM_LOCK\n"));
}

void TestFileCommands::newFileCopiesThePrevious()
{
    edit();
    f.form()->fileSave();
    edit();
    const QString created = scratch.filePath(QStringLiteral("new; $(touch pwned) 'file'.rc"));
    ModalAnswerer answerer({QMessageBox::No}, {created});
    f.form()->fileNew();
    QCOMPARE(answerer.titles(), QStringList{"Save ?"});
    QCOMPARE(readFile(created), readFile(path));
    QCOMPARE(KeysConfForm::editedFile(), created);
    QCOMPARE(f.form()->windowTitle(), QStringLiteral("Zem hotkeys editor - new; $(touch pwned) 'file'.rc"));
    QVERIFY(KeysConfForm::isModified());
    QVERIFY(savedActionsEnabled());
    QCOMPARE(KeysConfForm::itemKey(f.row("ZEMWM_LOCK")), QStringLiteral("Ctrl+Alt+L"));
    QVERIFY(!QFileInfo::exists(scratch.filePath("pwned")) && !QFileInfo::exists("pwned"));
}

void TestFileCommands::saveAs_data()
{
    QTest::addColumn<bool>("modified");
    QTest::newRow("no changes: an exact copy") << false;
    QTest::newRow("changes: the editor's bindings") << true;
}

void TestFileCommands::saveAs()
{
    QFETCH(bool, modified);
    QVERIFY(writeFile(path, "[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\n; kept by a plain copy\n"));
    if (modified)
        edit();
    const QString target = scratch.filePath(QStringLiteral("saved as 'copy'.rc"));
    ModalAnswerer answerer({}, {target});
    f.form()->fileSaveAs();
    QCOMPARE(answerer.count(), 0);
    QCOMPARE(readFile(target), modified
                                   ? QByteArray("[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\nCtrl|Alt|l=ZEMWM_LOCK\n")
                                   : readFile(path));
    QCOMPARE(KeysConfForm::editedFile(), target);
    QCOMPARE(f.form()->windowTitle(), QStringLiteral("Zem hotkeys editor - saved as 'copy'.rc"));
    QVERIFY(!KeysConfForm::isModified());
    QCOMPARE(readFile(path), QByteArray("[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\n; kept by a plain copy\n"));
}

void TestFileCommands::saveDialogCannotCreate()
{
    const QString impossible = scratch.filePath(QStringLiteral("no such dir/new.rc"));
    ModalAnswerer answerer({}, {impossible});
    f.form()->fileNew();
    QCOMPARE(answerer.titles(), QStringList{"Error"});
    QCOMPARE(answerer.last().text, QStringLiteral("Can't create file ") + impossible + QStringLiteral("\nNo such file or directory"));
    QVERIFY(!KeysConfForm::isModified()); // New stopped before its end
}

void TestFileCommands::restoreCopiesTheSystemFile()
{
    QVERIFY(writeFile(FormFixture::systemPath(), "[ShortCutKeys]\nAlt|F4=ZEMWM_KILL\n"));
    QVERIFY(writeFile(FormFixture::userPath(), "[ShortCutKeys]\nAlt|F9=ZEMWM_LOCK\n"));
    edit();
    ModalAnswerer answerer({QMessageBox::No});
    f.form()->fileRestore();
    QCOMPARE(answerer.titles(), QStringList{"Save ?"});
    QCOMPARE(answerer.last().text, QStringLiteral("All changes will be lost. Save them?"));
    QCOMPARE(answerer.last().buttons, QMessageBox::Yes | QMessageBox::No);
    QCOMPARE(readFile(FormFixture::userPath()), readFile(FormFixture::systemPath()));
    QCOMPARE(KeysConfForm::editedFile(), FormFixture::userPath());
    QCOMPARE(f.boundRows(), QStringList{"ZEMWM_KILL=Alt+F4@user"});
    QVERIFY(KeysConfForm::isModified());
    QVERIFY(savedActionsEnabled());
    QCOMPARE(readFile(path), QByteArray("[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\n")); // not saved: No
}

void TestFileCommands::restoreOffersSaveAsFirst()
{
    QVERIFY(writeFile(FormFixture::systemPath(), "[ShortCutKeys]\nAlt|F4=ZEMWM_KILL\n"));
    edit();
    const QString keep = scratch.filePath(QStringLiteral("kept before restore.rc"));
    ModalAnswerer answerer({QMessageBox::Yes}, {keep});
    f.form()->fileRestore();
    QCOMPARE(answerer.fileDialogs().size(), 1);
    QCOMPARE(readFile(keep), QByteArray("[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\nCtrl|Alt|l=ZEMWM_LOCK\n"));
    QCOMPARE(KeysConfForm::editedFile(), FormFixture::userPath());
    QCOMPARE(f.boundRows(), QStringList{"ZEMWM_KILL=Alt+F4@user"});

    // A cancelled Save As does not stop the restore.
    edit();
    ModalAnswerer cancelled({QMessageBox::Yes}, {QString()});
    f.form()->fileRestore();
    QCOMPARE(cancelled.fileDialogs().size(), 1);
    QCOMPARE(f.boundRows(), QStringList{"ZEMWM_KILL=Alt+F4@user"});
}

void TestFileCommands::apply_data()
{
    QTest::addColumn<bool>("otherFile");
    QTest::newRow("the start-up file: no warning") << false;
    QTest::newRow("another file: warned first") << true;
}

void TestFileCommands::apply()
{
    QFETCH(bool, otherFile);
    XConnection x;
    QVERIFY(x.isOpen());
    x.deleteRootProperty("_ZEMWM_COMMAND");

    QString applied = path;
    if (otherFile) {
        applied = scratch.filePath(QString::fromUtf8("ключи с пробелом; $(x).rc"));
        QVERIFY(writeFile(applied, "[ShortCutKeys]\n"));
        ModalAnswerer opener({}, {applied});
        f.form()->fileOpen();
        QCOMPARE(KeysConfForm::editedFile(), applied);
    }
    edit();
    ModalAnswerer answerer;
    f.form()->fileApply();
    if (otherFile) {
        QCOMPARE(answerer.titles(), QStringList{"Warning"});
        QCOMPARE(answerer.last().text,
                 QStringLiteral("You current file is \"%1\".\nAfter restart zem-wm will use \"%2\".")
                     .arg(applied, path));
    } else {
        QCOMPARE(answerer.count(), 0);
    }
    QVERIFY(readFile(applied).contains("Ctrl|Alt|l=ZEMWM_LOCK\n"));
    QTRY_COMPARE(x.rootProperty("_ZEMWM_COMMAND"),
                 "ZEMWM_UPDATE_VAL SCKeysFile " + applied.toLocal8Bit() + '\n');
    x.deleteRootProperty("_ZEMWM_COMMAND");
}

void TestFileCommands::applyWithFailedSave()
{
    XConnection x;
    x.deleteRootProperty("_ZEMWM_COMMAND");
    edit();
    QVERIFY(QFile::remove(path));
    QVERIFY(QDir().mkpath(path));
    ModalAnswerer answerer;
    f.form()->fileApply();
    QCOMPARE(answerer.titles(), QStringList{"Error"});
    QCOMPARE(answerer.last().text, QStringLiteral("Can't save in file ") + path + QStringLiteral("\nIs a directory"));
    QVERIFY(KeysConfForm::isModified());
    QVERIFY(savedActionsEnabled());
    // Give a wrongly sent command every chance to arrive before looking.
    QTest::qWait(100);
    QCOMPARE(x.rootProperty("_ZEMWM_COMMAND"), QByteArray());
}

ZEM_TEST_MAIN(TestFileCommands)
#include "tst_filecommands.moc"
