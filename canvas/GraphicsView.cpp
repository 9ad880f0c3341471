#include "canvas/GraphicsView.h"

#include "canvas/GraphicsText.h"

#include <QApplication>
#include <QGraphicsScene>
#include <QMouseEvent>
#include <QTouchEvent>

namespace
{
// Milliseconds within which a second touch makes a double click.
constexpr int DOUBLE_TOUCH_TIME = 350;

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
    m_clickTimer.setInterval(DOUBLE_TOUCH_TIME);
    connect(&m_clickTimer, &QTimer::timeout, this, &GraphicsView::mouseClick);
    connect(&m_finger, &OneFinger::began, this, &GraphicsView::touchBegin);
    connect(&m_finger, &OneFinger::moved, this, &GraphicsView::touchUpdate);
    connect(&m_finger, &OneFinger::lifted, this, &GraphicsView::touchEnd);
    connect(&m_finger, &OneFinger::cancelled, this, &GraphicsView::rest);
}

void GraphicsView::mouseClick()
{
    m_clickTimer.stop();
}

bool GraphicsView::viewportEvent(QEvent* event)
{
    if (OneFinger::isTouch(event))
        m_modifiers = static_cast<QTouchEvent*>(event)->modifiers();
    return m_finger.takes(event) || QGraphicsView::viewportEvent(event);
}

QPoint GraphicsView::fingerPosition() const
{
    return m_finger.positionIn(viewport()).toPoint();
}

// Releases the mouse grab of the object under the finger, which would otherwise receive every later touch.
void GraphicsView::rest()
{
    m_clickTimer.stop();
    QGraphicsItem* item = scene() ? scene()->mouseGrabberItem() : nullptr;
    if (!item)
        return;
    if (auto* text = qgraphicsitem_cast<GraphicsText*>(item))
        text->cancelTouch();
    if (scene()->mouseGrabberItem() == item)
        item->ungrabMouse();
}

void GraphicsView::touchBegin()
{
    const bool second = m_clickTimer.isActive();
    const QPoint position = fingerPosition();
    m_lastPressX = position.x();
    m_lastPressY = position.y();
    const QEvent::Type type = second ? QEvent::MouseButtonDblClick : QEvent::MouseButtonPress;
    QMouseEvent mouse = mouseEventAt(type, position, viewport(), Qt::LeftButton, Qt::LeftButton, m_modifiers);
    if (second) {
        mouseDoubleClickEvent(&mouse);
    } else {
        m_clickTimer.start();
        mousePressEvent(&mouse);
    }
}

void GraphicsView::touchUpdate()
{
    const QPoint position = fingerPosition();
    const QPoint moved = position - QPoint(m_lastPressX, m_lastPressY);
    if (moved.manhattanLength() <= QApplication::startDragDistance())
        return;
    QMouseEvent mouse =
        mouseEventAt(QEvent::MouseMove, position, viewport(), Qt::NoButton, Qt::LeftButton, m_modifiers);
    mouseMoveEvent(&mouse);
}

void GraphicsView::touchEnd()
{
    Q_EMIT deleteEmptyItem();
    const QPoint position = fingerPosition();
    QMouseEvent mouse = mouseEventAt(QEvent::MouseButtonRelease, position, viewport(), Qt::LeftButton,
                                     Qt::NoButton, m_modifiers);
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
