#pragma once

#include <array>

// The layout of a frame on the wire: always 20,480 bytes, little-endian 64-bit integers, padded with zeros.
namespace SocketFrame
{

constexpr long FRAME_SIZE = 20480;
constexpr long HEADER_SIZE = 56;
constexpr long MAX_PAYLOAD = FRAME_SIZE - HEADER_SIZE;
constexpr std::array<char, 3> ACKNOWLEDGEMENT = {'O', 'K', '\0'};
// Size in bytes of the receive buffer of both sockets of a connection.
constexpr int RECEIVE_BUFFER_SIZE = 122880;

// Offsets of the fields in bytes.
constexpr long RECEIVER_ID = 0;
constexpr long OBJECT_ID = 8;
constexpr long METHOD_ID = 16;
constexpr long DATA_POINTER = 24;
constexpr long IS_CALLBACK = 32;
constexpr long SIZE = 40;
constexpr long IS_REMOTE = 48;

// Returns the TCP port for a client number in this environment, or 0 if there is none.
unsigned short portOf(long identity);

} // namespace SocketFrame
