#pragma once

#include "hotkeysmodel.h"

#include <QUndoCommand>

class EditedFile;

// One edit as an undoable step: the bindings before and after it, and the row it is about. It
// acts on the edited file's bindings alone; whoever shows them follows the file's signal.
class ModelCommand : public QUndoCommand
{
public:
    ModelCommand(EditedFile* file, const QString& text, const HotkeysModel& before, const HotkeysModel& after,
                 BindingId focus);

    void undo() override;
    void redo() override;

private:
    EditedFile* file;
    HotkeysModel before;
    HotkeysModel after;
    BindingId focus;
};
