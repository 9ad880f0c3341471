#include "library/TitlerUtility.h"

#include "document/ArchiveManager.h"

#include <QFileInfo>
#include <QString>
#include <utility>

std::string TitlerUtility::getThumbnailNameFromTitlePath(std::string title, std::string suffix)
{
    return QFileInfo(QString::fromStdString(title)).baseName().toStdString() + suffix;
}

std::string TitlerUtility::getThumbnailPathFromTitlePath(std::string title, std::string name)
{
    return QFileInfo(QString::fromStdString(title)).path().toStdString() + "/" + name;
}

std::string TitlerUtility::getPicturePathFromTitlePath(std::string title, std::string name)
{
    if (!ArchiveManager::isPictureName(name))
        return {};
    return getThumbnailPathFromTitlePath(std::move(title), std::move(name));
}
