#include "document/TEdge.h"

#include "document/DocumentConstants.h"

TEdge::TEdge() : m_edgeColor(DEFAULT_EDGE_COLOR), m_edgeWidth(2)
{
}

bool TEdge::operator==(const TEdge& other) const
{
    return this == &other || (m_edgeWidth == other.m_edgeWidth && m_edgeColor == other.m_edgeColor);
}
