#include "selectcommanddialog.h"

#include "hotkeysfile.h"

#include "zemmenudialog.h"

#include <QCoreApplication>
#include <QDialogButtonBox>
#include <QDir>
#include <QFileDialog>
#include <QFileInfo>
#include <QGridLayout>
#include <QIcon>
#include <QLabel>
#include <QLineEdit>
#include <QMessageBox>
#include <QSettings>
#include <QSpacerItem>
#include <QToolButton>
#include <QVBoxLayout>

namespace {

const QString widthKey = QStringLiteral("SelectCommandDialog/Width");
const QString heightKey = QStringLiteral("SelectCommandDialog/Height");
const QString directoryKey = QStringLiteral("SelectCommandDialog/defaultSelectDialogDir");
const QString fileDialogSizeKey = QStringLiteral("SelectCommandDialog/fileDialogSize");

} // namespace

SelectCommandDialog::SelectCommandDialog(QWidget* parent) : QDialog(parent)
{
    if (objectName().isEmpty())
        setObjectName(QStringLiteral("commandDialog"));
    resize(469, 108);
    QSizePolicy fixedHeight(QSizePolicy::Preferred, QSizePolicy::Fixed);
    fixedHeight.setHeightForWidth(sizePolicy().hasHeightForWidth());
    setSizePolicy(fixedHeight);

    verticalLayout = new QVBoxLayout(this);
    verticalLayout->setObjectName(QStringLiteral("verticalLayout"));
    gridLayout = new QGridLayout();
    gridLayout->setObjectName(QStringLiteral("gridLayout"));
    commandLabel = new QLabel(this);
    commandLabel->setObjectName(QStringLiteral("commandLabel"));
    QSizePolicy labelPolicy(QSizePolicy::Preferred, QSizePolicy::Fixed);
    labelPolicy.setHeightForWidth(commandLabel->sizePolicy().hasHeightForWidth());
    commandLabel->setSizePolicy(labelPolicy);
    gridLayout->addWidget(commandLabel, 0, 0);
    commandLineEdit = new QLineEdit(this);
    commandLineEdit->setObjectName(QStringLiteral("commandLineEdit"));
    gridLayout->addWidget(commandLineEdit, 0, 1);
    selectCommandFileButton = new QToolButton(this);
    selectCommandFileButton->setObjectName(QStringLiteral("selectCommandFileButton"));
    gridLayout->addWidget(selectCommandFileButton, 0, 2);
    selectFromMenuButton = new QToolButton(this);
    selectFromMenuButton->setObjectName(QStringLiteral("selectFromMenuButton"));
    gridLayout->addWidget(selectFromMenuButton, 0, 3);
    gridLayout->addItem(new QSpacerItem(278, 18, QSizePolicy::Minimum, QSizePolicy::Expanding), 1, 0, 1, 4);
    verticalLayout->addLayout(gridLayout);
    buttonBox = new QDialogButtonBox(this);
    buttonBox->setObjectName(QStringLiteral("buttonBox"));
    buttonBox->setOrientation(Qt::Horizontal);
    buttonBox->setStandardButtons(QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
    verticalLayout->addWidget(buttonBox);

    commandLabel->setText(QCoreApplication::translate("commandDialog", "Command:"));
    selectCommandFileButton->setText(QCoreApplication::translate("commandDialog", "..."));
    selectFromMenuButton->setText(QCoreApplication::translate("commandDialog", "..."));
    // Two buttons reading "..." say nothing to a screen reader or a new user.
    selectCommandFileButton->setToolTip(tr("Choose a program file"));
    selectCommandFileButton->setAccessibleName(selectCommandFileButton->toolTip());
    selectFromMenuButton->setToolTip(tr("Choose an application from the menu"));
    selectFromMenuButton->setAccessibleName(selectFromMenuButton->toolTip());

    connect(buttonBox, &QDialogButtonBox::accepted, this, &SelectCommandDialog::accept);
    connect(buttonBox, &QDialogButtonBox::rejected, this, &SelectCommandDialog::reject);
    setWindowTitle(tr("Select Command"));
    connect(selectCommandFileButton, &QToolButton::clicked, this, &SelectCommandDialog::selectCommandFile);
    selectFromMenuButton->setIcon(QIcon::fromTheme(QStringLiteral("zemmenuedit")));
    connect(selectFromMenuButton, &QToolButton::clicked, this, &SelectCommandDialog::selectCommandFromMenu);

    restoreSize();
}

SelectCommandDialog::~SelectCommandDialog() = default;

void SelectCommandDialog::setCommand(const QString& command)
{
    commandLineEdit->setText(command);
    commandLineEdit->deselect();
    const int blank = command.indexOf(QLatin1Char(' '));
    if (blank > 0)
        commandLineEdit->setSelection(blank + 1, command.size() - blank - 1);
}

QString SelectCommandDialog::command() const
{
    return commandLineEdit->text();
}

void SelectCommandDialog::accept()
{
    // A control character is refused as it stands, not folded into a blank; an empty command
    // binds nothing. Either way the dialog stays open with what was typed.
    const QString problem = commandProblem(commandLineEdit->text());
    if (!problem.isEmpty()) {
        QMessageBox::warning(this, tr("Attention"), problem, QMessageBox::Ok);
        return;
    }
    commandLineEdit->setText(commandLineEdit->text().simplified());
    saveSize();
    QDialog::accept();
}

void SelectCommandDialog::reject()
{
    saveSize();
    QDialog::reject();
}

void SelectCommandDialog::restoreSize()
{
    QSettings settings;
    const int width = settings.value(widthKey, 0).toInt();
    const int height = settings.value(heightKey, 0).toInt();
    if (width == 0 || height == 0)
        resize(minimumSizeHint());
    else
        resize(width, height);
}

void SelectCommandDialog::saveSize()
{
    QSettings settings;
    settings.setValue(widthKey, width());
    settings.setValue(heightKey, height());
}

void SelectCommandDialog::selectCommandFile()
{
    for (;;) {
        QSettings settings;
        const QString startDir = settings.value(directoryKey, QStringLiteral("/usr/bin")).toString();

        QString chosen;
        {
            QFileDialog dialog(this, tr("Open executable"), startDir, QString());
            dialog.setViewMode(QFileDialog::List);
            dialog.resize(settings.value(fileDialogSizeKey, QSize(600, 400)).toSize());
            dialog.setOption(QFileDialog::DontUseNativeDialog);
            if (dialog.exec() == QDialog::Accepted)
                chosen = dialog.selectedFiles().value(0);
            settings.setValue(fileDialogSizeKey, dialog.size());
        }
        if (chosen.isEmpty())
            return;

        const QFileInfo file(chosen);
        if (!file.exists()) {
            if (QMessageBox::warning(
                    this, tr("File doesn't exist"),
                    tr("File you have selected doesn't exist. Do you want to choose another one?"),
                    QMessageBox::Yes | QMessageBox::Cancel) == QMessageBox::Cancel)
                return;
            continue;
        }
        if (!file.isFile() || !file.isExecutable()) {
            if (QMessageBox::warning(this, tr("File isn't executable"),
                                     tr("You can't exec selected file. Do you want to choose another one?"),
                                     QMessageBox::Yes | QMessageBox::Cancel) == QMessageBox::Cancel)
                return;
            continue;
        }
        const QString canonical = file.canonicalFilePath();
        settings.setValue(directoryKey, QFileInfo(canonical).absolutePath());
        setCommand(canonical);
        return;
    }
}

void SelectCommandDialog::selectCommandFromMenu()
{
    ZemMenuDialog menu(this);
    if (menu.exec() == 1)
        commandLineEdit->setText(menu.selectedItemExec(QString(), QString(), nullptr, nullptr));
}
