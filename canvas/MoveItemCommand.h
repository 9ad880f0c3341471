#pragma once

#include "canvas/CanvasCommand.h"

#include <QPointF>

// A move of one object. Scene coordinates.
class MoveItemCommand : public CanvasCommand
{
public:
    MoveItemCommand(CanvasScene* scene, int id, QPointF oldPosition, QPointF newPosition,
                    QUndoCommand* parent = nullptr);

private:
    void undoChange() override;
    void redoChange() override;
    void moveTo(QPointF position);

    QPointF m_oldPosition;
    QPointF m_newPosition;
    int m_objectId;
};
