#pragma once

#include "touchui/KSBaseItemWidget.h"
#include "touchui/ScrollViewerRow.h"
#include "touchui/ScrollViewerTouch.h"
#include "touchui/TouchTimer.h"

#include <QList>
#include <QMargins>
#include <QPoint>
#include <QPointF>
#include <QPointer>
#include <QRect>
#include <QScrollArea>

#include <memory>
#include <vector>

class KSScrollBar;
class QTouchEvent;
class ScrollViewerBoard;

// A vertical list of items for one finger, which taps or holds an item, scrolls the list and flicks it on,
// or, by an item's handle, lifts the item out and drops it at another place.
//
// Every kind of press is told by a signal with the item (null in empty area), a position and this list.
// Positions in signals are the item's, or this widget's when there is no item. A mouse does the same as a
// finger, but its list follows at once and does not run on. Items belong to the list as its descendants; one
// that is removed stays hidden as such, so that it can be put back. GUI thread only.
class KSScrollViewerWidget : public QScrollArea
{
    Q_OBJECT
public:
    // Where a lifted item floats. Not owned; null: the window of the list.
    static QPointer<QWidget> s_mainWnd;
    // The style sheet of the next list that is made.
    static QString s_scrollBarStyle;

    explicit KSScrollViewerWidget(QWidget* parent = nullptr);
    ~KSScrollViewerWidget() override;

    // Fixes the size of the list; 543 by 998 at first.
    void setSize(int width, int height);

    virtual int getSpacingBetweenItemAndScrollbar() const;
    // Left or right; others are ignored.
    virtual void setVScrollBarAlignment(Qt::Alignment alignment);
    virtual void setSpacingBetweenItems(int spacing);
    virtual void setMargins(QMargins margins);
    virtual void setMargins(int left, int top, int right, int bottom);
    // For items that have none of their own.
    virtual void setItemsDragFlagAlignment(DragFlagAlignment alignment)
    {
        m_touch.setDragAlignment(alignment);
    }
    // The bar shows only while there is something to scroll to.
    virtual void setScrollBarAutoShow(bool autoShow);
    virtual void setHasSeparator(bool hasSeparator);
    virtual void setSpacingBetweenItemAndScrollbar(int spacing);
    // -1 or an index beyond the end appends. Null, and items that are in the list already, are ignored.
    virtual void addWidgetItem(KSBaseItemWidget* item, int index);
    // The list object stays the caller's.
    virtual void addWidgetItems(QList<KSBaseItemWidget*>* items, int index);
    // Rows whose widgets are made when they come into view or are asked for: only getWidgetItem and
    // getWidgetItems ask. An index as above.
    void addRows(std::vector<std::unique_ptr<ScrollViewerRow>> rows, int index);
    // Takes rows out whose indexes rise. What is in view stays where it is.
    void removeRows(const QList<int>& indexes);
    // Takes away the widget of a row that was added without one; the row makes another one when it needs one.
    // The widget stays a hidden descendant of the list, for the caller to delete. False, and nothing happens,
    // when it is in view, in use by a finger or the row's own.
    bool giveBackWidgetItem(KSBaseItemWidget* item);
    // The item is hidden and stays a descendant of the list. What is not in the list is ignored.
    virtual void removeWidgetItem(KSBaseItemWidget* item);
    virtual void removeWidgetItem(int index);
    // So many items from the one on; more than there are means all of them.
    virtual void removeWidgetItems(int index, int count);
    virtual void removeWidgetItems(KSBaseItemWidget* item, int count);
    virtual void removeAll();
    virtual void swap(KSBaseItemWidget* first, KSBaseItemWidget* second);
    virtual void swap(int first, int second);
    virtual int count() const;
    virtual bool isEmpty() const;
    // Scrolls so that the item is the topmost one, as far as the range goes.
    virtual void moveToWidgetItem(int index);
    virtual void moveToWidgetItem(KSBaseItemWidget* item);
    // Scrolls so that the item is the lowest one.
    virtual void setLastVisibleItem(int index);
    virtual void setLastVisibleItem(KSBaseItemWidget* item);
    // The widget that floats under the finger; null when nothing is lifted.
    virtual KSBaseItemWidget* getMoveItem() const { return m_touch.movingWidget(); }
    // Switched off, the list does not follow the finger that is down; the next touch switches it on.
    virtual void setFlickAbility(bool ability) { m_touch.flicker().setAble(ability); }
    // Presses beside it, in widget coordinates, select nothing.
    virtual void setHEffectiveArea(int left, int width) { m_touch.setEffectiveArea(left, width); }
    virtual void onTranslateTouchEventToMouse(QObject*, QTouchEvent*) { m_touch.passOnAsMouse(); }
    virtual void onTranslateTouchBeginEventToMouse(QObject*, QTouchEvent*, QPoint& pos)
    {
        m_touch.fingerPressed(pos);
    }
    virtual void onTranslateTouchUpdateEventToMouse(QObject*, QTouchEvent*, QPoint& pos)
    {
        m_touch.fingerMoved(pos);
    }
    virtual void onTranslateTouchEndEventToMouse(QObject*, QTouchEvent*, QPoint& pos)
    {
        m_touch.fingerLifted(pos);
    }
    // Follows the finger. True when the event belongs to the motion and goes no further.
    virtual bool onTouchEvent(QObject*, QTouchEvent*) { return m_touch.followMotion(); }
    // One tick: how far the contents move.
    virtual QPointF getDistance() { return m_touch.getDistance(); }
    virtual void setAutoFlick(bool autoFlick) { m_touch.flicker().setGliding(autoFlick); }
    virtual void setStartPoint(const QPointF& point) { m_touch.flicker().setStart(point); }
    virtual void setEndPoint(const QPointF& point) { m_touch.flicker().setEnd(point); }
    virtual bool isFlickEnd() const { return m_touch.flicker().isEnd(); }
    virtual bool hasFlicked() const { return m_touch.flicker().hasFlicked(); }
    virtual void stopFlick() { m_touch.flicker().stop(); }
    // The list runs on after the finger has left.
    virtual bool isAutoFilck() const { return m_touch.flicker().isGliding(); }
    virtual bool flickAbility() const { return m_touch.flicker().isAble(); }

    KSBaseItemWidget* getWidgetItem(int index) const;
    // Null when there is no such row or its widget is not made.
    KSBaseItemWidget* madeWidgetItem(int index) const;
    // What the widget of a row is made from; null for a row that was added with its widget. Ends with the
    // row.
    ScrollViewerRow* row(int index) const;
    // In widget coordinates; null in a gap.
    KSBaseItemWidget* getWidgetItem(QPoint pos) const;
    int getIndexOfWidgetItem(const KSBaseItemWidget* item) const;
    QList<KSBaseItemWidget*> getWidgetItems(int index, int count) const;
    // In widget coordinates.
    QList<KSBaseItemWidget*> getWidgetItems(QRect rect) const;
    // In board coordinates.
    QList<KSBaseItemWidget*> getItemsIntersectRect(QRect rect) const;
    // What is to be seen, in board coordinates.
    QRect calculateVisibleRect() const;
    // The index of an item that is inserted at this place, in widget coordinates.
    int getInsertPos(QPoint pos) const;
    // The item of the last press.
    KSBaseItemWidget* getSelectedItem() const { return m_touch.pressedItem(); }
    // Items that are at least partly to be seen; -1 when there are none.
    int firstVisibleItem() const { return m_firstVisible; }
    int lastVisibleItem() const { return m_lastVisible; }
    bool isMove() const { return m_touch.flicker().isMove(); }
    bool isDragging() const { return m_touch.isDragging(); }
    // Restarts those timers of press and drag that run.
    void allTimersReset();
    void stopTapAndHoldTimer() { m_touch.stopHold(); }
    KSScrollBar* getVScrollBar() const { return m_bar; }
    Qt::Alignment getVScrollBarAlignment() const { return m_barAlignment; }
    bool getHasSeparator() const { return m_hasSeparator; }
    // Gives the old one.
    bool setMinitrimStatus(bool status) { return m_touch.setMinitrimStatus(status); }
    // While set, a touch is left to the item under it.
    void setIsTake(bool isTake) { m_touch.setIsTake(isTake); }
    bool itemsCanDrag() const { return m_touch.itemsCanDrag(); }

    bool eventFilter(QObject* object, QEvent* event) override;

public Q_SLOTS:
    void slotStartDrag(KSBaseItemWidget* item) { m_touch.startDrag(item); }
    void slotItemsCanDrag(bool canDrag) { m_touch.setItemsCanDrag(canDrag); }
    void slotHandleStretchTimer();
    void slotHandleMenuTimer() { m_touch.reportHold(); }
    void slotHandleMoveTimer() { m_touch.scrollAtEdge(); }
    void slotChangeScrollBarStyle(int minimum, int maximum);
    void slotHandleItemSizeChange();
    void slotScrollBarShowOrHide(int minimum, int maximum);
    void slotSetScrollBarValue(int value);
    void slotScrollBarSliderPressed();
    void slotShowPopupItem() { m_touch.startDrag(); }

Q_SIGNALS:
    // A tap on an item.
    void widgetItemClicked(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea);
    void widgetItemPressed(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea);
    // The end of a press without motion.
    void widgetItemReleased(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea);
    void widgetItemLongHold(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea);
    // For subclasses; not emitted here.
    void widgetItemPressedAndHold(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea,
                                  bool& willFlick);
    void widgetItemRightPressed(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea);
    // Before the item leaves the list.
    void signalDragOneItem(KSBaseItemWidget* item, int index, KSScrollViewerWidget* scrollArea);
    // A press on an item has become a motion. Who sets willFlick makes it one that ends in no tap.
    void signalFlick(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea, bool& willFlick);
    void minitrimStop();
    void signalVisibleItemsChange();
    // After a drop, when all items have their places.
    void signalItemDrop();
    void widgetItemMouseMove(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea);
    // The end of a press with motion.
    void widgetItemChangeColor(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea);

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    // Moves what is on screen already and paints the rest only.
    void scrollContentsBy(int dx, int dy) override;
    // A hidden list has no finger on it.
    void hideEvent(QHideEvent* event) override;
    bool focusNextPrevChild(bool next) override;

    // A subclass may start it.
    TouchTimer m_stretchTimer;

private:
    void buildBars();
    void adjustLayout();
    void setScrollBarInfo(int maximum, int page);
    void applyBarAlignment();
    void placeBar();
    void connectItem(KSBaseItemWidget* item);
    void disconnectItem(KSBaseItemWidget* item);
    void takeOut(int index, int count);
    void itemMade(KSBaseItemWidget* item);
    void itemGone(QObject* item);
    void refreshVisible();
    void wheelChange(bool move, int index);
    QPoint toBoard(const QPoint& pos) const;
    QList<KSBaseItemWidget*> itemsOf(int first, int count) const;

    void connectTouch();
    bool handleVScrollBarEvent(QEvent* event);
    void handleScrollBarPressedEvent(QEvent* event);

    ScrollViewerBoard* m_board;
    ScrollViewerTouch m_touch;
    KSScrollBar* m_bar = nullptr;
    Qt::Alignment m_barAlignment = Qt::AlignLeft;
    int m_firstVisible = -1;
    int m_lastVisible = -1;
    int m_savedValue = 0;
    int m_spacingToBar = 6;
    bool m_barAutoShow = true;
    bool m_hasSeparator = true;
    bool m_layingOut = false;
};
