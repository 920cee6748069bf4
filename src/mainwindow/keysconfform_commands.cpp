#include "keysconfform.h"

#include "bindingtree.h"
#include "editcommands.h"
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

    edits->addCommand(dialog.command());
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
    edits->setCommand(bindingAt(clicked), dialog.command());
}

void KeysConfForm::cloneCommand()
{
    QTreeWidgetItem* target = targetRow();
    if (!target || !target->parent())
        return;
    edits->clone(bindingAt(target));
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

    if (!edits->remove(bindingAt(target)))
        return;
    keysTree->setCurrentItem(parent);
    parent->setSelected(true);
}

void KeysConfForm::revertToSystemBinding()
{
    const BindingId id = bindingAt(targetRow());
    if (!model.canRevert(id) || currentFile != userHotkeysFilePath())
        return;
    const QStringList heldElsewhere = edits->revert(id);
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
