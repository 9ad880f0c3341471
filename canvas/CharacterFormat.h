#pragma once

#include <QColor>
#include <QFont>
#include <QString>
#include <QTextCharFormat>
#include <string>

class TextStyle;

// Turns character styles into fonts and layout formats. Fonts are shared by all text objects and kept by
// family, size, weight, slant and spacing, so that a character costs no look-up in the font system. GUI
// thread only.
class CharacterFormat
{
public:
    // False when the font system would answer with another family; an empty family is never installed.
    static bool familyIsInstalled(const QString& family);

    // ratio: raster pixels per stored pixel. Sizes are kept within 1 to 999 stored pixels.
    static QFont font(const TextStyle& style, double ratio);
    static int pixelSize(const TextStyle& style, double ratio);

    // Format of a character for layout. Its foreground has alpha 0: the document only places characters.
    static QTextCharFormat layoutFormat(const TextStyle& style, double ratio);

    // A colour of a record; black if the text is not a colour.
    static QColor color(const std::string& text);

    // Width of the outline pen in raster pixels; a pen of width 0 draws a hairline.
    static int outlineWidth(const TextStyle& style, double ratio);
};
