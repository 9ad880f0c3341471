#include "touchui/TouchTimer.h"

#include <QTimerEvent>

namespace
{

class QtClock : public TouchTimer::Clock
{
public:
    int start(QObject* receiver, int milliseconds) override { return receiver->startTimer(milliseconds); }
    void stop(QObject* receiver, int id) override
    {
        if (id > 0)
            receiver->killTimer(id);
    }
};

TouchTimer::Clock* s_installed = nullptr;

TouchTimer::Clock& currentClock()
{
    static QtClock ordinary;
    return s_installed != nullptr ? *s_installed : ordinary;
}

} // namespace

void TouchTimer::setClock(Clock* clock)
{
    s_installed = clock;
}

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
    m_id = currentClock().start(this, milliseconds);
}

void TouchTimer::stop()
{
    if (m_id != 0)
        currentClock().stop(this, m_id);
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
