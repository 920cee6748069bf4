#include "keysconfform.h"

#include "selectcommanddialog.h"

#include <QGroupBox>
#include <QMessageBox>
#include <QTreeWidget>

namespace {

const QString execCommand = QStringLiteral("ExecCommand");

} // namespace

void KeysConfForm::newCommand()
{
    keyGroupBox->setEnabled(false);
    SelectCommandDialog dialog(this);
    if (dialog.exec() != QDialog::Accepted || dialog.command().isEmpty())
        return;

    auto* row = new QTreeWidgetItem();
    commandGroupItem->addChild(row);
    row->setText(0, dialog.command());
    row->setText(2, execCommand);
    row->setText(3, userSource);
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
    clicked->setText(0, dialog.command());
    clicked->setText(2, execCommand);
    clicked->setText(3, userSource);
    fileChanged();
}

void KeysConfForm::cloneCommand()
{
    QTreeWidgetItem* target = targetRow();
    QTreeWidgetItem* parent = target ? target->parent() : nullptr;
    if (!parent)
        return;

    auto* row = new QTreeWidgetItem();
    parent->insertChild(parent->indexOfChild(target) + 1, row);
    row->setText(0, target->text(0));
    row->setText(2, target->text(2));
    row->setText(3, userSource);
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

    // A system binding stays switched off once the user's file is saved. A row without a key
    // binds nothing, and an empty disabled key would be written as a bogus entry.
    if (target->text(3) == systemSource && !itemKey(target).isEmpty() &&
        !disabledKeys.contains(itemKey(target)))
        disabledKeys.append(itemKey(target));
    delete target;
    keysTree->setCurrentItem(parent);
    parent->setSelected(true);
    fileChanged();
}
