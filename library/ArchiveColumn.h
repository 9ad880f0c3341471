// A column of items that is scrolled by finger or wheel, and tells taps, long holds and drags apart.
// Touches arrive as the mouse events that the platform makes of them. Positions in signals are relative to
// the item, or to the column when there is no item.
#pragma once

#include <QList>
#include <QPoint>
#include <QPointer>
#include <QScrollArea>
#include <QTimer>

class ArchiveItem;
class QScrollBar;
class QVBoxLayout;

class ArchiveColumn : public QScrollArea
{
    Q_OBJECT

public:
    static const int HOLD_TIME = 600;     // ms
    static const int TAP_TOLERANCE = 20;  // a finger that moves farther scrolls
    static const int EFFECTIVE_LEFT = 38; // left edge of the items; the scroll bar lies before it
    static const int EFFECTIVE_WIDTH = 505;
    static const int SPACING = 4;

    explicit ArchiveColumn(QWidget* parent = nullptr);

    // An index of -1 or beyond the end appends. The column becomes the item's parent and shows it.
    void addWidgetItem(ArchiveItem* item, int index);
    // Takes the item out of the column and hides it; it stays a child of the column. Others are ignored.
    void removeWidgetItem(ArchiveItem* item);
    void removeAll();
    int count() const { return static_cast<int>(mItems.size()); }
    bool isEmpty() const { return mItems.isEmpty(); }
    // Null when there is no such item.
    ArchiveItem* getWidgetItem(int index) const;
    // -1 for null and for an item that is not in the column.
    int getIndexOfWidgetItem(const ArchiveItem* item) const;
    // Scrolls so that the item is the topmost one. Indices outside are ignored.
    void moveToWidgetItem(int index);
    // First and last item that is at least partly in view; -1 when there is none.
    int firstVisibleItem() const;
    int lastVisibleItem() const;
    // The bottom of the item lies below the view.
    bool isCutAtBottom(int index) const;

    void stopTapAndHoldTimer();

signals:
    void widgetItemPressed(ArchiveItem* item, QPoint pos);
    // A tap; not sent after a drag.
    void widgetItemReleased(ArchiveItem* item, QPoint pos);
    void widgetItemLongHold(ArchiveItem* item, QPoint pos);
    void widgetItemRightPressed(ArchiveItem* item, QPoint pos);

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    ArchiveItem* itemAt(QPoint viewportPos) const;
    QPoint positionFor(ArchiveItem* item, QPoint viewportPos) const;
    void holdTimeout();
    void adjustLayout();

    QList<ArchiveItem*> mItems; // owned by the board as their parent
    QWidget* mBoard;
    QVBoxLayout* mLayout;
    QScrollBar* mBar;
    QTimer mHoldTimer;
    QPointer<ArchiveItem> mPressedItem;
    QPoint mPressPos;
    int mValueAtPress = 0;
    bool mPressed = false;
    bool mMoved = false;
};
