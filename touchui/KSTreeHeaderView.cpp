#include "touchui/KSTreeHeaderView.h"

#include "touchui/KSTreeView.h"
#include "touchui/KSVIEW.h"
#include "touchui/KSViewStyle.h"

#include <QMouseEvent>
#include <QPaintEvent>
#include <QPainter>
#include <QStyleOptionHeader>
#include <QTouchEvent>

namespace
{

bool isTouch(const QEvent* event)
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

} // namespace

KSTreeHeaderView::KSTreeHeaderView(KSTreeView* view) : QHeaderView(Qt::Horizontal, view), m_view(view)
{
    setAttribute(Qt::WA_AcceptTouchEvents);
    viewport()->setAttribute(Qt::WA_AcceptTouchEvents);
    setSectionsClickable(true);
    setHighlightSections(false);
    setSectionsMovable(false);
    setSectionResizeMode(QHeaderView::Fixed); // a finger would drag borders by accident
    setStretchLastSection(true);
    setSortIndicatorShown(true);
    setSortIndicator(-1, Qt::AscendingOrder);
    setFocusPolicy(Qt::NoFocus);
    // Far outside: the section comes up unclicked.
    connect(&m_finger, &OneFinger::cancelled, this, [this] {
        sendMouse(QEvent::MouseButtonRelease, viewport()->mapToGlobal(QPointF(-10000, -10000)));
    });
}

QSize KSTreeHeaderView::sizeHint() const
{
    return QSize(QHeaderView::sizeHint().width(),
                 m_view->getDesignAttribute(KSVIEW::DesignHeaderHeight).toInt());
}

bool KSTreeHeaderView::event(QEvent* event)
{
    if (isTouch(event)) {
        return onTouchEvent(static_cast<QTouchEvent*>(event));
    }
    return event->type() == QEvent::Gesture || QHeaderView::event(event);
}

bool KSTreeHeaderView::viewportEvent(QEvent* event)
{
    if (isTouch(event)) {
        return onTouchEvent(static_cast<QTouchEvent*>(event));
    }
    return event->type() == QEvent::Gesture || QHeaderView::viewportEvent(event);
}

bool KSTreeHeaderView::onTouchEvent(QTouchEvent* event)
{
    event->accept();
    switch (m_finger.follow(event)) {
    case OneFinger::Step::Begin:
        sendMouse(QEvent::MouseButtonPress, m_finger.position());
        break;
    case OneFinger::Step::Move:
        sendMouse(QEvent::MouseMove, m_finger.position());
        break;
    case OneFinger::Step::End:
        sendMouse(QEvent::MouseButtonRelease, m_finger.position());
        break;
    case OneFinger::Step::None:
        break;
    }
    return true;
}

void KSTreeHeaderView::sendMouse(QEvent::Type type, const QPointF& globalPosition)
{
    const bool release = type == QEvent::MouseButtonRelease;
    const Qt::MouseButton button = type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton;
    QMouseEvent mouse(type, viewport()->mapFromGlobal(globalPosition), globalPosition, button,
                      release ? Qt::NoButton : Qt::LeftButton, Qt::NoModifier);
    if (type == QEvent::MouseButtonPress) {
        mousePressEvent(&mouse);
    } else if (release) {
        mouseReleaseEvent(&mouse);
    } else {
        mouseMoveEvent(&mouse);
    }
}

void KSTreeHeaderView::paintSection(QPainter* painter, const QRect& rect, int logicalIndex) const
{
    if (!rect.isValid()) {
        return;
    }
    QStyleOptionHeader option;
    initStyleOption(&option);
    option.rect = rect;
    initStyleOptionForIndex(&option, logicalIndex);
    m_view->viewStyle()->drawControl(QStyle::CE_Header, &option, painter, this);
}

void KSTreeHeaderView::paintEvent(QPaintEvent* event)
{
    if (count() == 0) {
        QPainter painter(viewport());
        QStyleOptionHeader option;
        option.rect = viewport()->rect();
        m_view->viewStyle()->drawControl(QStyle::CE_HeaderEmptyArea, &option, &painter, this);
        return;
    }
    QHeaderView::paintEvent(event);
}
