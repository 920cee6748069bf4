#include "zemmenudialog.h"

#include <QDialogButtonBox>
#include <QLabel>
#include <QLineEdit>
#include <QStringList>
#include <QTreeWidget>
#include <QVBoxLayout>

ZemMenuDialog::ZemMenuDialog(QWidget* parent)
    : QDialog(parent)
{
    setWindowTitle(tr("Choose an application"));

    filterEdit = new QLineEdit(this);
    filterEdit->setObjectName(QStringLiteral("filterEdit"));
    filterEdit->setPlaceholderText(tr("Filter"));
    filterEdit->setClearButtonEnabled(true);

    applicationTree = new QTreeWidget(this);
    applicationTree->setObjectName(QStringLiteral("applicationTree"));
    applicationTree->setHeaderHidden(true);

    emptyLabel = new QLabel(tr("No installed applications were found."), this);
    emptyLabel->setObjectName(QStringLiteral("emptyLabel"));
    emptyLabel->setVisible(applicationTree->topLevelItemCount() == 0);

    auto* buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel, this);
    connect(buttons, &QDialogButtonBox::accepted, this, &QDialog::accept);
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);

    auto* layout = new QVBoxLayout(this);
    layout->addWidget(filterEdit);
    layout->addWidget(applicationTree);
    layout->addWidget(emptyLabel);
    layout->addWidget(buttons);
    resize(420, 480);
}

ZemMenuDialog::~ZemMenuDialog() = default;

QString ZemMenuDialog::selectedItemExec(const QString&, const QString&, const QStringList*,
                                        const QStringList*) const
{
    const QTreeWidgetItem* item = applicationTree->currentItem();
    return item ? item->data(0, Qt::UserRole).toString() : QString();
}
