#pragma once

#include <QDialog>
#include <QString>
#include <QStringList>
#include <QVector>

class QLabel;
class QLineEdit;
class QDialogButtonBox;
class QTreeWidget;
class QTreeWidgetItem;

// One application of the desktop menu, as its desktop entry describes it.
struct DesktopApplication
{
    QString id;       // desktop-file id: path below applications/, "/" turned into "-"
    QString name;     // localized Name
    QString comment;  // localized Comment or GenericName
    QString icon;     // theme icon name or absolute path
    QString exec;     // the Exec line as written
    QString category; // main category, empty when none
};

// The installed applications: the desktop entries below $XDG_DATA_HOME/applications and each
// $XDG_DATA_DIRS/applications, a directory earlier in that order hiding an entry of the same
// id in a later one; hidden, NoDisplay, non-application, unreadable, malformed and oversized
// entries are left out. Sorted by name.
QVector<DesktopApplication> installedApplications();
// An Exec line as a command line: field codes removed, "%%" turned into "%".
QString execWithoutFieldCodes(const QString& exec);

// The desktop-menu chooser: the installed applications grouped by main category, with their
// icons and a filter box, handing back the chosen application's command line.
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
    void fill();
    void applyFilter(const QString& text);
    void updateOkButton();

    QLineEdit* filterEdit = nullptr;
    QTreeWidget* applicationTree = nullptr;
    QLabel* emptyLabel = nullptr;
    QDialogButtonBox* buttons = nullptr;
};
