#include "editcommands.h"

#include "editedfile.h"
#include "modelcommand.h"

#include <QCoreApplication>
#include <QKeySequence>
#include <QUndoStack>

namespace {

// The steps' texts, in the window's translation context.
struct Texts
{
    Q_DECLARE_TR_FUNCTIONS(KeysConfForm)
};

QString shown(const QString& key)
{
    return QKeySequence::fromString(key, QKeySequence::PortableText).toString(QKeySequence::NativeText);
}

} // namespace

EditCommands::EditCommands(EditedFile* file, QUndoStack* stack, std::function<QString(BindingId)> nameOf)
    : file(file), stack(stack), nameOf(std::move(nameOf))
{
}

const HotkeysModel& EditCommands::model() const
{
    return file->model();
}

void EditCommands::push(const QString& text, BindingId focus, const HotkeysModel& after)
{
    stack->push(new ModelCommand(file, text, model(), after, focus));
}

void EditCommands::assign(BindingId id, const QString& key)
{
    HotkeysModel after = model();
    after.setKey(id, key);
    push(Texts::tr("Assign %1 to %2").arg(shown(key), nameOf(id)), id, after);
}

void EditCommands::reassign(BindingId holder, BindingId id)
{
    const Binding* held = model().find(holder);
    if (!held)
        return;
    HotkeysModel after = model();
    after.reassign(holder, id);
    push(Texts::tr("Reassign %1 from %2 to %3").arg(shown(held->key), nameOf(holder), nameOf(id)), id, after);
}

void EditCommands::clear(BindingId id)
{
    HotkeysModel after = model();
    after.clearKey(id);
    push(Texts::tr("Clear the key of %1").arg(nameOf(id)), id, after);
}

BindingId EditCommands::addCommand(const QString& command)
{
    HotkeysModel after = model();
    const BindingId id = after.addCommand(command);
    push(Texts::tr("Add command %1").arg(command), id, after);
    return id;
}

void EditCommands::setCommand(BindingId id, const QString& command)
{
    HotkeysModel after = model();
    after.setCommand(id, command);
    push(Texts::tr("Edit command %1").arg(command), id, after);
}

BindingId EditCommands::clone(BindingId id)
{
    HotkeysModel after = model();
    const BindingId copy = after.cloneRow(id);
    if (copy)
        push(Texts::tr("Clone %1").arg(nameOf(id)), copy, after);
    return copy;
}

bool EditCommands::remove(BindingId id)
{
    HotkeysModel after = model();
    if (!after.removeRow(id))
        return false;
    push(Texts::tr("Delete %1").arg(nameOf(id)), id, after);
    return true;
}

QStringList EditCommands::revert(BindingId id)
{
    HotkeysModel after = model();
    BindingId focus = id;
    const QStringList heldElsewhere = after.revert(id, &focus);
    push(Texts::tr("Revert %1 to the system binding").arg(nameOf(id)), focus, after);
    return heldElsewhere;
}
