#include "keysconfform.h"

#include "bindingtree.h"
#include "editcommands.h"
#include "keypanel.h"
#include "kkeysequencewidget.h"

#include <QGroupBox>
#include <QKeySequence>
#include <QMessageBox>
#include <QPushButton>
#include <QRadioButton>
#include <QSignalBlocker>
#include <QTreeWidget>

void KeysConfForm::itemSelected(QTreeWidgetItem* selected)
{
    const Binding* binding = model.find(bindingAt(selected));
    if (binding)
        keyPanel->showKey(binding->key);
    else
        keyPanel->showNoRow();
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
    const BindingId id = bindingAt(keysTree->currentItem());
    if (!id || seq.isEmpty())
        return;
    const QString key = seq.toString(QKeySequence::PortableText);
    if (isKeyPresent(seq, true)) {
        if (!reassignChosen) {
            // The panel shows the row's own key again, not the one refused.
            itemSelected(keysTree->currentItem());
            return;
        }
        // The key moves here; the row that held it is left without one.
        keyPanel->showRecorded(seq);
        edits->reassign(model.holderOf(key, id), id);
        return;
    }
    keyPanel->showRecorded(seq);
    edits->assign(id, key);
}

bool KeysConfForm::isKeyPresent(const QKeySequence& seq, bool warnuser)
{
    if (!keysTree)
        return false;
    // Keys are compared as the file will hold them, so two rows can never end up on one key.
    const BindingId holderId =
        model.holderOf(seq.toString(QKeySequence::PortableText), bindingAt(keysTree->currentItem()));
    const Binding* holder = model.find(holderId);
    reassignChosen = false;
    if (!holder)
        return false;

    if (warnuser) {
        // The holder is named by its function, or as a command for command rows.
        //: Names a command entry in "to the %2 action (%3)", where %3 is its command line.
        const QString holderName =
            holder->isCommand() ? tr("command") : HotkeysModel::functionNames().at(holder->function);
        QMessageBox box(
            QMessageBox::Warning, tr("Whoopsie! Key conflict."),
            tr("Ouch! The %1 key combination has already been allocated\nto the %2 action "
               "(%3).\n\nPlease choose a unique key combination.")
                .arg(seq.toString(QKeySequence::NativeText), holderName, bindingTree->actionText(holderId)),
            QMessageBox::Ok | QMessageBox::Apply, this);
        //: Moves the key combination to the edited row, leaving the other one without a key.
        box.button(QMessageBox::Apply)->setText(tr("Reassign"));
        box.setDefaultButton(QMessageBox::Ok);
        box.setEscapeButton(QMessageBox::Ok);
        reassignChosen = box.exec() == QMessageBox::Apply;
    }
    return true;
}

void KeysConfForm::opt_nokeys_checked()
{
    const BindingId id = bindingAt(keysTree->currentItem());
    if (!id)
        return;
    edits->clear(id);
    keyWidget->clearKeySequence();
    keyWidget->setEnabled(false);
}
