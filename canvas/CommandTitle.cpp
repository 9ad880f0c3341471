#include "canvas/CommandTitle.h"

#include "canvas/CanvasScene.h"
#include "document/Archive.h"

CommandTitle::CommandTitle(const CanvasScene& scene) : m_scene(scene), m_path(pathOf(scene))
{
}

bool CommandTitle::isShown() const
{
    return pathOf(m_scene) == m_path;
}

std::string CommandTitle::pathOf(const CanvasScene& scene)
{
    return scene.archive() ? scene.archive()->getPath() : std::string();
}
