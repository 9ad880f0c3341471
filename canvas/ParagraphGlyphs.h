#pragma once

#include "canvas/CaretGeometry.h"
#include "canvas/GlyphPathCache.h"

#include <QColor>
#include <QFont>
#include <QGlyphRun>
#include <QPointF>
#include <QRectF>
#include <QTransform>
#include <memory>
#include <vector>

class QPainter;
class QTextBlock;
class StyleDocument;
class TextStyle;

// The glyphs of one paragraph of a text object, recorded from its layout and its styles, ready for drawing.
// A character and its marks are drawn together in the style of the character, since a mark is placed on its
// base only within one font. Item coordinates. GUI thread only.
class ParagraphGlyphs
{
public:
    // Discards the recording, before the layout or the styles of the paragraph are recorded again. Its glyphs
    // are kept until then, so that their paths stay available even when their cache is full.
    void discard() { m_recorded = false; }
    bool isRecorded() const { return m_recorded; }
    // Records the paragraph. ratio: raster pixels per stored pixel.
    void record(const QTextBlock& block, CaretGeometry& carets, const StyleDocument& styles, double ratio);

    // Draw what touches the visible area. The transform is that of the item; the painter's own may differ
    // afterwards. Outlines are drawn first, since they lie below the glyphs of all paragraphs.
    void drawOutlines(QPainter& painter, const QTransform& origin, const QRectF& visible) const;
    void draw(QPainter& painter, const QTransform& origin, const QRectF& visible) const;

    // Returns the area that the two cover; empty if they draw nothing.
    QRectF inkRect() const;

private:
    // What characters of the same style have in common.
    struct Look {
        QFont font;
        QColor color;
        QColor edgeColor;
        int edgeWidth = 0;
        bool edge = false;
    };
    struct Glyph {
        QPointF baseline;
        std::shared_ptr<const GlyphPath> path;
        QColor color;
        QColor edgeColor;
        int edgeWidth = 0;
        bool edge = false;
    };
    // Small characters side by side that share font and colour.
    struct Run {
        QRawFont font;
        QColor color;
        QList<quint32> indexes;
        QList<QPointF> positions;
        QGlyphRun glyphs; // of the above, when all are collected
    };
    // One drawing step in reading order: the index of a single glyph or of a run.
    struct Step {
        bool isRun;
        size_t index;
        // Area that the step may draw on.
        QRectF reach;
    };

    static QRectF inkOf(const Glyph& glyph);
    static QRectF inkOf(const Run& run);
    static Look lookOf(const TextStyle& style, double ratio);
    void addGlyph(const Look& look, const QString& text, const CaretGeometry::Caret& caret);
    void addRuns(const Glyph& glyph, const QRectF& reach);

    std::vector<Glyph> m_glyphs;
    std::vector<Run> m_runs;
    std::vector<Step> m_steps;
    bool m_recorded = false;
};
