// What is the window's own: the key panel, the conflict box, the row actions, the questions,
// the Save and Apply states and what a failed write tells the user. The file rules themselves
// are the core's and tested there.
#include "keysconfform.h"
#include "kkeysequencewidget.h"
#include "modalanswerer.h"
#include "testenvironment.h"

#include <QAction>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QProcess>
#include <QPushButton>
#include <QRadioButton>
#include <QRandomGenerator>
#include <QScreen>
#include <QSettings>
#include <QStatusBar>
#include <QTreeWidget>
#include <QTreeWidgetItemIterator>
#include <QtTest>

Q_DECLARE_METATYPE(QMessageBox::StandardButton)

namespace {

// What the window manager has been sent, as xprop shows it; taken away afterwards.
QByteArray takeRootProperty()
{
    QProcess xprop;
    xprop.start(QStringLiteral("xprop"),
                {QStringLiteral("-root"), QStringLiteral("-notype"), QStringLiteral("_ZEMWM_COMMAND")});
    xprop.waitForFinished();
    QProcess::execute(QStringLiteral("xprop"),
                      {QStringLiteral("-root"), QStringLiteral("-remove"), QStringLiteral("_ZEMWM_COMMAND")});
    const QByteArray shown = xprop.readAllStandardOutput();
    return shown.startsWith("_ZEMWM_COMMAND = ") ? shown.mid(17).trimmed() : QByteArray();
}

} // namespace

class TestMainWindow : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void selectionShowsTheRow_data();
    void selectionShowsTheRow();
    void refusedRecording();
    void saveThenApply();
    void reassignThenRevert();
    void filterHidesTheSelectedRow();
    void undoInTheFilterField();
    void fitsTheScreen();
    void failedWriteKeepsEdits_data();
    void failedWriteKeepsEdits();
    void closeQuestion_data();
    void closeQuestion();
    void commandEntries();
    void saveAsAndRestore();
    void applyRefused_data();
    void applyRefused();
    void changedOnDisk_data();
    void changedOnDisk();
    void filterAndFindKey();
    void undoRedo_data();
    void undoRedo();
    void undoRandomEdits();

private:
    QTreeWidgetItem* row(const QString& name, int index = 0) const;
    void select(const QString& name, int index = 0) const
    {
        form->findChild<QTreeWidget*>()->setCurrentItem(row(name, index));
    }
    void assign(const QString& name, const char* key) const
    {
        select(name);
        form->setKey(QKeySequence(QLatin1String(key)));
    }
    QAction* action(const char* name) const { return form->findChild<QAction*>(QLatin1String(name)); }
    KKeySequenceWidget* keyWidget() const { return form->findChild<KKeySequenceWidget*>("keyWidget"); }
    // Every row with its key and source, then the disabled keys.
    QStringList state() const
    {
        QStringList rows = form->disabledKeyList();
        for (QTreeWidgetItemIterator it(form->findChild<QTreeWidget*>()); *it; ++it)
            rows << (*it)->text(0) + '|' + KeysConfForm::itemKey(*it) + '|' + (*it)->text(3);
        return rows;
    }
    bool saveEnabled() const
    {
        return action("fileSaveAction")->isEnabled() && action("fileApplyAction")->isEnabled();
    }

    std::unique_ptr<KeysConfForm> form;
    QString userFile;
};

void TestMainWindow::init()
{
    const QString system =
        QString::fromLocal8Bit(qgetenv("ZEM_SYSTEM_DIR")) + QLatin1String("/keyshortcutrc");
    QFile::remove(QString::fromLocal8Bit(qgetenv("ZEM_USER_DIR")));
    userFile = QString::fromLocal8Bit(qgetenv("ZEM_USER_DIR")) + QLatin1String("/keyshortcutrc");
    QVERIFY(writeFile(system, "[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\nCtrl|k=ZEMWM_KILL\n"));
    QVERIFY(writeFile(userFile, "[ShortCutKeys]\nAlt|F5=ZEMWM_LOCK\nCtrl|Alt|x=\"xclock\"\n"));
    form.reset(); // one main window at a time: its state is class-wide
    form = std::make_unique<KeysConfForm>();
    QVERIFY(form->init(userFile));
    form->show();
    QVERIFY(QTest::qWaitForWindowExposed(form.get()));
    takeRootProperty();
}

QTreeWidgetItem* TestMainWindow::row(const QString& name, int index) const
{
    for (QTreeWidgetItemIterator it(form->findChild<QTreeWidget*>()); *it; ++it) {
        const bool match =
            name.startsWith(QLatin1String("cmd:"))
                ? (*it)->parent() == KeysConfForm::commandGroup() && (*it)->text(0) == name.mid(4)
                : (*it)->text(2) == name || (name == QLatin1String("group") && !(*it)->parent());
        if (match && index-- == 0)
            return *it;
    }
    return nullptr;
}

void TestMainWindow::selectionShowsTheRow_data()
{
    QTest::addColumn<QString>("rowName");
    QTest::addColumn<QString>("actions"); // N new, C clone, E edit, D delete
    QTest::addColumn<QString>("panel");   // "" disabled, else the checked radio and the key shown

    // Each starts from ZEMWM_LOCK selected, which shows Alt+F5.
    QTest::newRow("function with a key") << "ZEMWM_LOCK" << QString("C") << "assign Alt+F5";
    QTest::newRow("function without key") << "ZEMWM_EXIT" << QString("C") << "clear None";
    QTest::newRow("group row") << "group" << QString() << QString();
    QTest::newRow("command group row") << "commands" << QString("N") << QString();
    QTest::newRow("command row") << "cmd:xclock" << QString("NCED") << "assign Ctrl+Alt+X";
}

void TestMainWindow::selectionShowsTheRow()
{
    QFETCH(QString, rowName);
    QFETCH(QString, actions);
    QFETCH(QString, panel);
    select(QStringLiteral("ZEMWM_LOCK"));
    form->findChild<QTreeWidget*>()->setCurrentItem(
        rowName == QLatin1String("commands") ? KeysConfForm::commandGroup() : row(rowName));
    QString shown;
    for (const auto& [name, letter] : {std::pair{"newCommandAction", 'N'},
                                       {"cloneCommandAction", 'C'},
                                       {"editCommandAction", 'E'},
                                       {"deleteCommandAction", 'D'}})
        shown += action(name)->isEnabled() ? QString(QLatin1Char(letter)) : QString();
    QCOMPARE(shown, actions);
    QCOMPARE(form->findChild<QGroupBox*>("keyGroupBox")->isEnabled(), !panel.isEmpty());
    if (!panel.isEmpty()) {
        QCOMPARE(form->findChild<QRadioButton*>("customKeyRadio")->isChecked(), panel.startsWith("assign"));
        QCOMPARE(keyWidget()->findChild<QPushButton*>("recordButton")->text(),
                 QLatin1Char(' ') + panel.section(' ', 1) + ' ');
    }
    QVERIFY(!KeysConfForm::isModified());
}

void TestMainWindow::refusedRecording()
{
    select(QStringLiteral("ZEMWM_LOCK"));
    ModalAnswerer answerer;
    // A combination the system file holds in another spelling is refused, and the panel shows
    // the row's own key again.
    keyWidget()->setKeySequence(QKeySequence(QStringLiteral("Ctrl+K")), KKeySequenceWidget::NoValidate);
    QCOMPARE(answerer.count(), 1);
    QCOMPARE(answerer.last().title, QStringLiteral("Whoopsie! Key conflict."));
    QCOMPARE(answerer.last().text,
             QStringLiteral(
                 "Ouch! The Ctrl+K key combination has already been allocated\nto the ZEMWM_KILL action "
                 "(close a window forcely).\n\nPlease choose a unique key combination."));
    QCOMPARE(KeysConfForm::itemKey(row("ZEMWM_LOCK")), QStringLiteral("Alt+F5"));
    QCOMPARE(keyWidget()->keySequence(), QKeySequence(QStringLiteral("Alt+F5")));
    QVERIFY(!KeysConfForm::isModified());

    keyWidget()->setKeySequence(QKeySequence(QStringLiteral("Ctrl+Alt+E")), KKeySequenceWidget::NoValidate);
    QCOMPARE(answerer.count(), 1);
    QCOMPARE(KeysConfForm::itemKey(row("ZEMWM_LOCK")), QStringLiteral("Ctrl+Alt+E"));
    QVERIFY(KeysConfForm::isModified() && form->isWindowModified());
}

void TestMainWindow::saveThenApply()
{
    QAction* save = action("fileSaveAction");
    QAction* apply = action("fileApplyAction");
    QVERIFY(!save->isEnabled() && !apply->isEnabled());
    assign(QStringLiteral("ZEMWM_EXIT"), "Ctrl+Alt+E");
    form->fileSave();
    // Saved but not yet handed over: nothing to save, but something to apply, also after an
    // edit taken back.
    QVERIFY(!save->isEnabled() && apply->isEnabled() && !form->isWindowModified());
    QCOMPARE(form->statusBar()->currentMessage(), QStringLiteral("Saved keyshortcutrc"));
    assign(QStringLiteral("ZEMWM_LOCK"), "Ctrl+Alt+L");
    action("undoAction")->trigger();
    QVERIFY(!save->isEnabled() && apply->isEnabled());
    form->fileApply();
    QCOMPARE(takeRootProperty(), "\"ZEMWM_UPDATE_VAL SCKeysFile " + QFile::encodeName(userFile) + "\\n\"");
    QCOMPARE(form->statusBar()->currentMessage(),
             QStringLiteral("The window manager was told to reload keyshortcutrc"));
    // Applied, an edit taken back leaves nothing to apply.
    assign(QStringLiteral("ZEMWM_LOCK"), "Ctrl+Alt+L");
    action("undoAction")->trigger();
    QVERIFY(!save->isEnabled() && !apply->isEnabled());
}

void TestMainWindow::reassignThenRevert()
{
    // Reassign takes the system's Ctrl+K from ZEMWM_KILL; reverting the row that took it gives
    // it back in the same step, and nothing is left switched off.
    ModalAnswerer answerer({QMessageBox::Apply});
    assign(QStringLiteral("ZEMWM_CLOSE"), "Ctrl+K");
    QVERIFY(KeysConfForm::itemKey(row("ZEMWM_KILL")).isEmpty());
    select(QStringLiteral("ZEMWM_CLOSE"));
    action("revertAction")->trigger();
    QCOMPARE(KeysConfForm::itemKey(row("ZEMWM_CLOSE")), QStringLiteral("Alt+F4"));
    QCOMPARE(KeysConfForm::itemKey(row("ZEMWM_KILL")), QStringLiteral("Ctrl+K"));
    QCOMPARE(row("ZEMWM_KILL")->text(3), QStringLiteral("system"));
    QCOMPARE(form->disabledKeyList(), QStringList());
    action("undoAction")->trigger();
    QVERIFY(KeysConfForm::itemKey(row("ZEMWM_KILL")).isEmpty());
}

void TestMainWindow::filterHidesTheSelectedRow()
{
    select(QStringLiteral("ZEMWM_LOCK"));
    QVERIFY(form->findChild<QGroupBox*>("keyGroupBox")->isEnabled());
    form->findChild<QLineEdit*>(QStringLiteral("filterEdit"))->setText(QStringLiteral("xclock"));
    form->applyFilter();
    // The panel no longer acts on a row that is not shown.
    QVERIFY(!form->findChild<QTreeWidget*>()->currentItem());
    QVERIFY(!form->findChild<QGroupBox*>("keyGroupBox")->isEnabled());
}

void TestMainWindow::undoInTheFilterField()
{
    auto* filter = form->findChild<QLineEdit*>(QStringLiteral("filterEdit"));
    assign(QStringLiteral("ZEMWM_EXIT"), "Ctrl+Alt+E");
    form->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(form.get()));
    filter->setFocus();
    QTest::keyClicks(filter, QStringLiteral("exit"));
    QTest::keyClick(filter, Qt::Key_Z, Qt::ControlModifier);
    QVERIFY(KeysConfForm::itemKey(row("ZEMWM_EXIT")).isEmpty());
    QCOMPARE(filter->text(), QStringLiteral("exit"));
}

void TestMainWindow::fitsTheScreen()
{
    // A size saved on a larger screen is shrunk to this one, and the window can be as small as a
    // 1024x700 screen at scale factor 2.
    QSettings().setValue(QStringLiteral("/Width"), 9000);
    QSettings().setValue(QStringLiteral("/Height"), 9000);
    form.reset();
    form = std::make_unique<KeysConfForm>();
    QVERIFY(form->init(userFile));
    const QRect available = form->screen()->availableGeometry();
    QVERIFY(form->width() <= available.width() && form->height() <= available.height());
    QVERIFY2(form->minimumSizeHint().width() <= 512 && form->minimumSizeHint().height() <= 350,
             qPrintable(QStringLiteral("%1x%2")
                            .arg(form->minimumSizeHint().width())
                            .arg(form->minimumSizeHint().height())));
}

void TestMainWindow::failedWriteKeepsEdits_data()
{
    QTest::addColumn<QString>("command");
    QTest::newRow("Save") << "save";
    QTest::newRow("Apply") << "apply";
    QTest::newRow("Yes on closing") << "close";
}

void TestMainWindow::failedWriteKeepsEdits()
{
    QFETCH(QString, command);
    assign(QStringLiteral("ZEMWM_EXIT"), "Ctrl+Alt+E");
    // The file's directory is replaced by a file: the write fails, and says why.
    QVERIFY(QDir(QFileInfo(userFile).path()).removeRecursively() &&
            writeFile(QFileInfo(userFile).path(), "x"));

    ModalAnswerer answerer({QMessageBox::Yes, QMessageBox::Ok});
    if (command == QLatin1String("save"))
        form->fileSave();
    else if (command == QLatin1String("apply"))
        form->fileApply();
    else
        QVERIFY(!form->close());
    QCOMPARE(answerer.last().title, QStringLiteral("Error"));
    QCOMPARE(answerer.last().text, QStringLiteral("Can't save in file %1\nNot a directory").arg(userFile));
    QVERIFY(KeysConfForm::isModified() && saveEnabled());
    QVERIFY(form->isVisible());
    QCOMPARE(takeRootProperty(), QByteArray());
}

void TestMainWindow::closeQuestion_data()
{
    QTest::addColumn<QMessageBox::StandardButton>("answer");
    QTest::addColumn<bool>("closed");
    QTest::addColumn<bool>("saved");
    QTest::newRow("Yes saves and closes") << QMessageBox::Yes << true << true;
    QTest::newRow("No closes without saving") << QMessageBox::No << true << false;
    QTest::newRow("Cancel keeps the window and the edits") << QMessageBox::Cancel << false << false;
}

void TestMainWindow::closeQuestion()
{
    QFETCH(QMessageBox::StandardButton, answer);
    QFETCH(bool, closed);
    QFETCH(bool, saved);
    const QByteArray before = readFile(userFile);
    assign(QStringLiteral("ZEMWM_EXIT"), "Ctrl+Alt+E");

    ModalAnswerer answerer({answer});
    QCOMPARE(form->close(), closed);
    QCOMPARE(answerer.titles(), QStringList{"Save ?"});
    QCOMPARE(answerer.last().text, QStringLiteral("Save previous changes?"));
    QCOMPARE(readFile(userFile) != before, saved);
    QCOMPARE(KeysConfForm::isModified(), !saved);
}

void TestMainWindow::commandEntries()
{
    QString typed = QStringLiteral("xeyes  -fg   red");
    ModalAnswerer answerer({QMessageBox::Yes});
    answerer.onOtherDialog([&](QDialog* dialog) {
        dialog->findChild<QLineEdit*>()->setText(typed);
        dialog->accept();
    });
    action("newCommandAction")->trigger();
    QTreeWidgetItem* added = row(QStringLiteral("cmd:xeyes -fg red"));
    QVERIFY(added);
    QCOMPARE(form->findChild<QTreeWidget*>()->currentItem(), added);
    QVERIFY(form->findChild<QRadioButton*>("noKeyRadio")->isChecked());

    // Edit keeps the row's key and place; Delete asks first.
    select(QStringLiteral("cmd:xclock"));
    typed = QStringLiteral("xclock -digital");
    action("editCommandAction")->trigger();
    QCOMPARE(KeysConfForm::commandGroup()->child(0)->text(0), typed);
    QCOMPARE(KeysConfForm::itemKey(KeysConfForm::commandGroup()->child(0)), QStringLiteral("Ctrl+Alt+X"));
    action("deleteCommandAction")->trigger();
    QCOMPARE(answerer.last().title, QStringLiteral("Delete"));
    QVERIFY(!row(QStringLiteral("cmd:xclock -digital")));
    QCOMPARE(form->findChild<QTreeWidget*>()->currentItem(), KeysConfForm::commandGroup());

    form->fileSave();
    QCOMPARE(readFile(userFile),
             QByteArray("[ShortCutKeys]\nAlt|F5=ZEMWM_LOCK\nNone|None0=\"xeyes -fg red\"\n"));
}

void TestMainWindow::saveAsAndRestore()
{
    assign(QStringLiteral("ZEMWM_EXIT"), "Ctrl+Alt+E");
    const QString other = QFileInfo(userFile).path() + QLatin1String("/other.rc");
    ModalAnswerer answerer({QMessageBox::Cancel, QMessageBox::Yes}, {other});
    form->fileSaveAs();
    // Another file holds every binding shown, the system's too, and is the one edited now.
    QCOMPARE(KeysConfForm::editedFile(), other);
    QCOMPARE(readFile(other),
             QByteArray("[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\nCtrl|k=ZEMWM_KILL\nAlt|F5=ZEMWM_LOCK\n"
                        "Ctrl|Alt|e=ZEMWM_EXIT\nCtrl|Alt|x=\"xclock\"\n"));
    // Restore asks first; Cancel changes nothing. Yes puts the system file in the place of the
    // user's, keeps the user's beside it, and edits it.
    const QByteArray before = readFile(userFile);
    form->fileRestore();
    QCOMPARE(answerer.titles(), QStringList{"Restore"});
    QCOMPARE(KeysConfForm::editedFile(), other);
    form->fileRestore();
    QCOMPARE(readFile(userFile),
             readFile(QFileInfo(userFile).path() + QLatin1String("/../system/keyshortcutrc")));
    QCOMPARE(readFile(userFile + QLatin1Char('~')), before);
    QCOMPARE(KeysConfForm::editedFile(), userFile);
}

void TestMainWindow::applyRefused_data()
{
    QTest::addColumn<QString>("fileName");
    QTest::addColumn<QString>("text");
    QTest::newRow("a line break in the file's name") << "keys\nZEMWM_UPDATE_VAL SCKeysFile evil.rc"
                                                     << "The window manager cannot be told to use this file";
    QTest::newRow("a property of another type in the way") << "keys.rc"
                                                           << "The window manager could not be told";
}

void TestMainWindow::applyRefused()
{
    QFETCH(QString, fileName);
    QFETCH(QString, text);
    const QString path = QFileInfo(userFile).path() + QLatin1Char('/') + fileName;
    QVERIFY(writeFile(path, "[ShortCutKeys]\n") && form->loadFile(path));
    if (fileName == QLatin1String("keys.rc"))
        QProcess::execute(QStringLiteral("xprop"),
                          QStringLiteral("-root -f _ZEMWM_COMMAND 32i -set _ZEMWM_COMMAND 5").split(' '));
    form->fileChanged();
    ModalAnswerer answerer;
    form->fileApply();
    QCOMPARE(answerer.titles().last(), QStringLiteral("Error"));
    QVERIFY2(answerer.last().text.startsWith(text), qPrintable(answerer.last().text));
    QVERIFY(!takeRootProperty().contains("SCKeysFile"));
}

void TestMainWindow::changedOnDisk_data()
{
    QTest::addColumn<bool>("edited");
    QTest::addColumn<QMessageBox::StandardButton>("answer"); // Save: Overwrite, Discard: Reload
    QTest::addColumn<QString>("lockKey");                    // ZEMWM_LOCK's key afterwards
    QTest::addColumn<bool>("system");                        // the system file changed, not the user's
    QTest::newRow("no unsaved edits: loaded at once, the row stays selected")
        << false << QMessageBox::Ok << "Alt+F6" << false;
    QTest::newRow("Cancel keeps the edits and the file") << true << QMessageBox::Cancel << "Alt+F5" << false;
    QTest::newRow("Reload drops the edits") << true << QMessageBox::Discard << "Alt+F6" << false;
    QTest::newRow("the system file alone changed: the box names it")
        << true << QMessageBox::Cancel << "Alt+F5" << true;
}

void TestMainWindow::changedOnDisk()
{
    QFETCH(bool, edited);
    QFETCH(QMessageBox::StandardButton, answer);
    QFETCH(QString, lockKey);
    QFETCH(bool, system);
    if (edited) {
        assign(QStringLiteral("ZEMWM_EXIT"), "Ctrl+Alt+E");
    }
    select(QStringLiteral("ZEMWM_LOCK"));
    const QString changed =
        system ? QFileInfo(userFile).path() + QLatin1String("/../system/keyshortcutrc") : userFile;
    const QByteArray theirs = "[ShortCutKeys]\nAlt|F6=ZEMWM_LOCK\n";
    const QByteArray ours = readFile(userFile);
    QVERIFY(writeFile(changed, theirs));
    ModalAnswerer answerer({answer});
    if (edited)
        form->fileSave();
    QTRY_COMPARE(KeysConfForm::itemKey(row(QStringLiteral("ZEMWM_LOCK"))), lockKey);
    QCOMPARE(form->findChild<QTreeWidget*>()->currentItem(), row(QStringLiteral("ZEMWM_LOCK")));
    QCOMPARE(answerer.titles(), edited ? QStringList{"File changed on disk"} : QStringList());
    if (edited)
        QCOMPARE(answerer.last().text.contains(QLatin1String("system")), system);
    QCOMPARE(readFile(userFile) == (system ? ours : theirs), answer != QMessageBox::Save);
    QCOMPARE(KeysConfForm::isModified(), answer == QMessageBox::Cancel);
}

void TestMainWindow::filterAndFindKey()
{
    auto* filter = form->findChild<QLineEdit*>(QStringLiteral("filterEdit"));
    QTreeWidgetItem* lockGroup = row(QStringLiteral("ZEMWM_LOCK"))->parent();
    lockGroup->setExpanded(true);
    form->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(form.get()));
    QTest::keyClick(form.get(), Qt::Key_F, Qt::ControlModifier);
    QTRY_VERIFY(filter->hasFocus());
    QTest::keyClicks(filter, QStringLiteral("xclock"));
    QTRY_COMPARE(form->statusBar()->findChild<QLabel*>()->text(), QStringLiteral("1 of 155 bindings"));
    QVERIFY(row(QStringLiteral("cmd:xclock"))->parent()->isExpanded() && lockGroup->isHidden());
    // Escape empties the filter, and the groups are open as they were before.
    QTest::keyClick(filter, Qt::Key_Escape);
    QTRY_VERIFY(!lockGroup->isHidden() && lockGroup->isExpanded());
    QVERIFY(!KeysConfForm::commandGroup()->isExpanded());

    form->findChild<KKeySequenceWidget*>(QStringLiteral("findKeyWidget"))
        ->setKeySequence(QKeySequence(QStringLiteral("Ctrl+Alt+Y")), KKeySequenceWidget::NoValidate);
    QCOMPARE(filter->text(), QStringLiteral("Ctrl+Alt+Y"));
    QCOMPARE(form->statusBar()->currentMessage(), QStringLiteral("Ctrl+Alt+Y is free"));
}

void TestMainWindow::undoRedo_data()
{
    QTest::addColumn<QString>("edit");
    QTest::addColumn<QString>("undoText");
    QTest::newRow("assign") << "assign" << QString("Undo Assign Ctrl+Alt+E to exit zem-wm");
    QTest::newRow("clear a system key")
        << "clear" << QString("Undo Clear the key of close a window (recommend)");
    QTest::newRow("clone") << "clone" << QString("Undo Clone lock screen");
    QTest::newRow("delete a command") << "delete" << QString("Undo Delete xclock");
    QTest::newRow("reassign") << "reassign"
                              << QString("Undo Reassign Ctrl+K from close a window forcely to exit zem-wm");
    QTest::newRow("revert") << "revert"
                            << QString("Undo Revert close a window (recommend) to the system binding");
}

void TestMainWindow::undoRedo()
{
    QFETCH(QString, edit);
    QFETCH(QString, undoText);
    ModalAnswerer answerer({edit == QLatin1String("delete") ? QMessageBox::Yes : QMessageBox::Apply});
    if (edit == QLatin1String("revert")) {
        assign(QStringLiteral("ZEMWM_CLOSE"), "Alt+F9");
        QVERIFY(action("revertAction")->isEnabled());
    }
    const QStringList before = state();
    const QString name = edit == QLatin1String("assign") || edit == QLatin1String("reassign") ? "ZEMWM_EXIT"
                         : edit == QLatin1String("delete")                                    ? "cmd:xclock"
                         : edit == QLatin1String("clone")                                     ? "ZEMWM_LOCK"
                                                                                              : "ZEMWM_CLOSE";
    select(name);
    if (edit == QLatin1String("assign") || edit == QLatin1String("reassign"))
        form->setKey(QKeySequence(edit == QLatin1String("assign") ? "Ctrl+Alt+E" : "Ctrl+K"));
    else if (edit == QLatin1String("clear"))
        QTest::mouseClick(form->findChild<QRadioButton*>("noKeyRadio"), Qt::LeftButton);
    else
        action(qPrintable(edit + QLatin1String(edit == QLatin1String("revert") ? "Action" : "CommandAction")))
            ->trigger();
    const QStringList after = state();
    QVERIFY(after != before);
    QCOMPARE(action("undoAction")->text(), undoText);
    action("undoAction")->trigger();
    QCOMPARE(state(), before);
    action("redoAction")->trigger();
    QCOMPARE(state(), after);
}

void TestMainWindow::undoRandomEdits()
{
    // Any sequence of edits undone to the start gives the state loaded, and redone the state
    // reached; and nothing is left to save at the start. Saved, then undone and saved again, the
    // file is the one loaded, byte for byte.
    QRandomGenerator random(20261206);
    const QByteArray loaded =
        "[ShortCutKeys]\n; mine\r\nalt|f5 = ZEMWM_LOCK\r\nALT|F5=ZEMWM_EXIT\nCtrl|Alt|x=\"xclock\"";
    QVERIFY(writeFile(userFile, loaded) && form->loadFile(userFile));
    const QStringList names{"ZEMWM_CLOSE", "ZEMWM_KILL", "ZEMWM_LOCK", "ZEMWM_EXIT", "cmd:xclock"};
    const QStringList keys{"Alt+F4", "Ctrl+K", "Alt+F5", "Ctrl+Alt+E", "Ctrl+Alt+X", "F9"};
    ModalAnswerer answerer({QMessageBox::Apply});
    const QStringList start = state();
    for (int step = 0; step < 40; ++step) {
        select(names.at(random.bounded(names.size())));
        if (random.bounded(3) == 0)
            QTest::mouseClick(form->findChild<QRadioButton*>("noKeyRadio"), Qt::LeftButton);
        else
            form->setKey(QKeySequence(keys.at(random.bounded(keys.size()))));
    }
    const QStringList end = state();
    while (action("undoAction")->isEnabled())
        action("undoAction")->trigger();
    QCOMPARE(state(), start);
    QVERIFY(!KeysConfForm::isModified());
    while (action("redoAction")->isEnabled())
        action("redoAction")->trigger();
    QCOMPARE(state(), end);
    form->fileSave();
    QVERIFY(readFile(userFile) != loaded);
    while (action("undoAction")->isEnabled())
        action("undoAction")->trigger();
    form->fileSave();
    QCOMPARE(readFile(userFile), loaded);
}

ZEM_TEST_MAIN(TestMainWindow)
#include "tst_mainwindow.moc"
