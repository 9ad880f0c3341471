#pragma once

#include <QColor>
#include <QFont>
#include <QString>
#include <QTextCharFormat>
#include <string>

class TextStyle;

// Turns character styles into fonts and layout formats. All text objects share them; they are cached by
// family, size, weight, slant and spacing, so that most characters need no query of the font database. GUI
// thread only.
class CharacterFormat
{
public:
    // Returns false when the font database would substitute another family; an empty family is never
    // installed.
    static bool familyIsInstalled(const QString& family);

    // Returns the font of a style. ratio: raster pixels per stored pixel. Sizes are limited to 1 to 999
    // stored pixels.
    static QFont font(const TextStyle& style, double ratio);
    static int pixelSize(const TextStyle& style, double ratio);

    // Returns the format of a character for layout. Its foreground is transparent, since the document is only
    // used for layout.
    static QTextCharFormat layoutFormat(const TextStyle& style, double ratio);

    // Returns a colour of a record; black if the text is not a colour.
    static QColor color(const std::string& text);

    // Returns the width of the outline pen in raster pixels; a pen of width 0 draws a hairline.
    static int outlineWidth(const TextStyle& style, double ratio);
};
