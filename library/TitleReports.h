#pragma once

#include "messaging/services/FileManagerDefine.h"

#include <QString>

// Reports titles added or removed by the list's undo commands: to the file manager by full path, and to the
// current request by plain file name. A receiver that is not installed is skipped. GUI thread.
namespace TitleReports
{

void titleChanged(FileManagerDefine::emTITLECHANGE_TYPE type, const QString& path);
bool isNewInContext(const QString& path);
void addToContext(const QString& path);
void removeFromContext(const QString& path);

} // namespace TitleReports
