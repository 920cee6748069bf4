#pragma once

#include "editedfile.h"
#include "filecommands.h"
#include "hotkeysmodel.h"

#include <QMainWindow>
#include <QMessageBox>
#include <QStringList>

#include <memory>

class BindingTree;
class EditCommands;
class FilterBar;
class KeyPanel;
class KKeySequenceWidget;
class QAction;
class QTimer;
class QGroupBox;
class QLabel;
class QLineEdit;
class QKeySequence;
class QMenu;
class QMenuBar;
class QPoint;
class QRadioButton;
class QSessionManager;
class QToolBar;
class QTreeWidget;
class QTreeWidgetItem;
class QUndoStack;
class QVBoxLayout;

// The editor's main window: the tree of window-manager functions and command entries with
// their keys, the key panel below it, and the file commands. The bindings themselves live in a
// HotkeysModel; the tree is a view of it. There is one window per process, and its editing
// state is class-wide.
class KeysConfForm : public QMainWindow, private FileCommands::Window
{
    Q_OBJECT
    Q_DISABLE_COPY(KeysConfForm)

public:
    explicit KeysConfForm(QWidget* parent = nullptr, Qt::WindowFlags flags = Qt::WindowFlags());
    ~KeysConfForm() override;

    // The stored key of a row (QKeySequence portable text; empty: none) and its setter, which
    // keeps the shown text in step.
    static QString itemKey(const QTreeWidgetItem* row);
    static void setItemKey(QTreeWidgetItem* row, const QString& key);

    // Reads a hotkeys file (merged with the system one for the user's file) into the tree;
    // false, with nothing changed, when it cannot be read: loadFailure() then says which file
    // failed and why.
    bool loadFile(const QString& path) override;
    QString loadFailure() const override;
    // Writes the bindings to the current file; true when there was nothing to write. A failure
    // leaves the file as it was, and saveFailure() gives the reason.
    bool saveFile();
    QString saveFailure() const;
    void fillFunctionTree();
    void updateTitle();

    QMessageBox::StandardButton askSaveChanges();
    bool selectFile(bool forOpen);
    bool copyToCurrentFile(const QString& from);

    static bool isModified() { return modified; }
    static QString editedFile() { return currentFile; }
    static QString startupPath() { return startupFile; }
    static QTreeWidgetItem* commandGroup() { return commandGroupItem; }
    static QString userSourceText() { return userSource; }
    static QString systemSourceText() { return systemSource; }
    QStringList disabledKeyList() const { return model.disabledKeys(); }
    const HotkeysModel& bindings() const { return model; }

public slots:
    virtual void capturedKey(const QKeySequence& seq);
    virtual void cloneCommand();
    virtual void deleteCommand();
    virtual void editCommand();
    virtual void fileApply();
    void fileChanged() override;
    virtual void fileClose();
    virtual void fileNew();
    virtual void fileOpen();
    virtual void fileRestore();
    virtual void fileSave();
    virtual void fileSaveAs();
    virtual void grabKeys();
    virtual bool init(QString filepath);
    virtual bool isKeyPresent(const QKeySequence& seq, bool warnuser);
    virtual void itemDoubleClicked(QTreeWidgetItem* clicked, int col);
    virtual void itemSelectionChanged();
    virtual void itemSelected(QTreeWidgetItem* selected);
    virtual void newCommand();
    virtual void opt_customkey_checked();
    virtual void opt_nokeys_checked();
    virtual void setKey(const QKeySequence& seq);
    virtual void slotPopupMenu(QTreeWidgetItem* item, QPoint point, int);
    virtual QTreeWidgetItem* setActionsEnabled(QTreeWidgetItem* item);
    // The function row's rows become those the system file gives it, as one undoable step.
    void revertToSystemBinding();

    bool messageReceived(const QString& message);
    // Shows the rows the filter text matches; a row that stops matching through an edit stays
    // until the text changes or a file is loaded.
    void applyFilter();
    // The desktop session ends: unsaved edits are offered for saving as when the window closes,
    // and Cancel keeps the session from ending.
    void commitData(QSessionManager& manager);

protected:
    void closeEvent(QCloseEvent* event) override;
    void contextMenuEvent(QContextMenuEvent* event) override;

private:
    // The parts of the window, made in this order.
    void createCentralParts();
    void createMenus();
    void connectParts();
    void showHeaderMenu(const QPoint& position);
    // The tree follows every change of the bindings, with the row it is about made current.
    void followBindings(const HotkeysModel& before, BindingId focus);
    void updateRevertAction();
    void connectKeyWidget();
    void restoreWindowState();
    void saveWindowState();
    // The row the command operations act on: the first selected row, else the current one.
    QTreeWidgetItem* targetRow() const;
    BindingId bindingAt(const QTreeWidgetItem* row) const;
    // What the file commands ask of the window.
    QWidget* questionParent() override;
    QString currentPath() const override;
    void setCurrentPath(const QString& path) override;
    QString startedWith() const override;
    bool hasUnsavedEdits() const override;
    void bindingsWritten() override;
    void reloadKeepingSelection() override;
    void tell(const QString& message) override;

    QTreeWidget* keysTree = nullptr;
    QGroupBox* keyGroupBox = nullptr;
    QRadioButton* customKeyRadio = nullptr;
    KKeySequenceWidget* keyWidget = nullptr;
    QRadioButton* noKeyRadio = nullptr;
    QMenuBar* menuBar = nullptr;
    QToolBar* toolBar = nullptr;
    QMenu* fileMenu = nullptr;
    QAction* fileNewAction = nullptr;
    QAction* fileOpenAction = nullptr;
    QAction* fileRestoreAction = nullptr;
    QAction* fileSaveAction = nullptr;
    QAction* fileSaveAsAction = nullptr;
    QAction* fileExitAction = nullptr;
    QAction* fileApplyAction = nullptr;
    QAction* editCommandAction = nullptr;
    QAction* newCommandAction = nullptr;
    QAction* deleteCommandAction = nullptr;
    QAction* cloneCommandAction = nullptr;
    QVBoxLayout* mainLayout = nullptr;
    // The edited file and its bindings have one owner; model is the bindings it holds.
    EditedFile* edited;
    HotkeysModel& model;
    std::unique_ptr<BindingTree> bindingTree;
    std::unique_ptr<EditCommands> edits;
    FileCommands* files = nullptr;
    QUndoStack* undoStack = nullptr;
    QAction* revertAction = nullptr;
    bool reassignChosen = false;
    FilterBar* filterBar = nullptr;
    KeyPanel* keyPanel = nullptr;

    static QString userSource;
    static QString systemSource;
    static bool modified;
    static QTreeWidgetItem* commandGroupItem;
    static QMenu* popupMenu;
    static QString currentFile;
    static QString startupFile;
};
