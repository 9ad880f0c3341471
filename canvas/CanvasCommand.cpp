#include "canvas/CanvasCommand.h"

#include "canvas/CanvasScene.h"
#include "document/Archive.h"

namespace
{

std::string shownPath(const CanvasScene& scene)
{
    return scene.archive() ? scene.archive()->getPath() : std::string();
}

} // namespace

CanvasCommand::CanvasCommand(CanvasScene* scene, QUndoCommand* parent)
    : QUndoCommand(parent), m_scene(scene), m_path(shownPath(*scene))
{
}

bool CanvasCommand::titleIsShown() const
{
    return shownPath(*m_scene) == m_path;
}

GraphicsText* CanvasCommand::shownItem(int id) const
{
    return titleIsShown() ? m_scene->findTextItem(id) : nullptr;
}

void CanvasCommand::undo()
{
    m_scene->saveArchiveFlag();
    undoChange();
    m_scene->update();
    m_scene->saveArchive();
}

void CanvasCommand::redo()
{
    m_scene->saveArchiveFlag();
    redoChange();
    m_scene->update();
    m_scene->saveArchive();
}
