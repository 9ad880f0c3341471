#include "touchui/KSTabWidget.h"

#include "touchui/KSCommonStyle.h"
#include "touchui/KSTabBar.h"

#include <QPainter>

namespace
{

QTabBar::Shape shapeOf(QTabWidget::TabPosition position)
{
    switch (position) {
    case QTabWidget::South:
        return QTabBar::RoundedSouth;
    case QTabWidget::West:
        return QTabBar::RoundedWest;
    case QTabWidget::East:
        return QTabBar::RoundedEast;
    case QTabWidget::North:
        break;
    }
    return QTabBar::RoundedNorth;
}

} // namespace

KSTabWidget::KSTabWidget(QWidget* parent) : QTabWidget(parent), m_bar(new KSTabBar)
{
    auto* look = new KSCommonStyle;
    look->setParent(this);
    setStyle(look);
    setTabBar(m_bar);
    m_bar->setExpanding(false); // the base class has just reset this
    setPaneImages(QStringLiteral(":/Pane_Tab/Pane_"));
}

void KSTabWidget::setTabPosition(TabPosition position)
{
    QTabWidget::setTabPosition(position);
    m_bar->setShape(shapeOf(position));
}

void KSTabWidget::setPaneImages(const QString& prefix)
{
    m_pane = SliceFrame(SliceFrame::family(prefix));
    update();
}

QRect KSTabWidget::paneRect() const
{
    const QRect bar = m_bar->geometry();
    switch (tabPosition()) {
    case South:
        return rect().adjusted(0, 0, 0, -bar.height());
    case West:
        return rect().adjusted(bar.width(), 0, 0, 0);
    case East:
        return rect().adjusted(0, 0, -bar.width(), 0);
    case North:
        break;
    }
    return rect().adjusted(0, bar.height(), 0, 0);
}

void KSTabWidget::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    m_pane.paint(painter, paneRect());
}
