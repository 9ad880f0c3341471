#pragma once

#include <string>

// Outline of a run of text: a colour as "#rrggbb" and a width in points relative to the font's own scale.
class TEdge
{
public:
    TEdge();

    const std::string& getEdgeColor() const { return m_edgeColor; }
    void setEdgeColor(const std::string& color) { m_edgeColor = color; }
    int getEdgeWidth() const { return m_edgeWidth; }
    void setEdgeWidth(int width) { m_edgeWidth = width; }

    bool operator==(const TEdge& other) const;

private:
    std::string m_edgeColor;
    int m_edgeWidth;
};
