#include "document/CanvasController.h"

#include "document/ArchiveManager.h"
#include "support/LogManager.h"

CanvasController::CanvasController() : mArchiveManager(ArchiveManager::getInstance())
{
}

void CanvasController::saveArchiveChange(QString path, Archive* archive)
{
    if (path.isEmpty())
        return;
    const int result = mArchiveManager->saveArchive(path.toStdString(), archive);
    const wchar_t* const text = result == 1   ? L"Save Archive Success !"
                                : result == 0 ? L"Path is invalid !"
                                              : L"Save Archive failed !";
    LOG_DEBUG_OPERATE(L"CanvasController", 200, text);
}

int CanvasController::getTextStyle(FontStyle* style)
{
    return mSettingManager.loadLastTextParameter(style);
}
