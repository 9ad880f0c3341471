// The cost of the application's event filter for events that it does not handle.
#include "bench/PairList.h"
#include "bench/Topics.h"
#include "touchui/KSAppEventFilter.h"

#include <QApplication>
#include <QEvent>
#include <QMouseEvent>
#include <QWidget>

namespace
{

constexpr double AIM = 1.05;

// Counts the events that arrive.
class Target : public QWidget
{
public:
    long arrived() const { return m_arrived; }

protected:
    void mouseMoveEvent(QMouseEvent* event) override
    {
        ++m_arrived;
        event->accept();
    }

private:
    long m_arrived = 0;
};

// Sends mouse moves, which are the most frequent events that are neither touches nor keys.
void deliver(benchmark::State& state)
{
    Target target;
    target.resize(100, 100);
    target.setMouseTracking(true);
    const QPointF position(50.0, 50.0);
    long sent = 0;
    for ([[maybe_unused]] auto _ : state) {
        QMouseEvent move(QEvent::MouseMove, position, position, Qt::NoButton, Qt::NoButton, Qt::NoModifier);
        QCoreApplication::sendEvent(&target, &move);
        ++sent;
    }
    if (target.arrived() != sent)
        state.SkipWithError("an event did not arrive");
}

void deliverThroughFilter(benchmark::State& state)
{
    KSAppEventFilter filter;
    filter.registerLockObject(&filter, nullptr, LOCKOBJECT_DEFAULTMUTEX, nullptr);
    QCoreApplication::instance()->installEventFilter(&filter);
    deliver(state);
    QCoreApplication::instance()->removeEventFilter(&filter);
}

} // namespace

void Topics::addFilter(PairList& list)
{
    list.add({"event_filter", AIM, PairList::Clock::Cpu}, benchmark::kNanosecond, deliverThroughFilter,
             deliver);
}
