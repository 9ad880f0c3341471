#include "library/ArchiveColumn.h"

#include "library/ArchiveItem.h"

#include <QMouseEvent>
#include <QScrollBar>
#include <QVBoxLayout>
#include <QWheelEvent>

namespace
{
const int BAR_LEFT = 3;
const int BAR_WIDTH = 32;
const int ROW = ArchiveItem::WIDGET_HEIGHT + ArchiveColumn::SPACING;
} // namespace

ArchiveColumn::ArchiveColumn(QWidget* parent)
    : QScrollArea(parent)
    , mBoard(new QWidget)
    , mLayout(new QVBoxLayout(mBoard))
    , mBar(new QScrollBar(Qt::Vertical, this))
{
    setStyleSheet(QStringLiteral("ArchiveColumn { background-color: rgb(51, 51, 51); border: 0px; }"));
    setFrameShape(QFrame::NoFrame);
    setFocusPolicy(Qt::NoFocus);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    mLayout->setContentsMargins(EFFECTIVE_LEFT, 0, 0, 0);
    mLayout->setSpacing(SPACING);
    mBoard->setObjectName(QStringLiteral("layoutBoard"));
    mBoard->setStyleSheet(QStringLiteral("QWidget#layoutBoard { background-color: rgb(51, 51, 51) }"));
    setWidget(mBoard);
    mBar->setStyleSheet(QStringLiteral(
        "QScrollBar:vertical { margin: 0px; border: 0px; width: 32px; background-color: rgb(51, 51, 51) }"
        "QScrollBar::up-arrow:vertical { height: 0px } QScrollBar::down-arrow:vertical { height: 0px }"
        "QScrollBar::add-line:vertical { height: 0px } QScrollBar::sub-line:vertical { height: 0px }"
        "QScrollBar::add-page:vertical, QScrollBar::sub-page:vertical { background: none }"
        "QScrollBar::handle:vertical { min-height: 42px; background-color: rgb(102, 102, 102) }"));

    QScrollBar* own = verticalScrollBar();
    // The bar shows only while there is something to scroll to.
    const auto followRange = [this](int minimum, int maximum) {
        mBar->setRange(minimum, maximum);
        mBar->setVisible(maximum > minimum);
    };
    connect(own, &QScrollBar::rangeChanged, this, followRange);
    followRange(own->minimum(), own->maximum());
    connect(own, &QScrollBar::valueChanged, mBar, &QScrollBar::setValue);
    connect(mBar, &QScrollBar::valueChanged, own, &QScrollBar::setValue);

    mHoldTimer.setSingleShot(true);
    mHoldTimer.setInterval(HOLD_TIME);
    connect(&mHoldTimer, &QTimer::timeout, this, &ArchiveColumn::holdTimeout);
    adjustLayout();
}

void ArchiveColumn::addWidgetItem(ArchiveItem* item, int index)
{
    if (!item || mItems.contains(item))
        return;
    if (index < 0 || index > count())
        index = count();
    mItems.insert(index, item);
    item->setParent(mBoard);
    mLayout->insertWidget(index, item);
    item->show();
    adjustLayout();
}

void ArchiveColumn::removeWidgetItem(ArchiveItem* item)
{
    if (!mItems.removeOne(item))
        return;
    mLayout->removeWidget(item);
    item->hide();
    if (mPressedItem == item)
        mPressedItem.clear();
    adjustLayout();
}

void ArchiveColumn::removeAll()
{
    for (ArchiveItem* item : mItems) {
        mLayout->removeWidget(item);
        item->hide();
    }
    mItems.clear();
    mPressedItem.clear();
    adjustLayout();
}

ArchiveItem* ArchiveColumn::getWidgetItem(int index) const
{
    return index >= 0 && index < count() ? mItems.at(index) : nullptr;
}

int ArchiveColumn::getIndexOfWidgetItem(const ArchiveItem* item) const
{
    return item ? static_cast<int>(mItems.indexOf(const_cast<ArchiveItem*>(item))) : -1;
}

void ArchiveColumn::moveToWidgetItem(int index)
{
    if (index >= 0 && index < count())
        verticalScrollBar()->setValue(index * ROW);
}

int ArchiveColumn::firstVisibleItem() const
{
    if (isEmpty())
        return -1;
    // The gap below an item still shows that item's neighbour first.
    return qMin((verticalScrollBar()->value() + SPACING) / ROW, count() - 1);
}

int ArchiveColumn::lastVisibleItem() const
{
    if (isEmpty())
        return -1;
    return qMin((verticalScrollBar()->value() + viewport()->height() - 1) / ROW, count() - 1);
}

bool ArchiveColumn::isCutAtBottom(int index) const
{
    return index * ROW + ArchiveItem::WIDGET_HEIGHT > verticalScrollBar()->value() + viewport()->height();
}

void ArchiveColumn::stopTapAndHoldTimer()
{
    mHoldTimer.stop();
}

void ArchiveColumn::adjustLayout()
{
    const int height = isEmpty() ? 0 : count() * ROW - SPACING;
    mBoard->setFixedSize(EFFECTIVE_LEFT + EFFECTIVE_WIDTH, height);
    mLayout->activate();
    mBar->setPageStep(viewport()->height());
}

ArchiveItem* ArchiveColumn::itemAt(QPoint viewportPos) const
{
    const QPoint pos = mBoard->mapFrom(viewport(), viewportPos);
    if (pos.x() < EFFECTIVE_LEFT || pos.x() >= EFFECTIVE_LEFT + EFFECTIVE_WIDTH || pos.y() < 0)
        return nullptr;
    return getWidgetItem(pos.y() / ROW); // a gap belongs to the item above it
}

QPoint ArchiveColumn::positionFor(ArchiveItem* item, QPoint viewportPos) const
{
    const QPoint global = viewport()->mapToGlobal(viewportPos);
    return item ? item->mapFromGlobal(global) : mapFromGlobal(global);
}

void ArchiveColumn::mousePressEvent(QMouseEvent* event)
{
    const QPoint pos = event->position().toPoint();
    mHoldTimer.stop();
    mMoved = false;
    mPressPos = pos;
    mValueAtPress = verticalScrollBar()->value();
    mPressedItem = itemAt(pos);
    mPressed = event->button() == Qt::LeftButton;
    if (event->button() == Qt::RightButton) {
        emit widgetItemRightPressed(mPressedItem, positionFor(mPressedItem, pos));
        return;
    }
    if (!mPressed)
        return;
    mHoldTimer.start();
    emit widgetItemPressed(mPressedItem, positionFor(mPressedItem, pos));
}

void ArchiveColumn::mouseMoveEvent(QMouseEvent* event)
{
    if (!mPressed)
        return;
    const QPoint way = event->position().toPoint() - mPressPos;
    if (!mMoved && way.manhattanLength() <= TAP_TOLERANCE)
        return;
    mMoved = true;
    mHoldTimer.stop();
    verticalScrollBar()->setValue(mValueAtPress - way.y());
}

void ArchiveColumn::mouseReleaseEvent(QMouseEvent* event)
{
    mHoldTimer.stop();
    if (!mPressed || event->button() != Qt::LeftButton)
        return;
    mPressed = false;
    const QPoint pos = event->position().toPoint();
    if (mMoved || (mPressedItem && itemAt(pos) != mPressedItem))
        return;
    emit widgetItemReleased(mPressedItem, positionFor(mPressedItem, pos));
}

void ArchiveColumn::holdTimeout()
{
    if (mPressed && !mMoved)
        emit widgetItemLongHold(mPressedItem, positionFor(mPressedItem, mPressPos));
}

void ArchiveColumn::wheelEvent(QWheelEvent* event)
{
    const int delta = event->angleDelta().y();
    const int first = firstVisibleItem();
    if (first < 0 || delta == 0)
        return;
    const bool cut = verticalScrollBar()->value() > first * ROW;
    moveToWidgetItem(delta < 0 ? qMin(first + 1, count() - 1) : cut ? first : qMax(first - 1, 0));
    event->accept();
}

void ArchiveColumn::resizeEvent(QResizeEvent* event)
{
    QScrollArea::resizeEvent(event);
    mBar->setGeometry(BAR_LEFT, 0, BAR_WIDTH, viewport()->height());
    mBar->setPageStep(viewport()->height());
}
