#include "document/TText.h"

#include "document/DocumentConstants.h"

#include <algorithm>

TText::TText()
    : mTextObjectID(0), mText(DEFAULT_TEXT), mX(-1.0f), mY(-1.0f), mZ(-1.0f), mTextAlign(-1), mShadowStyle(0)
{
}

TText::TText(const TText& other)
    : mTextObjectID(other.mTextObjectID)
    , mText(other.mText)
    , mX(other.mX)
    , mY(other.mY)
    , mZ(other.mZ)
    , mTextAlign(other.mTextAlign)
    , mShadowStyle(other.mShadowStyle)
    , mTextShadow(other.mTextShadow)
{
    cloneTextItems(other.mTextItems);
}

TText& TText::operator=(const TText& other)
{
    if (this == &other)
        return *this;
    mTextObjectID = other.mTextObjectID;
    mText = other.mText;
    mX = other.mX;
    mY = other.mY;
    mZ = other.mZ;
    mTextAlign = other.mTextAlign;
    mShadowStyle = other.mShadowStyle;
    mTextShadow = other.mTextShadow;
    releaseVectorTextStyle();
    cloneTextItems(other.mTextItems);
    return *this;
}

TText::~TText()
{
    releaseVectorTextStyle();
}

void TText::cloneTextItems(const std::vector<TextStyle*>& items)
{
    mTextItems.reserve(items.size());
    for (const TextStyle* item : items)
        if (item)
            mTextItems.push_back(new TextStyle(*item));
}

void TText::releaseVectorTextStyle()
{
    for (TextStyle*& item : mTextItems) {
        delete item;
        item = nullptr;
    }
    mTextItems.clear();
}

bool TText::XYZvalueIsTheSame(const TText& other) const
{
    return mX == other.mX && mY == other.mY && mZ == other.mZ;
}

bool TText::shadowIsTheSame(const TText& other) const
{
    if (mShadowStyle != other.mShadowStyle)
        return false;
    return mShadowStyle < 1 || mTextShadow == other.mTextShadow;
}

bool TText::textItemsIsTheSame(const TText& other) const
{
    return std::equal(mTextItems.begin(), mTextItems.end(), other.mTextItems.begin(), other.mTextItems.end(),
                      [](const TextStyle* a, const TextStyle* b) { return a == b || (a && b && *a == *b); });
}

bool TText::operator==(const TText& other) const
{
    if (this == &other)
        return true;
    return XYZvalueIsTheSame(other) && mTextObjectID == other.mTextObjectID && mText == other.mText &&
           mTextAlign == other.mTextAlign && shadowIsTheSame(other) && textItemsIsTheSame(other);
}
