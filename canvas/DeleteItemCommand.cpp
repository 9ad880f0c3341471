#include "canvas/DeleteItemCommand.h"

#include "canvas/CanvasScene.h"

DeleteItemCommand::DeleteItemCommand(CanvasScene* scene, TText* record, QUndoCommand* parent)
    : CanvasCommand(scene, parent), m_record(*record)
{
}

void DeleteItemCommand::undoChange()
{
    if (titleIsShown())
        scene().rebuildItem(&m_record, m_lastAlpha);
}

void DeleteItemCommand::redoChange()
{
    GraphicsText* item = shownItem(m_record.getTextObjectID());
    if (!item)
        return;
    m_lastAlpha = *item->getLastAlpaTextStyleValue();
    scene().deleteItem(item);
}
