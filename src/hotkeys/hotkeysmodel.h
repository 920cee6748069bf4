#pragma once

#include <QByteArray>
#include <QHash>
#include <QSet>
#include <QString>
#include <QStringList>
#include <QVector>

#include <memory>

class HotkeysEntries;

using BindingId = quint32;

enum class BindingSource {
    Unset,  // a catalogue function that no file has bound yet
    User,   // from the edited file, or changed in the editor
    System, // from the system hotkeys file
};

// What a binding or a disabled key was read as, so that an action nobody changed keeps the
// bytes it was written in.
struct EntryOrigin
{
    QByteArray rawValue; // the value as written, trimmed
    QString readAction;  // the action it was read as
    int lineNumber = 0;
    int line = -1;           // edited file: the index of the line that counts among its lines
    bool editedFile = false; // read from the edited file, not the system file
};

// One binding row: a catalogue function or a command line, its key and where it comes from.
struct Binding
{
    BindingId id = 0;
    int function = -1;  // index into HotkeysModel::functionNames(); -1 for a command
    QString command;    // commands only
    QString key;        // stored key: QKeySequence portable text, or text the key server could not read
    QByteArray fileKey; // the key as the file writes it; a placeholder for a keyless command
    BindingSource source = BindingSource::Unset;
    std::shared_ptr<const EntryOrigin> origin;
    bool keyRecorded = false; // fileKey was made from the stored key, not read from a file

    bool isCommand() const { return function < 0; }
};

struct DisabledKey
{
    QString key;
    QByteArray fileKey;
    std::shared_ptr<const EntryOrigin> origin;
};

// The bindings of one hotkeys file, merged over the system file when it is the user's, as
// rows in the order the editor shows them: every catalogue function with one or more rows, then
// the commands. The rules of the file live here: merging, writing, and which binding holds a
// key. Writing changes only the lines of the keys whose meaning the edits changed; everything
// else of the file read comes back byte for byte. No widgets.
class HotkeysModel
{
public:
    HotkeysModel();

    // Reads the file, merged with the system file when systemPath is not empty. On failure
    // the model is unchanged, and failedPath and reason say which file and why.
    bool load(const QString& path, const QString& systemPath, QString* failedPath, QString* reason);
    // Merges already read bytes; false when one of them is no hotkeys file, and then
    // systemFailed says whether it was the system file.
    bool loadBytes(const QByteArray& bytes, const QByteArray& systemBytes, bool withSystem,
                   bool* systemFailed = nullptr);

    static const QStringList& functionNames();
    const QVector<Binding>& rowsOf(int function) const { return functionRows.at(function); }
    const QVector<Binding>& commands() const { return commandRows; }
    // Every row, functions in catalogue order, then commands.
    QVector<const Binding*> rows() const;
    const Binding* find(BindingId id) const;
    QStringList disabledKeys() const;
    // The key a disabled key is written under in the file.
    QByteArray disabledFileKey(const QString& key) const;
    // The key a binding is written under in the file.
    QByteArray fileKeyOf(const Binding& binding) const;
    bool isDisabled(const QString& key) const;
    bool isDisabledFileKey(const QByteArray& fileKey) const;
    // Read but not shown: entries of functions this editor does not know.
    int keptEntryCount() const { return kept.size(); }
    // The edited file as it was read.
    const QByteArray& readBytes() const;

    // The binding whose key is the same key as `key` (a stored key; a multi-key sequence by its
    // first key), or as the file key; 0 when none. `except` is passed over.
    BindingId holderOf(const QString& key, BindingId except = 0) const;
    BindingId holderOfFileKey(const QByteArray& fileKey, BindingId except = 0) const;

    // Every edit keeps what the window shows equal to what is saved: a key freed from a system
    // binding, or from a user binding that hid the system file's binding of it, is switched
    // off, unless another row holds it.
    void setKey(BindingId id, const QString& key);
    // The same for a key given in file form, written as given.
    void setFileKey(BindingId id, const QByteArray& fileKey);
    void clearKey(BindingId id);
    void setCommand(BindingId id, const QString& command);
    BindingId addCommand(const QString& command);
    // A row for the function: its keyless row, or a further one; 0 for an unknown name.
    BindingId rowForFunction(const QString& name);
    // A keyless copy placed right after the row; 0 when there is no such row.
    BindingId cloneRow(BindingId id);
    // False for a function's last row, which always stays.
    bool removeRow(BindingId id);
    // The key moves from the row that holds it, which is left without one, to the target row.
    void reassign(BindingId holder, BindingId target);
    // Whether the row is one the system file gives (a function it binds, or a command line it
    // runs) and differs from what the system file gives.
    bool canRevert(BindingId id) const;
    // Makes the row's function, or the command row, what the system file gives, its keys no
    // longer disabled. A key this frees that the system file gives to a row now without a key
    // goes back to that row. Gives back the system keys that other rows hold, which stay with
    // them; `focus` (when given) becomes the row the revert is about afterwards.
    QStringList revert(BindingId id, BindingId* focus = nullptr);

    // The file's bytes: the file read, with the lines of every key whose meaning changed
    // rewritten in place, removed or added (only the user's rows count when userFile).
    // Keyless commands are given placeholder keys first. False, with the reason, when an entry
    // cannot be written so that it reads back the same.
    bool toBytes(bool userFile, QByteArray* bytes, QString* reason);

private:
    friend class HotkeysReader;
    friend class HotkeysRevert;
    friend class HotkeysWriter;

    struct Kept
    {
        QByteArray fileKey;
        std::shared_ptr<const EntryOrigin> origin;
    };

    Binding* findMutable(BindingId id);
    void assignKey(Binding* row, const QString& key, const QByteArray& fileKey, bool recorded);
    void keepFreedKeyOff(const Binding& row);
    void enable(const QByteArray& fileKey);

    QVector<QVector<Binding>> functionRows;
    QVector<Binding> commandRows;
    QVector<DisabledKey> disabled;
    QVector<Kept> kept;
    // What the system file binds: each function's keys in the order read, and every key.
    QHash<int, QVector<Binding>> systemBindings;
    QVector<Binding> systemCommands;
    QSet<QByteArray> systemKeys;
    // The edited file as read: its bytes, lines and entries, which writing patches.
    std::shared_ptr<const HotkeysEntries> base;
    BindingId lastId = 0;
};
