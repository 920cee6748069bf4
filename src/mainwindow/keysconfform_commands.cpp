#include "keysconfform.h"

#include "bindingtree.h"
#include "hotkeysfile.h"
#include "selectcommanddialog.h"

#include <QGroupBox>
#include <QKeySequence>
#include <QMessageBox>
#include <QTreeWidget>

void KeysConfForm::newCommand()
{
    keyGroupBox->setEnabled(false);
    SelectCommandDialog dialog(this);
    if (dialog.exec() != QDialog::Accepted || dialog.command().isEmpty())
        return;

    const HotkeysModel before = model;
    const BindingId id = model.addCommand(dialog.command());
    QTreeWidgetItem* row = bindingTree->insert(id);
    // Shown even where a filter hid every other command.
    commandGroupItem->setHidden(false);
    keysTree->scrollToItem(row);
    keysTree->setCurrentItem(row);
    keyGroupBox->setEnabled(true);
    recordEdit(tr("Add command %1").arg(dialog.command()), before, id);
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
    const HotkeysModel before = model;
    model.setCommand(bindingAt(clicked), dialog.command());
    bindingTree->refresh(bindingAt(clicked));
    recordEdit(tr("Edit command %1").arg(dialog.command()), before, bindingAt(clicked));
}

void KeysConfForm::cloneCommand()
{
    QTreeWidgetItem* target = targetRow();
    if (!target || !target->parent())
        return;
    const HotkeysModel before = model;
    const BindingId id = model.cloneRow(bindingAt(target));
    QTreeWidgetItem* row = bindingTree->insert(id);
    if (!row)
        return;
    keysTree->scrollToItem(row);
    keysTree->setCurrentItem(row);
    keyGroupBox->setEnabled(true);
    recordEdit(tr("Clone %1").arg(target->text(0)), before, id);
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

    const HotkeysModel before = model;
    const BindingId id = bindingAt(target);
    const QString text = target->text(0);
    if (!model.removeRow(id))
        return;
    bindingTree->remove(id);
    keysTree->setCurrentItem(parent);
    parent->setSelected(true);
    recordEdit(tr("Delete %1").arg(text), before, id);
}

void KeysConfForm::revertToSystemBinding()
{
    const BindingId id = bindingAt(targetRow());
    const Binding* binding = model.find(id);
    if (!binding || binding->isCommand() || currentFile != userHotkeysFilePath())
        return;
    const HotkeysModel before = model;
    const QString text = targetRow()->text(0);
    const QStringList heldElsewhere = model.revertToSystem(binding->function);
    const BindingId first = model.rowsOf(before.find(id)->function).first().id;
    showBindings(model, first);
    recordEdit(tr("Revert %1 to the system binding").arg(text), before, first);
    if (!heldElsewhere.isEmpty()) {
        QStringList shown;
        for (const QString& key : heldElsewhere)
            shown << QKeySequence::fromString(key, QKeySequence::PortableText)
                         .toString(QKeySequence::NativeText);
        QMessageBox::information(this, tr("Revert to System Binding"),
                                 tr("%1 stays with the row that holds it now.", nullptr, shown.size())
                                     .arg(shown.join(QLatin1String(", "))),
                                 QMessageBox::Ok);
    }
}
