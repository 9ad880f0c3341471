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

    int getTextObjectID() const { return m_textObjectID; }
    void setTextObjectID(int id) { m_textObjectID = id; }
    const std::string& getText() const { return m_text; }
    void setText(std::string text) { m_text = std::move(text); }

    float getXValue() const { return m_x; }
    void setXValue(float x) { m_x = x; }
    float getYValue() const { return m_y; }
    void setYValue(float y) { m_y = y; }
    float getZValue() const { return m_z; }
    void setZValue(float z) { m_z = z; }

    // -1 left, 0 centre, 1 right.
    int getTextAlign() const { return m_textAlign; }
    void setTextAlign(int align) { m_textAlign = align; }

    // 0 for no shadow, 1 to 3 for the presets.
    int getShadowStyle() const { return m_shadowStyle; }
    void setShadowStyle(int style) { m_shadowStyle = style; }

    // Never null. Owned by this record; may be changed in place. Keeps its values while the style is 0.
    TShadow* getTextShadow() { return &m_textShadow; }
    const TShadow* getTextShadow() const { return &m_textShadow; }
    void setTextShadow(const TShadow& shadow) { m_textShadow = shadow; }

    // Returns a copy of the vector; this record keeps ownership of the runs, which may be changed in place.
    std::vector<TextStyle*> getTextItems() const { return m_textItems; }

    // Takes ownership of the runs. Does NOT delete the previous ones: call releaseVectorTextStyle() first to
    // replace them.
    void setTextItems(const std::vector<TextStyle*>& items) { m_textItems = items; }
    void setTextItems(std::vector<TextStyle*>&& items) { m_textItems = std::move(items); }

    // Returns the same runs without copying the vector; valid until the runs are replaced.
    const std::vector<TextStyle*>& textItems() const { return m_textItems; }

    // Deletes all runs.
    void releaseVectorTextStyle();

    bool XYZvalueIsTheSame(const TText& other) const;

    // Returns whether the shadows look the same. Shadows that are off are equal, whatever their values.
    bool shadowIsTheSame(const TText& other) const;

    bool textItemsIsTheSame(const TText& other) const;

    bool operator==(const TText& other) const;

private:
    void assignTextItems(const std::vector<TextStyle*>& items);

    int m_textObjectID;
    std::string m_text;
    float m_x;
    float m_y;
    float m_z;
    int m_textAlign;
    int m_shadowStyle;
    TShadow m_textShadow;
    std::vector<TextStyle*> m_textItems; // owned
};
