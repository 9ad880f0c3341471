#include "canvas/TextPainter.h"

#include "canvas/GlyphPathCache.h"
#include "canvas/StyleDocument.h"

#include <QAbstractTextDocumentLayout>
#include <QApplication>
#include <QPainter>
#include <QPainterPathStroker>
#include <QPalette>
#include <QTextBlock>
#include <QTextCursor>
#include <QTextDocument>
#include <QTransform>
#include <algorithm>

using namespace TextObjectConstants;

namespace
{
constexpr double FRAME_RADIUS = 1.0;
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
    for (ParagraphGlyphs& paragraph : m_paragraphs)
        paragraph.discard();
    ++m_version;
    m_carets.invalidate();
}

bool TextPainter::invalidateParagraph(int number)
{
    ++m_version;
    m_carets.invalidate();
    if (number >= 0 && size_t(number) < m_paragraphs.size())
        m_paragraphs[size_t(number)].discard();
    return m_fontGeneration == GlyphPathCache::generation();
}

void TextPainter::recordGlyphs()
{
    if (m_fontGeneration != GlyphPathCache::generation()) {
        invalidate();
        m_fontGeneration = GlyphPathCache::generation();
    }
    m_paragraphs.resize(size_t(m_document.blockCount()));
    QTextBlock block = m_document.begin();
    for (ParagraphGlyphs& paragraph : m_paragraphs) {
        if (!paragraph.isRecorded())
            paragraph.record(block, m_carets, m_styles, m_ratio);
        block = block.next();
    }
}

void TextPainter::drawItemText(QPainter* painter, const QRectF& exposed)
{
    recordGlyphs();
    const bool antialiasing = painter->testRenderHint(QPainter::Antialiasing);
    const QTransform origin = painter->worldTransform();
    painter->setRenderHint(QPainter::Antialiasing);
    const QRectF visible = visibleArea(*painter) & exposed.adjusted(-1.0, -1.0, 1.0, 1.0);
    for (const ParagraphGlyphs& paragraph : m_paragraphs)
        paragraph.drawOutlines(*painter, origin, visible);
    for (const ParagraphGlyphs& paragraph : m_paragraphs)
        paragraph.draw(*painter, origin, visible);
    painter->setWorldTransform(origin);
    painter->setRenderHint(QPainter::Antialiasing, antialiasing);
}

QRectF TextPainter::inkRect()
{
    recordGlyphs();
    QRectF ink;
    for (const ParagraphGlyphs& paragraph : m_paragraphs)
        ink |= paragraph.inkRect();
    return ink;
}

void TextPainter::drawItemBoundingRect(QPainter* painter, const QRectF& rect, int status,
                                       const QRectF& exposed)
{
    prepareFrame(rect);
    painter->setRenderHint(QPainter::Antialiasing, false);
    painter->fillRect(m_frame.rect, status == FocusObject ? SELECTED_FILL : EDIT_FILL);
    painter->setRenderHint(QPainter::Antialiasing);
    constexpr double inside = ITEMBOUNDINGWIDTH;
    if (m_frame.rect.adjusted(inside, inside, -inside, -inside).contains(exposed))
        return; // nothing of the line
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
