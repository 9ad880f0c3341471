#include "canvas/GlyphPathCache.h"

#include <QCache>
#include <QChar>
#include <QGuiApplication>
#include <QHash>
#include <QPainterPathStroker>
#include <QRawFont>
#include <QTextLayout>
#include <algorithm>

namespace
{

// Large enough for the distinct characters of two titles in both sizes.
constexpr int CACHE_BYTES = 2 * 1024 * 1024;
constexpr int REMEMBERED_PEN_WIDTHS = 2;

struct GlyphKey {
    QString family;
    QString text;
    int pixelSize;
    int weight;
    bool italic;
    double spacing;

    bool operator==(const GlyphKey&) const = default;
};

size_t qHash(const GlyphKey& key, size_t seed)
{
    return qHashMulti(seed, key.family, key.text, key.pixelSize, key.weight, key.italic, key.spacing);
}

quint64 nextId()
{
    static quint64 last = 0;
    return ++last;
}

bool mayBePicture(const QString& text)
{
    return std::any_of(text.begin(), text.end(), [](QChar c) {
        return c.isSurrogate() || c.category() == QChar::Symbol_Other || c.unicode() == 0xFE0F;
    });
}

// What is known about fonts and their characters. Cleared when fonts are imported, since these may make a
// missing family available.
struct GlyphStore {
    using Entry = std::shared_ptr<const GlyphPath>;

    QHash<QString, bool> pictureFonts; // by family
    QCache<GlyphKey, Entry> glyphs{CACHE_BYTES};

    void clear()
    {
        pictureFonts.clear();
        glyphs.clear();
    }
};

GlyphStore& store()
{
    static GlyphStore glyphStore;
    static bool connected = false;
    if (!connected && qGuiApp) {
        connected = true;
        QObject::connect(qGuiApp, &QGuiApplication::fontDatabaseChanged, qGuiApp, [] { glyphStore.clear(); });
        QObject::connect(qGuiApp, &QObject::destroyed, [] {
            glyphStore.clear();
            connected = false;
        });
    }
    return glyphStore;
}

// Returns whether the font consists of coloured pictures, whose outlines are not usable.
bool isPictureFont(const QRawFont& font)
{
    auto& known = store().pictureFonts;
    auto found = known.constFind(font.familyName());
    if (found == known.constEnd()) {
        const bool pictures = !font.fontTable("CBLC").isEmpty() || !font.fontTable("sbix").isEmpty() ||
                              !font.fontTable("COLR").isEmpty();
        found = known.insert(font.familyName(), pictures);
    }
    return found.value();
}

QList<QGlyphRun> shaped(const QFont& font, const QString& text)
{
    QTextLayout layout(text, font);
    layout.beginLayout();
    const QTextLine line = layout.createLine();
    layout.endLayout();
    if (!line.isValid())
        return {};
    QList<QGlyphRun> runs = layout.glyphRuns();
    for (QGlyphRun& run : runs) {
        QList<QPointF> positions = run.positions();
        for (QPointF& position : positions)
            position.ry() -= line.ascent();
        run.setPositions(positions);
    }
    return runs;
}

bool drawnAsPicture(const QList<QGlyphRun>& runs)
{
    return std::any_of(runs.begin(), runs.end(),
                       [](const QGlyphRun& run) { return isPictureFont(run.rawFont()); });
}

} // namespace

GlyphPath::GlyphPath(const QFont& font, const QString& text)
    : m_id(nextId()), m_font(font), m_text(text), m_hasPath(!mayBePicture(text) || !drawnAsPicture(runs()))
{
}

const QPainterPath& GlyphPath::fill() const
{
    if (!m_fillMade) {
        m_fill.addText(0.0, 0.0, m_font, m_text);
        // The contours of one glyph may overlap.
        m_fill.setFillRule(Qt::WindingFill);
        m_fillMade = true;
    }
    return m_fill;
}

const QList<QGlyphRun>& GlyphPath::runs() const
{
    if (!m_runsMade) {
        m_runs = shaped(m_font, m_text);
        m_runsMade = true;
    }
    return m_runs;
}

const QPainterPath& GlyphPath::contour() const
{
    if (!m_contourMade) {
        m_contour = fill().simplified();
        m_contourMade = true;
    }
    return m_contour;
}

const QPainterPath& GlyphPath::outline(int penWidth) const
{
    const auto known = std::find_if(m_outlines.begin(), m_outlines.end(),
                                    [penWidth](const auto& o) { return o->penWidth == penWidth; });
    if (known != m_outlines.end())
        return (*known)->area;
    if (m_outlines.size() >= REMEMBERED_PEN_WIDTHS)
        m_outlines.erase(m_outlines.begin());
    QPainterPathStroker stroker;
    stroker.setWidth(penWidth);
    stroker.setJoinStyle(Qt::SvgMiterJoin);
    stroker.setCapStyle(Qt::SquareCap);
    auto made = std::make_unique<Outline>(Outline{penWidth, stroker.createStroke(contour())});
    made->area.setFillRule(Qt::WindingFill);
    m_outlines.push_back(std::move(made));
    return m_outlines.back()->area;
}

int GlyphPath::cost() const
{
    // Estimated, since the forms are computed later: a contour has about forty points, a Chinese one a
    // hundred, and its outlines have four times as many.
    const int points = m_text.isEmpty() || m_text.at(0).unicode() < 0x2E80 ? 40 : 100;
    return int(sizeof(GlyphPath)) + 6 * points * int(sizeof(QPainterPath::Element));
}

std::shared_ptr<const GlyphPath> GlyphPathCache::glyph(const QFont& font, const QString& text)
{
    auto& cache = store().glyphs;
    const GlyphKey key{font.family(), text,          font.pixelSize(),
                       font.weight(), font.italic(), text.size() > 1 ? font.letterSpacing() : 0.0};
    if (const GlyphStore::Entry* known = cache.object(key))
        return *known;
    auto made = std::make_shared<const GlyphPath>(font, text);
    cache.insert(key, new GlyphStore::Entry(made), made->cost());
    return made;
}
