// The main window: actions for each kind of row, context menus, the saved window state, closing
// with unsaved changes, and being brought forward by a second start.
#include "keysconfform.h"
#include "modalanswerer.h"
#include "testenvironment.h"

#include <QAction>
#include <QGroupBox>
#include <QHeaderView>
#include <QMenu>
#include <QSettings>
#include <QTreeWidget>
#include <QtTest>

namespace {

// Runs the given function on the next popup menu that opens, then closes it.
class PopupWatcher : public QObject
{
public:
    explicit PopupWatcher(std::function<void(QMenu*)> onMenu) : onMenu(std::move(onMenu))
    {
        connect(&timer, &QTimer::timeout, this, [this] {
            if (auto* menu = qobject_cast<QMenu*>(QApplication::activePopupWidget())) {
                timer.stop();
                ++seen;
                this->onMenu(menu);
                menu->close();
            }
        });
        timer.start(10);
    }
    int seen = 0;

private:
    std::function<void(QMenu*)> onMenu;
    QTimer timer;
};

} // namespace

Q_DECLARE_METATYPE(QMessageBox::StandardButton)

class TestMainWindow : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void actionsForRow_data();
    void actionsForRow();
    void rowMenu_data();
    void rowMenu();
    void headerMenuTogglesFunctionColumn();
    void firstRunDefaults();
    void stateSavedAndRestored();
    void maximizedKeepsNormalSize();
    void zeroSizeIgnored();
    void closing_data();
    void closing();
    void messageReceivedUnminimizes();
    void initResetsState();

private:
    QTreeWidgetItem* row(const QString& function, int index = 0) const;
    std::unique_ptr<KeysConfForm> form;
    QTreeWidget* tree = nullptr;
    QString path;
    QTemporaryDir scratch;
};

void TestMainWindow::init()
{
    QSettings().clear();
    path = scratch.filePath(QStringLiteral("window.rc"));
    QVERIFY(writeFile(path, "[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\nAlt|F5=ZEMWM_CLOSE\nAlt|x=\"xterm\"\n"));
    form = std::make_unique<KeysConfForm>();
    QVERIFY(form->init(path));
    tree = form->findChild<QTreeWidget*>(QStringLiteral("keysTree"));
    QVERIFY(tree);
}

void TestMainWindow::cleanup()
{
    form.reset();
}

QTreeWidgetItem* TestMainWindow::row(const QString& function, int index) const
{
    const auto found = tree->findItems(function, Qt::MatchExactly | Qt::MatchRecursive, 2);
    return index < found.size() ? found.at(index) : nullptr;
}

void TestMainWindow::actionsForRow_data()
{
    QTest::addColumn<QString>("which");
    QTest::addColumn<QString>("enabled"); // N(ew) E(dit) D(elete) C(lone), "-" for off
    QTest::addColumn<bool>("menu");

    QTest::newRow("no row") << "none"
                            << "----" << false;
    QTest::newRow("group row") << "group"
                               << "----" << false;
    QTest::newRow("command group row") << "commands"
                                       << "N---" << true;
    QTest::newRow("command row") << "command"
                                 << "NEDC" << true;
    QTest::newRow("function with one row") << "ZEMWM_LOCK"
                                           << "---C" << true;
    QTest::newRow("function with two rows") << "ZEMWM_CLOSE"
                                            << "--DC" << true;
}

void TestMainWindow::actionsForRow()
{
    QFETCH(QString, which);
    QFETCH(QString, enabled);
    QFETCH(bool, menu);

    QTreeWidgetItem* item = nullptr;
    if (which == "group")
        item = tree->topLevelItem(0);
    else if (which == "commands")
        item = KeysConfForm::commandGroup();
    else if (which == "command")
        item = KeysConfForm::commandGroup()->child(0);
    else if (which != "none")
        item = row(which);
    QVERIFY(which == "none" || item);

    // Start from the opposite, so that every action has to be set.
    for (const char* name :
         {"newCommandAction", "editCommandAction", "deleteCommandAction", "cloneCommandAction"})
        form->findChild<QAction*>(QLatin1String(name))->setEnabled(true);
    if (which == "none" || which == "group")
        form->setActionsEnabled(row(QStringLiteral("ZEMWM_LOCK")));

    QTreeWidgetItem* result = form->setActionsEnabled(item);
    QCOMPARE(result != nullptr, menu);
    if (menu)
        QCOMPARE(result, item);
    QString seen;
    const char* names[] = {"newCommandAction", "editCommandAction", "deleteCommandAction",
                           "cloneCommandAction"};
    for (int i = 0; i < 4; ++i)
        seen +=
            form->findChild<QAction*>(QLatin1String(names[i]))->isEnabled() ? QChar("NEDC"[i]) : QChar('-');
    QCOMPARE(seen, enabled);

    // Selecting the row does the same through the tree.
    if (item) {
        tree->setCurrentItem(item);
        QCOMPARE(form->findChild<QGroupBox*>(QStringLiteral("keyGroupBox"))->isEnabled(),
                 which == "command" || which.startsWith("ZEMWM_"));
    }
}

void TestMainWindow::rowMenu_data()
{
    QTest::addColumn<QString>("which");
    QTest::addColumn<QStringList>("enabledEntries"); // empty: no menu at all

    QTest::newRow("group row shows nothing") << "group" << QStringList();
    QTest::newRow("command group row") << "commands" << QStringList{"&New action"};
    QTest::newRow("command row") << "command" << QStringList{"&New action", "&Clone", "&Edit", "&Delete"};
}

void TestMainWindow::rowMenu()
{
    QFETCH(QString, which);
    QFETCH(QStringList, enabledEntries);
    QTreeWidgetItem* item = which == "group"      ? tree->topLevelItem(0)
                            : which == "commands" ? KeysConfForm::commandGroup()
                                                  : KeysConfForm::commandGroup()->child(0);
    QStringList seen;
    PopupWatcher watcher([&](QMenu* menu) {
        for (QAction* action : menu->actions()) {
            if (action->isEnabled())
                seen << action->text();
        }
    });
    form->show();
    QVERIFY(QTest::qWaitForWindowExposed(form.get()));
    QTimer::singleShot(2000, [] {
        if (QWidget* popup = QApplication::activePopupWidget())
            popup->close();
    });
    form->slotPopupMenu(item, form->mapToGlobal(QPoint(50, 50)), 0);
    QCOMPARE(watcher.seen, enabledEntries.isEmpty() ? 0 : 1);
    QCOMPARE(seen, enabledEntries);
}

void TestMainWindow::headerMenuTogglesFunctionColumn()
{
    QVERIFY(tree->isColumnHidden(2));
    QHeaderView* header = tree->header();
    const auto toggle = [&] {
        PopupWatcher watcher([](QMenu* menu) {
            QCOMPARE(menu->actions().size(), 1);
            QCOMPARE(menu->actions().first()->text(), QStringLiteral("zem-wm function"));
            menu->actions().first()->trigger();
        });
        emit header->customContextMenuRequested(QPoint(10, 5));
        QCOMPARE(watcher.seen, 1);
    };
    toggle();
    QVERIFY(!tree->isColumnHidden(2));
    toggle();
    QVERIFY(tree->isColumnHidden(2));
}

void TestMainWindow::firstRunDefaults()
{
    QCOMPARE(form->size(), QSize(800, 600));
    // The columns fit the rows inside the collapsed groups too.
    const QFontMetrics metrics(tree->font());
    QVERIFY(tree->columnWidth(0) >
            metrics.horizontalAdvance(QStringLiteral("horizontally tile windows within the screen")));
    QVERIFY(
        tree->columnWidth(1) >
        metrics.horizontalAdvance(QKeySequence(QStringLiteral("Alt+F4")).toString(QKeySequence::NativeText)));
    QVERIFY(!tree->topLevelItem(0)->isExpanded());
    QVERIFY(tree->isColumnHidden(2));
    QVERIFY(!tree->isColumnHidden(0) && !tree->isColumnHidden(1) && !tree->isColumnHidden(3));
    QVERIFY(!form->isMaximized());
}

void TestMainWindow::stateSavedAndRestored()
{
    form->resize(640, 480);
    tree->showColumn(2);
    tree->setColumnWidth(0, 333);
    form.reset();

    QSettings settings;
    QCOMPARE(settings.value("/Width").toInt(), 640);
    QCOMPARE(settings.value("/Height").toInt(), 480);
    QCOMPARE(settings.value("/Maximized").toBool(), false);
    QVERIFY(!settings.value("/MainWinState").toByteArray().isEmpty());
    QVERIFY(!settings.value("/HeaderState").toByteArray().isEmpty());

    form = std::make_unique<KeysConfForm>();
    QVERIFY(form->init(path));
    tree = form->findChild<QTreeWidget*>(QStringLiteral("keysTree"));
    QCOMPARE(form->size(), QSize(640, 480));
    QVERIFY(!tree->isColumnHidden(2)); // the saved header wins over the defaults
    QCOMPARE(tree->columnWidth(0), 333);
}

void TestMainWindow::maximizedKeepsNormalSize()
{
    form->resize(700, 500);
    form.reset();
    form = std::make_unique<KeysConfForm>();
    QVERIFY(form->init(path));
    form->showMaximized();
    QTRY_VERIFY(form->isMaximized());
    form.reset();

    QSettings settings;
    QCOMPARE(settings.value("/Maximized").toBool(), true);
    QCOMPARE(settings.value("/Width").toInt(), 700);
    QCOMPARE(settings.value("/Height").toInt(), 500);

    form = std::make_unique<KeysConfForm>();
    QVERIFY(form->init(path));
    QVERIFY(form->windowState() & Qt::WindowMaximized);
}

void TestMainWindow::zeroSizeIgnored()
{
    form.reset();
    QSettings settings;
    settings.setValue("/Width", 0);
    settings.setValue("/Height", 450);
    settings.sync();
    form = std::make_unique<KeysConfForm>();
    const QSize before = form->size();
    QVERIFY(form->init(path));
    QCOMPARE(form->size(), before);
}

void TestMainWindow::closing_data()
{
    QTest::addColumn<bool>("modified");
    QTest::addColumn<QMessageBox::StandardButton>("answer");
    QTest::addColumn<bool>("closed");

    QTest::newRow("nothing to save") << false << QMessageBox::Cancel << true;
    QTest::newRow("unsaved, Cancel keeps the window") << true << QMessageBox::Cancel << false;
    QTest::newRow("unsaved, No closes") << true << QMessageBox::No << true;
}

void TestMainWindow::closing()
{
    QFETCH(bool, modified);
    QFETCH(QMessageBox::StandardButton, answer);
    QFETCH(bool, closed);

    form->show();
    QVERIFY(QTest::qWaitForWindowExposed(form.get()));
    if (modified)
        form->fileChanged();
    ModalAnswerer answerer({answer});
    QCOMPARE(form->close(), closed);
    QCOMPARE(form->isVisible(), !closed);
    QCOMPARE(answerer.count(), modified ? 1 : 0);
    if (modified) {
        QCOMPARE(answerer.last().title, QStringLiteral("Save ?"));
        QCOMPARE(answerer.last().text, QStringLiteral("Save previous changes?"));
        QCOMPARE(answerer.last().buttons, QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel);
        QCOMPARE(answerer.last().parent, form.get());
        QVERIFY(KeysConfForm::isModified()); // neither answer saved anything
    }
}

void TestMainWindow::messageReceivedUnminimizes()
{
    form->showMinimized();
    QTRY_VERIFY(form->isMinimized());
    QVERIFY(form->messageReceived(QStringLiteral("anything")));
    QTRY_VERIFY(!form->isMinimized());
    QVERIFY(form->isVisible());
}

void TestMainWindow::initResetsState()
{
    QVERIFY(!KeysConfForm::isModified());
    QCOMPARE(KeysConfForm::startupPath(), path);
    QVERIFY(!form->findChild<QAction*>(QStringLiteral("fileSaveAction"))->isEnabled());
    QVERIFY(!form->findChild<QAction*>(QStringLiteral("fileApplyAction"))->isEnabled());
    for (const char* name :
         {"newCommandAction", "editCommandAction", "deleteCommandAction", "cloneCommandAction"})
        QVERIFY(!form->findChild<QAction*>(QLatin1String(name))->isEnabled());
    QVERIFY(!form->findChild<QGroupBox*>(QStringLiteral("keyGroupBox"))->isEnabled());
    QCOMPARE(form->windowTitle(), QStringLiteral("Zem hotkeys editor - window.rc"));
}

ZEM_TEST_MAIN(TestMainWindow)
#include "tst_mainwindow.moc"
