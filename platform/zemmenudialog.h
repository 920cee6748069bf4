#pragma once

#include <QDialog>

class QLabel;
class QLineEdit;
class QStringList;
class QTreeWidget;

// The desktop-menu chooser: lets the user pick one of the installed applications and hands
// back its command line.
class ZemMenuDialog : public QDialog
{
    Q_OBJECT
    Q_DISABLE_COPY(ZemMenuDialog)

public:
    explicit ZemMenuDialog(QWidget* parent = nullptr);
    ~ZemMenuDialog() override;

    // The chosen entry's command line; the arguments are accepted for the callers' sake and
    // carry nothing this chooser needs.
    QString selectedItemExec(const QString& name, const QString& icon, const QStringList* categories,
                             const QStringList* keywords) const;

private:
    QLineEdit* filterEdit = nullptr;
    QTreeWidget* applicationTree = nullptr;
    QLabel* emptyLabel = nullptr;
};
