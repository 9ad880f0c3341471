#include "document/FontStyle.h"

#include "document/DocumentConstants.h"

FontStyle::FontStyle()
    : mSize(96)
    , mBold(0)
    , mItalic(0)
    , mShadowStyle(0)
    , mEdge(0)
    , mKerning(100)
    , mAlign(-1)
    , mFamily(DEFAULT_FONT_FAMILY)
    , mColor(DEFAULT_FONT_CORLOR)
{
}
