#include "canvas/CaretPainter.h"

#include "canvas/CaretGeometry.h"
#include "canvas/CharacterFormat.h"
#include "canvas/ITextSurface.h"
#include "canvas/StyleDocument.h"
#include "canvas/TextObjectConstants.h"

#include <QFontMetricsF>
#include <QPainter>
#include <QPixmap>
#include <QTextBlock>
#include <QTextCursor>
#include <QTextDocument>
#include <QTextLayout>
#include <algorithm>

using namespace TextObjectConstants;

namespace
{

const QColor CARET_COLOR(0, 232, 0);
const QColor DraggedSelection(Qt::darkBlue);
constexpr double CARET_WIDTH = 2.0;
constexpr double HANDLE_LINE_WIDTH = 3.0;
constexpr double BASELINE_SHARE = 0.85;
constexpr double CARET_OVERHANG = 3.0;

const QPixmap& unpressedPicture()
{
    static const QPixmap picture(UN_PRESSED_CARET_PIXMAP_PATH);
    return picture;
}

const QPixmap& pressedPicture()
{
    static const QPixmap picture(PRESSED_CARET_PIXMAP_PATH);
    return picture;
}

} // namespace

CaretPainter::CaretPainter(const TextObjectParts& parts, TouchState& state) : m_parts(parts), m_state(state)
{
}

bool CaretPainter::noHandleCursor() const
{
    if (m_state.isHandleHeld())
        return false;
    if (!m_state.handleCaret)
        return true;
    return !m_parts.surface.selection().hasSelection() && m_state.previous.position < 0;
}

void CaretPainter::refreshHandles()
{
    if (!m_state.handleCaret)
        return;
    const QTextCursor cursor = m_parts.surface.selection();
    if (cursor.hasSelection()) {
        m_state.previous.position = cursor.anchor();
        m_state.current.position = cursor.position();
    }
    CaretGeometry& carets = m_parts.carets;
    TouchState::End& current = m_state.current;
    carets.caretPoint(current.line, current.point, current.block, cursor.position());
    if (!cursor.hasSelection()) {
        const int position = m_state.previous.position;
        m_state.previous = current;
        m_state.previous.position = position;
        return;
    }
    TouchState::End& previous = m_state.previous;
    carets.caretPoint(previous.line, previous.point, previous.block, previous.position);
}

void CaretPainter::adjustCurPosToPaintSelectionWhenContinueSelect()
{
    QTextCursor cursor = m_parts.surface.selection();
    if (!m_state.isHandleHeld() || cursor.hasSelection())
        return;
    if (cursor.position() == m_state.previous.position || cursor.position() == m_state.current.position)
        return;
    if (m_state.current.position < 0 || m_state.current.position >= m_parts.document.characterCount())
        return;
    cursor.setPosition(m_state.current.position);
    m_parts.surface.select(cursor);
}

void CaretPainter::paintSelectionWhenContinueSelect(QPainter* painter) const
{
    if (!m_state.isHandleHeld() || m_parts.surface.selection().hasSelection() ||
        m_state.previous.position < 0)
        return;
    if (m_state.previous.block != m_state.current.block) {
        paintShadowBlockFromPreviousCaretToCurrentCaret(painter);
        return;
    }
    const QPointF bottom = m_state.current.point + QPointF(HANDLEPIXMAPWIDTH / 2.0, 0.0);
    painter->fillRect(QRectF(m_state.previous.line.p1(), bottom).normalized(), DraggedSelection);
}

void CaretPainter::paintShadowBlockFromPreviousCaretToCurrentCaret(QPainter* painter) const
{
    const bool forward = m_state.previous.block < m_state.current.block;
    const TouchState::End& first = forward ? m_state.previous : m_state.current;
    const TouchState::End& last = forward ? m_state.current : m_state.previous;
    CaretGeometry& carets = m_parts.carets;
    for (int number = first.block; number <= last.block; ++number) {
        const QTextBlock block = m_parts.document.findBlockByNumber(number);
        if (!block.isValid())
            continue;
        TouchState::End begin;
        TouchState::End end;
        carets.caretPoint(begin.line, begin.point, begin.block, block.position());
        carets.caretPoint(end.line, end.point, end.block, block.position() + block.length() - 1);
        const double left = number == first.block ? first.line.x1() : begin.line.x1();
        const double right = number == last.block ? last.line.x1() : end.line.x1();
        painter->fillRect(QRectF(QPointF(left, begin.line.y1()), QPointF(right, end.line.y2())).normalized(),
                          DraggedSelection);
    }
}

void CaretPainter::paintCaretAndHandles(QPainter* painter)
{
    adjustCurPosToPaintSelectionWhenContinueSelect();
    painter->setBrush(Qt::NoBrush);
    if (m_state.isHandleHeld()) {
        paintCursor(painter);
        paintMovingHandles(painter);
    } else if (m_state.handleCaret) {
        showCursorForSelecting(painter);
    } else {
        paintCursor(painter);
    }
}

void CaretPainter::paintCursor(QPainter* painter) const
{
    const int position = m_parts.surface.selection().position();
    const StyleDocument& styles = m_parts.styles;
    if (position < 0 || position > styles.count())
        return;
    TouchState::End caret;
    if (!m_parts.carets.caretPoint(caret.line, caret.point, caret.block, position))
        return;
    const TextStyle* style = styles.at(std::max(position - 1, 0));
    const QFont font =
        style ? CharacterFormat::font(*style, m_parts.surface.canvasRatio()) : m_parts.document.defaultFont();
    const double length = caret.line.length();
    const double top = caret.line.y1();
    const double ascentTop = top + BASELINE_SHARE * length - QFontMetricsF(font).height() - CARET_OVERHANG;
    painter->setPen(QPen(CARET_COLOR, CARET_WIDTH));
    painter->drawLine(
        QLineF(caret.line.x1(), std::max(top, ascentTop), caret.line.x1(), top + length + CARET_OVERHANG));
}

void CaretPainter::drawHandle(QPainter* painter, const TouchState::End& end, const QPixmap& picture)
{
    painter->drawPixmap(QRectF(end.point, QSizeF(HANDLEPIXMAPWIDTH, HANDLEPIXMAPHEIGHT)), picture,
                        QRectF(picture.rect()));
}

void CaretPainter::paintMovingHandles(QPainter* painter) const
{
    painter->setPen(QPen(CARET_COLOR, HANDLE_LINE_WIDTH));
    painter->drawLine(m_state.previous.line);
    painter->drawLine(m_state.current.line);
    drawHandle(painter, m_state.previous, unpressedPicture());
    drawHandle(painter, m_state.current, pressedPicture());
}

void CaretPainter::showCursorForSelecting(QPainter* painter)
{
    refreshHandles();
    painter->setPen(QPen(CARET_COLOR, HANDLE_LINE_WIDTH));
    drawCurPosPixmap(painter);
    if (!m_parts.surface.selection().hasSelection())
        return;
    painter->drawLine(m_state.previous.line);
    drawHandle(painter, m_state.previous, unpressedPicture());
}

void CaretPainter::drawCurPosPixmap(QPainter* painter) const
{
    if (m_state.previous.position < 0)
        return;
    switch (m_state.gesture) {
    case TouchState::Gesture::None:
        painter->drawLine(m_state.current.line);
        drawHandle(painter, m_state.current, unpressedPicture());
        break;
    case TouchState::Gesture::Press:
    case TouchState::Gesture::DoubleTap:
        if (m_parts.surface.selection().position() == m_state.current.position)
            drawHandle(painter, m_state.current, pressedPicture());
        break;
    default:
        painter->drawLine(m_state.current.line);
        drawHandle(painter, m_state.current, pressedPicture());
        break;
    }
}
