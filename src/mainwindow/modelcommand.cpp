#include "modelcommand.h"

#include "editedfile.h"

ModelCommand::ModelCommand(EditedFile* file, const QString& text, const HotkeysModel& before,
                           const HotkeysModel& after, BindingId focus)
    : QUndoCommand(text), file(file), before(before), after(after), focus(focus)
{
}

void ModelCommand::undo()
{
    file->setBindings(before, focus);
}

void ModelCommand::redo()
{
    file->setBindings(after, focus);
}
