#include "canvas/ICanvasHost.h"

namespace
{
ICanvasHost* currentHost = nullptr;
}

ICanvasHost* ICanvasHost::instance()
{
    return currentHost;
}

void ICanvasHost::setInstance(ICanvasHost* host)
{
    currentHost = host;
}
