#include "keysconfform.h"

#include <QAction>
#include <QFileInfo>
#include <QMessageBox>

void KeysConfForm::updateTitle()
{
    QString title = tr("Zem hotkeys editor");
    const QString name = QFileInfo(currentFile).fileName();
    if (!name.isEmpty())
        title += QLatin1String(" - ") + name;
    setWindowTitle(title);
    setWindowIconText(tr("Zem hotkeys editor"));
}

void KeysConfForm::fileChanged()
{
    modified = true;
    fileSaveAction->setEnabled(true);
    fileApplyAction->setEnabled(true);
}

QMessageBox::StandardButton KeysConfForm::askSaveChanges()
{
    if (!modified)
        return QMessageBox::No;
    const QMessageBox::StandardButton answer =
        QMessageBox::warning(this, tr("Save ?"), tr("Save previous changes?"),
                             QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel);
    if (answer == QMessageBox::Cancel)
        return QMessageBox::Cancel;
    if (answer != QMessageBox::Yes)
        return QMessageBox::No;
    fileSave();
    return QMessageBox::Yes;
}

bool KeysConfForm::selectFile(bool)
{
    return false;
}

bool KeysConfForm::copyToCurrentFile(const QString&)
{
    return false;
}

bool KeysConfForm::saveFile()
{
    return !modified;
}

void KeysConfForm::fileNew()
{
}

void KeysConfForm::fileOpen()
{
}

void KeysConfForm::fileSave()
{
}

void KeysConfForm::fileSaveAs()
{
}

void KeysConfForm::fileRestore()
{
}

void KeysConfForm::fileApply()
{
}

void KeysConfForm::fileClose()
{
}
