#pragma once

#include <QPushButton>

class KKeySequenceWidgetPrivate;

// The button of the key widget: shows the sequence and, while recording, takes every key.
class KKeySequenceButton : public QPushButton
{
    Q_OBJECT
    Q_DISABLE_COPY(KKeySequenceButton)

public:
    KKeySequenceButton(KKeySequenceWidgetPrivate* d, QWidget* parent);
    ~KKeySequenceButton() override;

protected:
    bool event(QEvent* event) override;
    // While recording: a mouse press anywhere else in the application ends the recording.
    bool eventFilter(QObject* watched, QEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void keyReleaseEvent(QKeyEvent* event) override;

private:
    friend class KKeySequenceWidgetPrivate;
    KKeySequenceWidgetPrivate* const d;
};
