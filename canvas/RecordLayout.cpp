#include "canvas/RecordLayout.h"

#include "canvas/CharacterFormat.h"
#include "canvas/ITextSurface.h"
#include "canvas/StyleDocument.h"
#include "canvas/TextObjectConstants.h"
#include "canvas/TextPlacement.h"

#include <QAbstractTextDocumentLayout>
#include <QFontMetricsF>
#include <QRectF>
#include <QTextBlock>
#include <QTextCursor>
#include <QTextDocument>
#include <QTextLayout>
#include <QTextOption>
#include <algorithm>
#include <cmath>
#include <utility>

using namespace TextObjectConstants;

namespace
{

// How far an outline reaches beyond its glyph at a sharp corner, in pen widths.
constexpr double SPIKE_OF_OUTLINE = 2.0;
// Pixels around a paragraph that its caret and the antialiasing of its glyphs may cover.
constexpr double GLYPH_REACH = 6.0;

// Returns whether the document lays both styles out in the same way.
bool sameLayout(const TextStyle& a, const TextStyle& b)
{
    return a.fontIsTheSame(b) && a.getTextKerning() == b.getTextKerning() &&
           (a.isTextEdge() != 0) == (b.isTextEdge() != 0);
}

// Returns the margin on each side of a line.
double marginOf(double lineHeight)
{
    return MARGIN_SHARE_OF_LINE * lineHeight / 2.0;
}

// Returns whether no character is written from right to left.
bool isLeftToRight(const QString& text)
{
    return std::none_of(text.begin(), text.end(), [](QChar c) {
        switch (c.direction()) {
        case QChar::DirR:
        case QChar::DirAL:
        case QChar::DirAN:
        case QChar::DirRLE:
        case QChar::DirRLO:
        case QChar::DirRLI:
        case QChar::DirFSI:
            return true;
        default:
            return c.isSurrogate();
        }
    });
}

bool isMargin(const QTextBlockFormat& format, double margin)
{
    return qFuzzyCompare(format.leftMargin(), margin) && qFuzzyCompare(format.rightMargin(), margin);
}

Qt::Alignment alignmentOf(const TText& record)
{
    switch (record.getTextAlign()) {
    case 0:
        return Qt::AlignHCenter;
    case 1:
        return Qt::AlignRight;
    default:
        return Qt::AlignLeft;
    }
}

} // namespace

RecordLayout::RecordLayout(const TextObjectParts& parts) : m_parts(parts)
{
}

// Returns the margin that probably fits the record, which saves a second layout: while the fonts stay as tall
// as they were, what fitted last.
double RecordLayout::probableMargin()
{
    const double expected = expectedMargin();
    return std::exchange(m_lastExpectedMargin, expected) == expected ? m_lastMargin : expected;
}

// Estimates the margin from the tallest font. Only a line of mixed fonts may be taller.
double RecordLayout::expectedMargin() const
{
    double tallest = 0.0;
    const TextStyle* previous = nullptr;
    for (const TextStyle* style : m_parts.styles.current().textItems()) {
        if (previous && sameLayout(*previous, *style))
            continue;
        const QFont font = CharacterFormat::font(*style, m_parts.surface.canvasRatio());
        const QFontMetricsF metrics(font);
        const double height = metrics.ascent() + metrics.descent() + std::max(0.0, metrics.leading());
        tallest = std::max(tallest, std::ceil(height)); // as in the layout
        previous = style;
    }
    return marginOf(tallest);
}

void RecordLayout::insertRecord()
{
    const StyleDocument& styles = m_parts.styles;
    QTextCursor cursor(&m_parts.document);
    cursor.beginEditBlock();
    cursor.select(QTextCursor::Document);
    cursor.removeSelectedText();
    const double margin = probableMargin();
    QTextBlockFormat format = cursor.blockFormat();
    format.setLeftMargin(margin);
    format.setRightMargin(margin);
    cursor.setBlockFormat(format);
    for (int begin = 0; begin < styles.count();) {
        QString text;
        const TextStyle& first = *styles.at(begin);
        int end = begin;
        do {
            text += StyleDocument::textOf(*styles.at(end));
            ++end;
        } while (end < styles.count() && sameLayout(first, *styles.at(end)));
        cursor.insertText(text, CharacterFormat::layoutFormat(first, m_parts.surface.canvasRatio()));
        begin = end;
    }
    cursor.endEditBlock();
}

void RecordLayout::applyFormats(int begin, int end)
{
    QTextCursor cursor(&m_parts.document);
    cursor.beginEditBlock();
    setFormats(cursor, begin, end);
    cursor.endEditBlock();
}

void RecordLayout::applyStyles(int begin, int end)
{
    QTextCursor cursor(&m_parts.document);
    cursor.beginEditBlock();
    setFormats(cursor, begin, end);
    adjustLeftAndRightMargin(probableMargin());
    cursor.endEditBlock();
}

void RecordLayout::setFormats(QTextCursor& cursor, int begin, int end)
{
    const StyleDocument& styles = m_parts.styles;
    end = std::min(end, m_parts.document.characterCount() - 1);
    while (begin < end) {
        const TextStyle* first = styles.at(begin);
        if (!first)
            break;
        int next = begin + 1;
        while (next < end && styles.at(next) && sameLayout(*first, *styles.at(next)))
            ++next;
        cursor.setPosition(begin);
        cursor.setPosition(next, QTextCursor::KeepAnchor);
        cursor.setCharFormat(CharacterFormat::layoutFormat(*first, m_parts.surface.canvasRatio()));
        begin = next;
    }
}

void RecordLayout::setCaretHeight(const TextStyle& style)
{
    // The height of an empty line is that of the default font; setting this font lays the document out.
    const QFont before = m_parts.document.defaultFont();
    QFont font = before;
    font.setFamily(QString::fromStdString(style.getFontFamily()));
    font.setPixelSize(CharacterFormat::pixelSize(style, m_parts.surface.canvasRatio()));
    if (font == before)
        return;
    m_parts.document.setDefaultFont(font);
    m_lastBlocks = 0; // empty lines have another height now
}

void RecordLayout::updateWidthAndAlign()
{
    QTextDocument& document = m_parts.document;
    m_parts.surface.announceGeometryChange();
    const double margin = lineMargin();
    const double width = naturalWidth(margin);
    const double textWidth = textWidthFor(width);
    if (!hasMargins(margin) || document.textWidth() != textWidth ||
        document.defaultTextOption().alignment() != alignmentOf(m_parts.styles.current())) {
        // Each of them would lay the document out.
        document.setLayoutEnabled(false);
        adjustLeftAndRightMargin(margin);
        setDocumentAlign();
        document.setTextWidth(textWidth);
        document.setLayoutEnabled(true);
    } else if (m_parts.placement.area().size() != document.size()) {
        document.setTextWidth(textWidth); // after a small change the layout would report its size later
    }
    keepAnchor(width);
    m_lastWidth = width;
    m_lastMargin = margin;
    m_lastHeight = document.size().height();
    m_lastBlocks = document.blockCount();
    m_parts.surface.layoutChanged();
}

void RecordLayout::updateAfterTyping(int position, int added)
{
    if (isFitted())
        m_parts.surface.blockChanged(m_parts.document.findBlock(position).blockNumber(),
                                     areaOfTyping(position, added));
    else
        updateWidthAndAlign();
    m_isComposing = false;
}

// Returns where the paragraph may look different, in item coordinates. What stands before the word stays
// where it is if the text runs from left to right and begins at the left margin.
QRectF RecordLayout::areaOfTyping(int position, int added) const
{
    const QTextDocument& document = m_parts.document;
    const QTextBlock block = document.findBlock(position);
    const QString text = block.text();
    const QRectF lines = document.documentLayout()->blockBoundingRect(block);
    QRectF area(0.0, lines.top(), document.size().width(), lines.height());
    if (!m_isComposing && alignmentOf(m_parts.styles.current()) == Qt::AlignLeft &&
        block.layout()->lineCount() == 1 && isLeftToRight(text)) {
        const QTextLine line = block.layout()->lineAt(0);
        const double left = block.layout()->position().x();
        const int column = position - block.position();
        const qsizetype space = column > 1 ? text.lastIndexOf(QLatin1Char(' '), column - 2) : -1;
        area.setLeft(left + line.cursorToX(int(space + 1)));
        if (added > 0)
            area.setRight(left + line.cursorToX(int(text.size())));
    }
    int widest = 0;
    for (int i = block.position(); i < block.position() + int(text.size()); ++i) {
        const TextStyle* style = m_parts.styles.at(i);
        if (style && style->isTextEdge())
            widest = std::max(widest, CharacterFormat::outlineWidth(*style, m_parts.surface.canvasRatio()));
    }
    const double reach = lines.height() / 2.0 + SPIKE_OF_OUTLINE * widest + GLYPH_REACH;
    return area.adjusted(-reach, -reach, reach, reach);
}

// Returns whether updateWidthAndAlign() would leave everything as it is.
bool RecordLayout::isFitted() const
{
    const QTextDocument& document = m_parts.document;
    if (document.blockCount() != m_lastBlocks || document.size().height() != m_lastHeight)
        return false;
    const double margin = lineMargin();
    const double width = naturalWidth(margin);
    return hasMargins(margin) && width == m_lastWidth && textWidthFor(width) == document.textWidth();
}

bool RecordLayout::hasMargins(double margin) const
{
    for (QTextBlock block = m_parts.document.begin(); block.isValid(); block = block.next())
        if (!isMargin(block.blockFormat(), margin))
            return false;
    return true;
}

// Returns the width of the document with these margins and without a text width. Lines never wrap, so the
// text width does not change it, and a layout is not needed. Margins are rounded to 64ths of a pixel, as in
// the layout.
double RecordLayout::naturalWidth(double margin) const
{
    const auto rounded = [](double length) { return std::floor(length * 64.0) / 64.0; };
    const QTextDocument& document = m_parts.document;
    double widest = 0.0;
    for (QTextBlock block = document.begin(); block.isValid(); block = block.next())
        for (int i = 0; i < block.layout()->lineCount(); ++i)
            widest = std::max(widest, block.layout()->lineAt(i).naturalTextWidth());
    return widest + 2.0 * (rounded(margin) + rounded(document.documentMargin()));
}

// Lines that begin at the left margin are where they are whatever the width: without a text width the
// document is as wide as its longest line, and is not laid out again when that changes.
double RecordLayout::textWidthFor(double width) const
{
    if (alignmentOf(m_parts.styles.current()) != Qt::AlignLeft)
        return width;
    for (QTextBlock block = m_parts.document.begin(); block.isValid(); block = block.next())
        if (block.textDirection() == Qt::RightToLeft)
            return width;
    return -1.0;
}

void RecordLayout::finishLayout()
{
    // Each edit, even one that changes nothing, ends with the layout of what is pending.
    QTextCursor cursor(&m_parts.document);
    cursor.beginEditBlock();
    cursor.endEditBlock();
}

// Returns the margin that fits the tallest line.
double RecordLayout::lineMargin() const
{
    double tallest = 0.0;
    for (QTextBlock block = m_parts.document.begin(); block.isValid(); block = block.next())
        if (block.layout()->lineCount() > 0)
            tallest = std::max(tallest, block.layout()->lineAt(0).height());
    return marginOf(tallest);
}

void RecordLayout::adjustLeftAndRightMargin(double margin)
{
    QTextDocument& document = m_parts.document;
    QTextCursor cursor(&document);
    cursor.beginEditBlock();
    for (QTextBlock block = document.begin(); block.isValid(); block = block.next()) {
        QTextBlockFormat format = block.blockFormat();
        if (isMargin(format, margin))
            continue;
        format.setLeftMargin(margin);
        format.setRightMargin(margin);
        cursor.setPosition(block.position());
        cursor.setBlockFormat(format);
    }
    cursor.endEditBlock();
}

void RecordLayout::setDocumentAlign()
{
    QTextOption option = m_parts.document.defaultTextOption();
    const Qt::Alignment wanted = alignmentOf(m_parts.styles.current());
    if (option.alignment() == wanted)
        return;
    option.setAlignment(wanted);
    m_parts.document.setDefaultTextOption(option);
}

void RecordLayout::keepAnchor(double width)
{
    TText& record = m_parts.styles.current();
    const Qt::Alignment align = alignmentOf(record);
    if (!m_parts.placement.isPair() || m_lastWidth == 0.0 || align == Qt::AlignLeft)
        return;
    const double shift = (m_lastWidth - width) * (align == Qt::AlignHCenter ? CENTERPERCNTAGE : 1.0);
    if (shift == 0.0)
        return;
    m_parts.placement.shift(shift);
    record.setXValue(float(m_parts.placement.textPlace().x()));
}
