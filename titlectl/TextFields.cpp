#include "titlectl/TextFields.h"

#include "canvas/StyleDocument.h"
#include "document/TText.h"
#include "document/TextStyle.h"
#include "titlectl/TitleTexts.h"

#include <memory>
#include <utility>
#include <vector>

namespace
{

using Styles = std::vector<std::unique_ptr<TextStyle>>;

// A part "{name}": where its braces are, in UTF-16 units.
struct Part {
    qsizetype begin = 0;
    qsizetype end = 0;
    QString name;
};

std::vector<Part> partsOf(const QString& text)
{
    std::vector<Part> parts;
    qsizetype begin = -1;
    for (qsizetype at = 0; at < text.size(); ++at) {
        const QChar c = text.at(at);
        if (c == QLatin1Char('{')) {
            begin = at;
        } else if (c == QLatin1Char('\n')) {
            begin = -1;
        } else if (c == QLatin1Char('}') && begin >= 0) {
            const QString name = text.mid(begin + 1, at - begin - 1).trimmed();
            if (!name.isEmpty())
                parts.push_back({begin, at + 1, name});
            begin = -1;
        }
    }
    return parts;
}

void append(Styles& styles, const TextStyle& like, const QString& value)
{
    for (qsizetype i = 0; i < value.size(); ++i) {
        styles.push_back(std::make_unique<TextStyle>(like));
        styles.back()->setText(StyleDocument::storedText(value, i).toStdString());
    }
}

void setStyles(TText& text, Styles styles)
{
    std::vector<TextStyle*> items;
    items.reserve(styles.size());
    for (std::unique_ptr<TextStyle>& style : styles)
        items.push_back(style.release());
    text.releaseVectorTextStyle();
    text.setTextItems(std::move(items));
    TitleTexts::refreshText(text);
}

} // namespace

QStringList TextFields::partNames(const TText& text)
{
    TText record = text;
    StyleDocument::normalise(record);
    QStringList names;
    for (const Part& part : partsOf(TitleTexts::plainText(record)))
        if (!names.contains(part.name))
            names.append(part.name);
    return names;
}

void TextFields::replaceAll(TText& text, const QString& value)
{
    StyleDocument::normalise(text);
    const TextStyle first = text.textItems().empty() ? TextStyle() : *text.textItems().front();
    Styles styles;
    append(styles, first, value);
    setStyles(text, std::move(styles));
}

void TextFields::replaceParts(TText& text, const Values& values)
{
    StyleDocument::normalise(text);
    const std::vector<TextStyle*>& items = text.textItems();
    Styles styles;
    qsizetype at = 0;
    const auto keepUntil = [&](qsizetype end) {
        for (; at < end; ++at)
            styles.push_back(std::make_unique<TextStyle>(*items[std::size_t(at)]));
    };
    for (const Part& part : partsOf(TitleTexts::plainText(text))) {
        const std::optional<QString> value = values(part.name);
        if (!value)
            continue;
        keepUntil(part.begin);
        append(styles, *items[std::size_t(part.begin)], *value);
        at = part.end;
    }
    keepUntil(qsizetype(items.size()));
    setStyles(text, std::move(styles));
}

int TextFields::characterCount(const TText& text)
{
    const QString plain = TitleTexts::plainText(text);
    return int(plain.size() - plain.count(QLatin1Char('\n')));
}

bool TextFields::isBlank(const TText& text)
{
    return TitleTexts::plainText(text).trimmed().isEmpty();
}
