#include "touchui/ScrollViewerFlick.h"

#include "touchui/TouchClock.h"

namespace
{
constexpr FlickMotion::Rules RULES = FlickMotion::scrollViewer();
} // namespace

ScrollViewerFlick::ScrollViewerFlick(QObject* timerOwner) : m_owner(timerOwner)
{
}

ScrollViewerFlick::~ScrollViewerFlick()
{
    stopTimer();
}

void ScrollViewerFlick::begin(const QPointF& position)
{
    m_following = true;
    m_first = position;
    m_current = position;
    m_pendingStart = true;
}

void ScrollViewerFlick::follow(const QPointF& position)
{
    if (m_pendingStart)
        setStart(position);
    m_pendingStart = false;
    m_current = position;
}

void ScrollViewerFlick::setStart(const QPointF& point)
{
    m_start = point;
    m_hasFlicked = false;
    m_bounded = false;
}

bool ScrollViewerFlick::isEnd() const
{
    return FlickMotion::isFlickEnd(RULES, m_start, m_end);
}

void ScrollViewerFlick::startTimer()
{
    m_timerId = TouchClock::instance().start(m_owner, RULES.interval);
    m_hasFlicked = true;
}

void ScrollViewerFlick::stopTimer()
{
    if (m_timerId != 0)
        TouchClock::instance().stop(m_owner, m_timerId);
    m_timerId = 0;
}

QPointF ScrollViewerFlick::advance(const std::optional<FlickMotion::DragBounds>& bounds)
{
    const FlickMotion::Step step = m_auto ? FlickMotion::flickStep(RULES, m_start, m_end)
                                          : FlickMotion::dragStep(RULES, m_start, m_end, bounds);
    m_start = step.start;
    m_bounded = step.bounded;
    return step.distance;
}
