#include "touchui/Flicker.h"

#include <QAbstractScrollArea>
#include <QScrollBar>

Flicker::Flicker(const QAbstractScrollArea* list, const FlickMotion::Rules& rules)
    : m_list(list), m_rules(rules)
{
    connect(&m_timer, &TouchTimer::timeout, this, &Flicker::tick);
}

void Flicker::begin(const QPointF& position)
{
    stop();
    m_able = true;
    m_following = true;
    m_pendingStart = !m_rules.firstMoveScrolls;
    m_press = position;
    m_current = position;
    setStart(position);
    setEnd(position);
}

void Flicker::follow(const QPointF& position)
{
    if (!m_following)
        return;
    if (m_pendingStart)
        setStart(position);
    m_pendingStart = false;
    m_current = position;
    setEnd(position);
}

void Flicker::lift(const QPointF& position)
{
    if (!m_following)
        return;
    m_following = false;
    setEnd(position);
    if (m_able && !isEnd() && !m_bounded)
        m_gliding = true;
    else
        stop();
}

void Flicker::cancel()
{
    m_following = false;
    rest();
    stop();
}

void Flicker::setStart(const QPointF& point)
{
    m_start = point;
    m_hasFlicked = false;
    m_bounded = false;
}

void Flicker::setEnd(const QPointF& point)
{
    if (!m_able)
        return;
    m_end = point;
    if (isEnd() || isRunning())
        return;
    m_timer.start(m_rules.interval);
    m_hasFlicked = true;
    Q_EMIT started();
}

void Flicker::setAble(bool able)
{
    m_able = able;
    if (!able)
        stop();
}

void Flicker::stop()
{
    m_timer.stop();
    m_gliding = false;
}

QPointF Flicker::advance(const std::optional<FlickMotion::DragBounds>& bounds)
{
    return m_gliding ? glide() : drag(bounds);
}

QPointF Flicker::drag(const std::optional<FlickMotion::DragBounds>& bounds)
{
    return take(FlickMotion::dragStep(m_rules, m_start, m_end, bounds));
}

QPointF Flicker::glide()
{
    return take(FlickMotion::flickStep(m_rules, m_start, m_end));
}

QPointF Flicker::take(const FlickMotion::Step& step)
{
    m_start = step.start;
    m_bounded = step.bounded;
    return step.distance;
}

void Flicker::tick()
{
    if (isEnd()) {
        end(m_gliding ? End::Glide : End::Rest);
        return;
    }
    Q_EMIT ticked();
    if ((m_gliding || m_rules.dragStopsAtLimit) && isAtLimit())
        end(End::Limit);
}

void Flicker::end(End end)
{
    stop();
    Q_EMIT ended(end);
}

bool Flicker::isAtLimit() const
{
    const QScrollBar* bar = m_list->verticalScrollBar();
    return FlickMotion::isAtLimit(bar->value(), bar->minimum(), bar->maximum());
}
