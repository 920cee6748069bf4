#include "hotkeyscli.h"
#include "hotkeysfile.h"
#include "zemcore.h"

#include <QCoreApplication>
#include <QFile>
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
    // An argument that is not text in the locale's encoding would name another file than the
    // one meant, and reach the window manager as another path.
    for (int i = 1; i < argc; ++i) {
        if (!isFaithfulFileName(QByteArray(argv[i]))) {
            err << "zem-hotkeys: "
                << QCoreApplication::translate("ZemHotkeys", "the argument %1 is not valid in the locale's "
                                                             "encoding")
                       .arg(printableText(QFile::decodeName(argv[i])))
                << '\n';
            return 2;
        }
    }
    const int status = runHotkeysCommand(app.arguments().mid(1), out, err);
    out.flush();
    err.flush();
    return status;
}
