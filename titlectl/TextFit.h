#pragma once

#include "titlectl/TemplateFields.h"

class TText;

// Measures the text objects of a title as the canvas and the pictures show them, and makes texts that are too
// wide smaller. Lengths are pixels of the 1280 canvas. Needs a QApplication, but no window; GUI thread only.
class TextFit
{
public:
    // Returns the width in which the glyphs and outlines of the text stay on the canvas and in the pictures,
    // wherever the text is placed. Shadows are not counted. 0 if nothing is drawn.
    static double inkWidth(const TText& text);

    // Returns whether the ink is within the width. If it is not, makes all sizes smaller in the same
    // proportion, as little as necessary, but none below the smallest; when not even these sizes fit, the
    // text has them and the result is false. A text that fits, or that has the smallest size already, is not
    // changed.
    static bool shrink(TText& text, const TemplateFields::Fit& fit);

    // Moves a text that is centred or aligned right, so that its centre or right edge is where it was with
    // the text before.
    static void keepAlignment(TText& text, const TText& before);

private:
    static double inkWidthIn(const TText& text, double ratio, bool isBig);
    static double boxWidth(const TText& text);
};
