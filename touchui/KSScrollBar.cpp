#include "touchui/KSScrollBar.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>
#include <QStyle>
#include <QStyleOptionSlider>

KSScrollBar::KSScrollBar(QWidget* parent) : QScrollBar(parent)
{
    init();
}

KSScrollBar::KSScrollBar(Qt::Orientation orientation, QWidget* parent) : QScrollBar(orientation, parent)
{
    init();
}

void KSScrollBar::init()
{
    setAttribute(Qt::WA_AcceptTouchEvents);
    setFocusPolicy(Qt::NoFocus);
    connect(&m_finger, &OneFinger::acted, this, &KSScrollBar::followFinger);
    connect(&m_finger, &OneFinger::cancelled, this, &KSScrollBar::letGo);
}

bool KSScrollBar::event(QEvent* event)
{
    return event->type() == QEvent::ContextMenu || m_finger.takes(event) || QScrollBar::event(event);
}

// Positions of a press or move are truncated to whole pixels, that of a lift is rounded.
void KSScrollBar::followFinger(QEvent::Type type)
{
    const QPointF exact = m_finger.positionIn(this);
    const QPoint cut(static_cast<int>(exact.x()), static_cast<int>(exact.y()));
    sendMouse(type, type == QEvent::MouseButtonRelease ? exact.toPoint() : cut);
}

void KSScrollBar::sendMouse(QEvent::Type type, const QPoint& position)
{
    QMouseEvent mouse = OneFinger::mouseEvent(type, position, mapToGlobal(position));
    if (type == QEvent::MouseButtonPress)
        mousePressEvent(&mouse);
    else if (type == QEvent::MouseMove)
        mouseMoveEvent(&mouse);
    else
        mouseReleaseEvent(&mouse);
}

void KSScrollBar::letGo()
{
    if (m_pressed)
        sendMouse(QEvent::MouseButtonRelease, QPoint());
}

void KSScrollBar::mousePressEvent(QMouseEvent* event)
{
    m_pressed = true;
    QScrollBar::mousePressEvent(event);
    update();
}

void KSScrollBar::mouseReleaseEvent(QMouseEvent* event)
{
    m_pressed = false;
    QScrollBar::mouseReleaseEvent(event);
    update();
}

void KSScrollBar::keyReleaseEvent(QKeyEvent* event)
{
    if (event->key() == Qt::Key_PageUp || event->key() == Qt::Key_PageDown) {
        event->ignore();
        return;
    }
    QScrollBar::keyReleaseEvent(event);
}

// Scaled once for each size of the bar: a list that scrolls paints the whole bar at each step.
const QPixmap& KSScrollBar::track()
{
    if (m_track.size() == size())
        return m_track;
    m_track = QPixmap(size());
    m_track.fill(QColor(51, 51, 51));
    const QPixmap base(orientation() == Qt::Vertical ? QStringLiteral(":/Scrollbar/Scbar_base_v")
                                                     : QStringLiteral(":/Scrollbar/Scbar_base_h"));
    QPainter painter(&m_track);
    if (!base.isNull())
        painter.drawPixmap(rect(), base);
    return m_track;
}

const QPixmap& KSScrollBar::stretchedCenter(Handle& handle, QSize size)
{
    if (handle.stretched.size() == size)
        return handle.stretched;
    handle.stretched = QPixmap(size);
    handle.stretched.fill(Qt::transparent);
    QPainter painter(&handle.stretched);
    painter.drawPixmap(QRect(QPoint(0, 0), size), handle.center);
    return handle.stretched;
}

KSScrollBar::Handle& KSScrollBar::handlePictures()
{
    Handle& handle = m_handles[m_pressed ? 1 : 0];
    bool& loaded = m_loaded[m_pressed ? 1 : 0];
    if (loaded)
        return handle;
    loaded = true;
    const bool vertical = orientation() == Qt::Vertical;
    QString name = vertical ? (m_pressed ? QStringLiteral(":/Scrollbar/Scbar_handle_v_pressed_")
                                         : QStringLiteral(":/Scrollbar/Scbar_handle_v_rest_"))
                            : (m_pressed ? QStringLiteral(":/Scrollbar/Scbar_handle_h_pressed_")
                                         : QStringLiteral(":/Scrollbar/Scbar_handle_h_rest_"));
    handle.first.load(name + (vertical ? QStringLiteral("upper") : QStringLiteral("left")));
    handle.center.load(name + QStringLiteral("center"));
    handle.last.load(name + (vertical ? QStringLiteral("bottom") : QStringLiteral("right")));
    handle.grip.load(name + QStringLiteral("center_interval"));
    return handle;
}

QRect KSScrollBar::handleRect() const
{
    QStyleOptionSlider option;
    initStyleOption(&option);
    return style()->subControlRect(QStyle::CC_ScrollBar, &option, QStyle::SC_ScrollBarSlider, this);
}

void KSScrollBar::paintEvent(QPaintEvent*)
{
    QRect handle = handleRect();
    QPainter painter(this);
    if (orientation() == Qt::Vertical)
        paintVertical(&painter, handle);
    else
        paintHorizontal(&painter, handle);
}

void KSScrollBar::paintVertical(QPainter* painter, QRect& handle)
{
    painter->drawPixmap(0, 0, track());
    Handle& pictures = handlePictures();
    const int x = handle.x() + (handle.width() - pictures.center.width()) / 2;
    const int first = pictures.first.height();
    const int last = pictures.last.height();
    painter->drawPixmap(x, handle.y(), pictures.first);
    const QRect center(x, handle.y() + first, pictures.center.width(), handle.height() - first - last);
    if (center.height() > 0)
        painter->drawPixmap(center.topLeft(), stretchedCenter(pictures, center.size()));
    painter->drawPixmap(x, handle.bottom() + 1 - last, pictures.last);
    if (center.height() >= pictures.grip.height()) {
        painter->drawPixmap(handle.x() + (handle.width() - pictures.grip.width()) / 2,
                            center.y() + (center.height() - pictures.grip.height()) / 2, pictures.grip);
    }
}

void KSScrollBar::paintHorizontal(QPainter* painter, QRect& handle)
{
    painter->drawPixmap(0, 0, track());
    Handle& pictures = handlePictures();
    const int y = handle.y() + (handle.height() - pictures.center.height()) / 2;
    const int first = pictures.first.width();
    const int last = pictures.last.width();
    painter->drawPixmap(handle.x(), y, pictures.first);
    const QRect center(handle.x() + first, y, handle.width() - first - last, pictures.center.height());
    if (center.width() > 0)
        painter->drawPixmap(center.topLeft(), stretchedCenter(pictures, center.size()));
    painter->drawPixmap(handle.right() + 1 - last, y, pictures.last);
    if (center.width() >= pictures.grip.width()) {
        painter->drawPixmap(center.x() + (center.width() - pictures.grip.width()) / 2,
                            handle.y() + (handle.height() - pictures.grip.height()) / 2, pictures.grip);
    }
}
