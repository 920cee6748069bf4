// Assigning and clearing keys through the key panel, with the conflict check.
#include "formfixture.h"
#include "kkeysequencewidget.h"
#include "modalanswerer.h"
#include "testenvironment.h"

#include <QAction>
#include <QGroupBox>
#include <QPushButton>
#include <QRadioButton>
#include <QTreeWidget>
#include <QtTest>

class TestKeyAssignment : public QObject
{
    Q_OBJECT

private slots:
    void cleanup();

    void assign_data();
    void assign();
    void recordedWithTheKeyboard();
    void currentRowPassedOver();
    void clear_data();
    void clear();
    void panelFollowsSelection_data();
    void panelFollowsSelection();
    void groupRowLeavesPanelAsItWas();

private:
    // Records a combination into the selected row as the key widget reports a finished one.
    void record(const QKeySequence& sequence);
    KKeySequenceWidget* keyWidget() const { return f.form()->findChild<KKeySequenceWidget*>("keyWidget"); }
    QString recordText() const { return keyWidget()->findChild<QPushButton*>("recordButton")->text(); }
    FormFixture f;
};

void TestKeyAssignment::cleanup()
{
    f.reset();
}

void TestKeyAssignment::record(const QKeySequence& sequence)
{
    QTest::mouseClick(f.form()->findChild<QRadioButton*>("customKeyRadio"), Qt::LeftButton);
    QVERIFY(keyWidget()->isRecording());
    keyWidget()->setKeySequence(sequence);
}

void TestKeyAssignment::assign_data()
{
    QTest::addColumn<QByteArray>("userEntries");
    QTest::addColumn<QString>("rowName");
    QTest::addColumn<int>("rowIndex");
    QTest::addColumn<QString>("recorded");
    QTest::addColumn<QString>("conflict"); // the box's text; empty when the key is free
    QTest::addColumn<QStringList>("disabledAfter");

    const QByteArray entries =
        "Alt|F4=ZEMWM_CLOSE\nAlt|F5=ZEMWM_CLOSE\nCtrl|Alt|t=\"xterm -e top\"\nCtrl|q=\"Disable\"\n";
    const QString conflict = QStringLiteral(
        "Ouch! The %1 key combination has already been allocated\nto the %2 action (%3).\n\nPlease choose a "
        "unique key combination.");

    QTest::newRow("free key") << entries << "ZEMWM_LOCK" << 0 << "Ctrl+Alt+L"
                              << "" << QStringList{"Ctrl+Q"};
    QTest::newRow("held by a function row")
        << entries << "ZEMWM_LOCK" << 0 << "Alt+F4"
        << conflict.arg("Alt+F4", "ZEMWM_CLOSE", "close a window (recommend)") << QStringList{"Ctrl+Q"};
    QTest::newRow("held by a command row")
        << entries << "ZEMWM_LOCK" << 0 << "Ctrl+Alt+T"
        << conflict.arg("Ctrl+Alt+T", "command", "xterm -e top") << QStringList{"Ctrl+Q"};
    QTest::newRow("held in other letter case")
        << QByteArray("Ctrl|Alt|x=ZEMWM_KILL\n") << "ZEMWM_LOCK" << 0 << "Ctrl+Alt+X"
        << conflict.arg("Ctrl+Alt+X", "ZEMWM_KILL", "close a window forcely") << QStringList();
    QTest::newRow("the other row of the same function")
        << entries << "ZEMWM_CLOSE" << 1 << "Alt+F4"
        << conflict.arg("Alt+F4", "ZEMWM_CLOSE", "close a window (recommend)") << QStringList{"Ctrl+Q"};
    QTest::newRow("disabled key taken into use again") << entries << "ZEMWM_LOCK" << 0 << "Ctrl+Q"
                                                       << "" << QStringList();
}

void TestKeyAssignment::assign()
{
    QFETCH(QByteArray, userEntries);
    QFETCH(QString, rowName);
    QFETCH(int, rowIndex);
    QFETCH(QString, recorded);
    QFETCH(QString, conflict);
    QFETCH(QStringList, disabledAfter);

    QVERIFY(f.openUserFile(userEntries, QByteArray()));
    // A stored key in other letter case, as a hand-edited file may leave it.
    if (QTreeWidgetItem* kill = f.row("ZEMWM_KILL"); kill && !KeysConfForm::itemKey(kill).isEmpty())
        KeysConfForm::setItemKey(kill, KeysConfForm::itemKey(kill).toLower());
    f.form()->show();
    QVERIFY(QTest::qWaitForWindowExposed(f.form()));
    QTreeWidgetItem* target = f.row(rowName, rowIndex);
    QVERIFY(target);
    f.select(target);
    const QString keyBefore = KeysConfForm::itemKey(target);
    const QString sourceBefore = target->text(3);
    const QStringList othersBefore = f.boundRows();

    ModalAnswerer answerer;
    record(QKeySequence::fromString(recorded, QKeySequence::PortableText));
    QVERIFY(KeysConfForm::isModified()); // counted as an edit whatever follows
    QVERIFY(f.action("fileSaveAction")->isEnabled());

    if (conflict.isEmpty()) {
        QCOMPARE(answerer.count(), 0);
        QCOMPARE(KeysConfForm::itemKey(target), recorded);
        QCOMPARE(target->text(1), QKeySequence(recorded).toString(QKeySequence::NativeText));
        QCOMPARE(target->text(3), QStringLiteral("user"));
    } else {
        QCOMPARE(answerer.count(), 1);
        QCOMPARE(answerer.last().title, QStringLiteral("Whoopsie! Key conflict."));
        QCOMPARE(answerer.last().text, conflict);
        QCOMPARE(answerer.last().parent, f.form());
        QCOMPARE(KeysConfForm::itemKey(target), keyBefore);
        QCOMPARE(target->text(3), sourceBefore);
        QCOMPARE(f.boundRows(), othersBefore);
        // The refused combination stays on the button until another row is shown.
        QCOMPARE(recordText(), QLatin1Char(' ') + QKeySequence(recorded).toString(QKeySequence::NativeText) +
                                   QLatin1Char(' '));
    }
    QCOMPARE(f.form()->disabledKeyList(), disabledAfter);
}

void TestKeyAssignment::recordedWithTheKeyboard()
{
    QVERIFY(f.openUserFile(QByteArray(), QByteArray()));
    f.form()->show();
    QVERIFY(QTest::qWaitForWindowExposed(f.form()));
    QTreeWidgetItem* target = f.row("ZEMWM_LOCK");
    f.select(target);
    QTest::mouseClick(f.form()->findChild<QRadioButton*>("customKeyRadio"), Qt::LeftButton);
    QWidget* button = keyWidget()->findChild<QPushButton*>("recordButton");
    QTest::keyPress(button, Qt::Key_Alt, Qt::NoModifier);
    QTest::keyClick(button, Qt::Key_L, Qt::AltModifier);
    QTest::keyRelease(button, Qt::Key_Alt, Qt::AltModifier);
    QTRY_COMPARE_WITH_TIMEOUT(KeysConfForm::itemKey(target), QStringLiteral("Alt+L"), 3000);
    QVERIFY(KeysConfForm::isModified());
}

void TestKeyAssignment::currentRowPassedOver()
{
    QVERIFY(f.openUserFile("Alt|F4=ZEMWM_CLOSE\n", QByteArray()));
    const QKeySequence altF4(QStringLiteral("Alt+F4"));
    f.select(f.row("ZEMWM_CLOSE"));
    QVERIFY(!f.form()->isKeyPresent(altF4, false));
    f.select(f.row("ZEMWM_LOCK"));
    ModalAnswerer answerer;
    QVERIFY(f.form()->isKeyPresent(altF4, false));
    QVERIFY(f.form()->isKeyPresent(QKeySequence(QStringLiteral("alt+f4")), false));
    QCOMPARE(answerer.count(), 0); // no warning asked for, none shown
    // Disabled keys are no rows and never count.
    QVERIFY(!f.form()->isKeyPresent(QKeySequence(QStringLiteral("Ctrl+Q")), false));
}

void TestKeyAssignment::clear_data()
{
    QTest::addColumn<QString>("rowName");
    QTest::addColumn<QStringList>("disabledAfter");

    QTest::newRow("system row: its key is disabled") << "ZEMWM_CLOSE" << QStringList{"Ctrl+Q", "Alt+F4"};
    QTest::newRow("user row") << "ZEMWM_LOCK" << QStringList{"Ctrl+Q"};
    QTest::newRow("row without key") << "ZEMWM_RESTART" << QStringList{"Ctrl+Q"};
}

void TestKeyAssignment::clear()
{
    QFETCH(QString, rowName);
    QFETCH(QStringList, disabledAfter);

    QVERIFY(
        f.openUserFile("Alt|F5=ZEMWM_LOCK\nCtrl|q=\"Disable\"\n", "Alt|F4=ZEMWM_CLOSE\nCtrl|k=ZEMWM_KILL\n"));
    f.form()->show();
    QVERIFY(QTest::qWaitForWindowExposed(f.form()));
    QTreeWidgetItem* target = f.row(rowName);
    f.select(target);
    QVERIFY(!KeysConfForm::isModified());

    QTest::mouseClick(f.form()->findChild<QRadioButton*>("noKeyRadio"), Qt::LeftButton);
    QVERIFY(KeysConfForm::itemKey(target).isEmpty());
    QVERIFY(target->text(1).isEmpty());
    QCOMPARE(target->text(3), QStringLiteral("user"));
    QCOMPARE(f.form()->disabledKeyList(), disabledAfter);
    QVERIFY(KeysConfForm::isModified());
    QVERIFY(!keyWidget()->isEnabled());
    QVERIFY(keyWidget()->keySequence().isEmpty());
}

void TestKeyAssignment::panelFollowsSelection_data()
{
    QTest::addColumn<QString>("storedKey"); // put into ZEMWM_LOCK's row; "-" leaves it without key
    QTest::addColumn<bool>("assignChecked");
    QTest::addColumn<QString>("shown");

    QTest::newRow("row without key") << "-" << false << " None ";
    QTest::newRow("row with key") << "Ctrl+Alt+L" << true << " Ctrl+Alt+L ";
    QTest::newRow("# key shown verbatim") << "#Ctrl+L" << true << "#Ctrl+L";
    QTest::newRow("dangling plus shown as text") << "Ctrl+" << true << "Ctrl+";
    QTest::newRow("plus key is a key") << "Ctrl++" << true << " Ctrl++ ";
    QTest::newRow("unparsable shown as text") << "Frobnicate" << true << "Frobnicate";
}

void TestKeyAssignment::panelFollowsSelection()
{
    QFETCH(QString, storedKey);
    QFETCH(bool, assignChecked);
    QFETCH(QString, shown);

    QVERIFY(f.openUserFile("Alt|F4=ZEMWM_CLOSE\n", QByteArray()));
    QTreeWidgetItem* target = f.row("ZEMWM_LOCK");
    if (storedKey != "-")
        KeysConfForm::setItemKey(target, storedKey);
    // Start from a row with a key, so that every part of the panel has to change.
    f.select(f.row("ZEMWM_CLOSE"));
    f.select(target);

    QVERIFY(f.form()->findChild<QGroupBox*>("keyGroupBox")->isEnabled());
    QCOMPARE(f.form()->findChild<QRadioButton*>("customKeyRadio")->isChecked(), assignChecked);
    QCOMPARE(f.form()->findChild<QRadioButton*>("noKeyRadio")->isChecked(), !assignChecked);
    QCOMPARE(keyWidget()->isEnabled(), assignChecked);
    QCOMPARE(recordText(), shown);
    // Showing a row is no edit.
    QVERIFY(!KeysConfForm::isModified());
    QVERIFY(!f.action("fileSaveAction")->isEnabled());
}

void TestKeyAssignment::groupRowLeavesPanelAsItWas()
{
    QVERIFY(f.openUserFile("Alt|F4=ZEMWM_CLOSE\n", QByteArray()));
    f.select(f.row("ZEMWM_CLOSE"));
    f.select(f.tree()->topLevelItem(0));
    QVERIFY(!f.form()->findChild<QGroupBox*>("keyGroupBox")->isEnabled());
    QVERIFY(f.form()->findChild<QRadioButton*>("customKeyRadio")->isChecked());
    QCOMPARE(recordText(), QStringLiteral(" Alt+F4 "));
    f.select(KeysConfForm::commandGroup());
    QVERIFY(!f.form()->findChild<QGroupBox*>("keyGroupBox")->isEnabled());
    f.tree()->clearSelection();
    QVERIFY(!f.form()->findChild<QGroupBox*>("keyGroupBox")->isEnabled());
}

ZEM_TEST_MAIN(TestKeyAssignment)
#include "tst_keyassignment.moc"
