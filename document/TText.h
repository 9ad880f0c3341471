#pragma once

#include "document/TShadow.h"
#include "document/TextStyle.h"

#include <string>
#include <utility>
#include <vector>

// One text object of a title: its text, position, alignment, shadow, and its runs in reading order. Strings
// are UTF-8; positions are scene coordinates of the 1280 x 720 canvas. A copy is deep, including runs and
// shadow.
class TText
{
public:
    TText();
    TText(const TText& other);
    TText& operator=(const TText& other);
    ~TText();

    int getTextObjectID() const { return mTextObjectID; }
    void setTextObjectID(int id) { mTextObjectID = id; }
    const std::string& getText() const { return mText; }
    void setText(std::string text) { mText = std::move(text); }

    float getXValue() const { return mX; }
    void setXValue(float x) { mX = x; }
    float getYValue() const { return mY; }
    void setYValue(float y) { mY = y; }
    float getZValue() const { return mZ; }
    void setZValue(float z) { mZ = z; }

    // -1 left, 0 centre, 1 right.
    int getTextAlign() const { return mTextAlign; }
    void setTextAlign(int align) { mTextAlign = align; }

    // 0 for no shadow, 1 to 3 for the presets.
    int getShadowStyle() const { return mShadowStyle; }
    void setShadowStyle(int style) { mShadowStyle = style; }

    // Never null. Owned by this record; may be changed in place. Keeps its values while the style is 0.
    TShadow* getTextShadow() { return &mTextShadow; }
    const TShadow* getTextShadow() const { return &mTextShadow; }
    void setTextShadow(const TShadow& shadow) { mTextShadow = shadow; }

    // Returns a copy of the vector; this record keeps ownership of the runs, which may be changed in place.
    std::vector<TextStyle*> getTextItems() const { return mTextItems; }

    // Takes ownership of the runs. Does NOT delete the previous ones: call releaseVectorTextStyle() first to
    // replace them.
    void setTextItems(const std::vector<TextStyle*>& items) { mTextItems = items; }
    void setTextItems(std::vector<TextStyle*>&& items) { mTextItems = std::move(items); }

    // Returns the same runs without copying the vector; valid until the runs are replaced.
    const std::vector<TextStyle*>& textItems() const { return mTextItems; }

    // Deletes all runs.
    void releaseVectorTextStyle();

    bool XYZvalueIsTheSame(const TText& other) const;

    // Returns whether the shadows look the same. Shadows that are off are equal, whatever their values.
    bool shadowIsTheSame(const TText& other) const;

    bool textItemsIsTheSame(const TText& other) const;

    bool operator==(const TText& other) const;

private:
    void cloneTextItems(const std::vector<TextStyle*>& items);

    int mTextObjectID;
    std::string mText;
    float mX;
    float mY;
    float mZ;
    int mTextAlign;
    int mShadowStyle;
    TShadow mTextShadow;
    std::vector<TextStyle*> mTextItems; // owned
};
