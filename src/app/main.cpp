#include "hotkeysfile.h"
#include "keysconfform.h"
#include "myapplication.h"
#include "safefile.h"
#include "startup.h"
#include "zemcore.h"

#include <QFile>
#include <QMessageBox>

#include <cstdio>
#include <cstring>

namespace {

enum ExitStatus {
    AnotherInstanceShown = 0,
    UsageShown = 1,
    CreationDeclined = 2,
    CreationFailed = 3,
    LoadFailed = 4,
    NoDisplay = 5,
};

bool isHelp(const char* argument)
{
    return std::strcmp(argument, "--help") == 0 || std::strcmp(argument, "-h") == 0;
}

int printUsage()
{
    const QString usage =
        QObject::tr("Usage: zem-admin-hotkeys filepath - open/create file as hotkeys coll\n");
    std::fputs(usage.toLocal8Bit().constData(), stdout);
    std::fputs("\n", stdout);
    std::fflush(stdout);
    return UsageShown;
}

// The second start hands over to the running editor; what was asked of it is not done there.
int showRunningEditor(MyApplication* app, int argc, char** argv)
{
    app->sendMessage(QStringLiteral("show"), 5000);
    if (argc > 1)
        std::fprintf(stderr, "zem-admin-hotkeys: %s\n",
                     QObject::tr("an editor already runs on this display and was brought forward; "
                                 "%1 was not opened there")
                         .arg(printableText(QFile::decodeName(argv[1])))
                         .toLocal8Bit()
                         .constData());
    delete app;
    return AnotherInstanceShown;
}

// The file to edit: the one named, created when the user agrees, or the user's own. Empty, with
// the exit status, when the start ends here.
QString chooseFile(const QStringList& arguments, char** argv, int* status)
{
    QString path;
    if (arguments.size() == 1) {
        path = arguments.first();
        if (!isFaithfulFileName(QByteArray(argv[1]))) {
            // Read in the locale's encoding it names another file, which would be created.
            std::fprintf(
                stderr, "zem-admin-hotkeys: %s: %s\n",
                printableText(QFile::decodeName(argv[1])).toLocal8Bit().constData(),
                QObject::tr("the file name is not valid in the locale's encoding").toLocal8Bit().constData());
            *status = CreationDeclined;
            return QString();
        }
        if (path.startsWith(QLatin1Char('%'))) {
            // An unexpanded field code from a desktop entry: behave as if started without one.
            path.clear();
        } else if (!QFile::exists(path)) {
            const QMessageBox::StandardButton answer = QMessageBox::question(
                nullptr, QObject::tr("Warning"), QObject::tr("File %1 doesn't exist. Create?").arg(path),
                QMessageBox::Yes | QMessageBox::No);
            if (answer != QMessageBox::Yes) {
                *status = CreationDeclined;
                return QString();
            }
        }
    }
    if (path.isEmpty())
        path = userHotkeysFilePath();
    // Created all or nothing: a full disk must not leave an empty file that no later start can read.
    QString reason;
    if (!QFile::exists(path) && !writeFileSafely(path, emptyHotkeysFile, &reason)) {
        std::fprintf(stderr, "zem-admin-hotkeys: %s: %s\n", printableText(path).toLocal8Bit().constData(),
                     reason.toLocal8Bit().constData());
        QMessageBox::warning(nullptr, QObject::tr("Attention"),
                             QObject::tr("Can't open/create file:\n%1").arg(path) + QLatin1Char('\n') +
                                 reason,
                             QMessageBox::Ok);
        *status = CreationFailed;
        return QString();
    }
    return path;
}

// The window on the file, and the event loop until it closes.
int runEditor(MyApplication* app, KeysConfForm* form, const QString& path)
{
    if (!form->init(path)) {
        QMessageBox::warning(nullptr, QObject::tr("Attention"),
                             QObject::tr("Can't parse file:\n%1").arg(form->loadFailure()), QMessageBox::Ok);
        return LoadFailed;
    }
    QObject::connect(app, &MyApplication::messageReceived, form, &KeysConfForm::messageReceived);
    QObject::connect(app, &QGuiApplication::lastWindowClosed, app, &QCoreApplication::quit);
    // The session's end asks about unsaved edits itself, once, instead of closing the window.
    QGuiApplication::setFallbackSessionManagementEnabled(false);
    QObject::connect(app, &QGuiApplication::commitDataRequest, form, &KeysConfForm::commitData);
    form->show();
    return app->exec();
}

} // namespace

int main(int argc, char** argv)
{
    // Asked before anything else, and answered without a display or another editor's help.
    if (argc > 1 && std::strcmp(argv[1], "--version") == 0) {
        std::printf("zem-admin-hotkeys %s\n", ZEM_VERSION_STRING);
        return 0;
    }
    // Without a display Qt would abort in the application object; the usage needs none, and
    // anything else is told in one line.
    const QByteArray display = displayToOpen(argc, argv);
    if (!display.isNull()) {
        QCoreApplication core(argc, argv);
        if (argc > 1 && isHelp(argv[1]))
            return printUsage();
        std::fprintf(stderr, "zem-admin-hotkeys: cannot open the X display \"%s\"\n", display.constData());
        return NoDisplay;
    }

    Q_INIT_RESOURCE(icons);
    auto* app = new MyApplication(singleInstanceId(), argc, argv);
    if (app->isRunning())
        return showRunningEditor(app, argc, argv);
    zemInit(ZEM_VERSION_STRING, "Zem hotkeys editor");

    // The toolkit has taken its own options out of argc and argv by now.
    QStringList arguments;
    for (int i = 1; i < argc; ++i)
        arguments << QString::fromLocal8Bit(argv[i]);
    if (argc > 1 && isHelp(argv[1])) {
        delete app;
        return printUsage();
    }

    auto* form = new KeysConfForm();
    form->setWindowIcon(editorWindowIcon());
    int status = 0;
    const QString path = chooseFile(arguments, argv, &status);
    if (!path.isEmpty())
        status = runEditor(app, form, path);
    delete form;
    delete app;
    return status;
}
