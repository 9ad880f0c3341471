#pragma once

#include "touchui/ScrollViewerRow.h"

#include <QList>
#include <QMargins>
#include <QObject>
#include <QPixmap>
#include <QPoint>
#include <QRect>
#include <QSize>

#include <memory>
#include <vector>

class KSBaseItemWidget;
class QLabel;
class QPainter;
class QWidget;

// The rows of a scroll viewer, laid out from top to bottom on a board, with a placeholder at the position of
// a lifted item. A row is added with its widget, or as a ScrollViewerRow whose widget is created later. Board
// coordinates unless stated otherwise.
class ScrollViewerBoard : public QObject
{
    Q_OBJECT
public:
    // Creates the panel, which the viewer scrolls, and the board inside it.
    explicit ScrollViewerBoard(QObject* parent);
    ~ScrollViewerBoard() override;

    QWidget* panel() const { return m_panel; }
    QWidget* board() const { return m_board; }

    int count() const { return static_cast<int>(m_rows.size()); }
    bool isEmpty() const { return m_rows.empty(); }
    // Creates the widget if necessary. Returns null if there is no such row.
    KSBaseItemWidget* at(int index);
    // Returns null if there is no such row or its widget was not created.
    KSBaseItemWidget* made(int index) const;
    // Returns the object that creates the widget; null for a row that was added with its widget.
    ScrollViewerRow* row(int index) const;
    // Returns the rectangle of the row in the last layout. The row must exist.
    QRect place(int index) const { return m_rows[static_cast<std::size_t>(index)].place; }
    // Returns the existing widgets from top to bottom.
    QList<KSBaseItemWidget*> widgets() const;
    // Returns -1 for null and for items that are not on the board.
    int indexOf(const KSBaseItemWidget* item) const;
    // An index of -1 or beyond the end appends. The layout changes only with relayout().
    void insert(KSBaseItemWidget* item, int index);
    void insert(std::vector<std::unique_ptr<ScrollViewerRow>> rows, int index);
    // Remove rows from the order and the layout. The second form returns their existing widgets, which remain
    // children of the board.
    void take(KSBaseItemWidget* item);
    QList<KSBaseItemWidget*> take(int first, int count);
    // Removes the widget of a row, which creates another one when it is needed. The row must have been added
    // without a widget.
    void giveBack(KSBaseItemWidget* item);
    void swap(int first, int second);

    int spacing() const { return m_spacing; }
    void setSpacing(int spacing);
    void setMargins(const QMargins& margins);

    // Lays out all rows in their order and sets the heights of board and panel.
    void relayout();
    // Returns the height of the last layout: margins, rows, placeholder and the gaps between them.
    int contentsHeight() const { return m_contentsHeight; }
    void setWidths(int panelWidth, int boardWidth);

    void showPlaceholder(const QSize& size, int index);
    void movePlaceholder(int index);
    void hidePlaceholder();

    // The rows that intersect a rectangle, which are consecutive. count is 0 if there are none.
    struct Range {
        int first = -1;
        int count = 0;
        int last() const { return count > 0 ? first + count - 1 : -1; }
    };
    Range itemsMeeting(const QRect& rect) const;
    KSBaseItemWidget* itemInThePos(const QPoint& pos);
    // Returns the visible item at pos, including the gap below it. The area above the first visible item
    // belongs to that item; the area below the last visible item belongs to that unless the list ends there.
    KSBaseItemWidget* itemAroundThePos(const QPoint& pos, const QRect& visible);

    void paintSeparators(QPainter& painter, const QRect& exposed) const;

Q_SIGNALS:
    // Emitted when the widget of a row was created and placed, before it is shown.
    void itemMade(KSBaseItemWidget* item);
    // Emitted when an item was deleted without having been removed.
    void itemDestroyed(QObject* item);

private:
    struct Row {
        std::unique_ptr<ScrollViewerRow> maker;
        KSBaseItemWidget* widget = nullptr;
        QRect place;
    };

    void adopt(KSBaseItemWidget* item);
    void forget(QObject* item);
    QRect placeOf(const Row& row, int top) const;
    void layOut();
    std::vector<Row>::const_iterator firstEndingAt(int y) const;
    int boundedIndex(int index) const { return index < 0 || index > count() ? count() : index; }

    QWidget* m_panel;
    QWidget* m_board;
    QLabel* m_placeholder;
    QPixmap m_separator;
    std::vector<Row> m_rows;
    QMargins m_margins;
    int m_spacing;
    int m_keptIndex = -1; // index of the row below the placeholder; -1 if it is hidden
    int m_contentsHeight = 0;
    int m_panelWidth = 0;
};
