#pragma once

#include "touchui/SliceFrame.h"

#include <QTabWidget>

class KSTabBar;

// A tab widget with a KSTabBar, whose pane is painted from nine pictures.
class KSTabWidget : public QTabWidget
{
    Q_OBJECT
public:
    explicit KSTabWidget(QWidget* parent = nullptr);

    KSTabBar* ksTabBar() const { return m_bar; }
    // Hides that of the base: the bar takes the matching shape, too.
    void setTabPosition(TabPosition position);
    // The nine pictures of the pane: prefix + "Upper_Left" and so on.
    void setPaneImages(const QString& prefix);

protected:
    void paintEvent(QPaintEvent* event) override;
    // The widget without the bar's strip.
    QRect paneRect() const;

private:
    KSTabBar* m_bar; // child of this
    SliceFrame m_pane;
};
