// Makes text objects for titles that a program writes.
#pragma once

#include "document/TText.h"

#include <memory>

class SampleText
{
public:
    enum Shadow { NO_SHADOW = 0, RIGHT_DOWN = 1, CENTRE_DOWN = 2 };
    enum Align { LEFT = -1, CENTRE = 0, RIGHT = 1 };

    // How one text object looks: sizes on the 1920 wide raster, x and y the stored place on the 1280 wide
    // canvas.
    struct Look {
        float x = 0;
        float y = 0;
        const char* family = "KST";
        int size = 64;
        const char* color = "#FFFFFF";
        int bold = 0;
        int italic = 0;
        int kerning = 100; // percent
        int edgeWidth = 0; // 0 is no outline
        const char* edgeColor = "#000000";
        Shadow shadow = NO_SHADOW;
        Align align = LEFT;
    };

    // The text object with the number, one run a character as the canvas keeps them. The text is UTF-8.
    static std::unique_ptr<TText> make(int id, const char* utf8, const Look& look);

    // The look with such a place that the text's left edge, middle or right edge, by its alignment, is at x
    // and the middle of the capitals of its first line is at y; both on the 1920 wide raster. Measures with
    // the font, so it needs a QGuiApplication.
    static Look placed(Look look, const char* utf8, double x, double y);
};
