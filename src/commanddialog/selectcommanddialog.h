#pragma once

#include <QDialog>

class QDialogButtonBox;
class QGridLayout;
class QLabel;
class QLineEdit;
class QToolButton;
class QVBoxLayout;

// The small dialog in which the command line of a command entry is typed, picked from the
// executables on disk, or taken from the desktop menu. It remembers its size, the size of its
// file dialog and the directory of the last executable chosen.
class SelectCommandDialog : public QDialog
{
    Q_OBJECT
    Q_DISABLE_COPY(SelectCommandDialog)

public:
    explicit SelectCommandDialog(QWidget* parent);
    ~SelectCommandDialog() override;

    // Shows the command line with its arguments selected, so that typing replaces them.
    void setCommand(const QString& command);
    QString command() const;

protected slots:
    void accept() override;
    void reject() override;

private slots:
    void selectCommandFile();
    void selectCommandFromMenu();

private:
    void restoreSize();
    void saveSize();

    QVBoxLayout* verticalLayout = nullptr;
    QGridLayout* gridLayout = nullptr;
    QLabel* commandLabel = nullptr;
    QLineEdit* commandLineEdit = nullptr;
    QToolButton* selectCommandFileButton = nullptr;
    QToolButton* selectFromMenuButton = nullptr;
    QDialogButtonBox* buttonBox = nullptr;
};
