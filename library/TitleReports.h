// Where the list's undo commands report titles that come and go: the file manager by full path, and the
// request at hand by plain file name. Whatever is not installed is left out. GUI thread.
#pragma once

#include "messaging/services/FileManagerDefine.h"

#include <QString>

namespace TitleReports
{

void titleChanged(FileManagerDefine::emTITLECHANGE_TYPE type, const QString& path);
bool isNewInContext(const QString& path);
void addToContext(const QString& path);
void removeFromContext(const QString& path);

} // namespace TitleReports
