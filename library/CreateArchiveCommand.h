#pragma once

#include <QUndoCommand>

// Does nothing; it is the command type of the signal for created titles. A title is created with a
// PasteArchiveCommand.
class CreateArchiveCommand : public QUndoCommand
{
public:
    using QUndoCommand::QUndoCommand;

    void redo() override {}
    void undo() override {}
};
