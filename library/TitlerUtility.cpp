#include "library/TitlerUtility.h"

#include <QFileInfo>
#include <QString>

std::string TitlerUtility::getThumbnailNameFromTitlePath(std::string title, std::string suffix)
{
    return QFileInfo(QString::fromStdString(title)).baseName().toStdString() + suffix;
}

std::string TitlerUtility::getThumbnailPathFromTitlePath(std::string title, std::string name)
{
    return QFileInfo(QString::fromStdString(title)).path().toStdString() + "/" + name;
}
