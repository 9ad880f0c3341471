#include "panel/SizeBoxLineEdit.h"

#include <QPainter>

namespace
{

constexpr int ENABLED = 1;
const QColor ENABLED_COLOR(220, 220, 220);
const QColor DISABLED_COLOR(102, 102, 102);
const QColor SELECTION_COLOR(0, 0, 139);
constexpr int CARET_WIDTH = 2;
constexpr int CARET_MARGIN = 2;

} // namespace

SizeBoxLineEdit::SizeBoxLineEdit(QWidget* parent) : QLineEdit(parent)
{
    setFrame(false);
    setContextMenuPolicy(Qt::NoContextMenu);
    setStyleSheet(QStringLiteral("QLineEdit {border:0; background:transparent; font:20px;}"));
}

void SizeBoxLineEdit::setState(int state)
{
    if (m_state == state)
        return;
    m_state = state;
    update();
}

void SizeBoxLineEdit::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setFont(font());
    drawSelection(painter);
    drawText(painter);
}

// Returns the rectangle of the whole text.
QRect SizeBoxLineEdit::getTextRect() const
{
    return fontMetrics().boundingRect(rect(), Qt::AlignCenter, text());
}

void SizeBoxLineEdit::drawSelection(QPainter& painter) const
{
    const QRect area = getTextRect();
    const QFontMetrics metrics = fontMetrics();
    if (hasSelectedText()) {
        const int left = metrics.horizontalAdvance(text().left(selectionStart()));
        painter.fillRect(
            QRect(area.left() + left, area.top(), metrics.horizontalAdvance(selectedText()), area.height()),
            SELECTION_COLOR);
    } else if (hasFocus() && !isReadOnly()) {
        const int left = text().isEmpty()
                             ? rect().center().x()
                             : area.left() + metrics.horizontalAdvance(text().left(cursorPosition()));
        const int height = metrics.height();
        painter.fillRect(QRect(left, rect().center().y() - height / 2 + CARET_MARGIN, CARET_WIDTH,
                               height - 2 * CARET_MARGIN),
                         ENABLED_COLOR);
    }
}

void SizeBoxLineEdit::drawText(QPainter& painter) const
{
    painter.setPen(m_state == ENABLED ? ENABLED_COLOR : DISABLED_COLOR);
    painter.drawText(rect(), Qt::AlignCenter, text());
}
