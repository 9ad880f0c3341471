#include "touchui/KSScrollViewerWidget.h"

#include "touchui/KSScrollBar.h"
#include "touchui/ScrollViewerBoard.h"

#include <QEventPoint>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QPaintEvent>
#include <QPainter>
#include <QResizeEvent>
#include <QScopedValueRollback>
#include <QTouchEvent>
#include <QWheelEvent>

namespace
{

const QColor BACKGROUND(51, 51, 51);
constexpr int DEFAULT_WIDTH = 543;
constexpr int DEFAULT_HEIGHT = 998;
constexpr int BAR_LEFT = 3;
constexpr int BAR_WIDTH = 32;
constexpr int PAGE_EXTRA = 4;

const char BAR_STYLE[] =
    "QScrollBar:vertical { margin: 0px 0px 0px 0px;  border: 0px; width: 32px; background-color: rgb(51, 51, "
    "51)}"
    "QScrollBar::up-arrow:vertical {height: 0px}QScrollBar::down-arrow:vertical{height: 0px}"
    "QScrollBar::add-line:vertical {height: 0px}QScrollBar::sub-line:vertical {height: 0px}"
    "QScrollBar::handle:vertical {min-height: 42px}";

} // namespace

QPointer<QWidget> KSScrollViewerWidget::s_mainWnd;
QString KSScrollViewerWidget::s_scrollBarStyle =
    QStringLiteral("QScrollArea { background-color: rgb(51, 51, 51); border: 0px; }");

KSScrollViewerWidget::KSScrollViewerWidget(QWidget* parent)
    : QScrollArea(parent), m_board(new ScrollViewerBoard(this)), m_touch(*this, *m_board)
{
    setFrameShape(QFrame::NoFrame);
    setStyleSheet(s_scrollBarStyle);
    setAttribute(Qt::WA_AcceptTouchEvents);
    viewport()->setAttribute(Qt::WA_AcceptTouchEvents);
    // When scrolling, Qt copies the pixels of an opaque viewport instead of painting it again.
    viewport()->setAttribute(Qt::WA_OpaquePaintEvent);
    setWidget(m_board->panel());
    buildBars();

    connectTouch();
    connect(&m_stretchTimer, &TouchTimer::timeout, this, &KSScrollViewerWidget::slotHandleStretchTimer);
    connect(m_board, &ScrollViewerBoard::itemDestroyed, this, &KSScrollViewerWidget::itemGone);
    connect(m_board, &ScrollViewerBoard::itemMade, this, &KSScrollViewerWidget::itemMade);

    installEventFilter(this);
    viewport()->installEventFilter(this);
    m_board->board()->installEventFilter(this);
    m_bar->installEventFilter(this);
    setSize(DEFAULT_WIDTH, DEFAULT_HEIGHT);
    setHEffectiveArea(0, DEFAULT_WIDTH);
    adjustLayout();
}

KSScrollViewerWidget::~KSScrollViewerWidget()
{
    disconnect(m_board, nullptr, this, nullptr);
    for (KSBaseItemWidget* item : m_board->widgets())
        disconnectItem(item);
    m_touch.abandonDrag();
}

void KSScrollViewerWidget::connectTouch()
{
    connect(&m_touch.flicker(), &Flicker::ticked, this,
            [this] { m_touch.scrollBy(static_cast<int>(getDistance().y())); });
    const auto relay = [this](auto from, auto to) {
        connect(&m_touch, from, this, [this, to](KSBaseItemWidget* item, QPoint pos) {
            Q_EMIT(this->*to)(item, pos, this);
        });
    };
    relay(&ScrollViewerTouch::pressed, &KSScrollViewerWidget::widgetItemPressed);
    relay(&ScrollViewerTouch::rightPressed, &KSScrollViewerWidget::widgetItemRightPressed);
    relay(&ScrollViewerTouch::held, &KSScrollViewerWidget::widgetItemLongHold);
    relay(&ScrollViewerTouch::movedOver, &KSScrollViewerWidget::widgetItemMouseMove);
    relay(&ScrollViewerTouch::released, &KSScrollViewerWidget::widgetItemReleased);
    relay(&ScrollViewerTouch::releasedAfterMotion, &KSScrollViewerWidget::widgetItemChangeColor);
    relay(&ScrollViewerTouch::clicked, &KSScrollViewerWidget::widgetItemClicked);
    connect(&m_touch, &ScrollViewerTouch::flicked, this,
            [this](KSBaseItemWidget* item, QPoint pos, bool& willFlick) {
                Q_EMIT signalFlick(item, pos, this, willFlick);
            });
    connect(&m_touch, &ScrollViewerTouch::mouseDrags, &m_stretchTimer, &TouchTimer::stop);
    connect(&m_touch, &ScrollViewerTouch::dragStarts, this,
            [this](KSBaseItemWidget* item, int index) { Q_EMIT signalDragOneItem(item, index, this); });
    connect(&m_touch, &ScrollViewerTouch::dragStarted, this, &KSScrollViewerWidget::signalVisibleItemsChange);
    connect(&m_touch, &ScrollViewerTouch::dropped, this, [this] {
        adjustLayout();
        Q_EMIT signalItemDrop();
    });
}

void KSScrollViewerWidget::buildBars()
{
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    m_bar = new KSScrollBar(Qt::Vertical, viewport());
    m_bar->setStyleSheet(QString::fromLatin1(BAR_STYLE));
    m_bar->move(BAR_LEFT, 0);
    m_bar->setFixedWidth(BAR_WIDTH);
    m_bar->hide();
    connect(verticalScrollBar(), &QScrollBar::valueChanged, m_bar, &QScrollBar::setValue);
    connect(m_bar, &QScrollBar::valueChanged, this, &KSScrollViewerWidget::slotSetScrollBarValue);
    connect(m_bar, &QScrollBar::rangeChanged, this, &KSScrollViewerWidget::slotScrollBarShowOrHide);
    connect(m_bar, &QScrollBar::sliderPressed, this, &KSScrollViewerWidget::slotScrollBarSliderPressed);
}

void KSScrollViewerWidget::setSize(int width, int height)
{
    setFixedSize(width, height);
    m_board->setWidths(width, width - m_spacingToBar - BAR_WIDTH);
    m_bar->setFixedSize(BAR_WIDTH, viewport()->height());
    applyBarAlignment();
    adjustLayout();
}

int KSScrollViewerWidget::getSpacingBetweenItemAndScrollbar() const
{
    return m_spacingToBar;
}

void KSScrollViewerWidget::setSpacingBetweenItemAndScrollbar(int spacing)
{
    m_spacingToBar = qMax(spacing, 0);
    setSize(width(), height());
}

void KSScrollViewerWidget::setVScrollBarAlignment(Qt::Alignment alignment)
{
    if (alignment != Qt::AlignLeft && alignment != Qt::AlignRight)
        return;
    m_barAlignment = alignment;
    applyBarAlignment();
}

void KSScrollViewerWidget::applyBarAlignment()
{
    m_board->board()->move(m_barAlignment == Qt::AlignRight ? 0 : m_spacingToBar + BAR_WIDTH, 0);
    placeBar();
    m_bar->raise();
}

void KSScrollViewerWidget::placeBar()
{
    m_bar->move(m_barAlignment == Qt::AlignRight ? width() - BAR_WIDTH : 0, 0);
}

void KSScrollViewerWidget::setSpacingBetweenItems(int spacing)
{
    m_board->setSpacing(spacing);
    adjustLayout();
}

void KSScrollViewerWidget::setMargins(QMargins margins)
{
    m_board->setMargins(margins);
    adjustLayout();
}

void KSScrollViewerWidget::setMargins(int left, int top, int right, int bottom)
{
    setMargins(QMargins(left, top, right, bottom));
}

void KSScrollViewerWidget::setScrollBarAutoShow(bool autoShow)
{
    m_barAutoShow = autoShow;
    slotScrollBarShowOrHide(m_bar->minimum(), m_bar->maximum());
}

void KSScrollViewerWidget::setHasSeparator(bool hasSeparator)
{
    m_hasSeparator = hasSeparator;
    m_board->board()->update();
}

void KSScrollViewerWidget::connectItem(KSBaseItemWidget* item)
{
    if (item->getDragFlagAlignment() == DRAGFLAG_NONE)
        item->setDragFlagAlignment(m_touch.dragAlignment());
    item->setAttribute(Qt::WA_AcceptTouchEvents);
    item->installEventFilter(this);
    connect(item, &KSBaseItemWidget::signalResize, this, &KSScrollViewerWidget::slotHandleItemSizeChange,
            Qt::UniqueConnection);
    connect(item, &KSBaseItemWidget::signalStartMove, this, &KSScrollViewerWidget::slotStartDrag,
            Qt::UniqueConnection);
    if (m_touch.itemsCanDrag())
        item->setDragFlag(true);
    item->show();
}

void KSScrollViewerWidget::disconnectItem(KSBaseItemWidget* item)
{
    item->removeEventFilter(this);
    disconnect(item, nullptr, this, nullptr);
}

void KSScrollViewerWidget::addWidgetItem(KSBaseItemWidget* item, int index)
{
    if (!item || m_board->indexOf(item) >= 0)
        return;
    if (m_touch.liftedItem() == item)
        m_touch.abandonDrag();
    m_board->insert(item, index);
    connectItem(item);
    adjustLayout();
}

void KSScrollViewerWidget::addWidgetItems(QList<KSBaseItemWidget*>* items, int index)
{
    if (!items)
        return;
    if (index < 0 || index > count())
        index = count();
    for (KSBaseItemWidget* item : *items) {
        if (!item || m_board->indexOf(item) >= 0 || m_touch.liftedItem() == item)
            continue;
        m_board->insert(item, index++);
        connectItem(item);
    }
    adjustLayout();
}

void KSScrollViewerWidget::addRows(std::vector<std::unique_ptr<ScrollViewerRow>> rows, int index)
{
    m_board->insert(std::move(rows), index);
    adjustLayout();
}

// Lays the items out again only if the new widget has another height than was reserved for it.
void KSScrollViewerWidget::itemMade(KSBaseItemWidget* item)
{
    const int height = item->height();
    {
        const QScopedValueRollback<bool> guard(m_layingOut, true);
        connectItem(item);
    }
    if (item->height() != height)
        adjustLayout();
}

bool KSScrollViewerWidget::giveBackWidgetItem(KSBaseItemWidget* item)
{
    const int index = m_board->indexOf(item);
    const bool isShown = index >= m_firstVisible && index <= m_lastVisible;
    if (!m_board->row(index) || isShown || m_touch.isUsing(item))
        return false;
    disconnectItem(item);
    m_board->giveBack(item);
    item->hide();
    return true;
}

ScrollViewerRow* KSScrollViewerWidget::row(int index) const
{
    return m_board->row(index);
}

KSBaseItemWidget* KSScrollViewerWidget::madeWidgetItem(int index) const
{
    return m_board->made(index);
}

void KSScrollViewerWidget::removeWidgetItem(KSBaseItemWidget* item)
{
    if (item && m_touch.liftedItem() == item) {
        m_touch.abandonDrag();
        disconnectItem(item);
        m_touch.breakTouchOf(item);
        adjustLayout();
        return;
    }
    removeWidgetItems(m_board->indexOf(item), 1);
}

void KSScrollViewerWidget::removeWidgetItem(int index)
{
    removeWidgetItems(index, 1);
}

void KSScrollViewerWidget::removeWidgetItems(int index, int count)
{
    if (index < 0 || index >= this->count() || count <= 0)
        return;
    takeOut(index, count);
    adjustLayout();
}

void KSScrollViewerWidget::removeRows(const QList<int>& indexes)
{
    for (auto index = indexes.crbegin(); index != indexes.crend(); ++index) {
        if (*index < m_firstVisible)
            m_savedValue -= m_board->place(*index).height() + m_board->spacing();
        takeOut(*index, 1);
    }
    m_savedValue = qMax(m_savedValue, 0);
    adjustLayout();
}

void KSScrollViewerWidget::takeOut(int index, int count)
{
    for (KSBaseItemWidget* item : m_board->take(index, count)) {
        disconnectItem(item);
        item->hide();
        m_touch.forget(item);
    }
}

void KSScrollViewerWidget::removeWidgetItems(KSBaseItemWidget* item, int count)
{
    removeWidgetItems(m_board->indexOf(item), count);
}

void KSScrollViewerWidget::removeAll()
{
    if (KSBaseItemWidget* lifted = m_touch.liftedItem()) {
        m_touch.abandonDrag();
        disconnectItem(lifted);
        m_touch.breakTouchOf(lifted);
    }
    if (isEmpty())
        adjustLayout();
    removeWidgetItems(0, count());
}

// Only the QObject part of the item still exists.
void KSScrollViewerWidget::itemGone(QObject*)
{
    adjustLayout();
}

void KSScrollViewerWidget::swap(KSBaseItemWidget* first, KSBaseItemWidget* second)
{
    swap(m_board->indexOf(first), m_board->indexOf(second));
}

void KSScrollViewerWidget::swap(int first, int second)
{
    if (!m_board->at(first) || !m_board->at(second) || first == second)
        return;
    m_board->swap(first, second);
    adjustLayout();
}

int KSScrollViewerWidget::count() const
{
    return m_board->count();
}

bool KSScrollViewerWidget::isEmpty() const
{
    return m_board->isEmpty();
}

KSBaseItemWidget* KSScrollViewerWidget::getWidgetItem(int index) const
{
    return m_board->at(index);
}

KSBaseItemWidget* KSScrollViewerWidget::getWidgetItem(QPoint pos) const
{
    return m_board->itemInThePos(toBoard(pos));
}

int KSScrollViewerWidget::getIndexOfWidgetItem(const KSBaseItemWidget* item) const
{
    return m_board->indexOf(item);
}

QList<KSBaseItemWidget*> KSScrollViewerWidget::itemsOf(int first, int number) const
{
    QList<KSBaseItemWidget*> items;
    for (int i = first; i >= 0 && i < count() && i - first < number; ++i)
        items.append(m_board->at(i));
    return items;
}

QList<KSBaseItemWidget*> KSScrollViewerWidget::getWidgetItems(int index, int count) const
{
    return itemsOf(index, qMax(count, 0));
}

QList<KSBaseItemWidget*> KSScrollViewerWidget::getWidgetItems(QRect rect) const
{
    return getItemsIntersectRect(QRect(toBoard(rect.topLeft()), rect.size()));
}

QList<KSBaseItemWidget*> KSScrollViewerWidget::getItemsIntersectRect(QRect rect) const
{
    const ScrollViewerBoard::Range range = m_board->itemsMeeting(rect);
    return itemsOf(range.first, range.count);
}

QRect KSScrollViewerWidget::calculateVisibleRect() const
{
    return QRect(toBoard(QPoint(0, 0)), viewport()->size());
}

int KSScrollViewerWidget::getInsertPos(QPoint pos) const
{
    const int y = toBoard(pos).y();
    int index = 0;
    while (index < count() && m_board->place(index).center().y() < y)
        ++index;
    return index;
}

QPoint KSScrollViewerWidget::toBoard(const QPoint& pos) const
{
    return m_board->board()->mapFrom(this, pos);
}

// The guard prevents recursion: a layout resizes items without a fixed size, and these request a layout.
void KSScrollViewerWidget::adjustLayout()
{
    if (m_layingOut)
        return;
    const QScopedValueRollback<bool> guard(m_layingOut, true);
    const int saved = m_savedValue;
    m_board->relayout();
    m_savedValue = saved;
    setScrollBarInfo(m_board->contentsHeight() - viewport()->height(), viewport()->height() + PAGE_EXTRA);
    refreshVisible();
}

void KSScrollViewerWidget::setScrollBarInfo(int maximum, int page)
{
    const int saved = m_savedValue;
    verticalScrollBar()->setRange(0, qMax(maximum, 0));
    verticalScrollBar()->setPageStep(page);
    m_bar->setRange(0, qMax(maximum, 0));
    m_bar->setPageStep(page);
    slotSetScrollBarValue(saved);
}

void KSScrollViewerWidget::resizeEvent(QResizeEvent* event)
{
    QScrollArea::resizeEvent(event);
    m_bar->setFixedHeight(viewport()->height());
    setScrollBarInfo(m_board->contentsHeight() - viewport()->height(), viewport()->height() + PAGE_EXTRA);
    applyBarAlignment();
    refreshVisible();
}

void KSScrollViewerWidget::slotHandleItemSizeChange()
{
    adjustLayout();
}

void KSScrollViewerWidget::slotScrollBarShowOrHide(int minimum, int maximum)
{
    m_bar->setVisible(!m_barAutoShow || minimum != maximum);
}

void KSScrollViewerWidget::slotSetScrollBarValue(int value)
{
    verticalScrollBar()->setValue(value);
    m_savedValue = verticalScrollBar()->value();
    m_bar->setValue(m_savedValue);
    refreshVisible();
    if (isDragging())
        m_touch.updateIndicator();
}

void KSScrollViewerWidget::refreshVisible()
{
    const ScrollViewerBoard::Range range = m_board->itemsMeeting(calculateVisibleRect());
    for (int i = range.first; i >= 0 && i <= range.last(); ++i)
        m_board->at(i);
    if (range.first == m_firstVisible && range.last() == m_lastVisible)
        return;
    m_firstVisible = range.first;
    m_lastVisible = range.last();
    Q_EMIT signalVisibleItemsChange();
}

void KSScrollViewerWidget::moveToWidgetItem(int index)
{
    if (index >= 0 && index < count())
        slotSetScrollBarValue(
            index == 0 ? 0 : qBound(m_bar->minimum(), m_board->place(index).y(), m_bar->maximum()));
}

void KSScrollViewerWidget::moveToWidgetItem(KSBaseItemWidget* item)
{
    moveToWidgetItem(m_board->indexOf(item));
}

void KSScrollViewerWidget::setLastVisibleItem(int index)
{
    if (index >= 0 && index < count())
        slotSetScrollBarValue(qMax(m_board->place(index).bottom() + 1 - height(), m_bar->minimum()));
}

void KSScrollViewerWidget::setLastVisibleItem(KSBaseItemWidget* item)
{
    setLastVisibleItem(m_board->indexOf(item));
}

void KSScrollViewerWidget::wheelEvent(QWheelEvent* event)
{
    stopFlick();
    m_stretchTimer.stop();
    refreshVisible();
    event->accept();
    const QList<KSBaseItemWidget*> shown = getWidgetItems(rect());
    if (shown.isEmpty())
        return;
    const QScrollBar* area = verticalScrollBar();
    int index = m_board->indexOf(shown.constFirst());
    const int delta = event->angleDelta().y();
    const int value = area->value();
    if (delta < 0 && value != area->maximum()) {
        wheelChange(true, index + 1);
    } else if (delta > 0 && value != area->minimum()) {
        const QPoint origin = shown.constFirst()->mapTo(this, QPoint(0, 0));
        if (value != area->maximum() || rect().contains(origin))
            --index;
        wheelChange(value > 1, index);
    } else {
        wheelChange(false, index);
    }
}

void KSScrollViewerWidget::wheelChange(bool move, int index)
{
    if (move)
        moveToWidgetItem(qMax(index, 0));
    Q_EMIT signalVisibleItemsChange();
}

void KSScrollViewerWidget::paintEvent(QPaintEvent* event)
{
    QPainter painter(viewport());
    painter.fillRect(event->rect(), BACKGROUND);
}

void KSScrollViewerWidget::scrollContentsBy(int dx, int dy)
{
    viewport()->scroll(dx, dy); // also moves the child widgets
    placeBar();
    QScrollArea::scrollContentsBy(dx, dy);
}

void KSScrollViewerWidget::keyPressEvent(QKeyEvent* event)
{
    switch (event->key()) {
    case Qt::Key_Up:
    case Qt::Key_Down:
    case Qt::Key_Left:
    case Qt::Key_Right:
    case Qt::Key_PageUp:
    case Qt::Key_PageDown:
        event->accept();
        break;
    default:
        QAbstractScrollArea::keyPressEvent(event);
        break;
    }
}

bool KSScrollViewerWidget::focusNextPrevChild(bool)
{
    return true;
}

void KSScrollViewerWidget::slotChangeScrollBarStyle(int minimum, int maximum)
{
    const QString part =
        minimum == maximum
            ? QStringLiteral(
                  "QScrollBar::handle:vertical {background-image: url(:/back);background-position: "
                  "center;width: 20px}")
            : QStringLiteral("QScrollBar::handle:vertical {background-image: url(:/control);"
                             "background-position: center;width: 14px}");
    // Do not repeat the last rule, which would only make the style sheet longer.
    if (!s_scrollBarStyle.endsWith(part))
        s_scrollBarStyle += part;
}

void KSScrollViewerWidget::slotScrollBarSliderPressed()
{
    m_stretchTimer.stop();
}

void KSScrollViewerWidget::slotHandleStretchTimer()
{
    const KSBaseItemWidget* item = m_board->itemInThePos(toBoard(QPoint(width() / 2, 0)));
    if (item && verticalScrollBar()->value() != verticalScrollBar()->maximum())
        slotSetScrollBarValue(item->y());
    Q_EMIT minitrimStop();
}

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
        adjustLayout(); // an item requests another size
    if (event->type() == QEvent::Gesture)
        return object == this || object == viewport();
    if (OneFinger::isTouch(event))
        return m_touch.take(object, static_cast<QTouchEvent*>(event));
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

// A press beside the handle moves the handle under the press, so that it can be dragged from there.
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

void KSScrollViewerWidget::hideEvent(QHideEvent* event)
{
    m_touch.rest();
    QScrollArea::hideEvent(event);
}

void KSScrollViewerWidget::mousePressEvent(QMouseEvent* event)
{
    m_touch.mousePressed(event);
    event->accept();
}

void KSScrollViewerWidget::mouseMoveEvent(QMouseEvent* event)
{
    event->accept();
    m_touch.mouseMoved(event);
}

void KSScrollViewerWidget::mouseReleaseEvent(QMouseEvent* event)
{
    event->accept();
    m_touch.mouseReleased(event);
}

void KSScrollViewerWidget::allTimersReset()
{
    m_stretchTimer.restartIfActive();
    m_touch.restartTimers();
}
