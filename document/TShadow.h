// Drop shadow of a whole text object: a colour as "#rrggbb", an offset and a blur radius.
#pragma once

#include <string>

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

    // Exact comparison, the blur radius included; a NaN equals nothing but its own record.
    bool operator==(const TShadow& other) const;

private:
    std::string mShadowColor;
    int mShadowDirectionX;
    int mShadowDirectionY;
    double mShadowBlurRadius;
};
