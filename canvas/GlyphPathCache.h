#pragma once

#include <QFont>
#include <QGlyphRun>
#include <QList>
#include <QPainterPath>
#include <QString>
#include <memory>
#include <vector>

// Shape of one character (with its marks) at the origin of its baseline. Each form of it is made when it is
// first asked for, once per font and text.
class GlyphPath
{
public:
    GlyphPath(const QFont& font, const QString& text);

    // False for characters without an outline, which only the font system can draw: colour emoji.
    bool hasPath() const { return m_hasPath; }
    const QPainterPath& fill() const;
    // The area that a pen of the width covers on the merged contour. Width at least 1.
    const QPainterPath& outline(int penWidth) const;
    // The merged contour itself, for hairlines.
    const QPainterPath& contour() const;
    // The glyphs as the font system draws them; positions are relative to the baseline.
    const QList<QGlyphRun>& runs() const;

    // Bytes, roughly, of all forms.
    int cost() const;

private:
    struct Outline {
        int penWidth;
        QPainterPath area;
    };

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

// The glyph paths used last in this process; those on screen are held by their text objects. GUI thread only.
class GlyphPathCache
{
public:
    static std::shared_ptr<const GlyphPath> glyph(const QFont& font, const QString& text);
};
