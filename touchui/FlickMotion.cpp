#include "touchui/FlickMotion.h"

#include <QtMath>

#include <algorithm>

namespace FlickMotion
{
namespace
{

// Far larger than any screen, and small enough that sums do not overflow.
constexpr qreal FARTHEST = 1000000.0;

qreal sane(qreal value)
{
    return qIsNaN(value) ? 0.0 : std::clamp(value, -FARTHEST, FARTHEST);
}

QPointF sane(const Rules& rules, const QPointF& point)
{
    const QPointF result(sane(point.x()), sane(point.y()));
    return rules.wholePixels ? QPointF(result.toPoint()) : result;
}

Step makeStep(const QPointF& start, const QPointF& distance, int stepX, int stepY, bool bounded)
{
    Step result;
    result.start = start + QPointF(stepX, stepY);
    result.distance = distance * 0.5;
    result.scroll = int(result.distance.y());
    result.bounded = bounded;
    return result;
}

} // namespace

bool isFlickEnd(const Rules& rules, const QPointF& start, const QPointF& end)
{
    return qAbs(sane(rules, start).y() - sane(rules, end).y()) <= rules.restDistance;
}

Step dragStep(const Rules& rules, const QPointF& start, const QPointF& end,
              const std::optional<DragBounds>& bounds)
{
    const QPointF from = sane(rules, start);
    const QPointF way = sane(rules, end) - from;
    int distance = int(way.y());
    if (qAbs(distance) < rules.leastDrag)
        distance = distance < 0 ? -rules.leastDrag : rules.leastDrag;
    bool bounded = false;
    if (bounds)
        distance = boundedDistance(distance, *bounds, &bounded);
    return makeStep(from, QPointF(way.x(), distance), qRound(qRound(way.x()) * 0.5), qRound(distance * 0.5),
                    bounded);
}

Step flickStep(const Rules& rules, const QPointF& start, const QPointF& end)
{
    const QPointF from = sane(rules, start);
    const QPointF way = sane(rules, end) - from;
    int stepX = qRound(way.x() / rules.flickDivisor);
    int stepY = qRound(way.y() / rules.flickDivisor);
    if (qAbs(stepY) <= 1)
        stepY = way.y() < 0 ? -1 : 1;
    if (rules.leastStepBoth && qAbs(stepX) <= 1)
        stepX = way.x() < 0 ? -1 : (way.x() > 0 ? 1 : 0);
    return makeStep(from, way, stepX, stepY, false);
}

int boundedDistance(int distance, const DragBounds& bounds, bool* bounded)
{
    const int lastRow = bounds.viewerHeight - 1;
    const bool up = distance < 0 && bounds.top + distance <= 0;
    const bool down = distance >= 0 && bounds.bottom + distance > lastRow;
    if (bounded)
        *bounded = up || down;
    if (up)
        return -bounds.top;
    return down ? lastRow - bounds.bottom : distance;
}

int scrolledValue(int value, int offset, int minimum, int maximum)
{
    const qint64 wanted = qint64(value) - offset;
    return int(std::clamp<qint64>(wanted, minimum, qMax(minimum, maximum)));
}

bool isBeyondSlop(const QPointF& press, const QPointF& position, int slop)
{
    return (position.toPoint() - press.toPoint()).manhattanLength() > slop;
}

bool isMove(const QPointF& first, const QPointF& current)
{
    const QPointF way = current - first;
    return QPointF::dotProduct(way, way) > 400.0;
}

int dropIndex(std::span<const int> candidateTops, int firstIndex, int itemCount, int liftedTop, int oldIndex)
{
    if (itemCount <= 0)
        return 0;
    for (std::size_t i = 0; i < candidateTops.size(); ++i)
        if (candidateTops[i] >= liftedTop)
            return firstIndex + int(i);
    const bool past = !candidateTops.empty() && firstIndex + int(candidateTops.size()) == itemCount;
    return past ? itemCount : oldIndex;
}

bool needsEdgeScroll(int top, int overhang)
{
    return top <= -10 || overhang > 9;
}

int edgeScrollOffset(int top, int overhang)
{
    if (top < -30)
        return 30;
    if (top <= -10)
        return 10;
    return overhang < 31 ? -10 : -30;
}

QPoint slideInside(const QPoint& target, const QPoint& current, const QRect& area, const QSize& size)
{
    const int left = area.left();
    const int top = area.top();
    const int right = area.right() + 1 - size.width();
    const int bottom = area.bottom() + 1 - size.height();
    const bool insideX = target.x() > left && target.x() < right;
    const bool insideY = target.y() > top && target.y() < bottom;
    if (insideX && insideY)
        return target;
    if (insideY)
        return QPoint(target.x() <= left ? left : right, target.y());
    if (insideX)
        return QPoint(target.x(), target.y() <= top ? top : bottom);
    return current;
}

} // namespace FlickMotion
