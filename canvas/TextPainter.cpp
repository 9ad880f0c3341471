#include "canvas/TextPainter.h"

#include "canvas/CharacterFormat.h"
#include "canvas/GlyphMasks.h"
#include "canvas/StyleDocument.h"

#include <QAbstractTextDocumentLayout>
#include <QApplication>
#include <QPainter>
#include <QPainterPathStroker>
#include <QPalette>
#include <QTextBlock>
#include <QTextBoundaryFinder>
#include <QTextCursor>
#include <QTextDocument>
#include <algorithm>

using namespace TextObjectConstants;

namespace
{
// Position of the baseline within the height of a line.
constexpr double BASELINE_SHARE = 0.85;
constexpr double CARET_SHIFT = 1.0;
constexpr double FRAME_RADIUS = 1.0;
// Pixels; the font system caches bitmaps of smaller characters.
constexpr int LARGEST_BITMAP_GLYPH = 64;
const QColor SELECTED_FILL(0, 128, 255, 77);
const QColor EDIT_FILL(0, 0, 0, 77);

// Returns the visible area of the painter's device, in the painter's coordinates.
QRectF visibleArea(const QPainter& painter)
{
    bool invertible = false;
    const QTransform back = painter.combinedTransform().inverted(&invertible);
    const QRectF device(0.0, 0.0, painter.device()->width(), painter.device()->height());
    return invertible ? back.mapRect(device) : QRectF();
}

bool isSpace(const QString& text)
{
    return std::all_of(text.begin(), text.end(), [](QChar c) { return c.isSpace(); });
}
} // namespace

TextPainter::TextPainter(const QTextDocument& document, const StyleDocument& styles)
    : m_document(document), m_styles(styles), m_carets(document)
{
}

void TextPainter::setRatio(double ratio)
{
    m_ratio = ratio;
    invalidate();
}

void TextPainter::invalidate()
{
    m_valid = false;
    ++m_version;
    m_carets.invalidate();
}

void TextPainter::addGlyph(int position, const QString& text, const CaretGeometry::Caret& caret)
{
    const TextStyle* style = m_styles.at(position);
    if (!style || isSpace(text))
        return;
    const QFont font = CharacterFormat::font(*style, m_ratio);
    Glyph glyph;
    glyph.path = GlyphPathCache::glyph(font, text);
    glyph.baseline = QPointF(caret.x - CARET_SHIFT, caret.top + BASELINE_SHARE * caret.height);
    glyph.color = CharacterFormat::color(style->getFontColor());
    glyph.color.setAlpha(255);
    glyph.edge = style->isTextEdge() != 0 && glyph.path->hasPath();
    if (glyph.edge) {
        glyph.edgeColor = CharacterFormat::color(style->textEdge().getEdgeColor());
        glyph.edgeWidth = CharacterFormat::outlineWidth(*style, m_ratio);
    }
    // No glyph of a usable font extends farther than this from its baseline.
    const double extent = 2.0 * font.pixelSize() * double(text.size()) + glyph.edgeWidth;
    const QRectF reach(glyph.baseline - QPointF(extent, extent), QSizeF(2.0 * extent, 2.0 * extent));
    // A glyph with an outline is drawn as a path, so that both fit exactly. Other small characters look best
    // when the font system draws them.
    if (!glyph.path->hasPath() || (!glyph.edge && font.pixelSize() < LARGEST_BITMAP_GLYPH)) {
        addRuns(glyph, reach);
        return;
    }
    m_steps.push_back({false, m_glyphs.size(), reach});
    m_glyphs.push_back(std::move(glyph));
}

void TextPainter::addRuns(const Glyph& glyph, const QRectF& reach)
{
    for (const QGlyphRun& source : glyph.path->runs()) {
        QList<QPointF> positions = source.positions();
        for (QPointF& position : positions)
            position += glyph.baseline;
        if (!m_steps.empty() && m_steps.back().isRun) {
            PendingRun& last = m_pending.back();
            if (last.color == glyph.color && last.font == source.rawFont()) {
                last.indexes += source.glyphIndexes();
                last.positions += positions;
                m_steps.back().reach |= reach;
                continue;
            }
        }
        m_steps.push_back({true, m_pending.size(), reach});
        m_pending.push_back({source.rawFont(), glyph.color, source.glyphIndexes(), positions});
    }
}

void TextPainter::collectBlock(const QTextBlock& block)
{
    m_carets.caretsOfBlock(block, m_blockCarets);
    const QString text = block.text();
    QTextBoundaryFinder finder(QTextBoundaryFinder::Grapheme, text);
    qsizetype begin = 0;
    while (begin < text.size()) {
        finder.setPosition(begin);
        qsizetype end = finder.toNextBoundary();
        if (end <= begin)
            end = text.size();
        if (text.at(begin) != QChar::LineSeparator)
            addGlyph(block.position() + int(begin), text.mid(begin, end - begin),
                     m_blockCarets[size_t(begin)]);
        begin = end;
    }
}

void TextPainter::collectGlyphs()
{
    if (m_valid)
        return;
    // Kept until the new glyphs are made, so that their paths stay available even when the cache is full.
    const std::vector<Glyph> previous = std::move(m_glyphs);
    m_glyphs.clear();
    m_runs.clear();
    m_steps.clear();
    for (QTextBlock block = m_document.begin(); block.isValid(); block = block.next())
        collectBlock(block);
    m_runs.reserve(m_pending.size());
    for (const PendingRun& pending : m_pending) {
        Run run;
        run.color = pending.color;
        run.glyphs.setRawFont(pending.font);
        run.glyphs.setGlyphIndexes(pending.indexes);
        run.glyphs.setPositions(pending.positions);
        m_runs.push_back(std::move(run));
    }
    m_pending.clear();
    m_valid = true;
}

void TextPainter::drawItemTextOutLine(QPainter* painter, const QTransform& origin,
                                      const QRectF& visible) const
{
    for (const Step& step : m_steps) {
        if (step.isRun || !m_glyphs[step.index].edge || !visible.intersects(step.reach))
            continue;
        const Glyph& glyph = m_glyphs[step.index];
        painter->setWorldTransform(QTransform(origin).translate(glyph.baseline.x(), glyph.baseline.y()));
        if (glyph.edgeWidth > 0) {
            GlyphMasks::fillOutline(*painter, *glyph.path, glyph.edgeWidth, glyph.edgeColor);
        } else {
            const QPen hairline(glyph.edgeColor, 0, Qt::SolidLine, Qt::SquareCap, Qt::SvgMiterJoin);
            painter->strokePath(glyph.path->contour(), hairline);
        }
    }
}

void TextPainter::drawItemText(QPainter* painter, const QRectF& exposed)
{
    collectGlyphs();
    const bool antialiasing = painter->testRenderHint(QPainter::Antialiasing);
    const QTransform origin = painter->worldTransform();
    painter->setRenderHint(QPainter::Antialiasing);
    const QRectF visible = visibleArea(*painter) & exposed.adjusted(-1.0, -1.0, 1.0, 1.0);
    drawItemTextOutLine(painter, origin, visible);
    for (const Step& step : m_steps) {
        if (!visible.intersects(step.reach))
            continue;
        if (step.isRun) {
            const Run& run = m_runs[step.index];
            painter->setWorldTransform(origin);
            painter->setPen(run.color);
            painter->drawGlyphRun(QPointF(), run.glyphs);
        } else {
            const Glyph& glyph = m_glyphs[step.index];
            painter->setWorldTransform(QTransform(origin).translate(glyph.baseline.x(), glyph.baseline.y()));
            GlyphMasks::fill(*painter, *glyph.path, glyph.color);
        }
    }
    painter->setWorldTransform(origin);
    painter->setRenderHint(QPainter::Antialiasing, antialiasing);
}

QRectF TextPainter::inkOf(const Glyph& glyph)
{
    QRectF ink = glyph.path->fill().boundingRect();
    if (glyph.edge && glyph.edgeWidth > 0)
        ink |= glyph.path->outline(glyph.edgeWidth).boundingRect();
    else if (glyph.edge)
        ink.adjust(-0.5, -0.5, 0.5, 0.5); // a hairline
    return ink.translated(glyph.baseline);
}

QRectF TextPainter::inkOf(const Run& run)
{
    const QRawFont font = run.glyphs.rawFont();
    const QList<quint32> indexes = run.glyphs.glyphIndexes();
    const QList<QPointF> positions = run.glyphs.positions();
    QRectF ink;
    for (qsizetype i = 0; i < std::min(indexes.size(), positions.size()); ++i)
        if (const QRectF glyph = font.boundingRect(indexes[i]); !glyph.isEmpty())
            ink |= glyph.translated(positions[i]);
    return ink;
}

QRectF TextPainter::inkRect()
{
    collectGlyphs();
    QRectF ink;
    for (const Glyph& glyph : m_glyphs)
        ink |= inkOf(glyph);
    for (const Run& run : m_runs)
        ink |= inkOf(run);
    return ink;
}

void TextPainter::drawItemBoundingRect(QPainter* painter, const QRectF& rect, int status)
{
    prepareFrame(rect);
    painter->setRenderHint(QPainter::Antialiasing, false);
    painter->fillRect(m_frame.rect, status == FocusObject ? SELECTED_FILL : EDIT_FILL);
    painter->setRenderHint(QPainter::Antialiasing);
    if (status == FocusObject) {
        painter->fillPath(m_frame.solid, QColor(ITEMBOUNDINGSOLIDCOLOR));
        return;
    }
    painter->fillPath(m_frame.solid, QColor(ITEMBOUNDINGDOTUPCOLOR));
    painter->setRenderHint(QPainter::Antialiasing, false);
    painter->setPen(Qt::NoPen);
    painter->setBrush(QColor(ITEMBOUNDINGDOTDOWNCOLOR));
    painter->drawRects(m_frame.dots);
}

void TextPainter::prepareFrame(const QRectF& rect)
{
    if (m_frame.rect == rect)
        return;
    QPainterPath outline;
    outline.addRoundedRect(rect, FRAME_RADIUS, FRAME_RADIUS);
    m_frame.rect = rect;
    m_frame.solid = QPainterPathStroker(QPen(Qt::black, ITEMBOUNDINGWIDTH)).createStroke(outline);
    m_frame.solid.setFillRule(Qt::WindingFill);

    // Draws a dotted line with square caps: dots two pen widths long, one pen width apart.
    constexpr double pen = ITEMBOUNDINGWIDTH;
    m_frame.dots.clear();
    for (double x = rect.left(); x < rect.right(); x += 3.0 * pen) {
        const double length = std::min(2.0 * pen, rect.right() + pen - x);
        for (const double y : {rect.top(), rect.bottom()})
            m_frame.dots.append(QRectF(x - pen / 2.0, y - pen / 2.0, length, pen));
    }
    for (double y = rect.top(); y < rect.bottom(); y += 3.0 * pen) {
        const double length = std::min(2.0 * pen, rect.bottom() + pen - y);
        for (const double x : {rect.left(), rect.right()})
            m_frame.dots.append(QRectF(x - pen / 2.0, y - pen / 2.0, pen, length));
    }
}

void TextPainter::drawSelection(QPainter* painter, const QTextCursor& cursor, bool hasFocus)
{
    if (!cursor.hasSelection())
        return;
    QAbstractTextDocumentLayout::PaintContext context;
    context.palette = QApplication::palette();
    const auto group = hasFocus ? QPalette::Active : QPalette::Inactive;
    QAbstractTextDocumentLayout::Selection selection;
    selection.cursor = cursor;
    selection.format.setBackground(context.palette.brush(group, QPalette::Highlight));
    selection.format.setForeground(context.palette.brush(group, QPalette::HighlightedText));
    context.selections.append(selection);
    m_document.documentLayout()->draw(painter, context);
}
