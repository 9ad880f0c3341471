#pragma once

#include "touchui/KSPushbutton.h"

#include <QPointer>
#include <QRect>
#include <QSize>

class QGraphicsDropShadowEffect;
class QHBoxLayout;
class QLabel;
class QPainter;
class QVBoxLayout;

// On which side of an item its drag handle is.
enum DragFlagAlignment { DRAGFLAG_NONE = 0, DRAGFLAG_LEFT = 1, DRAGFLAG_RIGHT = 2 };

enum ChildPosEnum { CHILD_LEFT = 0, CHILD_RIGHT = 1, CHILD_WHOLE = 2, CHILD_THIRD = 3 };

// One row of a KSScrollViewerWidget: up to three child widgets, and a handle by which it can be dragged to
// another place of the list. Mouse events pass through it to the list. GUI thread only.
class KSBaseItemWidget : public KSPushbutton
{
    Q_OBJECT
public:
    explicit KSBaseItemWidget(QWidget* parent = nullptr);
    ~KSBaseItemWidget() override;

    // Takes the child over and deletes the one that it replaces; null empties the place. The whole place
    // takes the room of all three. The item's parent object becomes an event filter of the child.
    virtual void setChild(QWidget* child, ChildPosEnum position);
    // Lays the children out, left and right side by side and the third below. For items that do not place
    // their children themselves.
    virtual void createWidget();
    virtual QWidget* getChild(ChildPosEnum position) const;
    virtual QWidget* getLeftChild() const;
    // The left child when that fills the whole item.
    virtual QWidget* getRightChild() const;
    virtual QWidget* getThirdChild() const;
    // A copy that floats under the finger during a drag; the caller owns it. Null: the item itself floats.
    virtual KSBaseItemWidget* clone();
    virtual void setSelectedStyle();
    virtual void setNormalStyle();
    // A lifted item has a shadow and a base of its own.
    virtual void setPopup(bool popup);
    // Pixels between the children and around them, for createWidget().
    virtual void setSpace(int between, int around);
    // Shows or hides the handle.
    virtual void setDragFlag(bool dragFlag);
    virtual void setDragFlagAlignment(DragFlagAlignment alignment);
    virtual DragFlagAlignment getDragFlagAlignment() const;
    // Where a finger takes the handle, in item coordinates; null without an alignment.
    virtual QRect getDragArea() const;

    bool isPopup() const { return m_popup; }
    bool hasDragFlag() const { return m_dragFlag; }
    // A press elsewhere ends it with signalLostFocus().
    void setHasFocus(bool hasFocus);
    bool hasFocusFlag() const { return m_hasFocus; }

    bool eventFilter(QObject* watched, QEvent* event) override;

Q_SIGNALS:
    void signalResize();
    void signalLostFocus();
    // Asks the list to lift this item.
    void signalStartMove(KSBaseItemWidget* item);

protected:
    bool event(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    QPoint getHandlePos() const;
    void paintDragBase(QPainter& painter);
    void paintDragFlag(QPainter& painter);

private:
    void takeChild(QPointer<QWidget>& place, QWidget* child);
    void updateDragArea();
    int handleTop() const;
    QLabel* makeHandle();

    QPointer<QWidget> m_left;
    QPointer<QWidget> m_right;
    QPointer<QWidget> m_third;
    QVBoxLayout* m_column = nullptr;
    QHBoxLayout* m_row = nullptr;
    bool m_whole = false;
    bool m_dragFlag = false;
    int m_spaceBetween = 0;
    int m_spaceAround = 0;
    bool m_popup = false;
    DragFlagAlignment m_alignment = DRAGFLAG_NONE;
    QSize m_lastSize;
    QRect m_dragArea;
    bool m_hasFocus = false;
    QLabel* m_handle = nullptr;
    QGraphicsDropShadowEffect* m_shadow = nullptr; // the widget owns it
};
