// The key recorder, driven by key events as a keyboard would drive it, on a real X server
// (it grabs the keyboard while recording).
#include "kkeysequencewidget.h"
#include "modalanswerer.h"
#include "testenvironment.h"

#include <QAction>
#include <QElapsedTimer>
#include <QLineEdit>
#include <QPushButton>
#include <QToolButton>
#include <QVBoxLayout>
#include <QtTest>

Q_DECLARE_METATYPE(QKeySequence)

class TestKeyWidget : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void buttonTexts_data();
    void buttonTexts();
    void recordedSequence_data();
    void recordedSequence();
    void altGrRecordsNothing();
    void launch1WhileIdleStartsNothing();
    void returnOrSpaceStartsRecording_data();
    void returnOrSpaceStartsRecording();
    void fourthKeyEndsRecording();
    void singleKeyWhenMultiKeyNotAllowed();
    void releaseTimerEndsRecording();
    void heldModifierKeepsRecording();
    void unsupportedKey_data();
    void unsupportedKey();
    void emittedSignals_data();
    void emittedSignals();
    void receiverChangesSequenceFromSignal();
    void recordingOwnsTheKeyboard();
    void clearButton();
    void properties();

private:
    // Runs one step of a scenario:
    //   "click"            click the record button
    //   "press Ctrl"       press a modifier key (Ctrl, Alt, Shift, Meta, Super_L, Super_R)
    //   "release Ctrl"     release it
    //   "key Ctrl+A"       press and release a key, with the held modifiers and those named
    //   "set Ctrl+T"       setKeySequence;  "clear": clearKeySequence
    void run(const QStringList& steps);
    void sendKey(QEvent::Type type, int key, Qt::KeyboardModifiers modifiers);
    QString recordText() const { return button->text(); }

    std::unique_ptr<QWidget> window;
    KKeySequenceWidget* widget = nullptr;
    QPushButton* button = nullptr;
    QLineEdit* neighbour = nullptr;
    Qt::KeyboardModifiers held;
};

namespace {

const QHash<QString, QPair<int, Qt::KeyboardModifier>> modifierKeys = {
    {"Ctrl", {Qt::Key_Control, Qt::ControlModifier}}, {"Alt", {Qt::Key_Alt, Qt::AltModifier}},
    {"Shift", {Qt::Key_Shift, Qt::ShiftModifier}},    {"Meta", {Qt::Key_Meta, Qt::MetaModifier}},
    {"Super_L", {Qt::Key_Super_L, Qt::MetaModifier}}, {"Super_R", {Qt::Key_Super_R, Qt::MetaModifier}},
};

QKeySequence portable(const QString& text)
{
    return QKeySequence::fromString(text, QKeySequence::PortableText);
}

} // namespace

void TestKeyWidget::init()
{
    window = std::make_unique<QWidget>();
    auto* layout = new QVBoxLayout(window.get());
    widget = new KKeySequenceWidget(window.get());
    neighbour = new QLineEdit(window.get());
    layout->addWidget(widget);
    layout->addWidget(neighbour);
    button = widget->findChild<QPushButton*>(QStringLiteral("recordButton"));
    QVERIFY(button);
    window->show();
    window->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(window.get()));
    held = Qt::NoModifier;
}

void TestKeyWidget::cleanup()
{
    window.reset();
}

void TestKeyWidget::sendKey(QEvent::Type type, int key, Qt::KeyboardModifiers modifiers)
{
    QKeyEvent event(type, key, modifiers);
    QApplication::sendEvent(button, &event);
}

void TestKeyWidget::run(const QStringList& steps)
{
    for (const QString& step : steps) {
        const QString verb = step.section(QLatin1Char(' '), 0, 0);
        const QString argument = step.section(QLatin1Char(' '), 1);
        if (verb == QLatin1String("click")) {
            QTest::mouseClick(button, Qt::LeftButton);
        } else if (verb == QLatin1String("press") || verb == QLatin1String("release")) {
            QVERIFY2(modifierKeys.contains(argument), qPrintable(step));
            const auto [key, modifier] = modifierKeys.value(argument);
            // As X11 reports them: a modifier key's own event carries the state from before it
            // (QKeyEvent corrects that for Shift, Control, Alt and Meta, not for Super).
            if (verb == QLatin1String("press")) {
                sendKey(QEvent::KeyPress, key, held);
                held |= modifier;
            } else {
                sendKey(QEvent::KeyRelease, key, held);
                held &= ~Qt::KeyboardModifiers(modifier);
            }
        } else if (verb == QLatin1String("key")) {
            const QKeySequence sequence = portable(argument);
            QVERIFY2(sequence.count() == 1, qPrintable(step));
            const int combined = sequence[0];
            const int key = combined & ~int(Qt::KeyboardModifierMask);
            const auto extra = Qt::KeyboardModifiers(combined & int(Qt::KeyboardModifierMask));
            sendKey(QEvent::KeyPress, key, held | extra);
            sendKey(QEvent::KeyRelease, key, held | extra);
            // The modifiers named with the key are let go again, one release for all of them.
            const auto named = extra & ~(held | Qt::KeypadModifier);
            if (named != Qt::NoModifier)
                sendKey(QEvent::KeyRelease, Qt::Key_Shift, held | Qt::ShiftModifier);
        } else if (verb == QLatin1String("set")) {
            widget->setKeySequence(portable(argument), KKeySequenceWidget::NoValidate);
        } else if (verb == QLatin1String("clear")) {
            widget->clearKeySequence();
        } else {
            QFAIL(qPrintable(QStringLiteral("unknown step ") + step));
        }
    }
}

void TestKeyWidget::buttonTexts_data()
{
    QTest::addColumn<QStringList>("steps");
    QTest::addColumn<QString>("text");

    QTest::newRow("idle, empty") << QStringList() << " None ";
    QTest::newRow("recording, nothing yet") << QStringList{"click"} << " Input ... ";
    QTest::newRow("modifiers held before a key")
        << QStringList{"click", "press Shift", "press Alt", "press Ctrl"} << " Ctrl+Alt+Shift+ ... ";
    QTest::newRow("meta named first")
        << QStringList{"click", "press Ctrl", "press Meta"} << " Meta+Ctrl+ ... ";
    QTest::newRow("super held counts as meta") << QStringList{"click", "press Super_L"} << " Meta+ ... ";
    QTest::newRow("modifier held after a key")
        << QStringList{"click", "press Ctrl", "key A", "press Alt"} << " Ctrl+A,Ctrl+Alt+ ... ";
    QTest::newRow("key recorded, nothing held") << QStringList{"click", "key F2"} << " F2 ... ";
    QTest::newRow("modifier pressed then released before any key")
        << QStringList{"click", "press Ctrl", "release Ctrl"} << " Input ... ";
    QTest::newRow("recorded sequence") << QStringList{"set Ctrl+Alt+T"} << " Ctrl+Alt+T ";
    QTest::newRow("multi-key sequence") << QStringList{"set Ctrl+A, B"} << " Ctrl+A, B ";
    QTest::newRow("ampersand shown literally") << QStringList{"set Ctrl+&"} << " Ctrl+&& ";
    QTest::newRow("cleared") << QStringList{"set F5", "clear"} << " None ";
}

void TestKeyWidget::buttonTexts()
{
    QFETCH(QStringList, steps);
    QFETCH(QString, text);
    run(steps);
    QCOMPARE(recordText(), text);
}

void TestKeyWidget::recordedSequence_data()
{
    QTest::addColumn<QStringList>("steps");
    QTest::addColumn<QString>("sequence"); // portable text once the recording ended; empty: nothing

    // First keys that make no sense alone are passed over; the recording goes on.
    QTest::newRow("letter alone ignored") << QStringList{"key A"} << "";
    QTest::newRow("shift+letter ignored") << QStringList{"key Shift+A"} << "";
    QTest::newRow("digit ignored") << QStringList{"key 5"} << "";
    QTest::newRow("punctuation ignored") << QStringList{"key ,"} << "";
    QTest::newRow("tab ignored") << QStringList{"key Tab"} << "";
    QTest::newRow("shift+backtab ignored") << QStringList{"key Shift+Backtab"} << "";
    QTest::newRow("backspace ignored") << QStringList{"key Backspace"} << "";
    QTest::newRow("return ignored") << QStringList{"key Return"} << "";
    QTest::newRow("delete ignored") << QStringList{"key Del"} << "";
    QTest::newRow("space ignored") << QStringList{"key Space"} << "";
    // With Control, Alt, Meta or from the keypad they are recorded.
    QTest::newRow("ctrl+letter") << QStringList{"key Ctrl+A"} << "Ctrl+A";
    QTest::newRow("alt+tab") << QStringList{"key Alt+Tab"} << "Alt+Tab";
    QTest::newRow("meta+space") << QStringList{"key Meta+Space"} << "Meta+Space";
    QTest::newRow("keypad digit") << QStringList{"key Num+1"} << "Num+1";
    QTest::newRow("ctrl+delete") << QStringList{"key Ctrl+Del"} << "Ctrl+Del";
    // Keys allowed alone.
    QTest::newRow("function key alone") << QStringList{"key F5"} << "F5";
    QTest::newRow("escape alone") << QStringList{"key Esc"} << "Esc";
    QTest::newRow("print alone") << QStringList{"key Print"} << "Print";
    QTest::newRow("launch1 becomes calculator") << QStringList{"key Launch (1)"} << "Calculator";
    // Shift stays only with keys that allow it.
    QTest::newRow("shift kept with function key") << QStringList{"key Shift+F5"} << "Shift+F5";
    QTest::newRow("shift kept with letter") << QStringList{"key Ctrl+Shift+A"} << "Ctrl+Shift+A";
    QTest::newRow("shift dropped with digit") << QStringList{"key Ctrl+Shift+5"} << "Ctrl+5";
    QTest::newRow("shift dropped with percent") << QStringList{"key Ctrl+Shift+%"} << "Ctrl+%";
    QTest::newRow("backtab with shift is shift+tab")
        << QStringList{"key Ctrl+Shift+Backtab"} << "Ctrl+Shift+Tab";
    QTest::newRow("super_l held gives meta")
        << QStringList{"press Super_L", "key A", "release Super_L"} << "Meta+A";
    QTest::newRow("super_r held gives meta")
        << QStringList{"press Super_R", "key F3", "release Super_R"} << "Meta+F3";
    // Only the first key is tested.
    QTest::newRow("later keys never tested")
        << QStringList{"key Ctrl+A", "key B", "key Space"} << "Ctrl+A, B, Space";
    QTest::newRow("ignored first key then a real one") << QStringList{"key A", "key Alt+A"} << "Alt+A";
}

void TestKeyWidget::recordedSequence()
{
    QFETCH(QStringList, steps);
    QFETCH(QString, sequence);

    QSignalSpy changed(widget, &KKeySequenceWidget::keySequenceChanged);
    run(QStringList{"click"} + steps);
    if (sequence.isEmpty()) {
        QVERIFY(widget->isRecording());
        QCOMPARE(recordText(), QStringLiteral(" Input ... "));
        QCOMPARE(changed.count(), 0);
        return;
    }
    QTRY_VERIFY_WITH_TIMEOUT(!widget->isRecording(), 3000);
    QCOMPARE(changed.count(), 1);
    QCOMPARE(changed.first().first().value<QKeySequence>(), portable(sequence));
    QCOMPARE(widget->keySequence(), portable(sequence));
}

void TestKeyWidget::altGrRecordsNothing()
{
    run({"click", "key Ctrl+A"});
    const QString before = recordText();
    sendKey(QEvent::KeyPress, Qt::Key_AltGr, Qt::NoModifier);
    QCOMPARE(recordText(), before);
    QCOMPARE(widget->keySequence(), portable("Ctrl+A"));
}

void TestKeyWidget::launch1WhileIdleStartsNothing()
{
    sendKey(QEvent::KeyPress, Qt::Key_Launch1, Qt::NoModifier);
    QVERIFY(!widget->isRecording());
    QCOMPARE(recordText(), QStringLiteral(" None "));
}

void TestKeyWidget::returnOrSpaceStartsRecording_data()
{
    QTest::addColumn<int>("key");
    QTest::newRow("return") << int(Qt::Key_Return);
    QTest::newRow("space") << int(Qt::Key_Space);
}

void TestKeyWidget::returnOrSpaceStartsRecording()
{
    QFETCH(int, key);
    button->setFocus();
    QTest::keyClick(button, Qt::Key(key));
    QVERIFY(widget->isRecording());
    QCOMPARE(recordText(), QStringLiteral(" Input ... "));
    // Any other key on the idle button starts nothing.
    widget->clearKeySequence();
    QTest::keyClick(button, Qt::Key_F5);
    QVERIFY(!widget->isRecording());
}

void TestKeyWidget::fourthKeyEndsRecording()
{
    QSignalSpy changed(widget, &KKeySequenceWidget::keySequenceChanged);
    run({"click", "key Ctrl+A", "key B", "key C"});
    QVERIFY(widget->isRecording());
    run({"key D"});
    QVERIFY(!widget->isRecording());
    QCOMPARE(changed.count(), 1);
    QCOMPARE(widget->keySequence(), portable("Ctrl+A, B, C, D"));
    QCOMPARE(recordText(), QStringLiteral(" Ctrl+A, B, C, D "));
}

void TestKeyWidget::singleKeyWhenMultiKeyNotAllowed()
{
    widget->setMultiKeyShortcutsAllowed(false);
    run({"click", "press Ctrl", "key A"});
    QVERIFY(!widget->isRecording());
    QCOMPARE(widget->keySequence(), portable("Ctrl+A"));
}

void TestKeyWidget::releaseTimerEndsRecording()
{
    QSignalSpy changed(widget, &KKeySequenceWidget::keySequenceChanged);
    QElapsedTimer clock;
    run({"click", "key F2"});
    clock.start();
    QVERIFY(widget->isRecording());
    QTRY_VERIFY_WITH_TIMEOUT(!widget->isRecording(), 3000);
    QVERIFY2(clock.elapsed() >= 550, qPrintable(QString::number(clock.elapsed())));
    QCOMPARE(changed.count(), 1);
    QCOMPARE(recordText(), QStringLiteral(" F2 "));
}

void TestKeyWidget::heldModifierKeepsRecording()
{
    run({"click", "press Ctrl", "release Ctrl", "press Ctrl", "key A"});
    // Neither modifiers alone nor a key with a modifier still held end it.
    QTest::qWait(900);
    QVERIFY(widget->isRecording());
    QElapsedTimer clock;
    run({"release Ctrl"});
    clock.start();
    QTRY_VERIFY_WITH_TIMEOUT(!widget->isRecording(), 3000);
    QVERIFY2(clock.elapsed() >= 550, qPrintable(QString::number(clock.elapsed())));
    QCOMPARE(widget->keySequence(), portable("Ctrl+A"));
}

void TestKeyWidget::unsupportedKey_data()
{
    QTest::addColumn<QStringList>("before");
    QTest::addColumn<QString>("after"); // the sequence once the box is closed

    QTest::newRow("while recording") << QStringList{"set Ctrl+T", "click", "key Ctrl+A"} << "Ctrl+T";
    QTest::newRow("idle goes back to the sequence before the last change")
        << QStringList{"set Ctrl+T", "set Ctrl+U"} << "Ctrl+T";
}

void TestKeyWidget::unsupportedKey()
{
    QFETCH(QStringList, before);
    QFETCH(QString, after);
    run(before);

    ModalAnswerer answerer;
    QSignalSpy changed(widget, &KKeySequenceWidget::keySequenceChanged);
    sendKey(QEvent::KeyPress, -1, Qt::NoModifier);

    QCOMPARE(answerer.count(), 1);
    QCOMPARE(answerer.last().title, QStringLiteral("Unsupported Key"));
    QCOMPARE(answerer.last().text, QStringLiteral("The key you just pressed is not supported by Qt."));
    QCOMPARE(answerer.last().parent, button);
    QCOMPARE(answerer.last().buttons, QMessageBox::StandardButtons(QMessageBox::Ok));
    QVERIFY(!widget->isRecording());
    QCOMPARE(widget->keySequence(), portable(after));
    QCOMPARE(changed.count(), 0);
}

void TestKeyWidget::emittedSignals_data()
{
    QTest::addColumn<QStringList>("before");
    QTest::addColumn<QStringList>("steps");
    QTest::addColumn<QStringList>("emitted"); // portable texts, in order

    QTest::newRow("same sequence recorded again")
        << QStringList{"set Ctrl+T"} << QStringList{"click", "key Ctrl+T"} << QStringList();
    QTest::newRow("clear on empty") << QStringList() << QStringList{"clear"} << QStringList();
    QTest::newRow("clear on non-empty, idle")
        << QStringList{"set F5"} << QStringList{"clear"} << QStringList{""};
    QTest::newRow("set while idle") << QStringList() << QStringList{"set Alt+F4"} << QStringList{"Alt+F4"};
    QTest::newRow("set the same while idle")
        << QStringList{"set Alt+F4"} << QStringList{"set Alt+F4"} << QStringList();
    QTest::newRow("set during recording, compared with the sequence before it")
        << QStringList{"set Ctrl+T"} << QStringList{"click", "key Ctrl+A", "set Ctrl+T"} << QStringList();
    QTest::newRow("set another during recording")
        << QStringList{"set Ctrl+T"} << QStringList{"click", "set Ctrl+X"} << QStringList{"Ctrl+X"};
    QTest::newRow("recording started over")
        << QStringList{"set Ctrl+T"} << QStringList{"click", "key Ctrl+A", "click", "set Ctrl+A"}
        << QStringList();
}

void TestKeyWidget::emittedSignals()
{
    QFETCH(QStringList, before);
    QFETCH(QStringList, steps);
    QFETCH(QStringList, emitted);
    run(before);
    QSignalSpy changed(widget, &KKeySequenceWidget::keySequenceChanged);
    run(steps);
    QTRY_VERIFY_WITH_TIMEOUT(!widget->isRecording(), 3000);
    QStringList seen;
    for (const QList<QVariant>& arguments : changed)
        seen << arguments.first().value<QKeySequence>().toString(QKeySequence::PortableText);
    QCOMPARE(seen, emitted);
}

void TestKeyWidget::receiverChangesSequenceFromSignal()
{
    QSignalSpy changed(widget, &KKeySequenceWidget::keySequenceChanged);
    bool refused = false;
    connect(widget, &KKeySequenceWidget::keySequenceChanged, this, [&](const QKeySequence& seq) {
        // A receiver refusing the combination clears it at once.
        if (!refused && !seq.isEmpty()) {
            refused = true;
            widget->clearKeySequence();
        }
    });
    run({"click", "key Ctrl+A"});
    QTRY_VERIFY_WITH_TIMEOUT(!widget->isRecording(), 3000);
    QCOMPARE(changed.count(), 2);
    QVERIFY(widget->keySequence().isEmpty());
    QCOMPARE(recordText(), QStringLiteral(" None "));
}

void TestKeyWidget::recordingOwnsTheKeyboard()
{
    auto* save = new QAction(window.get());
    save->setShortcut(portable("Ctrl+S"));
    window->addAction(save);
    QSignalSpy fired(save, &QAction::triggered);

    button->setFocus();
    QTest::mouseClick(button, Qt::LeftButton);
    QCOMPARE(QWidget::keyboardGrabber(), button);
    QVERIFY(button->isDown());

    QTest::keyClick(button, Qt::Key_Tab); // ignored as a first key, and must not move the focus
    QCOMPARE(QApplication::focusWidget(), button);
    QTest::keyClick(button, Qt::Key_S, Qt::ControlModifier);
    QCOMPARE(fired.count(), 0);
    QTest::keyClick(button, Qt::Key_Tab); // a later key is recorded
    QCOMPARE(QApplication::focusWidget(), button);
    QTRY_VERIFY_WITH_TIMEOUT(!widget->isRecording(), 3000);
    QCOMPARE(widget->keySequence(), portable("Ctrl+S, Tab"));
    QCOMPARE(QWidget::keyboardGrabber(), nullptr);
    QVERIFY(!button->isDown());

    // Once idle the shortcut works again.
    QTest::keyClick(neighbour, Qt::Key_S, Qt::ControlModifier);
    QCOMPARE(fired.count(), 1);
}

void TestKeyWidget::clearButton()
{
    run({"set Ctrl+T"});
    QSignalSpy changed(widget, &KKeySequenceWidget::keySequenceChanged);
    auto* clear = widget->findChild<QToolButton*>(QStringLiteral("clearSequenceButton"));
    QVERIFY(clear);
    QVERIFY(clear->text().isEmpty());
    QTest::mouseClick(clear, Qt::LeftButton);
    QCOMPARE(changed.count(), 1);
    QVERIFY(widget->keySequence().isEmpty());
    QCOMPARE(recordText(), QStringLiteral(" None "));
}

void TestKeyWidget::properties()
{
    QCOMPARE(widget->property("multiKeyShortcutsAllowed").toBool(), true);
    QVERIFY(widget->setProperty("multiKeyShortcutsAllowed", false));
    QCOMPARE(widget->multiKeyShortcutsAllowed(), false);

    QCOMPARE(int(widget->checkForConflictsAgainst()), 1);
    widget->setCheckForConflictsAgainst(KKeySequenceWidget::StandardKeys);
    QCOMPARE(widget->property("checkForConflictsAgainst").toInt(), int(KKeySequenceWidget::StandardKeys));

    widget->showKeyText(QStringLiteral("#weird"));
    QCOMPARE(recordText(), QStringLiteral("#weird"));
    QVERIFY(widget->keySequence().isEmpty());
}

ZEM_TEST_MAIN(TestKeyWidget)
#include "tst_keywidget.moc"
