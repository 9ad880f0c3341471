#pragma once

#include "document/TEdge.h"

#include <string>
#include <utility>

// Style of one run of text in a TText. In the canvas each run has exactly one character. Strings are UTF-8,
// colours "#rrggbb". A copy is independent of its source.
class TextStyle
{
public:
    TextStyle();

    const std::string& getText() const { return mText; }
    void setText(std::string text) { mText = std::move(text); }
    const std::string& getFontFamily() const { return mFontFamily; }
    void setFontFamily(const std::string& family) { mFontFamily = family; }
    const std::string& getFontColor() const { return mFontColor; }
    void setFontColor(const std::string& color) { mFontColor = color; }

    // The family that was the default of the input language when the run was typed.
    const std::string& getAlphaDefaultFontOfInputLanguage() const { return mAlphaDefaultFont; }
    void setAlphaDefaultFontOfInputLanguage(std::string family) { mAlphaDefaultFont = std::move(family); }

    int getFontSize() const { return mFontSize; }
    void setFontSize(int size) { mFontSize = size; }
    int isFontBold() const { return mFontBold; }
    void setFontBold(int bold) { mFontBold = bold; }
    int isTextItalic() const { return mTextItalic; }
    void setIsTextItalic(int italic) { mTextItalic = italic; }

    // Letter spacing in percent; 100 is the font's normal spacing.
    int getTextKerning() const { return mTextKerning; }
    void setTextKerning(int kerning) { mTextKerning = kerning; }

    // 0 for no outline; with any other value the outline of getTextEdge() applies.
    int isTextEdge() const { return mIsTextEdge; }
    void setIsTextEdge(int edge) { mIsTextEdge = edge; }

    // Keeps its values while the outline is off.
    TEdge getTextEdge() const { return mTextEdge; }
    void setTextEdge(TEdge edge) { mTextEdge = std::move(edge); }

    // Returns the same outline without a copy, for painting and saving.
    const TEdge& textEdge() const { return mTextEdge; }

    // Compares family, size, colour, bold and italic, but neither kerning nor outline.
    bool fontIsTheSame(const TextStyle& other) const;

    // Compares the outlines. Outlines that are off are equal, whatever their values.
    bool edgeIsTheSame(const TextStyle& other) const;

    // Compares everything except the default font of the input language.
    bool operator==(const TextStyle& other) const;

private:
    std::string mText;
    std::string mFontFamily;
    std::string mFontColor;
    std::string mAlphaDefaultFont;
    int mFontSize;
    int mFontBold;
    int mTextItalic;
    int mTextKerning;
    int mIsTextEdge;
    TEdge mTextEdge;
};
