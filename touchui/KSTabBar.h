#pragma once

#include "touchui/OneFinger.h"

#include <QList>
#include <QSize>
#include <QTabBar>

class KSTabStyle;

// A tab bar that is operated with one finger: tabs have settable sizes and change on the lift, so that a
// finger that slides off changes nothing.
class KSTabBar : public QTabBar
{
    Q_OBJECT
public:
    explicit KSTabBar(QWidget* parent = nullptr);

    static constexpr int TEXT_PIXELS = 24;
    static constexpr int TAB_HEIGHT = 52;

    // Sets the size of a tab in pixels; an invalid size restores that of its text. Ignored if there is no
    // such tab.
    void setTabSizeHint(int index, const QSize& size);
    QSize sizeHint() const override;
    QSize minimumSizeHint() const override { return sizeHint(); }

    // Returns the tab under the finger, or -1.
    int pressedTab() const { return m_pressedTab; }

protected:
    QSize tabSizeHint(int index) const override;
    void tabInserted(int index) override;
    void tabRemoved(int index) override;
    bool event(QEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void hideEvent(QHideEvent* event) override;

private:
    QPoint fingerPosition() const;
    void pressAt(const QPoint& position);
    void moveTo(const QPoint& position);
    void releaseAt(const QPoint& position);
    void setPressedTab(int index);
    void dropPress();
    QSize textSize(int index) const;
    bool isUpright() const;

    KSTabStyle* m_style;   // child of this object
    QList<QSize> m_sizes;  // of each tab; invalid for the size of its text
    int m_pressStart = -1; // the tab on which the press began
    int m_pressedTab = -1; // the same, while the finger is on it
    OneFinger m_finger{this};
};
