#pragma once

#include "titlectl/CheckRule.h"

#include <QList>

// The rules about the texts of a title, and whether the title can be read at all. Of the rules about where a
// text stands and whether it is seen, one applies at most to each text.
namespace TextRules
{

QList<CheckRule> table();

} // namespace TextRules
