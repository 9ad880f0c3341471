#include "canvas/RecordLayout.h"

#include "canvas/CharacterFormat.h"
#include "canvas/ITextSurface.h"
#include "canvas/StyleDocument.h"
#include "canvas/TextObjectConstants.h"
#include "canvas/TextPlacement.h"

#include <QFontMetricsF>
#include <QTextBlock>
#include <QTextCursor>
#include <QTextDocument>
#include <QTextLayout>
#include <QTextOption>
#include <algorithm>
#include <cmath>

using namespace TextObjectConstants;

namespace
{

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

} // namespace

RecordLayout::RecordLayout(const TextObjectParts& parts) : m_parts(parts)
{
}

// Estimates the margins from the tallest font, which saves a second layout. Only a line of mixed fonts may be
// taller.
double RecordLayout::expectedMargin() const
{
    double tallest = 0.0;
    const TextStyle* previous = nullptr;
    for (const TextStyle* style : m_parts.styles.current().textItems()) {
        if (previous && sameLayout(*previous, *style))
            continue;
        const QFont font = CharacterFormat::font(*style, m_parts.surface.canvasRatio());
        tallest = std::max(tallest, QFontMetricsF(font).height());
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
    const double margin = expectedMargin();
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
    const StyleDocument& styles = m_parts.styles;
    end = std::min(end, m_parts.document.characterCount() - 1);
    QTextCursor cursor(&m_parts.document);
    cursor.beginEditBlock();
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
    cursor.endEditBlock();
}

void RecordLayout::setCaretHeight(const TextStyle& style)
{
    // The height of an empty line is that of the default font; setting this font lays the document out.
    const QFont before = m_parts.document.defaultFont();
    QFont font = before;
    font.setFamily(QString::fromStdString(style.getFontFamily()));
    font.setPixelSize(CharacterFormat::pixelSize(style, m_parts.surface.canvasRatio()));
    if (font != before)
        m_parts.document.setDefaultFont(font);
}

void RecordLayout::updateWidthAndAlign()
{
    m_parts.surface.announceGeometryChange();
    adjustLeftAndRightMargin();
    const double width = naturalWidth();
    if (m_parts.document.textWidth() != width)
        m_parts.document.setTextWidth(width);
    setDocumentAlign(width);
    m_lastWidth = width;
    m_lastHeight = m_parts.document.size().height();
    m_lastBlocks = m_parts.document.blockCount();
    m_parts.surface.layoutChanged();
}

void RecordLayout::updateAfterTyping(int position)
{
    if (isFitted())
        m_parts.surface.blockChanged(position);
    else
        updateWidthAndAlign();
}

// Returns whether updateWidthAndAlign() would leave everything as it is.
bool RecordLayout::isFitted() const
{
    const QTextDocument& document = m_parts.document;
    if (document.blockCount() != m_lastBlocks || document.size().height() != m_lastHeight)
        return false;
    const double margin = lineMargin();
    for (QTextBlock block = document.begin(); block.isValid(); block = block.next()) {
        const QTextBlockFormat format = block.blockFormat();
        if (!qFuzzyCompare(format.leftMargin(), margin) || !qFuzzyCompare(format.rightMargin(), margin))
            return false;
    }
    const double width = naturalWidth();
    return width == m_lastWidth && width == document.textWidth();
}

// Returns the width of the document without a text width. Lines never wrap, so the text width does not change
// it, and a second layout is not needed. Margins are rounded to 64ths of a pixel, as in the layout.
double RecordLayout::naturalWidth() const
{
    const auto rounded = [](double margin) { return std::floor(margin * 64.0) / 64.0; };
    const QTextDocument& document = m_parts.document;
    double widest = 0.0;
    for (QTextBlock block = document.begin(); block.isValid(); block = block.next()) {
        const QTextBlockFormat format = block.blockFormat();
        const double margins = rounded(format.leftMargin()) + rounded(format.rightMargin());
        for (int i = 0; i < block.layout()->lineCount(); ++i)
            widest = std::max(widest, block.layout()->lineAt(i).naturalTextWidth() + margins);
    }
    return widest + 2.0 * rounded(document.documentMargin());
}

void RecordLayout::finishLayout()
{
    m_parts.document.setTextWidth(-1.0);
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

void RecordLayout::adjustLeftAndRightMargin()
{
    QTextDocument& document = m_parts.document;
    const double margin = lineMargin();
    QTextCursor cursor(&document);
    cursor.beginEditBlock();
    for (QTextBlock block = document.begin(); block.isValid(); block = block.next()) {
        QTextBlockFormat format = block.blockFormat();
        if (qFuzzyCompare(format.leftMargin(), margin) && qFuzzyCompare(format.rightMargin(), margin))
            continue;
        format.setLeftMargin(margin);
        format.setRightMargin(margin);
        cursor.setPosition(block.position());
        cursor.setBlockFormat(format);
    }
    cursor.endEditBlock();
}

void RecordLayout::setDocumentAlign(double width)
{
    TText& record = m_parts.styles.current();
    const int align = record.getTextAlign();
    const Qt::Alignment wanted =
        align == 0 ? Qt::AlignHCenter : (align == 1 ? Qt::AlignRight : Qt::AlignLeft);
    QTextOption option = m_parts.document.defaultTextOption();
    if (option.alignment() != wanted) {
        option.setAlignment(wanted);
        m_parts.document.setDefaultTextOption(option);
    }
    if (!m_parts.placement.isPair() || m_lastWidth == 0.0 || (align != 0 && align != 1))
        return;
    const double shift = (m_lastWidth - width) * (align == 0 ? CENTERPERCNTAGE : 1.0);
    if (shift == 0.0)
        return;
    m_parts.placement.shift(shift);
    record.setXValue(float(m_parts.placement.textPlace().x()));
}
