// How fingers and the mouse move and work the tree.
#include "touchui/KSScrollBar.h"
#include "touchui/KSTreeModel.h"
#include "touchui/KSTreeView.h"
#include "touchui/TouchClock.h"

#include <QApplication>
#include <QMouseEvent>
#include <QTimerEvent>
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

bool KSTreeView::event(QEvent* event)
{
    if (isTouch(event)) {
        return onTouchEvent(static_cast<QTouchEvent*>(event));
    }
    return event->type() == QEvent::Gesture || QTreeView::event(event);
}

bool KSTreeView::viewportEvent(QEvent* event)
{
    if (isTouch(event)) {
        return onTouchEvent(static_cast<QTouchEvent*>(event));
    }
    return event->type() == QEvent::Gesture || QTreeView::viewportEvent(event);
}

bool KSTreeView::onTouchEvent(QTouchEvent* event)
{
    event->accept();
    switch (m_finger.follow(event)) {
    case OneFinger::Step::Begin:
        return onTouchBeginEvent(event);
    case OneFinger::Step::Move:
        return onTouchUpdateEvent(event);
    case OneFinger::Step::End:
        return onTouchEndEvent(event);
    case OneFinger::Step::None:
        return true;
    }
    return true;
}

QPoint KSTreeView::fingerPosition() const
{
    return m_finger.positionIn(viewport()).toPoint();
}

bool KSTreeView::onTouchBeginEvent(QTouchEvent*)
{
    const QPoint point = fingerPosition();
    const bool brake = isAutoFilck();
    beginMotion(point);
    if (!brake) {
        sendMouse(QEvent::MouseButtonPress, point);
    }
    return true;
}

bool KSTreeView::onTouchUpdateEvent(QTouchEvent*)
{
    const QPoint point = fingerPosition();
    moveMotion(point);
    sendMouse(QEvent::MouseMove, point);
    return true;
}

bool KSTreeView::onTouchEndEvent(QTouchEvent* event)
{
    endMotion(fingerPosition());
    onTranslateTouchEndEventToMouse(event);
    return true;
}

void KSTreeView::onTranslateTouchEndEventToMouse(QTouchEvent*)
{
    sendMouse(QEvent::MouseButtonRelease, fingerPosition());
}

// Nothing was tapped, and nothing goes on moving.
void KSTreeView::rest()
{
    stopFlick();
    cancelPress();
    hideElidedText();
}

void KSTreeView::sendMouse(QEvent::Type type, const QPoint& point)
{
    const bool release = type == QEvent::MouseButtonRelease;
    QMouseEvent mouse(type, point, viewport()->mapToGlobal(point),
                      type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton,
                      release ? Qt::NoButton : Qt::LeftButton, Qt::NoModifier);
    m_sendingMouse = true;
    if (type == QEvent::MouseButtonPress) {
        mousePressEvent(&mouse);
    } else if (release) {
        mouseReleaseEvent(&mouse);
    } else {
        mouseMoveEvent(&mouse);
    }
    m_sendingMouse = false;
}

// --- Mouse, and what a touch is passed on as ----------------------------------------------------------

void KSTreeView::mousePressEvent(QMouseEvent* event)
{
    event->accept();
    const QPoint point = event->position().toPoint();
    if (event->button() != Qt::LeftButton || (!m_sendingMouse && m_finger.isDown())) {
        return;
    }
    if (!m_sendingMouse) {
        const bool brake = isAutoFilck();
        beginMotion(point);
        if (brake) {
            return;
        }
    }
    beginPress(point);
}

void KSTreeView::mouseMoveEvent(QMouseEvent* event)
{
    event->accept();
    const QPoint point = event->position().toPoint();
    if (!m_sendingMouse && (event->buttons() & Qt::LeftButton) && !m_finger.isDown()) {
        moveMotion(point);
    }
    if (m_pressState == NotPressed) {
        return;
    }
    if ((point - m_pressPoint).manhattanLength() > QApplication::startDragDistance()) {
        m_finger.stopHold();
        m_moved = true;
    }
    if (m_pressedCheckBox.isValid() && !getCheckBoxRectForTouch(m_pressedCheckBox).contains(point)) {
        m_pressedCheckBox = QModelIndex();
        viewport()->update();
    }
    if (m_pressedIndicator.isValid() && !indicatorRectForTouch(m_pressedIndicator).contains(point)) {
        m_pressedIndicator = QModelIndex();
        viewport()->update();
    }
}

void KSTreeView::mouseReleaseEvent(QMouseEvent* event)
{
    event->accept();
    const QPoint point = event->position().toPoint();
    if (event->button() != Qt::LeftButton || (!m_sendingMouse && m_finger.isDown())) {
        return;
    }
    if (!m_sendingMouse) {
        endMotion(point);
    }
    const bool isTap = m_pressState == Pressed && !m_moved &&
                       (point - m_pressPoint).manhattanLength() <= QApplication::startDragDistance();
    if (isTap) {
        tap(point);
    }
    cancelPress();
}

void KSTreeView::mouseDoubleClickEvent(QMouseEvent* event)
{
    mousePressEvent(event);
}

void KSTreeView::beginPress(const QPoint& point)
{
    cancelPress();
    m_pressState = Pressed;
    m_pressPoint = point;
    const QModelIndex index = indexAt(point);
    m_pressIndex = index;
    if (!isUsable(index)) {
        return;
    }
    const QModelIndex first = index.siblingAtColumn(0);
    if (getCheckBoxRectForTouch(first).contains(point)) {
        m_pressedCheckBox = first;
    } else if (indicatorRectForTouch(first).contains(point)) {
        m_pressedIndicator = first;
    } else {
        m_finger.startHold(m_holdInterval);
    }
    viewport()->update();
}

void KSTreeView::cancelPress()
{
    m_finger.stopHold();
    m_pressState = NotPressed;
    m_moved = false;
    m_pressIndex = QModelIndex();
    m_pressedCheckBox = QModelIndex();
    m_pressedIndicator = QModelIndex();
    viewport()->update();
}

// What was pressed counts, also when the list has moved a few pixels under the finger. Receivers may change
// the model.
void KSTreeView::tap(const QPoint& point)
{
    const QPersistentModelIndex index = m_pressIndex;
    if (m_pressedCheckBox.isValid()) {
        if (getCheckBoxRectForTouch(m_pressedCheckBox).contains(point)) {
            changeCheckState(m_pressedCheckBox);
        }
    } else if (m_pressedIndicator.isValid()) {
        if (indicatorRectForTouch(m_pressedIndicator).contains(point)) {
            setExpanded(m_pressedIndicator, !isExpanded(m_pressedIndicator));
        }
    } else if (isUsable(index)) {
        makeCurrent(index);
        if (index.isValid()) {
            Q_EMIT signalCurrentChangedByTouch(index);
        }
        if (index.isValid()) {
            Q_EMIT clicked(index);
        }
    }
}

void KSTreeView::makeCurrent(const QModelIndex& index)
{
    const QPersistentModelIndex kept = index;
    setCurrentIndex(index);
    if (kept.isValid()) {
        Q_EMIT pressed(kept);
    }
}

void KSTreeView::slotHold()
{
    if (m_pressState != Pressed || !isUsable(m_pressIndex)) {
        return;
    }
    m_pressState = Held;
    const QPersistentModelIndex index = m_pressIndex;
    makeCurrent(index);
    if (index.isValid() && isTextElide(index)) {
        showElidedText(index);
    }
    if (index.isValid()) {
        Q_EMIT signalPressedAndHold(index);
    }
}

// --- Motion -------------------------------------------------------------------------------------------

void KSTreeView::beginMotion(const QPoint& point)
{
    stopFlick();
    setStartPoint(point);
    setEndPoint(point);
    m_pendingStart = true;
}

void KSTreeView::moveMotion(const QPoint& point)
{
    if (m_pendingStart) {
        setStartPoint(point);
        m_pendingStart = false;
    }
    setEndPoint(point);
}

void KSTreeView::endMotion(const QPoint& point)
{
    m_pendingStart = false;
    setEndPoint(point);
    if (isFlickEnd() || m_flickTimerId == 0) {
        stopFlick();
    } else {
        setAutoFlick(true);
    }
}

void KSTreeView::setAutoFlick(bool autoFlick)
{
    m_autoFlick = autoFlick;
}

bool KSTreeView::isAutoFilck()
{
    return m_autoFlick;
}

bool KSTreeView::hasFlicked()
{
    return m_hasFlicked;
}

void KSTreeView::setStartPoint(const QPoint& point)
{
    m_startPoint = point;
    m_hasFlicked = false;
}

void KSTreeView::setEndPoint(const QPoint& point)
{
    m_endPoint = point;
    if (isFlickEnd() || m_flickTimerId != 0) {
        return;
    }
    m_scrollingFlag = 1;
    setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
    m_startScrollValue = verticalScrollBar()->value();
    m_flickTimerId = TouchClock::instance().start(this, m_rules.interval);
    m_hasFlicked = true;
    m_finger.stopHold();
    hideElidedText();
}

bool KSTreeView::isFlickEnd()
{
    return FlickMotion::isFlickEnd(m_rules, m_startPoint, m_endPoint);
}

void KSTreeView::stopFlick()
{
    if (m_flickTimerId != 0) {
        TouchClock::instance().stop(this, m_flickTimerId);
        m_flickTimerId = 0;
    }
    m_autoFlick = false;
    m_scrollingFlag = 0;
}

void KSTreeView::timerEvent(QTimerEvent* event)
{
    if (event->timerId() != m_flickTimerId) {
        QTreeView::timerEvent(event);
        return;
    }
    const QScrollBar* bar = verticalScrollBar();
    if (!isFlickEnd()) {
        changeScrollBarValue(getDistance().y());
    } else if (bar->value() == bar->maximum()) {
        stopFlick();
        scrollToBottom();
    } else if (isAutoFilck()) {
        stopFlick();
    } else {
        m_finger.stopHold(); // the finger rests on a list that it has moved
    }
    // A glide dies at either end; there is no way on that would use up what is left of it.
    if (isAutoFilck() && FlickMotion::isAtLimit(bar->value(), bar->minimum(), bar->maximum())) {
        const bool atBottom = bar->value() == bar->maximum();
        stopFlick();
        if (atBottom) {
            scrollToBottom();
        }
    }
}

QPoint KSTreeView::getDistance()
{
    return isAutoFilck() ? getFlickDistance() : getDragDistance();
}

QPoint KSTreeView::getFlickDistance()
{
    const FlickMotion::Step step = FlickMotion::flickStep(m_rules, m_startPoint, m_endPoint);
    m_startPoint = step.start.toPoint();
    return QPoint(static_cast<int>(step.distance.x()), step.scroll);
}

QPoint KSTreeView::getDragDistance()
{
    const FlickMotion::Step step = FlickMotion::dragStep(m_rules, m_startPoint, m_endPoint);
    m_startPoint = step.start.toPoint();
    return QPoint(static_cast<int>(step.distance.x()), step.scroll);
}

void KSTreeView::changeScrollBarValue(int offset)
{
    QScrollBar* bar = verticalScrollBar();
    bar->setValue(FlickMotion::scrolledValue(m_startScrollValue, offset, bar->minimum(), bar->maximum()));
    m_startScrollValue = bar->value();
}

void KSTreeView::hideEvent(QHideEvent* event)
{
    rest();
    QTreeView::hideEvent(event);
}

void KSTreeView::allTimersReset()
{
    m_finger.restartHold();
    for (QTimer* timer : {&m_singleShotTimer, &m_loadingTimer}) {
        if (timer->isActive()) {
            timer->start();
        }
    }
}
