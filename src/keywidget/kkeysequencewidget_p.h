#pragma once

#include "kkeysequencewidget.h"

#include <QCoreApplication>
#include <QKeySequence>
#include <QTimer>

class KKeySequenceButton;
class QHBoxLayout;
class QToolButton;

// The widget's state and the recording logic that its button drives.
class KKeySequenceWidgetPrivate
{
    Q_DECLARE_TR_FUNCTIONS(KKeySequenceWidgetPrivate)

public:
    explicit KKeySequenceWidgetPrivate(KKeySequenceWidget* q);

    void setup();
    void beginRecording();
    void finishRecording();
    // Ends a recording without a new sequence: the one from before stays, and nothing is told.
    void cancelRecording();
    void refreshButtonText();
    // A key pressed while recording, with the modifiers held: the sequence gains it, unless it is
    // a first key that makes no sense alone.
    void recordKey(int key, quint32 held);
    // A key press that Qt could not name: warn, and go back to the sequence before.
    void unsupportedKey();

    // Whether a key may start a sequence without Control, Alt or Meta.
    static bool keyAllowedAlone(int key);
    // The sequence with one more key; a full sequence stays as it is.
    static QKeySequence appendKey(const QKeySequence& seq, int key);

    // How long a recording waits after the last key is let go. Tests shorten it; the program
    // never changes it.
    static int releaseDelayMs;
    static constexpr int longestSequence = 4;

    KKeySequenceWidget* owner;
    QMetaObject::Connection windowWatch;
    QHBoxLayout* layout = nullptr;
    KKeySequenceButton* recordButton = nullptr;
    QToolButton* clearSequenceButton = nullptr;
    QKeySequence sequence;
    QKeySequence previousSequence;
    QTimer releaseTimer;
    bool bareFirstKeyAllowed = false;
    quint32 keyCount = 0;
    quint32 heldModifiers = 0;
    bool recording = false;
    bool multiKeyShortcutsAllowed = true;
    KKeySequenceWidget::ShortcutTypes checkForConflictsAgainst = KKeySequenceWidget::ApplicationShortcuts;
};
