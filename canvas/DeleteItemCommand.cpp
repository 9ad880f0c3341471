#include "canvas/DeleteItemCommand.h"

#include "canvas/CanvasScene.h"

DeleteItemCommand::DeleteItemCommand(CanvasScene* scene, TText* record, QUndoCommand* parent)
    : QUndoCommand(parent), m_scene(scene), m_title(*scene), m_record(*record)
{
}

void DeleteItemCommand::undo()
{
    m_scene->saveArchiveFlag();
    if (m_title.isShown())
        m_scene->rebuildItem(&m_record, m_lastAlpha);
    m_scene->update();
    m_scene->saveArchive();
}

void DeleteItemCommand::redo()
{
    m_scene->saveArchiveFlag();
    GraphicsText* item = m_title.isShown() ? m_scene->findTextItem(m_record.getTextObjectID()) : nullptr;
    if (item) {
        m_lastAlpha = *item->getLastAlpaTextStyleValue();
        m_scene->deleteItem(item);
    }
    m_scene->update();
    m_scene->saveArchive();
}
