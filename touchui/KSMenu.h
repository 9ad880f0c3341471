#pragma once

#include "touchui/MenuPlacement.h"
#include "touchui/OneFinger.h"
#include "touchui/SliceFrame.h"

#include <QMenu>
#include <QPolygon>

class OutsidePressFilter;
class QTimer;
class QTouchEvent;

// A menu for one finger: a balloon with an arrow to its anchor, one row for each visible action. It closes by
// a choice, by a press outside (which presses nothing else), by its timer or by close(). It is no popup of
// Qt's, so that the finger that opened it is still lifted where it came down.
class KSMenu : public QMenu
{
    Q_OBJECT
public:
    explicit KSMenu(QWidget* parent = nullptr, const QFont& font = QFont());
    ~KSMenu() override;

    // Bounds the placement of all menus; not owned. Null: the screen does.
    static void setMainWindow(QWidget* window) { s_parent = window; }
    static QWidget* s_parent;

    // A combination of MenuPlacement::Flag.
    virtual void setBalloonAlignment(int flags);
    virtual bool testBalloonAlignment(int flag) const;

    // Opens at the anchor, in global coordinates.
    void popup(const QPoint& anchor, QAction* atAction = nullptr);

    // Milliseconds after which the menu closes by itself; 0 is never.
    void setAutoCloseTime(int milliseconds);
    int autoCloseTime() const { return m_autoCloseTime; }
    // These act only when a time is set.
    void startAutoCloseTimer();
    void restartAutoCloseTimer();

    // In menu coordinates.
    virtual QPolygon getMenuPointPoints() const;
    virtual QRect getMenuBackgroundRect() const;
    virtual int getMenuItemHeight() const;
    QRect getMenuItemRect(int row) const;
    // The row under the point; -1 outside all.
    int cursorItem(const QPoint& point) const;
    // The row that is marked; -1 for none.
    int currentItem() const { return m_current; }

    QSize sizeHint() const override;

Q_SIGNALS:
    // The visible menu is being closed.
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
