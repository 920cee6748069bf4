#include "safefile.h"

#include "hotkeysfile.h"

#include <QCoreApplication>
#include <QElapsedTimer>
#include <QFile>
#include <QFileInfo>
#include <QThread>

#include <cerrno>
#include <cstring>
#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <sys/xattr.h>
#include <unistd.h>

namespace {

// Its messages, translated in a context of their own.
struct HotkeysFile
{
    Q_DECLARE_TR_FUNCTIONS(HotkeysFile)
};

QString systemReason(int error)
{
    return QString::fromLocal8Bit(std::strerror(error));
}

QByteArray encoded(const QString& path)
{
    return QFile::encodeName(path);
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

// Root following another account's link would write where that account chose: refused unless
// the link belongs to root or to the owner of the directory it stands in, as the kernel decides
// for links in sticky directories.
QString plantedLink(const QString& path)
{
    if (::geteuid() != 0)
        return QString();
    QString hop = path;
    for (int hops = 0; hops < 40; ++hops) {
        struct stat link;
        if (::lstat(encoded(hop).constData(), &link) != 0 || !S_ISLNK(link.st_mode))
            return QString();
        struct stat dir;
        if (link.st_uid != 0 && (::stat(encoded(QFileInfo(hop).absolutePath()).constData(), &dir) != 0 ||
                                 dir.st_uid != link.st_uid))
            return HotkeysFile::tr("%1 is a symbolic link of another account").arg(hop);
        hop = QFileInfo(hop).symLinkTarget();
    }
    return QString();
}

// Why the existing file must not be replaced; empty when it may be.
QString refusal(const QString& target, const struct stat& old)
{
    if (!(old.st_mode & S_IWUSR))
        return HotkeysFile::tr("%1 is read-only: its owner's write permission is off").arg(target);
    if (::geteuid() != 0 && old.st_uid != ::geteuid())
        return HotkeysFile::tr("%1 belongs to another account").arg(target);
    if (old.st_nlink > 1)
        return HotkeysFile::tr("%1 has %2 hard links; replacing it would part it from the others")
            .arg(target)
            .arg(qulonglong(old.st_nlink));
    return QString();
}

// The extended attributes of one file onto another: ACLs, and whatever else is attached.
bool copyAttributes(int from, int to)
{
    const ssize_t size = ::flistxattr(from, nullptr, 0);
    if (size <= 0)
        return size == 0 || errno == ENOTSUP;
    QByteArray names(int(size), '\0');
    const ssize_t listed = ::flistxattr(from, names.data(), size_t(names.size()));
    if (listed < 0)
        return false;
    for (const QByteArray& name : names.left(int(listed)).split('\0')) {
        if (name.isEmpty())
            continue;
        const ssize_t length = ::fgetxattr(from, name.constData(), nullptr, 0);
        if (length < 0)
            return false;
        QByteArray value(int(length), '\0');
        if (::fgetxattr(from, name.constData(), value.data(), size_t(value.size())) != length ||
            ::fsetxattr(to, name.constData(), value.constData(), size_t(value.size()), 0) != 0) {
            // The security and trusted names belong to the system; an ordinary account may read
            // but not set them, and they are not the user's to keep.
            if (errno == EPERM && (name.startsWith("security.") || name.startsWith("trusted.")))
                continue;
            return false;
        }
    }
    return true;
}

// Writes, flushes and closes the temporary file, then gives it the name. Failures unlink it.
bool finish(int fd, const QByteArray& temporary, const QByteArray& bytes, const QByteArray& name, bool ok,
            QString* reason)
{
    ok = ok && writeAll(fd, bytes) && ::fsync(fd) == 0;
    int error = ok ? 0 : errno;
    if (::close(fd) != 0 && ok) {
        ok = false;
        error = errno;
    }
    if (ok && ::rename(temporary.constData(), name.constData()) != 0) {
        ok = false;
        error = errno;
    }
    if (!ok) {
        ::unlink(temporary.constData());
        *reason = systemReason(error);
        return false;
    }
    // The new name is on disk only once the directory is.
    const int dir = ::open(encoded(QFileInfo(QFile::decodeName(name)).absolutePath()).constData(),
                           O_RDONLY | O_DIRECTORY | O_CLOEXEC);
    if (dir >= 0) {
        ::fsync(dir);
        ::close(dir);
    }
    return true;
}

int temporaryBeside(const QString& target, QByteArray* temporary)
{
    const QFileInfo info(target);
    *temporary = encoded(info.absolutePath() + QLatin1String("/.") + info.fileName()) + ".XXXXXX";
    return ::mkstemp(temporary->data());
}

} // namespace

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

bool writeFileSafely(const QString& path, const QByteArray& bytes, QString* reason)
{
    if (path.isEmpty()) {
        *reason = HotkeysFile::tr("No file name");
        return false;
    }
    if (bytes.size() > largestHotkeysFile) {
        *reason = HotkeysFile::tr("The file would be larger than 16 MiB");
        return false;
    }
    *reason = plantedLink(path);
    if (!reason->isEmpty())
        return false;
    const QString target = finalTarget(path);
    if (QFileInfo(target).isDir()) {
        *reason = systemReason(EISDIR);
        return false;
    }
    struct stat old;
    const bool exists = ::stat(encoded(target).constData(), &old) == 0;
    if (exists) {
        *reason = refusal(target, old);
        if (!reason->isEmpty())
            return false;
    }

    QByteArray temporary;
    const int fd = temporaryBeside(target, &temporary);
    if (fd < 0) {
        *reason = systemReason(errno);
        return false;
    }
    bool ok = true;
    if (exists) {
        // Only root may give the file away; anyone may keep a group they belong to.
        if (::geteuid() == 0)
            ok = ::fchown(fd, old.st_uid, old.st_gid) == 0;
        else if (::fchown(fd, uid_t(-1), old.st_gid) != 0 && errno != EPERM)
            ok = false;
        ok = ok && ::fchmod(fd, old.st_mode & 07777) == 0;
        if (ok) {
            const int from = ::open(encoded(target).constData(), O_RDONLY | O_CLOEXEC);
            ok = from >= 0 && copyAttributes(from, fd);
            if (from >= 0)
                ::close(from);
        }
    } else {
        const mode_t mask = ::umask(0);
        ::umask(mask);
        ok = ::fchmod(fd, 0666 & ~mask) == 0;
    }
    return finish(fd, temporary, bytes, encoded(target), ok, reason);
}

bool writeNewFile(const QString& path, const QByteArray& bytes, mode_t mode, QString* reason)
{
    QByteArray temporary;
    const int fd = temporaryBeside(path, &temporary);
    if (fd < 0) {
        *reason = systemReason(errno);
        return false;
    }
    return finish(fd, temporary, bytes, encoded(path), ::fchmod(fd, mode & 07777) == 0, reason);
}

DirectoryLock::~DirectoryLock()
{
    unlock();
}

bool DirectoryLock::lock(const QString& path, QString* reason, int timeoutMs)
{
    unlock();
    const QString dir = QFileInfo(finalTarget(path)).absolutePath();
    fd = ::open(encoded(dir).constData(), O_RDONLY | O_DIRECTORY | O_CLOEXEC);
    if (fd < 0) {
        *reason = systemReason(errno);
        return false;
    }
    QElapsedTimer waited;
    waited.start();
    while (::flock(fd, LOCK_EX | LOCK_NB) != 0) {
        if ((errno != EWOULDBLOCK && errno != EINTR) || waited.elapsed() >= timeoutMs) {
            const int error = errno;
            unlock();
            *reason = error == EWOULDBLOCK
                          ? HotkeysFile::tr("Another program is writing a hotkeys file in %1; gave up "
                                            "waiting after %2 seconds")
                                .arg(dir)
                                .arg(timeoutMs / 1000)
                          : systemReason(error);
            return false;
        }
        QThread::msleep(10);
    }
    return true;
}

void DirectoryLock::unlock()
{
    if (fd >= 0) {
        ::close(fd); // closing drops the lock
        fd = -1;
    }
}
