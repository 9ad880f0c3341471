#include "canvas/CharacterFormat.h"

#include "canvas/TextObjectConstants.h"
#include "document/TextStyle.h"

#include <QBrush>
#include <QCache>
#include <QFontInfo>
#include <QGuiApplication>
#include <QHash>
#include <QPen>
#include <algorithm>
#include <cmath>
#include <functional>
#include <string>

namespace
{

constexpr int MAXIMUM_KERNING = 1000;
constexpr int MAXIMUM_OUTLINE = 200;
constexpr int CACHED_FONTS = 128;

struct FontKey {
    QString family;
    int pixelSize;
    int kerning;
    bool bold;
    bool italic;

    bool operator==(const FontKey&) const = default;
};

size_t qHash(const FontKey& key, size_t seed)
{
    return qHashMulti(seed, key.family, key.pixelSize, key.kerning, key.bold, key.italic);
}

struct FormatKey {
    FontKey font;
    std::string color;
    bool edge;

    bool operator==(const FormatKey&) const = default;
};

size_t qHash(const FormatKey& key, size_t seed)
{
    return qHashMulti(qHash(key.font, seed), std::hash<std::string>()(key.color), key.edge);
}

struct FontStore {
    QHash<QString, bool> installed;
    QCache<FontKey, QFont> fonts{CACHED_FONTS};
    QCache<FormatKey, QTextCharFormat> formats{CACHED_FONTS};

    void clear()
    {
        installed.clear();
        fonts.clear();
        formats.clear();
    }
};

FontStore& store()
{
    static FontStore fontStore;
    static bool connected = false;
    if (!connected && qGuiApp) {
        connected = true;
        // An imported font may make a missing family available.
        QObject::connect(qGuiApp, &QGuiApplication::fontDatabaseChanged, qGuiApp, [] { fontStore.clear(); });
        QObject::connect(qGuiApp, &QObject::destroyed, [] {
            fontStore.clear();
            connected = false;
        });
    }
    return fontStore;
}

int kerning(const TextStyle& style)
{
    return std::clamp(style.getTextKerning(), 0, MAXIMUM_KERNING);
}

FontKey fontKey(const TextStyle& style, double ratio)
{
    return {QString::fromStdString(style.getFontFamily()), CharacterFormat::pixelSize(style, ratio),
            kerning(style), style.isFontBold() != 0, style.isTextItalic() != 0};
}

} // namespace

bool CharacterFormat::familyIsInstalled(const QString& family)
{
    if (family.isEmpty())
        return false;
    auto& installed = store().installed;
    auto found = installed.constFind(family);
    if (found == installed.constEnd()) {
        // Family names come from files, so the cache is bounded.
        if (installed.size() > CACHED_FONTS)
            installed.clear();
        const QFont font(family);
        found = installed.insert(family, QFontInfo(font).family() == font.family());
    }
    return found.value();
}

int CharacterFormat::pixelSize(const TextStyle& style, double ratio)
{
    const int size = std::clamp(style.getFontSize(), 1, TextObjectConstants::MAXIMUM_FONT_SIZE);
    return std::max(1, int(std::lround(size * ratio)));
}

QFont CharacterFormat::font(const TextStyle& style, double ratio)
{
    const FontKey key = fontKey(style, ratio);
    auto& fonts = store().fonts;
    if (const QFont* known = fonts.object(key))
        return *known;
    QFont font(key.family);
    font.setPixelSize(key.pixelSize);
    font.setWeight(key.bold ? QFont::Bold : QFont::Normal);
    font.setItalic(key.italic);
    font.setLetterSpacing(QFont::PercentageSpacing, key.kerning);
    fonts.insert(key, new QFont(font));
    return font;
}

QTextCharFormat CharacterFormat::layoutFormat(const TextStyle& style, double ratio)
{
    const FormatKey key{fontKey(style, ratio), style.getFontColor(), style.isTextEdge() != 0};
    auto& formats = store().formats;
    if (const QTextCharFormat* known = formats.object(key))
        return *known;
    QTextCharFormat format;
    format.setFontFamilies({key.font.family});
    format.setProperty(QTextFormat::FontPixelSize, key.font.pixelSize);
    format.setFontWeight(key.font.bold ? QFont::Bold : QFont::Normal);
    format.setFontItalic(key.font.italic);
    format.setFontLetterSpacingType(QFont::PercentageSpacing);
    format.setFontLetterSpacing(key.font.kerning);
    QColor invisible = color(style.getFontColor());
    invisible.setAlpha(0);
    format.setForeground(QBrush(invisible));
    if (!key.edge)
        format.setTextOutline(QPen(Qt::NoPen));
    formats.insert(key, new QTextCharFormat(format));
    return format;
}

QColor CharacterFormat::color(const std::string& text)
{
    const QColor result(QString::fromStdString(text));
    return result.isValid() ? result : QColor(Qt::black);
}

int CharacterFormat::outlineWidth(const TextStyle& style, double ratio)
{
    return int(2 * std::clamp(style.textEdge().getEdgeWidth(), 0, MAXIMUM_OUTLINE) * ratio);
}
