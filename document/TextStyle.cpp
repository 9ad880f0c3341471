#include "document/TextStyle.h"

#include "document/DocumentConstants.h"

TextStyle::TextStyle()
    : mText(DEFAULT_TEXT)
    , mFontFamily(DEFAULT_FONT_FAMILY)
    , mFontColor(DEFAULT_FONT_CORLOR)
    , mAlphaDefaultFont(DEFAULT_FONT_FAMILY)
    , mFontSize(96)
    , mFontBold(0)
    , mTextItalic(0)
    , mTextKerning(100)
    , mIsTextEdge(0)
{
}

bool TextStyle::fontIsTheSame(const TextStyle& other) const
{
    return mFontSize == other.mFontSize && mFontBold == other.mFontBold && mTextItalic == other.mTextItalic &&
           mFontFamily == other.mFontFamily && mFontColor == other.mFontColor;
}

bool TextStyle::edgeIsTheSame(const TextStyle& other) const
{
    if (mIsTextEdge != other.mIsTextEdge)
        return false;
    return mIsTextEdge == 0 || mTextEdge == other.mTextEdge;
}

bool TextStyle::operator==(const TextStyle& other) const
{
    if (this == &other)
        return true;
    return fontIsTheSame(other) && mTextKerning == other.mTextKerning && mText == other.mText &&
           edgeIsTheSame(other);
}
