#pragma once

#include "document/FontStyle.h"
#include "document/TText.h"

#include <QList>
#include <QString>
#include <memory>

// The panel's copy of the style of the selection, one TextStyle per character, and the changes that the tool
// boxes make to it. While there is no copy, changes do nothing. Sizes are pixels of the 1920 raster, places
// pixels of the 1280 canvas. Plain data.
class WorkingStyle
{
public:
    // Pixels by which a shadow is offset, horizontally and vertically.
    static constexpr int SHADOW_OFFSET = 4;
    static constexpr char SHADOW_COLOR[] = "#000000";

    // Returns the spacing of each level, in percent of the font's own spacing.
    static const QList<int>& kernings();
    // Returns the shadow of each shadow style.
    static const QList<TShadow>& shadows();

    // Returns the copy; null until the first style arrives.
    const TText* record() const { return m_record.get(); }
    void set(const TText& record) { m_record = std::make_unique<TText>(record); }
    void clear() { m_record.reset(); }

    void setFamily(const QString& family);
    // Sets one size per character; characters beyond the list keep theirs.
    void setSizes(const QList<int>& sizes);
    void setBold(int bold);
    void setItalic(int italic);
    void setColor(const QString& color);
    // Sets one colour per character; characters beyond the list keep theirs.
    void setColors(const QList<QString>& colors);
    // Change one property of the edge each and keep the others.
    void setEdge(int on);
    void setEdgeWidth(int width);
    void setEdgeColor(const QString& color);
    void setEdgeColors(const QList<QString>& colors);
    // Sets the letter spacing in percent.
    void setKerning(int kerning);
    void setAlign(int align);
    // Sets the shadow; style is an index of shadows().
    void setShadow(int style);
    void moveBy(float x, float y);

    // Return one colour per character.
    QList<QString> colors() const;
    QList<QString> edgeColors() const;
    // Returns the style that the next run starts with: that of the first character, or the defaults if there
    // is none.
    FontStyle fontStyle() const;

private:
    template <typename Edit>
    void editAll(Edit edit);

    std::unique_ptr<TText> m_record;
};
