#include "keypanel.h"

#include "kkeysequencewidget.h"

#include <QButtonGroup>
#include <QCoreApplication>
#include <QHBoxLayout>
#include <QKeySequence>
#include <QRadioButton>
#include <QSignalBlocker>

KeyPanel::KeyPanel(QWidget* parent) : QGroupBox(parent)
{
    //: The title of the key panel below the tree.
    setTitle(QCoreApplication::translate("KeysConfForm", "Choose a Key for the Selected Action"));
    setObjectName(QStringLiteral("keyGroupBox"));
    assign = new QRadioButton(QCoreApplication::translate("KeysConfForm", "Assign Key:"), this);
    assign->setObjectName(QStringLiteral("customKeyRadio"));
    keys = new KKeySequenceWidget(this);
    keys->setObjectName(QStringLiteral("keyWidget"));
    clear = new QRadioButton(QCoreApplication::translate("KeysConfForm", "Clear Key"), this);
    clear->setObjectName(QStringLiteral("noKeyRadio"));
    //: Spoken by screen readers for the key recorder of the key panel.
    keys->setAccessibleName(QCoreApplication::translate("KeysConfForm", "Key of the selected action"));
    auto* radios = new QButtonGroup(this);
    radios->addButton(assign);
    radios->addButton(clear);

    auto* layout = new QHBoxLayout(this);
    layout->addWidget(assign);
    layout->addWidget(keys);
    layout->addWidget(clear);
    layout->addStretch(1);
    // Off until a row is chosen; only now, as Qt gives a widget made inside a disabled parent
    // no accessible role of its own, and screen readers would not know the buttons.
    setEnabled(false);
}

void KeyPanel::showNoRow()
{
    setEnabled(false);
}

void KeyPanel::showRecorded(const QKeySequence& sequence)
{
    // Telling the recorder what it shows is no new recording: were it to report a change, the
    // edit would be made, and recorded for undo, a second time.
    const QSignalBlocker quiet(keys);
    keys->setKeySequence(sequence, KKeySequenceWidget::NoValidate);
}

void KeyPanel::showKey(const QString& key)
{
    // Showing a row's key is no edit.
    const QSignalBlocker quiet(keys);
    setEnabled(true);
    if (key.isEmpty()) {
        clear->setChecked(true);
        keys->setEnabled(false);
        keys->clearKeySequence();
        return;
    }
    assign->setChecked(true);
    keys->setEnabled(true);
    // Keys that loading could not turn into a key sequence are shown as they were read.
    const QKeySequence sequence = QKeySequence::fromString(key, QKeySequence::NativeText);
    const QString portable = sequence.toString(QKeySequence::PortableText);
    const bool danglingPlus = portable.endsWith(QLatin1Char('+')) && !portable.endsWith(QLatin1String("++"));
    // Qt parses a name it does not know as Key_unknown instead of failing, so a sequence holding
    // one counts as empty too.
    bool unknownKey = false;
    for (int i = 0; i < sequence.count(); ++i)
        unknownKey |= (sequence[i] & ~int(Qt::KeyboardModifierMask)) == Qt::Key_unknown;
    if (key.startsWith(QLatin1Char('#')) || danglingPlus || sequence.isEmpty() || unknownKey)
        keys->showKeyText(key);
    else
        keys->setKeySequence(sequence, KKeySequenceWidget::NoValidate);
}
