#include "testenvironment.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

TestEnvironment::TestEnvironment() : dir(QDir::tempPath() + QLatin1String("/zem-test-XXXXXX"))
{
    for (const auto& [variable, name] : {std::pair{"XDG_CONFIG_HOME", "/config"},
                                         {"ZEM_USER_DIR", "/user"},
                                         {"ZEM_SYSTEM_DIR", "/system"}}) {
        QDir().mkpath(dir.path() + QLatin1String(name));
        qputenv(variable, QFile::encodeName(dir.path() + QLatin1String(name)));
    }
    qunsetenv("ZEM_SESSION_SUFFIX");
}
