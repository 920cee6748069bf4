#include "keysconfform.h"

#include <QFileInfo>

QString KeysConfForm::userSource;
QString KeysConfForm::systemSource;
bool KeysConfForm::modified = false;
QString KeysConfForm::currentFile;
QString KeysConfForm::startupFile;

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
}
