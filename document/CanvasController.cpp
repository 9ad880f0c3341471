#include "document/CanvasController.h"

#include "document/Archive.h"
#include "document/ArchiveManager.h"
#include "document/TitleParser.h"
#include "support/LogManager.h"
#include "support/RefusedWrites.h"

#include <cerrno>

CanvasController::CanvasController() : m_archiveManager(ArchiveManager::getInstance())
{
}

bool CanvasController::saveArchiveChange(QString path, Archive* archive)
{
    if (path.isEmpty())
        return false;
    const int result = m_archiveManager->saveArchive(path.toStdString(), archive);
    const int error = errno;
    const wchar_t* const text = result == 1   ? L"Save Archive Success !"
                                : result == 0 ? L"Path is invalid !"
                                              : L"Save Archive failed !";
    LOG_DEBUG_OPERATE(L"CanvasController", 200, text);
    if (result < 0)
        RefusedWrites::keep(archive->getPath(), TitleParser().toBytes(*archive), error);
    return result == 1;
}

int CanvasController::getTextStyle(FontStyle* style)
{
    return m_settingManager.loadLastTextParameter(style);
}
