#pragma once

// What the canvas asks of the window that shows it. The window installs itself; without one the canvas counts
// as hidden. GUI thread only.
class ICanvasHost
{
public:
    virtual ~ICanvasHost() = default;

    // True while the operator can see the window.
    virtual bool windowIsVisible() const = 0;

    static ICanvasHost* instance();
    // The caller keeps ownership and clears the pointer before the host dies.
    static void setInstance(ICanvasHost* host);
};
