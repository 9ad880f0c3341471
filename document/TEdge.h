#pragma once

#include <string>

// Outline of a run of text: a colour as "#rrggbb" and a width in points relative to the font's own scale.
class TEdge
{
public:
    TEdge();

    const std::string& getEdgeColor() const { return mEdgeColor; }
    void setEdgeColor(const std::string& color) { mEdgeColor = color; }
    int getEdgeWidth() const { return mEdgeWidth; }
    void setEdgeWidth(int width) { mEdgeWidth = width; }

    bool operator==(const TEdge& other) const;

private:
    std::string mEdgeColor;
    int mEdgeWidth;
};
