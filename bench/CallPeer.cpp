#include "bench/CallPeer.h"

#include "messaging/ptc/IAdapterBase.h"
#include "messaging/ptc/QtReceiver.h"
#include "messaging/ptc/SocketFrame.h"
#include "messaging/ptc/SocketRemoteReceiver.h"
#include "messaging/ptc/SocketRemoteSender.h"
#include "messaging/services/ITitler.h"
#include "messaging/services/ServiceFamilies.h"
#include "messaging/services/TitlerAdapter.h"

#include <QCoreApplication>
#include <array>
#include <cstdio>
#include <netinet/in.h>
#include <netinet/tcp.h>
#include <sys/socket.h>
#include <unistd.h>

namespace
{

constexpr long RAW_PEER = 1002; // client number whose port the raw peer uses

void announceReady()
{
    std::puts("ready");
    std::fflush(stdout);
}

sockaddr_in addressOf(long client)
{
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    address.sin_port = htons(SocketFrame::portOf(client));
    return address;
}

} // namespace

bool CallFactory::listen(long client, PTC::IAdapterBase* adapter, bool callback)
{
    auto receiver = std::make_unique<PTC::QtReceiver>(RECEIVER_ID);
    if (callback)
        receiver->addCBAdapter(adapter);
    else
        receiver->addAdapter(adapter);
    auto sockets = std::make_unique<SocketRemoteReceiver>(0);
    sockets->addReceiver(receiver.release());
    if (!sockets->initialize(client))
        return false;
    setRemoteReceiver(sockets.release());
    return true;
}

PTC::ISender* CallFactory::connectTo(long client)
{
    auto sender = std::make_unique<SocketRemoteSender>(RECEIVER_ID);
    if (!sender->initialize(client))
        return nullptr;
    addSender(sender.release());
    return findSender(RECEIVER_ID);
}

void CallFactory::createInstance(long, void**)
{
}

PTC::IAdapterBase* CallFactory::createAdapter(long, PTC::IReceiver*, void*)
{
    return nullptr;
}

PTC::IProxyBase* CallFactory::createProxy(long, long id, long client)
{
    PTC::ISender* sender = connectTo(client);
    if (!sender)
        return nullptr;
    auto* proxy = new TitlerCallBackRemoteProxy(id);
    proxy->setSender(sender);
    return proxy;
}

CallPeer::CallPeer() = default;
CallPeer::~CallPeer() = default;

int CallPeer::run()
{
    auto adapter = std::make_unique<TitlerAdapter>(TitlerAdapter::INTERFACE_ID);
    adapter->setTarget(this);
    adapter->setProxyFactory(&m_factory);
    if (!m_factory.listen(CallFactory::PEER, adapter.release(), false))
        return 1;
    announceReady();
    return QCoreApplication::exec();
}

void CallPeer::registerCallBack(ITitlerCallBack* callBack)
{
    m_callBack.reset(callBack);
}

void CallPeer::showTitlerCreate(_CALL_TITLER_TYPE type)
{
    if (!m_callBack)
        return;
    _CALLBACK_TITLER_PARAMTER result;
    result.type = type;
    m_callBack->finishTitlerCreateCallback(result);
}

void CallPeer::showTitlerEdit(_SHOW_TITLER_PARAMTER)
{
}

void CallPeer::showDialogMaskWidget(bool)
{
}

void CallPeer::showMessageMaskWidget(bool)
{
}

bool RawPeer::receiveAll(int socket, char* to, long size)
{
    return recv(socket, to, static_cast<std::size_t>(size), MSG_WAITALL) == size;
}

bool RawPeer::sendAll(int socket, const char* from, long size)
{
    return send(socket, from, static_cast<std::size_t>(size), MSG_NOSIGNAL) == size;
}

bool RawPeer::exchange(int socket, char* frame)
{
    auto acknowledgement = SocketFrame::ACKNOWLEDGEMENT;
    const long size = acknowledgement.size();
    return sendAll(socket, frame, SocketFrame::FRAME_SIZE) &&
           receiveAll(socket, acknowledgement.data(), size) &&
           receiveAll(socket, frame, SocketFrame::FRAME_SIZE) &&
           sendAll(socket, acknowledgement.data(), size);
}

int RawPeer::connectToPeer()
{
    const int on = 1;
    const int bufferSize = SocketFrame::RECEIVE_BUFFER_SIZE;
    const sockaddr_in address = addressOf(RAW_PEER);
    const int connection = socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0);
    setsockopt(connection, IPPROTO_TCP, TCP_NODELAY, &on, sizeof on);
    setsockopt(connection, SOL_SOCKET, SO_RCVBUF, &bufferSize, sizeof bufferSize);
    if (connect(connection, reinterpret_cast<const sockaddr*>(&address), sizeof address) == 0)
        return connection;
    close(connection);
    return -1;
}

int RawPeer::run()
{
    const int on = 1;
    const int bufferSize = SocketFrame::RECEIVE_BUFFER_SIZE;
    const sockaddr_in address = addressOf(RAW_PEER);
    const int listening = socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0);
    setsockopt(listening, SOL_SOCKET, SO_REUSEADDR, &on, sizeof on);
    setsockopt(listening, SOL_SOCKET, SO_RCVBUF, &bufferSize, sizeof bufferSize);
    if (bind(listening, reinterpret_cast<const sockaddr*>(&address), sizeof address) != 0 ||
        listen(listening, 1) != 0)
        return 1;
    announceReady();
    const int connection = accept(listening, nullptr, nullptr);
    setsockopt(connection, IPPROTO_TCP, TCP_NODELAY, &on, sizeof on);
    std::array<char, SocketFrame::FRAME_SIZE> frame{};
    auto acknowledgement = SocketFrame::ACKNOWLEDGEMENT;
    const long size = acknowledgement.size();
    while (receiveAll(connection, frame.data(), SocketFrame::FRAME_SIZE) &&
           sendAll(connection, acknowledgement.data(), size) &&
           sendAll(connection, frame.data(), SocketFrame::FRAME_SIZE) &&
           receiveAll(connection, acknowledgement.data(), size)) {
    }
    close(connection);
    close(listening);
    return 0;
}
