#pragma once

#include <QByteArray>
#include <QHash>
#include <QSet>
#include <QString>
#include <QStringList>
#include <QVector>

#include <memory>

using BindingId = quint32;

enum class BindingSource {
    Unset,  // a catalogue function that no file has bound yet
    User,   // from the edited file, or changed in the editor
    System, // from the system hotkeys file
};

// What a binding or a disabled key was read as, so that what nobody edits is written back
// byte for byte.
struct EntryOrigin
{
    QByteArray leading; // comment and blank lines above it
    QByteArray line;    // its whole line, line end included
    QByteArray rawKey;  // key and value as written, trimmed
    QByteArray rawValue;
    QString readKey; // the stored key and the action it was read as
    QString readAction;
    int lineNumber = 0;
    bool editedFile = false; // read from the edited file, not the system file
};

// One binding row: a catalogue function or a command line, its key and where it comes from.
struct Binding
{
    BindingId id = 0;
    int function = -1; // index into HotkeysModel::functionNames(); -1 for a command
    QString command;   // commands only
    QString key;       // stored key: QKeySequence portable text, or text the key server could not read
    BindingSource source = BindingSource::Unset;
    std::shared_ptr<const EntryOrigin> origin;

    bool isCommand() const { return function < 0; }
};

struct DisabledKey
{
    QString key;
    std::shared_ptr<const EntryOrigin> origin;
};

// The bindings of one hotkeys file, merged over the system file when it is the user's, as
// rows in the order the editor shows and writes them: every catalogue function with one or
// more rows, then the commands. The rules of the file live here: merging, writing, and which
// binding holds a key. No widgets.
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
    QByteArray fileKeyOf(const Binding& binding) const { return writtenKey(binding.key, binding.origin.get()); }
    bool isDisabled(const QString& key) const;
    // Read but not shown: entries of functions this editor does not know.
    int keptEntryCount() const { return kept.size(); }

    // The binding whose key would be written under the same file key as `key`, or that holds
    // the same stored key in any letter case; 0 when none. `except` is passed over.
    BindingId holderOf(const QString& key, BindingId except = 0) const;

    // Every edit keeps what the window shows equal to what is saved: a key freed from a system
    // binding, or from a user binding that hid the system file's binding of it, is switched
    // off, unless another row holds it.
    void setKey(BindingId id, const QString& key);
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
    // Whether the function's rows are other than those the system file gives it.
    bool differsFromSystem(int function) const;
    // Makes the function's rows those the system file gives it, their keys no longer disabled;
    // gives back the system keys that other rows hold, which stay with them.
    QStringList revertToSystem(int function);

    // The file's bytes: the rows in order (only the user's when userFile), the disabled keys,
    // then what was read but not shown; around them the rest of the file as it was read.
    // Keyless commands are given placeholder keys first. False, with the reason, when an entry
    // cannot be written so that it reads back the same.
    bool toBytes(bool userFile, QByteArray* bytes, QString* reason);

private:
    struct Kept
    {
        QByteArray foldedKey;
        std::shared_ptr<const EntryOrigin> origin;
    };

    Binding* findMutable(BindingId id);
    void keepFreedKeyOff(const Binding& row);
    void enable(const QString& key);
    // The system file's rows of the function, as loading arranges them, less the keys that rows
    // of other functions hold.
    QVector<Binding> systemRowsOf(int function) const;
    QByteArray writtenKey(const QString& key, const EntryOrigin* origin) const;
    void assignPlaceholders(bool userFile);

    QVector<QVector<Binding>> functionRows;
    QVector<Binding> commandRows;
    QVector<DisabledKey> disabled;
    QVector<Kept> kept;
    // What the system file binds: each function's keys in the order read, and every key.
    QHash<int, QVector<Binding>> systemBindings;
    QSet<QString> systemKeys;
    // The edited file around its entries: before the section, the section's header, what
    // closes the section, the other sections, and what follows the last line.
    QByteArray beforeSection;
    QByteArray sectionHeader;
    QByteArray sectionEnd;
    QByteArray otherSections;
    QByteArray afterLast;
    BindingId lastId = 0;
};
