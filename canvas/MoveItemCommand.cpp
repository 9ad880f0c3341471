#include "canvas/MoveItemCommand.h"

#include "canvas/CanvasScene.h"

MoveItemCommand::MoveItemCommand(CanvasScene* scene, int id, QPointF oldPosition, QPointF newPosition,
                                 QUndoCommand* parent)
    : CanvasCommand(scene, parent), m_oldPosition(oldPosition), m_newPosition(newPosition), m_objectId(id)
{
}

void MoveItemCommand::moveTo(QPointF position)
{
    if (GraphicsText* item = shownItem(m_objectId)) {
        item->placeAt(position);
        item->changeItemToSolidLineState();
    }
}

void MoveItemCommand::undoChange()
{
    moveTo(m_oldPosition);
}

void MoveItemCommand::redoChange()
{
    moveTo(m_newPosition);
}
