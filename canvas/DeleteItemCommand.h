#pragma once

#include "canvas/CanvasCommand.h"
#include "document/TText.h"

// Hides a text object. Undo creates the object anew from the copy that was taken when the command was made.
class DeleteItemCommand : public CanvasCommand
{
public:
    // Copies the record, which must not be null.
    DeleteItemCommand(CanvasScene* scene, TText* record, QUndoCommand* parent = nullptr);

private:
    void undoChange() override;
    void redoChange() override;

    TText m_record;
    TText m_lastAlpha;
};
