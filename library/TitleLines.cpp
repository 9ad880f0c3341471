#include "library/TitleLines.h"

#include <QFontMetrics>
#include <QPaintEvent>
#include <QPainter>
#include <QTextOption>
#include <QtMath>
#include <utility>

namespace
{

QTextLine layOut(QTextLayout& layout, const QString& text, const QFont& font, int width)
{
    // The first letter with a direction decides.
    QTextOption option;
    option.setTextDirection(text.isRightToLeft() ? Qt::RightToLeft : Qt::LeftToRight);
    option.setWrapMode(QTextOption::NoWrap);
    layout.setFont(font);
    layout.setText(text);
    layout.setTextOption(option);
    layout.beginLayout();
    QTextLine line = layout.createLine();
    if (line.isValid())
        line.setLineWidth(width);
    layout.endLayout();
    return line;
}

void setLine(QTextLayout& layout, const QString& text, const QFont& font, int width)
{
    const QTextLine line = layOut(layout, text, font, width);
    if (line.isValid() && line.naturalTextWidth() > width)
        layOut(layout, QFontMetrics(font).elidedText(text, Qt::ElideRight, width), font, width);
}

} // namespace

TitleLines::TitleLines(const Form& form, QWidget* parent) : QWidget(parent), m_form(form)
{
    for (QTextLayout& line : m_lines)
        line.setCacheEnabled(true);
}

void TitleLines::setTexts(const QStringList& texts, const QString& family)
{
    m_font = QFont(family);
    m_font.setPixelSize(m_form.fontHeight);
    m_texts = texts;
    m_isLaidOut = false;
    update();
}

void TitleLines::setLineWidth(int width)
{
    m_form.line.setWidth(width);
    m_isLaidOut = false;
    update();
}

const TitleLines::Lines& TitleLines::laidOut() const
{
    if (std::exchange(m_isLaidOut, true))
        return m_lines;
    const QStringList lines =
        m_texts.size() == 1 ? brokenIntoLines(m_texts.constFirst().simplified()) : m_texts;
    for (std::size_t i = 0; i < COUNT; ++i)
        setLine(m_lines[i], lines.value(static_cast<qsizetype>(i)).simplified(), m_font, textRect(0).width());
    return m_lines;
}

// The last line takes the rest of the text.
QStringList TitleLines::brokenIntoLines(const QString& text) const
{
    QStringList lines;
    QTextLayout layout(text, m_font);
    QTextOption wrapping;
    wrapping.setWrapMode(QTextOption::WrapAtWordBoundaryOrAnywhere);
    layout.setTextOption(wrapping);
    layout.beginLayout();
    while (lines.size() < static_cast<qsizetype>(COUNT)) {
        QTextLine line = layout.createLine();
        if (!line.isValid())
            break;
        line.setLineWidth(textRect(0).width());
        const bool isLast = lines.size() == static_cast<qsizetype>(COUNT) - 1;
        lines.append(text.mid(line.textStart(), isLast ? -1 : line.textLength()));
    }
    layout.endLayout();
    return lines;
}

QStringList TitleLines::lines() const
{
    QStringList texts;
    for (const QTextLayout& line : laidOut())
        texts.append(line.text());
    return texts;
}

QRect TitleLines::lineRect(int index) const
{
    return QRect(QPoint(0, m_form.top + index * m_form.line.height()), m_form.line);
}

QRect TitleLines::textRect(int index) const
{
    return lineRect(index).adjusted(m_form.padding, 0, -m_form.padding, 0);
}

// A line from right to left begins on the right. Centres the line or, if it is higher than its place, aligns
// it at the bottom: some families, including substitutes for missing characters, have more space above and
// below than the place, and descenders must not be cut off.
QPointF TitleLines::linePosition(std::size_t index) const
{
    const QRect place = textRect(static_cast<int>(index));
    const QTextLine line = m_lines[index].lineAt(0);
    const qreal height = line.ascent() + line.descent(); // QTextLine::height() is rounded up
    const qreal above = place.height() - height;
    const bool fits = qCeil(height) <= place.height();
    const bool isFromRight = m_lines[index].text().isRightToLeft();
    const qreal indent = isFromRight ? place.width() - line.horizontalAdvance() : 0;
    return QPointF(place.x() + indent, place.y() + (fits ? above / 2 : above));
}

void TitleLines::paintEvent(QPaintEvent* event)
{
    QPainter painter(this);
    if (m_form.background.isValid())
        painter.fillRect(event->rect(), m_form.background);
    painter.setPen(m_form.text);
    const Lines& lines = laidOut();
    for (std::size_t i = 0; i < COUNT; ++i) {
        const QRect place = lineRect(static_cast<int>(i));
        if (lines[i].text().isEmpty() || !place.intersects(event->rect()))
            continue;
        painter.setClipRect(place); // of a high line
        lines[i].draw(&painter, linePosition(i));
    }
}
