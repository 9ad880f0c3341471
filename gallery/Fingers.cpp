#include "gallery/Fingers.h"

#include <QPointingDevice>
#include <QWidget>
#include <QtGui/qpa/qwindowsysteminterface.h>

namespace
{

constexpr int MOST_FINGERS = 10;
constexpr unsigned long STEP = 10; // milliseconds between two events
constexpr qint64 DEVICE_ID = 77;

} // namespace

Fingers::Fingers()
{
    plugIn();
}

void Fingers::plugIn()
{
    m_devices.push_back(std::make_unique<QPointingDevice>(
        QStringLiteral("gallery touch screen"), DEVICE_ID, QInputDevice::DeviceType::TouchScreen,
        QPointingDevice::PointerType::Finger,
        QInputDevice::Capability::Position | QInputDevice::Capability::Area, MOST_FINGERS, 0));
    QWindowSystemInterface::registerInputDevice(m_devices.back().get());
}

Fingers::~Fingers()
{
    liftAll();
}

void Fingers::press(int finger, QWidget* window, const QPoint& position)
{
    if (m_down.contains(finger)) {
        move(finger, position);
        return;
    }
    if (window == nullptr || window->window()->windowHandle() == nullptr)
        return;
    m_down.insert(finger, {m_nextId++, position, window->window()->windowHandle()});
    send(finger, QEventPoint::State::Pressed);
}

void Fingers::pressWidget(int finger, QWidget* widget, const QPoint& position)
{
    press(finger, widget, widget->mapToGlobal(position));
}

void Fingers::move(int finger, const QPoint& position)
{
    const auto it = m_down.find(finger);
    if (it == m_down.end())
        return;
    it->position = position;
    send(finger, QEventPoint::State::Updated);
}

void Fingers::lift(int finger)
{
    if (!m_down.contains(finger))
        return;
    send(finger, QEventPoint::State::Released);
    m_down.remove(finger);
}

void Fingers::liftAll()
{
    while (!m_down.isEmpty())
        lift(m_down.firstKey());
}

void Fingers::cancel()
{
    if (m_down.isEmpty())
        return;
    QWindow* window = m_down.first().window;
    m_down.clear();
    m_time += STEP;
    QWindowSystemInterface::handleTouchCancelEvent<QWindowSystemInterface::SynchronousDelivery>(
        window, m_time, m_devices.back().get(), Qt::NoModifier);
    // With a new device later fingers do not reach the targets that Qt still remembers for the cancelled
    // ones.
    plugIn();
}

// Sends one event with all fingers, of which the given one has changed.
void Fingers::send(int finger, QEventPoint::State state)
{
    QList<QWindowSystemInterface::TouchPoint> points;
    for (auto it = m_down.cbegin(); it != m_down.cend(); ++it) {
        QWindowSystemInterface::TouchPoint point;
        point.id = it->id;
        point.state = it.key() == finger ? state : QEventPoint::State::Stationary;
        point.area = QRectF(it->position - QPointF(4, 4), QSizeF(8, 8));
        point.pressure = state == QEventPoint::State::Released && it.key() == finger ? 0 : 1;
        points.append(point);
    }
    m_time += STEP;
    QWindowSystemInterface::handleTouchEvent<QWindowSystemInterface::SynchronousDelivery>(
        m_down.value(finger).window, m_time, m_devices.back().get(), points, Qt::NoModifier);
}
