// The key recorder, driven by key events as a keyboard would drive it, on a real X server
// (it grabs the keyboard while recording).
#include "kkeysequencewidget.h"
#include "kkeysequencewidget_p.h"
#include "testenvironment.h"

#include <QAction>
#include <QElapsedTimer>
#include <QLineEdit>
#include <QPushButton>
#include <QVBoxLayout>
#include <QtTest>

Q_DECLARE_METATYPE(QKeySequence)

class TestKeyWidget : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void recordedSequence_data();
    void recordedSequence();
    void releaseDelay();
    void recordingOwnsTheKeyboard();
    void recordingEndsElsewhere_data();
    void recordingEndsElsewhere();

private:
    // Runs one step of a scenario:
    //   "click"            click the record button
    //   "press Ctrl"       press a modifier key (Ctrl, Alt, Shift, Meta, Super_L, Super_R)
    //   "release Ctrl"     release it
    //   "key Ctrl+A"       press and release a key, with the held modifiers and those named
    void run(const QStringList& steps);
    void sendKey(QEvent::Type type, int key, Qt::KeyboardModifiers modifiers);

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
    // A short wait after the last key keeps the suite fast; releaseDelay() measures it.
    KKeySequenceWidgetPrivate::releaseDelayMs = 60;
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
        } else {
            QFAIL(qPrintable(QStringLiteral("unknown step ") + step));
        }
    }
}

void TestKeyWidget::recordedSequence_data()
{
    QTest::addColumn<QStringList>("steps");
    QTest::addColumn<QString>("sequence"); // portable text once the recording ended; empty: nothing

    // First keys that make no sense alone are passed over; the recording goes on.
    QTest::newRow("letter alone ignored") << QStringList{"key A"} << "";
    QTest::newRow("shift+letter ignored") << QStringList{"key Shift+A"} << "";
    QTest::newRow("tab, return, space ignored") << QStringList{"key Tab", "key Return", "key Space"} << "";
    QTest::newRow("ctrl+letter") << QStringList{"key Ctrl+A"} << "Ctrl+A";
    QTest::newRow("keypad digit") << QStringList{"key Num+1"} << "Num+1";
    QTest::newRow("function key alone") << QStringList{"key F5"} << "F5";
    QTest::newRow("launch1 becomes calculator") << QStringList{"key Launch (1)"} << "Calculator";
    // Shift stays only with keys that allow it.
    QTest::newRow("shift kept with letter") << QStringList{"key Ctrl+Shift+A"} << "Ctrl+Shift+A";
    QTest::newRow("shift dropped with digit") << QStringList{"key Ctrl+Shift+5"} << "Ctrl+5";
    QTest::newRow("backtab with shift is shift+tab")
        << QStringList{"key Ctrl+Shift+Backtab"} << "Ctrl+Shift+Tab";
    QTest::newRow("super_r held gives meta")
        << QStringList{"press Super_R", "key F3", "release Super_R"} << "Meta+F3";
    // Only the first key is tested, and the fourth ends the recording at once.
    QTest::newRow("four keys") << QStringList{"key Ctrl+A", "key B", "key Space", "key D"}
                               << "Ctrl+A, B, Space, D";
}

void TestKeyWidget::recordedSequence()
{
    QFETCH(QStringList, steps);
    QFETCH(QString, sequence);

    QSignalSpy changed(widget, &KKeySequenceWidget::keySequenceChanged);
    run(QStringList{"click"} + steps);
    if (sequence.isEmpty()) {
        QVERIFY(widget->isRecording());
        QCOMPARE(button->text(), QStringLiteral(" Input ... "));
        QCOMPARE(changed.count(), 0);
        return;
    }
    QTRY_VERIFY_WITH_TIMEOUT(!widget->isRecording(), 3000);
    QCOMPARE(changed.count(), 1);
    QCOMPARE(changed.first().first().value<QKeySequence>(), portable(sequence));
    QCOMPARE(widget->keySequence(), portable(sequence));
    // The same sequence recorded again is no change, and reported as none.
    run(QStringList{"click"} + steps);
    QTRY_VERIFY_WITH_TIMEOUT(!widget->isRecording(), 3000);
    QCOMPARE(changed.count(), 1);
}

void TestKeyWidget::releaseDelay()
{
    KKeySequenceWidgetPrivate::releaseDelayMs = 300;
    QElapsedTimer clock;
    run({"click", "press Ctrl", "key A"});
    // A key with a modifier still held does not end it.
    QTest::qWait(400);
    QVERIFY(widget->isRecording());
    run({"release Ctrl"});
    clock.start();
    QTRY_VERIFY_WITH_TIMEOUT(!widget->isRecording(), 3000);
    QVERIFY2(clock.elapsed() >= 250, qPrintable(QString::number(clock.elapsed())));
    QCOMPARE(widget->keySequence(), portable("Ctrl+A"));
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

    QTest::keyClick(button, Qt::Key_S, Qt::ControlModifier);
    QCOMPARE(fired.count(), 0);
    QTest::keyClick(button, Qt::Key_Tab); // recorded, and the focus stays
    QCOMPARE(QApplication::focusWidget(), button);
    QTRY_VERIFY_WITH_TIMEOUT(!widget->isRecording(), 3000);
    QCOMPARE(widget->keySequence(), portable("Ctrl+S, Tab"));
    QCOMPARE(QWidget::keyboardGrabber(), nullptr);
    QVERIFY(!button->isDown());

    // Once idle the shortcut works again.
    QTest::keyClick(neighbour, Qt::Key_S, Qt::ControlModifier);
    QCOMPARE(fired.count(), 1);
}

void TestKeyWidget::recordingEndsElsewhere_data()
{
    QTest::addColumn<QString>("where");
    QTest::newRow("a click outside the button") << "click";
    QTest::newRow("another window of the program becomes active") << "window";
}

void TestKeyWidget::recordingEndsElsewhere()
{
    // The recording ends with the key from before it, and nothing is told.
    QFETCH(QString, where);
    widget->setKeySequence(portable("Ctrl+B"));
    QSignalSpy changed(widget, &KKeySequenceWidget::keySequenceChanged);
    QTest::mouseClick(button, Qt::LeftButton);
    QTest::keyPress(button, Qt::Key_Control);
    QVERIFY(widget->isRecording());
    QWidget other;
    if (where == QLatin1String("click")) {
        QTest::mouseClick(neighbour, Qt::LeftButton);
    } else {
        other.show();
        other.activateWindow();
        QVERIFY(QTest::qWaitForWindowActive(&other));
    }
    QTRY_VERIFY(!widget->isRecording());
    QCOMPARE(widget->keySequence(), portable("Ctrl+B"));
    QCOMPARE(changed.count(), 0);
    QCOMPARE(QWidget::keyboardGrabber(), nullptr);
}

ZEM_TEST_MAIN(TestKeyWidget)
#include "tst_keywidget.moc"
