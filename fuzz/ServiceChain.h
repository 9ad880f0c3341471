#pragma once

#include "ServiceSink.h"
#include "messaging/ptc/IProxyFactory.h"
#include "messaging/ptc/QtReceiver.h"
#include "messaging/ptc/SocketFrame.h"
#include "messaging/ptc/SocketRemoteReceiver.h"
#include "messaging/services/ServiceFamilies.h"
#include "messaging/services/TitlerAdapter.h"

#include <QCoreApplication>
#include <algorithm>
#include <cstdlib>
#include <memory>
#include <string>
#include <string_view>
#include <sys/socket.h>
#include <unistd.h>

// The path of a call from a socket into the program: the reader of a connection, the receiver that posts
// events, the adapters of all services, and an object that accepts the calls. Everything runs in the calling
// thread.
class ServiceChain : private PTC::IProxyFactory
{
public:
    static constexpr long RECEIVER = 4;
    static constexpr int CALLBACK_ADAPTERS = 14; // their object ids are 0 to 13
    static constexpr std::size_t MOST_BYTES = 8 * static_cast<std::size_t>(SocketFrame::FRAME_SIZE);

    ServiceChain()
    {
        auto receiver = std::make_unique<PTC::QtReceiver>(RECEIVER);
        auto* titler = new TitlerAdapter(TitlerAdapter::INTERFACE_ID);
        titler->setProxyFactory(this);
        titler->setTarget(static_cast<ITitler*>(&m_sink));
        receiver->addAdapter(titler);
        m_receiver = receiver.get();
        addAdapters();
        m_remote.addReceiver(receiver.release());
    }

    // Handles the bytes that a peer sends before it disconnects, MOST_BYTES at most.
    void receive(std::string_view bytes)
    {
        int ends[2];
        if (::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends) != 0)
            std::abort();
        const int room = 1 << 20;
        ::setsockopt(ends[0], SOL_SOCKET, SO_SNDBUF, &room, sizeof room);
        bytes = bytes.substr(0, MOST_BYTES);
        while (!bytes.empty()) {
            const ssize_t sent = ::send(ends[0], bytes.data(), bytes.size(), MSG_NOSIGNAL | MSG_DONTWAIT);
            if (sent <= 0)
                break;
            bytes.remove_prefix(static_cast<std::size_t>(sent));
        }
        ::shutdown(ends[0], SHUT_WR);
        m_remote.ThreadMain(ends[1]);
        ::close(ends[0]);
        ::close(ends[1]);
        QCoreApplication::sendPostedEvents();
    }

    const ServiceSink& sink() const { return m_sink; }

private:
    template <typename Service, typename CallBack>
    void addCallBack()
    {
        add(Service::CALLBACK_ADAPTER_TYPE, static_cast<CallBack*>(&m_sink));
    }
    template <typename Service, typename Notify>
    void addNotify()
    {
        add(Service::NOTIFY_ADAPTER_TYPE, static_cast<Notify*>(&m_sink));
    }
    void add(long type, void* target)
    {
        PTC::IAdapterBase* adapter = ServiceFamilies::createAdapter(type, m_nextId++);
        adapter->setTarget(target);
        m_receiver->addCBAdapter(adapter);
    }
    void addAdapters()
    {
        addCallBack<APPEventFilterRemoteProxy, IAPPEventFilterCallBack>();
        addNotify<APPEventFilterRemoteProxy, IAPPEventFilterNotify>();
        addCallBack<FileManagerControllerRemoteProxy, IFileManagerControllerCallBack>();
        addNotify<FileManagerControllerRemoteProxy, IFileManagerControllerNotify>();
        addCallBack<MessageCenterRemoteProxy, IMessageCenterCallBack>();
        addNotify<MessageCenterRemoteProxy, IMessageCenterNotify>();
        addCallBack<PowerManagerRemoteProxy, IPowerManagerCallBack>();
        addNotify<PowerManagerRemoteProxy, IPowerManagerNotify>();
        addCallBack<ProjectDataManagerRemoteProxy, IProjectDataManagerCallBack>();
        addNotify<ProjectDataManagerRemoteProxy, IProjectDataManagerNotify>();
        addCallBack<ShowTitlerControllerRemoteProxy, IShowTitlerControllerCallBack>();
        addCallBack<SoftKeyBoardControllerRemoteProxy, ISoftKeyBoardControllerCallBack>();
        addCallBack<SystemSetupManagerRemoteProxy, ISystemSetupManagerCallBack>();
        addNotify<SystemSetupManagerRemoteProxy, ISystemSetupManagerNotify>();
    }

    // Creates a proxy without a sender: calls of it have no effect.
    PTC::IProxyBase* createProxy(long type, long id, long client) override
    {
        const bool isKnown = type == TitlerAdapter::CALLBACK_INTERFACE_ID && client != 0;
        return isKnown ? new TitlerCallBackRemoteProxy(id) : nullptr;
    }

    ServiceSink m_sink;
    SocketRemoteReceiver m_remote{0};
    PTC::QtReceiver* m_receiver = nullptr; // owned by m_remote
    long m_nextId = 0;
};

// Returns the chain of the process, with an application, which posted events need.
inline ServiceChain& serviceChain()
{
    static int count = 1;
    static char name[] = "fuzz";
    static char* arguments[] = {name, nullptr};
    static QCoreApplication application(count, arguments);
    static ServiceChain chain;
    return chain;
}
