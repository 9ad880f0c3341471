#include "canvas/CreateItemCommand.h"

#include "canvas/CanvasScene.h"

CreateItemCommand::CreateItemCommand(CanvasScene* scene, QUndoCommand* parent)
    : CanvasCommand(scene, parent), m_objectId(scene->initCGraphicsTextItem())
{
}

void CreateItemCommand::undoChange()
{
    GraphicsText* item = shownItem(m_objectId);
    if (!item)
        return;
    m_record.reset(item->getTextList());
    m_lastAlpha = *item->getLastAlpaTextStyleValue();
    scene().deleteItem(item);
}

void CreateItemCommand::redoChange()
{
    if (!m_record || !titleIsShown())
        return;
    scene().rebuildItem(m_record.get(), m_lastAlpha);
    m_record.reset();
}
