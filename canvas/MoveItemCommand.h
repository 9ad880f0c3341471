#pragma once

#include "canvas/CommandTitle.h"

#include <QPointF>
#include <QUndoCommand>

class CanvasScene;

// A move of one object; made by the scene, owned by the undo stack. Scene coordinates.
class MoveItemCommand : public QUndoCommand
{
public:
    MoveItemCommand(CanvasScene* scene, int id, QPointF oldPosition, QPointF newPosition,
                    QUndoCommand* parent = nullptr);

    void undo() override;
    void redo() override;

private:
    void moveTo(QPointF position);

    CanvasScene* m_scene;
    CommandTitle m_title;
    QPointF m_oldPosition;
    QPointF m_newPosition;
    int m_objectId;
};
