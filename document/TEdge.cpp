#include "document/TEdge.h"

#include "document/DocumentConstants.h"

TEdge::TEdge() : mEdgeColor(DEFAULT_EDGE_COLOR), mEdgeWidth(2)
{
}

bool TEdge::operator==(const TEdge& other) const
{
    return this == &other || (mEdgeWidth == other.mEdgeWidth && mEdgeColor == other.mEdgeColor);
}
