#pragma once

#include "ServiceChain.h"

#include <algorithm>
#include <cstdint>
#include <cstring>
#include <string>
#include <vector>

// A compact form of frames, so that the fuzzer changes calls and not padding. A script is a sequence of
//
//   receiver, object, method, flags: one byte each; length of the payload: two bytes; the payload
//
// each of which becomes one frame of the wire.
struct FrameCall {
    enum Flag : std::uint8_t {
        CALLBACK = 1,  // for a callback adapter
        REMOTE = 2,    // the call comes from another process
        LIES = 4,      // the size in the header is not that of the payload
        CUT = 8,       // the frame ends after the payload
        NEGATIVE = 16, // with LIES: the size is negative
    };

    std::uint8_t receiver = 0;
    std::uint8_t object = 0;
    std::uint8_t method = 0;
    std::uint8_t flags = 0;
    std::vector<std::uint8_t> payload;

    static constexpr std::size_t HEAD = 6;

    // Reads all complete calls; the payload of the last one may be cut off.
    static std::vector<FrameCall> read(const std::uint8_t* data, std::size_t size)
    {
        std::vector<FrameCall> calls;
        while (size >= HEAD) {
            const std::size_t length = std::min<std::size_t>(data[4] | (data[5] << 8), size - HEAD);
            calls.push_back({data[0], data[1], data[2], data[3], {data + HEAD, data + HEAD + length}});
            data += HEAD + length;
            size -= HEAD + length;
        }
        return calls;
    }

    static std::vector<std::uint8_t> write(const std::vector<FrameCall>& calls)
    {
        std::vector<std::uint8_t> bytes;
        for (const FrameCall& call : calls) {
            const std::size_t length = std::min<std::size_t>(call.payload.size(), 0xffff);
            for (const std::size_t value :
                 {std::size_t(call.receiver), std::size_t(call.object), std::size_t(call.method),
                  std::size_t(call.flags), length & 0xff, length >> 8})
                bytes.push_back(static_cast<std::uint8_t>(value));
            bytes.insert(bytes.end(), call.payload.begin(),
                         call.payload.begin() + static_cast<std::ptrdiff_t>(length));
        }
        return bytes;
    }

    std::string frame() const
    {
        std::string bytes(static_cast<std::size_t>(SocketFrame::FRAME_SIZE), '\0');
        const auto put = [&bytes](long offset, std::int64_t value) {
            std::memcpy(bytes.data() + offset, &value, sizeof value);
        };
        const std::size_t length =
            std::min(payload.size(), static_cast<std::size_t>(SocketFrame::MAX_PAYLOAD));
        std::int64_t size = static_cast<std::int64_t>(length);
        if (flags & LIES)
            size = flags & NEGATIVE ? -size : size * 3 + 1;
        const bool isCallBack = flags & CALLBACK;
        put(SocketFrame::RECEIVER_ID, receiver % 8 == 7 ? receiver : ServiceChain::RECEIVER);
        put(SocketFrame::OBJECT_ID,
            isCallBack ? object % (ServiceChain::CALLBACK_ADAPTERS + 1) : TitlerAdapter::INTERFACE_ID);
        put(SocketFrame::METHOD_ID, method % 10);
        put(SocketFrame::IS_CALLBACK, isCallBack);
        put(SocketFrame::SIZE, size);
        put(SocketFrame::IS_REMOTE, flags & REMOTE ? 1 : 0);
        std::copy_n(payload.begin(), length, bytes.begin() + SocketFrame::HEADER_SIZE);
        if (flags & CUT)
            bytes.resize(static_cast<std::size_t>(SocketFrame::HEADER_SIZE) + length);
        return bytes;
    }
};
