#include "library/TemplateScrollArea.h"

#include "touchui/FlickMotion.h"
#include "touchui/KSScrollBar.h"
#include "touchui/TouchClock.h"
#include "touchui/TouchEventButton.h"

#include <QApplication>
#include <QMouseEvent>
#include <QPushButton>
#include <QScrollBar>
#include <QTimerEvent>
#include <QTouchEvent>
#include <QWheelEvent>

const QSize TemplateScrollArea::TOUCH_RECT_SIZE(50, 50);

namespace
{

constexpr FlickMotion::Rules RULES = FlickMotion::templateGrid();

// Narrower than in other lists: four columns and the bar fill the area.
const char SCROLL_BAR_STYLE[] =
    "QScrollBar:vertical { margin: 0px; border: 0px; width: 27px; background-color: rgb(51, 51, 51) }"
    "QScrollBar::up-arrow:vertical { height: 0px } QScrollBar::down-arrow:vertical { height: 0px }"
    "QScrollBar::add-line:vertical { height: 0px } QScrollBar::sub-line:vertical { height: 0px }"
    "QScrollBar::handle:vertical { min-height: 42px }";

bool isTouch(QEvent::Type type)
{
    return type == QEvent::TouchBegin || type == QEvent::TouchUpdate || type == QEvent::TouchEnd ||
           type == QEvent::TouchCancel;
}

} // namespace

TemplateScrollArea::TemplateScrollArea(QWidget* parent) : QScrollArea(parent)
{
    setFrameShape(QFrame::NoFrame);
    setVerticalScrollBar(new KSScrollBar(Qt::Vertical));
    verticalScrollBar()->setStyleSheet(QString::fromLatin1(SCROLL_BAR_STYLE));
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setFocusPolicy(Qt::NoFocus);
    connect(&mFinger, &OneFinger::cancelled, this, &TemplateScrollArea::rest);
}

void TemplateScrollArea::initTouch()
{
    setAttribute(Qt::WA_AcceptTouchEvents);
    viewport()->setAttribute(Qt::WA_AcceptTouchEvents);
    viewport()->installEventFilter(this);
    verticalScrollBar()->installEventFilter(this);
}

bool TemplateScrollArea::isFlickEnd() const
{
    return FlickMotion::isFlickEnd(RULES, mStartPoint, mEndPoint);
}

void TemplateScrollArea::stopFlick()
{
    if (mTimerId != 0)
        TouchClock::instance().stop(this, mTimerId);
    mTimerId = 0;
    mFlick = false;
}

// Nothing was tapped, and nothing goes on moving.
void TemplateScrollArea::rest()
{
    stopFlick();
    mPressedButton.clear();
}

void TemplateScrollArea::letGoOf(TouchEventButton* button)
{
    if (mFinger.receiver() == button)
        mFinger.cancel();
}

bool TemplateScrollArea::event(QEvent* event)
{
    if (event->type() == QEvent::Gesture)
        return true;
    if (isTouch(event->type()))
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
        if (isTouch(event->type()))
            return handleTouch(watched, static_cast<QTouchEvent*>(event));
    }
    return QScrollArea::eventFilter(watched, event);
}

bool TemplateScrollArea::handleTouch(QObject* watched, QTouchEvent* event)
{
    const bool wasFlicking = mFlick;
    if (mFinger.follow(event, watched) == OneFinger::Step::None)
        return true;
    onTouchEvent();
    if (!wasFlicking)
        onTranslateTouchEventToMouse(watched);
    if (!mFinger.isDown())
        mPressedButton.clear();
    return true;
}

void TemplateScrollArea::onTouchEvent()
{
    const QPoint position = mFinger.positionIn(this).toPoint();
    if (mFinger.step() == OneFinger::Step::Begin) {
        stopFlick();
        mPressedButton.clear();
        mStartPoint = mEndPoint = position;
        mFirstMove = true;
    } else if (!rect().contains(position)) {
        return;
    } else if (mFinger.step() == OneFinger::Step::Move) {
        moveTo(position);
    } else {
        liftAt(position);
    }
}

void TemplateScrollArea::moveTo(const QPoint& position)
{
    if (mFirstMove)
        mStartPoint = position;
    mFirstMove = false;
    setEndPoint(position);
}

void TemplateScrollArea::liftAt(const QPoint& position)
{
    setEndPoint(position);
    if (isFlickEnd())
        stopFlick();
    else
        mFlick = true;
}

void TemplateScrollArea::onTranslateTouchEventToMouse(QObject* watched)
{
    if (mFinger.step() == OneFinger::Step::Begin) {
        mPressPoint = mFinger.position().toPoint();
        mMoved = false;
        mPressedButton = qobject_cast<QPushButton*>(watched);
        mValueAtStart = verticalScrollBar()->value();
        sendPressToViewport(mPressPoint);
        return;
    }
    if (FlickMotion::isBeyondSlop(mPressPoint, mFinger.position(), FlickMotion::TOUCH_SLOP))
        mMoved = true;
    if (mFinger.step() != OneFinger::Step::End)
        return;
    viewport()->releaseMouse();
    if (mPressedButton && !mMoved)
        Q_EMIT itemPressed(mPressedButton);
}

void TemplateScrollArea::sendPressToViewport(const QPoint& global)
{
    QMouseEvent press(QEvent::MouseButtonPress, viewport()->mapFromGlobal(global), global, Qt::LeftButton,
                      Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(viewport(), &press);
}

void TemplateScrollArea::setEndPoint(const QPoint& point)
{
    mEndPoint = point;
    if (!isFlickEnd() && mTimerId == 0) {
        mValueAtStart = verticalScrollBar()->value();
        mTimerId = TouchClock::instance().start(this, TOUCH_TIMER_TIME);
    }
}

void TemplateScrollArea::timerEvent(QTimerEvent* event)
{
    if (event->timerId() != mTimerId) {
        QScrollArea::timerEvent(event);
        return;
    }
    if (isFlickEnd())
        stopFlick();
    else
        getDistance();
    const QScrollBar* bar = verticalScrollBar();
    if (FlickMotion::isAtLimit(bar->value(), bar->minimum(), bar->maximum()))
        stopFlick();
}

// One step of the start point towards the end point, and of the content by half of what lay between.
void TemplateScrollArea::getDistance()
{
    const FlickMotion::Step step = mFlick ? FlickMotion::flickStep(RULES, mStartPoint, mEndPoint)
                                          : FlickMotion::dragStep(RULES, mStartPoint, mEndPoint);
    mStartPoint = step.start.toPoint();
    changeScrollBarValue(step.scroll);
}

void TemplateScrollArea::changeScrollBarValue(int distance)
{
    QScrollBar* bar = verticalScrollBar();
    bar->setValue(FlickMotion::scrolledValue(bar->value(), distance, bar->minimum(), bar->maximum()));
}

// The area and its bar hand wheel events on to each other.
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
