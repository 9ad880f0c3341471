// Receivers, proxies, adapters and the factory, without sockets.
#include "messaging/ptc/CallbackProxy.h"
#include "messaging/ptc/Event.h"
#include "messaging/ptc/EventPacket.h"
#include "messaging/ptc/EventQueue.h"
#include "messaging/ptc/InstanceFactory.h"
#include "messaging/ptc/Proxy.h"
#include "messaging/ptc/QtReceiver.h"
#include "messaging/ptc/QtReceiverEvent.h"
#include "messaging/ptc/RemoteReceiver.h"
#include "messaging/ptc/RemoteSender.h"
#include "tests/messaging/RecordingAdapter.h"
#include "tests/support/Patience.h"

#include <QCoreApplication>
#include <QTest>

#include <memory>
#include <thread>

namespace
{

char* newData(const char* text)
{
    const std::size_t size = std::strlen(text);
    char* data = new char[size];
    std::memcpy(data, text, size);
    return data;
}

class KeepingSender : public PTC::RemoteSender
{
public:
    explicit KeepingSender(long id, bool* destroyed = nullptr) : PTC::RemoteSender(id), m_destroyed(destroyed)
    {
    }
    ~KeepingSender() override
    {
        if (m_destroyed != nullptr)
            *m_destroyed = true;
    }
    void send(PTC::Event* event) override { last.reset(event); }

    std::unique_ptr<PTC::Event> last;

private:
    bool* m_destroyed;
};

class PlainRemoteReceiver : public PTC::RemoteReceiver
{
public:
    using PTC::RemoteReceiver::RemoteReceiver;
    void run() override {}
};

class OpenFactory : public PTC::InstanceFactory
{
public:
    using PTC::InstanceFactory::addSender;
    using PTC::InstanceFactory::findSender;
    using PTC::InstanceFactory::setRemoteReceiver;

    void createInstance(long, void**) override {}
    PTC::IAdapterBase* createAdapter(long type, PTC::IReceiver* receiver, void* target) override
    {
        if (type != 7)
            return nullptr;
        auto* adapter = new RecordingAdapter(40);
        adapter->setTarget(target);
        receiver->addCBAdapter(adapter);
        last = adapter;
        return adapter;
    }
    PTC::IProxyBase* createProxy(long type, long id, long client) override
    {
        asked = {type, id, client};
        return nullptr;
    }

    RecordingAdapter* last = nullptr;
    QList<long> asked;
};

} // namespace

class tst_receiver : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void receiverLooksInTheRightMap();
    void receiverKeepsTheFirstOfAnId();
    void receiverOwnsItsAdapters();
    void removedCallbackAdapterIsDeleted();
    void plainReceiverHandlesAtOnce();
    void qtReceiverHandlesInItsThread();
    void qtReceiverIgnoresOtherEvents();
    void qtReceiverDropsWhenStopped();
    void undeliveredEventsAreFreed();
    void remoteReceiverDropsUnknownReceivers();
    void eventQueue();
    void proxyInvokes();
    void callbackProxyInvokes();
    void proxyMakesAdapters();
    void adapterAsksItsFactory();
    void factoryKeepsSenders();
    void factoryIdentity();
};

void tst_receiver::receiverLooksInTheRightMap()
{
    PTC::Receiver receiver(4);
    auto* adapter = new RecordingAdapter(5);
    receiver.addAdapter(adapter);
    PTC::Event callback(5, 1, nullptr, 0, true, true);
    receiver.handleEvent(&callback);
    QCOMPARE(adapter->calls.size(), 0);
    PTC::Event call(5, 1, nullptr, 0, true, false);
    receiver.handleEvent(&call);
    QCOMPARE(adapter->calls.size(), 1);
    PTC::Event unknown(6, 1, nullptr, 0, true, false);
    receiver.handleEvent(&unknown);
    QCOMPARE(adapter->calls.size(), 1);
    QCOMPARE(receiver.getId(), 4L);
}

void tst_receiver::receiverKeepsTheFirstOfAnId()
{
    PTC::Receiver receiver(4);
    auto* first = new RecordingAdapter(5);
    auto* second = new RecordingAdapter(5);
    receiver.addAdapter(first);
    receiver.addAdapter(second);
    receiver.addAdapter(first);
    PTC::Event call(5, 1, nullptr, 0, true, false);
    receiver.handleEvent(&call);
    QCOMPARE(first->calls.size(), 1);
    QCOMPARE(second->calls.size(), 0); // not delivered, but its owner may still use it
    QCOMPARE(second->getId(), 5L);
}

void tst_receiver::receiverOwnsItsAdapters()
{
    bool gone[3] = {};
    {
        PTC::Receiver receiver(1);
        for (int i = 0; i < 3; ++i) {
            auto* adapter = new RecordingAdapter(i / 2);
            adapter->destroyed = &gone[i];
            if (i == 2)
                receiver.addCBAdapter(adapter);
            else
                receiver.addAdapter(adapter);
        }
        QVERIFY(!gone[0] && !gone[1] && !gone[2]);
    }
    QVERIFY(gone[0] && gone[1] && gone[2]);
}

void tst_receiver::removedCallbackAdapterIsDeleted()
{
    PTC::Receiver receiver(1);
    bool gone = false;
    auto* adapter = new RecordingAdapter(3);
    adapter->destroyed = &gone;
    receiver.addCBAdapter(adapter);
    receiver.removeCBAdapter(99);
    QVERIFY(!gone);
    receiver.removeCBAdapter(3);
    QVERIFY(gone);
    PTC::Event callback(3, 1, nullptr, 0, true, true);
    receiver.handleEvent(&callback);
}

void tst_receiver::plainReceiverHandlesAtOnce()
{
    PTC::Receiver receiver(1);
    auto* adapter = new RecordingAdapter(3);
    receiver.addAdapter(adapter);
    receiver.recv(new PTC::Event(3, 8, newData("abc"), 3, true, false));
    QCOMPARE(adapter->calls.size(), 1);
    QCOMPARE(adapter->calls.front().payload, QByteArray("abc"));
}

void tst_receiver::qtReceiverHandlesInItsThread()
{
    PTC::QtReceiver receiver(1);
    auto* adapter = new RecordingAdapter(3);
    receiver.addAdapter(adapter);
    std::thread other([&receiver] { receiver.recv(new PTC::Event(3, 8, newData("abc"), 3, true, false)); });
    other.join();
    QCOMPARE(adapter->calls.size(), 0);
    QTRY_COMPARE(adapter->calls.size(), 1);
    QCOMPARE(adapter->calls.front().thread, QThread::currentThread());
    QCOMPARE(adapter->calls.front().payload, QByteArray("abc"));
    // The receiver's own thread is never blocked.
    for (int i = 0; i < PTC::QtReceiver::MAX_PENDING_EVENTS * 2; ++i)
        receiver.recv(new PTC::Event(3, 8, newData("d"), 1, true, false));
    QTRY_COMPARE(adapter->calls.size(), 1 + PTC::QtReceiver::MAX_PENDING_EVENTS * 2);
}

void tst_receiver::qtReceiverIgnoresOtherEvents()
{
    PTC::QtReceiver receiver(1);
    auto* adapter = new RecordingAdapter(3);
    receiver.addAdapter(adapter);
    QEvent other(QEvent::User);
    QCoreApplication::sendEvent(&receiver, &other);
    QCOMPARE(adapter->calls.size(), 0);
    QCOMPARE(receiver.pendingEvents(), 0);
    QCOMPARE(static_cast<int>(PTC::QtReceiverEvent(nullptr).type()), 65534);
}

void tst_receiver::qtReceiverDropsWhenStopped()
{
    PTC::QtReceiver receiver(1);
    auto* adapter = new RecordingAdapter(3);
    receiver.addAdapter(adapter);
    receiver.stopReceiving();
    receiver.recv(new PTC::Event(3, 8, newData("abc"), 3, true, false));
    QCoreApplication::processEvents();
    QCOMPARE(receiver.pendingEvents(), 0);
    QCOMPARE(adapter->calls.size(), 0);
}

void tst_receiver::undeliveredEventsAreFreed()
{
    auto receiver = std::make_unique<PTC::QtReceiver>(1);
    receiver->recv(new PTC::Event(3, 8, newData("abc"), 3, true, false));
    QCOMPARE(receiver->pendingEvents(), 1);
    receiver.reset(); // the leak checker reports what is not freed
    QCoreApplication::processEvents();
}

void tst_receiver::remoteReceiverDropsUnknownReceivers()
{
    PlainRemoteReceiver remote(0);
    QCOMPARE(remote.getIdentity(), -1L);
    QVERIFY(remote.initialize(1003));
    QCOMPARE(remote.getIdentity(), 1003L);
    auto* receiver = new PTC::Receiver(4);
    auto* adapter = new RecordingAdapter(117);
    receiver->addAdapter(adapter);
    remote.addReceiver(receiver);
    PTC::EventPacket packet;
    packet.receiverId = 5;
    packet.objectId = 117;
    packet.data = newData("ab");
    packet.size = 2;
    remote.handleEventPacket(&packet);
    QCOMPARE(adapter->calls.size(), 0);
    packet.receiverId = 4;
    packet.data = newData("ab");
    remote.handleEventPacket(&packet);
    QCOMPARE(adapter->calls.size(), 1);
    QVERIFY(packet.data == nullptr);
}

void tst_receiver::eventQueue()
{
    PTC::EventQueue queue;
    QCOMPARE(queue.count(), 0UL);
    QVERIFY(queue.at(0) == nullptr);
    queue.remove(0);
    auto* first = new PTC::Event(1, 1, nullptr, 0, true, false);
    auto* second = new PTC::Event(2, 1, nullptr, 0, true, false);
    queue.add(first);
    queue.add(second);
    QCOMPARE(queue.count(), 2UL);
    QVERIFY(queue.capacity() >= 2);
    QVERIFY(queue.at(0) == first && queue.at(1) == second && queue.at(2) == nullptr);
    queue.remove(0);
    QCOMPARE(queue.count(), 1UL);
    QVERIFY(queue.at(0) == second);
}

void tst_receiver::proxyInvokes()
{
    KeepingSender sender(1);
    PTC::Proxy proxy(65, true);
    proxy.setSender(&sender);
    char data[3] = {'a', 'b', 'c'};
    proxy.invokeMethod(3, data, 3);
    QCOMPARE(sender.last->getObjectId(), 65L);
    QCOMPARE(sender.last->getMethodId(), 3L);
    QVERIFY(sender.last->getData() == data);
    QCOMPARE(sender.last->getSize(), 3L);
    QVERIFY(sender.last->isRemote());
    QVERIFY(!sender.last->isCallback());
}

void tst_receiver::callbackProxyInvokes()
{
    KeepingSender sender(1);
    PTC::CallbackProxy proxy(12, false);
    proxy.setSender(&sender);
    char data[1] = {};
    proxy.invokeMethod(2, data, 1);
    QCOMPARE(sender.last->getObjectId(), 12L);
    QVERIFY(sender.last->isCallback());
    QVERIFY(!sender.last->isRemote());
}

void tst_receiver::proxyMakesAdapters()
{
    OpenFactory factory;
    PTC::Receiver receiver(4);
    PTC::Proxy proxy(1, true);
    proxy.setAdapterFactory(&factory);
    proxy.setReceiver(&receiver);
    int target = 0;
    QCOMPARE(proxy.createAdapter(7, &target), 40L);
    QVERIFY(factory.last->target == &target);
    QCOMPARE(proxy.createAdapter(8, &target), -1L);
    bool gone = false;
    factory.last->destroyed = &gone;
    proxy.destoryAdapter(40);
    QVERIFY(gone);
    QCOMPARE(proxy.getRRIdentity(), -1L);
}

void tst_receiver::adapterAsksItsFactory()
{
    OpenFactory factory;
    RecordingAdapter adapter(1);
    QVERIFY(adapter.createProxy(118, 2, 1000) == nullptr);
    QVERIFY(factory.asked.isEmpty());
    adapter.setProxyFactory(&factory);
    adapter.createProxy(118, 2, 1000);
    QCOMPARE(factory.asked, (QList<long>{118, 2, 1000}));
}

void tst_receiver::factoryKeepsSenders()
{
    bool firstGone = false;
    bool secondGone = false;
    {
        OpenFactory factory;
        QVERIFY(factory.initialize());
        QVERIFY(factory.findSender(1) == nullptr);
        auto* first = new KeepingSender(1, &firstGone);
        factory.addSender(first);
        QVERIFY(factory.findSender(1) == first);
        factory.addSender(new KeepingSender(1, &secondGone));
        QVERIFY(secondGone);
        QVERIFY(factory.findSender(1) == first);
        factory.addSender(first);
        QVERIFY(!firstGone);
    }
    QVERIFY(firstGone);
}

void tst_receiver::factoryIdentity()
{
    OpenFactory factory;
    QCOMPARE(factory.getRRIdentity(), -1L);
    auto* receiver = new PlainRemoteReceiver(0);
    receiver->initialize(1002);
    factory.setRemoteReceiver(receiver);
    QCOMPARE(factory.getRRIdentity(), 1002L);
    factory.setRemoteReceiver(nullptr);
    QCOMPARE(factory.getRRIdentity(), -1L);
}

QTEST_GUILESS_MAIN(tst_receiver)
#include "tst_receiver.moc"
