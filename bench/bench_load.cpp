// Times loading a large user hotkeys file merged with a large system file, in the core alone and
// into the main window, writing it back, and filtering the window's tree as a user types.
//
//   bench_load [user-entries [system-entries [runs]]]   (default 10000 2000 7)
//
// Generates both files in a temporary directory and prints the median and best time of the runs,
// for the given size and for twice that size, so that the growth can be read off.
#include "functioncatalogue.h"
#include "hotkeysfile.h"
#include "hotkeysmodel.h"
#include "keyforms.h"
#include "keysconfform.h"

#include <QApplication>
#include <QDir>
#include <QElapsedTimer>
#include <QFile>
#include <QLineEdit>
#include <QTemporaryDir>
#include <QTextStream>

#include <X11/Xlib.h>

#include <algorithm>
#include <cstdio>
#include <random>

namespace {

// Key names the key server knows, from the ranges of the X key symbols.
QStringList keyNames()
{
    QStringList names;
    const std::pair<unsigned long, unsigned long> ranges[] = {
        {0x21, 0x7e},     {0xa1, 0xff},     {0x1a1, 0x1ff},   {0x2a1, 0x2fe},
        {0x3a2, 0x3fe},   {0x4a1, 0x4df},   {0x5ac, 0x5f2},   {0x6a1, 0x6ff},
        {0x7a1, 0x7f9},   {0xcdf, 0xcfa},   {0xda1, 0xdf9},   {0xea1, 0xefa},
        {0xff50, 0xff58}, {0xffbe, 0xffe0}, {0xff95, 0xff9f}, {0x1008ff01, 0x1008ffb0},
        {0x8a1, 0x8fe},   {0x9df, 0x9f8},   {0xaa1, 0xafe},   {0xba3, 0xbfc},
    };
    for (const auto& [first, last] : ranges) {
        for (unsigned long sym = first; sym <= last; ++sym) {
            if (const char* name = XKeysymToString(sym))
                names << QString::fromLatin1(name);
        }
    }
    std::shuffle(names.begin(), names.end(), std::mt19937(20261206));
    return names;
}

// n distinct keys in file form. Three in four are real key combinations, the fourth a name the
// key server does not know (the loader keeps such keys as text); modifiers vary fastest and the
// names come in a fixed shuffled order. So a file of any size up to about 25,000 keys has the
// same mix of key kinds, and two sizes differ only in size.
QStringList distinctKeys(int n, int offset)
{
    static const QStringList names = keyNames();
    static const char* modifierSets[] = {"Ctrl|",
                                         "Alt|",
                                         "Super|",
                                         "Ctrl|Alt|",
                                         "Ctrl|Shift|",
                                         "Alt|Shift|",
                                         "Ctrl|Super|",
                                         "Alt|Super|",
                                         "Shift|Super|",
                                         "Ctrl|Alt|Shift|",
                                         "Ctrl|Alt|Super|",
                                         "Ctrl|Shift|Super|",
                                         "Alt|Shift|Super|",
                                         "Ctrl|Alt|Shift|Super|",
                                         "None|",
                                         "Shift|"};
    const int sets = int(std::size(modifierSets));
    QStringList keys;
    for (int i = offset; keys.size() < n; ++i) {
        const int real = i - i / 4;
        if (i % 4 != 3 && real < names.size() * sets)
            keys << QLatin1String(modifierSets[real % sets]) + names.at(real / sets);
        else
            keys << QStringLiteral("Ctrl|Alt|Bench%1").arg(i);
    }
    return keys;
}

void writeHotkeysFile(const QString& path, int entries, int keyOffset)
{
    static const QVector<WmFunctionEntry> table = buildWmFunctionTable();
    QStringList functions;
    for (const WmFunctionEntry& entry : table) {
        if (entry.keyName)
            functions << QLatin1String(entry.keyName);
    }
    QFile file(path);
    file.open(QIODevice::WriteOnly | QIODevice::Truncate);
    QTextStream out(&file);
    out << "[ShortCutKeys]\n";
    const QStringList keys = distinctKeys(entries, keyOffset);
    for (int i = 0; i < entries; ++i) {
        switch (i % 10) {
        case 0:
        case 1:
        case 2:
        case 3: // functions, many with several keys
            out << keys.at(i) << '=' << functions.at((i / 10 * 4 + i % 10) % functions.size()) << '\n';
            break;
        case 9:
            out << keys.at(i) << "=\"Disable\"\n";
            break;
        case 8:
            out << "None|None" << i << "=\"keyless command " << i << "\"\n";
            break;
        default:
            out << keys.at(i) << "=\"command --number " << i << " --verbose\"\n";
        }
    }
}

struct Timing
{
    double median;
    double best;
};

template <typename Step> Timing timed(int runs, Step step)
{
    QVector<double> seconds;
    for (int run = 0; run < runs; ++run) {
        QElapsedTimer clock;
        clock.start();
        if (!step()) {
            std::fprintf(stderr, "bench_load: a step failed\n");
            std::exit(1);
        }
        seconds << clock.nsecsElapsed() / 1e9;
    }
    std::sort(seconds.begin(), seconds.end());
    return {seconds.at(seconds.size() / 2), seconds.first()};
}

// Core load, window load, and writing the loaded bindings back; the medians.
QVector<Timing> timeAll(KeysConfForm& form, int userEntries, int systemEntries, int runs)
{
    // The system file shares a fifth of its keys with the user's, so the skip rule is busy too.
    writeHotkeysFile(userHotkeysFilePath(), userEntries, 0);
    writeHotkeysFile(systemHotkeysFilePath(), systemEntries, userEntries - systemEntries / 5);
    HotkeysModel model;
    QString failed, reason;
    QByteArray bytes;
    return {
        timed(runs,
              [&] { return model.load(userHotkeysFilePath(), systemHotkeysFilePath(), &failed, &reason); }),
        timed(runs, [&] { return form.loadFile(userHotkeysFilePath()); }),
        timed(runs, [&] { return model.toBytes(true, &bytes, &reason); })};
}

} // namespace

int main(int argc, char** argv)
{
    QTemporaryDir dir;
    qputenv("ZEM_USER_DIR", QFile::encodeName(dir.filePath(QStringLiteral("user"))));
    qputenv("ZEM_SYSTEM_DIR", QFile::encodeName(dir.filePath(QStringLiteral("system"))));
    qputenv("XDG_CONFIG_HOME", QFile::encodeName(dir.filePath(QStringLiteral("config"))));
    QDir().mkpath(dir.filePath(QStringLiteral("system")));
    QApplication app(argc, argv);

    const QStringList arguments = app.arguments();
    const int userEntries = arguments.size() > 1 ? arguments.at(1).toInt() : 10000;
    const int systemEntries = arguments.size() > 2 ? arguments.at(2).toInt() : 2000;
    const int runs = arguments.size() > 3 ? arguments.at(3).toInt() : 7;

    // The per-load line on standard error is not what is measured here.
    std::freopen("/dev/null", "w", stderr);
    KeysConfForm form;
    const char* what[] = {"core load", "window load", "write back"};
    for (int factor : {1, 2}) {
        const QVector<Timing> timings = timeAll(form, factor * userEntries, factor * systemEntries, runs);
        for (int i = 0; i < timings.size(); ++i)
            std::printf("%-11s %d + %d entries: median %.3f s, best %.3f s\n", what[i], factor * userEntries,
                        factor * systemEntries, timings.at(i).median, timings.at(i).best);
    }

    // One keystroke at a time, as typed into the filter field, over the smaller tree.
    timeAll(form, userEntries, systemEntries, 1);
    QCoreApplication::processEvents(); // as the editor's event loop does before anyone types
    auto* filter = form.findChild<QLineEdit*>(QStringLiteral("filterEdit"));
    QVector<double> seconds;
    for (int run = 0; run < runs; ++run) {
        for (const QString& text :
             {"w", "wi", "win", "window", "ctrl+alt+t", "Ctrl|Alt|Bench7", "xterm", ""}) {
            QElapsedTimer clock;
            clock.start();
            filter->setText(text);
            form.applyFilter();
            seconds << clock.nsecsElapsed() / 1e9;
            if (qEnvironmentVariableIsSet("BENCH_VERBOSE"))
                std::printf("  %-16s %.1f ms\n", qPrintable(filter->text()), seconds.last() * 1000);
        }
    }
    std::sort(seconds.begin(), seconds.end());
    std::printf("filter      %d + %d entries: median %.1f ms, worst %.1f ms a keystroke\n", userEntries,
                systemEntries, seconds.at(seconds.size() / 2) * 1000, seconds.last() * 1000);
    return 0;
}
