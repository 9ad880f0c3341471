// The creation of a title travels as a PasteArchiveCommand; this command changes nothing and keeps the signal
// that is reserved for it typed.
#pragma once

#include <QUndoCommand>

class CreateArchiveCommand : public QUndoCommand
{
public:
    using QUndoCommand::QUndoCommand;

    void redo() override {}
    void undo() override {}
};
