// Files changed behind the editor's back: the edited file (and, in the merged view, the system
// file) is watched; a change with no unsaved edits is loaded at once, and with unsaved edits
// Save and Apply ask before they overwrite it.
#include "keysconfform.h"

#include "hotkeysfile.h"

#include <QFileInfo>
#include <QPushButton>
#include <QTimer>
#include <QTreeWidget>
#include <QTreeWidgetItemIterator>

namespace {

// A row as it can be found again in a rebuilt tree: its function or command line, and which of
// the rows of that name it is.
QString identityOf(const QTreeWidgetItem* row)
{
    if (!row)
        return QString();
    const QTreeWidgetItem* parent = row->parent();
    const QString name = row->text(2).isEmpty() || row->text(2) == QLatin1String("ExecCommand")
                             ? row->text(2) + QLatin1Char('\n') + row->text(0)
                             : row->text(2);
    int index = 0;
    for (int i = 0; parent && parent->child(i) != row; ++i)
        index += parent->child(i)->text(0) == row->text(0) && parent->child(i)->text(2) == row->text(2);
    return name + QLatin1Char('\n') + QString::number(index);
}

} // namespace

void KeysConfForm::filesChangedOnDisk(EditedFile::Change change)
{
    // With unsaved edits nothing is dropped: Save and Apply ask. A vanished file is told at Save.
    if (!modified && change != EditedFile::Change::None && change != EditedFile::Change::Vanished)
        reloadKeepingSelection();
}

void KeysConfForm::reloadKeepingSelection()
{
    const QString selected = identityOf(keysTree->currentItem());
    if (!loadFile(currentFile))
        return;
    for (QTreeWidgetItemIterator it(keysTree); *it; ++it) {
        if (!selected.isEmpty() && identityOf(*it) == selected) {
            keysTree->setCurrentItem(*it);
            break;
        }
    }
}

bool KeysConfForm::mayOverwrite(EditedFile::Change change)
{
    if (change == EditedFile::Change::None)
        return true;
    if (change == EditedFile::Change::Vanished) {
        QMessageBox::information(
            this, tr("File changed on disk"),
            tr("%1 was deleted or renamed since it was loaded.\nIt is written anew.").arg(currentFile),
            QMessageBox::Ok);
        return true;
    }
    // Name the file that changed: the edits may be sound for the user's file and still rest on
    // system bindings that are no longer there.
    const QString text =
        change == EditedFile::Change::SystemFile
            ? tr("The system hotkeys file %1 was changed by another program since it was loaded.\n"
                 "Overwrite %2 with your edits, reload both and drop them, or cancel?")
                  .arg(edited->systemPath(), currentFile)
            : tr("%1 was changed by another program since it was loaded.\nOverwrite it with your edits, "
                 "reload it and drop them, or cancel?")
                  .arg(currentFile);
    QMessageBox box(QMessageBox::Warning, tr("File changed on disk"), text,
                    QMessageBox::Save | QMessageBox::Discard | QMessageBox::Cancel, this);
    box.button(QMessageBox::Save)->setText(tr("Overwrite"));
    box.button(QMessageBox::Discard)->setText(tr("Reload"));
    box.setDefaultButton(QMessageBox::Cancel);
    const int answer = box.exec();
    if (answer == QMessageBox::Save)
        return true;
    if (answer == QMessageBox::Discard)
        reloadKeepingSelection();
    return false;
}
