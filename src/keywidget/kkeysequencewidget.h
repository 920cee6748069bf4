#pragma once

#include <QKeySequence>
#include <QWidget>

class KKeySequenceWidgetPrivate;

// Records a key combination of up to four keys. The current sequence is the text of a push
// button; pressing it starts a recording, and when the recording ends with a sequence other
// than before, keySequenceChanged() reports it. The widget judges nothing: whether a
// combination is free is for the receiver of the signal to decide.
class KKeySequenceWidget : public QWidget
{
    Q_OBJECT
    Q_DISABLE_COPY(KKeySequenceWidget)
    Q_PROPERTY(bool multiKeyShortcutsAllowed READ multiKeyShortcutsAllowed WRITE setMultiKeyShortcutsAllowed)
    Q_PROPERTY(ShortcutTypes checkForConflictsAgainst READ checkForConflictsAgainst WRITE
                   setCheckForConflictsAgainst)

public:
    enum Validation {
        Validate = 0,
        NoValidate = 1,
    };
    Q_ENUM(Validation)

    // Which shortcuts a conflict check would look at; kept for callers, checked by nobody.
    enum ShortcutType {
        NoShortcuts = 0x00,
        ApplicationShortcuts = 0x01,
        StandardKeys = 0x02,
        WindowManagerShortcuts = 0x04,
    };
    Q_DECLARE_FLAGS(ShortcutTypes, ShortcutType)
    Q_FLAG(ShortcutTypes)

    explicit KKeySequenceWidget(QWidget* parent = nullptr);
    ~KKeySequenceWidget() override;

    bool multiKeyShortcutsAllowed() const;
    void setMultiKeyShortcutsAllowed(bool allowed);
    ShortcutTypes checkForConflictsAgainst() const;
    void setCheckForConflictsAgainst(ShortcutTypes types);

    QKeySequence keySequence() const;
    bool isRecording() const;
    // Shows the text on the button as it stands, leaving the sequence alone until the next
    // refresh; for stored keys that are no valid key sequence.
    void showKeyText(const QString& text);

signals:
    void keySequenceChanged(const QKeySequence& seq);

public slots:
    void captureKeySequence();
    // Every sequence is accepted; the validation argument is kept for callers.
    void setKeySequence(const QKeySequence& seq, KKeySequenceWidget::Validation val);
    void setKeySequence(const QKeySequence& seq);
    void clearKeySequence();

private slots:
    void doneRecording();

private:
    friend class KKeySequenceWidgetPrivate;
    KKeySequenceWidgetPrivate* const d;
};

Q_DECLARE_OPERATORS_FOR_FLAGS(KKeySequenceWidget::ShortcutTypes)
