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
    fileApplyAction->setEnabled(modified || files->isUnapplied());
    setWindowModified(modified);
    updateRevertAction();
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
    files->loaded();
    undoStack->clear();
    fileChanged();
    return true;
}

QString KeysConfForm::loadFailure() const
{
    const QString why = edited->error();
    return why.isEmpty() ? edited->failedPath() : edited->failedPath() + QLatin1Char('\n') + why;
}

// The file commands are a part of their own; the slots of the window hand them over.
QMessageBox::StandardButton KeysConfForm::askSaveChanges()
{
    return files->askSaveChanges();
}

bool KeysConfForm::selectFile(bool forOpen)
{
    return files->selectFile(forOpen);
}

bool KeysConfForm::copyToCurrentFile(const QString& from)
{
    return files->copyToCurrentFile(from);
}

bool KeysConfForm::saveFile()
{
    return files->saveFile();
}

QString KeysConfForm::saveFailure() const
{
    return files->saveFailure();
}

void KeysConfForm::fileNew()
{
    files->fileNew();
}

void KeysConfForm::fileOpen()
{
    files->fileOpen();
}

void KeysConfForm::fileSave()
{
    files->fileSave();
}

void KeysConfForm::fileSaveAs()
{
    files->fileSaveAs();
}

void KeysConfForm::fileRestore()
{
    files->fileRestore();
}

void KeysConfForm::fileApply()
{
    files->fileApply();
}

void KeysConfForm::fileClose()
{
    files->fileClose();
}

QWidget* KeysConfForm::questionParent()
{
    return this;
}

QString KeysConfForm::currentPath() const
{
    return currentFile;
}

void KeysConfForm::setCurrentPath(const QString& path)
{
    currentFile = path;
    updateTitle();
}

QString KeysConfForm::startedWith() const
{
    return startupFile;
}

bool KeysConfForm::hasUnsavedEdits() const
{
    return modified;
}

void KeysConfForm::bindingsWritten()
{
    bindingTree->refreshCommands();
}

void KeysConfForm::tell(const QString& message)
{
    statusBar()->showMessage(message);
}

void KeysConfForm::reloadKeepingSelection()
{
    // The selected binding as it can be found again among the bindings read anew: its function
    // or command line, and which of the rows of that name it is.
    const auto named = [this](const Binding& like) {
        QVector<BindingId> ids;
        for (const Binding* row : model.rows()) {
            if (row->function == like.function && (like.function >= 0 || row->command == like.command))
                ids << row->id;
        }
        return ids;
    };
    const Binding* selected = model.find(bindingAt(keysTree->currentItem()));
    const Binding kept = selected ? *selected : Binding();
    const int index = selected ? named(kept).indexOf(selected->id) : -1;
    if (!loadFile(currentFile) || index < 0)
        return;
    const QVector<BindingId> ids = named(kept);
    if (index < ids.size())
        keysTree->setCurrentItem(bindingTree->rowOf(ids.at(index)));
}
