#pragma once

#include "canvas/CommandTitle.h"
#include "document/TText.h"

#include <QUndoCommand>

class CanvasScene;

// Hides a text object; made by the scene, owned by the undo stack. Undo builds the object anew from the copy
// that was taken when the command was made.
class DeleteItemCommand : public QUndoCommand
{
public:
    // Copies the record, which must not be null.
    DeleteItemCommand(CanvasScene* scene, TText* record, QUndoCommand* parent = nullptr);

    void undo() override;
    void redo() override;

private:
    CanvasScene* m_scene;
    CommandTitle m_title;
    TText m_record;
    TText m_lastAlpha;
};
