// The peer process of the messaging benchmark, and the factory that both processes use.
#pragma once

#include "messaging/ptc/InstanceFactory.h"
#include "messaging/services/ITitler.h"

#include <memory>

namespace PTC
{
class IAdapterBase;
class ISender;
} // namespace PTC

// Listens under a client number and connects to another one on request.
class CallFactory : public PTC::InstanceFactory
{
public:
    static constexpr long RECEIVER_ID = 4;
    static constexpr long CALLER = 1000; // client numbers
    static constexpr long PEER = 1003;

    // Takes ownership of the adapter; callback selects the table that it is entered in.
    bool listen(long client, PTC::IAdapterBase* adapter, bool callback);
    // Returns a connection to the client; null when nobody listens there.
    PTC::ISender* connectTo(long client);

    // Does nothing: both processes know their only service.
    void createInstance(long id, void** instance) override;
    PTC::IAdapterBase* createAdapter(long type, PTC::IReceiver* receiver, void* target) override;
    // Connects to a client that registers a callback.
    PTC::IProxyBase* createProxy(long type, long id, long client) override;
};

// Answers every request for titles with an empty result.
class CallPeer : public ITitler
{
public:
    CallPeer();
    ~CallPeer() override;

    // Serves until the process is ended; prints a line when it listens. Returns the exit code.
    int run();

    void registerCallBack(ITitlerCallBack* callBack) override;
    void showTitlerCreate(_CALL_TITLER_TYPE type) override;
    void showTitlerEdit(_SHOW_TITLER_PARAMTER param) override;
    void showDialogMaskWidget(bool show) override;
    void showMessageMaskWidget(bool show) override;

private:
    CallFactory m_factory;
    std::unique_ptr<ITitlerCallBack> m_callBack;
};

// Receives whole frames on one socket, acknowledges each and sends it back: measures the wire without the
// framework.
class RawPeer
{
public:
    // Same as CallPeer::run().
    static int run();

    // Sends one frame and receives it back, with both acknowledgements. Returns false when the connection is
    // closed.
    static bool exchange(int socket, char* frame);
    // Connects to the peer and returns the socket; -1 when that fails.
    static int connectToPeer();

private:
    static bool receiveAll(int socket, char* to, long size);
    static bool sendAll(int socket, const char* from, long size);
};
