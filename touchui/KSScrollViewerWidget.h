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

// A vertical list of items that is operated with one finger: a tap or a hold on an item, a drag or a flick of
// the list, or a drag of an item by its handle to another position.
//
// Each kind of press is reported by a signal with the item (null for an empty area), a position and this
// list. Positions in signals are in coordinates of the item, or of this widget if there is no item. The mouse
// works in the same way, but the list follows it directly and does not glide. Items are descendants of the
// list and owned by it; a removed item remains a hidden descendant, so that it can be added again. GUI thread
// only.
class KSScrollViewerWidget : public QScrollArea
{
    Q_OBJECT
public:
    // The parent of a lifted item. Not owned; if null, the window of the list.
    static QPointer<QWidget> s_mainWnd;
    // The style sheet of lists that are created later.
    static QString s_scrollBarStyle;

    explicit KSScrollViewerWidget(QWidget* parent = nullptr);
    ~KSScrollViewerWidget() override;

    // Fixes the size of the list in pixels; the default is 543 by 998.
    void setSize(int width, int height);

    virtual int getSpacingBetweenItemAndScrollbar() const;
    // Accepts left and right; other values are ignored.
    virtual void setVScrollBarAlignment(Qt::Alignment alignment);
    virtual void setSpacingBetweenItems(int spacing);
    virtual void setMargins(QMargins margins);
    virtual void setMargins(int left, int top, int right, int bottom);
    // Applies to items that have no alignment of their own.
    virtual void setItemsDragFlagAlignment(DragFlagAlignment alignment)
    {
        m_touch.setDragAlignment(alignment);
    }
    // If true, the bar is visible only while the list can be scrolled.
    virtual void setScrollBarAutoShow(bool autoShow);
    virtual void setHasSeparator(bool hasSeparator);
    virtual void setSpacingBetweenItemAndScrollbar(int spacing);
    // An index of -1 or beyond the end appends. Null and items that are already in the list are ignored.
    virtual void addWidgetItem(KSBaseItemWidget* item, int index);
    // The caller keeps the QList object.
    virtual void addWidgetItems(QList<KSBaseItemWidget*>* items, int index);
    // Adds rows whose widgets are created when they become visible or are requested by getWidgetItem or
    // getWidgetItems. index as above.
    void addRows(std::vector<std::unique_ptr<ScrollViewerRow>> rows, int index);
    // Removes rows; indexes must be ascending. The visible rows keep their position on the screen.
    void removeRows(const QList<int>& indexes);
    // Removes the widget of a row that was added by addRows; the row creates another one when it is needed.
    // The widget remains a hidden descendant of the list; the caller may delete it. Returns false, without
    // any effect, if the widget is visible, used by a finger, or was added by addWidgetItem.
    bool giveBackWidgetItem(KSBaseItemWidget* item);
    // Hides the item, which remains a descendant of the list. Ignores items that are not in the list.
    virtual void removeWidgetItem(KSBaseItemWidget* item);
    virtual void removeWidgetItem(int index);
    // Remove count items beginning with this one; a larger count removes all that follow.
    virtual void removeWidgetItems(int index, int count);
    virtual void removeWidgetItems(KSBaseItemWidget* item, int count);
    virtual void removeAll();
    virtual void swap(KSBaseItemWidget* first, KSBaseItemWidget* second);
    virtual void swap(int first, int second);
    virtual int count() const;
    virtual bool isEmpty() const;
    // Scrolls the item to the top, as far as the range allows.
    virtual void moveToWidgetItem(int index);
    virtual void moveToWidgetItem(KSBaseItemWidget* item);
    // Scrolls the item to the bottom.
    virtual void setLastVisibleItem(int index);
    virtual void setLastVisibleItem(KSBaseItemWidget* item);
    // Returns the widget that floats under the finger; null if no item is lifted.
    virtual KSBaseItemWidget* getMoveItem() const { return m_touch.movingWidget(); }
    // If false, the list does not follow the current finger; the next touch enables following again.
    virtual void setFlickAbility(bool ability) { m_touch.flicker().setAble(ability); }
    // Sets the horizontal range in widget coordinates outside of which presses select no item.
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
    // Follows the finger. Returns whether the event belongs to a scroll motion and needs no further handling.
    virtual bool onTouchEvent(QObject*, QTouchEvent*) { return m_touch.followMotion(); }
    // Calculates one tick; returns the distance by which the contents move.
    virtual QPointF getDistance() { return m_touch.getDistance(); }
    virtual void setAutoFlick(bool autoFlick) { m_touch.flicker().setGliding(autoFlick); }
    virtual void setStartPoint(const QPointF& point) { m_touch.flicker().setStart(point); }
    virtual void setEndPoint(const QPointF& point) { m_touch.flicker().setEnd(point); }
    virtual bool isFlickEnd() const { return m_touch.flicker().isEnd(); }
    virtual bool hasFlicked() const { return m_touch.flicker().hasFlicked(); }
    virtual void stopFlick() { m_touch.flicker().stop(); }
    // Returns whether the list glides after the lift.
    virtual bool isAutoFilck() const { return m_touch.flicker().isGliding(); }
    virtual bool flickAbility() const { return m_touch.flicker().isAble(); }

    KSBaseItemWidget* getWidgetItem(int index) const;
    // Returns null if there is no such row or its widget was not created.
    KSBaseItemWidget* madeWidgetItem(int index) const;
    // Returns the object that creates the widget of a row; null for a row that was added with its widget.
    // Owned by the row.
    ScrollViewerRow* row(int index) const;
    // pos is in widget coordinates; returns null in a gap.
    KSBaseItemWidget* getWidgetItem(QPoint pos) const;
    int getIndexOfWidgetItem(const KSBaseItemWidget* item) const;
    QList<KSBaseItemWidget*> getWidgetItems(int index, int count) const;
    // rect is in widget coordinates.
    QList<KSBaseItemWidget*> getWidgetItems(QRect rect) const;
    // rect is in board coordinates.
    QList<KSBaseItemWidget*> getItemsIntersectRect(QRect rect) const;
    // Returns the visible rectangle in board coordinates.
    QRect calculateVisibleRect() const;
    // Returns the index for an item that is inserted at this position, in widget coordinates.
    int getInsertPos(QPoint pos) const;
    // Returns the item of the last press.
    KSBaseItemWidget* getSelectedItem() const { return m_touch.pressedItem(); }
    // Return the first and last item that are at least partly visible; -1 if there are none.
    int firstVisibleItem() const { return m_firstVisible; }
    int lastVisibleItem() const { return m_lastVisible; }
    bool isMove() const { return m_touch.flicker().isMove(); }
    bool isDragging() const { return m_touch.isDragging(); }
    // Restarts the press and drag timers that are running.
    void allTimersReset();
    void stopTapAndHoldTimer() { m_touch.stopHold(); }
    KSScrollBar* getVScrollBar() const { return m_bar; }
    Qt::Alignment getVScrollBarAlignment() const { return m_barAlignment; }
    bool getHasSeparator() const { return m_hasSeparator; }
    // Returns the status that was set before.
    bool setMinitrimStatus(bool status) { return m_touch.setMinitrimStatus(status); }
    // While set, the list does not handle touches that begin, but leaves them to the item under the finger.
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
    // Emitted for a tap on an item.
    void widgetItemClicked(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea);
    void widgetItemPressed(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea);
    // Emitted at the end of a press without motion.
    void widgetItemReleased(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea);
    void widgetItemLongHold(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea);
    // For subclasses; never emitted here.
    void widgetItemPressedAndHold(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea,
                                  bool& willFlick);
    void widgetItemRightPressed(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea);
    // Emitted before the lifted item leaves the list.
    void signalDragOneItem(KSBaseItemWidget* item, int index, KSScrollViewerWidget* scrollArea);
    // Emitted when a press on an item becomes a motion. If a receiver sets willFlick, the press does not end
    // as a tap.
    void signalFlick(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea, bool& willFlick);
    void minitrimStop();
    void signalVisibleItemsChange();
    // Emitted after a drop, when all items have their positions.
    void signalItemDrop();
    void widgetItemMouseMove(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea);
    // Emitted at the end of a press with motion.
    void widgetItemChangeColor(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea);

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    // Moves the pixels on the screen and paints only the rest.
    void scrollContentsBy(int dx, int dy) override;
    // Ends the current press: a hidden list receives no further touch events.
    void hideEvent(QHideEvent* event) override;
    bool focusNextPrevChild(bool next) override;

    // For subclasses; not started here.
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
