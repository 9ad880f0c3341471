#pragma once

#include "canvas/CanvasCommand.h"
#include "document/TText.h"

#include <memory>

// Makes a new text object; Undo hides the object, redo builds it
// anew.
class CreateItemCommand : public CanvasCommand
{
public:
    // Makes the object at once, so that it exists before the command is pushed.
    explicit CreateItemCommand(CanvasScene* scene, QUndoCommand* parent = nullptr);

    // -1 when no object could be made.
    int objectId() const { return m_objectId; }

private:
    void undoChange() override;
    void redoChange() override;

    // Null until the first undo and after each redo.
    std::unique_ptr<TText> m_record;
    TText m_lastAlpha;
    int m_objectId;
};
