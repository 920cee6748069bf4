#include "keysconfform.h"

#include "bindingtree.h"
#include "editcommands.h"
#include "filterbar.h"
#include "hotkeysfile.h"
#include "keypanel.h"
#include "kkeysequencewidget.h"
#include "modelcommand.h"
#include "windowmenus.h"

#include <QAction>
#include <QButtonGroup>
#include <QCloseEvent>
#include <QContextMenuEvent>
#include <QFileSystemWatcher>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QLabel>
#include <QMenu>
#include <QMenuBar>
#include <QRadioButton>
#include <QScreen>
#include <QSessionManager>
#include <QSettings>
#include <QStatusBar>
#include <QTimer>
#include <QTreeWidget>
#include <QTreeWidgetItemIterator>
#include <QUndoStack>
#include <QVBoxLayout>

QString KeysConfForm::userSource;
QString KeysConfForm::systemSource;
bool KeysConfForm::modified = false;
QTreeWidgetItem* KeysConfForm::commandGroupItem = nullptr;
QMenu* KeysConfForm::popupMenu = nullptr;
QString KeysConfForm::currentFile;
QString KeysConfForm::startupFile;

KeysConfForm::KeysConfForm(QWidget* parent, Qt::WindowFlags flags)
    : QMainWindow(parent, flags), edited(new EditedFile(this)), model(edited->model())
{
    setWindowTitle(tr("Zem hotkeys editor"));
    userSource = tr("user");
    systemSource = tr("system");
    // Every edit is a step that can be taken back.
    undoStack = new QUndoStack(this);
    files = new FileCommands(this, edited, undoStack, this);

    createCentralParts();
    createMenus();
    connectParts();
}

void KeysConfForm::createCentralParts()
{
    auto* central = new QWidget(this);
    setCentralWidget(central);
    mainLayout = new QVBoxLayout(central);

    keysTree = new QTreeWidget(central);
    keysTree->setObjectName(QStringLiteral("keysTree"));
    //: Spoken by screen readers for the tree of bindings.
    keysTree->setAccessibleName(tr("Bindings"));
    keysTree->setSortingEnabled(false);
    keysTree->setHeaderLabels({tr("Action"), tr("Current Key"), tr("zem-wm function"), tr("Source")});
    // The tree takes the room there is and scrolls, so that the window fits small screens.
    keysTree->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Expanding);
    keysTree->setAllColumnsShowFocus(true);
    keysTree->header()->setContextMenuPolicy(Qt::CustomContextMenu);
    connect(keysTree->header(), &QHeaderView::customContextMenuRequested, this,
            &KeysConfForm::showHeaderMenu);
    mainLayout->addWidget(keysTree);
    bindingTree = std::make_unique<BindingTree>(keysTree, &model);
    bindingTree->setSourceTexts(userSource, systemSource);
    edits = std::make_unique<EditCommands>(edited, undoStack,
                                           [this](BindingId id) { return bindingTree->actionText(id); });
    filterBar = new FilterBar(keysTree, bindingTree.get(), &model, central);
    mainLayout->insertWidget(0, filterBar);
    statusBar()->addPermanentWidget(filterBar->countLabel());
    connect(filterBar, &FilterBar::selectionHidden, this, [this] { itemSelected(nullptr); });
    connect(filterBar, &FilterBar::found, this, [this](const QString& message) {
        if (message.isEmpty())
            statusBar()->clearMessage();
        else
            statusBar()->showMessage(message);
    });

    keyPanel = new KeyPanel(central);
    keyGroupBox = keyPanel;
    customKeyRadio = keyPanel->assignRadio();
    keyWidget = keyPanel->recorder();
    noKeyRadio = keyPanel->clearRadio();
    mainLayout->addWidget(keyPanel);
}

void KeysConfForm::createMenus()
{
    const WindowMenus menus(this, undoStack);
    fileNewAction = menus.fileNewAction;
    fileOpenAction = menus.fileOpenAction;
    fileRestoreAction = menus.fileRestoreAction;
    fileSaveAction = menus.fileSaveAction;
    fileSaveAsAction = menus.fileSaveAsAction;
    fileExitAction = menus.fileExitAction;
    fileApplyAction = menus.fileApplyAction;
    newCommandAction = menus.newCommandAction;
    cloneCommandAction = menus.cloneCommandAction;
    editCommandAction = menus.editCommandAction;
    deleteCommandAction = menus.deleteCommandAction;
    revertAction = menus.revertAction;
    menuBar = menus.menuBar;
    fileMenu = menus.fileMenu;
    toolBar = menus.toolBar;
}

void KeysConfForm::connectParts()
{
    // The order matters: a recorded key marks the document modified before it is assigned.
    connect(fileNewAction, &QAction::triggered, this, &KeysConfForm::fileNew);
    connect(fileOpenAction, &QAction::triggered, this, &KeysConfForm::fileOpen);
    connect(fileRestoreAction, &QAction::triggered, this, &KeysConfForm::fileRestore);
    connect(fileSaveAction, &QAction::triggered, this, &KeysConfForm::fileSave);
    connect(fileSaveAsAction, &QAction::triggered, this, &KeysConfForm::fileSaveAs);
    connect(fileExitAction, &QAction::triggered, this, &KeysConfForm::fileClose);
    connect(noKeyRadio, &QRadioButton::clicked, this, &KeysConfForm::opt_nokeys_checked);
    connect(keysTree, &QTreeWidget::itemDoubleClicked, this, &KeysConfForm::itemDoubleClicked);
    connect(keysTree, &QTreeWidget::itemSelectionChanged, this, &KeysConfForm::itemSelectionChanged);
    connect(customKeyRadio, &QRadioButton::clicked, this, &KeysConfForm::opt_customkey_checked);
    connectKeyWidget();
    connect(deleteCommandAction, &QAction::triggered, this, &KeysConfForm::deleteCommand);
    connect(editCommandAction, &QAction::triggered, this, &KeysConfForm::editCommand);
    connect(newCommandAction, &QAction::triggered, this, &KeysConfForm::newCommand);
    connect(fileApplyAction, &QAction::triggered, this, &KeysConfForm::fileApply);
    connect(cloneCommandAction, &QAction::triggered, this, &KeysConfForm::cloneCommand);
    connect(revertAction, &QAction::triggered, this, &KeysConfForm::revertToSystemBinding);
    connect(undoStack, &QUndoStack::indexChanged, this, &KeysConfForm::fileChanged);
    connect(edited, &EditedFile::changedOnDisk, files, &FileCommands::filesChangedOnDisk);
    connect(edited, &EditedFile::bindingsChanged, this, &KeysConfForm::followBindings);
}

KeysConfForm::~KeysConfForm()
{
    // The stack says it is emptied as it goes, when this window is no longer one.
    undoStack->disconnect(this);
    saveWindowState();
    // The class-wide pointers must not outlive the rows and menus they point into.
    commandGroupItem = nullptr;
    popupMenu = nullptr;
}

void KeysConfForm::connectKeyWidget()
{
    connect(keyWidget, &KKeySequenceWidget::keySequenceChanged, this, &KeysConfForm::fileChanged);
    connect(keyWidget, &KKeySequenceWidget::keySequenceChanged, this, &KeysConfForm::capturedKey);
}

bool KeysConfForm::init(QString filepath)
{
    modified = false;
    fileSaveAction->setEnabled(false);
    fileApplyAction->setEnabled(false);

    delete popupMenu;
    popupMenu = new QMenu(keysTree);
    popupMenu->setObjectName(QStringLiteral("popupMenu"));
    popupMenu->addAction(newCommandAction);
    popupMenu->addAction(cloneCommandAction);
    popupMenu->addAction(editCommandAction);
    popupMenu->addAction(deleteCommandAction);
    popupMenu->addAction(revertAction);
    setActionsEnabled(nullptr);

    const bool loaded = loadFile(filepath);
    startupFile = filepath;
    restoreWindowState();
    return loaded;
}

void KeysConfForm::restoreWindowState()
{
    QSettings settings;
    if (settings.contains(QStringLiteral("/MainWinState")))
        restoreState(settings.value(QStringLiteral("/MainWinState")).toByteArray(), 0);
    const int width = settings.value(QStringLiteral("/Width"), QStringLiteral("800")).toInt();
    const int height = settings.value(QStringLiteral("/Height"), QStringLiteral("600")).toInt();
    // A saved size, or the first start's 800x600, from a larger screen or a smaller scale must
    // not open the window beyond the screen it is on.
    const QRect available = screen()->availableGeometry();
    if (width != 0 && height != 0)
        resize(qMin(width, available.width()), qMin(height, available.height()));
    if (settings.value(QStringLiteral("/Maximized"), QStringLiteral("false")).toBool())
        setWindowState(windowState() | Qt::WindowMaximized);

    const QByteArray headerState = settings.value(QStringLiteral("/HeaderState")).toByteArray();
    if (!headerState.isEmpty()) {
        keysTree->header()->restoreState(headerState);
    } else {
        // Qt measures only the rows it shows; the groups start collapsed, and the columns are to
        // fit the loaded rows inside them as well.
        keysTree->expandAll();
        keysTree->resizeColumnToContents(0);
        keysTree->resizeColumnToContents(1);
        keysTree->hideColumn(2);
        keysTree->resizeColumnToContents(3);
        keysTree->collapseAll();
    }
}

void KeysConfForm::saveWindowState()
{
    QSettings settings;
    if (!isMaximized()) {
        settings.setValue(QStringLiteral("/Width"), geometry().width());
        settings.setValue(QStringLiteral("/Height"), geometry().height());
    }
    settings.setValue(QStringLiteral("/Maximized"), isMaximized());
    settings.setValue(QStringLiteral("/MainWinState"), saveState(0));
    settings.setValue(QStringLiteral("/HeaderState"), keysTree->header()->saveState());
}

QString KeysConfForm::itemKey(const QTreeWidgetItem* row)
{
    return row ? row->data(1, Qt::UserRole).toString() : QString();
}

void KeysConfForm::setItemKey(QTreeWidgetItem* row, const QString& key)
{
    BindingTree::showKey(row, key);
}

void KeysConfForm::itemSelectionChanged()
{
    const QList<QTreeWidgetItem*> selected = keysTree->selectedItems();
    QTreeWidgetItem* row = selected.isEmpty() ? nullptr : selected.first();
    itemSelected(row);
    setActionsEnabled(row);
    updateRevertAction();
}

void KeysConfForm::updateRevertAction()
{
    revertAction->setEnabled(edited->isMerged() && currentFile == edited->path() &&
                             model.canRevert(bindingAt(targetRow())));
}

void KeysConfForm::applyFilter()
{
    filterBar->apply();
}

void KeysConfForm::followBindings(const HotkeysModel& before, BindingId focus)
{
    bindingTree->follow(before);
    // The row the step is about, where it still is, shown even where the filter hid it.
    if (QTreeWidgetItem* row = bindingTree->rowOf(focus)) {
        row->setHidden(false);
        row->parent()->setHidden(false);
        keysTree->scrollToItem(row);
        keysTree->setCurrentItem(row);
    }
    // The key panel shows the selected row as it is now, also when the step left it selected.
    itemSelected(keysTree->currentItem());
    updateRevertAction();
}

QTreeWidgetItem* KeysConfForm::setActionsEnabled(QTreeWidgetItem* item)
{
    const auto enable = [this](bool add, bool edit, bool remove, bool clone) {
        newCommandAction->setEnabled(add);
        editCommandAction->setEnabled(edit);
        deleteCommandAction->setEnabled(remove);
        cloneCommandAction->setEnabled(clone);
    };

    if (item && item == commandGroupItem) {
        enable(true, false, false, false);
        return item;
    }
    QTreeWidgetItem* parent = item ? item->parent() : nullptr;
    if (!parent) {
        enable(false, false, false, false);
        return nullptr;
    }
    if (parent == commandGroupItem) {
        enable(true, true, true, true);
        return item;
    }
    const Binding* binding = model.find(bindingAt(item));
    if (!binding)
        return nullptr;
    enable(false, false, model.rowsOf(binding->function).size() >= 2, true);
    return item;
}

void KeysConfForm::slotPopupMenu(QTreeWidgetItem* item, QPoint point, int)
{
    if (setActionsEnabled(item) && popupMenu)
        popupMenu->exec(point);
}

void KeysConfForm::contextMenuEvent(QContextMenuEvent* event)
{
    slotPopupMenu(keysTree->currentItem(), event->globalPos(), 0);
}

void KeysConfForm::showHeaderMenu(const QPoint& position)
{
    QMenu menu;
    QAction* functionColumn = menu.addAction(keysTree->headerItem()->text(2));
    functionColumn->setCheckable(true);
    functionColumn->setChecked(!keysTree->isColumnHidden(2));
    connect(functionColumn, &QAction::triggered, this,
            [this](bool checked) { keysTree->setColumnHidden(2, !checked); });
    menu.exec(keysTree->header()->mapToGlobal(position));
}

void KeysConfForm::closeEvent(QCloseEvent* event)
{
    if (askSaveChanges() == QMessageBox::Cancel)
        event->ignore();
    else
        event->accept();
}

void KeysConfForm::commitData(QSessionManager& manager)
{
    if (!modified || !manager.allowsInteraction())
        return;
    const QMessageBox::StandardButton answer = askSaveChanges();
    manager.release();
    if (answer == QMessageBox::Cancel)
        manager.cancel();
}

bool KeysConfForm::messageReceived(const QString&)
{
    if (isMinimized())
        showNormal();
    raise();
    activateWindow();
    return true;
}

void KeysConfForm::grabKeys() {}

void KeysConfForm::fillFunctionTree()
{
    bindingTree->rebuild();
    commandGroupItem = bindingTree->commandGroup();
}

BindingId KeysConfForm::bindingAt(const QTreeWidgetItem* row) const
{
    return bindingTree->bindingAt(row);
}

QTreeWidgetItem* KeysConfForm::targetRow() const
{
    const QList<QTreeWidgetItem*> selected = keysTree->selectedItems();
    return selected.isEmpty() ? keysTree->currentItem() : selected.first();
}
