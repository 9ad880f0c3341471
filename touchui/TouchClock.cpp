#include "touchui/TouchClock.h"

#include <QObject>

namespace
{

class QtClock : public TouchClock
{
public:
    int start(QObject* receiver, int milliseconds) override { return receiver->startTimer(milliseconds); }
    void stop(QObject* receiver, int id) override
    {
        if (id > 0)
            receiver->killTimer(id);
    }
};

TouchClock* s_installed = nullptr;

} // namespace

TouchClock& TouchClock::instance()
{
    static QtClock ordinary;
    return s_installed ? *s_installed : ordinary;
}

void TouchClock::setInstance(TouchClock* clock)
{
    s_installed = clock;
}
