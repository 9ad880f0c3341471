#include "titlectl/TextRules.h"

#include "canvas/CharacterFormat.h"
#include "canvas/SafeAreaLines.h"
#include "canvas/StyleDocument.h"
#include "document/TText.h"
#include "document/TextStyle.h"
#include "titlectl/CheckedTitle.h"
#include "titlectl/TextFields.h"
#include "titlectl/TitleInk.h"

#include <QFile>
#include <QGlyphRun>
#include <QSet>
#include <QStringList>
#include <QTextLayout>
#include <algorithm>
#include <initializer_list>
#include <vector>

namespace
{

constexpr QRect RASTER(QPoint(0, 0), RasterScene::SIZE);
constexpr double FROM_CANVAS = 1.5;

// How a text stands on the picture and whether it is seen. The first that holds counts.
enum class Sight { Good, Blank, WithoutSize, Outside, CutOff, NoInk, LikeItsGround, OutsideSafeArea };

bool isWithoutSize(const TText& text)
{
    return std::all_of(text.textItems().begin(), text.textItems().end(),
                       [](const TextStyle* style) { return !style || style->getFontSize() <= 0; });
}

QRect safeArea()
{
    const QRectF canvas = SafeAreaLines::OUTER_AREA;
    return QRectF(canvas.topLeft() * FROM_CANVAS, canvas.size() * FROM_CANVAS).toRect();
}

Sight sightOf(const TText& text, const TitleInk::Text& drawn)
{
    if (TextFields::isBlank(text))
        return Sight::Blank;
    if (isWithoutSize(text))
        return Sight::WithoutSize;
    // Ink is looked for near the picture only; a wide gap between two words may hide the rest of a line.
    const bool reachesFar = drawn.layout.left() < RASTER.left() - TitleInk::BORDER ||
                            drawn.layout.right() > RASTER.right() + TitleInk::BORDER;
    const bool isSeen = drawn.ink.intersects(RASTER);
    if (!isSeen && (!drawn.ink.isEmpty() || !drawn.layout.intersects(RASTER)))
        return Sight::Outside;
    if (!isSeen)
        return Sight::NoInk;
    if (!RASTER.contains(drawn.ink) || reachesFar)
        return Sight::CutOff;
    if (drawn.contrast < TitleInk::LEAST_CONTRAST)
        return Sight::LikeItsGround;
    return safeArea().contains(drawn.ink) ? Sight::Good : Sight::OutsideSafeArea;
}

QString reasonOf(Sight sight)
{
    switch (sight) {
    case Sight::Blank:
        return QStringLiteral("the text has no characters but blanks");
    case Sight::WithoutSize:
        return QStringLiteral("the size of the text is 0");
    case Sight::Outside:
        return QStringLiteral("the text is outside the picture");
    case Sight::CutOff:
        return QStringLiteral("the text is cut off at the edge of the picture");
    case Sight::NoInk:
        return QStringLiteral("the text draws nothing");
    case Sight::LikeItsGround:
        return QStringLiteral("the text has the colour of what is behind it, or is covered");
    case Sight::OutsideSafeArea:
        return QStringLiteral("the text reaches out of the safe area (90% of the picture)");
    case Sight::Good:
        break;
    }
    return {};
}

QString nameOf(const TText& text)
{
    return QStringLiteral("text %1").arg(text.getTextObjectID());
}

// Reports the texts with one of these sights.
void checkSight(const CheckedTitle& title, std::initializer_list<Sight> wanted, FindingList& findings)
{
    const std::vector<TText*>& texts = title.archive().text();
    const std::vector<TitleInk::Text>& drawn = title.ink().texts();
    for (std::size_t i = 0; i < std::min(texts.size(), drawn.size()); ++i) {
        const Sight sight = sightOf(*texts[i], drawn[i]);
        if (std::find(wanted.begin(), wanted.end(), sight) != wanted.end())
            findings.append({title.path(), nameOf(*texts[i]), {}, reasonOf(sight)});
    }
}

void checkReadable(const CheckedTitle& title, FindingList& findings)
{
    if (!title.isReadable() && QFile::exists(title.path())) // missing files are for the order's rule
        findings.append({title.path(), {}, {}, QStringLiteral("the title cannot be read")});
}

void checkEmpty(const CheckedTitle& title, FindingList& findings)
{
    if (title.isReadable() && title.archive().text().empty() && title.archive().getBgResourceBig().empty())
        findings.append(
            {title.path(), {}, {}, QStringLiteral("the title has neither texts nor a background")});
    checkSight(title, {Sight::Blank}, findings);
}

void checkInvisible(const CheckedTitle& title, FindingList& findings)
{
    checkSight(title, {Sight::WithoutSize, Sight::NoInk, Sight::LikeItsGround}, findings);
}

void checkOutside(const CheckedTitle& title, FindingList& findings)
{
    checkSight(title, {Sight::Outside}, findings);
}

void checkCutOff(const CheckedTitle& title, FindingList& findings)
{
    checkSight(title, {Sight::CutOff}, findings);
}

void checkSafeArea(const CheckedTitle& title, FindingList& findings)
{
    checkSight(title, {Sight::OutsideSafeArea}, findings);
}

void checkFonts(const CheckedTitle& title, FindingList& findings)
{
    for (const TText* text : title.archive().text()) {
        QSet<QString> reported;
        for (const TextStyle* style : text->textItems()) {
            const QString family = QString::fromStdString(style->getFontFamily());
            if (StyleDocument::textOf(*style).trimmed().isEmpty() || reported.contains(family) ||
                CharacterFormat::familyIsInstalled(family))
                continue;
            reported.insert(family);
            findings.append(
                {title.path(),
                 nameOf(*text),
                 {},
                 QStringLiteral("the font \"%1\" is not installed; another one is drawn").arg(family)});
        }
    }
}

// Returns whether the character is drawn only together with others.
bool isPartOfAnother(const QString& character)
{
    const QChar::Category category = QChar::category(character.toUcs4().constFirst());
    return category == QChar::Mark_NonSpacing || category == QChar::Mark_SpacingCombining ||
           category == QChar::Mark_Enclosing || category == QChar::Other_Format;
}

// Returns whether neither the font nor one that stands in for it has the character.
bool lacksGlyph(const QString& character, const QFont& font)
{
    QTextLayout layout(character, font);
    layout.beginLayout();
    layout.createLine();
    layout.endLayout();
    const QList<QGlyphRun> runs = layout.glyphRuns();
    return std::any_of(runs.begin(), runs.end(),
                       [](const QGlyphRun& run) { return run.glyphIndexes().contains(0); });
}

void checkGlyphs(const CheckedTitle& title, FindingList& findings)
{
    for (const TText* text : title.archive().text()) {
        QSet<QString> tried;
        QStringList missing;
        for (const TextStyle* style : text->textItems()) {
            const QString character = StyleDocument::textOf(*style);
            const QString key = character + QLatin1Char('/') + QString::fromStdString(style->getFontFamily());
            if (character.trimmed().isEmpty() || tried.contains(key) || isPartOfAnother(character))
                continue;
            tried.insert(key);
            if (lacksGlyph(character, CharacterFormat::font(*style, 1.0)))
                missing.append(QStringLiteral("U+%1")
                                   .arg(character.toUcs4().constFirst(), 4, 16, QLatin1Char('0'))
                                   .toUpper());
        }
        if (!missing.isEmpty())
            findings.append(
                {title.path(),
                 nameOf(*text),
                 {},
                 QStringLiteral("no font has a glyph for %1").arg(missing.join(QStringLiteral(", ")))});
    }
}

} // namespace

QList<CheckRule> TextRules::table()
{
    return {{QStringLiteral("title-unreadable"), QStringLiteral("a title file cannot be read"), nullptr,
             checkReadable},
            {QStringLiteral("font-missing"), QStringLiteral("a font of a text is not installed"), nullptr,
             checkFonts},
            {QStringLiteral("glyph-missing"), QStringLiteral("no font has a glyph for a character"), nullptr,
             checkGlyphs},
            {QStringLiteral("text-empty"), QStringLiteral("a text has only blanks, or a title shows nothing"),
             nullptr, checkEmpty},
            {QStringLiteral("text-invisible"),
             QStringLiteral("a text has size 0, draws nothing, or has the colour of its ground"), nullptr,
             checkInvisible},
            {QStringLiteral("text-outside"), QStringLiteral("a text is outside the picture"), nullptr,
             checkOutside},
            {QStringLiteral("text-cut-off"), QStringLiteral("a text is cut off at the edge of the picture"),
             nullptr, checkCutOff},
            {QStringLiteral("text-outside-safe-area"),
             QStringLiteral("a text reaches out of the safe area, 90% of the picture"), nullptr,
             checkSafeArea}};
}
