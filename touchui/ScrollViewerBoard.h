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

// The rows of a scroll viewer in their order, laid out from top to bottom on one board, with a placeholder
// that keeps the place of an item that has been lifted. A row is added with its widget, or as a
// ScrollViewerRow whose widget is made later. Coordinates are the board's unless said otherwise.
class ScrollViewerBoard : public QObject
{
    Q_OBJECT
public:
    // Makes the panel, which the viewer scrolls, and in it the board.
    explicit ScrollViewerBoard(QObject* parent);
    ~ScrollViewerBoard() override;

    QWidget* panel() const { return m_panel; }
    QWidget* board() const { return m_board; }

    int count() const { return static_cast<int>(m_rows.size()); }
    bool isEmpty() const { return m_rows.empty(); }
    // Makes the widget when there is none yet. Null when there is no such row.
    KSBaseItemWidget* at(int index);
    // Null when there is no such row or its widget is not made.
    KSBaseItemWidget* made(int index) const;
    // What the widget is made from; null for a row that was added with its widget.
    ScrollViewerRow* row(int index) const;
    // Where the row lies since the last layout. There must be such a row.
    QRect place(int index) const { return m_rows[static_cast<std::size_t>(index)].place; }
    // The widgets that are made, from top to bottom.
    QList<KSBaseItemWidget*> widgets() const;
    // -1 for null and for strangers.
    int indexOf(const KSBaseItemWidget* item) const;
    // An index of -1 or beyond the end appends. Nothing is laid out before relayout().
    void insert(KSBaseItemWidget* item, int index);
    void insert(std::vector<std::unique_ptr<ScrollViewerRow>> rows, int index);
    // Takes rows out of the order and the layout and returns those of their widgets that are made; they stay
    // the board's children.
    void take(KSBaseItemWidget* item);
    QList<KSBaseItemWidget*> take(int first, int count);
    // Takes the widget of a row away, which makes another one when it needs one. The row must have been added
    // without its widget.
    void giveBack(KSBaseItemWidget* item);
    void swap(int first, int second);

    int spacing() const { return m_spacing; }
    void setSpacing(int spacing);
    void setMargins(const QMargins& margins);

    // Lays all rows out in their order, and gives board and panel their height.
    void relayout();
    // Margins, rows, the place that is kept, and the gaps between them, as of the last layout.
    int contentsHeight() const { return m_contentsHeight; }
    void setWidths(int panelWidth, int boardWidth);

    void showPlaceholder(const QSize& size, int index);
    void movePlaceholder(int index);
    void hidePlaceholder();

    // Rows that a rectangle meets: they follow one another. count is 0 when there are none.
    struct Range {
        int first = -1;
        int count = 0;
        int last() const { return count > 0 ? first + count - 1 : -1; }
    };
    Range itemsMeeting(const QRect& rect) const;
    KSBaseItemWidget* itemInThePos(const QPoint& pos);
    // The gap below an item belongs to it. What the visible rectangle shows above its first item belongs to
    // that, and below its last one to that unless the list ends there.
    KSBaseItemWidget* itemAroundThePos(const QPoint& pos, const QRect& visible);

    void paintSeparators(QPainter& painter, const QRect& exposed) const;

Q_SIGNALS:
    // The widget of a row has been made and has its place; it does not show yet.
    void itemMade(KSBaseItemWidget* item);
    // An item was deleted without having been taken out.
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
    int m_keptIndex = -1; // of the row before which the placeholder lies; -1: it does not show
    int m_contentsHeight = 0;
    int m_panelWidth = 0;
};
