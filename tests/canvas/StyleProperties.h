#pragma once

#include "CanvasTestTools.h"

#include <QString>

// All properties of a style change, with two different values each, for tests.
namespace StyleProperties
{

inline bool isOverall(int id)
{
    return id == TextObjectConstants::PropertyShadow || id == TextObjectConstants::PropertyAlign ||
           id == TextObjectConstants::PropertyPosition;
}

// Sets the property of the style or the record to the first or second value.
inline void set(int id, TText& source, int value)
{
    const bool second = value != 0;
    switch (id) {
    case TextObjectConstants::PropertyShadow:
        source.setShadowStyle(second ? 2 : 1);
        source.getTextShadow()->setShadowDirectionX(second ? -1 : 1);
        source.getTextShadow()->setShadowDirectionY(1);
        return;
    case TextObjectConstants::PropertyAlign:
        source.setTextAlign(second ? 0 : 1);
        return;
    case TextObjectConstants::PropertyPosition:
        source.setXValue(second ? 222.0F : 333.0F);
        source.setYValue(second ? 111.0F : 155.0F);
        return;
    default:
        break;
    }
    for (TextStyle* style : source.textItems()) {
        TEdge edge = style->textEdge();
        switch (id) {
        case TextObjectConstants::PropertyFamily:
            style->setFontFamily(second ? "DFHeiW5-A" : "DejaVu Sans");
            break;
        case TextObjectConstants::PropertySize:
            style->setFontSize(second ? 120 : 60);
            break;
        case TextObjectConstants::PropertyBold:
            style->setFontBold(second ? 0 : 1);
            break;
        case TextObjectConstants::PropertyItalic:
            style->setIsTextItalic(second ? 0 : 1);
            break;
        case TextObjectConstants::PropertyColor:
            style->setFontColor(second ? "#00AA00" : "#AA0000");
            break;
        case TextObjectConstants::PropertyEdge:
            style->setIsTextEdge(second ? 0 : 1);
            break;
        case TextObjectConstants::PropertyEdgeWidthPreview:
            style->setIsTextEdge(1);
            edge.setEdgeWidth(second ? 9 : 5);
            style->setTextEdge(edge);
            break;
        case TextObjectConstants::PropertyEdgeWidthOrColor:
            style->setIsTextEdge(1);
            edge.setEdgeColor(second ? "#0000FF" : "#FF00FF");
            style->setTextEdge(edge);
            break;
        case TextObjectConstants::PropertyKerning:
            style->setTextKerning(second ? 80 : 150);
            break;
        default:
            break;
        }
    }
}

// Returns a style without its text as one readable line.
inline QString describe(const TextStyle& style)
{
    return QString("%1 %2 %3 b%4 i%5 k%6 e%7 %8 %9")
        .arg(QString::fromStdString(style.getFontFamily()))
        .arg(style.getFontSize())
        .arg(QString::fromStdString(style.getFontColor()))
        .arg(style.isFontBold())
        .arg(style.isTextItalic())
        .arg(style.getTextKerning())
        .arg(style.isTextEdge())
        .arg(style.textEdge().getEdgeWidth())
        .arg(QString::fromStdString(style.textEdge().getEdgeColor()));
}

// Returns the whole record, including its place, as text.
inline QString describe(const TText& record)
{
    QString text = QString("id%1 (%2,%3,%4) align%5 shadow%6 %7,%8 %9\n")
                       .arg(record.getTextObjectID())
                       .arg(record.getXValue())
                       .arg(record.getYValue())
                       .arg(record.getZValue())
                       .arg(record.getTextAlign())
                       .arg(record.getShadowStyle())
                       .arg(record.getTextShadow()->getShadowDirectionX())
                       .arg(record.getTextShadow()->getShadowDirectionY())
                       .arg(record.getTextShadow()->getShadowBlurRadius());
    for (const TextStyle* style : record.textItems())
        text += QString::fromStdString(style->getText()) + QLatin1Char('|') + describe(*style) +
                QLatin1Char('|') + QString::fromStdString(style->getAlphaDefaultFontOfInputLanguage()) +
                QLatin1Char('\n');
    return text;
}

} // namespace StyleProperties
