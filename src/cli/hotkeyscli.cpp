#include "hotkeyscli.h"

#include "bindingfilter.h"
#include "functioncatalogue.h"
#include "hotkeyscheck.h"
#include "hotkeysdocument.h"
#include "hotkeysentries.h"
#include "hotkeysfile.h"
#include "hotkeyslines.h"
#include "hotkeysmodel.h"
#include "keyforms.h"
#include "safefile.h"
#include "zemwmcommand.h"

#include <QCoreApplication>
#include <QFileInfo>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QKeySequence>
#include <QTextStream>

#include <X11/Xlib.h>

#include <algorithm>

namespace {

// Its messages, translated in a context of their own.
struct ZemHotkeys
{
    Q_DECLARE_TR_FUNCTIONS(ZemHotkeys)
};

const char usage[] = "Usage: zem-hotkeys list [--json] [FILE]\n"
                     "       zem-hotkeys check [--json] [FILE...]\n"
                     "       zem-hotkeys set KEY TARGET [--file FILE] [--force]\n"
                     "       zem-hotkeys unset KEY [--file FILE]\n"
                     "       zem-hotkeys apply [FILE]\n"
                     "       zem-hotkeys --help | --version\n";

struct Options
{
    bool json = false;
    bool force = false;
    bool help = false;
    bool version = false;
    QString file;
    QStringList words; // the command and its arguments
    QString error;
};

Options parse(const QStringList& arguments)
{
    Options options;
    for (int i = 0; i < arguments.size(); ++i) {
        const QString& argument = arguments.at(i);
        if (argument == QLatin1String("--")) {
            options.words << arguments.mid(i + 1);
            break;
        }
        if (argument == QLatin1String("--json")) {
            options.json = true;
        } else if (argument == QLatin1String("--force")) {
            options.force = true;
        } else if (argument == QLatin1String("--help") || argument == QLatin1String("-h")) {
            options.help = true;
        } else if (argument == QLatin1String("--version")) {
            options.version = true;
        } else if (argument.startsWith(QLatin1String("--file="))) {
            options.file = argument.mid(7);
            if (options.file.isEmpty())
                options.error = ZemHotkeys::tr("--file needs a file name");
        } else if (argument == QLatin1String("--file")) {
            if (i + 1 < arguments.size())
                options.file = arguments.at(++i);
            else
                options.error = ZemHotkeys::tr("--file needs a file name");
        } else if (argument.startsWith(QLatin1Char('-')) && argument.size() > 1) {
            options.error = ZemHotkeys::tr("unknown option %1").arg(argument);
        } else {
            options.words << argument;
        }
    }
    return options;
}

QString functionDescription(int function)
{
    static const QStringList descriptions = [] {
        QStringList result;
        for (const WmFunctionEntry& entry : buildWmFunctionTable(false)) {
            if (entry.code != 0 && entry.keyName)
                result << entry.text;
        }
        return result;
    }();
    return descriptions.value(function);
}

// The file an edit or a listing is about: the one named, else the user's, merged with the system's.
struct Target
{
    QString path;
    bool userFile = false;
};

Target targetOf(const QString& file)
{
    // A file that is named is taken alone, even the user's own.
    return file.isEmpty() ? Target{userHotkeysFilePath(), true} : Target{file, false};
}

bool load(HotkeysModel& model, const Target& target, QTextStream& err)
{
    QString failed;
    QString reason;
    // A user who never saved a binding has no file yet: that is an empty one, as the editor
    // would create it.
    if (target.userFile && !QFileInfo::exists(target.path)) {
        QByteArray system;
        const QString systemPath = systemHotkeysFilePath();
        if (readHotkeysFile(systemPath, &system, &reason) && model.loadBytes(emptyHotkeysFile, system, true))
            return true;
        err << "zem-hotkeys: " << printableText(systemPath) << ": "
            << (reason.isEmpty() ? ZemHotkeys::tr("no [ShortCutKeys] section") : reason) << '\n';
        return false;
    }
    if (model.load(target.path, target.userFile ? systemHotkeysFilePath() : QString(), &failed, &reason))
        return true;
    err << "zem-hotkeys: " << printableText(failed) << ": " << reason << '\n';
    return false;
}

// Every read-modify-write holds the lock from before the file is read until it is replaced,
// so that a writer beside it can neither lose this change nor have its own lost.
bool lockFor(DirectoryLock& lock, const Target& target, QTextStream& err)
{
    QString reason;
    if (lock.lock(target.path, &reason))
        return true;
    err << "zem-hotkeys: " << printableText(target.path) << ": " << reason << '\n';
    return false;
}

bool save(HotkeysModel& model, const Target& target, QTextStream& err)
{
    QByteArray bytes;
    QString reason;
    if (model.toBytes(target.userFile, &bytes, &reason) && writeFileSafely(target.path, bytes, &reason))
        return true;
    err << "zem-hotkeys: " << printableText(target.path) << ": " << reason << '\n';
    return false;
}

QByteArray readKey(const QString& text, QTextStream& err)
{
    const QByteArray key = fileKeyFromTyped(text);
    if (key.isEmpty())
        err << "zem-hotkeys: " << ZemHotkeys::tr("cannot read the key \"%1\"").arg(printableText(text))
            << '\n';
    return key;
}

QString describe(const Binding& binding)
{
    return binding.isCommand() ? binding.command : HotkeysModel::functionNames().at(binding.function);
}

int list(const Options& options, QTextStream& out, QTextStream& err)
{
    if (options.words.size() > 2)
        return UsageError;
    HotkeysModel model;
    if (!load(model, targetOf(options.words.value(1)), err))
        return Failed;
    QJsonArray entries;
    const auto add = [&](const QString& key, const QString& function, const QString& command,
                         const QString& action, const QString& source) {
        if (!options.json) {
            out << printableText(key) << '\t'
                << printableText(!function.isEmpty()  ? function
                                 : !command.isEmpty() ? command
                                                      : action)
                << '\t' << source << '\n';
            return;
        }
        const QString stored = fromFileKey(key);
        entries.append(QJsonObject{
            {"key", key},
            {"shown", stored.isEmpty() ? QString() : stored},
            {"function", function.isEmpty() ? QJsonValue() : QJsonValue(function)},
            {"command", command.isEmpty() ? QJsonValue() : QJsonValue(command)},
            {"action", action},
            {"source", source},
        });
    };
    for (const Binding* row : model.rows()) {
        if (!row->isCommand() && row->key.isEmpty())
            continue;
        const QString key = row->key.isEmpty() ? QString() : QString::fromLocal8Bit(model.fileKeyOf(*row));
        const QString source =
            row->source == BindingSource::System ? QStringLiteral("system") : QStringLiteral("user");
        if (row->isCommand())
            add(key, QString(), row->command, row->command, source);
        else
            add(key, HotkeysModel::functionNames().at(row->function), QString(),
                functionDescription(row->function), source);
    }
    for (const QString& key : model.disabledKeys())
        add(QString::fromLocal8Bit(model.disabledFileKey(key)), QString(), QString(),
            QStringLiteral("Disable"), QStringLiteral("user"));
    if (options.json)
        out << QJsonDocument(entries).toJson(QJsonDocument::Indented);
    return 0;
}

int check(const Options& options, QTextStream& out)
{
    QStringList files = options.words.mid(1);
    if (files.isEmpty())
        files << userHotkeysFilePath() << systemHotkeysFilePath();
    QVector<Finding> findings;
    for (const QString& file : qAsConst(files))
        findings += checkHotkeysFile(file);
    QJsonArray entries;
    for (const Finding& finding : qAsConst(findings)) {
        const QString severity = finding.error ? QStringLiteral("error") : QStringLiteral("warning");
        if (options.json)
            entries.append(QJsonObject{{"file", finding.path},
                                       {"line", finding.line},
                                       {"severity", severity},
                                       {"code", finding.code},
                                       {"message", finding.text}});
        else
            out << printableText(finding.path) << ':' << finding.line << ": " << severity << ": "
                << finding.text << '\n';
    }
    if (options.json)
        out << QJsonDocument(entries).toJson(QJsonDocument::Indented);
    const bool errors =
        std::any_of(findings.cbegin(), findings.cend(), [](const Finding& f) { return f.error; });
    return errors ? Failed : findings.isEmpty() ? 0 : CheckWarnings;
}

int set(const Options& options, QTextStream& out, QTextStream& err)
{
    if (options.words.size() != 3)
        return UsageError;
    const QByteArray key = readKey(options.words.at(1), err);
    // Blanks at the ends go; anything else of the command is the user's, and a control
    // character is refused below, never folded into a blank.
    QString target = options.words.at(2);
    while (target.startsWith(QLatin1Char(' ')))
        target.remove(0, 1);
    while (target.endsWith(QLatin1Char(' ')))
        target.chop(1);
    if (key.isEmpty())
        return Failed;
    const bool function = target.startsWith(QLatin1String("ZEMWM_"));
    if (function && !HotkeysModel::functionNames().contains(target)) {
        err << "zem-hotkeys: "
            << ZemHotkeys::tr("%1 is no function of the window manager").arg(printableText(target)) << '\n';
        return Failed;
    }
    if (!function) {
        const QString problem = commandProblem(target);
        if (!problem.isEmpty()) {
            err << "zem-hotkeys: " << problem << '\n';
            return Failed;
        }
    }
    HotkeysModel model;
    const Target file = targetOf(options.file);
    DirectoryLock lock;
    if (!lockFor(lock, file, err) || !load(model, file, err))
        return Failed;
    if (const Binding* holder = model.find(model.holderOfFileKey(key))) {
        if (describe(*holder) == target) {
            out << ZemHotkeys::tr("%1 already does %2").arg(options.words.at(1), printableText(target))
                << '\n';
            return 0;
        }
        if (!options.force) {
            err << "zem-hotkeys: "
                << ZemHotkeys::tr("%1 is held by %2; --force takes it over")
                       .arg(options.words.at(1), printableText(describe(*holder)))
                << '\n';
            return KeyTaken;
        }
        model.clearKey(holder->id);
    }
    const BindingId row = function ? model.rowForFunction(target) : model.addCommand(target);
    model.setFileKey(row, key);
    return save(model, file, err) ? 0 : Failed;
}

int unset(const Options& options, QTextStream& err)
{
    if (options.words.size() != 2)
        return UsageError;
    const QByteArray key = readKey(options.words.at(1), err);
    if (key.isEmpty())
        return Failed;
    HotkeysModel model;
    const Target file = targetOf(options.file);
    DirectoryLock lock;
    if (!lockFor(lock, file, err) || !load(model, file, err))
        return Failed;
    const Binding* holder = model.find(model.holderOfFileKey(key));
    if (!holder) {
        err << "zem-hotkeys: "
            << ZemHotkeys::tr("no binding holds %1").arg(printableText(options.words.at(1))) << '\n';
        return Failed;
    }
    // A function's only row stays, without its key; any other row goes.
    if (!model.removeRow(holder->id))
        model.clearKey(holder->id);
    return save(model, file, err) ? 0 : Failed;
}

int apply(const Options& options, QTextStream& err)
{
    if (options.words.size() > 2)
        return UsageError;
    const QString path = targetOf(options.words.value(1)).path;
    QString reason;
    const QByteArray command = reloadCommandFor(path, &reason);
    if (command.isEmpty()) {
        err << "zem-hotkeys: " << printableText(path) << ": " << reason << '\n';
        return Failed;
    }
    // The window manager is told only of a file it can read.
    QByteArray bytes;
    HotkeysDocument document;
    if (!readHotkeysFile(path, &bytes, &reason) ||
        (!document.load(bytes) && !(reason = ZemHotkeys::tr("no [ShortCutKeys] section")).isEmpty())) {
        err << "zem-hotkeys: " << printableText(path) << ": " << reason << '\n';
        return Failed;
    }
    Display* display = XOpenDisplay(nullptr);
    if (!display) {
        err << "zem-hotkeys: " << ZemHotkeys::tr("no X display; the window manager cannot be told") << '\n';
        return Failed;
    }
    const bool sent = SendCommandToWM(display, command.constData());
    XCloseDisplay(display);
    if (!sent)
        err << "zem-hotkeys: " << ZemHotkeys::tr("the X display refused the command") << '\n';
    return sent ? 0 : Failed;
}

} // namespace

int runHotkeysCommand(const QStringList& arguments, QTextStream& out, QTextStream& err)
{
    const Options options = parse(arguments);
    if (options.help) {
        out << usage;
        return 0;
    }
    if (options.version) {
        out << "zem-hotkeys " << QCoreApplication::applicationVersion() << '\n';
        return 0;
    }
    const QString command = options.words.value(0);
    int status = UsageError;
    if (!options.error.isEmpty())
        err << "zem-hotkeys: " << options.error << '\n';
    else if (command == QLatin1String("list"))
        status = list(options, out, err);
    else if (command == QLatin1String("check"))
        status = check(options, out);
    else if (command == QLatin1String("set"))
        status = set(options, out, err);
    else if (command == QLatin1String("unset"))
        status = unset(options, err);
    else if (command == QLatin1String("apply"))
        status = apply(options, err);
    if (status == UsageError)
        err << usage;
    return status;
}
