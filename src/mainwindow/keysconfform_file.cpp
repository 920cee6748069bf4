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
#include <QStatusBar>
#include <QTimer>
#include <QTreeWidget>
#include <QUndoStack>
#include <QX11Info>

#include <cstdio>

void KeysConfForm::updateTitle()
{
    QString title = tr("Zem hotkeys editor");
    const QString name = QFileInfo(currentFile).fileName();
    if (!name.isEmpty())
        title += QLatin1String(" - ") + name;
    // The unsaved mark stands in the title only while there are unsaved edits.
    setWindowTitle(title + QLatin1String("[*]"));
    setWindowIconText(tr("Zem hotkeys editor"));
}

void KeysConfForm::fileChanged()
{
    // Unsaved edits are the steps between the clean state of the undo stack and now.
    modified = !undoStack->isClean();
    fileSaveAction->setEnabled(modified);
    // A file saved but not yet handed to the window manager still has something to apply.
    fileApplyAction->setEnabled(modified || unapplied);
    setWindowModified(modified);
    updateRevertAction();
}

void KeysConfForm::startAfresh()
{
    // The file as it now stands counts as edited: Save rewrites it and Apply hands it over.
    unapplied = true;
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
    // The copy goes through the same all-or-nothing write as saving: a full disk leaves the
    // file it was to replace as it was; and it waits for any other writer of the target.
    if (edited->copy(from, to))
        return true;
    QMessageBox::warning(this, tr("Error"),
                         tr("Can't copy %1\nto %2").arg(from, to) + QLatin1Char('\n') + edited->error(),
                         QMessageBox::Ok);
    return false;
}

bool KeysConfForm::keepBackup(const QString& path)
{
    // The replaced file stays beside it, so that even a confirmed Restore can be taken back.
    if (edited->keepBackup(path))
        return true;
    QMessageBox::warning(this, tr("Error"),
                         tr("Can't copy %1\nto %2").arg(path, path + QLatin1Char('~')) + QLatin1Char('\n') +
                             edited->error(),
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
    if (!edited->load(path)) {
        std::fprintf(stderr, "zem-admin-hotkeys: %s: %s\n",
                     printableText(edited->failedPath()).toLocal8Bit().constData(),
                     edited->error().toLocal8Bit().constData());
        return false;
    }
    std::fprintf(stderr, "files %s %s\n", path.toLocal8Bit().constData(),
                 edited->systemPath().toLocal8Bit().constData());

    currentFile = path;
    updateTitle();
    keysTree->setUpdatesEnabled(false);
    fillFunctionTree();
    keysTree->setUpdatesEnabled(true);
    // A new tree shows what the filter asks for; what the filter looks at is made while the
    // user has not begun to type, so that the first keystroke does not wait for it.
    applyFilter();
    QTimer::singleShot(0, this, [this] { bindingTree->searchRows(); });
    // A loaded file has nothing to undo and no unsaved edits; as the window manager's own
    // file at start-up, or reloaded because it changed, it counts as applied.
    unapplied = false;
    undoStack->clear();
    fileChanged();
    return true;
}

QString KeysConfForm::loadFailure() const
{
    const QString why = edited->error();
    return why.isEmpty() ? edited->failedPath() : edited->failedPath() + QLatin1Char('\n') + why;
}

bool KeysConfForm::saveFile()
{
    lastSave = EditedFile::SaveResult::Saved;
    if (!modified)
        return true;
    if (currentFile.isEmpty()) {
        saveError = tr("No file name");
        lastSave = EditedFile::SaveResult::Failed;
        return false;
    }
    // The bindings go to the file the commands chose last.
    if (edited->path() != currentFile)
        edited->setPath(currentFile);
    lastSave = edited->save(acceptedDiskState);
    // Keyless commands have been given their placeholder keys.
    bindingTree->refreshCommands();
    saveError = edited->error();
    if (lastSave == EditedFile::SaveResult::Failed)
        std::fprintf(stderr, "zem-admin-hotkeys: Can't save file %s\n",
                     printableText(currentFile).toLocal8Bit().constData());
    return lastSave == EditedFile::SaveResult::Saved;
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
    // The user is asked with the lock let go, so that the others are not kept waiting.
    acceptedDiskState.clear();
    if (modified && currentFile == edited->path() && edited->change() == EditedFile::Change::Vanished)
        mayOverwrite(EditedFile::Change::Vanished);
    while (!saveFile()) {
        if (lastSave != EditedFile::SaveResult::Changed)
            break;
        const QByteArray seen = edited->diskState();
        if (!mayOverwrite(edited->change()))
            return false;
        acceptedDiskState = seen;
    }
    if (lastSave == EditedFile::SaveResult::Saved)
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
        unapplied = true;
        undoStack->setClean();
        fileChanged();
        statusBar()->showMessage(tr("Saved %1").arg(QFileInfo(currentFile).fileName()));
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
    if (!SendCommandToWM(QX11Info::display(), command.constData())) {
        QMessageBox::warning(this, tr("Error"),
                             tr("The window manager could not be told to reload %1.").arg(currentFile),
                             QMessageBox::Ok);
        return;
    }
    unapplied = false;
    fileChanged();
    statusBar()->showMessage(
        tr("The window manager was told to reload %1").arg(QFileInfo(currentFile).fileName()));
}

void KeysConfForm::fileClose()
{
    if (askSaveChanges() == QMessageBox::Cancel)
        return;
    QCoreApplication::quit();
}
