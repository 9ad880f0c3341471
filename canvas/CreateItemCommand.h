#pragma once

#include "canvas/CanvasCommand.h"
#include "document/TText.h"

#include <memory>

// Creates a text object. Undo hides the object, redo creates it anew.
class CreateItemCommand : public CanvasCommand
{
public:
    // Creates the object at once, so that it exists before the command is pushed.
    explicit CreateItemCommand(CanvasScene* scene, QUndoCommand* parent = nullptr);

    // Returns the id of the object, or -1 when it could not be created.
    int objectId() const { return m_objectId; }

private:
    void undoChange() override;
    void redoChange() override;

    // Null until the first undo and after each redo.
    std::unique_ptr<TText> m_record;
    TText m_lastAlpha;
    int m_objectId;
};
