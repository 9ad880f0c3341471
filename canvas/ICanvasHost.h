#pragma once

// What the canvas needs to know about the window that shows it. The window installs itself; without one the
// canvas counts as hidden. GUI thread only.
class ICanvasHost
{
public:
    virtual ~ICanvasHost() = default;

    // Returns whether the operator can see the window.
    virtual bool windowIsVisible() const = 0;

    static ICanvasHost* instance();
    // Sets the host, which the caller keeps owning. Call with null before the host is destroyed.
    static void setInstance(ICanvasHost* host);
};
