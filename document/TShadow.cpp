#include "document/TShadow.h"

#include "document/DocumentConstants.h"

TShadow::TShadow()
    : m_shadowColor(DEFAULT_SHADOW_COLOR)
    , m_shadowDirectionX(0)
    , m_shadowDirectionY(0)
    , m_shadowBlurRadius(18.3)
{
}

bool TShadow::operator==(const TShadow& other) const
{
    return this == &other ||
           (m_shadowDirectionX == other.m_shadowDirectionX &&
            m_shadowDirectionY == other.m_shadowDirectionY &&
            m_shadowBlurRadius == other.m_shadowBlurRadius && m_shadowColor == other.m_shadowColor);
}
