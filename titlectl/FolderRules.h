#pragma once

#include "titlectl/CheckRule.h"

#include <QList>

// The rules about the files of a folder: its order and what is left over.
namespace FolderRules
{

QList<CheckRule> table();

} // namespace FolderRules
