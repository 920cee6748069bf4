#pragma once

#include "hotkeysmodel.h"

#include <QUndoCommand>

class KeysConfForm;

// One edit as an undoable step: the bindings before and after it, and the row it was about.
// The edit itself is done by the window before the step is pushed, so the first redo does
// nothing; later ones, and undo, show the whole state of the other side.
class ModelCommand : public QUndoCommand
{
public:
    ModelCommand(KeysConfForm* form, const QString& text, const HotkeysModel& before,
                 const HotkeysModel& after, BindingId focus);

    void undo() override;
    void redo() override;

private:
    KeysConfForm* form;
    HotkeysModel before;
    HotkeysModel after;
    BindingId focus;
    bool done = true;
};
