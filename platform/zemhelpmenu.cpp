#include "zemhelpmenu.h"

#include <QAction>
#include <QApplication>
#include <QMessageBox>

ZemHelpMenu::ZemHelpMenu(QWidget* parent) : QMenu(tr("&Help"), parent)
{
    QAction* about = addAction(tr("About Zem hotkeys editor"));
    about->setObjectName(QStringLiteral("aboutAction"));
    connect(about, &QAction::triggered, this, &ZemHelpMenu::showAbout);

    QAction* aboutQt = addAction(tr("About Qt"));
    aboutQt->setObjectName(QStringLiteral("aboutQtAction"));
    connect(aboutQt, &QAction::triggered, this, [] { QApplication::aboutQt(); });
}

void ZemHelpMenu::showAbout()
{
    QMessageBox::about(parentWidget(), tr("About Zem hotkeys editor"),
                       tr("<h3>Zem hotkeys editor %1</h3>"
                          "<p>Edits the keyboard shortcuts of the zem-wm window manager.</p>")
                           .arg(QStringLiteral(ZEM_VERSION_STRING)));
}
