#pragma once

#include "editedfile.h"

#include <QMessageBox>
#include <QObject>

class QUndoStack;
class QWidget;

// The file commands and their questions: New, Open, Restore, Save, Save As, Apply and Exit, the
// question before unsaved edits are dropped, and what a change on disk asks. It works on the
// edited file and the undo stack; what it needs of the window is asked through Window.
class FileCommands : public QObject
{
    Q_OBJECT
    Q_DISABLE_COPY(FileCommands)

public:
    // What the commands ask of the window they belong to.
    class Window
    {
    public:
        virtual ~Window() = default;
        virtual QWidget* questionParent() = 0;
        virtual QString currentPath() const = 0;
        // The file the commands act on from now on; the title follows.
        virtual void setCurrentPath(const QString& path) = 0;
        virtual QString startedWith() const = 0;
        virtual bool hasUnsavedEdits() const = 0;
        // Reads the file into the tree; false, with nothing changed, when it cannot.
        virtual bool loadFile(const QString& path) = 0;
        virtual QString loadFailure() const = 0;
        virtual void fileChanged() = 0;
        // Keyless commands were given placeholder keys by a save.
        virtual void bindingsWritten() = 0;
        virtual void reloadKeepingSelection() = 0;
        // One line in the status bar.
        virtual void tell(const QString& message) = 0;
    };

    FileCommands(Window* window, EditedFile* file, QUndoStack* undo, QObject* parent);

    QMessageBox::StandardButton askSaveChanges();
    bool selectFile(bool forOpen);
    bool copyToCurrentFile(const QString& from);
    // Writes the bindings to the current file; true when there was nothing to write.
    bool saveFile();
    QString saveFailure() const { return saveError; }
    // A file saved, or chosen, since the window manager was last told to read it.
    bool isUnapplied() const { return unapplied; }
    // A file was loaded: as the window manager's own at start-up, or reloaded, it is applied.
    void loaded() { unapplied = false; }

    void fileNew();
    void fileOpen();
    void fileSave();
    void fileSaveAs();
    void fileRestore();
    void fileApply();
    void fileClose();
    void filesChangedOnDisk(EditedFile::Change change);

private:
    // After New, Open and Restore: nothing to undo, and the file counts as edited.
    void startAfresh();
    // Loads the current file; when it cannot be loaded, says so and makes previous current again.
    bool loadCurrentFileOr(const QString& previous);
    bool saveFileOrWarn();
    // Before a save: false when the file changed on disk and the user chose not to overwrite it
    // (Reload loads it as it is now).
    bool mayOverwrite(EditedFile::Change change);
    // Copies a file's bytes through the same safe write as saving; says so when it fails.
    bool copyFile(const QString& from, const QString& to);
    // Keeps the file as it is beside it, with "~" added to its name; says so when it cannot.
    bool keepBackup(const QString& path);

    Window* window;
    EditedFile* file;
    QUndoStack* undo;
    bool unapplied = false;
    EditedFile::SaveResult lastSave = EditedFile::SaveResult::Saved;
    // What was on disk when the user agreed to overwrite it.
    QByteArray acceptedDiskState;
    QString saveError;
};
