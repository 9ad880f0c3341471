#include "touchui/TouchTimer.h"

#include "touchui/TouchClock.h"

#include <QTimerEvent>

TouchTimer::TouchTimer(QObject* parent) : QObject(parent)
{
}

TouchTimer::~TouchTimer()
{
    stop();
}

void TouchTimer::start(int milliseconds)
{
    stop();
    m_interval = milliseconds;
    m_id = TouchClock::instance().start(this, milliseconds);
}

void TouchTimer::stop()
{
    if (m_id != 0)
        TouchClock::instance().stop(this, m_id);
    m_id = 0;
}

void TouchTimer::restartIfActive()
{
    if (isActive())
        start(m_interval);
}

void TouchTimer::timerEvent(QTimerEvent* event)
{
    if (event->timerId() != m_id)
        return;
    if (m_singleShot)
        stop();
    Q_EMIT timeout();
}
