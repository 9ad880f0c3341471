#include "titlectl/TitleDescription.h"

#include "canvas/StyleDocument.h"
#include "document/Archive.h"
#include "document/TText.h"
#include "document/TextStyle.h"
#include "titlectl/TitleTexts.h"

#include <QJsonArray>
#include <algorithm>
#include <string>

namespace
{

QString from(const std::string& text)
{
    return QString::fromStdString(text);
}

// Compares everything but the characters.
bool looksTheSame(const TextStyle& a, const TextStyle& b)
{
    TextStyle other = b;
    other.setText(a.getText());
    return a == other;
}

QJsonObject runOf(const TextStyle& style)
{
    QJsonObject run{{QStringLiteral("font"), from(style.getFontFamily())},
                    {QStringLiteral("size"), style.getFontSize()},
                    {QStringLiteral("color"), from(style.getFontColor())},
                    {QStringLiteral("bold"), style.isFontBold() != 0},
                    {QStringLiteral("italic"), style.isTextItalic() != 0},
                    {QStringLiteral("kerning"), style.getTextKerning()}};
    if (style.isTextEdge() != 0)
        run.insert(QStringLiteral("outline"),
                   QJsonObject{{QStringLiteral("color"), from(style.textEdge().getEdgeColor())},
                               {QStringLiteral("width"), style.textEdge().getEdgeWidth()}});
    return run;
}

QJsonArray runsOf(const TText& text)
{
    QJsonArray runs;
    QString characters;
    const TextStyle* first = nullptr;
    const auto finish = [&] {
        if (!first)
            return;
        QJsonObject run = runOf(*first);
        run.insert(QStringLiteral("text"), characters);
        runs.append(run);
        characters.clear();
    };
    for (const TextStyle* style : text.textItems()) {
        if (!style)
            continue;
        if (!first || !looksTheSame(*first, *style)) {
            finish();
            first = style;
        }
        characters += StyleDocument::textOf(*style);
    }
    finish();
    return runs;
}

QString alignOf(const TText& text)
{
    static const QString NAMES[] = {QStringLiteral("left"), QStringLiteral("centre"),
                                    QStringLiteral("right")};
    return NAMES[std::clamp(text.getTextAlign() + 1, 0, 2)];
}

QJsonObject textOf(const TText& text)
{
    QJsonObject object{{QStringLiteral("id"), text.getTextObjectID()},
                       {QStringLiteral("text"), TitleTexts::plainText(text)},
                       {QStringLiteral("x"), double(text.getXValue())},
                       {QStringLiteral("y"), double(text.getYValue())},
                       {QStringLiteral("z"), double(text.getZValue())},
                       {QStringLiteral("align"), alignOf(text)},
                       {QStringLiteral("shadow"), text.getShadowStyle()},
                       {QStringLiteral("runs"), runsOf(text)}};
    return object;
}

} // namespace

QJsonObject TitleDescription::json() const
{
    QJsonArray texts;
    for (const TText* text : m_archive.text())
        if (text)
            texts.append(textOf(*text));
    return {{QStringLiteral("file"), from(m_archive.getPath())},
            {QStringLiteral("background"),
             QJsonObject{{QStringLiteral("1280"), from(m_archive.getBgResource())},
                         {QStringLiteral("1920"), from(m_archive.getBgResourceBig())}}},
            {QStringLiteral("pictures"),
             QJsonObject{{QStringLiteral("1920"), from(m_archive.getThumbnailBig())},
                         {QStringLiteral("960"), from(m_archive.getThumbnailMiddle())},
                         {QStringLiteral("240"), from(m_archive.getThumbnailSmall())},
                         {QStringLiteral("240 on black"), from(m_archive.getThumbnailBlack())}}},
            {QStringLiteral("clip"), from(m_archive.getClip())},
            {QStringLiteral("gain"), from(m_archive.getGain())},
            {QStringLiteral("density"), from(m_archive.getDensity())},
            {QStringLiteral("texts"), texts}};
}

QStringList TitleDescription::lines() const
{
    QStringList lines{from(m_archive.getPath())};
    if (!m_archive.getBgResourceBig().empty())
        lines.append(QStringLiteral("  background %1").arg(from(m_archive.getBgResourceBig())));
    for (const TText* text : m_archive.text()) {
        if (!text)
            continue;
        QString characters = TitleTexts::plainText(*text);
        characters.replace(QLatin1Char('\\'), QLatin1String("\\\\"));
        characters.replace(QLatin1Char('\n'), QLatin1String("\\n"));
        lines.append(QStringLiteral("  %1=%2").arg(QString::number(text->getTextObjectID()), characters));
        const TextStyle* style = text->textItems().empty() ? nullptr : text->textItems().front();
        if (style)
            lines.append(QStringLiteral("      %1 %2 %3, %4, at %5,%6")
                             .arg(from(style->getFontFamily()), QString::number(style->getFontSize()),
                                  from(style->getFontColor()), alignOf(*text),
                                  QString::number(double(text->getXValue())),
                                  QString::number(double(text->getYValue()))));
    }
    return lines;
}
