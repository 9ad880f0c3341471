#include "library/TitleReports.h"

#include "document/ITitleChangeReporter.h"
#include "library/IEditContext.h"

#include <QFileInfo>
#include <string>

namespace
{

std::wstring fileNameOf(const QString& path)
{
    return QFileInfo(path).fileName().toStdWString();
}

} // namespace

void TitleReports::titleChanged(FileManagerDefine::emTITLECHANGE_TYPE type, const QString& path)
{
    if (ITitleChangeReporter* reporter = ITitleChangeReporter::instance())
        reporter->changeTitlerStatus(type, path);
}

bool TitleReports::isNewInContext(const QString& path)
{
    IEditContext* context = IEditContext::instance();
    return context && context->isNewCreateFile(fileNameOf(path));
}

void TitleReports::addToContext(const QString& path)
{
    if (IEditContext* context = IEditContext::instance())
        context->insertFilePath(fileNameOf(path));
}

void TitleReports::removeFromContext(const QString& path)
{
    if (IEditContext* context = IEditContext::instance())
        context->deleteFilePath(fileNameOf(path));
}
