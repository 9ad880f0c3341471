#include "canvas/StyleComparison.h"

#include "document/TText.h"

#include <algorithm>
#include <string>

namespace
{

bool stringIsTheSame(const std::string& reference, const std::string& other)
{
    return reference.empty() || reference == other;
}

bool intNumIsTheSame(int reference, int other)
{
    return reference == -1 || reference == other;
}

bool boolNumIsTheSame(bool reference, bool other)
{
    return !reference || other;
}

bool looksLike(const TextStyle& first, const TextStyle& other)
{
    return stringIsTheSame(first.getFontFamily(), other.getFontFamily()) &&
           stringIsTheSame(first.getFontColor(), other.getFontColor()) &&
           stringIsTheSame(first.textEdge().getEdgeColor(), other.textEdge().getEdgeColor()) &&
           intNumIsTheSame(first.getFontSize(), other.getFontSize()) &&
           intNumIsTheSame(first.getTextKerning(), other.getTextKerning()) &&
           intNumIsTheSame(first.textEdge().getEdgeWidth(), other.textEdge().getEdgeWidth()) &&
           boolNumIsTheSame(first.isFontBold() != 0, other.isFontBold() != 0) &&
           boolNumIsTheSame(first.isTextEdge() != 0, other.isTextEdge() != 0) &&
           boolNumIsTheSame(first.isTextItalic() != 0, other.isTextItalic() != 0);
}

} // namespace

bool StyleComparison::isTheSame(const TText& style)
{
    const auto& items = style.textItems();
    if (items.size() < 2)
        return true;
    return std::all_of(items.begin() + 1, items.end(),
                       [&items](const TextStyle* other) { return looksLike(*items.front(), *other); });
}
