#pragma once

#include "document/FontStyle.h"
#include "document/TText.h"

#include <QList>
#include <QString>
#include <memory>

// The panel's copy of the style of what is selected, one TextStyle a character, and the changes that the tool
// boxes make to it. Nothing is changed while there is no copy. Sizes are pixels of the 1920 raster, places
// pixels of the 1280 canvas. Plain data.
class WorkingStyle
{
public:
    // To the side and down.
    static constexpr int SHADOW_OFFSET = 4;
    static constexpr char SHADOW_COLOR[] = "#000000";

    // Percent of the font's own spacing; the index is the level.
    static const QList<int>& kernings();
    // The index is the shadow style.
    static const QList<TShadow>& shadows();

    // Null until the first style arrives.
    const TText* record() const { return m_record.get(); }
    void set(const TText& record) { m_record = std::make_unique<TText>(record); }
    void clear() { m_record.reset(); }

    void setFamily(const QString& family);
    // One size a character; characters beyond the list keep theirs.
    void setSizes(const QList<int>& sizes);
    void setBold(int bold);
    void setItalic(int italic);
    void setColor(const QString& color);
    // One colour a character; characters beyond the list keep theirs.
    void setColors(const QList<QString>& colors);
    // Of the edge only what is named changes.
    void setEdge(int on);
    void setEdgeWidth(int width);
    void setEdgeColor(const QString& color);
    void setEdgeColors(const QList<QString>& colors);
    // Percent.
    void setKerning(int kerning);
    void setAlign(int align);
    // An index of shadows().
    void setShadow(int style);
    void moveBy(float x, float y);

    // One a character.
    QList<QString> colors() const;
    QList<QString> edgeColors() const;
    // What the next run starts with: the style of the first character. The defaults without one.
    FontStyle fontStyle() const;

private:
    template <typename Edit>
    void editAll(Edit edit);

    std::unique_ptr<TText> m_record;
};
