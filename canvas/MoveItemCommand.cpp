#include "canvas/MoveItemCommand.h"

#include "canvas/CanvasScene.h"

MoveItemCommand::MoveItemCommand(CanvasScene* scene, int id, QPointF oldPosition, QPointF newPosition,
                                 QUndoCommand* parent)
    : QUndoCommand(parent)
    , m_scene(scene)
    , m_title(*scene)
    , m_oldPosition(oldPosition)
    , m_newPosition(newPosition)
    , m_objectId(id)
{
}

void MoveItemCommand::moveTo(QPointF position)
{
    m_scene->saveArchiveFlag();
    GraphicsText* item = m_title.isShown() ? m_scene->findTextItem(m_objectId) : nullptr;
    if (item) {
        item->placeAt(position);
        item->changeItemToSolidLineState();
    }
    m_scene->update();
    m_scene->saveArchive();
}

void MoveItemCommand::undo()
{
    moveTo(m_oldPosition);
}

void MoveItemCommand::redo()
{
    moveTo(m_newPosition);
}
