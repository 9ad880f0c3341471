#pragma once

#include <span>

// Lists every service of the appliance with its process and its numbers.
namespace ServiceTable
{

// Client keys; the key of a sender is the receiver id in its frames.
constexpr long MAIN_CLIENT_KEY = 1;
constexpr long SUB_PANEL_CLIENT_KEY = 3;
constexpr long TITLER_CLIENT_KEY = 4;

// Client numbers; a process listens on the port of its number.
constexpr long MAIN_CLIENT = 1000;
constexpr long SUB_PANEL_CLIENT = 1002;
constexpr long TITLER_CLIENT = 1003;

constexpr long NO_ADAPTER = 0;

struct Service {
    long interfaceId;
    const char* name;
    long clientKey;
    long port;
    int methods;          // number of operations of the interface
    long callBackAdapter; // adapter types; NO_ADAPTER if there is none
    long notifyAdapter;
};

// Returns all services in the order of their interface ids.
std::span<const Service> services();
// Returns null for an id that is not in the table.
const Service* findByInterface(long interfaceId);
// Returns the key of the sender to the process with that client number; the key of this process for an
// unknown number.
long senderKeyOf(long client);
// Returns whether another process of the appliance has that client number.
bool isSibling(long client);

} // namespace ServiceTable
