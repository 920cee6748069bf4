#include "keysconfform.h"

#include "bindingtree.h"
#include "hotkeysfile.h"
#include "safefile.h"
#include "zemcore.h"
#include "zemwmcommand.h"

#include <QAction>
#include <QCoreApplication>
#include <QFileDialog>
#include <QFileInfo>
#include <QMessageBox>
#include <QTimer>
#include <QTreeWidget>
#include <QUndoStack>
#include <QX11Info>

#include <cstdio>
#include <sys/stat.h>

void KeysConfForm::updateTitle()
{
    QString title = tr("Zem hotkeys editor");
    const QString name = QFileInfo(currentFile).fileName();
    if (!name.isEmpty())
        title += QLatin1String(" - ") + name;
    setWindowTitle(title);
    setWindowIconText(tr("Zem hotkeys editor"));
}

void KeysConfForm::fileChanged()
{
    // Unsaved edits are the steps between the clean state of the undo stack and now.
    modified = !undoStack->isClean();
    fileSaveAction->setEnabled(modified);
    fileApplyAction->setEnabled(modified);
    updateRevertAction();
}

void KeysConfForm::startAfresh()
{
    // The file as it now stands counts as edited: Save rewrites it and Apply hands it over.
    undoStack->clear();
    undoStack->resetClean();
    fileChanged();
}

QMessageBox::StandardButton KeysConfForm::askSaveChanges()
{
    if (!modified)
        return QMessageBox::No;
    const QMessageBox::StandardButton answer =
        QMessageBox::warning(this, tr("Save ?"), tr("Save previous changes?"),
                             QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel);
    if (answer == QMessageBox::Cancel)
        return QMessageBox::Cancel;
    if (answer != QMessageBox::Yes)
        return QMessageBox::No;
    fileSave();
    // A save that failed keeps the edits marked unsaved: whatever was to follow must not
    // discard them.
    return modified ? QMessageBox::Cancel : QMessageBox::Yes;
}

bool KeysConfForm::selectFile(bool forOpen)
{
    const QString startDir = QString::fromStdString(GetZemDir(ZEM_USER_CONFIG_DIR));
    const QString caption = tr("Select hotkeys file");
    const QString chosen = forOpen
                               ? QFileDialog::getOpenFileName(this, caption, startDir, QStringLiteral("*"))
                               : QFileDialog::getSaveFileName(this, caption, startDir, QStringLiteral("*"));
    if (chosen.isEmpty())
        return false;
    currentFile = chosen;
    updateTitle();
    if (forOpen || QFileInfo::exists(currentFile))
        return true;

    QString reason;
    if (!writeFileSafely(currentFile, QByteArray(), &reason)) {
        QMessageBox::warning(this, tr("Error"),
                             tr("Can't create file ") + currentFile + QLatin1Char('\n') + reason,
                             QMessageBox::Ok);
        return false;
    }
    return true;
}

bool KeysConfForm::copyFile(const QString& from, const QString& to)
{
    // Copying a file onto itself would change nothing.
    const QString source = QFileInfo(from).canonicalFilePath();
    if (!source.isEmpty() && source == QFileInfo(to).canonicalFilePath())
        return true;
    // The copy goes through the same all-or-nothing write as saving: a full disk leaves the
    // file it was to replace as it was; and it waits for any other writer of the target.
    QFile file(from);
    QString reason;
    QByteArray bytes;
    DirectoryLock lock;
    if (!file.open(QIODevice::ReadOnly)) {
        reason = file.errorString();
    } else {
        bytes = file.read(largestHotkeysFile + 1);
        if (file.error() != QFileDevice::NoError)
            reason = file.errorString();
        else if (bytes.size() > largestHotkeysFile)
            reason = tr("The file is larger than 16 MiB");
    }
    if (reason.isEmpty() && lock.lock(to, &reason) && writeFileSafely(to, bytes, &reason))
        return true;
    QMessageBox::warning(this, tr("Error"),
                         tr("Can't copy %1\nto %2").arg(from, to) + QLatin1Char('\n') + reason,
                         QMessageBox::Ok);
    return false;
}

bool KeysConfForm::keepBackup(const QString& path)
{
    // The replaced file stays beside it, so that even a confirmed Restore can be taken back. The
    // backup is a new file renamed into place: whatever stands under its name, a link another
    // account planted included, is replaced and never written through, and it is as private
    // as the file it keeps.
    QString reason;
    QByteArray bytes;
    struct stat info;
    if (!QFileInfo::exists(path))
        return true;
    if (readHotkeysFile(path, &bytes, &reason) && ::stat(QFile::encodeName(path).constData(), &info) == 0 &&
        writeNewFile(path + QLatin1Char('~'), bytes, info.st_mode, &reason))
        return true;
    QMessageBox::warning(this, tr("Error"),
                         tr("Can't copy %1\nto %2").arg(path, path + QLatin1Char('~')) + QLatin1Char('\n') +
                             reason,
                         QMessageBox::Ok);
    return false;
}

bool KeysConfForm::copyToCurrentFile(const QString& from)
{
    return copyFile(from, currentFile);
}

bool KeysConfForm::loadFile(const QString& path)
{
    if (path.isEmpty())
        return false;
    const QString systemPath = path == userHotkeysFilePath() ? systemHotkeysFilePath() : QString();
    if (!model.load(path, systemPath, &failedPath, &loadError)) {
        std::fprintf(stderr, "zem-admin-hotkeys: %s: %s\n",
                     printableText(failedPath).toLocal8Bit().constData(),
                     loadError.toLocal8Bit().constData());
        return false;
    }
    std::fprintf(stderr, "files %s %s\n", path.toLocal8Bit().constData(),
                 systemPath.toLocal8Bit().constData());

    currentFile = path;
    updateTitle();
    keysTree->setUpdatesEnabled(false);
    fillFunctionTree();
    keysTree->setUpdatesEnabled(true);
    // A new tree shows what the filter asks for; what the filter looks at is made while the
    // user has not begun to type, so that the first keystroke does not wait for it.
    applyFilter();
    QTimer::singleShot(0, this, [this] { bindingTree->searchRows(); });
    // A loaded file has nothing to undo and no unsaved edits.
    undoStack->clear();
    fileChanged();
    watchFiles(model.readBytes());
    return true;
}

QString KeysConfForm::loadFailure() const
{
    return loadError.isEmpty() ? failedPath : failedPath + QLatin1Char('\n') + loadError;
}

bool KeysConfForm::saveFile()
{
    if (!modified)
        return true;
    if (currentFile.isEmpty()) {
        saveError = tr("No file name");
        return false;
    }
    QByteArray bytes;
    const bool composed = model.toBytes(currentFile == userHotkeysFilePath(), &bytes, &saveError);
    // Keyless commands have been given their placeholder keys.
    bindingTree->refreshCommands();
    if (!composed || !writeFileSafely(currentFile, bytes, &saveError)) {
        std::fprintf(stderr, "zem-admin-hotkeys: Can't save file %s\n",
                     printableText(currentFile).toLocal8Bit().constData());
        return false;
    }
    saveError.clear();
    watchFiles(bytes);
    return true;
}

void KeysConfForm::fileNew()
{
    if (askSaveChanges() == QMessageBox::Cancel)
        return;
    const QString previous = currentFile;
    if (!selectFile(false))
        return;
    copyToCurrentFile(previous);
    startAfresh();
}

void KeysConfForm::fileOpen()
{
    if (askSaveChanges() == QMessageBox::Cancel)
        return;
    const QString previous = currentFile;
    if (!selectFile(true))
        return;
    if (loadCurrentFileOr(previous))
        startAfresh();
}

bool KeysConfForm::loadCurrentFileOr(const QString& previous)
{
    if (loadFile(currentFile))
        return true;
    // The tree still shows the previous file: it stays the one that Save writes.
    currentFile = previous;
    updateTitle();
    QMessageBox::warning(this, tr("Attention"), tr("Can't parse file:\n%1").arg(loadFailure()),
                         QMessageBox::Ok);
    return false;
}

bool KeysConfForm::saveFileOrWarn()
{
    // Another program may write the file at any moment: whether it did is asked under the lock
    // that every writer of this program takes, and the lock is held until the file is replaced.
    // It is let go while the user is asked, so that the others are not kept waiting.
    DirectoryLock lock;
    QByteArray accepted;
    while (modified) {
        if (!lock.lock(currentFile, &saveError))
            break;
        const DiskChange change = changedOnDisk();
        if (change == DiskChange::None || diskDigests() == accepted)
            break;
        accepted = diskDigests();
        lock.unlock();
        if (!mayOverwrite(change))
            return false;
    }
    if ((!modified || lock.isLocked()) && saveFile())
        return true;
    // The system's reason goes on a line of its own.
    QMessageBox::warning(this, tr("Error"),
                         tr("Can't save in file ") + currentFile + QLatin1Char('\n') + saveError,
                         QMessageBox::Ok);
    return false;
}

void KeysConfForm::fileSave()
{
    // A failed save keeps the edits marked unsaved, so that they are still offered for saving.
    if (saveFileOrWarn()) {
        undoStack->setClean();
        fileChanged();
    }
}

void KeysConfForm::fileSaveAs()
{
    const QString previous = currentFile;
    if (!selectFile(false))
        return;
    copyToCurrentFile(previous);
    fileSave();
}

void KeysConfForm::fileRestore()
{
    // One click would otherwise wipe every binding the user ever saved.
    if (QMessageBox::question(
            this, tr("Restore"),
            tr("Replace your hotkeys file with the system one?\nAll your own bindings in it will "
               "be lost."),
            QMessageBox::Yes | QMessageBox::Cancel) != QMessageBox::Yes)
        return;
    if (modified && QMessageBox::question(this, tr("Save ?"), tr("All changes will be lost. Save them?"),
                                          QMessageBox::Yes | QMessageBox::No) == QMessageBox::Yes)
        fileSaveAs();

    const QString previous = currentFile;
    currentFile = userHotkeysFilePath();
    if (!keepBackup(currentFile)) {
        currentFile = previous;
        return;
    }
    copyToCurrentFile(systemHotkeysFilePath());
    if (loadCurrentFileOr(previous))
        startAfresh();
}

void KeysConfForm::fileApply()
{
    QString problem;
    const QByteArray command = reloadCommandFor(currentFile, &problem);
    if (command.isEmpty()) {
        QMessageBox::warning(this, tr("Error"),
                             tr("The window manager cannot be told to use this file.\nSave it under another "
                                "name.") +
                                 QLatin1Char('\n') + problem,
                             QMessageBox::Ok);
        return;
    }
    // Nothing is handed to the window manager that was not written.
    if (!saveFileOrWarn())
        return;
    undoStack->setClean();
    fileChanged();

    if (currentFile != startupFile) {
        QMessageBox::warning(this, tr("Warning"),
                             tr("You current file is \"%1\".\nAfter restart zem-wm will use \"%2\".")
                                 .arg(currentFile, startupFile),
                             QMessageBox::Ok);
    }
    if (!SendCommandToWM(QX11Info::display(), command.constData()))
        QMessageBox::warning(this, tr("Error"),
                             tr("The window manager could not be told to reload %1.").arg(currentFile),
                             QMessageBox::Ok);
}

void KeysConfForm::fileClose()
{
    if (askSaveChanges() == QMessageBox::Cancel)
        return;
    QCoreApplication::quit();
}
