#include "keysconfform.h"

#include "hotkeysdocument.h"
#include "hotkeysfile.h"

#include <cstdio>

bool KeysConfForm::loadFile(const QString& path)
{
    if (path.isEmpty())
        return false;

    const QString userFile = userHotkeysFilePath();
    const QString systemPath = path == userFile ? systemHotkeysFilePath() : QString();

    HotkeysDocument mainDocument;
    if (!mainDocument.load(path))
        return false;
    // Editing the user's file needs the system file it is merged with.
    HotkeysDocument systemDocument;
    if (!systemPath.isEmpty() && !systemDocument.load(systemPath))
        return false;

    std::fprintf(stderr, "files %s %s\n", path.toLocal8Bit().constData(), systemPath.toLocal8Bit().constData());

    currentFile = path;
    updateTitle();
    disabledKeys.clear();

    modified = false;
    return true;
}
