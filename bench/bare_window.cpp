// The yardstick for the editor's start: a bare Qt main window of the editor's first-start shape
// (800x600, a menu bar, a tool bar, a tree and a status bar), doing nothing else.
#include <QApplication>
#include <QMainWindow>
#include <QMenuBar>
#include <QStatusBar>
#include <QToolBar>
#include <QTreeWidget>

int main(int argc, char** argv)
{
    QApplication app(argc, argv);
    QMainWindow window;
    window.menuBar()->addMenu(QStringLiteral("&File"));
    window.addToolBar(QStringLiteral("toolbar"));
    window.setCentralWidget(new QTreeWidget(&window));
    window.statusBar();
    window.resize(800, 600);
    window.show();
    return app.exec();
}
