#include "library/TemplateScrollArea.h"

#include "touchui/KSScrollBar.h"
#include "touchui/TouchEventButton.h"

#include <QApplication>
#include <QMouseEvent>
#include <QPushButton>
#include <QScrollBar>
#include <QTouchEvent>
#include <QWheelEvent>

const QSize TemplateScrollArea::TOUCH_RECT_SIZE(50, 50);

namespace
{

// Narrower than in other lists, so that four columns and the bar fit into the area.
const char SCROLL_BAR_STYLE[] =
    "QScrollBar:vertical { margin: 0px; border: 0px; width: 27px; background-color: rgb(51, 51, 51) }"
    "QScrollBar::up-arrow:vertical { height: 0px } QScrollBar::down-arrow:vertical { height: 0px }"
    "QScrollBar::add-line:vertical { height: 0px } QScrollBar::sub-line:vertical { height: 0px }"
    "QScrollBar::handle:vertical { min-height: 42px }";

} // namespace

TemplateScrollArea::TemplateScrollArea(QWidget* parent) : QScrollArea(parent)
{
    setFrameShape(QFrame::NoFrame);
    setVerticalScrollBar(new KSScrollBar(Qt::Vertical));
    verticalScrollBar()->setStyleSheet(QString::fromLatin1(SCROLL_BAR_STYLE));
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setFocusPolicy(Qt::NoFocus);
    connect(&m_finger, &OneFinger::cancelled, this, &TemplateScrollArea::rest);
    connect(&m_flicker, &Flicker::ticked, this, &TemplateScrollArea::getDistance);
}

void TemplateScrollArea::initTouch()
{
    setAttribute(Qt::WA_AcceptTouchEvents);
    viewport()->setAttribute(Qt::WA_AcceptTouchEvents);
    viewport()->installEventFilter(this);
    verticalScrollBar()->installEventFilter(this);
}

// Drops the pressed button and stops the motion. Called when the touch was cancelled.
void TemplateScrollArea::rest()
{
    m_flicker.cancel();
    m_pressedButton.clear();
}

void TemplateScrollArea::letGoOf(TouchEventButton* button)
{
    if (m_finger.receiver() == button)
        m_finger.cancel();
}

bool TemplateScrollArea::event(QEvent* event)
{
    if (event->type() == QEvent::Gesture)
        return true;
    if (OneFinger::isTouch(event))
        return handleTouch(this, static_cast<QTouchEvent*>(event));
    return QScrollArea::event(event);
}

bool TemplateScrollArea::eventFilter(QObject* watched, QEvent* event)
{
    if (watched == verticalScrollBar()) {
        if (event->type() != QEvent::Wheel)
            return QScrollArea::eventFilter(watched, event);
        wheelEvent(static_cast<QWheelEvent*>(event));
        return true;
    }
    if (watched == viewport() || qobject_cast<QPushButton*>(watched)) {
        if (event->type() == QEvent::Gesture)
            return true;
        if (OneFinger::isTouch(event))
            return handleTouch(watched, static_cast<QTouchEvent*>(event));
    }
    return QScrollArea::eventFilter(watched, event);
}

bool TemplateScrollArea::handleTouch(QObject* watched, QTouchEvent* event)
{
    const bool wasFlicking = m_flicker.isGliding();
    if (m_finger.follow(event, watched) == OneFinger::Step::None)
        return true;
    onTouchEvent();
    if (!wasFlicking)
        onTranslateTouchEventToMouse(watched);
    if (!m_finger.isDown())
        m_pressedButton.clear();
    return true;
}

void TemplateScrollArea::onTouchEvent()
{
    const QPoint position = m_finger.positionIn(this).toPoint();
    if (m_finger.step() == OneFinger::Step::Begin) {
        m_flicker.begin(position);
        m_pressedButton.clear();
    } else if (!rect().contains(position)) {
        return;
    } else if (m_finger.step() == OneFinger::Step::Move) {
        m_flicker.follow(position);
    } else {
        m_flicker.lift(position);
    }
}

void TemplateScrollArea::onTranslateTouchEventToMouse(QObject* watched)
{
    if (m_finger.step() == OneFinger::Step::Begin) {
        m_pressPoint = m_finger.position().toPoint();
        m_moved = false;
        m_pressedButton = qobject_cast<QPushButton*>(watched);
        sendPressToViewport(m_pressPoint);
        return;
    }
    if (FlickMotion::isBeyondSlop(m_pressPoint, m_finger.position(), FlickMotion::TOUCH_SLOP))
        m_moved = true;
    if (m_finger.step() != OneFinger::Step::End)
        return;
    viewport()->releaseMouse();
    if (m_pressedButton && !m_moved)
        Q_EMIT itemPressed(m_pressedButton);
}

void TemplateScrollArea::sendPressToViewport(const QPoint& global)
{
    QMouseEvent press(QEvent::MouseButtonPress, viewport()->mapFromGlobal(global), global, Qt::LeftButton,
                      Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(viewport(), &press);
}

// Scrolls by half of the distance that is left. Called for each step of the motion.
void TemplateScrollArea::getDistance()
{
    changeScrollBarValue(FlickMotion::pixels(m_flicker.advance()).y());
}

void TemplateScrollArea::changeScrollBarValue(int distance)
{
    QScrollBar* bar = verticalScrollBar();
    bar->setValue(FlickMotion::scrolledValue(bar->value(), distance, bar->minimum(), bar->maximum()));
}

// Filters wheel events, since the area and its scroll bar forward them to each other.
void TemplateScrollArea::wheelEvent(QWheelEvent* event)
{
    stopFlick();
    QScrollBar* bar = verticalScrollBar();
    const int way = event->angleDelta().y() * bar->singleStep() * QApplication::wheelScrollLines();
    changeScrollBarValue(way / QWheelEvent::DefaultDeltasPerStep);
    event->accept();
}

void TemplateScrollArea::hideEvent(QHideEvent* event)
{
    rest();
    QScrollArea::hideEvent(event);
}
