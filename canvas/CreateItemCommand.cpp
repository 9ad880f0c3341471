#include "canvas/CreateItemCommand.h"

#include "canvas/CanvasScene.h"

CreateItemCommand::CreateItemCommand(CanvasScene* scene, QUndoCommand* parent)
    : QUndoCommand(parent), m_scene(scene), m_title(*scene), m_objectId(scene->initCGraphicsTextItem())
{
}

void CreateItemCommand::undo()
{
    m_scene->saveArchiveFlag();
    GraphicsText* item = m_title.isShown() ? m_scene->findTextItem(m_objectId) : nullptr;
    if (item) {
        m_record.reset(item->getTextList());
        m_lastAlpha = *item->getLastAlpaTextStyleValue();
        m_scene->deleteItem(item);
    }
    m_scene->update();
    m_scene->saveArchive();
}

void CreateItemCommand::redo()
{
    m_scene->saveArchiveFlag();
    if (m_record && m_title.isShown()) {
        m_scene->rebuildItem(m_record.get(), m_lastAlpha);
        m_record.reset();
    }
    m_scene->update();
    m_scene->saveArchive();
}
