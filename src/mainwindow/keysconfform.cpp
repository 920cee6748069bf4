#include "keysconfform.h"

KeysConfForm::KeysConfForm(QWidget* parent, Qt::WindowFlags flags)
    : QMainWindow(parent, flags)
{
    setWindowTitle(tr("Zem hotkeys editor"));
    userSource = tr("user");
    systemSource = tr("system");
}

KeysConfForm::~KeysConfForm() = default;

bool KeysConfForm::init(QString filepath)
{
    disabledKeys.clear();
    modified = false;
    const bool loaded = loadFile(filepath);
    startupFile = filepath;
    return loaded;
}

bool KeysConfForm::messageReceived(const QString&)
{
    if (isMinimized())
        showNormal();
    raise();
    activateWindow();
    return true;
}
