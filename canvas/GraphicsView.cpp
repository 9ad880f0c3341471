#include "canvas/GraphicsView.h"

#include <QApplication>
#include <QMouseEvent>
#include <QPointingDevice>
#include <QTouchEvent>

namespace
{
// Milliseconds within which a second touch makes a double click.
constexpr int DoubleTouchTime = 350;

QMouseEvent mouseEventAt(QEvent::Type type, QPoint position, const QWidget* viewport, Qt::MouseButton button,
                         Qt::MouseButtons buttons, Qt::KeyboardModifiers modifiers)
{
    return QMouseEvent(type, position, viewport->mapToGlobal(position), button, buttons, modifiers);
}
} // namespace

GraphicsView::GraphicsView(QGraphicsScene* scene, QWidget* parent) : QGraphicsView(scene, parent)
{
    setAttribute(Qt::WA_AcceptTouchEvents);
    viewport()->setAttribute(Qt::WA_AcceptTouchEvents);
    m_clickTimer.setSingleShot(true);
    m_clickTimer.setInterval(DoubleTouchTime);
    connect(&m_clickTimer, &QTimer::timeout, this, &GraphicsView::mouseClick);
}

void GraphicsView::mouseClick()
{
    m_clickTimer.stop();
}

void GraphicsView::endTouch()
{
    if (m_touchPoints.isEmpty())
        return;
    // By way of the application, whose gate lets other fingers in then.
    QTouchEvent cancel(QEvent::TouchCancel, QPointingDevice::primaryPointingDevice());
    QApplication::sendEvent(viewport(), &cancel);
}

void GraphicsView::getTouchPoints(QEvent* event)
{
    switch (event->type()) {
    case QEvent::TouchBegin:
    case QEvent::TouchUpdate:
    case QEvent::TouchEnd:
        m_touchPoints = static_cast<QTouchEvent*>(event)->points();
        break;
    default:
        break;
    }
}

bool GraphicsView::viewportEvent(QEvent* event)
{
    getTouchPoints(event);
    switch (event->type()) {
    case QEvent::TouchBegin:
        touchBegin(static_cast<QTouchEvent&>(*event));
        return true;
    case QEvent::TouchUpdate:
        touchUpdate(static_cast<QTouchEvent&>(*event));
        return true;
    case QEvent::TouchEnd:
        touchEnd(static_cast<QTouchEvent&>(*event));
        return true;
    case QEvent::TouchCancel:
        // Ends where the finger was, or the object under it would take every later touch for its own.
        touchEnd(static_cast<QTouchEvent&>(*event));
        return true;
    default:
        return QGraphicsView::viewportEvent(event);
    }
}

void GraphicsView::touchBegin(const QTouchEvent& touch)
{
    if (m_touchPoints.isEmpty())
        return;
    const bool second = m_clickTimer.isActive();
    const QPoint position = m_touchPoints.first().position().toPoint();
    m_lastPressX = position.x();
    m_lastPressY = position.y();
    const QEvent::Type type = second ? QEvent::MouseButtonDblClick : QEvent::MouseButtonPress;
    QMouseEvent mouse =
        mouseEventAt(type, position, viewport(), Qt::LeftButton, Qt::LeftButton, touch.modifiers());
    if (second) {
        mouseDoubleClickEvent(&mouse);
    } else {
        m_clickTimer.start();
        mousePressEvent(&mouse);
    }
}

void GraphicsView::touchUpdate(const QTouchEvent& touch)
{
    if (m_touchPoints.isEmpty())
        return;
    const QPoint position = m_touchPoints.first().position().toPoint();
    const QPoint moved = position - QPoint(m_lastPressX, m_lastPressY);
    if (moved.manhattanLength() <= QApplication::startDragDistance())
        return;
    QMouseEvent mouse = mouseEventAt(QEvent::MouseMove, position, viewport(), Qt::NoButton, Qt::LeftButton,
                                     touch.modifiers());
    mouseMoveEvent(&mouse);
}

void GraphicsView::touchEnd(const QTouchEvent& touch)
{
    if (m_touchPoints.isEmpty())
        return;
    Q_EMIT deleteEmptyItem();
    const QPoint position = m_touchPoints.first().position().toPoint();
    m_touchPoints.clear();
    QMouseEvent mouse = mouseEventAt(QEvent::MouseButtonRelease, position, viewport(), Qt::LeftButton,
                                     Qt::NoButton, touch.modifiers());
    mouseReleaseEvent(&mouse);
}

void GraphicsView::mousePressEvent(QMouseEvent* event)
{
    QGraphicsView::mousePressEvent(event);
}

void GraphicsView::mouseReleaseEvent(QMouseEvent* event)
{
    QGraphicsView::mouseReleaseEvent(event);
}

void GraphicsView::mouseMoveEvent(QMouseEvent* event)
{
    QGraphicsView::mouseMoveEvent(event);
}

void GraphicsView::mouseDoubleClickEvent(QMouseEvent* event)
{
    m_clickTimer.stop();
    QGraphicsView::mouseDoubleClickEvent(event);
}
