#pragma once

#include <QPixmap>
#include <QProxyStyle>

#include <array>

class QStyleOptionSlider;

// Paints a KSSLider and defines the positions of its parts. Parts without a picture are painted plainly.
class KSSliderStyle : public QProxyStyle
{
    Q_OBJECT
public:
    struct Images {
        std::array<QPixmap, 3> handle; // at rest, pressed, disabled
        std::array<QPixmap, 3> groove; // left, centre, right; or top, centre, bottom
    };

    KSSliderStyle();

    void setImages(const Images& images) { m_images = images; }

    void drawComplexControl(ComplexControl control, const QStyleOptionComplex* option, QPainter* painter,
                            const QWidget* widget = nullptr) const override;
    QRect subControlRect(ComplexControl control, const QStyleOptionComplex* option, SubControl subControl,
                         const QWidget* widget = nullptr) const override;
    int pixelMetric(PixelMetric metric, const QStyleOption* option = nullptr,
                    const QWidget* widget = nullptr) const override;
    int styleHint(StyleHint hint, const QStyleOption* option = nullptr, const QWidget* widget = nullptr,
                  QStyleHintReturn* returnData = nullptr) const override;

    // Returns the mark of a value, above or below (or beside) the groove, in widget coordinates; null without
    // marks.
    QRect tickRect(const QStyleOptionSlider& option, int value) const;
    QSize handleSize() const;
    // Height in pixels of the band of marks on one side of the slider.
    static constexpr int TICK_BAND = 14;

private:
    void drawHorizantalSlider(const QStyleOptionSlider& option, QPainter& painter) const;
    void drawVerticalSlider(const QStyleOptionSlider& option, QPainter& painter) const;
    void drawGroove(const QStyleOptionSlider& option, QPainter& painter) const;
    void drawHandle(const QStyleOptionSlider& option, QPainter& painter) const;
    void drawTick(const QStyleOptionSlider& option, QPainter& painter) const;
    QRect grooveRect(const QStyleOptionSlider& option) const;
    QRect handleRect(const QStyleOptionSlider& option) const;

    Images m_images;
};
