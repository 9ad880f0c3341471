#include "touchui/TouchEventButton.h"

#include "support/LogManager.h"

#include <QCoreApplication>
#include <QEventPoint>
#include <QMouseEvent>
#include <QPointingDevice>
#include <QTouchEvent>

TouchEventButton::TouchEventButton(QWidget* parent) : QPushButton(parent)
{
    init();
}

TouchEventButton::TouchEventButton(const QString& text, QWidget* parent) : QPushButton(text, parent)
{
    init();
}

void TouchEventButton::init()
{
    setAttribute(Qt::WA_AcceptTouchEvents);
    // Qt gives the focus at touch begin, also for a touch that is refused, and a button that loses it comes
    // up.
    setFocusPolicy(Qt::NoFocus);
    connect(this, &QAbstractButton::released, this, &TouchEventButton::slotEmitReleased);
}

bool TouchEventButton::event(QEvent* event)
{
    switch (event->type()) {
    case QEvent::TouchBegin:
        if (isEnabled()) {
            touchBeginEvent(static_cast<QTouchEvent*>(event));
        }
        return true;
    case QEvent::TouchUpdate:
        if (isEnabled()) {
            touchUpdateEvent(static_cast<QTouchEvent*>(event));
        }
        return true;
    case QEvent::TouchEnd:
        if (isEnabled()) {
            touchEndEvent(static_cast<QTouchEvent*>(event));
        }
        return true;
    case QEvent::TouchCancel:
        touchCancelEvent();
        return true;
    default:
        return QPushButton::event(event);
    }
}

// The end of a touch never comes to a button that was disabled under it, and must not be waited for.
void TouchEventButton::changeEvent(QEvent* event)
{
    QPushButton::changeEvent(event);
    if (event->type() == QEvent::EnabledChange && !isEnabled()) {
        m_touching = false;
        m_touchId = -1;
    }
}

bool TouchEventButton::touchBeginEvent(QTouchEvent* event)
{
    if (event->points().isEmpty()) {
        return true;
    }
    const QEventPoint& point = event->points().constFirst();
    const QPointF start = point.globalPressPosition();
    Q_EMIT signalPressedPoint(QPoint(static_cast<int>(start.x()), static_cast<int>(start.y())));
    if (m_touching) {
        return true;
    }
    ++m_pressCount;
    m_touching = true;
    m_touchId = point.id();
    m_lastPosition = point.position().toPoint();
    QMouseEvent press(QEvent::MouseButtonPress, m_lastPosition, point.globalPosition().toPoint(),
                      Qt::LeftButton, Qt::LeftButton, Qt::NoModifier);
    mousePressEvent(&press);
    return true;
}

bool TouchEventButton::touchUpdateEvent(QTouchEvent* event)
{
    if (!m_touching) {
        return true;
    }
    for (const QEventPoint& point : event->points()) {
        if (point.id() != m_touchId) {
            continue;
        }
        if (point.state() == QEventPoint::State::Released) {
            m_touching = false;
            m_touchId = -1;
            sendRelease(m_lastPosition, mapToGlobal(m_lastPosition));
            return true;
        }
        QPoint position = point.position().toPoint();
        QPoint screenPosition = point.globalPosition().toPoint();
        moveIntoWidget(position, screenPosition);
        m_lastPosition = position;
        QMouseEvent move(QEvent::MouseMove, position, screenPosition, Qt::LeftButton, Qt::LeftButton,
                         Qt::NoModifier);
        mouseMoveEvent(&move);
    }
    return true;
}

bool TouchEventButton::touchEndEvent(QTouchEvent* event)
{
    if (!m_touching || event->points().isEmpty()) {
        return true;
    }
    m_touching = false;
    m_touchId = -1;
    const QEventPoint& point = event->points().constFirst();
    QPoint position = point.position().toPoint();
    QPoint screenPosition = point.globalPosition().toPoint();
    moveIntoWidget(position, screenPosition);
    sendRelease(position, screenPosition);
    return true;
}

// The window system took the touch away (for a gesture of its own, say): the button comes up and nothing is
// clicked.
void TouchEventButton::touchCancelEvent()
{
    if (!m_touching) {
        return;
    }
    m_touching = false;
    m_touchId = -1;
    const QPoint outside(-1, -1);
    QMouseEvent move(QEvent::MouseMove, outside, mapToGlobal(outside), Qt::LeftButton, Qt::LeftButton,
                     Qt::NoModifier);
    mouseMoveEvent(&move);
    sendRelease(outside, mapToGlobal(outside));
}

void TouchEventButton::breakTouch()
{
    QTouchEvent cancel(QEvent::TouchCancel, QPointingDevice::primaryPointingDevice());
    QCoreApplication::sendEvent(this, &cancel);
}

void TouchEventButton::sendRelease(const QPoint& position, const QPoint& screenPosition)
{
    QMouseEvent release(QEvent::MouseButtonRelease, position, screenPosition, Qt::LeftButton, Qt::LeftButton,
                        Qt::NoModifier);
    mouseReleaseEvent(&release);
}

// A finger that is still inside the touch rectangle counts as being on the button. The low end of y is 1,
// unlike x.
void TouchEventButton::moveIntoWidget(QPoint& position, QPoint& screenPosition) const
{
    if (m_touchRect.isNull() || !m_touchRect.contains(position)) {
        return;
    }
    QPoint inside = position;
    if (inside.x() < 0) {
        inside.setX(0);
    } else if (inside.x() > width() - 1) {
        inside.setX(width() - 1);
    }
    if (inside.y() <= 0) {
        inside.setY(1);
    } else if (inside.y() > height() - 1) {
        inside.setY(height() - 1);
    }
    screenPosition += inside - position;
    position = inside;
}

void TouchEventButton::mouseMoveEvent(QMouseEvent* event)
{
    if (!isDown()) {
        event->ignore();
        return;
    }
    m_releasedOutside = !rect().contains(event->position().toPoint());
    QAbstractButton::mouseMoveEvent(event);
    m_releasedOutside = false;
}

void TouchEventButton::slotEmitReleased()
{
    if (m_releasedOutside) {
        LOG_USER_OPERATE(L"TEB slotEmitReleased", 239, L"Outside!");
    }
    Q_EMIT signalReleased(m_releasedOutside);
}
