#pragma once

#include <QList>
#include <QMargins>
#include <QObject>
#include <QPoint>
#include <QRect>
#include <QSize>

class KSBaseItemWidget;
class QLabel;
class QPainter;
class QVBoxLayout;
class QWidget;

// The items of a scroll viewer in their order, laid out from top to bottom on one board, with a placeholder
// that keeps the place of an item that has been lifted. Coordinates are the board's unless said otherwise.
class ScrollViewerBoard : public QObject
{
    Q_OBJECT
public:
    // Makes the panel, which the viewer scrolls, and in it the board.
    explicit ScrollViewerBoard(QObject* parent);

    QWidget* panel() const { return m_panel; }
    QWidget* board() const { return m_board; }

    const QList<KSBaseItemWidget*>& items() const { return m_items; }
    int count() const { return static_cast<int>(m_items.size()); }
    bool isEmpty() const { return m_items.isEmpty(); }
    // Null when there is no such item.
    KSBaseItemWidget* at(int index) const;
    // -1 for null and for strangers.
    int indexOf(const KSBaseItemWidget* item) const;
    // An index of -1 or beyond the end appends. The item is not laid out before relayout().
    void insert(KSBaseItemWidget* item, int index);
    // Takes the item out of the order and the layout; it stays the board's child.
    void take(KSBaseItemWidget* item);
    void swap(int first, int second);

    int spacing() const;
    void setSpacing(int spacing);
    void setMargins(const QMargins& margins);

    // Lays all items out in their order, and gives board and panel their height.
    void relayout();
    // Margins, items, the place that is kept, and the gaps between them.
    int contentsHeight() const;
    void setWidths(int panelWidth, int boardWidth);

    void showPlaceholder(const QSize& size, int index);
    void movePlaceholder(int index);
    void hidePlaceholder();

    // Items that a rectangle meets: they follow one another. count is 0 when there are none.
    struct Range {
        int first = -1;
        int count = 0;
        int last() const { return count > 0 ? first + count - 1 : -1; }
    };
    Range itemsMeeting(const QRect& rect) const;
    KSBaseItemWidget* itemInThePos(const QPoint& pos) const;
    // The gap below an item belongs to it. What the visible rectangle shows above its first item belongs to
    // that, and below its last one to that unless the list ends there.
    KSBaseItemWidget* itemAroundThePos(const QPoint& pos, const QRect& visible) const;

    void paintSeparators(QPainter& painter, const QRect& exposed) const;

Q_SIGNALS:
    // An item was deleted without having been taken out.
    void itemDestroyed(QObject* item);

private:
    void forget(QObject* item);

    QWidget* m_panel;
    QWidget* m_board;
    QVBoxLayout* m_layout;
    QLabel* m_placeholder;
    QList<KSBaseItemWidget*> m_items;
    int m_panelWidth = 0;
};
