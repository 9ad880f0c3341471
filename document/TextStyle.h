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

    const std::string& getText() const { return m_text; }
    void setText(std::string text) { m_text = std::move(text); }
    const std::string& getFontFamily() const { return m_fontFamily; }
    void setFontFamily(const std::string& family) { m_fontFamily = family; }
    const std::string& getFontColor() const { return m_fontColor; }
    void setFontColor(const std::string& color) { m_fontColor = color; }

    // The family that was the default of the input language when the run was typed.
    const std::string& getAlphaDefaultFontOfInputLanguage() const { return m_alphaDefaultFont; }
    void setAlphaDefaultFontOfInputLanguage(std::string family) { m_alphaDefaultFont = std::move(family); }

    int getFontSize() const { return m_fontSize; }
    void setFontSize(int size) { m_fontSize = size; }
    int isFontBold() const { return m_fontBold; }
    void setFontBold(int bold) { m_fontBold = bold; }
    int isTextItalic() const { return m_textItalic; }
    void setIsTextItalic(int italic) { m_textItalic = italic; }

    // Letter spacing in percent; 100 is the font's normal spacing.
    int getTextKerning() const { return m_textKerning; }
    void setTextKerning(int kerning) { m_textKerning = kerning; }

    // 0 for no outline; with any other value the outline of getTextEdge() applies.
    int isTextEdge() const { return m_isTextEdge; }
    void setIsTextEdge(int edge) { m_isTextEdge = edge; }

    // Keeps its values while the outline is off.
    TEdge getTextEdge() const { return m_textEdge; }
    void setTextEdge(TEdge edge) { m_textEdge = std::move(edge); }

    // Returns the same outline without a copy, for painting and saving.
    const TEdge& textEdge() const { return m_textEdge; }

    // Compares family, size, colour, bold and italic, but neither kerning nor outline.
    bool fontIsTheSame(const TextStyle& other) const;

    // Compares the outlines. Outlines that are off are equal, whatever their values.
    bool edgeIsTheSame(const TextStyle& other) const;

    // Compares everything except the default font of the input language.
    bool operator==(const TextStyle& other) const;

private:
    std::string m_text;
    std::string m_fontFamily;
    std::string m_fontColor;
    std::string m_alphaDefaultFont;
    int m_fontSize;
    int m_fontBold;
    int m_textItalic;
    int m_textKerning;
    int m_isTextEdge;
    TEdge m_textEdge;
};
