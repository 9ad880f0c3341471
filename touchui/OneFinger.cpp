#include "touchui/OneFinger.h"

#include "touchui/KSAppEventFilter.h"

#include <QCoreApplication>
#include <QEvent>
#include <QEventPoint>
#include <QPointingDevice>
#include <QTouchEvent>
#include <QWidget>
#include <utility>

OneFinger::OneFinger(QWidget* widget) : m_widget(widget)
{
    m_hold.setSingleShot(true);
    connect(&m_hold, &TouchTimer::timeout, this, &OneFinger::held);
    widget->installEventFilter(this);
}

OneFinger::Step OneFinger::follow(const QTouchEvent* event, QObject* receiver)
{
    if (receiver == nullptr)
        receiver = event->target() != nullptr ? event->target() : m_widget;
    const Step step = stepOf(event, receiver);
    m_step = step;
    report(step);
    return step;
}

// Guards against a receiver that destroys the widget, and with it this object.
void OneFinger::report(Step step)
{
    const QPointer<OneFinger> self = this;
    switch (step) {
    case Step::Begin:
        Q_EMIT began();
        break;
    case Step::Move:
        Q_EMIT moved();
        break;
    case Step::End:
        Q_EMIT lifted();
        break;
    case Step::None:
        return;
    }
    if (self != nullptr) {
        Q_EMIT acted(step == Step::Begin  ? QEvent::MouseButtonPress
                     : step == Step::Move ? QEvent::MouseMove
                                          : QEvent::MouseButtonRelease);
    }
}

bool OneFinger::takes(QEvent* event, QObject* receiver)
{
    if (!isTouch(event))
        return false;
    follow(static_cast<QTouchEvent*>(event), receiver);
    return true;
}

bool OneFinger::isTouch(const QEvent* event)
{
    switch (event->type()) {
    case QEvent::TouchBegin:
    case QEvent::TouchUpdate:
    case QEvent::TouchEnd:
    case QEvent::TouchCancel:
        return true;
    default:
        return false;
    }
}

QMouseEvent OneFinger::mouseEvent(QEvent::Type type, const QPointF& position, const QPointF& globalPosition)
{
    return QMouseEvent(type, position, globalPosition,
                       type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton,
                       type == QEvent::MouseButtonRelease ? Qt::NoButton : Qt::LeftButton, Qt::NoModifier);
}

OneFinger::Step OneFinger::stepOf(const QTouchEvent* event, QObject* receiver)
{
    if (event->type() == QEvent::TouchBegin)
        return begin(event, receiver);
    if (!isDown())
        return Step::None;
    if (event->type() == QEvent::TouchCancel) {
        drop();
        return Step::None;
    }
    if (m_receiver != receiver)
        return Step::None;
    for (const QEventPoint& point : event->points()) {
        if (point.id() != m_id)
            continue;
        m_position = point.globalPosition();
        // If another finger is still on the same object, the lift is reported by a TouchUpdate.
        if (event->type() == QEvent::TouchUpdate && point.state() != QEventPoint::State::Released)
            return Step::Move;
        letGo();
        return Step::End;
    }
    if (event->type() == QEvent::TouchEnd)
        drop(); // all fingers are up, but the lift of this one was not reported
    return Step::None;
}

OneFinger::Step OneFinger::begin(const QTouchEvent* event, QObject* receiver)
{
    if (event->points().isEmpty() || !m_widget->isEnabled())
        return Step::None;
    if (isDown()) {
        if (!isLost(receiver))
            return Step::None;
        drop();
    }
    reportEnd();
    const QEventPoint& point = event->points().constFirst();
    m_id = point.id();
    m_receiver = receiver;
    m_position = point.globalPosition();
    m_pressPosition = m_position;
    if (receiver != m_widget)
        connect(receiver, &QObject::destroyed, this, &OneFinger::receiverDestroyed, Qt::UniqueConnection);
    return Step::Begin;
}

// Returns whether the current finger must be up already when a touch begins at receiver. A second finger on
// the same object would have been part of the same touch. On another object it is an additional finger as
// long as the first object still has its touch.
bool OneFinger::isLost(const QObject* receiver) const
{
    if (receiver == m_receiver)
        return true;
    KSAppEventFilter* gate = KSAppEventFilter::current();
    return gate != nullptr && !gate->isTouched(m_receiver);
}

void OneFinger::cancel()
{
    if (isDown()) {
        const QPointer<OneFinger> self = this;
        cancelTouchOf(m_receiver); // normally arrives here as a TouchCancel, unless it is filtered
        if (self == nullptr || !isDown())
            return;
    } else if (!m_hold.isActive()) {
        return;
    }
    letGo();
    Q_EMIT cancelled();
}

void OneFinger::cancelTouchOf(QObject* object)
{
    QTouchEvent cancel(QEvent::TouchCancel, QPointingDevice::primaryPointingDevice());
    QCoreApplication::sendEvent(object, &cancel);
}

QPointF OneFinger::positionIn(const QWidget* widget) const
{
    return widget->mapFromGlobal(m_position);
}

void OneFinger::startHold(int milliseconds)
{
    m_hold.start(milliseconds);
}

void OneFinger::letGo()
{
    if (m_receiver != nullptr && m_receiver != m_widget)
        disconnect(m_receiver, &QObject::destroyed, this, &OneFinger::receiverDestroyed);
    m_id = NONE;
    m_receiver.clear();
    m_hold.stop();
}

void OneFinger::drop()
{
    letGo();
    Q_EMIT cancelled();
}

// Reports the end later, when the receiver is destroyed completely and the widget does not use it any more.
void OneFinger::receiverDestroyed(QObject* receiver)
{
    if (isDown() && (m_receiver == nullptr || m_receiver == receiver)) {
        letGo();
        m_isEndUnreported = true;
        QMetaObject::invokeMethod(this, &OneFinger::reportEnd, Qt::QueuedConnection);
    }
}

void OneFinger::reportEnd()
{
    if (std::exchange(m_isEndUnreported, false))
        Q_EMIT cancelled();
}

bool OneFinger::eventFilter(QObject* object, QEvent* event)
{
    if (object == m_widget &&
        (event->type() == QEvent::Hide || (event->type() == QEvent::EnabledChange && !m_widget->isEnabled())))
        cancel();
    return QObject::eventFilter(object, event);
}
