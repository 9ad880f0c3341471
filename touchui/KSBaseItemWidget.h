#pragma once

#include "touchui/KSPushbutton.h"

#include <QPixmap>
#include <QPointer>
#include <QRect>
#include <QSize>
#include <array>

class QHBoxLayout;
class QLabel;
class QPainter;
class QVBoxLayout;

// The side of an item on which its drag handle is.
enum DragFlagAlignment { DRAGFLAG_NONE = 0, DRAGFLAG_LEFT = 1, DRAGFLAG_RIGHT = 2 };

enum ChildPosEnum { CHILD_LEFT = 0, CHILD_RIGHT = 1, CHILD_WHOLE = 2, CHILD_THIRD = 3 };

// One row of a KSScrollViewerWidget: up to three child widgets, and a handle for dragging it to another
// position in the list. Mouse events are left to the list. GUI thread only.
class KSBaseItemWidget : public KSPushbutton
{
    Q_OBJECT
public:
    explicit KSBaseItemWidget(QWidget* parent = nullptr);
    ~KSBaseItemWidget() override;

    // Takes ownership of the child and deletes the one that it replaces; null leaves the position empty.
    // CHILD_WHOLE replaces all three. The item's parent object becomes an event filter of the child.
    virtual void setChild(QWidget* child, ChildPosEnum position);
    // Creates a layout: left and right child side by side, the third below. For items that do not position
    // their children themselves.
    virtual void createWidget();
    virtual QWidget* getChild(ChildPosEnum position) const;
    virtual QWidget* getLeftChild() const;
    // Returns the left child if that fills the whole item.
    virtual QWidget* getRightChild() const;
    virtual QWidget* getThirdChild() const;
    // Returns a copy that floats under the finger during a drag and is owned by the caller, or null if the
    // item itself shall float.
    virtual KSBaseItemWidget* clone();
    virtual void setSelectedStyle();
    virtual void setNormalStyle();
    // A lifted item has a shadow and its own background pictures.
    virtual void setPopup(bool popup);
    // Sets the space between the children and around them in pixels, for createWidget().
    virtual void setSpace(int between, int around);
    // Shows or hides the drag handle.
    virtual void setDragFlag(bool dragFlag);
    virtual void setDragFlagAlignment(DragFlagAlignment alignment);
    virtual DragFlagAlignment getDragFlagAlignment() const;
    // Returns the touch area of the drag handle in item coordinates; null without an alignment.
    virtual QRect getDragArea() const;

    bool isPopup() const { return m_popup; }
    bool hasDragFlag() const { return m_dragFlag; }
    // The focus is lost, with signalLostFocus(), by a press outside the item.
    void setHasFocus(bool hasFocus);
    bool hasFocusFlag() const { return m_hasFocus; }

    bool eventFilter(QObject* watched, QEvent* event) override;

Q_SIGNALS:
    void signalResize();
    void signalLostFocus();
    // Requests that the list lifts this item.
    void signalStartMove(KSBaseItemWidget* item);

protected:
    // How the background is painted: from the style sheets of setSelectedStyle() and setNormalStyle(), or by
    // a subclass that sets no style sheet.
    enum class Background { StyleSheet, Own };
    KSBaseItemWidget(Background background, QWidget* parent);

    bool event(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    // Paints what lies below the children of an item that is not lifted, at least within exposed.
    virtual void paintBackground(QPainter& painter, const QRect& exposed);
    QPoint getHandlePos() const;
    void paintDragBase(QPainter& painter);
    void paintDragFlag(QPainter& painter);

private:
    void takeChild(QPointer<QWidget>& place, QWidget* child);
    void updateDragArea();
    int handleTop() const;
    QLabel* makeHandle();
    void loadDragBase();
    void showShadow(bool show);

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
    std::array<QPixmap, 3> m_dragBase; // left, centre and right; loaded when the item is first lifted
};
