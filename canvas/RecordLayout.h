#pragma once

#include "canvas/TextObjectParts.h"

class TextStyle;

// Lays the Qt document of a text object out as its record says: text, formats, margins, width and alignment.
// Changes of the document that are made here are not typing: the caller keeps them from being read back.
// Lengths are item coordinates. GUI thread only.
class RecordLayout
{
public:
    explicit RecordLayout(const TextObjectParts& parts);

    // Replaces the text of the document by that of the record. updateWidthAndAlign() has to follow.
    void insertRecord();
    // Formats the characters from begin to before end as their styles say.
    void applyFormats(int begin, int end);
    // The height of an empty document, from the font of the style.
    void setCaretHeight(const TextStyle& style);

    // Fits margins, width and alignment to the text. An object that is centred or aligned right keeps its
    // centre or its right edge where it was at the last call.
    void updateWidthAndAlign();
    // The next call of updateWidthAndAlign() leaves the object where it is.
    void forgetWidth() { m_lastWidth = 0.0; }
    // Call after characters were removed: while the document reports that, it has not laid itself out yet.
    void finishLayout();

private:
    double expectedMargin() const;
    double naturalWidth() const;
    void adjustLeftAndRightMargin();
    void setDocumentAlign(double width);

    TextObjectParts m_parts;
    double m_lastWidth = 0.0;
};
