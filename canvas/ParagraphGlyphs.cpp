#include "canvas/ParagraphGlyphs.h"

#include "canvas/CharacterFormat.h"
#include "canvas/GlyphMasks.h"
#include "canvas/StyleDocument.h"

#include <QPainter>
#include <QPen>
#include <QRawFont>
#include <QString>
#include <QTextBlock>
#include <QTextBoundaryFinder>
#include <algorithm>

namespace
{

// Position of the baseline within the height of a line.
constexpr double BASELINE_SHARE = 0.85;
constexpr double CARET_SHIFT = 1.0;
// Pixels; the font system caches bitmaps of smaller characters.
constexpr int LARGEST_BITMAP_GLYPH = 64;

bool isSpace(const QString& text)
{
    return std::all_of(text.begin(), text.end(), [](QChar c) { return c.isSpace(); });
}

// Returns whether both styles look the same.
bool isSameLook(const TextStyle& a, const TextStyle& b)
{
    return a.fontIsTheSame(b) && a.getTextKerning() == b.getTextKerning() && a.edgeIsTheSame(b);
}

} // namespace

ParagraphGlyphs::Look ParagraphGlyphs::lookOf(const TextStyle& style, double ratio)
{
    Look look;
    look.font = CharacterFormat::font(style, ratio);
    look.color = CharacterFormat::color(style.getFontColor());
    look.color.setAlpha(255);
    look.edge = style.isTextEdge() != 0;
    if (look.edge) {
        look.edgeColor = CharacterFormat::color(style.textEdge().getEdgeColor());
        look.edgeWidth = CharacterFormat::outlineWidth(style, ratio);
    }
    return look;
}

void ParagraphGlyphs::record(const QTextBlock& block, CaretGeometry& carets, const StyleDocument& styles,
                             double ratio)
{
    const std::vector<Glyph> previous = std::move(m_glyphs);
    m_glyphs.clear();
    m_runs.clear();
    m_steps.clear();
    m_recorded = true;
    std::vector<CaretGeometry::Caret> places;
    carets.caretsOfBlock(block, places);
    const QString text = block.text();
    QTextBoundaryFinder finder(QTextBoundaryFinder::Grapheme, text);
    const TextStyle* last = nullptr;
    Look look;
    for (qsizetype begin = 0, end = 0; begin < text.size(); begin = end) {
        finder.setPosition(begin);
        end = finder.toNextBoundary();
        if (end <= begin)
            end = text.size();
        const QString character = text.mid(begin, end - begin);
        const TextStyle* style = styles.at(block.position() + int(begin));
        if (!style || isSpace(character))
            continue;
        if (!last || !isSameLook(*last, *style))
            look = lookOf(*style, ratio);
        last = style;
        addGlyph(look, character, places[size_t(begin)]);
    }
    for (Run& run : m_runs) {
        run.glyphs.setRawFont(run.font);
        run.glyphs.setGlyphIndexes(run.indexes);
        run.glyphs.setPositions(run.positions);
    }
}

void ParagraphGlyphs::addGlyph(const Look& look, const QString& text, const CaretGeometry::Caret& caret)
{
    Glyph glyph;
    glyph.path = GlyphPathCache::glyph(look.font, text);
    glyph.baseline = QPointF(caret.x - CARET_SHIFT, caret.top + BASELINE_SHARE * caret.height);
    glyph.color = look.color;
    glyph.edge = look.edge && glyph.path->hasPath();
    if (glyph.edge) {
        glyph.edgeColor = look.edgeColor;
        glyph.edgeWidth = look.edgeWidth;
    }
    // No glyph of a usable font extends farther than this from its baseline.
    const int pixelSize = look.font.pixelSize();
    const double extent = 2.0 * pixelSize * double(text.size()) + glyph.edgeWidth;
    const QRectF reach(glyph.baseline - QPointF(extent, extent), QSizeF(2.0 * extent, 2.0 * extent));
    // A glyph with an outline is drawn as a path, so that both fit exactly. Other small characters look best
    // when the font system draws them.
    if (!glyph.path->hasPath() || (!glyph.edge && pixelSize < LARGEST_BITMAP_GLYPH)) {
        addRuns(glyph, reach);
        return;
    }
    m_steps.push_back({false, m_glyphs.size(), reach});
    m_glyphs.push_back(std::move(glyph));
}

void ParagraphGlyphs::addRuns(const Glyph& glyph, const QRectF& reach)
{
    for (const QGlyphRun& source : glyph.path->runs()) {
        const QRawFont font = source.rawFont();
        const bool isSame = !m_steps.empty() && m_steps.back().isRun && m_runs.back().color == glyph.color &&
                            m_runs.back().font == font;
        if (isSame) {
            m_steps.back().reach |= reach;
        } else {
            m_steps.push_back({true, m_runs.size(), reach});
            m_runs.push_back({font, glyph.color, {}, {}, {}});
        }
        Run& run = m_runs.back();
        run.indexes += source.glyphIndexes();
        for (const QPointF& position : source.positions())
            run.positions.append(position + glyph.baseline);
    }
}

void ParagraphGlyphs::drawOutlines(QPainter& painter, const QTransform& origin, const QRectF& visible) const
{
    for (const Step& step : m_steps) {
        if (step.isRun || !m_glyphs[step.index].edge || !visible.intersects(step.reach))
            continue;
        const Glyph& glyph = m_glyphs[step.index];
        painter.setWorldTransform(QTransform(origin).translate(glyph.baseline.x(), glyph.baseline.y()));
        if (glyph.edgeWidth > 0) {
            GlyphMasks::fillOutline(painter, *glyph.path, glyph.edgeWidth, glyph.edgeColor);
        } else {
            const QPen hairline(glyph.edgeColor, 0, Qt::SolidLine, Qt::SquareCap, Qt::SvgMiterJoin);
            painter.strokePath(glyph.path->contour(), hairline);
        }
    }
}

void ParagraphGlyphs::draw(QPainter& painter, const QTransform& origin, const QRectF& visible) const
{
    for (const Step& step : m_steps) {
        if (!visible.intersects(step.reach))
            continue;
        if (step.isRun) {
            const Run& run = m_runs[step.index];
            painter.setWorldTransform(origin);
            painter.setPen(run.color);
            painter.drawGlyphRun(QPointF(), run.glyphs);
        } else {
            const Glyph& glyph = m_glyphs[step.index];
            painter.setWorldTransform(QTransform(origin).translate(glyph.baseline.x(), glyph.baseline.y()));
            GlyphMasks::fill(painter, *glyph.path, glyph.color);
        }
    }
}

QRectF ParagraphGlyphs::inkOf(const Glyph& glyph)
{
    QRectF ink = glyph.path->fill().boundingRect();
    if (glyph.edge && glyph.edgeWidth > 0)
        ink |= glyph.path->outline(glyph.edgeWidth).boundingRect();
    else if (glyph.edge)
        ink.adjust(-0.5, -0.5, 0.5, 0.5); // a hairline
    return ink.translated(glyph.baseline);
}

QRectF ParagraphGlyphs::inkOf(const Run& run)
{
    QRectF ink;
    for (qsizetype i = 0; i < std::min(run.indexes.size(), run.positions.size()); ++i)
        if (const QRectF glyph = run.font.boundingRect(run.indexes[i]); !glyph.isEmpty())
            ink |= glyph.translated(run.positions[i]);
    return ink;
}

QRectF ParagraphGlyphs::inkRect() const
{
    QRectF ink;
    for (const Glyph& glyph : m_glyphs)
        ink |= inkOf(glyph);
    for (const Run& run : m_runs)
        ink |= inkOf(run);
    return ink;
}
