#pragma once

class QAction;
class QMainWindow;
class QMenu;
class QMenuBar;
class QToolBar;
class QUndoStack;

// The window's actions, with the names the window knows them by, and the menus and the tool
// bar that hold them. What the actions do is the window's to connect.
class WindowMenus
{
public:
    WindowMenus(QMainWindow* window, QUndoStack* undoStack);

    QAction* fileNewAction = nullptr;
    QAction* fileOpenAction = nullptr;
    QAction* fileRestoreAction = nullptr;
    QAction* fileSaveAction = nullptr;
    QAction* fileSaveAsAction = nullptr;
    QAction* fileExitAction = nullptr;
    QAction* fileApplyAction = nullptr;
    QAction* newCommandAction = nullptr;
    QAction* cloneCommandAction = nullptr;
    QAction* editCommandAction = nullptr;
    QAction* deleteCommandAction = nullptr;
    QAction* revertAction = nullptr;
    QMenuBar* menuBar = nullptr;
    QMenu* fileMenu = nullptr;
    QToolBar* toolBar = nullptr;

private:
    void createActions();
    void createMenus(QUndoStack* undoStack);
    void createToolBar();

    QMainWindow* window;
};
