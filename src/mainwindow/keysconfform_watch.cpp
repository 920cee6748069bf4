// Files changed behind the editor's back: the edited file (and, in the merged view, the system
// file) is watched; a change with no unsaved edits is loaded at once, and with unsaved edits
// Save and Apply ask before they overwrite it.
#include "keysconfform.h"

#include "hotkeysfile.h"

#include <QCryptographicHash>
#include <QFile>
#include <QFileInfo>
#include <QFileSystemWatcher>
#include <QPushButton>
#include <QTimer>
#include <QTreeWidget>
#include <QTreeWidgetItemIterator>

namespace {

// What a file holds, in short; empty when there is no such file.
QByteArray digestOf(const QString& path)
{
    QFile file(path);
    if (path.isEmpty() || !file.open(QIODevice::ReadOnly))
        return QByteArray();
    return QCryptographicHash::hash(file.read(largestHotkeysFile + 1), QCryptographicHash::Sha1);
}

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

void KeysConfForm::watchFiles(const QByteArray& fileBytes)
{
    // The digest of the bytes read or written, not of the file read again: a change made in
    // between must count as a change.
    watchedFile = currentFile;
    watchedDigest = QCryptographicHash::hash(fileBytes, QCryptographicHash::Sha1);
    watchedSystem = currentFile == userHotkeysFilePath() ? systemHotkeysFilePath() : QString();
    systemDigest = digestOf(watchedSystem);
    rewatch();
}

void KeysConfForm::rewatch()
{
    // A file replaced by a rename, as every save does, is no longer watched under its name; the
    // directories tell when it comes back.
    const QStringList watched = watcher->files() + watcher->directories();
    if (!watched.isEmpty())
        watcher->removePaths(watched);
    for (const QString& path : {watchedFile, watchedSystem}) {
        if (path.isEmpty())
            continue;
        if (QFileInfo::exists(path))
            watcher->addPath(path);
        watcher->addPath(QFileInfo(path).absolutePath());
    }
}

KeysConfForm::DiskChange KeysConfForm::changedOnDisk() const
{
    if (watchedFile.isEmpty() || watchedFile != currentFile)
        return DiskChange::None;
    if (!QFileInfo::exists(watchedFile))
        return DiskChange::Vanished;
    if (digestOf(watchedFile) != watchedDigest)
        return DiskChange::EditedFile;
    if (digestOf(watchedSystem) != systemDigest)
        return DiskChange::SystemFile;
    return DiskChange::None;
}

QByteArray KeysConfForm::diskDigests() const
{
    return digestOf(watchedFile) + digestOf(watchedSystem);
}

void KeysConfForm::filesChangedOnDisk()
{
    rewatch();
    // With unsaved edits nothing is dropped: Save and Apply ask. A vanished file is told at Save.
    const DiskChange change = changedOnDisk();
    if (!modified && change != DiskChange::None && change != DiskChange::Vanished)
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

bool KeysConfForm::mayOverwrite(DiskChange change)
{
    if (change == DiskChange::None)
        return true;
    if (change == DiskChange::Vanished) {
        QMessageBox::information(
            this, tr("File changed on disk"),
            tr("%1 was deleted or renamed since it was loaded.\nIt is written anew.").arg(watchedFile),
            QMessageBox::Ok);
        return true;
    }
    // Name the file that changed: the edits may be sound for the user's file and still rest on
    // system bindings that are no longer there.
    const QString text =
        change == DiskChange::SystemFile
            ? tr("The system hotkeys file %1 was changed by another program since it was loaded.\n"
                 "Overwrite %2 with your edits, reload both and drop them, or cancel?")
                  .arg(watchedSystem, watchedFile)
            : tr("%1 was changed by another program since it was loaded.\nOverwrite it with your edits, "
                 "reload it and drop them, or cancel?")
                  .arg(watchedFile);
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
