#pragma once

#include <QMenu>

// The desktop's standard Help menu: "About" for the program and for Qt.
class ZemHelpMenu : public QMenu
{
    Q_OBJECT
    Q_DISABLE_COPY(ZemHelpMenu)

public:
    explicit ZemHelpMenu(QWidget* parent);

private:
    void showAbout();
};
