#include "touchui/CustomComboBoxView.h"

#include "touchui/FlickMotion.h"
#include "touchui/KSScrollBar.h"
#include "touchui/TouchClock.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>
#include <QScrollBar>
#include <QTimerEvent>
#include <QTouchEvent>

namespace
{

constexpr FlickMotion::Rules RULES = FlickMotion::treeView();
// Without arrows: the bar is all track and handle.
const char LIST_STYLE[] = "QListView { background: transparent; border: 0px; }"
                          "QScrollBar { margin: 0px; border: 0px; background-color: rgb(51, 51, 51) }"
                          "QScrollBar:vertical { width: 32px }"
                          "QScrollBar::add-line, QScrollBar::sub-line { width: 0px; height: 0px }"
                          "QScrollBar::handle:vertical { min-height: 42px }";

} // namespace

CustomComboBoxView::CustomComboBoxView(QWidget* parent)
    : QListView(parent), m_separator(QStringLiteral(":/Menu/Separator_H"))
{
    viewport()->setAttribute(Qt::WA_AcceptTouchEvents);
    setFrameShape(QFrame::NoFrame);
    setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setVerticalScrollBar(new KSScrollBar(Qt::Vertical));
    setEditTriggers(QAbstractItemView::NoEditTriggers);
    setSelectionMode(QAbstractItemView::SingleSelection);
    setFocusPolicy(Qt::NoFocus);
    setUniformItemSizes(true);
    setStyleSheet(QString::fromLatin1(LIST_STYLE));
    connect(&m_finger, &OneFinger::cancelled, this, &CustomComboBoxView::rest);
}

CustomComboBoxView::~CustomComboBoxView()
{
    CustomComboBoxView::stopFlick();
}

bool CustomComboBoxView::onTouchEvent(QTouchEvent* event)
{
    switch (m_finger.follow(event)) {
    case OneFinger::Step::Begin:
        onTouchBeginEvent(event);
        break;
    case OneFinger::Step::Move:
        onTouchUpdateEvent(event);
        break;
    case OneFinger::Step::End:
        onTouchEndEvent(event);
        break;
    case OneFinger::Step::None:
        break;
    }
    return true;
}

void CustomComboBoxView::onTouchBeginEvent(QTouchEvent*)
{
    pressAt(fingerPosition());
}

void CustomComboBoxView::onTouchUpdateEvent(QTouchEvent*)
{
    moveTo(fingerPosition());
}

void CustomComboBoxView::onTouchEndEvent(QTouchEvent*)
{
    releaseAt(fingerPosition());
}

QPoint CustomComboBoxView::fingerPosition() const
{
    return m_finger.positionIn(viewport()).toPoint();
}

void CustomComboBoxView::pressAt(const QPoint& position)
{
    m_brake = m_autoFlick;
    stopFlick();
    m_down = true;
    m_pressPoint = position;
    setStartPoint(position);
    setEndPoint(position);
    setPressedIndex(m_brake ? QModelIndex() : indexAt(position));
}

void CustomComboBoxView::moveTo(const QPoint& position)
{
    if (!m_down) {
        return;
    }
    setEndPoint(position);
    if (m_hasFlicked || FlickMotion::isBeyondSlop(m_pressPoint, position, FlickMotion::TOUCH_SLOP)) {
        setPressedIndex(QModelIndex());
    }
}

void CustomComboBoxView::releaseAt(const QPoint& position)
{
    if (!m_down) {
        return;
    }
    m_down = false;
    setEndPoint(position);
    const QModelIndex tapped = m_pressedIndex;
    setPressedIndex(QModelIndex());
    if (!isFlickEnd()) {
        setAutoFlick(true);
        return;
    }
    stopFlick();
    if (!m_hasFlicked && tapped.isValid() && indexAt(position) == tapped &&
        (tapped.flags() & Qt::ItemIsEnabled)) {
        Q_EMIT signalTapped(tapped);
    }
}

void CustomComboBoxView::cancelTouch()
{
    m_finger.cancel();
    rest();
}

void CustomComboBoxView::rest()
{
    m_down = false;
    setPressedIndex(QModelIndex());
    stopFlick();
}

void CustomComboBoxView::setAutoFlick(bool on)
{
    m_autoFlick = on;
}

void CustomComboBoxView::setStartPoint(const QPoint& point)
{
    m_startPoint = point;
    m_hasFlicked = false;
}

void CustomComboBoxView::setEndPoint(const QPoint& point)
{
    m_endPoint = point;
    if (!isFlickEnd() && m_flickTimerId == 0) {
        m_scrollValue = verticalScrollBar()->value();
        m_flickTimerId = TouchClock::instance().start(this, RULES.interval);
        m_hasFlicked = true;
    }
}

bool CustomComboBoxView::isFlickEnd() const
{
    return FlickMotion::isFlickEnd(RULES, m_startPoint, m_endPoint);
}

void CustomComboBoxView::stopFlick()
{
    if (m_flickTimerId != 0) {
        TouchClock::instance().stop(this, m_flickTimerId);
        m_flickTimerId = 0;
    }
    m_autoFlick = false;
}

QPoint CustomComboBoxView::getDistance()
{
    return m_autoFlick ? getFlickDistance() : getDragDistance();
}

QPoint CustomComboBoxView::getFlickDistance()
{
    const FlickMotion::Step step = FlickMotion::flickStep(RULES, m_startPoint, m_endPoint);
    m_startPoint = step.start.toPoint();
    return QPoint(static_cast<int>(step.distance.x()), step.scroll);
}

QPoint CustomComboBoxView::getDragDistance()
{
    const FlickMotion::Step step = FlickMotion::dragStep(RULES, m_startPoint, m_endPoint);
    m_startPoint = step.start.toPoint();
    return QPoint(static_cast<int>(step.distance.x()), step.scroll);
}

void CustomComboBoxView::changeScrollBarValue(int offset)
{
    QScrollBar* bar = verticalScrollBar();
    m_scrollValue = FlickMotion::scrolledValue(m_scrollValue, offset, bar->minimum(), bar->maximum());
    bar->setValue(m_scrollValue);
}

void CustomComboBoxView::timerEvent(QTimerEvent* event)
{
    if (m_flickTimerId == 0 || event->timerId() != m_flickTimerId) {
        QListView::timerEvent(event);
        return;
    }
    const QScrollBar* bar = verticalScrollBar();
    if (!isFlickEnd()) {
        changeScrollBarValue(getDistance().y());
        // A flick dies at the end of the list: the next touch is no brake.
        if (m_autoFlick && FlickMotion::isAtLimit(bar->value(), bar->minimum(), bar->maximum())) {
            stopFlick();
        }
        return;
    }
    if (bar->value() == bar->maximum()) {
        stopFlick();
        scrollToBottom();
    } else if (m_autoFlick) {
        stopFlick();
    }
}

bool CustomComboBoxView::viewportEvent(QEvent* event)
{
    switch (event->type()) {
    case QEvent::TouchBegin:
    case QEvent::TouchUpdate:
    case QEvent::TouchEnd:
    case QEvent::TouchCancel:
        return onTouchEvent(static_cast<QTouchEvent*>(event));
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonDblClick:
    case QEvent::MouseMove:
    case QEvent::MouseButtonRelease:
        return viewportMouseEvent(event);
    case QEvent::Gesture:
    case QEvent::ContextMenu:
        return true;
    case QEvent::Wheel:
        stopFlick();
        return QListView::viewportEvent(event);
    default:
        return QListView::viewportEvent(event);
    }
}

bool CustomComboBoxView::viewportMouseEvent(QEvent* event)
{
    const auto* mouse = static_cast<QMouseEvent*>(event);
    const QPoint position = mouse->position().toPoint();
    if (m_finger.isDown()) {
        return true; // a finger has the list
    }
    if (event->type() == QEvent::MouseMove) {
        if (mouse->buttons() & Qt::LeftButton) {
            moveTo(position);
        }
    } else if (mouse->button() == Qt::LeftButton) {
        if (event->type() == QEvent::MouseButtonRelease) {
            releaseAt(position);
        } else {
            pressAt(position);
        }
    }
    return true;
}

void CustomComboBoxView::setPressedIndex(const QModelIndex& index)
{
    if (m_pressedIndex != index) {
        m_pressedIndex = index;
        viewport()->update();
    }
}

void CustomComboBoxView::paintEvent(QPaintEvent* event)
{
    QListView::paintEvent(event);
    if (model() == nullptr) {
        return;
    }
    QPainter painter(viewport());
    const int last = model()->rowCount(rootIndex()) - 1;
    const QModelIndex first = indexAt(QPoint(0, 0));
    for (int row = first.isValid() ? first.row() : 0; row < last; ++row) {
        const QRect rect = visualRect(model()->index(row, modelColumn(), rootIndex()));
        if (rect.top() > viewport()->height()) {
            break;
        }
        drawSeparator(painter, rect);
    }
}

void CustomComboBoxView::drawSeparator(QPainter& painter, const QRect& rect)
{
    if (!m_separator.isNull()) {
        painter.drawPixmap(
            QRect(rect.left(), rect.bottom() + 1 - m_separator.height(), rect.width(), m_separator.height()),
            m_separator);
    }
}

void CustomComboBoxView::keyPressEvent(QKeyEvent* event)
{
    event->ignore();
}

void CustomComboBoxView::hideEvent(QHideEvent* event)
{
    cancelTouch();
    QListView::hideEvent(event);
}
