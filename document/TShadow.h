#pragma once

#include <string>

// Drop shadow of a whole text object: a colour as "#rrggbb", an offset and a blur radius.
class TShadow
{
public:
    TShadow();

    const std::string& getShadowColor() const { return mShadowColor; }
    void setShadowColor(const std::string& color) { mShadowColor = color; }
    int getShadowDirectionX() const { return mShadowDirectionX; }
    void setShadowDirectionX(int x) { mShadowDirectionX = x; }
    int getShadowDirectionY() const { return mShadowDirectionY; }
    void setShadowDirectionY(int y) { mShadowDirectionY = y; }
    double getShadowBlurRadius() const { return mShadowBlurRadius; }
    void setShadowBlurRadius(double radius) { mShadowBlurRadius = radius; }

    // Compares exactly, including the blur radius. A NaN is equal only within the same object.
    bool operator==(const TShadow& other) const;

private:
    std::string mShadowColor;
    int mShadowDirectionX;
    int mShadowDirectionY;
    double mShadowBlurRadius;
};
