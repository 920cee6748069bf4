#include "hotkeysfile.h"
#include "keysconfform.h"
#include "myapplication.h"
#include "startup.h"
#include "zemcore.h"

#include <QFile>
#include <QMessageBox>

#include <cstdio>

namespace {

enum ExitStatus {
    AnotherInstanceShown = 0,
    UsageShown = 1,
    CreationDeclined = 2,
    CreationFailed = 3,
    LoadFailed = 4,
};

} // namespace

int main(int argc, char** argv)
{
    auto* app = new MyApplication(singleInstanceId(), argc, argv);
    if (app->isRunning()) {
        app->sendMessage(QStringLiteral("show"), 5000);
        delete app;
        return AnotherInstanceShown;
    }

    zemInit("2.8.16", "Zem hotkeys editor");

    // The toolkit has taken its own options out of argc and argv by now.
    QStringList arguments;
    for (int i = 1; i < argc; ++i)
        arguments << QString::fromLocal8Bit(argv[i]);
    if (!arguments.isEmpty() &&
        (arguments.first() == QLatin1String("--help") || arguments.first() == QLatin1String("-h"))) {
        const QString usage =
            QObject::tr("Usage: zem-admin-hotkeys filepath - open/create file as hotkeys coll\n");
        std::fputs(usage.toLocal8Bit().constData(), stdout);
        std::fputs("\n", stdout);
        std::fflush(stdout);
        delete app;
        return UsageShown;
    }

    auto* form = new KeysConfForm();
    form->setWindowIcon(editorWindowIcon());

    QString path;
    if (arguments.size() == 1) {
        path = arguments.first();
        if (path.startsWith(QLatin1Char('%'))) {
            // An unexpanded field code from a desktop entry: behave as if started without one.
            path.clear();
        } else if (!QFile::exists(path)) {
            const QMessageBox::StandardButton answer = QMessageBox::question(
                nullptr, QObject::tr("Warning"), QObject::tr("File %1 doesn't exist. Create?").arg(path),
                QMessageBox::Yes | QMessageBox::No);
            if (answer != QMessageBox::Yes) {
                delete form;
                delete app;
                return CreationDeclined;
            }
        }
    }
    if (path.isEmpty())
        path = userHotkeysFilePath();

    // Created all or nothing: a full disk must not leave an empty file that no later start can read.
    QString reason;
    if (!QFile::exists(path) && !writeFileSafely(path, emptyHotkeysFile, &reason)) {
        std::fprintf(stderr, "zem-admin-hotkeys: %s: %s\n", path.toLocal8Bit().constData(),
                     reason.toLocal8Bit().constData());
        QMessageBox::warning(nullptr, QObject::tr("Attention"),
                             QObject::tr("Can't open/create file:\n%1").arg(path) + QLatin1Char('\n') +
                                 reason,
                             QMessageBox::Ok);
        delete form;
        delete app;
        return CreationFailed;
    }

    if (!form->init(path)) {
        QMessageBox::warning(nullptr, QObject::tr("Attention"),
                             QObject::tr("Can't parse file:\n%1").arg(form->loadFailure()), QMessageBox::Ok);
        delete form;
        delete app;
        return LoadFailed;
    }

    QObject::connect(app, &MyApplication::messageReceived, form, &KeysConfForm::messageReceived);
    QObject::connect(app, &QGuiApplication::lastWindowClosed, app, &QCoreApplication::quit);

    form->show();
    const int result = app->exec();
    delete form;
    delete app;
    return result;
}
