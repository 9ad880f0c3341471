#include "touchui/ScrollViewerBoard.h"

#include "touchui/KSBaseItemWidget.h"

#include <QLabel>
#include <QPainter>
#include <QPixmap>
#include <QWidget>

#include <algorithm>
#include <iterator>
#include <utility>

namespace
{

constexpr int SPACING = 4;
constexpr int SEPARATOR_HEIGHT = 4;

// Returns the height that the layout assigns to the item.
int heightOf(const QWidget* item)
{
    if (item->minimumHeight() == item->maximumHeight())
        return item->minimumHeight();
    const int hint = qMax(item->sizeHint().height(), item->minimumSizeHint().height());
    return qBound(item->minimumHeight(), hint, item->maximumHeight());
}

} // namespace

ScrollViewerBoard::ScrollViewerBoard(QObject* parent)
    : QObject(parent)
    , m_panel(new QWidget)
    , m_board(new QWidget(m_panel))
    , m_placeholder(new QLabel(m_board))
    , m_separator(QStringLiteral(":/Pane_Tab/Separator_H"))
    , m_spacing(SPACING)
{
    m_panel->setObjectName(QStringLiteral("panelBoard"));
    m_panel->setStyleSheet(QStringLiteral("QWidget#panelBoard { background-color: rgb(51, 51, 51)}"));
    m_panel->setAttribute(Qt::WA_TranslucentBackground);
    m_board->setObjectName(QStringLiteral("layoutBoard"));
    m_board->setStyleSheet(QStringLiteral("QWidget#layoutBoard { background-color: rgb(51, 51, 51) }"));
    m_board->setAttribute(Qt::WA_TranslucentBackground);
    m_placeholder->setStyleSheet(QStringLiteral("background-color: rgb(51, 51, 51)"));
    m_placeholder->setAttribute(Qt::WA_TranslucentBackground);
    m_placeholder->setFixedSize(0, 0);
    m_placeholder->hide();
}

ScrollViewerBoard::~ScrollViewerBoard() = default;

KSBaseItemWidget* ScrollViewerBoard::at(int index)
{
    if (index < 0 || index >= count())
        return nullptr;
    Row& row = m_rows[static_cast<std::size_t>(index)];
    if (row.widget)
        return row.widget;
    KSBaseItemWidget* item = row.maker->makeWidget();
    row.widget = item;
    adopt(item);
    row.place = placeOf(row, row.place.top());
    item->setGeometry(row.place);
    Q_EMIT itemMade(item);
    return item;
}

KSBaseItemWidget* ScrollViewerBoard::made(int index) const
{
    return index >= 0 && index < count() ? m_rows[static_cast<std::size_t>(index)].widget : nullptr;
}

ScrollViewerRow* ScrollViewerBoard::row(int index) const
{
    return index >= 0 && index < count() ? m_rows[static_cast<std::size_t>(index)].maker.get() : nullptr;
}

QList<KSBaseItemWidget*> ScrollViewerBoard::widgets() const
{
    QList<KSBaseItemWidget*> result;
    for (const Row& row : m_rows)
        if (row.widget)
            result.append(row.widget);
    return result;
}

int ScrollViewerBoard::indexOf(const KSBaseItemWidget* item) const
{
    if (!item)
        return -1;
    const auto found =
        std::find_if(m_rows.begin(), m_rows.end(), [item](const Row& row) { return row.widget == item; });
    return found == m_rows.end() ? -1 : static_cast<int>(found - m_rows.begin());
}

void ScrollViewerBoard::adopt(KSBaseItemWidget* item)
{
    if (item->parentWidget() != m_board)
        item->setParent(m_board);
    connect(item, &QObject::destroyed, this, &ScrollViewerBoard::forget);
}

void ScrollViewerBoard::insert(KSBaseItemWidget* item, int index)
{
    Row row;
    row.widget = item;
    m_rows.insert(m_rows.begin() + boundedIndex(index), std::move(row));
    adopt(item);
}

void ScrollViewerBoard::insert(std::vector<std::unique_ptr<ScrollViewerRow>> rows, int index)
{
    std::vector<Row> added(rows.size());
    for (std::size_t i = 0; i < rows.size(); ++i)
        added[i].maker = std::move(rows[i]);
    m_rows.insert(m_rows.begin() + boundedIndex(index), std::make_move_iterator(added.begin()),
                  std::make_move_iterator(added.end()));
}

void ScrollViewerBoard::take(KSBaseItemWidget* item)
{
    if (const int index = indexOf(item); index >= 0)
        take(index, 1);
}

QList<KSBaseItemWidget*> ScrollViewerBoard::take(int first, int number)
{
    const auto begin = m_rows.begin() + first;
    const auto end = begin + qMin(number, count() - first);
    QList<KSBaseItemWidget*> gone;
    for (auto row = begin; row != end; ++row) {
        if (!row->widget)
            continue;
        disconnect(row->widget, &QObject::destroyed, this, &ScrollViewerBoard::forget);
        gone.append(row->widget);
    }
    m_rows.erase(begin, end);
    return gone;
}

void ScrollViewerBoard::giveBack(KSBaseItemWidget* item)
{
    disconnect(item, &QObject::destroyed, this, &ScrollViewerBoard::forget);
    m_rows[static_cast<std::size_t>(indexOf(item))].widget = nullptr;
}

void ScrollViewerBoard::forget(QObject* item)
{
    const auto isIt = [item](const Row& row) { return static_cast<const QObject*>(row.widget) == item; };
    std::erase_if(m_rows, isIt);
    Q_EMIT itemDestroyed(item);
}

void ScrollViewerBoard::swap(int first, int second)
{
    std::swap(m_rows[static_cast<std::size_t>(first)], m_rows[static_cast<std::size_t>(second)]);
}

void ScrollViewerBoard::setSpacing(int spacing)
{
    m_spacing = qMax(spacing, 0);
}

void ScrollViewerBoard::setMargins(const QMargins& margins)
{
    m_margins = margins;
}

// An item that is narrower than the board is centred.
QRect ScrollViewerBoard::placeOf(const Row& row, int top) const
{
    const int width = m_board->width() - m_margins.left() - m_margins.right();
    QSize size(width, 0);
    if (row.widget)
        size = QSize(qMin(width, row.widget->maximumWidth()), heightOf(row.widget));
    else
        size = QSize(qMin(width, row.maker->size().width()), row.maker->size().height());
    return QRect(QPoint(m_margins.left() + (width - size.width()) / 2, top), size);
}

void ScrollViewerBoard::layOut()
{
    int y = m_margins.top();
    const auto layPlaceholder = [&] {
        m_placeholder->move(m_margins.left(), y);
        y += m_placeholder->height() + m_spacing;
    };
    for (int i = 0; i < count(); ++i) {
        if (i == m_keptIndex)
            layPlaceholder();
        Row& row = m_rows[static_cast<std::size_t>(i)];
        row.place = placeOf(row, y);
        if (row.widget)
            row.widget->setGeometry(row.place);
        y += row.place.height() + m_spacing;
    }
    if (m_keptIndex >= count())
        layPlaceholder();
    const bool hasPlaces = !isEmpty() || m_keptIndex >= 0;
    m_contentsHeight = hasPlaces ? y - m_spacing + m_margins.bottom() : 0;
}

void ScrollViewerBoard::relayout()
{
    m_keptIndex = qMin(m_keptIndex, count());
    layOut();
    m_board->setFixedHeight(m_contentsHeight);
    m_panel->setFixedSize(m_panelWidth, m_contentsHeight);
    m_board->update();
}

void ScrollViewerBoard::setWidths(int panelWidth, int boardWidth)
{
    m_panelWidth = panelWidth;
    m_panel->setFixedWidth(panelWidth);
    m_board->setFixedWidth(qMax(boardWidth, 0));
}

void ScrollViewerBoard::showPlaceholder(const QSize& size, int index)
{
    m_placeholder->setFixedSize(size);
    m_placeholder->show();
    movePlaceholder(index);
}

void ScrollViewerBoard::movePlaceholder(int index)
{
    m_keptIndex = qBound(0, index, count());
    layOut();
    m_board->update();
}

void ScrollViewerBoard::hidePlaceholder()
{
    m_keptIndex = -1;
    m_placeholder->setFixedSize(0, 0);
    m_placeholder->hide();
}

// Returns the first row that ends at or below y.
std::vector<ScrollViewerBoard::Row>::const_iterator ScrollViewerBoard::firstEndingAt(int y) const
{
    return std::partition_point(m_rows.begin(), m_rows.end(),
                                [y](const Row& row) { return row.place.bottom() < y; });
}

ScrollViewerBoard::Range ScrollViewerBoard::itemsMeeting(const QRect& rect) const
{
    Range result;
    for (auto row = firstEndingAt(rect.top()); row != m_rows.end() && row->place.top() <= rect.bottom();
         ++row) {
        if (row->place.intersects(rect)) {
            if (result.count == 0)
                result.first = static_cast<int>(row - m_rows.begin());
            ++result.count;
        } else if (result.count > 0) {
            break;
        }
    }
    return result;
}

KSBaseItemWidget* ScrollViewerBoard::itemInThePos(const QPoint& pos)
{
    const auto row = firstEndingAt(pos.y());
    return row != m_rows.end() && row->place.contains(pos) ? at(static_cast<int>(row - m_rows.begin()))
                                                           : nullptr;
}

KSBaseItemWidget* ScrollViewerBoard::itemAroundThePos(const QPoint& pos, const QRect& visible)
{
    const Range range = itemsMeeting(visible);
    for (int i = range.first; i >= 0 && i <= range.last(); ++i) {
        const QRect row = place(i);
        const bool endsList = i == count() - 1;
        const int end = row.bottom() + (endsList ? 0 : m_spacing);
        const bool above = pos.y() < row.top() && i == range.first;
        const bool below = pos.y() > end && i == range.last() && !endsList;
        if (above || below || (pos.y() >= row.top() && pos.y() <= end))
            return at(i);
    }
    return nullptr;
}

void ScrollViewerBoard::paintSeparators(QPainter& painter, const QRect& exposed) const
{
    if (isEmpty() || m_separator.isNull())
        return;
    const QRect first = m_rows.front().place;
    for (auto row = firstEndingAt(exposed.top() - SEPARATOR_HEIGHT);
         row != m_rows.end() && row + 1 != m_rows.end() && row->place.bottom() < exposed.bottom(); ++row)
        painter.drawPixmap(QRect(first.x(), row->place.bottom() + 1, first.width(), SEPARATOR_HEIGHT),
                           m_separator);
}
