#include "touchui/TouchEventButton.h"

#include "support/LogManager.h"

#include <QEventPoint>
#include <QMouseEvent>
#include <QScopedValueRollback>
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
    // Qt sets the focus when a touch begins, even if the touch is refused, and a button that loses the focus
    // is released.
    setFocusPolicy(Qt::NoFocus);
    connect(this, &QAbstractButton::released, this, &TouchEventButton::slotEmitReleased);
    connect(&m_finger, &OneFinger::cancelled, this, &TouchEventButton::comeUp);
}

bool TouchEventButton::event(QEvent* event)
{
    switch (event->type()) {
    case QEvent::TouchBegin:
        if (isEnabled())
            touchBeginEvent(static_cast<QTouchEvent*>(event));
        return true;
    case QEvent::TouchUpdate:
        if (isEnabled())
            touchUpdateEvent(static_cast<QTouchEvent*>(event));
        return true;
    case QEvent::TouchEnd:
        if (isEnabled())
            touchEndEvent(static_cast<QTouchEvent*>(event));
        return true;
    case QEvent::TouchCancel:
        m_finger.follow(static_cast<QTouchEvent*>(event));
        return true;
    default:
        return QPushButton::event(event);
    }
}

bool TouchEventButton::touchBeginEvent(QTouchEvent* event)
{
    if (event->points().isEmpty())
        return true;
    const QPointF start = event->points().constFirst().globalPressPosition();
    Q_EMIT signalPressedPoint(QPoint(static_cast<int>(start.x()), static_cast<int>(start.y())));
    if (m_finger.follow(event, this) != OneFinger::Step::Begin)
        return true;
    m_lastPosition = m_finger.positionIn(this).toPoint();
    QMouseEvent press(QEvent::MouseButtonPress, m_lastPosition, m_finger.position().toPoint(), Qt::LeftButton,
                      Qt::LeftButton, Qt::NoModifier);
    mousePressEvent(&press);
    return true;
}

bool TouchEventButton::touchUpdateEvent(QTouchEvent* event)
{
    followMotion(event);
    return true;
}

bool TouchEventButton::touchEndEvent(QTouchEvent* event)
{
    followMotion(event);
    return true;
}

void TouchEventButton::followMotion(const QTouchEvent* event)
{
    const OneFinger::Step step = m_finger.follow(event, this);
    QPoint position = m_finger.positionIn(this).toPoint();
    QPoint screenPosition = m_finger.position().toPoint();
    moveIntoWidget(position, screenPosition);
    if (step == OneFinger::Step::Move) {
        m_lastPosition = position;
        QMouseEvent move(QEvent::MouseMove, position, screenPosition, Qt::LeftButton, Qt::LeftButton,
                         Qt::NoModifier);
        mouseMoveEvent(&move);
    } else if (step == OneFinger::Step::End && event->type() == QEvent::TouchUpdate) {
        sendRelease(m_lastPosition, mapToGlobal(m_lastPosition)); // another finger remains down
    } else if (step == OneFinger::Step::End) {
        sendRelease(position, screenPosition);
    }
}

// Releases the button without a click.
void TouchEventButton::comeUp()
{
    const QScopedValueRollback<bool> guard(m_touchCancelled, true);
    const QPoint outside(-1, -1);
    QMouseEvent move(QEvent::MouseMove, outside, mapToGlobal(outside), Qt::LeftButton, Qt::LeftButton,
                     Qt::NoModifier);
    mouseMoveEvent(&move);
    sendRelease(outside, mapToGlobal(outside));
}

void TouchEventButton::sendRelease(const QPoint& position, const QPoint& screenPosition)
{
    QMouseEvent release(QEvent::MouseButtonRelease, position, screenPosition, Qt::LeftButton, Qt::LeftButton,
                        Qt::NoModifier);
    mouseReleaseEvent(&release);
}

// Moves a position outside the button but inside the touch rectangle onto the button. The smallest y is 1,
// unlike x.
void TouchEventButton::moveIntoWidget(QPoint& position, QPoint& screenPosition) const
{
    if (m_touchRect.isNull() || !m_touchRect.contains(position))
        return;
    QPoint inside = position;
    if (inside.x() < 0)
        inside.setX(0);
    else if (inside.x() > width() - 1)
        inside.setX(width() - 1);
    if (inside.y() <= 0)
        inside.setY(1);
    else if (inside.y() > height() - 1)
        inside.setY(height() - 1);
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
    if (m_releasedOutside)
        LOG_USER_OPERATE(L"TEB slotEmitReleased", 239, L"Outside!");
    Q_EMIT signalReleased(m_releasedOutside);
}
