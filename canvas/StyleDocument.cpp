#include "canvas/StyleDocument.h"

#include "canvas/InputLanguageFonts.h"
#include "canvas/TextObjectConstants.h"

#include <algorithm>
#include <cmath>
#include <utility>

using namespace TextObjectConstants;

namespace
{

// Positions beyond this come from damaged files; a scene index cannot hold them.
constexpr float PLACE_LIMIT = 100000.0F;

float usablePlace(float value)
{
    return std::isfinite(value) ? std::clamp(value, -PLACE_LIMIT, PLACE_LIMIT) : 0.0F;
}

bool sameStyle(const TextStyle& a, const TextStyle& b)
{
    return a == b && a.isTextEdge() == b.isTextEdge() && a.textEdge() == b.textEdge() &&
           a.getAlphaDefaultFontOfInputLanguage() == b.getAlphaDefaultFontOfInputLanguage();
}

QString withPlainLineBreaks(QString text)
{
    text.replace(QLatin1String("\r\n"), QLatin1String("\n"));
    for (QChar& c : text)
        if (c == QLatin1Char('\r') || c == QChar::ParagraphSeparator || c == QChar::LineSeparator)
            c = QLatin1Char('\n');
    return text;
}

void copyObjectProperties(TText& out, const TText& from)
{
    out.setXValue(from.getXValue());
    out.setYValue(from.getYValue());
    out.setZValue(from.getZValue());
    out.setShadowStyle(from.getShadowStyle());
    out.setTextShadow(*from.getTextShadow());
    out.setTextAlign(from.getTextAlign());
    out.setTextObjectID(0);
    out.setText(std::string());
}

// Returns whether the text is one character that is stored as it is.
bool isOneUnit(const QString& text)
{
    if (text.size() != 1)
        return false;
    const QChar c = text.at(0);
    return !c.isSurrogate() && !c.isNull() && c != QLatin1Char('\r') && c != QChar::ParagraphSeparator &&
           c != QChar::LineSeparator && c != QChar::ReplacementCharacter;
}

bool isCombining(QChar c)
{
    return c.isMark() || c.isLowSurrogate() || c == QChar(0x200D) ||
           (c.unicode() >= 0xFE00 && c.unicode() <= 0xFE0F);
}

int sign(int value)
{
    return value > 0 ? 1 : (value < 0 ? -1 : 0);
}

} // namespace

StyleDocument::StyleDocument() = default;

TextStyle* StyleDocument::at(int position) const
{
    const auto& items = m_current.textItems();
    return position >= 0 && position < int(items.size()) ? items[size_t(position)] : nullptr;
}

QString StyleDocument::textOf(const TextStyle& style)
{
    return QString::fromStdString(style.getText());
}

QChar StyleDocument::characterAt(int position) const
{
    const TextStyle* style = at(position);
    if (!style)
        return QChar();
    const QString text = textOf(*style);
    return text.isEmpty() ? QChar(0xDC00) : text.at(0);
}

QString StyleDocument::storedText(const QString& characters, qsizetype index)
{
    const QChar c = characters.at(index);
    if (c.isHighSurrogate() && index + 1 < characters.size() && characters.at(index + 1).isLowSurrogate())
        return characters.mid(index, 2);
    if (c.isLowSurrogate() && index > 0 && characters.at(index - 1).isHighSurrogate())
        return QString();
    return c.isSurrogate() ? QString(QChar(QChar::ReplacementCharacter)) : QString(c);
}

// Returns whether each run has one character of one unit, which is usual, and there are not too many.
bool StyleDocument::isNormal(const TText& record)
{
    int characters = 0;
    for (const TextStyle* style : record.textItems()) {
        if (!style)
            return false;
        const std::string& stored = style->getText();
        const bool isAscii = stored.size() == 1 && stored.front() > 0 && stored.front() != '\r';
        if (!isAscii && !isOneUnit(textOf(*style)))
            return false;
        characters += stored == "\n" ? 0 : 1;
    }
    return characters <= CHARACTER_LIMIT;
}

void StyleDocument::normalise(TText& record)
{
    record.setXValue(usablePlace(record.getXValue()));
    record.setYValue(usablePlace(record.getYValue()));
    record.setZValue(usablePlace(record.getZValue()));

    if (isNormal(record))
        return;
    const std::vector<TextStyle*> source = record.getTextItems();
    std::vector<TextStyle*> result;
    result.reserve(source.size());
    int characters = 0;
    for (size_t i = 0; i < source.size(); ++i) {
        const QString text = source[i] ? withPlainLineBreaks(textOf(*source[i])) : QString();
        for (qsizetype c = 0; c < text.size(); ++c) {
            const bool lineBreak = text.at(c) == QLatin1Char('\n');
            const bool pair = text.at(c).isHighSurrogate() && c + 1 < text.size();
            const int units = pair ? 2 : 1;
            if (!lineBreak && characters + units > CHARACTER_LIMIT)
                continue;
            characters += lineBreak ? 0 : units;
            result.push_back(new TextStyle(*source[i]));
            result.back()->setText(storedText(text, c).toStdString());
            if (!pair)
                continue;
            // In records made by this program the second half has a style of its own.
            const bool hasOwn = text.size() == 2 && i + 1 < source.size() && source[i + 1] &&
                                source[i + 1]->getText().empty();
            result.push_back(new TextStyle(hasOwn ? *source[i + 1] : *source[i]));
            result.back()->setText(std::string());
            ++c;
        }
    }
    record.releaseVectorTextStyle();
    record.setTextItems(std::move(result));
}

void StyleDocument::setCurrent(const TText& record)
{
    m_current = record;
    normalise(m_current);
    m_previewing = false;
}

void StyleDocument::insert(int position, std::vector<std::unique_ptr<TextStyle>> styles)
{
    std::vector<TextStyle*> items = m_current.getTextItems();
    if (position < 0 || position > int(items.size()))
        return;
    items.insert(items.begin() + position, styles.size(), nullptr);
    for (size_t i = 0; i < styles.size(); ++i)
        items[size_t(position) + i] = styles[i].release();
    m_current.setTextItems(std::move(items));
}

bool StyleDocument::remove(int position)
{
    std::vector<TextStyle*> items = m_current.getTextItems();
    if (position < 0 || position >= int(items.size()))
        return false;
    const bool last = items.size() == 1;
    const std::unique_ptr<TextStyle> style(items[size_t(position)]);
    if (last)
        copyTextStyle(m_lastAlpha, *style);
    items.erase(items.begin() + position);
    m_current.setTextItems(std::move(items));
    return last;
}

void StyleDocument::copyNeighbourStyle(int position, bool startOfLine, QChar added, TextStyle& out) const
{
    if (isEmpty())
        return;
    const int index = std::clamp(startOfLine ? position : position - 1, 0, count() - 1);
    const TextStyle& source = *at(index);
    const std::string text = out.getText();
    const std::string alphaDefault = out.getAlphaDefaultFontOfInputLanguage();
    out = source;
    out.setText(text);
    out.setAlphaDefaultFontOfInputLanguage(alphaDefault);

    // A mark is drawn on its base character and takes the family of the base.
    const QChar previous = characterAt(index);
    if (previous == QLatin1Char('\n') || added == QLatin1Char('\n') || isCombining(added))
        return;
    if (InputLanguageFonts::getSoftkeyboardMode(previous) != InputLanguageFonts::getSoftkeyboardMode(added))
        out.setFontFamily(InputLanguageFonts::getDefaultFontAccordingToLanguage(added, true).toStdString());
}

void StyleDocument::copyTTextToTextStyle(TextStyle& out, const TText& source)
{
    const auto take = [&source](TText& target) {
        target.setShadowStyle(source.getShadowStyle());
        target.setTextShadow(*source.getTextShadow());
        target.setTextAlign(source.getTextAlign());
    };
    take(m_current);
    if (isEmpty() && &source != &m_lastAlpha)
        take(m_lastAlpha);
    if (!source.textItems().empty())
        out = *source.textItems().front();
}

void StyleDocument::copyTextStyle(TText& out, const TextStyle& style) const
{
    auto copy = std::make_unique<TextStyle>(style);
    copyObjectProperties(out, m_current);
    out.releaseVectorTextStyle();
    out.setTextItems({copy.release()});
}

void StyleDocument::copySelection(TText& out, int begin, int end) const
{
    copyObjectProperties(out, m_current);
    out.releaseVectorTextStyle();
    std::vector<TextStyle*> items;
    for (int i = std::max(begin, 0); i < end && i < count(); ++i)
        items.push_back(new TextStyle(*at(i)));
    out.setTextItems(std::move(items));
}

void StyleDocument::setOverallProperty(int id, const TText& source)
{
    if (id == PropertyShadow) {
        m_current.setShadowStyle(source.getShadowStyle());
        m_current.setTextShadow(*source.getTextShadow());
    } else if (id == PropertyAlign) {
        m_current.setTextAlign(source.getTextAlign());
        if (isEmpty())
            m_lastAlpha.setTextAlign(source.getTextAlign());
    }
}

void StyleDocument::setFontProperties(int id, TextStyle& target, const TextStyle& source)
{
    switch (id) {
    case PropertyFamily: {
        target.setFontFamily(source.getFontFamily());
        const QString text = textOf(target);
        if (!text.isEmpty())
            InputLanguageFonts::replaceLastFontWithCurrentCharFont(text.at(0), source.getFontFamily());
        break;
    }
    case PropertySize:
        target.setFontSize(source.getFontSize());
        break;
    case PropertyBold:
        target.setFontBold(source.isFontBold());
        break;
    case PropertyItalic:
        target.setIsTextItalic(source.isTextItalic());
        break;
    case PropertyColor:
        target.setFontColor(source.getFontColor());
        break;
    default:
        break;
    }
}

void StyleDocument::setCharacterProperty(int id, TextStyle& target, const TextStyle& source)
{
    switch (id) {
    case PropertyEdge:
    case PropertyEdgeWidthPreview:
    case PropertyEdgeWidthOrColor:
        target.setIsTextEdge(source.isTextEdge());
        target.setTextEdge(source.textEdge());
        break;
    case PropertyKerning:
        target.setTextKerning(source.getTextKerning());
        break;
    default:
        setFontProperties(id, target, source);
        break;
    }
}

void StyleDocument::synchronise(TText& target, const TText& source)
{
    const auto& from = source.textItems();
    const auto& to = target.textItems();
    size_t head = 0;
    const size_t shorter = std::min(from.size(), to.size());
    while (head < shorter && sameStyle(*from[head], *to[head]))
        ++head;
    size_t tail = 0;
    while (tail < shorter - head && sameStyle(*from[from.size() - 1 - tail], *to[to.size() - 1 - tail]))
        ++tail;

    if (head + tail != from.size() || head + tail != to.size()) {
        std::vector<TextStyle*> items;
        items.reserve(from.size());
        items.insert(items.end(), to.begin(), to.begin() + std::ptrdiff_t(head));
        size_t old = head; // of the styles that are overwritten or deleted
        for (size_t i = head; i < from.size() - tail; ++i) {
            if (old == to.size() - tail) {
                items.push_back(new TextStyle(*from[i]));
                continue;
            }
            *to[old] = *from[i];
            items.push_back(to[old++]);
        }
        items.insert(items.end(), to.end() - std::ptrdiff_t(tail), to.end());
        for (; old < to.size() - tail; ++old)
            delete to[old];
        target.setTextItems(std::move(items));
    }
    const int id = source.getTextObjectID();
    copyObjectProperties(target, source);
    target.setTextObjectID(id);
    target.setText(source.getText());
}

void StyleDocument::markEditStart()
{
    synchronise(m_editStart, m_current);
    synchronise(m_editStartLastAlpha, m_lastAlpha);
}

void StyleDocument::markPreviewStart()
{
    if (!m_previewing)
        synchronise(m_beforePreview, m_current);
    m_previewing = true;
}

bool StyleDocument::takeBackPreview()
{
    removePreviewFrom(m_current);
    return std::exchange(m_previewing, false);
}

void StyleDocument::removePreviewFrom(TText& copy) const
{
    const auto& before = m_beforePreview.textItems();
    const auto& items = copy.textItems();
    if (!m_previewing || before.size() != items.size())
        return;
    for (size_t i = 0; i < items.size(); ++i)
        *items[i] = *before[i];
}

void StyleDocument::saveForNextInsert(const TText& style, int property, int cursorPosition)
{
    m_nextInsert = style;
    m_styleSaved = true;
    m_savedProperty = property;
    m_savedCursorPosition = cursorPosition;
}

int StyleDocument::getMinmumSize(const TText& record)
{
    if (record.textItems().empty())
        return DEFAULT_MINIMUM_SIZE;
    const auto& items = record.textItems();
    const auto smallest =
        std::min_element(items.begin(), items.end(), [](const TextStyle* a, const TextStyle* b) {
            return a->getFontSize() < b->getFontSize();
        });
    return (*smallest)->getFontSize();
}

int StyleDocument::getRadioValueofStandardSize(int size)
{
    return size / STANDARD_FONT_SIZE + (size % STANDARD_FONT_SIZE > STANDARD_FONT_SIZE / 2 ? 1 : 0);
}

void StyleDocument::setItemShadowInfo(TText& record)
{
    if (record.textItems().empty())
        return;
    // Larger sizes come from damaged files only and would make shadows too large for the memory.
    const int size = std::clamp(getMinmumSize(record), 0, MAXIMUM_FONT_SIZE);
    const int step = getRadioValueofStandardSize(size);
    const int offset = int(step * STANDARD_OFFSET);
    TShadow& shadow = *record.getTextShadow();
    shadow.setShadowDirectionX(sign(shadow.getShadowDirectionX()) * offset);
    shadow.setShadowDirectionY(sign(shadow.getShadowDirectionY()) * offset);
    shadow.setShadowBlurRadius(std::max(step * STANDARD_BLUR_RADIUS, MINIMUM_BLUR_RADIUS));
}
