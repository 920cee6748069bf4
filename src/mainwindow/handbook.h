#pragma once

#include <QDialog>

// The editor's short manual, in a window of its own beside the main window.
class Handbook : public QDialog
{
    Q_OBJECT
    Q_DISABLE_COPY(Handbook)

public:
    explicit Handbook(QWidget* parent);
};
