#pragma once

#include "canvas/TextObjectParts.h"

class QRectF;
class QTextCursor;
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
    // Applies the styles of the characters from begin to before end. Call updateWidthAndAlign() or
    // updateAfterTyping() after it.
    void applyFormats(int begin, int end);
    // As above, with the margins that fit the styles, which saves a second layout. Call updateWidthAndAlign()
    // after it.
    void applyStyles(int begin, int end);
    // Sets the height of an empty document, from the font of the style.
    void setCaretHeight(const TextStyle& style);

    // Fits margins, width and alignment to the text. An object that is centred or aligned right keeps its
    // centre or its right edge where it was at the last call.
    void updateWidthAndAlign();
    // As above, after characters were added at the position or removed there (added is 0): repaints what of
    // their paragraph changed, if the object keeps its size and its paragraphs.
    void updateAfterTyping(int position, int added);
    // Call when an input method composes text, which is laid out but not in the document: the next call of
    // updateAfterTyping() repaints the whole paragraph.
    void noteComposition() { m_isComposing = true; }
    // Makes the next call of updateWidthAndAlign() leave the object where it is.
    void forgetWidth() { m_lastWidth = 0.0; }
    // Call after characters were removed: the document reports the removal before it has laid itself out.
    // Lays out the changed paragraphs only.
    void finishLayout();

private:
    double probableMargin();
    double expectedMargin() const;
    double naturalWidth(double margin) const;
    double lineMargin() const;
    bool hasMargins(double margin) const;
    // Returns the text width that the document needs.
    double textWidthFor(double width) const;
    bool isFitted() const;
    QRectF areaOfTyping(int position, int added) const;
    void setFormats(QTextCursor& cursor, int begin, int end);
    void adjustLeftAndRightMargin(double margin);
    void setDocumentAlign();
    // Moves the object so that its anchor stays where it was.
    void keepAnchor(double width);

    TextObjectParts m_parts;
    double m_lastWidth = 0.0;
    double m_lastHeight = 0.0;
    double m_lastMargin = 0.0;
    double m_lastExpectedMargin = 0.0;
    int m_lastBlocks = 0;
    bool m_isComposing = false;
};
