#include "titlectl/TitleTexts.h"

#include "canvas/StyleDocument.h"
#include "document/Archive.h"
#include "document/TText.h"
#include "document/TextStyle.h"
#include "titlectl/TextFit.h"

#include <algorithm>
#include <memory>
#include <vector>

namespace
{

// Returns how many characters at the beginning are equal; never half of a pair.
qsizetype equalAtBegin(const QString& a, const QString& b)
{
    const qsizetype most = std::min(a.size(), b.size());
    qsizetype count = 0;
    while (count < most && a.at(count) == b.at(count))
        ++count;
    return count > 0 && a.at(count - 1).isHighSurrogate() ? count - 1 : count;
}

// Returns how many characters at the end are equal behind the first ones; never half of a pair.
qsizetype equalAtEnd(const QString& a, const QString& b, qsizetype first)
{
    const qsizetype most = std::min(a.size(), b.size()) - first;
    qsizetype count = 0;
    while (count < most && a.at(a.size() - 1 - count) == b.at(b.size() - 1 - count))
        ++count;
    return count > 0 && a.at(a.size() - count).isLowSurrogate() ? count - 1 : count;
}

} // namespace

QString TitleTexts::plainText(const TText& text)
{
    QString characters;
    for (const TextStyle* style : text.textItems())
        if (style)
            characters += StyleDocument::textOf(*style);
    return characters;
}

void TitleTexts::refreshText(TText& text)
{
    text.setText(plainText(text).replace(QChar(QChar::Nbsp), QLatin1Char(' ')).toStdString());
}

TText* TitleTexts::find(const Archive& archive, int id)
{
    for (TText* text : archive.text())
        if (text && text->getTextObjectID() == id)
            return text;
    return nullptr;
}

void TitleTexts::replace(TText& text, const QString& characters)
{
    StyleDocument::normalise(text); // one style for each position
    const TText record = text;
    const QString before = plainText(text);
    const qsizetype begin = equalAtBegin(before, characters);
    const qsizetype end = equalAtEnd(before, characters, begin);

    std::vector<TextStyle*> styles = text.getTextItems();
    const auto firstReplaced = styles.begin() + begin;
    const auto firstKept = styles.end() - end;
    TextStyle style;
    if (!styles.empty())
        style = begin < static_cast<qsizetype>(styles.size()) - end
                    ? **firstReplaced
                    : *styles[static_cast<std::size_t>(std::max<qsizetype>(begin - 1, 0))];
    std::vector<TextStyle*> result(styles.begin(), firstReplaced);
    for (qsizetype i = begin; i < characters.size() - end; ++i) {
        auto added = std::make_unique<TextStyle>(style);
        added->setText(StyleDocument::storedText(characters, i).toStdString());
        result.push_back(added.release());
    }
    std::for_each(firstReplaced, firstKept, [](TextStyle* replaced) { delete replaced; });
    result.insert(result.end(), firstKept, styles.end());
    text.setTextItems(std::move(result));
    refreshText(text);
    TextFit::keepAlignment(text, record);
}
