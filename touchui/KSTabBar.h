#pragma once

#include "touchui/OneFinger.h"

#include <QList>
#include <QSize>
#include <QTabBar>

class KSTabStyle;

// A tab bar for one finger: tabs have the size they are told and change on the lift, so that a finger that
// slides off changes nothing.
class KSTabBar : public QTabBar
{
    Q_OBJECT
public:
    explicit KSTabBar(QWidget* parent = nullptr);

    static constexpr int TEXT_PIXELS = 24;
    static constexpr int TAB_HEIGHT = 52;

    // Overrides the size of a tab; an invalid size takes the text's again. An index without a tab is ignored.
    void setTabSizeHint(int index, const QSize& size);
    QSize sizeHint() const override;
    QSize minimumSizeHint() const override { return sizeHint(); }

    // See KSTabStyle.
    void setImages(const QString& images);
    // The tab under the finger, -1 for none.
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

    KSTabStyle* m_style;   // child of this
    QList<QSize> m_sizes;  // of each tab; invalid: that of its text
    int m_pressStart = -1; // the tab that the press began on
    int m_pressedTab = -1; // the same while the finger is on it
    OneFinger m_finger{this};
};
