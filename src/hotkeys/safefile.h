#pragma once

#include <QByteArray>
#include <QString>

#include <sys/types.h>

// Replaces the file with the bytes, or leaves it exactly as it was: the bytes go to a new file
// beside it, every write, the flush to disk and the close are checked, and only then does the
// new file take the old one's name. Mode, owner, group and extended attributes (ACLs) are kept;
// a symbolic link stays a link and its target is replaced. Refused, with the file untouched: a
// file whose owner may not write it (for root too), another account's file (unless root), a
// file with further hard links, more than 16 MiB, and, for root, a symbolic link of another
// account (the kernel's protected-symlink rule, applied in every directory). On failure
// `reason` says why, in the system's words where it has them.
bool writeFileSafely(const QString& path, const QByteArray& bytes, QString* reason);

// Writes the bytes as a new file of that mode and renames it over `path`, whatever stands there:
// a symbolic link at `path` is replaced, never followed. For backups beside a file.
bool writeNewFile(const QString& path, const QByteArray& bytes, mode_t mode, QString* reason);

// The file a path finally names, following symbolic links, so that saving through a link
// replaces the file behind it and the link stays.
QString finalTarget(const QString& path);

// An advisory lock (flock) on the directory of a hotkeys file, held across every read-modify-
// write of this program, so that two writers never interleave and no lock file is left behind.
// Released when destroyed.
class DirectoryLock
{
public:
    // How long a writer waits for another before it gives up.
    static constexpr int defaultTimeoutMs = 5000;

    DirectoryLock() = default;
    ~DirectoryLock();
    DirectoryLock(const DirectoryLock&) = delete;
    DirectoryLock& operator=(const DirectoryLock&) = delete;

    // Locks the directory the file at `path` finally lies in; false, with the reason, when the
    // lock was not had within the time.
    bool lock(const QString& path, QString* reason, int timeoutMs = defaultTimeoutMs);
    void unlock();
    bool isLocked() const { return fd >= 0; }

private:
    int fd = -1;
};
