// Every service of the appliance: where it lives and by which numbers it is addressed.
#pragma once

#include <span>

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
    int methods;          // operations of the interface
    long callBackAdapter; // adapter types, NO_ADAPTER for none
    long notifyAdapter;
};

// All services in the order of their interface ids.
std::span<const Service> services();
// Null for an id that is not in the table.
const Service* findByInterface(long interfaceId);
// The service that has the callback or notify adapter type; null for an unknown type.
const Service* findByAdapter(long adapterType);
// Key of the sender to a process by its client number; that of this process for an unknown one.
long senderKeyOf(long client);
// Whether another process of the appliance has that client number.
bool isSibling(long client);

} // namespace ServiceTable
