#include "hotkeysfile.h"

#include "zemcore.h"

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QFileInfo>

#include <algorithm>
#include <cerrno>
#include <cstring>

namespace {

QString hotkeysFileIn(ZemDir dir)
{
    return QString::fromStdString(GetZemDir(dir)) + QLatin1String("/keyshortcutrc") +
           QString::fromStdString(zemSessionConfigSuffix(ZEM_CURRENT_SESSION));
}

QString systemReason(int error)
{
    return QString::fromLocal8Bit(std::strerror(error));
}

// Its messages, translated in a context of their own.
struct HotkeysFile
{
    Q_DECLARE_TR_FUNCTIONS(HotkeysFile)
};

} // namespace

QString userHotkeysFilePath()
{
    return hotkeysFileIn(ZEM_USER_CONFIG_DIR);
}

QString systemHotkeysFilePath()
{
    return hotkeysFileIn(ZEM_SYSTEM_CONFIG_DIR);
}

namespace {

bool isControl(uint c)
{
    return c < 0x20 || (c >= 0x7f && c <= 0x9f) || c == 0x2028 || c == 0x2029;
}

} // namespace

QString commandProblem(const QString& command)
{
    if (command.trimmed().isEmpty())
        return HotkeysFile::tr("The command is empty");
    for (const QChar c : command) {
        if (isControl(c.unicode()))
            return HotkeysFile::tr("The command holds the control character %1, which a hotkeys file "
                                   "cannot hold")
                .arg(printableText(QString(c)));
    }
    return QString();
}

QString printableText(const QString& text)
{
    QString result;
    result.reserve(text.size());
    for (const QChar c : text) {
        const uint code = c.unicode();
        if (!isControl(code))
            result += c;
        else if (code < 0x80)
            result += QStringLiteral("\\x%1").arg(code, 2, 16, QLatin1Char('0'));
        else
            result += QStringLiteral("\\u{%1}").arg(code, 4, 16, QLatin1Char('0'));
    }
    return result;
}

QByteArray reloadCommandFor(const QString& path, QString* reason)
{
    const QByteArray name = QFile::encodeName(path);
    const QByteArray command = "ZEMWM_UPDATE_VAL SCKeysFile " + name + '\n';
    if (std::any_of(name.cbegin(), name.cend(), [](char c) { return uchar(c) < 0x20 || c == 0x7f; })) {
        *reason = HotkeysFile::tr("The file name holds control characters");
        return QByteArray();
    }
    if (QFile::decodeName(name) != path) {
        *reason = HotkeysFile::tr("The file name cannot be written in the locale's encoding");
        return QByteArray();
    }
    if (command.size() > 4096) {
        *reason = HotkeysFile::tr("The file name is too long to be handed to the window manager");
        return QByteArray();
    }
    return command;
}

bool isFaithfulFileName(const QByteArray& name)
{
    return QFile::encodeName(QFile::decodeName(name)) == name;
}

bool readHotkeysFile(const QString& path, QByteArray* bytes, QString* reason)
{
    if (path.isEmpty()) {
        *reason = HotkeysFile::tr("No file name");
        return false;
    }
    // Only regular files: a directory would be parsed as garbage, a device such as /dev/zero
    // would never end, and opening a named pipe would wait for a writer.
    const QFileInfo info(path);
    if (!info.exists()) {
        *reason = systemReason(ENOENT);
        return false;
    }
    if (!info.isFile()) {
        *reason = HotkeysFile::tr("Not a regular file");
        return false;
    }
    if (info.size() > largestHotkeysFile) {
        *reason = HotkeysFile::tr("The file is larger than 16 MiB");
        return false;
    }
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        *reason = file.errorString();
        return false;
    }
    // The file may have grown since it was looked at; never read more than the limit allows.
    *bytes = file.read(largestHotkeysFile + 1);
    if (file.error() != QFileDevice::NoError) {
        *reason = file.errorString();
        return false;
    }
    if (bytes->size() > largestHotkeysFile) {
        *reason = HotkeysFile::tr("The file is larger than 16 MiB");
        return false;
    }
    if (bytes->contains('\0')) {
        *reason = HotkeysFile::tr("The file holds NUL bytes");
        return false;
    }
    return true;
}
