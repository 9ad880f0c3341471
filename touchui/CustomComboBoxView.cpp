#include "touchui/CustomComboBoxView.h"

#include "touchui/KSScrollBar.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>
#include <QScrollBar>
#include <QTouchEvent>

namespace
{

// Without arrow buttons: the bar consists only of the track and the handle.
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
    connect(&m_flicker, &Flicker::ticked, this, [this] { changeScrollBarValue(getDistance().y()); });
    connect(&m_flicker, &Flicker::ended, this, &CustomComboBoxView::showLastRowWhole);
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
    const bool brake = isAutoFilck();
    m_pressPoint = position;
    m_flicker.begin(position);
    setPressedIndex(brake ? QModelIndex() : indexAt(position));
}

void CustomComboBoxView::moveTo(const QPoint& position)
{
    if (!m_flicker.isFollowing())
        return;
    m_flicker.follow(position);
    if (hasFlicked() || FlickMotion::isBeyondSlop(m_pressPoint, position, FlickMotion::TOUCH_SLOP))
        setPressedIndex(QModelIndex());
}

void CustomComboBoxView::releaseAt(const QPoint& position)
{
    if (!m_flicker.isFollowing())
        return;
    m_flicker.lift(position);
    const QModelIndex tapped = m_pressedIndex;
    setPressedIndex(QModelIndex());
    if (!isAutoFilck() && !hasFlicked() && tapped.isValid() && indexAt(position) == tapped &&
        (tapped.flags() & Qt::ItemIsEnabled))
        Q_EMIT signalTapped(tapped);
}

void CustomComboBoxView::cancelTouch()
{
    m_finger.cancel();
    rest();
}

void CustomComboBoxView::rest()
{
    m_flicker.cancel();
    setPressedIndex(QModelIndex());
}

QPoint CustomComboBoxView::getDistance()
{
    return isAutoFilck() ? getFlickDistance() : getDragDistance();
}

void CustomComboBoxView::changeScrollBarValue(int offset)
{
    QScrollBar* bar = verticalScrollBar();
    bar->setValue(FlickMotion::scrolledValue(bar->value(), offset, bar->minimum(), bar->maximum()));
}

void CustomComboBoxView::showLastRowWhole()
{
    if (verticalScrollBar()->value() == verticalScrollBar()->maximum())
        scrollToBottom();
}

bool CustomComboBoxView::viewportEvent(QEvent* event)
{
    switch (event->type()) {
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
        return OneFinger::isTouch(event) ? onTouchEvent(static_cast<QTouchEvent*>(event))
                                         : QListView::viewportEvent(event);
    }
}

bool CustomComboBoxView::viewportMouseEvent(QEvent* event)
{
    const auto* mouse = static_cast<QMouseEvent*>(event);
    const QPoint position = mouse->position().toPoint();
    if (m_finger.isDown())
        return true; // a finger is using the list
    if (event->type() == QEvent::MouseMove) {
        if (mouse->buttons() & Qt::LeftButton)
            moveTo(position);
    } else if (mouse->button() == Qt::LeftButton) {
        if (event->type() == QEvent::MouseButtonRelease)
            releaseAt(position);
        else
            pressAt(position);
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
    if (model() == nullptr)
        return;
    QPainter painter(viewport());
    const int last = model()->rowCount(rootIndex()) - 1;
    const QModelIndex first = indexAt(QPoint(0, 0));
    for (int row = first.isValid() ? first.row() : 0; row < last; ++row) {
        const QRect rect = visualRect(model()->index(row, modelColumn(), rootIndex()));
        if (rect.top() > viewport()->height())
            break;
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
