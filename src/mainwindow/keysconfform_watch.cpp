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

void KeysConfForm::watchFiles()
{
    watchedFile = currentFile;
    watchedDigest = digestOf(currentFile);
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

bool KeysConfForm::changedOnDisk() const
{
    return !watchedFile.isEmpty() && watchedFile == currentFile &&
           (digestOf(watchedFile) != watchedDigest || digestOf(watchedSystem) != systemDigest);
}

void KeysConfForm::filesChangedOnDisk()
{
    rewatch();
    // With unsaved edits nothing is dropped: Save and Apply ask. A vanished file is told at Save.
    if (!modified && changedOnDisk() && QFileInfo::exists(watchedFile))
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

bool KeysConfForm::mayOverwrite()
{
    if (watchedFile != currentFile || !changedOnDisk())
        return true;
    if (!QFileInfo::exists(watchedFile)) {
        QMessageBox::information(
            this, tr("File changed on disk"),
            tr("%1 was deleted or renamed since it was loaded.\nIt is written anew.").arg(watchedFile),
            QMessageBox::Ok);
        return true;
    }
    QMessageBox box(
        QMessageBox::Warning, tr("File changed on disk"),
        tr("%1 was changed by another program since it was loaded.\nOverwrite it with your edits, "
           "reload it and drop them, or cancel?")
            .arg(watchedFile),
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
