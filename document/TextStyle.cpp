#include "document/TextStyle.h"

#include "document/DocumentConstants.h"

TextStyle::TextStyle()
    : m_text(DEFAULT_TEXT)
    , m_fontFamily(DEFAULT_FONT_FAMILY)
    , m_fontColor(DEFAULT_FONT_CORLOR)
    , m_alphaDefaultFont(DEFAULT_FONT_FAMILY)
    , m_fontSize(96)
    , m_fontBold(0)
    , m_textItalic(0)
    , m_textKerning(100)
    , m_isTextEdge(0)
{
}

bool TextStyle::fontIsTheSame(const TextStyle& other) const
{
    return m_fontSize == other.m_fontSize && m_fontBold == other.m_fontBold &&
           m_textItalic == other.m_textItalic && m_fontFamily == other.m_fontFamily &&
           m_fontColor == other.m_fontColor;
}

bool TextStyle::edgeIsTheSame(const TextStyle& other) const
{
    if (m_isTextEdge != other.m_isTextEdge)
        return false;
    return m_isTextEdge == 0 || m_textEdge == other.m_textEdge;
}

bool TextStyle::operator==(const TextStyle& other) const
{
    if (this == &other)
        return true;
    return fontIsTheSame(other) && m_textKerning == other.m_textKerning && m_text == other.m_text &&
           edgeIsTheSame(other);
}
