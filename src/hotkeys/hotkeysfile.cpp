#include "hotkeysfile.h"

#include "zemcore.h"
#include "zemkeyserver.h"

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QKeySequence>
#include <QRegularExpression>

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

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

// The file a path finally names, following symbolic links, so that saving through a link
// replaces the file behind it and the link stays.
QString finalTarget(const QString& path)
{
    QString target = path;
    for (int hops = 0; hops < 40; ++hops) {
        const QFileInfo info(target);
        if (!info.isSymLink())
            break;
        target = info.symLinkTarget();
    }
    return target;
}

bool writeAll(int fd, const QByteArray& bytes)
{
    const char* data = bytes.constData();
    qint64 left = bytes.size();
    while (left > 0) {
        const ssize_t written = ::write(fd, data, size_t(left));
        if (written < 0) {
            if (errno == EINTR)
                continue;
            return false;
        }
        if (written == 0) {
            errno = ENOSPC;
            return false;
        }
        data += written;
        left -= written;
    }
    return true;
}

} // namespace

QString userHotkeysFilePath()
{
    return hotkeysFileIn(ZEM_USER_CONFIG_DIR);
}

QString systemHotkeysFilePath()
{
    return hotkeysFileIn(ZEM_SYSTEM_CONFIG_DIR);
}

QString toFileKey(const QString& keyString)
{
    QString key = keyString;
    const int lastPlus = key.lastIndexOf(QLatin1Char('+'));
    if (lastPlus < 0) {
        if (key.size() == 1)
            key = key.toLower();
        return QLatin1String("None|") + key;
    }
    const QString keyPart = key.mid(lastPlus + 1);
    if (keyPart.size() == 1)
        key = key.left(lastPlus + 1) + keyPart.toLower();
    key.replace(QLatin1Char('+'), QLatin1Char('|'));
    return key;
}

QString fromFileKey(const QString& fileKey, bool* readable)
{
    static const QRegularExpression placeholder(QStringLiteral("None[0-9]+"));

    QString key = unquoted(fileKey);
    key.replace(QLatin1Char('|'), QLatin1Char('+'));
    key.remove(QStringLiteral("None+"));
    key.remove(placeholder);

    if (readable)
        *readable = true;
    if (key == QLatin1String("XF86Calculator"))
        return QStringLiteral("Calculator");
    const QString converted = ZemKeyServer::KeyStringXToQt(key);
    if (readable)
        *readable = key.isEmpty() || !converted.isEmpty();
    return converted.isEmpty() ? key : converted;
}

QString fileKeyOf(const QString& storedKey)
{
    const QKeySequence sequence = QKeySequence::fromString(storedKey, QKeySequence::NativeText);
    QString keyString = ZemKeyServer::KeyQtToKeyStringX(sequence.isEmpty() ? 0 : sequence[0]);
    if (keyString.isEmpty())
        keyString = storedKey;
    return toFileKey(keyString);
}

QString unquoted(const QString& text)
{
    const QLatin1Char quote('"');
    if (text.size() >= 2 && text.startsWith(quote) && text.endsWith(quote))
        return text.mid(1, text.size() - 2);
    return text;
}

bool isWritableFileKey(const QByteArray& key)
{
    const auto isBlank = [](char c) { return c == ' ' || c == '\t'; };
    return !key.isEmpty() && !key.contains('\n') && !key.contains('\r') && !key.contains('\0') &&
           !key.contains('=') && !isBlank(key.front()) && !isBlank(key.back()) &&
           !QByteArray(";#[\"").contains(key.front());
}

bool readsBackAsWritten(const QString& storedKey)
{
    const QByteArray written = fileKeyOf(storedKey).toLocal8Bit();
    return isWritableFileKey(written) &&
           foldedKey(fileKeyOf(fromFileKey(QString::fromLocal8Bit(written))).toLocal8Bit()) ==
               foldedKey(written);
}

QByteArray foldedKey(const QByteArray& key)
{
    QByteArray folded = key;
    for (char& c : folded) {
        if (c >= 'A' && c <= 'Z')
            c = char(c - 'A' + 'a');
    }
    return folded;
}

QByteArray reloadCommandFor(const QString& path)
{
    const QByteArray command = "ZEMWM_UPDATE_VAL SCKeysFile " + path.toLocal8Bit() + '\n';
    const bool controls = std::any_of(command.cbegin(), command.cend() - 1,
                                      [](char c) { return uchar(c) < 0x20 || c == 0x7f; });
    return controls || command.size() > 4096 ? QByteArray() : command;
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

bool writeFileSafely(const QString& path, const QByteArray& bytes, QString* reason)
{
    if (path.isEmpty()) {
        *reason = HotkeysFile::tr("No file name");
        return false;
    }
    const QString target = finalTarget(path);
    const QFileInfo targetInfo(target);
    if (targetInfo.isDir()) {
        *reason = systemReason(EISDIR);
        return false;
    }
    QByteArray temporary =
        QFile::encodeName(targetInfo.absolutePath() + QLatin1String("/.") + targetInfo.fileName()) +
        ".XXXXXX";
    const int fd = ::mkstemp(temporary.data());
    if (fd < 0) {
        *reason = systemReason(errno);
        return false;
    }

    struct stat old;
    bool ok = true;
    if (::stat(QFile::encodeName(target).constData(), &old) == 0) {
        ok = ::fchmod(fd, old.st_mode & 07777) == 0;
        // Only root may give the file away; for anyone else the owner is already the same.
        if (ok && ::fchown(fd, old.st_uid, old.st_gid) != 0 && errno != EPERM)
            ok = false;
    } else {
        const mode_t mask = ::umask(0);
        ::umask(mask);
        ok = ::fchmod(fd, 0666 & ~mask) == 0;
    }
    ok = ok && writeAll(fd, bytes) && ::fsync(fd) == 0;
    int error = ok ? 0 : errno;
    if (::close(fd) != 0 && ok) {
        ok = false;
        error = errno;
    }
    if (ok && ::rename(temporary.constData(), QFile::encodeName(target).constData()) != 0) {
        ok = false;
        error = errno;
    }
    if (!ok) {
        ::unlink(temporary.constData());
        *reason = systemReason(error);
        return false;
    }
    // The new name is on disk only once the directory is.
    const int dir = ::open(QFile::encodeName(targetInfo.absolutePath()).constData(), O_RDONLY | O_DIRECTORY);
    if (dir >= 0) {
        ::fsync(dir);
        ::close(dir);
    }
    return true;
}
