#include "kkeysequencebutton.h"

#include "kkeysequencewidget_p.h"

#include <KKeyServer>
#include <QKeyEvent>

namespace {

constexpr quint32 fiveModifiers =
    Qt::ShiftModifier | Qt::ControlModifier | Qt::AltModifier | Qt::MetaModifier | Qt::KeypadModifier;
constexpr quint32 fourModifiers =
    Qt::ShiftModifier | Qt::ControlModifier | Qt::AltModifier | Qt::MetaModifier;
// Qt reports a key it cannot name with this code.
constexpr int unsupportedKeyCode = -1;

bool isModifierKey(int key)
{
    switch (key) {
    case Qt::Key_Shift:
    case Qt::Key_Control:
    case Qt::Key_Meta:
    case Qt::Key_Alt:
    case Qt::Key_Super_L:
    case Qt::Key_Super_R:
        return true;
    default:
        return false;
    }
}

bool isSuperKey(int key)
{
    return key == Qt::Key_Super_L || key == Qt::Key_Super_R;
}

} // namespace

KKeySequenceButton::KKeySequenceButton(KKeySequenceWidgetPrivate* d, QWidget* parent)
    : QPushButton(parent), d(d)
{
}

KKeySequenceButton::~KKeySequenceButton() = default;

bool KKeySequenceButton::eventFilter(QObject* watched, QEvent* event)
{
    if (d->recording && event->type() == QEvent::MouseButtonPress) {
        auto* widget = qobject_cast<QWidget*>(watched);
        // The press still reaches its target: the clear button clears, and this one records anew.
        if (widget && widget != this)
            d->cancelRecording();
    }
    return QPushButton::eventFilter(watched, event);
}

bool KKeySequenceButton::event(QEvent* event)
{
    if (d->recording) {
        // Every key belongs to the recording: Tab must not move the focus, and no shortcut of
        // the application may fire.
        if (event->type() == QEvent::KeyPress) {
            keyPressEvent(static_cast<QKeyEvent*>(event));
            return true;
        }
        if (event->type() == QEvent::ShortcutOverride) {
            event->accept();
            return true;
        }
    }
    return QPushButton::event(event);
}

void KKeySequenceButton::keyPressEvent(QKeyEvent* event)
{
    int key = event->key();
    if (key == unsupportedKeyCode) {
        d->unsupportedKey();
        return;
    }

    quint32 held = 0;
    if (key == Qt::Key_Launch1) {
        // The calculator key of many keyboards reaches Qt as Launch1.
        if (!d->recording) {
            QPushButton::keyPressEvent(event);
            return;
        }
        held = quint32(event->modifiers()) & fiveModifiers;
        event->accept();
        d->heldModifiers = held;
        key = Qt::Key_Calculator;
    } else {
        held = quint32(event->modifiers()) & fiveModifiers;
        if (isSuperKey(key))
            held |= Qt::MetaModifier;

        if (!d->recording) {
            if (key == Qt::Key_Return || key == Qt::Key_Space) {
                d->beginRecording();
                d->heldModifiers = held;
                d->refreshButtonText();
            } else {
                QPushButton::keyPressEvent(event);
            }
            return;
        }

        event->accept();
        d->heldModifiers = held;
        if (key == Qt::Key_AltGr)
            return;
        if (isModifierKey(key)) {
            if (d->keyCount > 0 && held == 0)
                d->releaseTimer.start(KKeySequenceWidgetPrivate::releaseDelayMs);
            else
                d->releaseTimer.stop();
            d->refreshButtonText();
            return;
        }
    }

    d->recordKey(key, held);
}

void KKeySequenceButton::keyReleaseEvent(QKeyEvent* event)
{
    if (event->key() == unsupportedKeyCode) {
        event->ignore();
        return;
    }
    if (!d->recording) {
        QAbstractButton::keyReleaseEvent(event);
        return;
    }

    event->accept();
    quint32 left = quint32(event->modifiers()) & fourModifiers;
    if (isSuperKey(event->key()))
        left = quint32(event->modifiers()) & (Qt::ShiftModifier | Qt::ControlModifier | Qt::AltModifier);

    if (d->heldModifiers & ~left) {
        d->heldModifiers = left;
        if (d->keyCount > 0 && left == 0)
            d->releaseTimer.start(KKeySequenceWidgetPrivate::releaseDelayMs);
        else
            d->releaseTimer.stop();
        d->refreshButtonText();
    }
}
