#include "keysconfform.h"

#include "bindingtree.h"
#include "selectcommanddialog.h"

#include <QGroupBox>
#include <QMessageBox>
#include <QTreeWidget>

void KeysConfForm::newCommand()
{
    keyGroupBox->setEnabled(false);
    SelectCommandDialog dialog(this);
    if (dialog.exec() != QDialog::Accepted || dialog.command().isEmpty())
        return;

    QTreeWidgetItem* row = bindingTree->insert(model.addCommand(dialog.command()));
    // Shown even where a filter hid every other command.
    commandGroupItem->setHidden(false);
    keysTree->scrollToItem(row);
    keysTree->setCurrentItem(row);
    keyGroupBox->setEnabled(true);
    fileChanged();
}

void KeysConfForm::editCommand()
{
    if (QTreeWidgetItem* row = targetRow())
        itemDoubleClicked(row, 0);
}

void KeysConfForm::itemDoubleClicked(QTreeWidgetItem* clicked, int)
{
    if (!commandGroupItem || commandGroupItem->childCount() == 0 || !clicked ||
        clicked->parent() != commandGroupItem)
        return;

    SelectCommandDialog dialog(this);
    dialog.setCommand(clicked->text(0));
    if (dialog.exec() != QDialog::Accepted || dialog.command().isEmpty() ||
        dialog.command() == clicked->text(0))
        return;
    model.setCommand(bindingAt(clicked), dialog.command());
    bindingTree->refresh(bindingAt(clicked));
    fileChanged();
}

void KeysConfForm::cloneCommand()
{
    QTreeWidgetItem* target = targetRow();
    if (!target || !target->parent())
        return;
    QTreeWidgetItem* row = bindingTree->insert(model.cloneRow(bindingAt(target)));
    if (!row)
        return;
    keysTree->scrollToItem(row);
    keysTree->setCurrentItem(row);
    keyGroupBox->setEnabled(true);
    fileChanged();
}

void KeysConfForm::deleteCommand()
{
    QTreeWidgetItem* target = targetRow();
    QTreeWidgetItem* parent = target ? target->parent() : nullptr;
    if (!parent)
        return;
    if (QMessageBox::question(this, tr("Delete"), tr("Are you sure to delete this action?"),
                              QMessageBox::Yes | QMessageBox::No, QMessageBox::No) != QMessageBox::Yes)
        return;

    const BindingId id = bindingAt(target);
    if (!model.removeRow(id))
        return;
    bindingTree->remove(id);
    keysTree->setCurrentItem(parent);
    parent->setSelected(true);
    fileChanged();
}
