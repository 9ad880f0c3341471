#pragma once

#include <string>

// Drop shadow of a whole text object: a colour as "#rrggbb", an offset and a blur radius.
class TShadow
{
public:
    TShadow();

    const std::string& getShadowColor() const { return m_shadowColor; }
    void setShadowColor(const std::string& color) { m_shadowColor = color; }
    int getShadowDirectionX() const { return m_shadowDirectionX; }
    void setShadowDirectionX(int x) { m_shadowDirectionX = x; }
    int getShadowDirectionY() const { return m_shadowDirectionY; }
    void setShadowDirectionY(int y) { m_shadowDirectionY = y; }
    double getShadowBlurRadius() const { return m_shadowBlurRadius; }
    void setShadowBlurRadius(double radius) { m_shadowBlurRadius = radius; }

    // Compares exactly, including the blur radius. A NaN is equal only within the same object.
    bool operator==(const TShadow& other) const;

private:
    std::string m_shadowColor;
    int m_shadowDirectionX;
    int m_shadowDirectionY;
    double m_shadowBlurRadius;
};
