#include "appliance/SampleText.h"

#include "canvas/TextObjectConstants.h"

#include <QFont>
#include <QFontMetricsF>
#include <QString>
#include <QStringList>
#include <cmath>
#include <vector>

namespace
{

constexpr const char* LATIN = "KST";

TextStyle styleOf(const SampleText::Look& look)
{
    TextStyle style;
    style.setFontFamily(look.family);
    style.setAlphaDefaultFontOfInputLanguage(LATIN);
    style.setFontSize(look.size);
    style.setFontColor(look.color);
    style.setFontBold(look.bold);
    style.setIsTextItalic(look.italic);
    style.setTextKerning(look.kerning);
    if (look.edgeWidth > 0) {
        TEdge edge;
        edge.setEdgeWidth(look.edgeWidth);
        edge.setEdgeColor(look.edgeColor);
        style.setTextEdge(edge);
        style.setIsTextEdge(1);
    }
    return style;
}

QFont fontOf(const SampleText::Look& look)
{
    QFont font(QString::fromUtf8(look.family));
    font.setPixelSize(look.size);
    font.setBold(look.bold != 0);
    font.setItalic(look.italic != 0);
    font.setLetterSpacing(QFont::PercentageSpacing, look.kerning);
    return font;
}

} // namespace

std::unique_ptr<TText> SampleText::make(int id, const char* utf8, const Look& look)
{
    auto text = std::make_unique<TText>();
    text->setTextObjectID(id);
    text->setText(utf8);
    text->setXValue(look.x);
    text->setYValue(look.y);
    text->setZValue(static_cast<float>(id));
    text->setTextAlign(look.align);
    text->setShadowStyle(look.shadow);
    if (look.shadow != NO_SHADOW) {
        TShadow shadow;
        shadow.setShadowDirectionX(look.shadow == RIGHT_DOWN ? 1 : 0);
        shadow.setShadowDirectionY(1);
        text->setTextShadow(shadow);
    }
    std::vector<TextStyle*> items;
    const QString characters = QString::fromUtf8(utf8);
    for (const QChar c : characters) {
        auto style = std::make_unique<TextStyle>(styleOf(look));
        style->setText(QString(c).toStdString());
        items.push_back(style.release());
    }
    text->setTextItems(std::move(items));
    return text;
}

SampleText::Look SampleText::placed(Look look, const char* utf8, double x, double y)
{
    const QFontMetricsF metrics(fontOf(look));
    double width = 0;
    const QStringList lines = QString::fromUtf8(utf8).split(QLatin1Char('\n'));
    for (const QString& line : lines)
        width = qMax(width, metrics.horizontalAdvance(line));
    // In addition to the margin of the document every line has a margin, which leaves room for the handles.
    const double margin = TextObjectConstants::MARGIN_SHARE_OF_LINE / 2 * metrics.height();
    const double left = (look.align == LEFT ? x : look.align == CENTRE ? x - width / 2 : x - width) - margin;
    const double top = y + metrics.capHeight() / 2 - metrics.ascent();
    const double toCanvas = TextObjectConstants::SCENEPERCENTAGE;
    look.x = static_cast<float>(std::round(left * toCanvas - TextObjectConstants::DOCUMENT_MARGIN));
    look.y = static_cast<float>(std::round(top * toCanvas - TextObjectConstants::DOCUMENT_MARGIN));
    return look;
}
