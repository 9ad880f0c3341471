#pragma once

#include "canvas/TextObjectParts.h"

class TextStyle;

// Lays out the Qt document of a text object according to its record: text, formats, margins, width and
// alignment. The changes that it makes in the document are not typing: the caller has to keep them from being
// read back into the record. Lengths are item coordinates. GUI thread only.
class RecordLayout
{
public:
    explicit RecordLayout(const TextObjectParts& parts);

    // Replaces the text of the document by that of the record. Call updateWidthAndAlign() after it.
    void insertRecord();
    // Applies the styles of the characters from begin to before end.
    void applyFormats(int begin, int end);
    // Sets the height of an empty document, from the font of the style.
    void setCaretHeight(const TextStyle& style);

    // Fits margins, width and alignment to the text. An object that is centred or aligned right keeps its
    // centre or its right edge where it was at the last call.
    void updateWidthAndAlign();
    // As above, after characters were added at the position: repaints their paragraph only, if the object
    // keeps its size and its paragraphs.
    void updateAfterTyping(int position);
    // Makes the next call of updateWidthAndAlign() leave the object where it is.
    void forgetWidth() { m_lastWidth = 0.0; }
    // Call after characters were removed: the document reports the removal before it has laid itself out.
    void finishLayout();

private:
    double expectedMargin() const;
    double naturalWidth() const;
    double lineMargin() const;
    bool isFitted() const;
    void adjustLeftAndRightMargin();
    void setDocumentAlign(double width);

    TextObjectParts m_parts;
    double m_lastWidth = 0.0;
    double m_lastHeight = 0.0;
    int m_lastBlocks = 0;
};
