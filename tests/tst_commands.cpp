// Command entries: adding, editing, cloning and deleting rows, and cloning function rows.
#include "formfixture.h"
#include "kkeysequencewidget.h"
#include "modalanswerer.h"
#include "testenvironment.h"

#include <QAction>
#include <QGroupBox>
#include <QLineEdit>
#include <QRadioButton>
#include <QTreeWidget>
#include <QtTest>

Q_DECLARE_METATYPE(QMessageBox::StandardButton)

namespace {

// Answers the command selection dialog: types the text (null: cancels) and records what it
// was preset with.
struct CommandAnswer
{
    explicit CommandAnswer(QString typed = QString()) : typed(std::move(typed)) {}

    QString typed;
    QString presetWith;
    int shown = 0;

    void operator()(QDialog* dialog)
    {
        ++shown;
        auto* edit = dialog->findChild<QLineEdit*>("commandLineEdit");
        presetWith = edit->text();
        if (typed.isNull()) {
            dialog->reject();
            return;
        }
        edit->setText(typed);
        dialog->accept();
    }
};

} // namespace

class TestCommands : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void newCommand();
    void newCommandCancelledOrEmpty_data();
    void newCommandCancelledOrEmpty();
    void editKeepsKeyAndPlace();
    void editWithoutChange_data();
    void editWithoutChange();
    void doubleClickAndReturn_data();
    void doubleClickAndReturn();
    void cloneCommandRow();
    void cloneFunctionRow();
    void deleteRows_data();
    void deleteRows();
    void newCommandWithKeySavedAndRead();

private:
    QString enabledCommandActions() const;
    FormFixture f;
    QTemporaryDir scratch;
};

void TestCommands::init()
{
    QVERIFY(f.openUserFile("Ctrl|Alt|t=\"xterm -e top\"\nAlt|F5=ZEMWM_LOCK\n",
                           "Ctrl|Alt|c=\"xclock\"\nAlt|F4=ZEMWM_CLOSE\n"));
    f.form()->show();
    f.form()->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(f.form()));
}

void TestCommands::cleanup()
{
    f.reset();
}

QString TestCommands::enabledCommandActions() const
{
    QString seen;
    const char* names[] = {"newCommandAction", "editCommandAction", "deleteCommandAction",
                           "cloneCommandAction"};
    for (int i = 0; i < 4; ++i)
        seen += f.action(names[i])->isEnabled() ? QChar("NEDC"[i]) : QChar('-');
    return seen;
}

void TestCommands::newCommand()
{
    f.select(KeysConfForm::commandGroup());
    KeysConfForm::commandGroup()->setExpanded(false);
    CommandAnswer answer{QStringLiteral("xeyes -fg red")};
    ModalAnswerer answerer;
    answerer.onOtherDialog(std::ref(answer));
    f.action("newCommandAction")->trigger();

    QCOMPARE(answer.shown, 1);
    QCOMPARE(answer.presetWith, QString());
    QTreeWidgetItem* commands = KeysConfForm::commandGroup();
    QTreeWidgetItem* added = commands->child(commands->childCount() - 1);
    QCOMPARE(added->text(0), QStringLiteral("xeyes -fg red"));
    QCOMPARE(added->text(2), QStringLiteral("ExecCommand"));
    QCOMPARE(added->text(3), QStringLiteral("user"));
    QVERIFY(KeysConfForm::itemKey(added).isEmpty());
    QCOMPARE(f.tree()->currentItem(), added);
    QVERIFY(added->isSelected());
    QVERIFY(commands->isExpanded());
    QVERIFY(f.form()->findChild<QGroupBox*>("keyGroupBox")->isEnabled());
    QVERIFY(f.form()->findChild<QRadioButton*>("noKeyRadio")->isChecked());
    QVERIFY(!f.form()->findChild<KKeySequenceWidget*>("keyWidget")->isEnabled());
    QCOMPARE(enabledCommandActions(), QStringLiteral("NEDC"));
    QVERIFY(KeysConfForm::isModified());
    QVERIFY(f.action("fileSaveAction")->isEnabled() && f.action("fileApplyAction")->isEnabled());
}

void TestCommands::newCommandCancelledOrEmpty_data()
{
    QTest::addColumn<QString>("typed");
    QTest::newRow("cancelled") << QString();
    QTest::newRow("empty command line") << QStringLiteral("   ");
}

void TestCommands::newCommandCancelledOrEmpty()
{
    QFETCH(QString, typed);
    f.select(KeysConfForm::commandGroup());
    const int before = KeysConfForm::commandGroup()->childCount();
    CommandAnswer answer{typed};
    ModalAnswerer answerer;
    answerer.onOtherDialog(std::ref(answer));
    f.form()->newCommand();
    QCOMPARE(answer.shown, 1);
    QCOMPARE(KeysConfForm::commandGroup()->childCount(), before);
    QVERIFY(!KeysConfForm::isModified());
    QVERIFY(!f.form()->findChild<QGroupBox*>("keyGroupBox")->isEnabled());
}

void TestCommands::editKeepsKeyAndPlace()
{
    QTreeWidgetItem* row = f.row("cmd:xclock");
    QVERIFY(row);
    const int place = KeysConfForm::commandGroup()->indexOfChild(row);
    f.select(row);
    CommandAnswer answer{QStringLiteral("xclock -digital")};
    ModalAnswerer answerer;
    answerer.onOtherDialog(std::ref(answer));
    f.action("editCommandAction")->trigger();

    QCOMPARE(answer.presetWith, QStringLiteral("xclock"));
    QCOMPARE(row->text(0), QStringLiteral("xclock -digital"));
    QCOMPARE(KeysConfForm::itemKey(row), QStringLiteral("Ctrl+Alt+C"));
    QCOMPARE(row->text(3), QStringLiteral("user")); // was the system's
    QCOMPARE(KeysConfForm::commandGroup()->indexOfChild(row), place);
    QVERIFY(KeysConfForm::isModified());
}

void TestCommands::editWithoutChange_data()
{
    QTest::addColumn<QString>("typed");
    QTest::newRow("unchanged") << QStringLiteral("xterm -e top");
    QTest::newRow("only white space changed") << QStringLiteral("  xterm   -e top ");
    QTest::newRow("emptied") << QStringLiteral("");
    QTest::newRow("cancelled") << QString();
}

void TestCommands::editWithoutChange()
{
    QFETCH(QString, typed);
    QTreeWidgetItem* row = f.row("cmd:xterm -e top");
    f.select(row);
    CommandAnswer answer{typed};
    ModalAnswerer answerer;
    answerer.onOtherDialog(std::ref(answer));
    f.form()->editCommand();
    QCOMPARE(answer.shown, 1);
    QCOMPARE(row->text(0), QStringLiteral("xterm -e top"));
    QVERIFY(!KeysConfForm::isModified());
}

void TestCommands::doubleClickAndReturn_data()
{
    QTest::addColumn<QString>("rowName");
    QTest::addColumn<QString>("how");
    QTest::addColumn<bool>("opens");

    for (const char* how : {"double-click column 0", "double-click column 3", "Return"}) {
        QTest::addRow("command row, %s", how) << "cmd:xterm -e top" << how << true;
        QTest::addRow("function row, %s", how) << "ZEMWM_LOCK" << how << false;
    }
}

void TestCommands::doubleClickAndReturn()
{
    QFETCH(QString, rowName);
    QFETCH(QString, how);
    QFETCH(bool, opens);

    QTreeWidgetItem* row = f.row(rowName);
    f.tree()->scrollToItem(row);
    f.select(row);
    CommandAnswer answer; // cancels
    ModalAnswerer answerer;
    answerer.onOtherDialog(std::ref(answer));
    QWidget* viewport = f.tree()->viewport();
    if (how == "Return") {
        f.tree()->setFocus();
        QTest::keyClick(f.tree(), Qt::Key_Return);
    } else {
        const int column = how.endsWith('0') ? 0 : 3;
        f.tree()->showColumn(column);
        const QRect rect = f.tree()->visualItemRect(row);
        const QPoint at(f.tree()->columnViewportPosition(column) + f.tree()->columnWidth(column) / 2,
                        rect.center().y());
        // QTest's double click on a widget is the second click alone; the first comes before it.
        QTest::mouseClick(viewport, Qt::LeftButton, Qt::NoModifier, at);
        QTest::mouseDClick(viewport, Qt::LeftButton, Qt::NoModifier, at);
    }
    QCOMPARE(answer.shown, opens ? 1 : 0);
    if (opens)
        QCOMPARE(answer.presetWith, QStringLiteral("xterm -e top"));
}

void TestCommands::cloneCommandRow()
{
    QTreeWidgetItem* row = f.row("cmd:xterm -e top");
    f.select(row);
    f.action("cloneCommandAction")->trigger();
    QTreeWidgetItem* commands = KeysConfForm::commandGroup();
    QTreeWidgetItem* clone = commands->child(commands->indexOfChild(row) + 1);
    QCOMPARE(clone->text(0), QStringLiteral("xterm -e top"));
    QCOMPARE(clone->text(2), QStringLiteral("ExecCommand"));
    QCOMPARE(clone->text(3), QStringLiteral("user"));
    QVERIFY(KeysConfForm::itemKey(clone).isEmpty());
    QCOMPARE(f.tree()->currentItem(), clone);
    QVERIFY(f.form()->findChild<QRadioButton*>("noKeyRadio")->isChecked());
    QCOMPARE(enabledCommandActions(), QStringLiteral("NEDC"));
    QVERIFY(KeysConfForm::isModified());
}

void TestCommands::cloneFunctionRow()
{
    QTreeWidgetItem* lock = f.row("ZEMWM_LOCK");
    f.select(lock);
    QCOMPARE(enabledCommandActions(), QStringLiteral("---C"));
    f.action("cloneCommandAction")->trigger();

    QTreeWidgetItem* clone = f.row("ZEMWM_LOCK", 1);
    QVERIFY(clone);
    QCOMPARE(clone->parent()->indexOfChild(clone), lock->parent()->indexOfChild(lock) + 1);
    QCOMPARE(clone->text(0), lock->text(0));
    QCOMPARE(clone->text(3), QStringLiteral("user"));
    QVERIFY(KeysConfForm::itemKey(clone).isEmpty());
    QCOMPARE(f.tree()->currentItem(), clone);
    QCOMPARE(enabledCommandActions(), QStringLiteral("--DC"));
    f.select(lock);
    QCOMPARE(enabledCommandActions(), QStringLiteral("--DC"));

    // Once one of the two is deleted, the other may not be.
    ModalAnswerer answerer({QMessageBox::Yes});
    f.select(clone);
    f.action("deleteCommandAction")->trigger();
    QCOMPARE(f.row("ZEMWM_LOCK", 1), nullptr);
    f.select(lock);
    QCOMPARE(enabledCommandActions(), QStringLiteral("---C"));
}

void TestCommands::deleteRows_data()
{
    QTest::addColumn<QString>("rowName");
    QTest::addColumn<QMessageBox::StandardButton>("answer");
    QTest::addColumn<QStringList>("disabledAfter");

    QTest::newRow("user command row") << "cmd:xterm -e top" << QMessageBox::Yes << QStringList();
    QTest::newRow("system command row") << "cmd:xclock" << QMessageBox::Yes << QStringList{"Ctrl+Alt+C"};
    QTest::newRow("No keeps the row") << "cmd:xclock" << QMessageBox::No << QStringList();
}

void TestCommands::deleteRows()
{
    QFETCH(QString, rowName);
    QFETCH(QMessageBox::StandardButton, answer);
    QFETCH(QStringList, disabledAfter);

    f.select(f.row(rowName));
    ModalAnswerer answerer({answer});
    QTest::keyClick(f.tree(), Qt::Key_Delete);
    QCOMPARE(answerer.titles(), QStringList{"Delete"});
    QCOMPARE(answerer.last().text, QStringLiteral("Are you sure to delete this action?"));
    QCOMPARE(answerer.last().buttons, QMessageBox::Yes | QMessageBox::No);
    QCOMPARE(answerer.last().defaultButton, QMessageBox::No);
    QCOMPARE(f.form()->disabledKeyList(), disabledAfter);
    if (answer != QMessageBox::Yes) {
        QVERIFY(f.row(rowName));
        QVERIFY(!KeysConfForm::isModified());
        return;
    }
    QCOMPARE(f.row(rowName), nullptr);
    QCOMPARE(f.tree()->currentItem(), KeysConfForm::commandGroup());
    QVERIFY(KeysConfForm::commandGroup()->isSelected());
    QVERIFY(!f.form()->findChild<QGroupBox*>("keyGroupBox")->isEnabled());
    QCOMPARE(enabledCommandActions(), QStringLiteral("N---"));
    QVERIFY(KeysConfForm::isModified());
}

void TestCommands::newCommandWithKeySavedAndRead()
{
    f.select(KeysConfForm::commandGroup());
    CommandAnswer answer{QStringLiteral("xmessage \"hello world\"")};
    ModalAnswerer answerer;
    answerer.onOtherDialog(std::ref(answer));
    f.form()->newCommand();
    f.form()->setKey(QKeySequence(QStringLiteral("Ctrl+Alt+M")));
    f.form()->fileSave();
    QVERIFY(readFile(FormFixture::userPath()).contains("Ctrl|Alt|m=\"xmessage \"hello world\"\"\n"));

    QVERIFY(f.form()->loadFile(FormFixture::userPath()));
    QTreeWidgetItem* row = f.row("cmd:xmessage \"hello world\"");
    QVERIFY(row);
    QCOMPARE(KeysConfForm::itemKey(row), QStringLiteral("Ctrl+Alt+M"));
    QCOMPARE(row->text(3), QStringLiteral("user"));
}

ZEM_TEST_MAIN(TestCommands)
#include "tst_commands.moc"
