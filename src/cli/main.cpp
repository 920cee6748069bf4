#include "hotkeyscli.h"
#include "zemcore.h"

#include <QCoreApplication>
#include <QLoggingCategory>
#include <QTextStream>

#include <cstdio>

int main(int argc, char** argv)
{
    QCoreApplication app(argc, argv);
    QCoreApplication::setApplicationName(QStringLiteral("zem-hotkeys"));
    QCoreApplication::setApplicationVersion(QStringLiteral(ZEM_VERSION_STRING));
    // The key server's tables need no display; its complaint that there is none is noise here.
    QLoggingCategory::setFilterRules(QStringLiteral("kf.windowsystem.*=false"));
    zemInstallTranslations();
    QTextStream out(stdout);
    QTextStream err(stderr);
    const int status = runHotkeysCommand(app.arguments().mid(1), out, err);
    out.flush();
    err.flush();
    return status;
}
