#include "panel/TextToolsLog.h"

#include "canvas/TextObjectConstants.h"
#include "document/TText.h"
#include "panel/EdgeToolBox.h"
#include "panel/RangeOfMoveText.h"
#include "support/LogManager.h"

namespace
{

constexpr wchar_t LOG_AREA[] = L"Text Property Area";
constexpr int OPERATION = 200;

std::wstring changeintValueToString(int value)
{
    return value == 0 ? L" without " : L" with ";
}

const wchar_t* directionWord(int direction)
{
    switch (direction) {
    case RangeOfMoveText::UPBUTTON_INDEX:
        return L"up";
    case RangeOfMoveText::RIGHTBUTTON_INDEX:
        return L"right";
    case RangeOfMoveText::DOWNBUTTON_INDEX:
        return L"down";
    default:
        return L"left";
    }
}

} // namespace

void TextToolsLog::write(const std::wstring& line)
{
    if (!line.empty())
        LOG_USER_OPERATE(LOG_AREA, OPERATION, line);
}

std::wstring TextToolsLog::family(const QString& family)
{
    return L"Adjust Font Family to " + family.toStdWString();
}

std::wstring TextToolsLog::size(int size)
{
    return L"Adjust Font Size to " + std::to_wstring(size);
}

std::wstring TextToolsLog::bold(int on)
{
    return L"Adjust Bold to" + changeintValueToString(on) + L"bold";
}

std::wstring TextToolsLog::italic(int on)
{
    return L"Adjust Italic to" + changeintValueToString(on) + L"Italic";
}

std::wstring TextToolsLog::color(const QString& color)
{
    return L"Adjust Font Color to " + color.toStdWString();
}

std::wstring TextToolsLog::edge(int on, const TEdge& edge, int undoFlag, int kind)
{
    switch (kind) {
    case EdgeToolBox::SWITCH:
        return L"Adjust Edge to " + changeintValueToString(on) + L"Edge";
    case EdgeToolBox::WIDTH:
        return undoFlag == TextObjectConstants::PreviewedChange
                   ? std::wstring()
                   : L"Adjust Edge Width to " + std::to_wstring(edge.getEdgeWidth());
    case EdgeToolBox::COLOR:
        return L"Adjust Edge Color to " + QString::fromStdString(edge.getEdgeColor()).toStdWString();
    default:
        return {};
    }
}

std::wstring TextToolsLog::shadow()
{
    return L"Adjust shadow ";
}

std::wstring TextToolsLog::align()
{
    return L"Adjust Alignment";
}

std::wstring TextToolsLog::kerning()
{
    return L"Adjust Space ";
}

std::wstring TextToolsLog::move(int range, int direction)
{
    return L"Move Text Object " + std::to_wstring(range) + L" px to the " + directionWord(direction);
}
