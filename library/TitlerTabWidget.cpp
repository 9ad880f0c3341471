#include "library/TitlerTabWidget.h"

#include "touchui/KSTabBar.h"

#include <QPainter>

namespace
{

const int LIST_PANE = 8; // kind, see DrawBoundingRectangle
const int TAB_OVERLAP = 4;
constexpr QColor DIALOG_COLOR(51, 51, 51);

} // namespace

TitlerTabWidget::TitlerTabWidget(QWidget* parent) : KSTabWidget(parent)
{
}

void TitlerTabWidget::setPainLine(int x, int y)
{
    m_frameCorner = QPoint(x, y);
    update();
}

void TitlerTabWidget::paintEvent(QPaintEvent* event)
{
    KSTabWidget::paintEvent(event);
    QPainter painter(this);
    if (m_frameCorner)
        m_frame.paintBackground(painter, *m_frameCorner, LIST_PANE);
    painter.fillRect(0, 0, width(), tabBar()->height() - TAB_OVERLAP, DIALOG_COLOR);
}
