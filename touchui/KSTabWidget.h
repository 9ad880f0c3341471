#pragma once

#include "touchui/SliceFrame.h"

#include <QTabWidget>

class KSTabBar;

// A tab widget with a KSTabBar and a pane that is painted from nine pictures.
class KSTabWidget : public QTabWidget
{
    Q_OBJECT
public:
    explicit KSTabWidget(QWidget* parent = nullptr);

    KSTabBar* ksTabBar() const { return m_bar; }
    // Hides the function of the base class; also sets the matching shape of the bar.
    void setTabPosition(TabPosition position);
    // Sets the nine pictures of the pane: prefix + "Upper_Left" and so on.
    void setPaneImages(const QString& prefix);

protected:
    void paintEvent(QPaintEvent* event) override;
    // Returns the widget's rectangle without the strip of the bar.
    QRect paneRect() const;

private:
    KSTabBar* m_bar; // child of this object
    SliceFrame m_pane;
};
