#pragma once

#include "hotkeysmodel.h"

#include <QString>
#include <QStringList>

#include <functional>

class EditedFile;
class QUndoStack;

// The one way to make an edit: each is a step of the undo stack that changes the edited file's
// bindings as a whole, named for the user (its undo text). The steps know nothing of the window,
// which follows the edited file's signal.
class EditCommands
{
public:
    // `nameOf` says how a binding is called in the steps' texts (its action).
    EditCommands(EditedFile* file, QUndoStack* stack, std::function<QString(BindingId)> nameOf);
    Q_DISABLE_COPY(EditCommands)

    void assign(BindingId id, const QString& key);
    // The key moves from the row that holds it, which is left without one, to `id`.
    void reassign(BindingId holder, BindingId id);
    void clear(BindingId id);
    BindingId addCommand(const QString& command);
    void setCommand(BindingId id, const QString& command);
    BindingId clone(BindingId id);
    // False for a function's last row, which always stays.
    bool remove(BindingId id);
    // Gives back the system keys that other rows hold.
    QStringList revert(BindingId id);

private:
    void push(const QString& text, BindingId focus, const HotkeysModel& after);
    const HotkeysModel& model() const;

    EditedFile* file;
    QUndoStack* stack;
    std::function<QString(BindingId)> nameOf;
};
