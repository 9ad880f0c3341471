#pragma once

#include "canvas/ICanvasHost.h"

// A window that shows or not. The test installs it.
class FakeCanvasHost : public ICanvasHost
{
public:
    bool windowIsVisible() const override { return visible; }

    bool visible = false;
};
