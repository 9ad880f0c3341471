#pragma once

#include <QImage>

// Paints the background pictures of the sample titles, 1920x1080. The result is always the same.
class SampleBackgrounds
{
public:
    // A city by night, with a dark bar for text along the bottom. Opaque.
    static QImage cityNight();
    // Light beams over a stage. Opaque.
    static QImage stageLights();
    // A bar along the bottom, transparent elsewhere.
    static QImage lowerThird();

    // Two shades of grey in squares, as the background of transparent pictures.
    static QImage checker(const QSize& size);
};
