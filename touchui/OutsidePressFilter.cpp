#include "touchui/OutsidePressFilter.h"

#include "touchui/KSAppEventFilter.h"

#include <QCoreApplication>
#include <QMouseEvent>
#include <QTouchEvent>
#include <QWidget>

OutsidePressFilter::OutsidePressFilter(QWidget* window, QObject* parent) : QObject(parent), m_window(window)
{
    registerWithGate();
}

void OutsidePressFilter::registerWithGate()
{
    if (m_gate != nullptr)
        return;
    m_gate = KSAppEventFilter::current();
    if (m_gate != nullptr)
        m_gate->registerEventFilter(this);
}

void OutsidePressFilter::start()
{
    m_watching = true;
    registerWithGate();
    if (m_gate == nullptr)
        QCoreApplication::instance()->installEventFilter(this);
}

void OutsidePressFilter::stop()
{
    m_watching = false;
    if (m_swallowsTouch || m_swallowsMouse)
        return;
    QCoreApplication::instance()->removeEventFilter(this); // installed only if there is no KSAppEventFilter
}

bool OutsidePressFilter::eventFilter(QObject* obj, QEvent* event)
{
    switch (event->type()) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonDblClick:
    case QEvent::TouchBegin:
        return obj->isWidgetType() && swallowPress(obj, event);
    case QEvent::MouseMove:
        return m_swallowsMouse && obj == m_swallowed;
    case QEvent::TouchUpdate:
        return m_swallowsTouch && obj == m_swallowed;
    case QEvent::MouseButtonRelease:
        if (!m_swallowsMouse || obj != m_swallowed)
            return false;
        endSwallowing();
        return true;
    case QEvent::TouchEnd:
    case QEvent::TouchCancel:
        if (!m_swallowsTouch || obj != m_swallowed)
            return false;
        endSwallowing();
        return true;
    default:
        return false;
    }
}

bool OutsidePressFilter::swallowPress(QObject* obj, QEvent* event)
{
    if (m_swallowsTouch || m_swallowsMouse)
        endSwallowing(); // the lift of the previous press was not seen
    if (!m_watching || !isOutside(event))
        return false;
    const bool touch = event->type() == QEvent::TouchBegin;
    m_swallowsTouch = touch;
    m_swallowsMouse = !touch;
    m_swallowed = obj;
    event->accept(); // otherwise its end would not be delivered
    Q_EMIT pressedOutside();
    return true;
}

bool OutsidePressFilter::isOutside(QEvent* event) const
{
    if (m_window == nullptr)
        return false;
    QPointF position;
    if (event->type() == QEvent::TouchBegin) {
        const auto* touch = static_cast<QTouchEvent*>(event);
        if (touch->points().isEmpty())
            return false;
        position = touch->points().constFirst().globalPosition();
    } else {
        position = static_cast<QMouseEvent*>(event)->globalPosition();
    }
    return !m_window->geometry().contains(position.toPoint());
}

void OutsidePressFilter::endSwallowing()
{
    m_swallowsTouch = false;
    m_swallowsMouse = false;
    m_swallowed.clear();
    if (!m_watching)
        stop();
}
