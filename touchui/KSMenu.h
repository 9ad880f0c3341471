#pragma once

#include "touchui/MenuPlacement.h"
#include "touchui/OneFinger.h"
#include "touchui/SliceFrame.h"

#include <QMenu>
#include <QPolygon>

class OutsidePressFilter;
class QTimer;
class QTouchEvent;

// A menu that is operated with one finger: a balloon with an arrow to its anchor and one row for each visible
// action. It closes when a row is chosen, on a press outside (which has no other effect), by its timer or by
// close(). It is not a Qt popup, so that the widget under the finger that opened it still receives the lift.
class KSMenu : public QMenu
{
    Q_OBJECT
public:
    explicit KSMenu(QWidget* parent = nullptr, const QFont& font = QFont());
    ~KSMenu() override;

    // Sets the window that limits the placement of all menus; not owned. If null, the screen is the limit.
    static void setMainWindow(QWidget* window) { s_parent = window; }
    static QWidget* s_parent;

    // flags is a combination of MenuPlacement::Flag.
    virtual void setBalloonAlignment(int flags);
    virtual bool testBalloonAlignment(int flag) const;

    // Opens the menu at the anchor, in global coordinates.
    void popup(const QPoint& anchor, QAction* atAction = nullptr);

    // Sets the time in milliseconds after which the menu closes; 0 for never.
    void setAutoCloseTime(int milliseconds);
    // These have an effect only if a time is set.
    void startAutoCloseTimer();
    void restartAutoCloseTimer();

    // These return menu coordinates.
    virtual QPolygon getMenuPointPoints() const;
    virtual QRect getMenuBackgroundRect() const;
    virtual int getMenuItemHeight() const;
    QRect getMenuItemRect(int row) const;
    // Returns the row at the point, or -1.
    int cursorItem(const QPoint& point) const;
    // Returns the highlighted row, or -1.
    int currentItem() const { return m_current; }

    QSize sizeHint() const override;

Q_SIGNALS:
    // Emitted when the visible menu is about to close.
    void signalMenuAboutToClose();

protected:
    bool event(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;

    virtual void AutoMoveMenuVertical(const QPoint& anchor);
    virtual void AutoMoveMenuHorizontal(const QPoint& anchor);
    virtual bool onKeyEvent(QKeyEvent* event);
    virtual void onMouseLeave();
    virtual void onMouseButtonPress(const QPoint& position);
    virtual void onMouseMove(const QPoint& position);
    virtual void onMouseButtonRelease(const QPoint& position, Qt::MouseButton button);
    virtual bool onTouchEvent(QTouchEvent* event);
    virtual void drawMenuItem(QPainter& painter, int row, const QAction* action);

private:
    bool onMouseEvent(QEvent* event);
    int flags() const;
    QRect bounds() const;
    MenuPlacement::Placement placement() const;
    QList<QAction*> rows() const;
    void setCurrent(int row);
    void adjustMask();
    void drawBalloon(QPainter& painter) const;

    OutsidePressFilter* m_outsidePress;
    QTimer* m_autoCloseTimer = nullptr;
    SliceFrame m_frame;
    QPixmap m_arrow;
    QPixmap m_separator;
    QPixmap m_cursor;
    QPoint m_anchor;
    bool m_hasAnchor = false;
    int m_alignment = MenuPlacement::Below;
    int m_autoCloseTime = 0;
    int m_current = -1;
    OneFinger m_finger{this};
};
