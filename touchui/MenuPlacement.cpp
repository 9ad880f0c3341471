#include "touchui/MenuPlacement.h"

#include <algorithm>

namespace MenuPlacement
{
namespace
{

constexpr int ABOVE_OVERLAP = 45;      // how far a menu beside its anchor extends below it
constexpr int LEAST_BOTTOM_SPACE = 11; // if less is left below that menu, it keeps BOTTOM_SPACE
constexpr int BOTTOM_SPACE = 13;
constexpr int GAP = 9; // between a menu and the anchor below it

int rightEdge(const QRect& rect)
{
    return rect.x() + rect.width();
}

int bottomEdge(const QRect& rect)
{
    return rect.y() + rect.height();
}

// Returns the start that keeps the length inside the bounds; if it is too long, the beginning of the bounds.
int keepInside(int start, int length, int from, int to)
{
    return std::max(std::min(start, to - length), from);
}

// Returns the position of the arrow's tip along its side.
int tipAlong(int anchor, int start, int length)
{
    const int inset = std::min(ARROW_INSET + ARROW_WIDTH / 2, length / 2);
    return std::clamp(anchor - start, inset, std::max(inset, length - inset));
}

} // namespace

int menuTop(int flags, int anchorY, int menuHeight, const QRect& bounds)
{
    int top = 0;
    if (flags & Below) {
        top = anchorY;
    } else if (flags & Above) {
        int bottom = anchorY + ABOVE_OVERLAP;
        if (bottomEdge(bounds) - bottom < LEAST_BOTTOM_SPACE)
            bottom = bottomEdge(bounds) - BOTTOM_SPACE;
        top = bottom - menuHeight;
    } else {
        top = anchorY - GAP - menuHeight;
    }
    return keepInside(top, menuHeight, bounds.y(), bottomEdge(bounds));
}

int menuLeft(int flags, int anchorX, int menuWidth, const QRect& bounds)
{
    int left = anchorX - menuWidth / 2;
    if ((flags & Above) && !(flags & Below)) {
        const bool roomAtRight = anchorX + menuWidth <= rightEdge(bounds);
        const bool roomAtLeft = anchorX - menuWidth >= bounds.x();
        left = roomAtRight || !roomAtLeft ? anchorX : anchorX - menuWidth;
    } else if (flags & Horizontal) {
        left = anchorX - ARROW_INSET - ARROW_WIDTH / 2;
    }
    return keepInside(left, menuWidth, bounds.x(), rightEdge(bounds));
}

Placement placeMenu(int flags, const QPoint& anchor, const QSize& size, const QRect& bounds)
{
    Placement result;
    result.rect = QRect(QPoint(menuLeft(flags, anchor.x(), size.width(), bounds),
                               menuTop(flags, anchor.y(), size.height(), bounds)),
                        size);
    if ((flags & Above) && !(flags & Below)) {
        const bool menuIsLeft = result.rect.x() < anchor.x() && rightEdge(result.rect) <= anchor.x();
        result.side = menuIsLeft ? ArrowSide::Right : ArrowSide::Left;
        result.tip =
            QPoint(menuIsLeft ? size.width() - 1 : 0, tipAlong(anchor.y(), result.rect.y(), size.height()));
    } else {
        result.side = flags & Below ? ArrowSide::Top : ArrowSide::Bottom;
        result.tip = QPoint(tipAlong(anchor.x(), result.rect.x(), size.width()),
                            flags & Below ? 0 : size.height() - 1);
    }
    return result;
}

Placement placeBalloon(const QRect& anchor, const QSize& size, const QRect& bounds, bool below)
{
    const bool roomAbove = anchor.y() - size.height() >= bounds.y();
    const bool roomBelow = bottomEdge(anchor) + size.height() <= bottomEdge(bounds);
    const bool under = below ? roomBelow || !roomAbove : !roomAbove && roomBelow;
    const int x = anchor.x() + anchor.width() / 2;
    Placement result;
    result.rect = QRect(QPoint(keepInside(x - size.width() / 2, size.width(), bounds.x(), rightEdge(bounds)),
                               keepInside(under ? bottomEdge(anchor) : anchor.y() - size.height(),
                                          size.height(), bounds.y(), bottomEdge(bounds))),
                        size);
    result.side = under ? ArrowSide::Top : ArrowSide::Bottom;
    result.tip = QPoint(tipAlong(x, result.rect.x(), size.width()), under ? 0 : size.height() - 1);
    return result;
}

QRect background(const QSize& size, ArrowSide side)
{
    const QRect whole(QPoint(0, 0), size);
    switch (side) {
    case ArrowSide::Top:
        return whole.adjusted(0, ARROW_LENGTH, 0, 0);
    case ArrowSide::Bottom:
        return whole.adjusted(0, 0, 0, -ARROW_LENGTH);
    case ArrowSide::Left:
        return whole.adjusted(ARROW_LENGTH, 0, 0, 0);
    case ArrowSide::Right:
        return whole.adjusted(0, 0, -ARROW_LENGTH, 0);
    }
    return whole;
}

QRect rowRect(const QRect& background, int border, int count, int index)
{
    if (index < 0 || index >= count)
        return QRect();
    const QRect inner = background.adjusted(border, border, -border, -border);
    const int height = inner.height() / count;
    const int rest = index == count - 1 ? inner.height() - height * count : 0;
    return QRect(inner.x(), inner.y() + index * height, inner.width(), height + rest);
}

int rowAt(const QRect& background, int border, int count, const QPoint& point)
{
    for (int i = 0; i < count; ++i)
        if (rowRect(background, border, count, i).contains(point))
            return i;
    return -1;
}

} // namespace MenuPlacement
