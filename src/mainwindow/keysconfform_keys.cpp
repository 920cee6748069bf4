#include "keysconfform.h"

#include "kkeysequencewidget.h"

#include <QGroupBox>
#include <QKeySequence>
#include <QMessageBox>
#include <QRadioButton>
#include <QTreeWidget>
#include <QTreeWidgetItemIterator>

void KeysConfForm::itemSelected(QTreeWidgetItem* selected)
{
    // Showing a row's key in the widget is no edit.
    disconnectKeyWidget();

    if (!selected || selected == commandGroupItem || selected->text(2).isEmpty()) {
        keyGroupBox->setEnabled(false);
        connectKeyWidget();
        return;
    }

    keyGroupBox->setEnabled(true);
    const QString key = itemKey(selected);
    if (key.isEmpty()) {
        noKeyRadio->setChecked(true);
        keyWidget->setEnabled(false);
        keyWidget->clearKeySequence();
    } else {
        customKeyRadio->setChecked(true);
        keyWidget->setEnabled(true);
        // Keys that loading could not turn into a key sequence are shown as they were read.
        const QKeySequence sequence = QKeySequence::fromString(key, QKeySequence::NativeText);
        const QString portable = sequence.toString(QKeySequence::PortableText);
        const bool danglingPlus =
            portable.endsWith(QLatin1Char('+')) && !portable.endsWith(QLatin1String("++"));
        // Qt parses a name it does not know as Key_unknown instead of failing, so a sequence
        // holding one counts as empty too.
        bool unknownKey = false;
        for (int i = 0; i < sequence.count(); ++i)
            unknownKey |= (sequence[i] & ~int(Qt::KeyboardModifierMask)) == Qt::Key_unknown;
        if (key.startsWith(QLatin1Char('#')) || danglingPlus || sequence.isEmpty() || unknownKey)
            keyWidget->showKeyText(key);
        else
            keyWidget->setKeySequence(sequence, KKeySequenceWidget::NoValidate);
    }
    connectKeyWidget();
}

void KeysConfForm::opt_customkey_checked()
{
    keyWidget->setEnabled(true);
    keyWidget->captureKeySequence();
}

void KeysConfForm::capturedKey(const QKeySequence& seq)
{
    setKey(seq);
}

void KeysConfForm::setKey(const QKeySequence& seq)
{
    QTreeWidgetItem* row = keysTree->currentItem();
    if (!row || seq.isEmpty())
        return;
    if (isKeyPresent(seq, true))
        return;

    setItemKey(row, seq.toString(QKeySequence::PortableText));
    row->setText(3, userSource);
    keyWidget->setKeySequence(seq, KKeySequenceWidget::NoValidate);
    fileChanged();
    // A combination in use again is no longer disabled.
    disabledKeys.removeAll(itemKey(row));
}

bool KeysConfForm::isKeyPresent(const QKeySequence& seq, bool warnuser)
{
    if (!keysTree)
        return false;
    const QString wanted = seq.toString(QKeySequence::PortableText).toLower();
    QTreeWidgetItem* current = keysTree->currentItem();
    QTreeWidgetItem* holder = nullptr;
    for (QTreeWidgetItemIterator it(keysTree); *it; ++it) {
        if (*it != current && itemKey(*it).toLower() == wanted) {
            holder = *it;
            break;
        }
    }
    if (!holder)
        return false;

    if (warnuser) {
        // The holder is named by its function, or as a command for command rows.
        const QString function = holder->text(2);
        //: Names a command entry in "to the %2 action (%3)", where %3 is its command line.
        const QString holderName = function == QLatin1String("ExecCommand") ? tr("command") : function;
        QMessageBox::warning(this, tr("Whoopsie! Key conflict."),
                             tr("Ouch! The %1 key combination has already been allocated\nto the %2 action "
                                "(%3).\n\nPlease choose a unique key combination.")
                                 .arg(seq.toString(QKeySequence::NativeText), holderName, holder->text(0)),
                             QMessageBox::Ok);
    }
    return true;
}

void KeysConfForm::opt_nokeys_checked()
{
    QTreeWidgetItem* row = keysTree->currentItem();
    if (!row)
        return;
    // A system binding stays switched off once the user's file is saved. A row without a key
    // binds nothing, and an empty disabled key would be written as a bogus entry.
    if (row->text(3) == systemSource && !itemKey(row).isEmpty() && !disabledKeys.contains(itemKey(row)))
        disabledKeys.append(itemKey(row));
    setItemKey(row, QString());
    row->setText(3, userSource);
    fileChanged();
    keyWidget->clearKeySequence();
    keyWidget->setEnabled(false);
}
