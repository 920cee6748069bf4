#include "modelcommand.h"

#include "keysconfform.h"

ModelCommand::ModelCommand(KeysConfForm* form, const QString& text, const HotkeysModel& before,
                           const HotkeysModel& after, BindingId focus)
    : QUndoCommand(text), form(form), before(before), after(after), focus(focus)
{
}

void ModelCommand::undo()
{
    form->showBindings(before, focus);
}

void ModelCommand::redo()
{
    if (done) {
        done = false;
        return;
    }
    form->showBindings(after, focus);
}
