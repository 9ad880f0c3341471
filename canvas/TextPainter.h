#pragma once

#include "canvas/CaretGeometry.h"
#include "canvas/GlyphPathCache.h"
#include "canvas/TextObjectConstants.h"

#include <QColor>
#include <QGlyphRun>
#include <QList>
#include <QPointF>
#include <QRawFont>
#include <QRectF>
#include <QString>
#include <memory>
#include <vector>

class QPainter;
class QTextBlock;
class QTextCursor;
class QTextDocument;
class QTransform;
class StyleDocument;

// Paints one text object: outlines below glyphs, frames, selections. Caches what it draws until the text, a
// style or the layout changes. A character and its marks are drawn together in the style of the character,
// since a mark is placed on its base only within one font; in the record each position keeps its own style.
// GUI thread only.
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
    // Returns a number that changes whenever what is drawn may have changed.
    quint64 contentVersion() const { return m_version; }
    CaretGeometry& carets() { return m_carets; }

    // Draws at least what is in the exposed rectangle, in item coordinates.
    void drawItemText(QPainter* painter, const QRectF& exposed);
    // Returns the area that drawItemText() covers with glyphs and outlines, in item coordinates; empty if it
    // draws nothing.
    QRectF inkRect();
    // Draws the frame of a pair: status is that of the child, FocusEdit or FocusObject.
    void drawItemBoundingRect(QPainter* painter, const QRectF& rect, int status);
    // Highlights the selection of the cursor; hasFocus chooses the colours.
    void drawSelection(QPainter* painter, const QTextCursor& cursor, bool hasFocus);

private:
    struct Glyph {
        QPointF baseline;
        std::shared_ptr<const GlyphPath> path;
        QColor color;
        QColor edgeColor;
        int edgeWidth = 0;
        bool edge = false;
    };
    // Small characters side by side that share font and colour, in item coordinates.
    struct Run {
        QGlyphRun glyphs;
        QColor color;
    };
    // A run whose glyphs are still being collected.
    struct PendingRun {
        QRawFont font;
        QColor color;
        QList<quint32> indexes;
        QList<QPointF> positions;
    };
    // One drawing step in reading order: the index of a single glyph or of a run.
    struct Step {
        bool isRun;
        size_t index;
        // Area that the step may draw on, in item coordinates.
        QRectF reach;
    };

    // A frame ready for drawing. Its dots are rectangles: a path of dots takes ten times as long as the solid
    // line.
    struct Frame {
        QRectF rect;
        QPainterPath solid;
        QList<QRectF> dots;
    };

    static QRectF inkOf(const Glyph& glyph);
    static QRectF inkOf(const Run& run);
    void collectGlyphs();
    void prepareFrame(const QRectF& rect);
    void collectBlock(const QTextBlock& block);
    void addGlyph(int position, const QString& text, const CaretGeometry::Caret& caret);
    void addRuns(const Glyph& glyph, const QRectF& reach);
    void drawItemTextOutLine(QPainter* painter, const QTransform& origin, const QRectF& visible) const;

    const QTextDocument& m_document;
    const StyleDocument& m_styles;
    double m_ratio = TextObjectConstants::SCENEPERCENTAGE;
    CaretGeometry m_carets;
    std::vector<Glyph> m_glyphs;
    std::vector<Run> m_runs;
    std::vector<PendingRun> m_pending;
    std::vector<Step> m_steps;
    std::vector<CaretGeometry::Caret> m_blockCarets;
    Frame m_frame;
    quint64 m_version = 0;
    bool m_valid = false;
};
