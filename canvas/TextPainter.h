#pragma once

#include "canvas/CaretGeometry.h"
#include "canvas/ParagraphGlyphs.h"
#include "canvas/TextObjectConstants.h"

#include <QList>
#include <QPainterPath>
#include <QRectF>
#include <vector>

class QPainter;
class QTextCursor;
class QTextDocument;
class StyleDocument;

// Paints one text object: outlines below glyphs, frames, selections. Keeps what each paragraph draws until
// its text, a style or the layout changes, or fonts are imported. GUI thread only.
class TextPainter
{
public:
    // Keeps references to both, which must outlive this object.
    TextPainter(const QTextDocument& document, const StyleDocument& styles);

    // Sets the raster pixels per stored pixel.
    void setRatio(double ratio);
    double ratio() const { return m_ratio; }
    // Call after text, styles or layout changed.
    void invalidate();
    // As above, when only the text and the styles of one paragraph changed and the layout of the others did
    // not. number: that of its block. Returns whether what is drawn of the others is the same as before.
    bool invalidateParagraph(int number);
    // Returns a number that changes whenever what is drawn may have changed.
    quint64 contentVersion() const { return m_version; }
    CaretGeometry& carets() { return m_carets; }

    // Draws at least what is in the exposed rectangle, in item coordinates.
    void drawItemText(QPainter* painter, const QRectF& exposed);
    // Returns the area that drawItemText() covers with glyphs and outlines, in item coordinates; empty if it
    // draws nothing.
    QRectF inkRect();
    // Draws at least what is in the exposed rectangle of the frame of a pair: status is that of the child,
    // FocusEdit or FocusObject.
    void drawItemBoundingRect(QPainter* painter, const QRectF& rect, int status, const QRectF& exposed);
    // Highlights the selection of the cursor; hasFocus chooses the colours.
    void drawSelection(QPainter* painter, const QTextCursor& cursor, bool hasFocus);

private:
    // A frame ready for drawing. Its dots are rectangles: a path of dots takes ten times as long as the solid
    // line.
    struct Frame {
        QRectF rect;
        QPainterPath solid;
        QList<QRectF> dots;
    };

    // Records the paragraphs that have no recording.
    void recordGlyphs();
    void prepareFrame(const QRectF& rect);

    const QTextDocument& m_document;
    const StyleDocument& m_styles;
    double m_ratio = TextObjectConstants::SCENEPERCENTAGE;
    CaretGeometry m_carets;
    std::vector<ParagraphGlyphs> m_paragraphs;
    // Of the fonts that the paragraphs were recorded with.
    quint64 m_fontGeneration = 0;
    Frame m_frame;
    quint64 m_version = 0;
};
