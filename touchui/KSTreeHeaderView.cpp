#include "touchui/KSTreeHeaderView.h"

#include "touchui/KSTreeView.h"
#include "touchui/KSVIEW.h"
#include "touchui/KSViewStyle.h"

#include <QMouseEvent>
#include <QPaintEvent>
#include <QPainter>
#include <QStyleOptionHeader>
#include <QTouchEvent>

KSTreeHeaderView::KSTreeHeaderView(KSTreeView* view, const KSViewStyle* style)
    : QHeaderView(Qt::Horizontal, view), m_view(view), m_style(style)
{
    setAttribute(Qt::WA_AcceptTouchEvents);
    viewport()->setAttribute(Qt::WA_AcceptTouchEvents);
    setSectionsClickable(true);
    setHighlightSections(false);
    setSectionsMovable(false);
    setSectionResizeMode(QHeaderView::Fixed); // a finger would move borders by accident
    setStretchLastSection(true);
    setSortIndicatorShown(true);
    setSortIndicator(-1, Qt::AscendingOrder);
    setFocusPolicy(Qt::NoFocus);
    connect(&m_finger, &OneFinger::acted, this,
            [this](QEvent::Type type) { sendMouse(type, m_finger.position()); });
    // Release far outside, so that the section is not clicked.
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
    return takes(event) || QHeaderView::event(event);
}

bool KSTreeHeaderView::viewportEvent(QEvent* event)
{
    return takes(event) || QHeaderView::viewportEvent(event);
}

bool KSTreeHeaderView::takes(QEvent* event)
{
    return event->type() == QEvent::Gesture ||
           (OneFinger::isTouch(event) && onTouchEvent(static_cast<QTouchEvent*>(event)));
}

bool KSTreeHeaderView::onTouchEvent(QTouchEvent* event)
{
    event->accept();
    m_finger.follow(event);
    return true;
}

void KSTreeHeaderView::sendMouse(QEvent::Type type, const QPointF& globalPosition)
{
    QMouseEvent mouse =
        OneFinger::mouseEvent(type, viewport()->mapFromGlobal(globalPosition), globalPosition);
    if (type == QEvent::MouseButtonPress)
        mousePressEvent(&mouse);
    else if (type == QEvent::MouseButtonRelease)
        mouseReleaseEvent(&mouse);
    else
        mouseMoveEvent(&mouse);
}

void KSTreeHeaderView::paintSection(QPainter* painter, const QRect& rect, int logicalIndex) const
{
    if (!rect.isValid())
        return;
    QStyleOptionHeader option;
    initStyleOption(&option);
    option.rect = rect;
    initStyleOptionForIndex(&option, logicalIndex);
    m_style->drawControl(QStyle::CE_Header, &option, painter, this);
}

void KSTreeHeaderView::paintEvent(QPaintEvent* event)
{
    if (count() == 0) {
        QPainter painter(viewport());
        QStyleOptionHeader option;
        option.rect = viewport()->rect();
        m_style->drawControl(QStyle::CE_HeaderEmptyArea, &option, &painter, this);
        return;
    }
    QHeaderView::paintEvent(event);
}
