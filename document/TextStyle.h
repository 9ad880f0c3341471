// Look of one run of text in a TText. The canvas keeps every run at one character.
// Strings are UTF-8, colours "#rrggbb". A copy shares nothing with its source.
#pragma once

#include "document/TEdge.h"

#include <string>
#include <utility>

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

    // Letter spacing in percent; 100 is the font's own.
    int getTextKerning() const { return mTextKerning; }
    void setTextKerning(int kerning) { mTextKerning = kerning; }

    // 0: no outline; any other value: the outline of getTextEdge() applies.
    int isTextEdge() const { return mIsTextEdge; }
    void setIsTextEdge(int edge) { mIsTextEdge = edge; }

    // Kept while the outline is off, too.
    TEdge getTextEdge() const { return mTextEdge; }
    void setTextEdge(TEdge edge) { mTextEdge = std::move(edge); }

    // The same outline without a copy, for painting and saving.
    const TEdge& textEdge() const { return mTextEdge; }

    // Family, size, colour, bold and italic; neither kerning nor outline.
    bool fontIsTheSame(const TextStyle& other) const;

    // Outlines that are off are the same whatever their values.
    bool edgeIsTheSame(const TextStyle& other) const;

    // Everything but the alpha default font.
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
