#include "testenvironment.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

TestEnvironment::TestEnvironment() : dir(QDir::tempPath() + QLatin1String("/zem-test-XXXXXX"))
{
    QDir().mkpath(configHome());
    QDir().mkpath(userDir());
    QDir().mkpath(systemDir());
    qputenv("XDG_CONFIG_HOME", QFile::encodeName(configHome()));
    qputenv("ZEM_USER_DIR", QFile::encodeName(userDir()));
    qputenv("ZEM_SYSTEM_DIR", QFile::encodeName(systemDir()));
    qunsetenv("ZEM_SESSION_SUFFIX");
}

bool writeFile(const QString& path, const QByteArray& bytes)
{
    QDir().mkpath(QFileInfo(path).absolutePath());
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly | QIODevice::Truncate))
        return false;
    return file.write(bytes) == bytes.size();
}

QByteArray readFile(const QString& path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}
