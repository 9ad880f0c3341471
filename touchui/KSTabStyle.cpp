#include "touchui/KSTabStyle.h"

#include "touchui/NineSlice.h"

#include <QPainter>
#include <QStringList>
#include <QStyleOptionTab>
#include <QTabBar>

namespace
{

constexpr int ICON_GAP = 8;
constexpr int MARGIN = 12;
const QColor DISABLED_TEXT(102, 102, 102);

const char STANDARD_IMAGES[] = "Pane_Tab:Tab_Rest_Left:Tab_Rest_Center:Tab_Rest_Right:"
                               "Tab_Pressed_Left:Tab_Pressed_Center:Tab_Pressed_Right:"
                               "Tab_Disabled_Left:Tab_Disabled_Center:Tab_Disabled_Right:"
                               "Tab_Selected_Left:Tab_Selected_Center:Tab_Selected_Right";

// The pictures show a tab above its pane; for the other sides they are rotated or mirrored.
void turn(QPainter& painter, QTabBar::Shape shape, QRect& rect)
{
    switch (shape) {
    case QTabBar::RoundedSouth:
    case QTabBar::TriangularSouth:
        painter.translate(rect.x(), rect.y() + rect.height());
        painter.scale(1, -1);
        rect = QRect(QPoint(0, 0), rect.size());
        break;
    case QTabBar::RoundedWest:
    case QTabBar::TriangularWest:
        painter.translate(rect.x(), rect.y() + rect.height());
        painter.rotate(-90);
        rect = QRect(QPoint(0, 0), rect.size().transposed());
        break;
    case QTabBar::RoundedEast:
    case QTabBar::TriangularEast:
        painter.translate(rect.x() + rect.width(), rect.y());
        painter.rotate(90);
        rect = QRect(QPoint(0, 0), rect.size().transposed());
        break;
    default:
        break;
    }
}

} // namespace

KSTabStyle::KSTabStyle(const QString& images)
{
    setImages(images);
}

void KSTabStyle::setImages(const QString& images)
{
    const QStringList names =
        (images.isEmpty() ? QString::fromLatin1(STANDARD_IMAGES) : images).split(QLatin1Char(':'));
    for (std::size_t look = 0; look < m_pictures.size(); ++look) {
        for (std::size_t i = 0; i < m_pictures[look].size(); ++i) {
            const QString name = names.value(qsizetype(1 + look * 3 + i));
            m_pictures[look][i] = name.isEmpty()
                                      ? m_pictures[Rest][i]
                                      : QPixmap(QStringLiteral(":/%1/%2").arg(names.constFirst(), name));
        }
    }
}

void KSTabStyle::drawControl(ControlElement element, const QStyleOption* option, QPainter* painter,
                             const QWidget* widget) const
{
    const auto* tab = qstyleoption_cast<const QStyleOptionTab*>(option);
    if (tab != nullptr && element == CE_TabBarTabShape)
        drawTabBarShape(*tab, *painter, widget);
    else if (tab != nullptr && element == CE_TabBarTabLabel)
        drawTabBarLabel(*tab, *painter);
    else
        KSCommonStyle::drawControl(element, option, painter, widget);
}

void KSTabStyle::drawPrimitive(PrimitiveElement element, const QStyleOption* option, QPainter* painter,
                               const QWidget* widget) const
{
    switch (element) {
    case PE_FrameTabBarBase:
    case PE_FrameFocusRect:
    case PE_FrameTabWidget:
        return; // the pane paints itself
    default:
        KSCommonStyle::drawPrimitive(element, option, painter, widget);
    }
}

int KSTabStyle::pixelMetric(PixelMetric metric, const QStyleOption* option, const QWidget* widget) const
{
    switch (metric) {
    case PM_TabBarTabOverlap:
    case PM_TabBarTabShiftHorizontal:
    case PM_TabBarTabShiftVertical:
    case PM_TabBarBaseOverlap:
    case PM_TabBarBaseHeight:
        return 0;
    default:
        return KSCommonStyle::pixelMetric(metric, option, widget);
    }
}

bool KSTabStyle::isPressed(const QStyleOptionTab& option, const QWidget* widget) const
{
    const auto* bar = qobject_cast<const QTabBar*>(widget);
    return m_pressedTab >= 0 && bar != nullptr && bar->tabRect(m_pressedTab) == option.rect;
}

void KSTabStyle::drawTabBarShape(const QStyleOptionTab& option, QPainter& painter,
                                 const QWidget* widget) const
{
    Look look = Rest;
    if (!(option.state & State_Enabled))
        look = Disabled;
    else if (option.state & State_Selected)
        look = Selected;
    else if (isPressed(option, widget))
        look = Pressed;
    const auto& pieces = m_pictures[look];
    painter.save();
    painter.setRenderHint(QPainter::SmoothPixmapTransform);
    QRect rect = option.rect;
    turn(painter, option.shape, rect);
    const NineSlice::Triple cells = NineSlice::row(rect, pieces[0].width(), pieces[2].width());
    for (std::size_t i = 0; i < pieces.size(); ++i)
        if (!pieces[i].isNull() && !cells[i].isEmpty())
            painter.drawPixmap(cells[i], pieces[i]);
    painter.restore();
}

void KSTabStyle::drawTabBarLabel(const QStyleOptionTab& option, QPainter& painter) const
{
    const bool enabled = option.state & State_Enabled;
    painter.save();
    QRect rect = option.rect;
    if (option.shape == QTabBar::RoundedWest || option.shape == QTabBar::TriangularWest ||
        option.shape == QTabBar::RoundedEast || option.shape == QTabBar::TriangularEast)
        turn(painter, option.shape, rect);
    QRect area = rect.adjusted(MARGIN, 0, -MARGIN, 0);
    drawTabBarPixmap(option, painter, area);
    const bool selected = option.state & State_Selected;
    painter.setPen(!enabled   ? DISABLED_TEXT
                   : selected ? option.palette.color(QPalette::BrightText)
                              : option.palette.color(QPalette::WindowText));
    painter.drawText(area, Qt::AlignCenter | Qt::TextSingleLine,
                     option.fontMetrics.elidedText(option.text, Qt::ElideRight, area.width()));
    painter.restore();
}

// Draws the icon and removes its space from the area.
void KSTabStyle::drawTabBarPixmap(const QStyleOptionTab& option, QPainter& painter, QRect& area) const
{
    if (option.icon.isNull())
        return;
    const QSize size = option.iconSize.isValid() ? option.iconSize : QSize(32, 32);
    const QRect place(QPoint(area.x(), area.y() + (area.height() - size.height()) / 2), size);
    option.icon.paint(&painter, place, Qt::AlignCenter,
                      option.state & State_Enabled ? QIcon::Normal : QIcon::Disabled,
                      option.state & State_Selected ? QIcon::On : QIcon::Off);
    area.setLeft(area.x() + size.width() + ICON_GAP);
}
