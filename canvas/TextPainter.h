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

// Paints one text object: outlines below glyphs, frames, selections. Keeps what it draws until the text, a
// style or the layout changes. A character and the marks on it are drawn as one with the style of the
// character, since a mark finds its base only in one font; each position keeps its own style in the record.
// GUI thread only.
class TextPainter
{
public:
    // Both outlive this object.
    TextPainter(const QTextDocument& document, const StyleDocument& styles);

    // Raster pixels per stored pixel.
    void setRatio(double ratio);
    double ratio() const { return m_ratio; }
    // Call when text, styles or layout changed.
    void invalidate();
    // Another number whenever what is drawn may have changed.
    quint64 contentVersion() const { return m_version; }
    CaretGeometry& carets() { return m_carets; }

    void drawItemText(QPainter* painter);
    // Frame of a pair: status is that of the child, FocusEdit or FocusObject.
    void drawItemBoundingRect(QPainter* painter, const QRectF& rect, int status);
    // Highlights the selection of the cursor, with the colours of a text that has the focus or not.
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
    // A run while it is collected.
    struct PendingRun {
        QRawFont font;
        QColor color;
        QList<quint32> indexes;
        QList<QPointF> positions;
    };
    // What is drawn in reading order: a glyph of its own or a run, by index.
    struct Step {
        bool isRun;
        size_t index;
        // Covers what the step draws, in item coordinates.
        QRectF reach;
    };

    // A frame as it is stroked. Dots are rectangles: as one path they cost ten times the solid line.
    struct Frame {
        QRectF rect;
        QPainterPath solid;
        QList<QRectF> dots;
    };

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
