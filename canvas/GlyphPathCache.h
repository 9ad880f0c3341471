#pragma once

#include <QFont>
#include <QPainterPath>
#include <QString>
#include <memory>
#include <vector>

// Outline of one character (with its marks) at the origin of its baseline. Made once per font and text.
class GlyphPath
{
public:
    GlyphPath(const QFont& font, const QString& text);

    // False for characters without an outline, which only the font system can draw: colour emoji.
    bool hasPath() const { return m_hasPath; }
    const QPainterPath& fill() const { return m_fill; }
    // The area that a pen of the width covers on the merged contour. Width at least 1.
    const QPainterPath& outline(int penWidth) const;
    // The merged contour itself, for hairlines.
    const QPainterPath& contour() const;

    // Bytes, roughly.
    int cost() const;

private:
    struct Outline {
        int penWidth;
        QPainterPath area;
    };

    QPainterPath m_fill;
    mutable QPainterPath m_contour;
    mutable bool m_contourMade = false;
    mutable std::vector<std::unique_ptr<Outline>> m_outlines;
    bool m_hasPath = true;
};

// The glyph paths used last in this process; those on screen are held by their text objects. GUI thread only.
class GlyphPathCache
{
public:
    static std::shared_ptr<const GlyphPath> glyph(const QFont& font, const QString& text);
};
