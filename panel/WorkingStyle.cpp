#include "panel/WorkingStyle.h"

#include <QPoint>
#include <algorithm>

const QList<int>& WorkingStyle::kernings()
{
    static const QList<int> table{80, 90, 100, 110, 120};
    return table;
}

const QList<TShadow>& WorkingStyle::shadows()
{
    static const QList<TShadow> table = [] {
        const QPoint directions[] = {
            {0, 0}, {SHADOW_OFFSET, SHADOW_OFFSET}, {0, SHADOW_OFFSET}, {-SHADOW_OFFSET, SHADOW_OFFSET}};
        QList<TShadow> made;
        for (const QPoint& direction : directions) {
            TShadow shadow;
            shadow.setShadowColor(SHADOW_COLOR);
            shadow.setShadowDirectionX(direction.x());
            shadow.setShadowDirectionY(direction.y());
            made.append(shadow);
        }
        return made;
    }();
    return table;
}

// Calls the edit with each character's style and its index.
template <typename Edit>
void WorkingStyle::editAll(Edit edit)
{
    if (!m_record)
        return;
    qsizetype index = 0;
    for (TextStyle* item : m_record->textItems())
        edit(*item, index++);
}

void WorkingStyle::setFamily(const QString& family)
{
    editAll([name = family.toStdString()](TextStyle& item, qsizetype) { item.setFontFamily(name); });
}

void WorkingStyle::setSizes(const QList<int>& sizes)
{
    editAll([&sizes](TextStyle& item, qsizetype index) {
        if (index < sizes.size())
            item.setFontSize(sizes.at(index));
    });
}

void WorkingStyle::setBold(int bold)
{
    editAll([bold](TextStyle& item, qsizetype) { item.setFontBold(bold); });
}

void WorkingStyle::setItalic(int italic)
{
    editAll([italic](TextStyle& item, qsizetype) { item.setIsTextItalic(italic); });
}

void WorkingStyle::setColor(const QString& color)
{
    editAll([name = color.toStdString()](TextStyle& item, qsizetype) { item.setFontColor(name); });
}

void WorkingStyle::setColors(const QList<QString>& colors)
{
    editAll([&colors](TextStyle& item, qsizetype index) {
        if (index < colors.size())
            item.setFontColor(colors.at(index).toStdString());
    });
}

void WorkingStyle::setEdge(int on)
{
    editAll([on](TextStyle& item, qsizetype) { item.setIsTextEdge(on); });
}

void WorkingStyle::setEdgeWidth(int width)
{
    editAll([width](TextStyle& item, qsizetype) {
        TEdge edge = item.getTextEdge();
        edge.setEdgeWidth(width);
        item.setTextEdge(edge);
    });
}

void WorkingStyle::setEdgeColor(const QString& color)
{
    editAll([name = color.toStdString()](TextStyle& item, qsizetype) {
        TEdge edge = item.getTextEdge();
        edge.setEdgeColor(name);
        item.setTextEdge(edge);
    });
}

void WorkingStyle::setEdgeColors(const QList<QString>& colors)
{
    editAll([&colors](TextStyle& item, qsizetype index) {
        if (index >= colors.size())
            return;
        TEdge edge = item.getTextEdge();
        edge.setEdgeColor(colors.at(index).toStdString());
        item.setTextEdge(edge);
    });
}

void WorkingStyle::setKerning(int kerning)
{
    editAll([kerning](TextStyle& item, qsizetype) { item.setTextKerning(kerning); });
}

void WorkingStyle::setAlign(int align)
{
    if (m_record)
        m_record->setTextAlign(align);
}

void WorkingStyle::setShadow(int style)
{
    if (!m_record || style < 0 || style >= shadows().size())
        return;
    m_record->setShadowStyle(style);
    m_record->setTextShadow(shadows().at(style));
}

void WorkingStyle::moveBy(float x, float y)
{
    if (!m_record)
        return;
    m_record->setXValue(m_record->getXValue() + x);
    m_record->setYValue(m_record->getYValue() + y);
}

QList<QString> WorkingStyle::colors() const
{
    QList<QString> colors;
    if (!m_record)
        return colors;
    for (const TextStyle* item : m_record->textItems())
        colors.append(QString::fromStdString(item->getFontColor()));
    return colors;
}

QList<QString> WorkingStyle::edgeColors() const
{
    QList<QString> colors;
    if (!m_record)
        return colors;
    for (const TextStyle* item : m_record->textItems())
        colors.append(QString::fromStdString(item->textEdge().getEdgeColor()));
    return colors;
}

FontStyle WorkingStyle::fontStyle() const
{
    FontStyle style;
    if (!m_record || m_record->textItems().empty())
        return style;
    const TextStyle& item = *m_record->textItems().front();
    style.setFamily(item.getFontFamily());
    style.setSize(item.getFontSize());
    style.setColor(item.getFontColor());
    style.setBold(item.isFontBold());
    style.setItalic(item.isTextItalic());
    style.setKerning(item.getTextKerning());
    style.setEdge(item.isTextEdge());
    style.setEdgePoint(item.getTextEdge());
    style.setAlign(m_record->getTextAlign());
    style.setShadowStyle(m_record->getShadowStyle());
    style.setShadowPoint(*m_record->getTextShadow());
    return style;
}
