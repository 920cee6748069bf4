// How long the editor takes from its start until its window is mapped, with an empty hotkeys
// file, against a bare Qt window of the same shape: 20 paired runs, one after the other, and
// the medians and the median of the ratios.
//   bench_map EDITOR BARE_WINDOW [RUNS]
#include <QCoreApplication>
#include <QDir>
#include <QElapsedTimer>
#include <QFile>
#include <QProcess>
#include <QTemporaryDir>
#include <QThread>

#include <X11/Xlib.h>

#include <algorithm>
#include <cstdio>
#include <vector>

namespace {

// Starts the program and waits for a window of its to be mapped on the root window; ms.
double timeToMap(Display* display, const QString& program, const QStringList& arguments,
                 const QProcessEnvironment& env)
{
    XSelectInput(display, DefaultRootWindow(display), SubstructureNotifyMask);
    XSync(display, True);
    QProcess process;
    process.setProcessEnvironment(env);
    QElapsedTimer clock;
    clock.start();
    process.start(program, arguments);
    double elapsed = -1;
    while (clock.elapsed() < 20000) {
        while (XPending(display)) {
            XEvent event;
            XNextEvent(display, &event);
            if (event.type == MapNotify && elapsed < 0)
                elapsed = double(clock.nsecsElapsed()) / 1e6;
        }
        if (elapsed >= 0)
            break;
        QThread::usleep(200);
    }
    process.terminate();
    process.waitForFinished(5000);
    return elapsed;
}

double median(std::vector<double> values)
{
    std::sort(values.begin(), values.end());
    return values.empty() ? 0 : values.at(values.size() / 2);
}

} // namespace

int main(int argc, char** argv)
{
    QCoreApplication app(argc, argv);
    if (argc < 3) {
        std::fprintf(stderr, "usage: bench_map EDITOR BARE_WINDOW [RUNS]\n");
        return 64;
    }
    const int runs = argc > 3 ? std::atoi(argv[3]) : 20;
    Display* display = XOpenDisplay(nullptr);
    if (!display) {
        std::fprintf(stderr, "bench_map: no X display\n");
        return 2;
    }
    QTemporaryDir dir;
    QDir().mkpath(dir.filePath(QStringLiteral("user")));
    QDir().mkpath(dir.filePath(QStringLiteral("system")));
    QDir().mkpath(dir.filePath(QStringLiteral("run")));
    QFile::setPermissions(dir.filePath(QStringLiteral("run")),
                          QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    for (const char* name : {"user/keyshortcutrc", "system/keyshortcutrc"}) {
        QFile file(dir.filePath(QLatin1String(name)));
        file.open(QIODevice::WriteOnly);
        file.write("[ShortCutKeys]\n");
    }
    QProcessEnvironment env = QProcessEnvironment::systemEnvironment();
    env.insert(QStringLiteral("ZEM_USER_DIR"), dir.filePath(QStringLiteral("user")));
    env.insert(QStringLiteral("ZEM_SYSTEM_DIR"), dir.filePath(QStringLiteral("system")));
    env.insert(QStringLiteral("XDG_CONFIG_HOME"), dir.filePath(QStringLiteral("config")));
    env.insert(QStringLiteral("XDG_RUNTIME_DIR"), dir.filePath(QStringLiteral("run")));

    std::vector<double> editor, bare, ratio;
    for (int i = 0; i < runs; ++i) {
        const double b = timeToMap(display, QString::fromLocal8Bit(argv[2]), {}, env);
        const double e = timeToMap(display, QString::fromLocal8Bit(argv[1]), {}, env);
        if (b <= 0 || e <= 0)
            continue;
        bare.push_back(b);
        editor.push_back(e);
        ratio.push_back(e / b);
    }
    std::printf("window mapped, %zu paired runs: editor median %.1f ms, bare Qt window median %.1f ms, "
                "ratio median %.3f (min %.3f, max %.3f)\n",
                ratio.size(), median(editor), median(bare), median(ratio),
                ratio.empty() ? 0 : *std::min_element(ratio.begin(), ratio.end()),
                ratio.empty() ? 0 : *std::max_element(ratio.begin(), ratio.end()));
    XCloseDisplay(display);
    return ratio.empty() ? 2 : 0;
}
