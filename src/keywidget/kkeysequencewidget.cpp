#include "kkeysequencewidget.h"

#include "kkeysequencebutton.h"
#include "kkeysequencewidget_p.h"

#include <KKeyServer>
#include <QApplication>
#include <QHBoxLayout>
#include <QIcon>
#include <QMessageBox>
#include <QToolButton>
#include <QWindow>

int KKeySequenceWidgetPrivate::releaseDelayMs = 600;

KKeySequenceWidgetPrivate::KKeySequenceWidgetPrivate(KKeySequenceWidget* q) : owner(q) {}

void KKeySequenceWidgetPrivate::setup()
{
    layout = new QHBoxLayout(owner);
    layout->setContentsMargins(0, 0, 0, 0);

    recordButton = new KKeySequenceButton(this, owner);
    recordButton->setObjectName(QStringLiteral("recordButton"));
    recordButton->setFocusPolicy(Qt::StrongFocus);
    recordButton->setIcon(QIcon::fromTheme(QStringLiteral("input-keyboard")));
    layout->addWidget(recordButton);

    clearSequenceButton = new QToolButton(owner);
    clearSequenceButton->setObjectName(QStringLiteral("clearSequenceButton"));
    clearSequenceButton->setIcon(QIcon::fromTheme(QStringLiteral("edit-delete")));
    // An icon alone says nothing to a screen reader or to a user who does not know it.
    clearSequenceButton->setToolTip(KKeySequenceButton::tr("Clear the key"));
    clearSequenceButton->setAccessibleName(KKeySequenceButton::tr("Clear the key"));
    layout->addWidget(clearSequenceButton);

    QObject::connect(recordButton, &QPushButton::clicked, owner, &KKeySequenceWidget::captureKeySequence);
    QObject::connect(clearSequenceButton, &QToolButton::clicked, owner,
                     &KKeySequenceWidget::clearKeySequence);
    QObject::connect(&releaseTimer, &QTimer::timeout, owner, &KKeySequenceWidget::doneRecording);
    releaseTimer.setSingleShot(true);

    refreshButtonText();
}

void KKeySequenceWidgetPrivate::beginRecording()
{
    keyCount = 0;
    heldModifiers = 0;
    previousSequence = sequence;
    sequence = QKeySequence();
    recording = true;
    recordButton->grabKeyboard();
    recordButton->setDown(true);
    // A recording ends when the user turns elsewhere: a click outside the button, or another
    // window (of this program too) becoming the active one. The keyboard grab itself moves no
    // window's focus, so it does not end it.
    qApp->installEventFilter(recordButton);
    windowWatch =
        QObject::connect(qApp, &QGuiApplication::focusWindowChanged, recordButton, [this](QWindow* now) {
            if (recording && now != recordButton->window()->windowHandle())
                cancelRecording();
        });
    refreshButtonText();
}

void KKeySequenceWidgetPrivate::cancelRecording()
{
    sequence = previousSequence;
    previousSequence = sequence;
    finishRecording();
}

void KKeySequenceWidgetPrivate::finishRecording()
{
    releaseTimer.stop();
    qApp->removeEventFilter(recordButton);
    QObject::disconnect(windowWatch);
    recording = false;
    recordButton->releaseKeyboard();
    recordButton->setDown(false);
    if (sequence != previousSequence)
        emit owner->keySequenceChanged(sequence);
    refreshButtonText();
}

void KKeySequenceWidgetPrivate::refreshButtonText()
{
    // "&" would otherwise turn the next letter into a mnemonic.
    QString text = sequence.toString(QKeySequence::NativeText).replace(QLatin1Char('&'), QLatin1String("&&"));
    if (recording) {
        if (heldModifiers != 0) {
            if (!text.isEmpty())
                text += QLatin1Char(',');
            for (const Qt::KeyboardModifier modifier :
                 {Qt::MetaModifier, Qt::ControlModifier, Qt::AltModifier, Qt::ShiftModifier}) {
                if (heldModifiers & modifier)
                    text += KKeyServer::modToStringUser(modifier) + QLatin1Char('+');
            }
        } else if (keyCount == 0) {
            text = tr("Input");
        }
        text += QLatin1String(" ...");
    }
    if (text.isEmpty())
        text = tr("None");
    recordButton->setText(QLatin1Char(' ') + text + QLatin1Char(' '));
}

void KKeySequenceWidgetPrivate::unsupportedKey()
{
    QMessageBox::warning(recordButton, KKeySequenceButton::tr("Unsupported Key"),
                         KKeySequenceButton::tr("The key you just pressed is not supported by Qt."),
                         QMessageBox::Ok, QMessageBox::NoButton);
    sequence = previousSequence;
    finishRecording();
}

void KKeySequenceWidgetPrivate::recordKey(int key, quint32 held)
{
    // A first key without Control, Alt, Meta or the keypad must be one that makes sense alone.
    if (keyCount == 0 && (held & ~quint32(Qt::ShiftModifier)) == 0 && !keyAllowedAlone(key) &&
        !bareFirstKeyAllowed)
        return;
    if (key == 0)
        return;

    int combined = 0;
    if (key == Qt::Key_Backtab && (heldModifiers & Qt::ShiftModifier))
        combined = Qt::Key_Tab | int(heldModifiers);
    else if (KKeyServer::isShiftAsModifierAllowed(key))
        combined = key | int(heldModifiers);
    else
        combined = key | int(heldModifiers & ~quint32(Qt::ShiftModifier));

    if (keyCount > 0)
        sequence = appendKey(sequence, combined);
    else
        sequence = QKeySequence(combined);
    ++keyCount;

    if (!multiKeyShortcutsAllowed || keyCount >= quint32(longestSequence)) {
        finishRecording();
        return;
    }
    if (heldModifiers != 0)
        releaseTimer.stop();
    else
        releaseTimer.start(releaseDelayMs);
    refreshButtonText();
}

bool KKeySequenceWidgetPrivate::keyAllowedAlone(int key)
{
    if (QKeySequence(key).toString(QKeySequence::PortableText).size() == 1)
        return false;
    switch (key) {
    case Qt::Key_Tab:
    case Qt::Key_Backtab:
    case Qt::Key_Backspace:
    case Qt::Key_Return:
    case Qt::Key_Delete:
    case Qt::Key_Space:
        return false;
    default:
        return true;
    }
}

QKeySequence KKeySequenceWidgetPrivate::appendKey(const QKeySequence& seq, int key)
{
    switch (seq.count()) {
    case 0:
        return QKeySequence(key);
    case 1:
        return QKeySequence(seq[0], key);
    case 2:
        return QKeySequence(seq[0], seq[1], key);
    case 3:
        return QKeySequence(seq[0], seq[1], seq[2], key);
    default:
        return seq;
    }
}

KKeySequenceWidget::KKeySequenceWidget(QWidget* parent)
    : QWidget(parent), d(new KKeySequenceWidgetPrivate(this))
{
    d->setup();
}

KKeySequenceWidget::~KKeySequenceWidget()
{
    delete d;
}

bool KKeySequenceWidget::multiKeyShortcutsAllowed() const
{
    return d->multiKeyShortcutsAllowed;
}

void KKeySequenceWidget::setMultiKeyShortcutsAllowed(bool allowed)
{
    d->multiKeyShortcutsAllowed = allowed;
}

KKeySequenceWidget::ShortcutTypes KKeySequenceWidget::checkForConflictsAgainst() const
{
    return d->checkForConflictsAgainst;
}

void KKeySequenceWidget::setCheckForConflictsAgainst(ShortcutTypes types)
{
    d->checkForConflictsAgainst = types;
}

QKeySequence KKeySequenceWidget::keySequence() const
{
    return d->sequence;
}

bool KKeySequenceWidget::isRecording() const
{
    return d->recording;
}

void KKeySequenceWidget::showKeyText(const QString& text)
{
    d->recordButton->setText(text);
}

void KKeySequenceWidget::captureKeySequence()
{
    d->beginRecording();
}

void KKeySequenceWidget::setKeySequence(const QKeySequence& seq, Validation)
{
    // During a recording the sequence from before it stays the one to compare with.
    if (!d->recording)
        d->previousSequence = d->sequence;
    d->sequence = seq;
    d->finishRecording();
}

void KKeySequenceWidget::setKeySequence(const QKeySequence& seq)
{
    setKeySequence(seq, NoValidate);
}

void KKeySequenceWidget::clearKeySequence()
{
    setKeySequence(QKeySequence(), NoValidate);
}

void KKeySequenceWidget::doneRecording()
{
    d->finishRecording();
}
