#include "touchui/NineSlice.h"

#include <QtGlobal>

namespace NineSlice
{
namespace
{

using Lengths = std::array<int, 3>;

Lengths split(int length, int first, int last)
{
    length = qMax(length, 0);
    first = qMax(first, 0);
    last = qMax(last, 0);
    if (qint64(first) + last > length) {
        first = int(qint64(length) * first / (qint64(first) + last));
        last = length - first;
    }
    return {first, length - first - last, last};
}

} // namespace

Cells cells(const QRect& target, const QMargins& corners)
{
    const Lengths widths = split(target.width(), corners.left(), corners.right());
    const Lengths heights = split(target.height(), corners.top(), corners.bottom());
    Cells result;
    int y = target.y();
    for (std::size_t line = 0; line < heights.size(); ++line) {
        int x = target.x();
        for (std::size_t column = 0; column < widths.size(); ++column) {
            result[line * widths.size() + column] = QRect(x, y, widths[column], heights[line]);
            x += widths[column];
        }
        y += heights[line];
    }
    return result;
}

Triple row(const QRect& target, int left, int right)
{
    const Lengths widths = split(target.width(), left, right);
    const int height = qMax(target.height(), 0);
    return {QRect(target.x(), target.y(), widths[0], height),
            QRect(target.x() + widths[0], target.y(), widths[1], height),
            QRect(target.x() + widths[0] + widths[1], target.y(), widths[2], height)};
}

Triple column(const QRect& target, int top, int bottom)
{
    const Lengths heights = split(target.height(), top, bottom);
    const int width = qMax(target.width(), 0);
    return {QRect(target.x(), target.y(), width, heights[0]),
            QRect(target.x(), target.y() + heights[0], width, heights[1]),
            QRect(target.x(), target.y() + heights[0] + heights[1], width, heights[2])};
}

} // namespace NineSlice
