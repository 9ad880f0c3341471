#include "document/TShadow.h"

#include "document/DocumentConstants.h"

TShadow::TShadow()
    : mShadowColor(DEFAULT_SHADOW_COLOR), mShadowDirectionX(0), mShadowDirectionY(0), mShadowBlurRadius(18.3)
{
}

bool TShadow::operator==(const TShadow& other) const
{
    return this == &other ||
           (mShadowDirectionX == other.mShadowDirectionX && mShadowDirectionY == other.mShadowDirectionY &&
            mShadowBlurRadius == other.mShadowBlurRadius && mShadowColor == other.mShadowColor);
}
