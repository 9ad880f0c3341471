#include "canvas/CaretGeometry.h"

#include "canvas/TextObjectConstants.h"

#include <QTextBlock>
#include <QTextLayout>
#include <algorithm>

namespace
{
// The caret is drawn one pixel right of its character; the last line ends three pixels above the lower
// margin.
constexpr double CARET_SHIFT = 1.0;
constexpr double LAST_LINE_LIFT = 3.0;

QTextLine lineOf(const QTextBlock& block, int column)
{
    const QTextLine line = block.layout()->lineForTextPosition(column);
    return line.isValid() || block.layout()->lineCount() == 0 ? line : block.layout()->lineAt(0);
}
} // namespace

CaretGeometry::CaretGeometry(const QTextDocument& document) : m_document(document)
{
}

void CaretGeometry::refresh()
{
    if (m_valid)
        return;
    // Reading the size completes a pending layout.
    m_documentHeight = m_document.size().height();
    m_heightsAbove.clear();
    double above = 0.0;
    for (QTextBlock block = m_document.begin(); block.isValid(); block = block.next()) {
        m_heightsAbove.push_back(above);
        const QTextLayout* layout = block.layout();
        for (int i = 0; i < layout->lineCount(); ++i)
            above += layout->lineAt(i).height();
    }
    m_valid = true;
}

double CaretGeometry::heightAbove(int blockNumber)
{
    refresh();
    const bool known = blockNumber >= 0 && size_t(blockNumber) < m_heightsAbove.size();
    return m_document.documentMargin() + (known ? m_heightsAbove[size_t(blockNumber)] : 0.0);
}

double CaretGeometry::bottomOf(const QTextBlock& block, const QTextLine& line) const
{
    const double margin = m_document.documentMargin();
    if (!block.next().isValid() && line.lineNumber() == block.layout()->lineCount() - 1)
        return m_documentHeight - LAST_LINE_LIFT - margin;
    return line.y() + line.height() + margin + m_heightsAbove[size_t(block.blockNumber())];
}

bool CaretGeometry::caretPoint(QLineF& line, QPointF& point, int& block, int position)
{
    if (position < 0)
        return false;
    refresh();
    const QTextBlock textBlock = m_document.findBlock(position);
    if (!textBlock.isValid())
        return false;
    const int column = position - textBlock.position();
    const QTextLine textLine = lineOf(textBlock, column);
    if (!textLine.isValid())
        return false;
    const double x = textLine.cursorToX(column) + CARET_SHIFT + m_document.documentMargin();
    const double bottom = bottomOf(textBlock, textLine);
    line = QLineF(x, bottom - textLine.height(), x, bottom);
    point = QPointF(x - TextObjectConstants::HANDLEPIXMAPWIDTH / 2.0, bottom);
    block = textBlock.blockNumber();
    return true;
}

void CaretGeometry::caretsOfBlock(const QTextBlock& block, std::vector<Caret>& carets)
{
    refresh();
    carets.clear();
    carets.resize(size_t(block.length()));
    const double margin = m_document.documentMargin();
    for (int i = 0; i < block.layout()->lineCount(); ++i) {
        const QTextLine line = block.layout()->lineAt(i);
        const double top = bottomOf(block, line) - line.height();
        // The line also has the text that an input method composes, which is not in the block.
        const int end = std::min(line.textStart() + line.textLength(), block.length());
        for (int column = line.textStart(); column < end; ++column)
            carets[size_t(column)] = {line.cursorToX(column) + CARET_SHIFT + margin, top, line.height()};
    }
}
