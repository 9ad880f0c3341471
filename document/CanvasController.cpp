#include "document/CanvasController.h"

#include "document/ArchiveManager.h"

#include <QDebug>

CanvasController::CanvasController() : mArchiveManager(ArchiveManager::getInstance())
{
}

void CanvasController::saveArchiveChange(QString path, Archive* archive)
{
    if (path.isEmpty())
        return;
    const int result = mArchiveManager->saveArchive(path.toStdString(), archive);
    if (result == 1)
        qDebug("Save Archive Success !");
    else if (result == 0)
        qDebug("Path is invalid !");
    else
        qDebug("Save Archive failed !");
}

int CanvasController::getTextStyle(FontStyle* style)
{
    return mSettingManager.loadLastTextParameter(style);
}
