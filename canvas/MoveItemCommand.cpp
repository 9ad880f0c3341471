#include "canvas/MoveItemCommand.h"

#include "canvas/CanvasScene.h"
#include "canvas/StyleDocument.h"
#include "document/TText.h"

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
        item->getItemTText()->setXValue(float(position.x()));
        item->getItemTText()->setYValue(float(position.y()));
        if (GraphicsText* parent = item->parentTextItem())
            parent->setPos(position);
        item->setPos(0.0, 0.0);
        // The next change of style starts from this place.
        item->styles().refreshUndoBaseline();
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
