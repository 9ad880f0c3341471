// Sends random bytes over a connection. The input is a sequence of pieces, each one byte, two bytes of length
// and the bytes; an odd first byte fills the frame up with zeros.
#include "ServiceChain.h"

#include <algorithm>
#include <cstdint>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    constexpr auto FRAME = static_cast<std::size_t>(SocketFrame::FRAME_SIZE);
    std::string stream;
    while (size >= 3 && stream.size() < ServiceChain::MOST_BYTES) {
        const std::size_t length = std::min<std::size_t>(data[1] | (data[2] << 8), size - 3);
        stream.append(reinterpret_cast<const char*>(data + 3), length);
        if (data[0] % 2 == 1)
            stream.resize((stream.size() + FRAME - 1) / FRAME * FRAME);
        data += 3 + length;
        size -= 3 + length;
    }
    serviceChain().receive(stream);
    return 0;
}
