#include "editedfile.h"

#include "hotkeysfile.h"
#include "safefile.h"

#include <QCryptographicHash>
#include <QFile>
#include <QFileInfo>
#include <QFileSystemWatcher>
#include <QTimer>

#include <sys/stat.h>

namespace {

QByteArray digestOf(const QByteArray& bytes)
{
    return QCryptographicHash::hash(bytes, QCryptographicHash::Sha1);
}

// What a file holds, in short; empty when there is no such file.
QByteArray digestOfFile(const QString& path)
{
    QFile file(path);
    if (path.isEmpty() || !file.open(QIODevice::ReadOnly))
        return QByteArray();
    return digestOf(file.read(largestHotkeysFile + 1));
}

} // namespace

EditedFile::EditedFile(QObject* parent)
    : QObject(parent), watcher(new QFileSystemWatcher(this)), quiet(new QTimer(this))
{
    // A save by another program is a burst of events (temporary file, rename, directory); one
    // look once they are over is enough.
    quiet->setSingleShot(true);
    quiet->setInterval(300);
    connect(watcher, &QFileSystemWatcher::fileChanged, quiet, qOverload<>(&QTimer::start));
    connect(watcher, &QFileSystemWatcher::directoryChanged, quiet, qOverload<>(&QTimer::start));
    connect(quiet, &QTimer::timeout, this, &EditedFile::settle);
}

EditedFile::~EditedFile() = default;

bool EditedFile::isMerged() const
{
    return !filePath.isEmpty() && filePath == userHotkeysFilePath();
}

QString EditedFile::systemPath() const
{
    return isMerged() ? systemHotkeysFilePath() : QString();
}

bool EditedFile::load(const QString& path)
{
    const QString system = path == userHotkeysFilePath() ? systemHotkeysFilePath() : QString();
    if (path.isEmpty() || !bindings.load(path, system, &failed, &lastError)) {
        if (path.isEmpty()) {
            failed.clear();
            lastError = tr("No file name");
        }
        return false;
    }
    filePath = path;
    remember(bindings.readBytes());
    return true;
}

void EditedFile::setBindings(const HotkeysModel& state, BindingId focus)
{
    const HotkeysModel before = bindings;
    bindings = state;
    emit bindingsChanged(before, focus);
}

void EditedFile::setPath(const QString& path)
{
    filePath = path;
    // Nothing of the new file was read: only the lock guards a write to it.
    fileDigest.clear();
    systemDigest.clear();
    watchedSystem.clear();
    rewatch();
}

EditedFile::SaveResult EditedFile::save(const QByteArray& accepted)
{
    if (filePath.isEmpty()) {
        lastError = tr("No file name");
        return SaveResult::Failed;
    }
    DirectoryLock lock;
    if (!lock.lock(filePath, &lastError))
        return SaveResult::Failed;
    const Change now = change();
    if (now != Change::None && now != Change::Vanished && diskState() != accepted)
        return SaveResult::Changed;
    QByteArray bytes;
    if (!bindings.toBytes(isMerged(), &bytes, &lastError) || !writeFileSafely(filePath, bytes, &lastError))
        return SaveResult::Failed;
    remember(bytes);
    lastError.clear();
    return SaveResult::Saved;
}

EditedFile::Change EditedFile::change() const
{
    if (fileDigest.isEmpty())
        return Change::None;
    if (!QFileInfo::exists(filePath))
        return Change::Vanished;
    if (digestOfFile(filePath) != fileDigest)
        return Change::EditedFile;
    if (!watchedSystem.isEmpty() && digestOfFile(watchedSystem) != systemDigest)
        return Change::SystemFile;
    return Change::None;
}

QByteArray EditedFile::diskState() const
{
    return digestOfFile(filePath) + digestOfFile(watchedSystem);
}

bool EditedFile::copy(const QString& from, const QString& to)
{
    // Copying a file onto itself would change nothing.
    const QString source = QFileInfo(from).canonicalFilePath();
    if (!source.isEmpty() && source == QFileInfo(to).canonicalFilePath())
        return true;
    QByteArray bytes;
    DirectoryLock lock;
    return readHotkeysFile(from, &bytes, &lastError) && lock.lock(to, &lastError) &&
           writeFileSafely(to, bytes, &lastError);
}

bool EditedFile::keepBackup(const QString& path)
{
    QByteArray bytes;
    struct stat info;
    if (!QFileInfo::exists(path))
        return true;
    DirectoryLock lock;
    return lock.lock(path, &lastError) && readHotkeysFile(path, &bytes, &lastError) &&
           ::stat(QFile::encodeName(path).constData(), &info) == 0 &&
           writeNewFile(path + QLatin1Char('~'), bytes, info.st_mode, &lastError);
}

void EditedFile::remember(const QByteArray& fileBytes)
{
    // The digest of the bytes read or written, not of the file read again: a change made in
    // between must count as a change.
    fileDigest = digestOf(fileBytes);
    watchedSystem = systemPath();
    systemDigest = digestOfFile(watchedSystem);
    rewatch();
}

void EditedFile::rewatch()
{
    // A file replaced by a rename, as every save does, is no longer watched under its name; the
    // directories tell when it comes back.
    const QStringList watched = watcher->files() + watcher->directories();
    if (!watched.isEmpty())
        watcher->removePaths(watched);
    for (const QString& path : {filePath, watchedSystem}) {
        if (path.isEmpty())
            continue;
        if (QFileInfo::exists(path))
            watcher->addPath(path);
        watcher->addPath(QFileInfo(path).absolutePath());
    }
}

void EditedFile::settle()
{
    rewatch();
    const Change now = change();
    if (now != Change::None)
        emit changedOnDisk(now);
}
