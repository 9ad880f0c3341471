#include "app/WindowBackground.h"

#include "app/TitlerWindow.h"

#include <QImageReader>
#include <QPainter>
#include <QRegion>

namespace
{

// Kinds of frames, see DrawBoundingRectangle.
constexpr int WINDOW_FRAME = 1;
constexpr int LEFT_FRAME = 2;
constexpr QPoint WINDOW_FRAME_POS(8, 8);
constexpr QPoint LEFT_FRAME_POS(12, 61);
constexpr QRect CANVAS_IN_SURROUND(30, 22, 1280, 720);

} // namespace

void WindowBackground::load()
{
    QImageReader reader(QStringLiteral(":/PanelBG/Titler_Canvas"));
    const QPixmap surround = QPixmap::fromImageReader(&reader);
    for (const QRect& strip : QRegion(surround.rect()).subtracted(CANVAS_IN_SURROUND))
        m_canvasSurround.push_back({strip.topLeft(), surround.copy(strip)});
    m_vertical = QImage(QStringLiteral(":/Separator_V"));
    m_horizontal = QImage(QStringLiteral(":/Separator_H"));
}

void WindowBackground::paint(QPainter& painter)
{
    if (m_canvasSurround.empty())
        load();
    m_windowFrame.paintBackground(painter, WINDOW_FRAME_POS, WINDOW_FRAME);
    m_leftFrame.paintBackground(painter, LEFT_FRAME_POS, LEFT_FRAME);
    for (const Strip& strip : m_canvasSurround)
        painter.drawPixmap(TitlerWindow::STARTPOINT_OF_CANVASSCENE_BG + strip.place, strip.picture);
    painter.drawImage(TitlerWindow::VSEPARATOR_RECT, m_vertical);
    painter.drawImage(TitlerWindow::HSEPARATOR_TOP_RECT, m_horizontal);
    painter.drawImage(TitlerWindow::HSEPARATOR_BOTTOM_RECT, m_horizontal);
}
