// Sends sequences of calls through all parts between a socket and the program.
#include "FrameScript.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    std::string stream;
    for (const FrameCall& call : FrameCall::read(data, size)) {
        if (stream.size() >= ServiceChain::MOST_BYTES)
            break;
        stream += call.frame();
    }
    serviceChain().receive(stream);
    return 0;
}
