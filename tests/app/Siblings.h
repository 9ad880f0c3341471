// The two sibling processes as the window needs them: something that accepts connections. Calls to them
// vanish.
#pragma once

#include "messaging/ptc/SocketRemoteReceiver.h"

class Siblings
{
public:
    bool listen() { return mMain.initialize(1000) && mSubPanel.initialize(1002); }

private:
    SocketRemoteReceiver mMain{0};
    SocketRemoteReceiver mSubPanel{0};
};
