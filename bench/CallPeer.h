// The other process of the messaging benchmark, and the factory that both sides build their end with.
#pragma once

#include "messaging/ptc/InstanceFactory.h"
#include "messaging/services/ITitler.h"

#include <memory>

namespace PTC
{
class IAdapterBase;
class ISender;
} // namespace PTC

// Listens under a client number and connects where it is told to.
class CallFactory : public PTC::InstanceFactory
{
public:
    static constexpr long RECEIVER_ID = 4;
    static constexpr long CALLER = 1000; // client numbers
    static constexpr long PEER = 1003;

    // Takes the adapter over; callback says in which table it goes.
    bool listen(long client, PTC::IAdapterBase* adapter, bool callback);
    // A connection to that client; null when nobody listens there.
    PTC::ISender* connectTo(long client);

    // Makes nothing: both sides know their only service.
    void createInstance(long id, void** instance) override;
    PTC::IAdapterBase* createAdapter(long type, PTC::IReceiver* receiver, void* target) override;
    // Connects to whoever registers a callback.
    PTC::IProxyBase* createProxy(long type, long id, long client) override;
};

// Answers every request for titles at once with an empty result.
class CallPeer : public ITitler
{
public:
    CallPeer();
    ~CallPeer() override;

    // Serves until the process is ended; prints a line when it listens. The exit code.
    int run();

    void registerCallBack(ITitlerCallBack* callBack) override;
    void showTitlerCreate(_CALL_TITLER_TYPE type) override;
    void showTitlerEdit(_SHOW_TITLER_PARAMTER param) override;
    void showDialogMaskWidget(bool show) override;
    void showMessageMaskWidget(bool show) override;

private:
    CallFactory mFactory;
    std::unique_ptr<ITitlerCallBack> mCallBack;
};

// Takes whole frames on one socket, acknowledges each and sends it back: what the wire costs without the
// framework.
class RawPeer
{
public:
    // As CallPeer::run.
    static int run();

    // One frame there and back, with both acknowledgements. False when the connection is gone.
    static bool exchange(int socket, char* frame);
    // Connects to the peer; -1 when that fails.
    static int connectToPeer();

private:
    static bool receiveAll(int socket, char* to, long size);
    static bool sendAll(int socket, const char* from, long size);
};
