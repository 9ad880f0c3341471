// How fingers and the mouse move and work the tree.
#include "touchui/KSScrollBar.h"
#include "touchui/KSTreeModel.h"
#include "touchui/KSTreeView.h"

#include <QApplication>
#include <QMouseEvent>
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
    m_flicker.begin(point);
    if (!brake) {
        sendMouse(QEvent::MouseButtonPress, point);
    }
    return true;
}

bool KSTreeView::onTouchUpdateEvent(QTouchEvent*)
{
    const QPoint point = fingerPosition();
    m_flicker.follow(point);
    sendMouse(QEvent::MouseMove, point);
    return true;
}

bool KSTreeView::onTouchEndEvent(QTouchEvent* event)
{
    m_flicker.lift(fingerPosition());
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
    m_flicker.cancel();
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
        m_flicker.begin(point);
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
        m_flicker.follow(point);
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
        m_flicker.lift(point);
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

void KSTreeView::motionStarted()
{
    setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
    m_finger.stopHold();
    hideElidedText();
}

void KSTreeView::showLastRowWhole()
{
    if (verticalScrollBar()->value() == verticalScrollBar()->maximum()) {
        scrollToBottom();
    }
}

QPoint KSTreeView::getDistance()
{
    return isAutoFilck() ? getFlickDistance() : getDragDistance();
}

void KSTreeView::changeScrollBarValue(int offset)
{
    QScrollBar* bar = verticalScrollBar();
    bar->setValue(FlickMotion::scrolledValue(bar->value(), offset, bar->minimum(), bar->maximum()));
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
