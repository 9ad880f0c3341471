#pragma once

#include "titlectl/CheckRule.h"

#include <QList>

// The rules about the pictures of a title and its background.
namespace PictureRules
{

QList<CheckRule> table();

} // namespace PictureRules
