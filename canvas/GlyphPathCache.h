#pragma once

#include <QFont>
#include <QGlyphRun>
#include <QList>
#include <QPainterPath>
#include <QString>
#include <memory>
#include <vector>

// The shape of one character (with its marks), with the origin on its baseline. Each form of it is computed
// when it is first requested, once per font and text.
class GlyphPath
{
public:
    GlyphPath(const QFont& font, const QString& text);
    Q_DISABLE_COPY(GlyphPath)

    // Returns false for characters without an outline, such as colour emoji, which only the font system can
    // draw.
    bool hasPath() const { return m_hasPath; }
    const QPainterPath& fill() const;
    // Returns the area that a pen of the width covers when it follows the merged contour. The width is at
    // least 1.
    const QPainterPath& outline(int penWidth) const;
    // Returns the merged contour itself, for hairlines.
    const QPainterPath& contour() const;
    // Returns the glyphs as the font system draws them; positions are relative to the baseline.
    const QList<QGlyphRun>& runs() const;

    // Returns an estimate of the bytes that all forms take.
    int cost() const;
    // Returns a number that no other object of this process has or had.
    quint64 id() const { return m_id; }

private:
    struct Outline {
        int penWidth;
        QPainterPath area;
    };

    quint64 m_id;
    QFont m_font;
    QString m_text;
    mutable QPainterPath m_fill;
    mutable QPainterPath m_contour;
    mutable QList<QGlyphRun> m_runs;
    mutable std::vector<std::unique_ptr<Outline>> m_outlines;
    mutable bool m_fillMade = false;
    mutable bool m_contourMade = false;
    mutable bool m_runsMade = false;
    bool m_hasPath = true;
};

// Caches the glyph paths used last in this process. Text objects keep those on screen alive. GUI thread only.
class GlyphPathCache
{
public:
    static std::shared_ptr<const GlyphPath> glyph(const QFont& font, const QString& text);
};
