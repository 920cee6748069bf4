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

    HotkeysModel after = model;
    const BindingId id = after.addCommand(dialog.command());
    edit(tr("Add command %1").arg(dialog.command()), id, after);
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
    const QString command = bindingTree->actionText(bindingAt(clicked));
    dialog.setCommand(command);
    if (dialog.exec() != QDialog::Accepted || dialog.command().isEmpty() || dialog.command() == command)
        return;
    HotkeysModel after = model;
    after.setCommand(bindingAt(clicked), dialog.command());
    edit(tr("Edit command %1").arg(dialog.command()), bindingAt(clicked), after);
}

void KeysConfForm::cloneCommand()
{
    QTreeWidgetItem* target = targetRow();
    if (!target || !target->parent())
        return;
    HotkeysModel after = model;
    const BindingId id = after.cloneRow(bindingAt(target));
    if (id)
        edit(tr("Clone %1").arg(bindingTree->actionText(bindingAt(target))), id, after);
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

    HotkeysModel after = model;
    const BindingId id = bindingAt(target);
    if (!after.removeRow(id))
        return;
    edit(tr("Delete %1").arg(bindingTree->actionText(id)), id, after);
    keysTree->setCurrentItem(parent);
    parent->setSelected(true);
}

void KeysConfForm::revertToSystemBinding()
{
    const BindingId id = bindingAt(targetRow());
    if (!model.canRevert(id) || currentFile != userHotkeysFilePath())
        return;
    HotkeysModel after = model;
    BindingId focus = id;
    const QStringList heldElsewhere = after.revert(id, &focus);
    edit(tr("Revert %1 to the system binding").arg(bindingTree->actionText(id)), focus, after);
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
