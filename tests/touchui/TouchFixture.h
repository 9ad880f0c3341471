#pragma once

#include "TouchDevice.h"

#include "touchui/KSAppEventFilter.h"

#include <QCoreApplication>
#include <QPointingDevice>
#include <QTest>
#include <QWidget>

#include <memory>

// A touch screen and the application's event filter, with short names for the actions of fingers. Positions
// are in widget coordinates.
class TouchFixture
{
public:
    TouchFixture() : filter(std::make_unique<KSAppEventFilter>())
    {
        filter->registerLockObject(filter.get(), nullptr, LOCKOBJECT_DEFAULTMUTEX, nullptr);
        QCoreApplication::instance()->installEventFilter(filter.get());
    }

    void press(QWidget* widget, const QPoint& position, int finger = 0) const
    {
        QTest::touchEvent(widget, m_device).press(finger, position, widget);
    }
    void move(QWidget* widget, const QPoint& position, int finger = 0) const
    {
        QTest::touchEvent(widget, m_device).move(finger, position, widget);
    }
    void lift(QWidget* widget, const QPoint& position, int finger = 0) const
    {
        QTest::touchEvent(widget, m_device).release(finger, position, widget);
    }
    void tap(QWidget* widget, const QPoint& position) const { m_device.tap(widget, position); }
    void cancel(QWidget* widget) const
    {
        QTouchEvent event(QEvent::TouchCancel, m_device);
        QCoreApplication::sendEvent(widget, &event);
    }
    QPointingDevice* device() const { return m_device; }
    bool isLocked() const { return filter->isLock(nullptr, LOCKMETHOD_TOUCH); }

    std::unique_ptr<KSAppEventFilter> filter;

private:
    TouchDevice m_device;
};
