#include "touchui/KSBaseItemWidget.h"

#include <QCoreApplication>
#include <QEvent>
#include <QEventPoint>
#include <QGraphicsDropShadowEffect>
#include <QHBoxLayout>
#include <QLabel>
#include <QPaintEvent>
#include <QPainter>
#include <QPixmap>
#include <QPointerEvent>
#include <QStyle>
#include <QStyleOption>
#include <QVBoxLayout>

namespace
{

constexpr int HANDLE_SIZE = 22;
constexpr int HANDLE_LEFT = 6;

// Returns the position of the press in global coordinates.
QPoint pressPosition(const QEvent* event)
{
    const auto& points = static_cast<const QPointerEvent*>(event)->points();
    return points.isEmpty() ? QPoint() : points.constFirst().globalPosition().toPoint();
}

} // namespace

KSBaseItemWidget::KSBaseItemWidget(QWidget* parent) : KSBaseItemWidget(Background::StyleSheet, parent)
{
}

KSBaseItemWidget::KSBaseItemWidget(Background background, QWidget* parent) : KSPushbutton(parent)
{
    setFocusPolicy(Qt::NoFocus);
    if (background == Background::StyleSheet)
        KSBaseItemWidget::setNormalStyle();
}

// Created when it is first needed, because most rows are never dragged.
QLabel* KSBaseItemWidget::makeHandle()
{
    auto* handle = new QLabel(this);
    handle->setPixmap(QPixmap(QStringLiteral(":/MainButtons/Main_Move_Handle")));
    handle->setStyleSheet(QStringLiteral("background-color: rgb(51, 51, 51)"));
    handle->setAttribute(Qt::WA_TransparentForMouseEvents);
    handle->hide();
    return handle;
}

KSBaseItemWidget::~KSBaseItemWidget() = default;

void KSBaseItemWidget::takeChild(QPointer<QWidget>& place, QWidget* child)
{
    if (place && place != child)
        delete place.data();
    place = child;
}

void KSBaseItemWidget::setChild(QWidget* child, ChildPosEnum position)
{
    if (child) {
        child->setAttribute(Qt::WA_TransparentForMouseEvents);
        child->setParent(this);
        if (parent())
            child->installEventFilter(parent());
    }
    switch (position) {
    case CHILD_LEFT:
        takeChild(m_left, child);
        m_whole = false;
        break;
    case CHILD_RIGHT:
        takeChild(m_right, child);
        m_whole = false;
        break;
    case CHILD_THIRD:
        takeChild(m_third, child);
        break;
    default:
        takeChild(m_right, nullptr);
        takeChild(m_third, nullptr);
        takeChild(m_left, child);
        m_whole = true;
        break;
    }
}

void KSBaseItemWidget::createWidget()
{
    if (!m_column) {
        m_column = new QVBoxLayout(this);
        m_row = new QHBoxLayout;
        m_column->addLayout(m_row);
    }
    m_column->setContentsMargins(m_spaceAround, m_spaceAround, m_spaceAround, m_spaceAround);
    m_column->setSpacing(m_spaceBetween);
    m_row->setSpacing(m_spaceBetween);
    for (QWidget* child : {m_left.data(), m_right.data(), m_third.data()}) {
        if (!child)
            continue;
        if (child == m_third)
            m_column->addWidget(child);
        else
            m_row->addWidget(child);
        child->show();
    }
}

QWidget* KSBaseItemWidget::getChild(ChildPosEnum position) const
{
    switch (position) {
    case CHILD_RIGHT:
        return getRightChild();
    case CHILD_THIRD:
        return getThirdChild();
    default:
        return getLeftChild();
    }
}

QWidget* KSBaseItemWidget::getLeftChild() const
{
    return m_left;
}

QWidget* KSBaseItemWidget::getRightChild() const
{
    return m_whole ? m_left : m_right;
}

QWidget* KSBaseItemWidget::getThirdChild() const
{
    return m_whole ? m_left : m_third;
}

KSBaseItemWidget* KSBaseItemWidget::clone()
{
    return nullptr;
}

void KSBaseItemWidget::setSelectedStyle()
{
    setStyleSheet(QStringLiteral("QPushButton { background: rgb(0, 129, 255) }"));
}

void KSBaseItemWidget::setNormalStyle()
{
    setStyleSheet(QStringLiteral("QPushButton { background-color: rgb(51, 51, 51) }"));
}

void KSBaseItemWidget::setPopup(bool popup)
{
    showShadow(popup);
    m_popup = popup;
    if (popup && m_dragBase.front().isNull())
        loadDragBase();
    // Hide the handle: its background would be visible on the lifted look, which paints the handle itself.
    if (m_handle)
        m_handle->setVisible(m_dragFlag && !popup);
    updateDragArea();
    update();
}

// The effect exists only while it is shown, since Qt paints all that lies behind a widget with an effect.
void KSBaseItemWidget::showShadow(bool show)
{
    if (!show) {
        setGraphicsEffect(nullptr);
        return;
    }
    auto* shadow = new QGraphicsDropShadowEffect(this);
    shadow->setBlurRadius(15.0);
    shadow->setColor(QColor(0, 0, 0, 255));
    shadow->setOffset(0, 0);
    setGraphicsEffect(shadow);
}

void KSBaseItemWidget::setSpace(int between, int around)
{
    m_spaceBetween = qMax(between, 0);
    m_spaceAround = qMax(around, 0);
    if (m_column)
        createWidget();
}

void KSBaseItemWidget::setDragFlag(bool dragFlag)
{
    m_dragFlag = dragFlag;
    updateDragArea();
    if (dragFlag) {
        if (!m_handle)
            m_handle = makeHandle();
        m_handle->setGeometry(QRect(getHandlePos(), QSize(HANDLE_SIZE, HANDLE_SIZE)));
        m_handle->setVisible(!m_popup);
        m_handle->raise();
    } else if (m_handle) {
        m_handle->hide();
    }
}

void KSBaseItemWidget::setDragFlagAlignment(DragFlagAlignment alignment)
{
    m_alignment = alignment;
    updateDragArea();
    if (m_handle)
        m_handle->move(getHandlePos());
    update();
}

DragFlagAlignment KSBaseItemWidget::getDragFlagAlignment() const
{
    return m_alignment;
}

QRect KSBaseItemWidget::getDragArea() const
{
    return m_dragArea;
}

int KSBaseItemWidget::handleTop() const
{
    return (rect().bottom() - HANDLE_SIZE) / 2;
}

QPoint KSBaseItemWidget::getHandlePos() const
{
    switch (m_alignment) {
    case DRAGFLAG_LEFT:
        return QPoint(HANDLE_LEFT, handleTop());
    case DRAGFLAG_RIGHT:
        return QPoint(width() - HANDLE_SIZE, handleTop());
    default:
        return QPoint(0, handleTop());
    }
}

void KSBaseItemWidget::updateDragArea()
{
    const int top = handleTop();
    switch (m_alignment) {
    case DRAGFLAG_LEFT:
        m_dragArea = QRect(QPoint(0, top - 10), QPoint(35, top + 31));
        break;
    case DRAGFLAG_RIGHT:
        m_dragArea = QRect(QPoint(width() - 36, top - 10), QPoint(width() - 1, top + 31));
        break;
    default:
        m_dragArea = QRect();
        break;
    }
}

// The application's events are filtered only while the item has the focus and can lose it.
void KSBaseItemWidget::setHasFocus(bool hasFocus)
{
    if (m_hasFocus == hasFocus)
        return;
    m_hasFocus = hasFocus;
    if (hasFocus)
        QCoreApplication::instance()->installEventFilter(this);
    else
        QCoreApplication::instance()->removeEventFilter(this);
}

bool KSBaseItemWidget::eventFilter(QObject* watched, QEvent* event)
{
    const bool press = event->type() == QEvent::MouseButtonPress || event->type() == QEvent::TouchBegin;
    // Check the position and not the receiver: a press inside the item is also delivered to its parents.
    if (press && m_hasFocus && !m_popup && watched->isWidgetType() &&
        !rect().contains(mapFromGlobal(pressPosition(event)))) {
        setHasFocus(false);
        Q_EMIT signalLostFocus();
    }
    return KSPushbutton::eventFilter(watched, event);
}

bool KSBaseItemWidget::event(QEvent* event)
{
    switch (event->type()) {
    case QEvent::MouseButtonPress:
        setHasFocus(true);
        return false;
    case QEvent::MouseMove:
    case QEvent::MouseButtonRelease:
        return false;
    case QEvent::MouseButtonDblClick:
        return true;
    case QEvent::TouchBegin:
        setHasFocus(true);
        return KSPushbutton::event(event);
    default:
        return KSPushbutton::event(event);
    }
}

void KSBaseItemWidget::resizeEvent(QResizeEvent* event)
{
    KSPushbutton::resizeEvent(event);
    updateDragArea();
    if (m_handle)
        m_handle->move(getHandlePos());
    if (size() == m_lastSize)
        return;
    m_lastSize = size();
    Q_EMIT signalResize();
}

void KSBaseItemWidget::paintEvent(QPaintEvent* event)
{
    QPainter painter(this);
    if (m_popup)
        paintDragBase(painter);
    else
        paintBackground(painter, event->rect());
    paintDragFlag(painter);
}

// Paints only the background of the style sheet; as a button, the item would also get a bevel.
void KSBaseItemWidget::paintBackground(QPainter& painter, const QRect&)
{
    QStyleOption option;
    option.initFrom(this);
    style()->drawPrimitive(QStyle::PE_Widget, &option, &painter, this);
}

void KSBaseItemWidget::loadDragBase()
{
    m_dragBase = {QPixmap(QStringLiteral(":/MainButtons/Main_drag_base_Left")),
                  QPixmap(QStringLiteral(":/MainButtons/Main_drag_base_Center")),
                  QPixmap(QStringLiteral(":/MainButtons/Main_drag_base_Right"))};
}

void KSBaseItemWidget::paintDragBase(QPainter& painter)
{
    const auto& [left, center, right] = m_dragBase;
    painter.drawPixmap(QRect(0, 0, left.width(), height()), left);
    painter.drawPixmap(QRect(left.width(), 0, width() - left.width() - right.width(), height()), center);
    painter.drawPixmap(QRect(width() - right.width(), 0, right.width(), height()), right);
}

void KSBaseItemWidget::paintDragFlag(QPainter& painter)
{
    if (m_dragFlag && m_handle && m_alignment != DRAGFLAG_NONE)
        painter.drawPixmap(getHandlePos(), m_handle->pixmap());
}
