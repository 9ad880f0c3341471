// Background pictures of the sample titles, painted at 1920x1080. The same every time.
#pragma once

#include <QImage>

class SampleBackgrounds
{
public:
    // A city by night, with a dark bar for text along the bottom. Opaque.
    static QImage cityNight();
    // Light beams over a stage. Opaque.
    static QImage stageLights();
    // A bar along the bottom, transparent elsewhere.
    static QImage lowerThird();

    // Two shades of grey in squares, which stand for transparent parts.
    static QImage checker(const QSize& size);
};
