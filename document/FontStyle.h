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

    int getSize() const { return mSize; }
    void setSize(int size) { mSize = size; }
    int getBold() const { return mBold; }
    void setBold(int bold) { mBold = bold; }
    int getItalic() const { return mItalic; }
    void setItalic(int italic) { mItalic = italic; }
    int getShadowStyle() const { return mShadowStyle; }
    void setShadowStyle(int style) { mShadowStyle = style; }
    int getEdge() const { return mEdge; }
    void setEdge(int edge) { mEdge = edge; }
    int getKerning() const { return mKerning; }
    void setKerning(int kerning) { mKerning = kerning; }
    int getAlign() const { return mAlign; }
    void setAlign(int align) { mAlign = align; }
    const std::string& getFamily() const { return mFamily; }
    void setFamily(const std::string& family) { mFamily = family; }
    const std::string& getColor() const { return mColor; }
    void setColor(const std::string& color) { mColor = color; }

    // Never null. Owned by this record; may be changed in place.
    TEdge* getEdgePoint() { return &mEdgePoint; }
    const TEdge* getEdgePoint() const { return &mEdgePoint; }
    void setEdgePoint(TEdge edge) { mEdgePoint = std::move(edge); }

    // Never null. Owned by this record; may be changed in place.
    TShadow* getShadowPoint() { return &mShadowPoint; }
    const TShadow* getShadowPoint() const { return &mShadowPoint; }
    void setShadowPoint(TShadow shadow) { mShadowPoint = std::move(shadow); }

private:
    int mSize;
    int mBold;
    int mItalic;
    int mShadowStyle;
    int mEdge;
    int mKerning;
    int mAlign;
    std::string mFamily;
    std::string mColor;
    TEdge mEdgePoint;
    TShadow mShadowPoint;
};
