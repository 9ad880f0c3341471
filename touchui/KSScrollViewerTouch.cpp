// What fingers and mouse do to the list: flicks, presses and the dragging of items.
#include "touchui/KSScrollViewerWidget.h"

#include "support/LogManager.h"
#include "touchui/KSScrollBar.h"
#include "touchui/ScrollViewerBoard.h"
#include "touchui/ScrollViewerDrag.h"

#include <QEventPoint>
#include <QHideEvent>
#include <QMouseEvent>
#include <QPaintEvent>
#include <QPainter>
#include <QTouchEvent>

namespace
{

bool isTouch(const QEvent* event)
{
    return event->type() == QEvent::TouchBegin || event->type() == QEvent::TouchUpdate ||
           event->type() == QEvent::TouchEnd || event->type() == QEvent::TouchCancel;
}

} // namespace

bool KSScrollViewerWidget::eventFilter(QObject* object, QEvent* event)
{
    if (object == m_bar)
        return handleVScrollBarEvent(event);
    if (object == m_board->board() && event->type() == QEvent::Paint) {
        QPainter painter(m_board->board());
        if (m_hasSeparator)
            m_board->paintSeparators(painter, static_cast<QPaintEvent*>(event)->rect());
        return true;
    }
    if (object == m_board->board() && event->type() == QEvent::LayoutRequest)
        adjustLayout(); // an item wants another size
    if (event->type() == QEvent::Gesture || isTouch(event))
        return handleTouchEventFilter(object, event);
    return QScrollArea::eventFilter(object, event);
}

bool KSScrollViewerWidget::handleVScrollBarEvent(QEvent* event)
{
    switch (event->type()) {
    case QEvent::Wheel:
        wheelEvent(static_cast<QWheelEvent*>(event));
        return true;
    case QEvent::ContextMenu:
        return true;
    case QEvent::MouseButtonPress:
    case QEvent::TouchBegin:
        stopFlick();
        refreshVisible();
        handleScrollBarPressedEvent(event);
        return false;
    default:
        return false;
    }
}

// Beside the handle the list jumps, so that the handle comes under the press and can be dragged on from
// there.
void KSScrollViewerWidget::handleScrollBarPressedEvent(QEvent* event)
{
    slotScrollBarSliderPressed();
    const QList<QEventPoint>& points = static_cast<QPointerEvent*>(event)->points();
    if (points.isEmpty())
        return;
    const int y = m_bar->mapFromGlobal(points.constFirst().globalPosition().toPoint()).y();
    const QRect handle = m_bar->handleRect();
    if (y >= handle.top() && y <= handle.bottom())
        m_bar->update();
    else
        slotSetScrollBarValue(
            static_cast<int>(qint64(y) * m_board->board()->height() / qMax(height(), 1) - height() / 2));
}

bool KSScrollViewerWidget::handleTouchEventFilter(QObject* object, QEvent* event)
{
    if (event->type() == QEvent::Gesture)
        return object == this || object == viewport();
    auto* touch = static_cast<QTouchEvent*>(event);
    if (event->type() != QEvent::TouchCancel && isOtherItemTouchWhenGraping(object, event))
        return true;
    if (m_finger.follow(touch, object) == OneFinger::Step::None)
        return !m_isTake;
    auto* item = qobject_cast<KSBaseItemWidget*>(object);
    const bool isItem = item && (m_board->indexOf(item) >= 0 || m_drag->item() == item);
    if (!isItem && object != this && object != viewport()) {
        onTranslateTouchEventToMouse(object, touch);
        return true;
    }
    const bool brake = isAutoFilck();
    const bool result = onTouchEvent(object, touch);
    if (brake)
        handleFlickBeginEvent(m_finger.positionIn(this).toPoint());
    else
        onTranslateTouchEventToMouse(object, touch);
    return result;
}

// A finger on a list in flight stops it and presses nothing.
void KSScrollViewerWidget::handleFlickBeginEvent(const QPoint& pos)
{
    m_press.drop();
    m_press.press = pos;
    m_press.last = pos;
    m_scrollValue = verticalScrollBar()->value();
    m_press.stopTimers();
    m_press.clearItem();
}

bool KSScrollViewerWidget::isOtherItemTouchWhenGraping(QObject* object, QEvent* event) const
{
    if (!m_drag->isActive() || !isTouch(event) || object == m_finger.receiver())
        return false;
    if (object == this || object == viewport())
        return true;
    return m_board->indexOf(qobject_cast<KSBaseItemWidget*>(object)) >= 0;
}

// Nothing is tapped or held, nothing goes on moving, and what is lifted returns to its place.
void KSScrollViewerWidget::rest()
{
    m_flicker.cancel();
    m_press.stopTimers();
    m_press.drop();
    m_press.moved = false;
    m_press.willFlick = false;
    m_press.popupRequested = false;
    putItemBack();
}

// For an item that has left the list: the finger that is on it gets no further, and others may come.
void KSScrollViewerWidget::breakTouchOf(KSBaseItemWidget* item)
{
    if (m_finger.receiver() == item)
        m_finger.cancel();
}

void KSScrollViewerWidget::hideEvent(QHideEvent* event)
{
    rest();
    QScrollArea::hideEvent(event);
}

bool KSScrollViewerWidget::onTouchEvent(QObject*, QTouchEvent*)
{
    const QPointF position = m_finger.positionIn(this);
    if (m_finger.step() == OneFinger::Step::Begin) {
        if (!m_isTake)
            m_flicker.begin(position);
        return !m_isTake;
    }
    if (!m_flicker.isFollowing())
        return !m_isTake;
    if (m_finger.step() == OneFinger::Step::Move) {
        m_flicker.follow(position);
        return true;
    }
    m_flicker.lift(position);
    if (flickAbility() && !isFlickEnd())
        m_savedMinitrim = std::exchange(m_minitrim, false);
    return true;
}

void KSScrollViewerWidget::motionEnded(Flicker::End end)
{
    if (end == Flicker::End::Rest)
        m_minitrim = m_savedMinitrim;
}

QPointF KSScrollViewerWidget::getDistance()
{
    return m_flicker.advance(dragBounds());
}

std::optional<FlickMotion::DragBounds> KSScrollViewerWidget::dragBounds() const
{
    const KSBaseItemWidget* item = m_press.item;
    if (!item || m_board->indexOf(item) < 0)
        return std::nullopt;
    const int top = m_board->board()->mapTo(this, item->pos()).y();
    return FlickMotion::DragBounds{top, top + item->height() - 1, height()};
}

void KSScrollViewerWidget::onTranslateTouchEventToMouse(QObject* object, QTouchEvent* event)
{
    QPoint pos = m_finger.positionIn(this).toPoint();
    switch (m_finger.step()) {
    case OneFinger::Step::Begin:
        onTranslateTouchBeginEventToMouse(object, event, pos);
        break;
    case OneFinger::Step::Move:
        onTranslateTouchUpdateEventToMouse(object, event, pos);
        break;
    case OneFinger::Step::End:
        onTranslateTouchEndEventToMouse(object, event, pos);
        break;
    case OneFinger::Step::None:
        break;
    }
}

void KSScrollViewerWidget::onTranslateTouchBeginEventToMouse(QObject*, QTouchEvent*, QPoint& pos)
{
    beginPress(ScrollViewerPress::Pointer::Finger, pos, Qt::LeftButton);
}

void KSScrollViewerWidget::beginPress(ScrollViewerPress::Pointer pointer, const QPoint& pos,
                                      Qt::MouseButton button)
{
    m_scrollValue = verticalScrollBar()->value();
    m_press.begin(pointer, pos, m_scrollValue);
    m_press.item = m_board->itemAroundThePos(toBoard(pos), calculateVisibleRect());
    m_press.index = m_board->indexOf(m_press.item);
    if (pos.x() < m_effectiveLeft || pos.x() > m_effectiveLeft + m_effectiveWidth) {
        m_press.clearItem();
        m_press.drop();
        return;
    }
    QMouseEvent press(QEvent::MouseButtonPress, pos, mapToGlobal(pos), button, button, Qt::NoModifier);
    if (m_press.index < 0) {
        handleAreaPressedEvent(&press);
        return;
    }
    m_press.positionInItem = m_press.item->mapFrom(this, pos);
    m_press.calculateBounds(m_press.item->height(), height());
    m_press.item->setHasFocus(true);
    if (m_itemsCanDrag && isItemDragAreaPressed()) {
        m_drag->setSize(m_press.item->size());
        m_press.popup.start(ScrollViewerPress::POPUP_TIME);
        m_press.dragAreaPressed = true;
    } else {
        handleItemPressedEvent(&press);
    }
}

bool KSScrollViewerWidget::isItemDragAreaPressed() const
{
    const QRect area = m_press.item->getDragArea();
    return !area.isNull() && area.contains(m_press.positionInItem);
}

void KSScrollViewerWidget::handleItemPressedEvent(QMouseEvent* event)
{
    m_press.positionInItem = m_press.item->mapFrom(this, m_press.press);
    if (event->button() == Qt::RightButton) {
        m_press.drop();
        Q_EMIT widgetItemRightPressed(m_press.item, m_press.positionInItem, this);
    } else {
        startHold(L"handleItemPressedEvent");
    }
}

void KSScrollViewerWidget::handleAreaPressedEvent(QMouseEvent* event)
{
    m_press.positionInItem = QPoint(-1, -1);
    m_press.calculateBounds(0, height());
    if (event->button() == Qt::RightButton) {
        m_press.drop();
        Q_EMIT widgetItemRightPressed(nullptr, m_press.press, this);
    } else {
        startHold(L"handleAreaPressedEvent");
    }
}

void KSScrollViewerWidget::startHold(const wchar_t* tag)
{
    m_press.hold.start(ScrollViewerPress::HOLD_TIME);
    LOG_USER_OPERATE(tag, 200, L"Timer started");
    Q_EMIT widgetItemPressed(m_press.item, m_press.item ? m_press.positionInItem : m_press.press, this);
}

void KSScrollViewerWidget::slotHandleMenuTimer()
{
    const bool isItemGone = m_press.index >= 0 && !m_press.item;
    if (m_press.willFlick || isItemGone)
        return;
    Q_EMIT widgetItemLongHold(m_press.item, m_press.item ? m_press.positionInItem : m_press.press, this);
}

void KSScrollViewerWidget::stopTapAndHoldTimer()
{
    m_press.hold.stop();
}

void KSScrollViewerWidget::allTimersReset()
{
    m_stretchTimer.restartIfActive();
    m_press.hold.restartIfActive();
    m_drag->edgeTimer.restartIfActive();
}

void KSScrollViewerWidget::onTranslateTouchUpdateEventToMouse(QObject*, QTouchEvent*, QPoint& pos)
{
    if (m_press.item)
        Q_EMIT widgetItemMouseMove(m_press.item, m_press.item->mapFromGlobal(mapToGlobal(pos)), this);
    if (!m_press.isActive())
        return;
    if (m_drag->isActive()) {
        moveDragItem(pos);
        return;
    }
    if (!m_press.isBeyondSlop(pos))
        return;
    m_press.hold.stop();
    if (!m_press.item)
        return;
    Q_EMIT signalFlick(m_press.item, m_press.positionInItem, this, m_press.willFlick);
    if (m_press.willFlick)
        JudgeHaveMoveNow(pos);
}

bool KSScrollViewerWidget::isInsidePressedItem(const QPoint& pos) const
{
    return m_press.item && m_press.item->rect().contains(m_press.item->mapFromGlobal(mapToGlobal(pos)));
}

void KSScrollViewerWidget::JudgeHaveMoveNow(const QPoint& pos)
{
    if (!m_press.dragAreaPressed && !isInsidePressedItem(pos)) {
        m_press.drop();
        m_press.willFlick = false;
    }
    m_press.moved = m_scrollValue != m_press.valueAtPress;
}

void KSScrollViewerWidget::onTranslateTouchEndEventToMouse(QObject*, QTouchEvent*, QPoint& pos)
{
    m_press.popup.stop();
    // A list that runs on has been moved, even when its first tick is still to come; a finger that slid a
    // little is a tap all the same.
    if ((m_press.willFlick || isMove()) && isAutoFilck() && m_bar->maximum() > m_bar->minimum())
        m_press.moved = true;
    endPress(pos);
}

void KSScrollViewerWidget::endPress(const QPoint& pos)
{
    if (!m_press.isActive())
        return;
    m_press.drop();
    m_press.stopTimers();
    m_drag->edgeTimer.stop();
    viewport()->releaseMouse();
    const bool moved = m_press.moved;
    if (moved) {
        MouseReleaseChangeColorSingal(pos);
    } else {
        MouseReleaseSingal(pos);
        m_press.willFlick = false;
    }
    if (m_drag->isActive() || moved) {
        handleDropItemWhenRelease();
        m_press.moved = false;
        m_press.popupRequested = false;
        m_press.willFlick = false;
    } else if (m_press.item && isInsidePressedItem(pos)) {
        Q_EMIT widgetItemClicked(m_press.item, m_press.positionInItem, this);
    }
}

void KSScrollViewerWidget::MouseReleaseSingal(const QPoint& pos)
{
    if (!m_press.item)
        Q_EMIT widgetItemReleased(nullptr, pos, this);
    else if (isInsidePressedItem(pos))
        Q_EMIT widgetItemReleased(m_press.item, m_press.item->mapFromGlobal(mapToGlobal(pos)), this);
}

void KSScrollViewerWidget::MouseReleaseChangeColorSingal(const QPoint& pos)
{
    if (!m_press.item)
        Q_EMIT widgetItemChangeColor(nullptr, pos, this);
    else if (isInsidePressedItem(pos))
        Q_EMIT widgetItemChangeColor(m_press.item, m_press.item->mapFromGlobal(mapToGlobal(pos)), this);
}

void KSScrollViewerWidget::mousePressEvent(QMouseEvent* event)
{
    stopFlick();
    m_finger.cancel();
    beginPress(ScrollViewerPress::Pointer::Mouse, event->position().toPoint(), event->button());
    event->accept();
}

void KSScrollViewerWidget::mouseMoveEvent(QMouseEvent* event)
{
    event->accept();
    if (m_finger.isDown())
        return;
    const QPoint pos = event->position().toPoint();
    if (m_press.item)
        Q_EMIT widgetItemMouseMove(m_press.item, m_press.item->mapFromGlobal(mapToGlobal(pos)), this);
    if (!m_press.isActive())
        return;
    if (m_drag->isActive()) {
        moveDragItem(pos);
        return;
    }
    if (!m_press.isBeyondSlop(pos))
        return;
    m_press.hold.stop();
    if (m_press.item) {
        Q_EMIT signalFlick(m_press.item, m_press.positionInItem, this, m_press.willFlick);
        if (m_press.willFlick)
            JudgeHaveMoveNow(pos);
    }
    m_stretchTimer.stop();
    if (pos.y() != m_press.last.y()) {
        moveAll(pos);
        m_press.moved = m_press.moved || m_scrollValue != m_press.valueAtPress;
    }
}

void KSScrollViewerWidget::mouseReleaseEvent(QMouseEvent* event)
{
    event->accept();
    m_press.popup.stop();
    if (!m_finger.isDown())
        endPress(event->position().toPoint());
}

void KSScrollViewerWidget::moveAll(const QPoint& pos)
{
    if (m_press.outOfBounds && m_press.isOutside(pos.y())) {
        m_press.last = pos;
        return;
    }
    handleMovement(pos);
    m_press.outOfBounds = m_press.isOutside(pos.y());
    m_press.last = pos;
}

void KSScrollViewerWidget::handleMovement(const QPoint& pos)
{
    int distance = pos.y() - m_press.last.y();
    if (const auto bounds = dragBounds())
        distance = FlickMotion::boundedDistance(distance, *bounds);
    changeScrollBarValue(distance);
}

void KSScrollViewerWidget::slotShowPopupItem()
{
    startDrag();
}

void KSScrollViewerWidget::slotStartDrag(KSBaseItemWidget* item)
{
    if (!item || m_drag->isActive() || m_board->indexOf(item) < 0)
        return;
    m_press.item = item;
    m_press.index = m_board->indexOf(item);
    m_press.popupRequested = true;
    m_press.willFlick = false;
    m_drag->setSize(item->size());
    item->setPopup(true);
    startDrag();
}

void KSScrollViewerWidget::startDrag()
{
    KSBaseItemWidget* item = m_press.item;
    if (m_drag->isActive() || !item || m_board->indexOf(item) < 0)
        return;
    m_barPressed = true;
    m_press.stopTimers();
    // The finger moves the item now and not the list.
    setFlickAbility(false);
    m_flicker.rest();
    Q_EMIT signalDragOneItem(item, m_press.index, this);
    QWidget* parent = s_mainWnd ? s_mainWnd.data() : window();
    const QPoint position = parent->mapFromGlobal(mapToGlobal(m_press.press)) - m_press.positionInItem;
    m_drag->lift(item, m_dragAlignment, parent, position);
    viewport()->grabMouse();
    Q_EMIT signalVisibleItemsChange();
}

void KSScrollViewerWidget::moveDragItem(const QPoint& pos)
{
    m_drag->moveBy(pos.y() - m_press.last.y());
    m_press.last = pos;
    const int top = m_drag->topIn(this);
    if (!FlickMotion::needsEdgeScroll(top, top + m_drag->height() - height()))
        m_drag->edgeTimer.stop();
    else if (!m_drag->edgeTimer.isActive())
        m_drag->edgeTimer.start(ScrollViewerDrag::SCROLL_TIME);
    updateIndicator();
}

void KSScrollViewerWidget::slotHandleMoveTimer()
{
    const int top = m_drag->topIn(this);
    changeScrollBarValue(FlickMotion::edgeScrollOffset(top, top + m_drag->height() - height()));
    updateIndicator();
}

void KSScrollViewerWidget::updateIndicator()
{
    m_drag->updateIndicator(calculateVisibleRect(), isTall());
}

void KSScrollViewerWidget::dropItem()
{
    viewport()->releaseMouse();
    m_press.dragAreaPressed = false;
    KSBaseItemWidget* item = m_drag->drop();
    if (item) {
        m_press.item = item;
        m_press.index = m_board->indexOf(item);
        if (!m_itemsCanDrag)
            item->setDragFlag(false);
        item->show();
    }
    adjustLayout();
    Q_EMIT signalItemDrop();
    m_drag->hideLastClone();
}

void KSScrollViewerWidget::handleDropItemWhenRelease()
{
    if (!m_drag->isActive())
        return;
    const QPointer<KSBaseItemWidget> item = m_drag->item();
    dropItem();
    if (item && m_board->indexOf(item) >= 0 && item->geometry().bottom() > calculateVisibleRect().bottom())
        setLastVisibleItem(item);
}

void KSScrollViewerWidget::putItemBack()
{
    if (!m_drag->isActive())
        return;
    m_drag->returnToOrigin();
    dropItem();
}

// The list changes under the finger: what was lifted is not put back.
void KSScrollViewerWidget::abandonDrag()
{
    if (!m_drag->isActive())
        return;
    viewport()->releaseMouse();
    m_press.clearItem();
    m_press.drop();
    m_press.dragAreaPressed = false;
    m_drag->abandon();
}

void KSScrollViewerWidget::slotItemsCanDrag(bool canDrag)
{
    if (m_itemsCanDrag == canDrag)
        return;
    m_itemsCanDrag = canDrag;
    for (KSBaseItemWidget* item : m_board->widgets())
        item->setDragFlag(canDrag);
    if (!canDrag && m_drag->isActive()) {
        dropItem();
        m_press.drop();
    }
}
