#include "windowmenus.h"

#include "handbook.h"
#include "zemhelpmenu.h"

#include <QAction>
#include <QCoreApplication>
#include <QIcon>
#include <QMainWindow>
#include <QMenu>
#include <QMenuBar>
#include <QToolBar>
#include <QUndoStack>

namespace {

// The window's texts, in the window's translation context.
struct Texts
{
    Q_DECLARE_TR_FUNCTIONS(KeysConfForm)
};

QAction* makeAction(QObject* parent, const QString& text, const char* iconName)
{
    auto* action = new QAction(text, parent);
    if (iconName)
        action->setIcon(QIcon::fromTheme(QLatin1String(iconName)));
    return action;
}

} // namespace

WindowMenus::WindowMenus(QMainWindow* window, QUndoStack* undoStack) : window(window)
{
    createActions();
    createMenus(undoStack);
    createToolBar();
}

void WindowMenus::createActions()
{
    fileNewAction = makeAction(window, Texts::tr("&New file"), "document-new");
    fileOpenAction = makeAction(window, Texts::tr("&Open..."), "document-open");
    fileRestoreAction = makeAction(window, Texts::tr("&Restore..."), "view-refresh");
    fileRestoreAction->setToolTip(Texts::tr("Restore user's keyshortcutrc file from system one"));
    fileSaveAction = makeAction(window, Texts::tr("&Save"), "document-save");
    fileSaveAsAction = makeAction(window, Texts::tr("Save &As..."), "document-save-as");
    fileExitAction = makeAction(window, Texts::tr("E&xit"), nullptr);
    fileApplyAction = makeAction(window, Texts::tr("Apply"), "dialog-ok-apply");
    newCommandAction = makeAction(window, Texts::tr("&New action"), "edit-add");
    cloneCommandAction = makeAction(window, Texts::tr("&Clone"), "edit-copy");
    editCommandAction = makeAction(window, Texts::tr("&Edit"), "document-properties");
    editCommandAction->setShortcut(Qt::Key_Return);
    deleteCommandAction = makeAction(window, Texts::tr("&Delete"), "edit-delete");
    deleteCommandAction->setShortcut(Qt::Key_Delete);
    // The desktop's own keys for the file commands; Apply, which saves and hands over, gets
    // Ctrl+Return.
    fileNewAction->setShortcut(QKeySequence::New);
    fileOpenAction->setShortcut(QKeySequence::Open);
    fileSaveAction->setShortcut(QKeySequence::Save);
    fileSaveAsAction->setShortcut(QKeySequence::SaveAs);
    fileExitAction->setShortcut(QKeySequence::Quit);
    fileApplyAction->setShortcut(QKeySequence(Qt::CTRL | Qt::Key_Return));
    const std::pair<QAction*, const char*> names[] = {
        {fileNewAction, "fileNewAction"},
        {fileOpenAction, "fileOpenAction"},
        {fileRestoreAction, "fileRestoreAction"},
        {fileSaveAction, "fileSaveAction"},
        {fileSaveAsAction, "fileSaveAsAction"},
        {fileExitAction, "fileExitAction"},
        {fileApplyAction, "fileApplyAction"},
        {newCommandAction, "newCommandAction"},
        {cloneCommandAction, "cloneCommandAction"},
        {editCommandAction, "editCommandAction"},
        {deleteCommandAction, "deleteCommandAction"},
    };
    for (const auto& [action, name] : names)
        action->setObjectName(QLatin1String(name));
}

void WindowMenus::createMenus(QUndoStack* undoStack)
{
    menuBar = new QMenuBar(window);
    fileMenu = new QMenu(Texts::tr("&File"), menuBar);
    fileMenu->addAction(fileNewAction);
    fileMenu->addAction(fileOpenAction);
    fileMenu->addAction(fileRestoreAction);
    fileMenu->addAction(fileSaveAction);
    fileMenu->addAction(fileSaveAsAction);
    fileMenu->addAction(fileApplyAction);
    fileMenu->addSeparator();
    fileMenu->addAction(fileExitAction);
    menuBar->addMenu(fileMenu);
    QAction* undoAction = undoStack->createUndoAction(window, Texts::tr("Undo"));
    undoAction->setObjectName(QStringLiteral("undoAction"));
    undoAction->setShortcut(QKeySequence::Undo);
    QAction* redoAction = undoStack->createRedoAction(window, Texts::tr("Redo"));
    redoAction->setObjectName(QStringLiteral("redoAction"));
    redoAction->setShortcut(QKeySequence::Redo);
    revertAction = makeAction(window, Texts::tr("Revert to System Binding"), "edit-undo");
    revertAction->setObjectName(QStringLiteral("revertAction"));
    revertAction->setEnabled(false);
    QMenu* editMenu = new QMenu(Texts::tr("&Edit"), menuBar);
    editMenu->addAction(undoAction);
    editMenu->addAction(redoAction);
    editMenu->addSeparator();
    editMenu->addAction(revertAction);
    menuBar->addMenu(editMenu);
    auto* helpMenu = new ZemHelpMenu(window);
    auto* handbookAction =
        new QAction(QIcon::fromTheme(QStringLiteral("help-contents")), Texts::tr("Handbook"), window);
    handbookAction->setObjectName(QStringLiteral("handbookAction"));
    handbookAction->setShortcut(QKeySequence::HelpContents);
    QObject::connect(handbookAction, &QAction::triggered, window, [window = window] {
        auto* handbook = window->findChild<Handbook*>();
        if (!handbook)
            handbook = new Handbook(window);
        handbook->show();
        handbook->raise();
        handbook->activateWindow();
    });
    helpMenu->insertAction(helpMenu->actions().value(0), handbookAction);
    helpMenu->insertSeparator(helpMenu->actions().value(1));
    menuBar->addMenu(helpMenu);
    window->setMenuWidget(menuBar);
}

void WindowMenus::createToolBar()
{
    toolBar = new QToolBar(Texts::tr("Actions toolbar"), window);
    toolBar->setObjectName(QStringLiteral("toolbar"));
    toolBar->addAction(fileNewAction);
    toolBar->addAction(fileOpenAction);
    toolBar->addAction(fileRestoreAction);
    toolBar->addAction(fileSaveAction);
    toolBar->addAction(fileSaveAsAction);
    toolBar->addAction(fileApplyAction);
    toolBar->addSeparator();
    toolBar->addAction(newCommandAction);
    toolBar->addAction(cloneCommandAction);
    toolBar->addAction(editCommandAction);
    toolBar->addAction(deleteCommandAction);
    window->addToolBar(toolBar);
    // Buttons that show only an icon are named for screen readers and in their tool tips.
    for (QAction* action : toolBar->actions()) {
        if (action->isSeparator())
            continue;
        QWidget* button = toolBar->widgetForAction(action);
        const QString name = action->text().remove(QLatin1Char('&'));
        button->setAccessibleName(name);
        if (action != fileRestoreAction)
            action->setToolTip(name);
    }
}
