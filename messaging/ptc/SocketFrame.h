// The frame of the wire: a fixed 20,480 bytes, little-endian 64-bit integers, padded with zeros.
#pragma once

#include <array>

namespace SocketFrame
{

constexpr long FRAME_SIZE = 20480;
constexpr long HEADER_SIZE = 56;
constexpr long MAX_PAYLOAD = FRAME_SIZE - HEADER_SIZE;
constexpr std::array<char, 3> ACKNOWLEDGEMENT = {'O', 'K', '\0'};
// Receive buffer of both ends in bytes.
constexpr int RECEIVE_BUFFER_SIZE = 122880;

// Offsets of the fields.
constexpr long RECEIVER_ID = 0;
constexpr long OBJECT_ID = 8;
constexpr long METHOD_ID = 16;
constexpr long DATA_POINTER = 24;
constexpr long IS_CALLBACK = 32;
constexpr long SIZE = 40;
constexpr long IS_REMOTE = 48;

// The TCP port of a client number in this environment; 0 when there is none.
unsigned short portOf(long identity);

} // namespace SocketFrame
