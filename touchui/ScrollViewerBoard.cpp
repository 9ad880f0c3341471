#include "touchui/ScrollViewerBoard.h"

#include "touchui/KSBaseItemWidget.h"

#include <QLabel>
#include <QPainter>
#include <QPixmap>
#include <QVBoxLayout>
#include <QWidget>

namespace
{

constexpr int SPACING = 4;
constexpr int SEPARATOR_HEIGHT = 4;

// The height that the layout gives the item.
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
    , m_layout(new QVBoxLayout(m_board))
    , m_placeholder(new QLabel(m_board))
{
    m_panel->setObjectName(QStringLiteral("panelBoard"));
    m_panel->setStyleSheet(QStringLiteral("QWidget#panelBoard { background-color: rgb(51, 51, 51)}"));
    m_panel->setAttribute(Qt::WA_TranslucentBackground);
    m_board->setObjectName(QStringLiteral("layoutBoard"));
    m_board->setStyleSheet(QStringLiteral("QWidget#layoutBoard { background-color: rgb(51, 51, 51) }"));
    m_board->setAttribute(Qt::WA_TranslucentBackground);
    m_layout->setContentsMargins(0, 0, 0, 0);
    m_layout->setSpacing(SPACING);
    m_layout->setSizeConstraint(QLayout::SetNoConstraint);
    m_placeholder->setStyleSheet(QStringLiteral("background-color: rgb(51, 51, 51)"));
    m_placeholder->setAttribute(Qt::WA_TranslucentBackground);
    m_placeholder->setFixedSize(0, 0);
    m_placeholder->hide();
}

KSBaseItemWidget* ScrollViewerBoard::at(int index) const
{
    return index >= 0 && index < count() ? m_items.at(index) : nullptr;
}

int ScrollViewerBoard::indexOf(const KSBaseItemWidget* item) const
{
    return item ? static_cast<int>(m_items.indexOf(const_cast<KSBaseItemWidget*>(item))) : -1;
}

void ScrollViewerBoard::insert(KSBaseItemWidget* item, int index)
{
    if (index < 0 || index > count())
        index = count();
    m_items.insert(index, item);
    if (item->parentWidget() != m_board)
        item->setParent(m_board);
    connect(item, &QObject::destroyed, this, &ScrollViewerBoard::forget);
}

void ScrollViewerBoard::take(KSBaseItemWidget* item)
{
    disconnect(item, &QObject::destroyed, this, &ScrollViewerBoard::forget);
    m_items.removeOne(item);
    m_layout->removeWidget(item);
}

void ScrollViewerBoard::forget(QObject* item)
{
    const auto isIt = [item](const KSBaseItemWidget* other) {
        return static_cast<const QObject*>(other) == item;
    };
    m_items.removeIf(isIt);
    Q_EMIT itemDestroyed(item);
}

void ScrollViewerBoard::swap(int first, int second)
{
    m_items.swapItemsAt(first, second);
}

int ScrollViewerBoard::spacing() const
{
    return m_layout->spacing();
}

void ScrollViewerBoard::setSpacing(int spacing)
{
    m_layout->setSpacing(qMax(spacing, 0));
}

void ScrollViewerBoard::setMargins(const QMargins& margins)
{
    m_layout->setContentsMargins(margins);
}

void ScrollViewerBoard::relayout()
{
    const int kept = m_placeholder->isHidden() ? -1 : m_layout->indexOf(m_placeholder);
    m_layout->removeWidget(m_placeholder);
    for (int i = 0; i < count(); ++i) {
        const QLayoutItem* there = m_layout->itemAt(i);
        if (there && there->widget() == m_items.at(i))
            continue;
        m_layout->removeWidget(m_items.at(i));
        m_layout->insertWidget(i, m_items.at(i));
    }
    if (kept >= 0)
        m_layout->insertWidget(qMin(kept, count()), m_placeholder);
    const int height = contentsHeight();
    m_board->setFixedHeight(height);
    m_panel->setFixedSize(m_panelWidth, height);
    m_layout->activate();
    m_board->update();
}

int ScrollViewerBoard::contentsHeight() const
{
    const bool kept = !m_placeholder->isHidden();
    const int places = count() + (kept ? 1 : 0);
    if (places == 0)
        return 0;
    const QMargins margins = m_layout->contentsMargins();
    int height = margins.top() + margins.bottom() + spacing() * (places - 1);
    if (kept)
        height += m_placeholder->height();
    for (const KSBaseItemWidget* item : m_items)
        height += heightOf(item);
    return height;
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
    m_layout->insertWidget(qBound(0, index, count()), m_placeholder);
    m_placeholder->show();
    m_layout->activate();
    m_board->update();
}

void ScrollViewerBoard::movePlaceholder(int index)
{
    m_layout->removeWidget(m_placeholder);
    m_layout->insertWidget(qBound(0, index, count()), m_placeholder);
    m_layout->activate();
    m_board->update();
}

void ScrollViewerBoard::hidePlaceholder()
{
    if (m_placeholder->isHidden())
        return;
    m_layout->removeWidget(m_placeholder);
    m_placeholder->setFixedSize(0, 0);
    m_placeholder->hide();
}

ScrollViewerBoard::Range ScrollViewerBoard::itemsMeeting(const QRect& rect) const
{
    Range result;
    for (int i = 0; i < count(); ++i) {
        if (m_items.at(i)->geometry().intersects(rect)) {
            if (result.count == 0)
                result.first = i;
            ++result.count;
        } else if (result.count > 0) {
            break;
        }
    }
    return result;
}

KSBaseItemWidget* ScrollViewerBoard::itemInThePos(const QPoint& pos) const
{
    for (KSBaseItemWidget* item : m_items) {
        if (item->geometry().contains(pos))
            return item;
    }
    return nullptr;
}

KSBaseItemWidget* ScrollViewerBoard::itemAroundThePos(const QPoint& pos, const QRect& visible) const
{
    const Range range = itemsMeeting(visible);
    for (int i = range.first; i >= 0 && i <= range.last(); ++i) {
        KSBaseItemWidget* item = m_items.at(i);
        const bool endsList = i == count() - 1;
        const int end = item->geometry().bottom() + (endsList ? 0 : spacing());
        const bool above = pos.y() < item->y() && i == range.first;
        const bool below = pos.y() > end && i == range.last() && !endsList;
        if (above || below || (pos.y() >= item->y() && pos.y() <= end))
            return item;
    }
    return nullptr;
}

void ScrollViewerBoard::paintSeparators(QPainter& painter, const QRect& exposed) const
{
    if (isEmpty())
        return;
    const QPixmap separator(QStringLiteral(":/Pane_Tab/Separator_H"));
    if (separator.isNull())
        return;
    const KSBaseItemWidget* first = m_items.constFirst();
    for (int i = 0; i + 1 < count(); ++i) {
        const QRect line(first->x(), m_items.at(i)->geometry().bottom() + 1, first->width(),
                         SEPARATOR_HEIGHT);
        if (line.intersects(exposed))
            painter.drawPixmap(line, separator);
    }
}
