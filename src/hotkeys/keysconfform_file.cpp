#include "keysconfform.h"

#include "hotkeysfile.h"
#include "zemcore.h"
#include "zemwmcommand.h"

#include <QAction>
#include <QCoreApplication>
#include <QFileDialog>
#include <QFileInfo>
#include <QMessageBox>
#include <QProcess>
#include <QX11Info>

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
    // A save that failed keeps the edits marked unsaved: whatever was to follow must not
    // discard them.
    return modified ? QMessageBox::Cancel : QMessageBox::Yes;
}

bool KeysConfForm::selectFile(bool forOpen)
{
    const QString startDir = QString::fromStdString(GetZemDir(ZEM_USER_CONFIG_DIR));
    const QString caption = tr("Select hotkeys file");
    const QString chosen = forOpen
                               ? QFileDialog::getOpenFileName(this, caption, startDir, QStringLiteral("*"))
                               : QFileDialog::getSaveFileName(this, caption, startDir, QStringLiteral("*"));
    if (chosen.isEmpty())
        return false;
    currentFile = chosen;
    updateTitle();
    if (forOpen || QFileInfo::exists(currentFile))
        return true;

    QFile file(currentFile);
    if (!file.open(QIODevice::WriteOnly)) {
        QMessageBox::warning(this, tr("Error"), tr("Can't create file ") + currentFile, QMessageBox::Ok);
        return false;
    }
    return true;
}

bool KeysConfForm::copyToCurrentFile(const QString& from)
{
    // Copying a file onto itself would only make cp complain.
    if (QFileInfo(from).canonicalFilePath() == QFileInfo(currentFile).canonicalFilePath())
        return true;
    // Started with an argument list, never through a shell: any path is only a path.
    QProcess copy;
    copy.start(QStringLiteral("/bin/cp"), {QStringLiteral("-f"), QStringLiteral("--"), from, currentFile});
    const bool copied =
        copy.waitForFinished(-1) && copy.exitStatus() == QProcess::NormalExit && copy.exitCode() == 0;
    if (!copied)
        QMessageBox::warning(this, tr("Error"), tr("Can't copy %1\nto %2").arg(from, currentFile),
                             QMessageBox::Ok);
    return copied;
}

void KeysConfForm::fileNew()
{
    if (askSaveChanges() == QMessageBox::Cancel)
        return;
    const QString previous = currentFile;
    if (!selectFile(false))
        return;
    copyToCurrentFile(previous);
    fileChanged();
}

void KeysConfForm::fileOpen()
{
    if (askSaveChanges() == QMessageBox::Cancel)
        return;
    const QString previous = currentFile;
    if (!selectFile(true))
        return;
    if (loadCurrentFileOr(previous))
        fileChanged();
}

bool KeysConfForm::loadCurrentFileOr(const QString& previous)
{
    if (loadFile(currentFile))
        return true;
    // The tree still shows the previous file: it stays the one that Save writes.
    const QString unreadable = currentFile;
    currentFile = previous;
    updateTitle();
    QMessageBox::warning(this, tr("Attention"), tr("Can't parse file:\n%1").arg(unreadable), QMessageBox::Ok);
    return false;
}

bool KeysConfForm::saveFileOrWarn()
{
    if (saveFile())
        return true;
    QMessageBox::warning(this, tr("Error"), tr("Can't save in file ") + currentFile, QMessageBox::Ok);
    return false;
}

void KeysConfForm::fileSave()
{
    // A failed save keeps the edits marked unsaved, so that they are still offered for saving.
    if (saveFileOrWarn())
        modified = false;
}

void KeysConfForm::fileSaveAs()
{
    const QString previous = currentFile;
    if (!selectFile(false))
        return;
    copyToCurrentFile(previous);
    fileSave();
}

void KeysConfForm::fileRestore()
{
    if (modified && QMessageBox::question(this, tr("Save ?"), tr("All changes will be lost. Save them?"),
                                          QMessageBox::Yes | QMessageBox::No) == QMessageBox::Yes)
        fileSaveAs();

    const QString previous = currentFile;
    currentFile = userHotkeysFilePath();
    copyToCurrentFile(systemHotkeysFilePath());
    if (loadCurrentFileOr(previous))
        fileChanged();
}

void KeysConfForm::fileApply()
{
    // Nothing is handed to the window manager that was not written.
    if (!saveFileOrWarn())
        return;
    modified = false;
    fileSaveAction->setEnabled(false);
    fileApplyAction->setEnabled(false);

    if (currentFile != startupFile) {
        QMessageBox::warning(this, tr("Warning"),
                             tr("You current file is \"%1\".\nAfter restart zem-wm will use \"%2\".")
                                 .arg(currentFile, startupFile),
                             QMessageBox::Ok);
    }
    const QByteArray command = "ZEMWM_UPDATE_VAL SCKeysFile " + currentFile.toLocal8Bit() + '\n';
    SendCommandToWM(QX11Info::display(), command.constData());
}

void KeysConfForm::fileClose()
{
    if (askSaveChanges() == QMessageBox::Cancel)
        return;
    QCoreApplication::quit();
}
