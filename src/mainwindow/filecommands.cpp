#include "filecommands.h"

#include "hotkeysfile.h"
#include "safefile.h"
#include "zemcore.h"
#include "zemwmcommand.h"

#include <QCoreApplication>
#include <QFileDialog>
#include <QFileInfo>
#include <QPushButton>
#include <QUndoStack>
#include <QX11Info>

#include <cstdio>

namespace {

// The window's texts, in the window's translation context.
struct Texts
{
    Q_DECLARE_TR_FUNCTIONS(KeysConfForm)
};

} // namespace

FileCommands::FileCommands(Window* window, EditedFile* file, QUndoStack* undo, QObject* parent)
    : QObject(parent), window(window), file(file), undo(undo)
{
}

void FileCommands::startAfresh()
{
    // The file as it now stands counts as edited: Save rewrites it and Apply hands it over.
    unapplied = true;
    undo->clear();
    undo->resetClean();
    window->fileChanged();
}

QMessageBox::StandardButton FileCommands::askSaveChanges()
{
    if (!window->hasUnsavedEdits())
        return QMessageBox::No;
    const QMessageBox::StandardButton answer = QMessageBox::warning(
        window->questionParent(), Texts::tr("Save ?"), Texts::tr("Save previous changes?"),
        QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel);
    if (answer == QMessageBox::Cancel)
        return QMessageBox::Cancel;
    if (answer != QMessageBox::Yes)
        return QMessageBox::No;
    fileSave();
    // A save that failed keeps the edits marked unsaved: whatever was to follow must not
    // discard them.
    return window->hasUnsavedEdits() ? QMessageBox::Cancel : QMessageBox::Yes;
}

bool FileCommands::selectFile(bool forOpen)
{
    const QString startDir = QString::fromStdString(GetZemDir(ZEM_USER_CONFIG_DIR));
    const QString caption = Texts::tr("Select hotkeys file");
    const QString chosen =
        forOpen
            ? QFileDialog::getOpenFileName(window->questionParent(), caption, startDir, QStringLiteral("*"))
            : QFileDialog::getSaveFileName(window->questionParent(), caption, startDir, QStringLiteral("*"));
    if (chosen.isEmpty())
        return false;
    window->setCurrentPath(chosen);
    if (forOpen || QFileInfo::exists(window->currentPath()))
        return true;

    QString reason;
    if (!writeFileSafely(window->currentPath(), QByteArray(), &reason)) {
        QMessageBox::warning(window->questionParent(), Texts::tr("Error"),
                             Texts::tr("Can't create file ") + window->currentPath() + QLatin1Char('\n') +
                                 reason,
                             QMessageBox::Ok);
        return false;
    }
    return true;
}

bool FileCommands::copyFile(const QString& from, const QString& to)
{
    // The copy goes through the same all-or-nothing write as saving: a full disk leaves the
    // file it was to replace as it was; and it waits for any other writer of the target.
    if (file->copy(from, to))
        return true;
    QMessageBox::warning(window->questionParent(), Texts::tr("Error"),
                         Texts::tr("Can't copy %1\nto %2").arg(from, to) + QLatin1Char('\n') + file->error(),
                         QMessageBox::Ok);
    return false;
}

bool FileCommands::keepBackup(const QString& path)
{
    // The replaced file stays beside it, so that even a confirmed Restore can be taken back.
    if (file->keepBackup(path))
        return true;
    QMessageBox::warning(window->questionParent(), Texts::tr("Error"),
                         Texts::tr("Can't copy %1\nto %2").arg(path, path + QLatin1Char('~')) +
                             QLatin1Char('\n') + file->error(),
                         QMessageBox::Ok);
    return false;
}

bool FileCommands::copyToCurrentFile(const QString& from)
{
    return copyFile(from, window->currentPath());
}

bool FileCommands::saveFile()
{
    lastSave = EditedFile::SaveResult::Saved;
    if (!window->hasUnsavedEdits())
        return true;
    if (window->currentPath().isEmpty()) {
        saveError = Texts::tr("No file name");
        lastSave = EditedFile::SaveResult::Failed;
        return false;
    }
    // The bindings go to the file the commands chose last.
    if (file->path() != window->currentPath())
        file->setPath(window->currentPath());
    lastSave = file->save(acceptedDiskState);
    // Keyless commands have been given their placeholder keys.
    window->bindingsWritten();
    saveError = file->error();
    if (lastSave == EditedFile::SaveResult::Failed)
        std::fprintf(stderr, "zem-admin-hotkeys: Can't save file %s\n",
                     printableText(window->currentPath()).toLocal8Bit().constData());
    return lastSave == EditedFile::SaveResult::Saved;
}

void FileCommands::fileNew()
{
    if (askSaveChanges() == QMessageBox::Cancel)
        return;
    const QString previous = window->currentPath();
    if (!selectFile(false))
        return;
    copyToCurrentFile(previous);
    startAfresh();
}

void FileCommands::fileOpen()
{
    if (askSaveChanges() == QMessageBox::Cancel)
        return;
    const QString previous = window->currentPath();
    if (!selectFile(true))
        return;
    if (loadCurrentFileOr(previous))
        startAfresh();
}

bool FileCommands::loadCurrentFileOr(const QString& previous)
{
    if (window->loadFile(window->currentPath()))
        return true;
    // The tree still shows the previous file: it stays the one that Save writes.
    window->setCurrentPath(previous);
    QMessageBox::warning(window->questionParent(), Texts::tr("Attention"),
                         Texts::tr("Can't parse file:\n%1").arg(window->loadFailure()), QMessageBox::Ok);
    return false;
}

bool FileCommands::saveFileOrWarn()
{
    // Another program may write the file at any moment: whether it did is asked under the lock
    // that every writer of this program takes, and the lock is held until the file is replaced.
    // The user is asked with the lock let go, so that the others are not kept waiting.
    acceptedDiskState.clear();
    if (window->hasUnsavedEdits() && window->currentPath() == file->path() &&
        file->change() == EditedFile::Change::Vanished)
        mayOverwrite(EditedFile::Change::Vanished);
    while (!saveFile()) {
        if (lastSave != EditedFile::SaveResult::Changed)
            break;
        const QByteArray seen = file->diskState();
        if (!mayOverwrite(file->change()))
            return false;
        acceptedDiskState = seen;
    }
    if (lastSave == EditedFile::SaveResult::Saved)
        return true;
    // The system's reason goes on a line of its own.
    QMessageBox::warning(window->questionParent(), Texts::tr("Error"),
                         Texts::tr("Can't save in file ") + window->currentPath() + QLatin1Char('\n') +
                             saveError,
                         QMessageBox::Ok);
    return false;
}

void FileCommands::fileSave()
{
    // A failed save keeps the edits marked unsaved, so that they are still offered for saving.
    if (saveFileOrWarn()) {
        unapplied = true;
        undo->setClean();
        window->fileChanged();
        window->tell(Texts::tr("Saved %1").arg(QFileInfo(window->currentPath()).fileName()));
    }
}

void FileCommands::fileSaveAs()
{
    const QString previous = window->currentPath();
    if (!selectFile(false))
        return;
    copyToCurrentFile(previous);
    fileSave();
}

void FileCommands::fileRestore()
{
    // One click would otherwise wipe every binding the user ever saved.
    if (QMessageBox::question(
            window->questionParent(), Texts::tr("Restore"),
            Texts::tr("Replace your hotkeys file with the system one?\nAll your own bindings in it will "
                      "be lost."),
            QMessageBox::Yes | QMessageBox::Cancel) != QMessageBox::Yes)
        return;
    if (window->hasUnsavedEdits() &&
        QMessageBox::question(window->questionParent(), Texts::tr("Save ?"),
                              Texts::tr("All changes will be lost. Save them?"),
                              QMessageBox::Yes | QMessageBox::No) == QMessageBox::Yes)
        fileSaveAs();

    const QString previous = window->currentPath();
    window->setCurrentPath(userHotkeysFilePath());
    if (!keepBackup(window->currentPath())) {
        window->setCurrentPath(previous);
        return;
    }
    copyToCurrentFile(systemHotkeysFilePath());
    if (loadCurrentFileOr(previous))
        startAfresh();
}

void FileCommands::fileApply()
{
    QString problem;
    const QByteArray command = reloadCommandFor(window->currentPath(), &problem);
    if (command.isEmpty()) {
        QMessageBox::warning(
            window->questionParent(), Texts::tr("Error"),
            Texts::tr("The window manager cannot be told to use this file.\nSave it under another "
                      "name.") +
                QLatin1Char('\n') + problem,
            QMessageBox::Ok);
        return;
    }
    // Nothing is handed to the window manager that was not written.
    if (!saveFileOrWarn())
        return;
    undo->setClean();
    window->fileChanged();

    if (window->currentPath() != window->startedWith()) {
        QMessageBox::warning(window->questionParent(), Texts::tr("Warning"),
                             Texts::tr("You current file is \"%1\".\nAfter restart zem-wm will use \"%2\".")
                                 .arg(window->currentPath(), window->startedWith()),
                             QMessageBox::Ok);
    }
    if (!SendCommandToWM(QX11Info::display(), command.constData())) {
        QMessageBox::warning(
            window->questionParent(), Texts::tr("Error"),
            Texts::tr("The window manager could not be told to reload %1.").arg(window->currentPath()),
            QMessageBox::Ok);
        return;
    }
    unapplied = false;
    window->fileChanged();
    window->tell(Texts::tr("The window manager was told to reload %1")
                     .arg(QFileInfo(window->currentPath()).fileName()));
}

void FileCommands::fileClose()
{
    if (askSaveChanges() == QMessageBox::Cancel)
        return;
    QCoreApplication::quit();
}

void FileCommands::filesChangedOnDisk(EditedFile::Change change)
{
    // With unsaved edits nothing is dropped: Save and Apply ask. A vanished file is told at Save.
    if (!window->hasUnsavedEdits() && change != EditedFile::Change::None &&
        change != EditedFile::Change::Vanished)
        window->reloadKeepingSelection();
}

bool FileCommands::mayOverwrite(EditedFile::Change change)
{
    if (change == EditedFile::Change::None)
        return true;
    if (change == EditedFile::Change::Vanished) {
        QMessageBox::information(
            window->questionParent(), Texts::tr("File changed on disk"),
            Texts::tr("%1 was deleted or renamed since it was loaded.\nIt is written anew.")
                .arg(window->currentPath()),
            QMessageBox::Ok);
        return true;
    }
    // Name the file that changed: the edits may be sound for the user's file and still rest on
    // system bindings that are no longer there.
    const QString text =
        change == EditedFile::Change::SystemFile
            ? Texts::tr("The system hotkeys file %1 was changed by another program since it was loaded.\n"
                        "Overwrite %2 with your edits, reload both and drop them, or cancel?")
                  .arg(file->systemPath(), window->currentPath())
            : Texts::tr(
                  "%1 was changed by another program since it was loaded.\nOverwrite it with your edits, "
                  "reload it and drop them, or cancel?")
                  .arg(window->currentPath());
    QMessageBox box(QMessageBox::Warning, Texts::tr("File changed on disk"), text,
                    QMessageBox::Save | QMessageBox::Discard | QMessageBox::Cancel, window->questionParent());
    box.button(QMessageBox::Save)->setText(Texts::tr("Overwrite"));
    box.button(QMessageBox::Discard)->setText(Texts::tr("Reload"));
    box.setDefaultButton(QMessageBox::Cancel);
    const int answer = box.exec();
    if (answer == QMessageBox::Save)
        return true;
    if (answer == QMessageBox::Discard)
        window->reloadKeepingSelection();
    return false;
}
