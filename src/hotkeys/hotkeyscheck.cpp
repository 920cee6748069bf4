#include "hotkeyscheck.h"

#include "hotkeysentries.h"
#include "hotkeysfile.h"
#include "hotkeysmodel.h"
#include "keyforms.h"

#include <QCoreApplication>
#include <QFileInfo>
#include <QHash>
#include <QKeySequence>
#include <QProcess>
#include <QStandardPaths>

namespace {

// Its messages, translated in a context of their own.
struct HotkeysCheck
{
    Q_DECLARE_TR_FUNCTIONS(HotkeysCheck)
};

bool programExists(const QString& command)
{
    // Large files run the same few programs thousands of times; each is looked up once.
    static QHash<QString, bool> known;
    const QString program = QProcess::splitCommand(command).value(0);
    const auto it = known.constFind(program);
    if (it != known.cend())
        return *it;
    bool exists = false;
    if (program.contains(QLatin1Char('/'))) {
        const QFileInfo info(program);
        exists = info.isFile() && info.isExecutable();
    } else if (!program.isEmpty()) {
        exists = !QStandardPaths::findExecutable(program).isEmpty();
    }
    known.insert(program, exists);
    return exists;
}

// A key of one printable character without Ctrl, Alt or Meta takes that character from typing.
bool swallowsTyping(const QString& storedKey)
{
    const QKeySequence sequence = QKeySequence::fromString(storedKey, QKeySequence::PortableText);
    if (sequence.count() != 1)
        return false;
    const int combined = sequence[0];
    const int key = combined & ~int(Qt::KeyboardModifierMask);
    const bool chord = combined & int(Qt::ControlModifier | Qt::AltModifier | Qt::MetaModifier);
    return !chord && key < 0x01000000 && QChar::isPrint(uint(key));
}

} // namespace

QVector<Finding> checkHotkeysFile(const QString& path)
{
    QVector<Finding> findings;
    QByteArray bytes;
    QString reason;
    HotkeysEntries file;
    if (!readHotkeysFile(path, &bytes, &reason)) {
        findings.append({path, 0, true, QStringLiteral("unreadable-file"), reason});
        return findings;
    }
    if (!file.read(bytes)) {
        findings.append(
            {path, 0, true, QStringLiteral("no-section"), HotkeysCheck::tr("no [ShortCutKeys] section")});
        return findings;
    }
    const QVector<HotkeysLine>& lines = file.lines().lines();
    // Lines of a key that another line of the same key overrides, and the line that counts.
    QHash<int, int> overridden;
    for (const KeyEntry& entry : file.entries()) {
        for (int line : entry.others)
            overridden.insert(line, entry.counting >= 0 ? lines.at(entry.counting).number : 0);
    }
    for (int i = 0; i < lines.size(); ++i) {
        const HotkeysLine& line = lines.at(i);
        if (line.kind != HotkeysLine::Entry || !file.lines().isHotkeysSection(line.section))
            continue;
        const QString key = printableText(QString::fromLocal8Bit(line.key));
        const QString value = unquoted(QString::fromLocal8Bit(line.value));
        const auto say = [&](bool error, const char* code, const QString& text) {
            findings.append({path, line.number, error, QLatin1String(code), text});
        };
        bool readable = true;
        const QString stored = fromFileKey(QString::fromLocal8Bit(line.key), &readable);
        if (!readable)
            say(true, "unreadable-key", HotkeysCheck::tr("the key %1 cannot be read").arg(key));
        if (overridden.contains(i))
            say(false, "duplicate-key",
                HotkeysCheck::tr("the key %1 does not count: line %2 binds the same key")
                    .arg(key)
                    .arg(overridden.value(i)));
        if (value.startsWith(QLatin1String("ZEMWM_"))) {
            if (!HotkeysModel::functionNames().contains(value))
                say(true, "unknown-function",
                    HotkeysCheck::tr("%1 is no function of the window manager").arg(printableText(value)));
        } else if (value != QLatin1String("Disable") && !programExists(value)) {
            say(false, "missing-program",
                HotkeysCheck::tr("the program of \"%1\" is not installed").arg(printableText(value)));
        }
        if (readable && value != QLatin1String("Disable") && swallowsTyping(stored))
            say(false, "swallows-typing",
                HotkeysCheck::tr("the key %1 alone takes a character from typing").arg(key));
    }
    return findings;
}
