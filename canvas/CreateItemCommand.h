#pragma once

#include "canvas/CommandTitle.h"
#include "document/TText.h"

#include <QUndoCommand>
#include <memory>

class CanvasScene;

// Makes a new text object; made by the scene, owned by the undo stack. Undo hides the object, redo builds it
// anew.
class CreateItemCommand : public QUndoCommand
{
public:
    // Makes the object at once, so that it exists before the command is pushed.
    explicit CreateItemCommand(CanvasScene* scene, QUndoCommand* parent = nullptr);

    void undo() override;
    void redo() override;

    // -1 when no object could be made.
    int objectId() const { return m_objectId; }

private:
    CanvasScene* m_scene;
    CommandTitle m_title;
    // Null until the first undo and after each redo.
    std::unique_ptr<TText> m_record;
    TText m_lastAlpha;
    int m_objectId;
};
