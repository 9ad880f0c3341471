#include "touchui/KSSliderStyle.h"

#include "touchui/NineSlice.h"

#include <QPainter>
#include <QSlider>
#include <QStyleOptionSlider>

namespace
{

constexpr QSize PLAIN_HANDLE(44, 44);
constexpr int PLAIN_GROOVE = 12;
constexpr int TICK_LENGTH = 8;
constexpr int TICK_WIDTH = 2;
constexpr int MOST_TICKS = 200; // more marks would look like a grey bar
constexpr qreal DISABLED_OPACITY = 0.4;
const QColor PLAIN_COLOR(102, 102, 102);
const QColor PLAIN_GROOVE_COLOR(30, 30, 30);
const QColor TICK_COLOR(178, 178, 178);

bool isHorizontal(const QStyleOptionSlider& option)
{
    return option.orientation == Qt::Horizontal;
}

int bandBefore(const QStyleOptionSlider& option)
{
    return option.tickPosition & QSlider::TicksAbove ? KSSliderStyle::TICK_BAND : 0;
}

int bandAfter(const QStyleOptionSlider& option)
{
    return option.tickPosition & QSlider::TicksBelow ? KSSliderStyle::TICK_BAND : 0;
}

// Returns the strip for handle and groove, without the bands of the marks.
QRect strip(const QStyleOptionSlider& option)
{
    const int before = bandBefore(option);
    const int after = bandAfter(option);
    return isHorizontal(option) ? option.rect.adjusted(0, before, 0, -after)
                                : option.rect.adjusted(before, 0, -after, 0);
}

} // namespace

KSSliderStyle::KSSliderStyle() : QProxyStyle(QStringLiteral("Fusion"))
{
}

QSize KSSliderStyle::handleSize() const
{
    return m_images.handle[0].isNull() ? PLAIN_HANDLE : m_images.handle[0].size();
}

void KSSliderStyle::drawComplexControl(ComplexControl control, const QStyleOptionComplex* option,
                                       QPainter* painter, const QWidget* widget) const
{
    const auto* slider = qstyleoption_cast<const QStyleOptionSlider*>(option);
    if (control != CC_Slider || slider == nullptr) {
        QProxyStyle::drawComplexControl(control, option, painter, widget);
        return;
    }
    if (isHorizontal(*slider))
        drawHorizantalSlider(*slider, *painter);
    else
        drawVerticalSlider(*slider, *painter);
}

void KSSliderStyle::drawHorizantalSlider(const QStyleOptionSlider& option, QPainter& painter) const
{
    drawTick(option, painter);
    drawGroove(option, painter);
    drawHandle(option, painter);
}

void KSSliderStyle::drawVerticalSlider(const QStyleOptionSlider& option, QPainter& painter) const
{
    drawTick(option, painter);
    drawGroove(option, painter);
    drawHandle(option, painter);
}

void KSSliderStyle::drawGroove(const QStyleOptionSlider& option, QPainter& painter) const
{
    const QRect target = grooveRect(option);
    const auto& pieces = m_images.groove;
    const NineSlice::Triple cells = isHorizontal(option)
                                        ? NineSlice::row(target, pieces[0].width(), pieces[2].width())
                                        : NineSlice::column(target, pieces[0].height(), pieces[2].height());
    if (pieces[1].isNull())
        painter.fillRect(target, PLAIN_GROOVE_COLOR);
    for (std::size_t i = 0; i < pieces.size(); ++i)
        if (!pieces[i].isNull() && !cells[i].isEmpty())
            painter.drawPixmap(cells[i], pieces[i]);
}

void KSSliderStyle::drawHandle(const QStyleOptionSlider& option, QPainter& painter) const
{
    const QRect target = handleRect(option);
    std::size_t look = option.state & State_Sunken ? 1 : 0;
    if (!(option.state & State_Enabled))
        look = 2;
    const QPixmap& picture = m_images.handle[look].isNull() ? m_images.handle[0] : m_images.handle[look];
    if (picture.isNull()) {
        painter.fillRect(target, PLAIN_COLOR);
        return;
    }
    // A disabled handle is drawn with reduced opacity, because the pictures for it do not look disabled.
    painter.save();
    painter.setOpacity(look == 2 ? DISABLED_OPACITY : 1.0);
    painter.drawPixmap(target, picture);
    painter.restore();
}

void KSSliderStyle::drawTick(const QStyleOptionSlider& option, QPainter& painter) const
{
    if (option.tickPosition == QSlider::NoTicks)
        return;
    const qint64 range = qint64(option.maximum) - option.minimum;
    const qint64 interval = qMax<qint64>(option.tickInterval, 1);
    if (range <= 0 || range / interval > MOST_TICKS)
        return;
    const int across = isHorizontal(option) ? option.rect.height() : option.rect.width();
    for (qint64 value = option.minimum; value <= option.maximum; value += interval) {
        const QRect mark = tickRect(option, int(value));
        painter.fillRect(mark, TICK_COLOR);
        if (option.tickPosition == QSlider::TicksBothSides) {
            const QRect other =
                isHorizontal(option)
                    ? QRect(mark.x(), across - mark.y() - mark.height(), mark.width(), mark.height())
                    : QRect(across - mark.x() - mark.width(), mark.y(), mark.width(), mark.height());
            painter.fillRect(other, TICK_COLOR);
        }
    }
}

QRect KSSliderStyle::tickRect(const QStyleOptionSlider& option, int value) const
{
    if (option.tickPosition == QSlider::NoTicks)
        return QRect();
    QStyleOptionSlider at = option;
    at.sliderPosition = value;
    const QPoint center = handleRect(at).center();
    const bool before = option.tickPosition == QSlider::TicksAbove;
    if (isHorizontal(option)) {
        const int y = before ? option.rect.y() + TICK_BAND - TICK_LENGTH - 2
                             : option.rect.y() + option.rect.height() - TICK_BAND + 2;
        return QRect(center.x() - TICK_WIDTH / 2 + 1, y, TICK_WIDTH, TICK_LENGTH);
    }
    const int x = before ? option.rect.x() + TICK_BAND - TICK_LENGTH - 2
                         : option.rect.x() + option.rect.width() - TICK_BAND + 2;
    return QRect(x, center.y() - TICK_WIDTH / 2 + 1, TICK_LENGTH, TICK_WIDTH);
}

QRect KSSliderStyle::grooveRect(const QStyleOptionSlider& option) const
{
    const QRect area = strip(option);
    if (isHorizontal(option)) {
        const int height = m_images.groove[1].isNull() ? PLAIN_GROOVE : m_images.groove[1].height();
        return QRect(area.x(), area.y() + (area.height() - height) / 2, area.width(), height);
    }
    const int width = m_images.groove[1].isNull() ? PLAIN_GROOVE : m_images.groove[1].width();
    return QRect(area.x() + (area.width() - width) / 2, area.y(), width, area.height());
}

QRect KSSliderStyle::handleRect(const QStyleOptionSlider& option) const
{
    const QRect area = strip(option);
    const QSize size = handleSize();
    const bool flat = isHorizontal(option);
    const int span = qMax(0, flat ? area.width() - size.width() : area.height() - size.height());
    const int along = sliderPositionFromValue(option.minimum, option.maximum, option.sliderPosition, span,
                                              option.upsideDown);
    const QPoint corner = flat ? QPoint(area.x() + along, area.y() + (area.height() - size.height()) / 2)
                               : QPoint(area.x() + (area.width() - size.width()) / 2, area.y() + along);
    return QRect(corner, size);
}

QRect KSSliderStyle::subControlRect(ComplexControl control, const QStyleOptionComplex* option,
                                    SubControl subControl, const QWidget* widget) const
{
    const auto* slider = qstyleoption_cast<const QStyleOptionSlider*>(option);
    if (control != CC_Slider || slider == nullptr)
        return QProxyStyle::subControlRect(control, option, subControl, widget);
    switch (subControl) {
    case SC_SliderHandle:
        return handleRect(*slider);
    case SC_SliderGroove:
        return grooveRect(*slider);
    case SC_SliderTickmarks:
        return tickRect(*slider, slider->minimum).united(tickRect(*slider, slider->maximum));
    default:
        return QRect();
    }
}

int KSSliderStyle::pixelMetric(PixelMetric metric, const QStyleOption* option, const QWidget* widget) const
{
    const auto* slider = qstyleoption_cast<const QStyleOptionSlider*>(option);
    const bool flat = slider == nullptr || isHorizontal(*slider);
    switch (metric) {
    case PM_SliderLength:
        return flat ? handleSize().width() : handleSize().height();
    case PM_SliderThickness:
    case PM_SliderControlThickness:
        return flat ? handleSize().height() : handleSize().width();
    default:
        return QProxyStyle::pixelMetric(metric, option, widget);
    }
}

int KSSliderStyle::styleHint(StyleHint hint, const QStyleOption* option, const QWidget* widget,
                             QStyleHintReturn* returnData) const
{
    switch (hint) {
    case SH_Slider_AbsoluteSetButtons:
        return Qt::NoButton;
    case SH_Slider_PageSetButtons:
        return Qt::LeftButton;
    case SH_Slider_StopMouseOverSlider:
        return 1;
    default:
        return QProxyStyle::styleHint(hint, option, widget, returnData);
    }
}
