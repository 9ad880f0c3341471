#pragma once

#include "document/TEdge.h"
#include "document/TShadow.h"

#include <string>
#include <utility>

// The flat text style that the property panel remembers between objects. It is stored in the settings, not in
// a title. Strings are UTF-8, colours "#rrggbb". A copy is independent of its source.
class FontStyle
{
public:
    FontStyle();

    int getSize() const { return m_size; }
    void setSize(int size) { m_size = size; }
    int getBold() const { return m_bold; }
    void setBold(int bold) { m_bold = bold; }
    int getItalic() const { return m_italic; }
    void setItalic(int italic) { m_italic = italic; }
    int getShadowStyle() const { return m_shadowStyle; }
    void setShadowStyle(int style) { m_shadowStyle = style; }
    int getEdge() const { return m_edge; }
    void setEdge(int edge) { m_edge = edge; }
    int getKerning() const { return m_kerning; }
    void setKerning(int kerning) { m_kerning = kerning; }
    int getAlign() const { return m_align; }
    void setAlign(int align) { m_align = align; }
    const std::string& getFamily() const { return m_family; }
    void setFamily(const std::string& family) { m_family = family; }
    const std::string& getColor() const { return m_color; }
    void setColor(const std::string& color) { m_color = color; }

    // Never null. Owned by this record; may be changed in place.
    TEdge* getEdgePoint() { return &m_edgePoint; }
    const TEdge* getEdgePoint() const { return &m_edgePoint; }
    void setEdgePoint(TEdge edge) { m_edgePoint = std::move(edge); }

    // Never null. Owned by this record; may be changed in place.
    TShadow* getShadowPoint() { return &m_shadowPoint; }
    const TShadow* getShadowPoint() const { return &m_shadowPoint; }
    void setShadowPoint(TShadow shadow) { m_shadowPoint = std::move(shadow); }

private:
    int m_size;
    int m_bold;
    int m_italic;
    int m_shadowStyle;
    int m_edge;
    int m_kerning;
    int m_align;
    std::string m_family;
    std::string m_color;
    TEdge m_edgePoint;
    TShadow m_shadowPoint;
};
