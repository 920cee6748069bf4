#pragma once

#include "hotkeysmodel.h"

#include <QObject>
#include <QString>

class QFileSystemWatcher;
class QTimer;

// The hotkeys file being edited: its path, its bindings (shown over the system file when it is
// the user's own), and what it and the system file held when they were last read or written,
// so that a write never silently replaces another program's change. Every write holds the lock
// on the file's directory from that check until the file is replaced. Both files are watched,
// and a change by another program is told once it has settled.
class EditedFile : public QObject
{
    Q_OBJECT

public:
    enum class Change { None, EditedFile, SystemFile, Vanished };
    enum class SaveResult { Saved, Changed, Failed };

    explicit EditedFile(QObject* parent = nullptr);
    ~EditedFile() override;

    const QString& path() const { return filePath; }
    // The user's own file is shown over the system file; any other file alone.
    bool isMerged() const;
    QString systemPath() const;
    HotkeysModel& model() { return bindings; }
    const HotkeysModel& model() const { return bindings; }
    // The bindings become this state, as an edit or its undoing makes them; told with the state
    // before, and the binding the change is about.
    void setBindings(const HotkeysModel& state, BindingId focus);

    // Reads the file, and the system file for the user's own; on failure nothing changes, and
    // failedPath() and error() say which file failed and why.
    bool load(const QString& path);
    // Another name for the same bindings, as New and Save As choose one; nothing is read.
    void setPath(const QString& path);
    // Writes the bindings. Changed, with nothing written, when a file changed on disk since it
    // was read or written, unless what is on disk now is `accepted` (diskState() when the user
    // agreed to overwrite it).
    SaveResult save(const QByteArray& accepted = QByteArray());
    // What changed on disk since the files were read or written, and, in short, what is there.
    Change change() const;
    QByteArray diskState() const;
    // Copies a file's bytes onto another, all or nothing, waiting for other writers of the target.
    bool copy(const QString& from, const QString& to);
    // Keeps the file as it is beside itself, under its name with "~" added: a new file with the
    // file's permissions, replacing whatever stands under that name (a planted link included).
    bool keepBackup(const QString& path);

    QString failedPath() const { return failed; }
    QString error() const { return lastError; }

signals:
    void bindingsChanged(const HotkeysModel& before, BindingId focus);
    // Another program changed the edited file or the system file; told once they are quiet.
    void changedOnDisk(EditedFile::Change change);

private:
    void remember(const QByteArray& fileBytes);
    void rewatch();
    void settle();

    QString filePath;
    HotkeysModel bindings;
    QString watchedSystem;
    QByteArray fileDigest;
    QByteArray systemDigest;
    QString failed;
    QString lastError;
    QFileSystemWatcher* watcher = nullptr;
    QTimer* quiet = nullptr;
};
