#pragma once

#include <QGroupBox>

class KKeySequenceWidget;
class QKeySequence;
class QRadioButton;

// The key panel below the tree: "Assign Key:" with the recorder, and "Clear Key". It shows the
// selected row's key and reports what the user chooses; the edits themselves are the window's.
class KeyPanel : public QGroupBox
{
    Q_OBJECT
    Q_DISABLE_COPY(KeyPanel)

public:
    explicit KeyPanel(QWidget* parent);

    QRadioButton* assignRadio() const { return assign; }
    QRadioButton* clearRadio() const { return clear; }
    KKeySequenceWidget* recorder() const { return keys; }

    // Shows a row's stored key (empty: none), without telling anyone of a change.
    void showKey(const QString& storedKey);
    // No row to act on: the panel is off.
    void showNoRow();
    // The recorder shows this sequence, as after a recording, without reporting it again.
    void showRecorded(const QKeySequence& sequence);

private:
    QRadioButton* assign = nullptr;
    KKeySequenceWidget* keys = nullptr;
    QRadioButton* clear = nullptr;
};
