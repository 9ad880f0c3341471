// The socket transport against plain sockets: frames, acknowledgements, hostile peers, lifetimes.
#include "messaging/ptc/Event.h"
#include "messaging/ptc/EventPacket.h"
#include "messaging/ptc/QtReceiver.h"
#include "messaging/ptc/SocketFrame.h"
#include "messaging/ptc/SocketRemoteReceiver.h"
#include "messaging/ptc/SocketRemoteSender.h"
#include "tests/messaging/RecordingAdapter.h"
#include "tests/messaging/TestPorts.h"
#include "tests/messaging/TestSocket.h"
#include "tests/support/Patience.h"
#include "tests/support/RandomSeed.h"

#include <QDir>
#include <QTest>

#include <csignal>
#include <memory>
#include <thread>

namespace
{

const long SERVER = 1003;
const long RECEIVER = 4;
const long OBJECT = 117;

QByteArray frame(qint64 receiver, qint64 object, qint64 method, const QByteArray& payload,
                 bool callback = false)
{
    return TestSocket::frame(receiver, object, method, callback, payload.size(), true, payload);
}

int openDescriptors()
{
    return int(QDir("/proc/self/fd").entryList(QDir::Files | QDir::System | QDir::NoDotAndDotDot).size());
}

} // namespace

class tst_socketremotereceiver : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
    void oneFrame();
    void piecesOfAThousand();
    void sizeZeroIsAcknowledgedAndDropped();
    void badSizesAreDropped_data();
    void badSizesAreDropped();
    void largestPayload();
    void unknownReceiverAndObject();
    void callbacksAndAdaptersAreApart();
    void twoFramesInOneWrite();
    void peerDiesInTheMiddleOfAFrame();
    void silentPeersHoldNobodyUp();
    void dozensOfConnections();
    void fiveThousandReconnections();
    void openConnectionsAreLimited();
    void randomFrames();
    void floodIsHeldUp();
    void destructionWhileHeldUp();
    void portTaken();
    void identityBeyondPorts();
    void senderFrame();
    void senderClearsTheRestOfTheFrame();
    void senderRefusesOversize();
    void senderDrainsAtMostTenBytes_data();
    void senderDrainsAtMostTenBytes();
    void senderToNobody();
    void senderWhosePeerDied();
    void senderSurvivesABlockedPeer();

private:
    void startServer();

    std::unique_ptr<SocketRemoteReceiver> m_server;
    PTC::QtReceiver* m_receiver = nullptr;
    RecordingAdapter* m_adapter = nullptr;
    RecordingAdapter* m_callbackAdapter = nullptr;
};

void tst_socketremotereceiver::initTestCase()
{
    TestPorts::useFreeOffset();
    std::signal(SIGPIPE, SIG_DFL); // a write that raises SIGPIPE would end this program
}

void tst_socketremotereceiver::init()
{
    startServer();
}

void tst_socketremotereceiver::cleanup()
{
    m_server.reset();
}

void tst_socketremotereceiver::startServer()
{
    m_server = std::make_unique<SocketRemoteReceiver>(0);
    QCOMPARE(m_server->getIdentity(), -1L);
    QVERIFY(m_server->initialize(SERVER));
    QCOMPARE(m_server->getIdentity(), SERVER);
    m_receiver = new PTC::QtReceiver(RECEIVER);
    m_adapter = new RecordingAdapter(OBJECT);
    m_callbackAdapter = new RecordingAdapter(OBJECT);
    m_receiver->addAdapter(m_adapter);
    m_receiver->addCBAdapter(m_callbackAdapter);
    m_server->addReceiver(m_receiver);
}

void tst_socketremotereceiver::oneFrame()
{
    TestSocket peer(SERVER);
    peer.write(frame(RECEIVER, OBJECT, 2, "payload"));
    QTRY_COMPARE(m_adapter->calls.size(), 1);
    const RecordingAdapter::Call& call = m_adapter->calls.front();
    QCOMPARE(call.method, 2L);
    QCOMPARE(call.payload, QByteArray("payload"));
    QVERIFY(call.remote);
    QVERIFY(!call.callback);
    QCOMPARE(call.thread, QThread::currentThread());
    QVERIFY(peer.read(3).startsWith(QByteArray("OK\0", 3)));
    QVERIFY(m_server->getLastClientSocket() > 0);
}

void tst_socketremotereceiver::piecesOfAThousand()
{
    TestSocket peer(SERVER);
    const QByteArray whole = frame(RECEIVER, OBJECT, 3, "abc");
    QByteArray acknowledgements;
    for (qsizetype at = 0; at < whole.size(); at += 1000) {
        peer.write(whole.mid(at, 1000));
        acknowledgements += peer.read(3); // each piece is received by itself
    }
    QCOMPARE(acknowledgements, QByteArray("OK\0", 3).repeated(21));
    QTRY_COMPARE(m_adapter->calls.size(), 1);
    QVERIFY(peer.nothingToRead());
}

void tst_socketremotereceiver::sizeZeroIsAcknowledgedAndDropped()
{
    TestSocket peer(SERVER);
    peer.write(frame(RECEIVER, OBJECT, 1, QByteArray()));
    QCOMPARE(peer.read(3), QByteArray("OK\0", 3));
    peer.write(frame(RECEIVER, OBJECT, 2, "x"));
    QTRY_COMPARE(m_adapter->calls.size(), 1);
    QCOMPARE(m_adapter->calls.front().method, 2L);
}

void tst_socketremotereceiver::badSizesAreDropped_data()
{
    QTest::addColumn<qint64>("size");
    for (const qint64 size : {qint64(-1), std::numeric_limits<qint64>::min(), qint64(20425), qint64(20480),
                              qint64(1) << 32, qint64(1) << 62, std::numeric_limits<qint64>::max()})
        QTest::addRow("%lld", static_cast<long long>(size)) << size;
}

void tst_socketremotereceiver::badSizesAreDropped()
{
    QFETCH(qint64, size);
    TestSocket peer(SERVER);
    peer.write(TestSocket::frame(RECEIVER, OBJECT, 1, false, size, true, "payload"));
    QCOMPARE(peer.read(3), QByteArray("OK\0", 3));
    peer.write(frame(RECEIVER, OBJECT, 2, "x"));
    QTRY_COMPARE(m_adapter->calls.size(), 1);
    QCOMPARE(m_adapter->calls.front().method, 2L);
}

void tst_socketremotereceiver::largestPayload()
{
    TestSocket peer(SERVER);
    const QByteArray payload(20424, 'p');
    peer.write(frame(RECEIVER, OBJECT, 1, payload));
    QTRY_COMPARE(m_adapter->calls.size(), 1);
    QCOMPARE(m_adapter->calls.front().payload, payload);
}

void tst_socketremotereceiver::unknownReceiverAndObject()
{
    TestSocket peer(SERVER);
    peer.write(frame(99, OBJECT, 1, "x"));
    peer.write(frame(RECEIVER, 5000, 1, "x"));
    peer.write(frame(-1, -1, -1, "x", true));
    peer.write(frame(RECEIVER, OBJECT, 7, "x"));
    QTRY_COMPARE(m_adapter->calls.size(), 1);
    QCOMPARE(m_adapter->calls.front().method, 7L);
}

void tst_socketremotereceiver::callbacksAndAdaptersAreApart()
{
    TestSocket peer(SERVER);
    peer.write(frame(RECEIVER, OBJECT, 1, "c", true));
    QTRY_COMPARE(m_callbackAdapter->calls.size(), 1);
    QVERIFY(m_callbackAdapter->calls.front().callback);
    QCOMPARE(m_adapter->calls.size(), 0);
}

void tst_socketremotereceiver::twoFramesInOneWrite()
{
    TestSocket peer(SERVER);
    peer.write(frame(RECEIVER, OBJECT, 1, "first") + frame(RECEIVER, OBJECT, 2, "second"));
    QTRY_COMPARE(m_adapter->calls.size(), 2);
    QCOMPARE(m_adapter->calls.at(0).payload, QByteArray("first"));
    QCOMPARE(m_adapter->calls.at(1).payload, QByteArray("second"));
}

void tst_socketremotereceiver::peerDiesInTheMiddleOfAFrame()
{
    {
        TestSocket dying(SERVER);
        dying.write(frame(RECEIVER, OBJECT, 1, "lost").left(10000));
    }
    TestSocket peer(SERVER);
    peer.write(frame(RECEIVER, OBJECT, 2, "kept"));
    QTRY_COMPARE(m_adapter->calls.size(), 1);
    QCOMPARE(m_adapter->calls.front().payload, QByteArray("kept"));
}

void tst_socketremotereceiver::silentPeersHoldNobodyUp()
{
    TestSocket silent(SERVER);
    TestSocket half(SERVER);
    half.write(QByteArray(56, '\0'));
    TestSocket peer(SERVER);
    peer.write(frame(RECEIVER, OBJECT, 1, "x"));
    QTRY_COMPARE(m_adapter->calls.size(), 1);
}

void tst_socketremotereceiver::dozensOfConnections()
{
    // The accept loop takes two a second; the others wait in the backlog and are served in turn.
    std::vector<std::unique_ptr<TestSocket>> peers;
    for (int i = 0; i < 24; ++i)
        peers.push_back(std::make_unique<TestSocket>(SERVER, TestSocket::DoNotWait));
    int written = 0;
    for (const auto& peer : peers) {
        if (written++ % 6 == 0) {
            QTRY_VERIFY(peer->isConnected());
            peer->write(frame(RECEIVER, OBJECT, 1, "x"));
        }
    }
    QTRY_COMPARE(m_adapter->calls.size(), 4);
}

void tst_socketremotereceiver::fiveThousandReconnections()
{
    m_server.reset();
    m_server = std::make_unique<SocketRemoteReceiver>(0);
    m_server->setAcceptPause(0);
    QVERIFY(m_server->initialize(SERVER));
    const int before = openDescriptors();
    for (int i = 0; i < 5000; ++i) {
        TestSocket peer(SERVER);
        QVERIFY(peer.write("x"));
        QCOMPARE(peer.read(3), QByteArray("OK\0", 3));
        peer.resetAtEnd();
        if (i % 500 == 0)
            QTRY_VERIFY(openDescriptors() <= before + SocketRemoteReceiver::MAX_ENDED_CONNECTIONS + 3);
    }
    // The sockets of the connections that ended last are kept.
    QTRY_COMPARE(openDescriptors(), before + SocketRemoteReceiver::MAX_ENDED_CONNECTIONS);
    m_server.reset();
    QVERIFY(openDescriptors() < before);
}

void tst_socketremotereceiver::openConnectionsAreLimited()
{
    m_server.reset();
    m_server = std::make_unique<SocketRemoteReceiver>(0);
    m_server->setAcceptPause(1);
    QVERIFY(m_server->initialize(SERVER));
    std::vector<std::unique_ptr<TestSocket>> peers;
    for (int i = 0; i < SocketRemoteReceiver::MAX_OPEN_CONNECTIONS; ++i) {
        peers.push_back(std::make_unique<TestSocket>(SERVER));
        QVERIFY(peers.back()->write("x"));
        QCOMPARE(peers.back()->read(3).size(), qsizetype(3));
    }
    // A further connection waits until another one ends, and is served then.
    TestSocket waiting(SERVER);
    QVERIFY(waiting.write("x"));
    QVERIFY(waiting.nothingToRead());
    peers.erase(peers.begin() + 7);
    QCOMPARE(waiting.read(3), QByteArray("OK\0", 3));
    // The other connections are not affected.
    for (const auto& peer : peers) {
        QVERIFY(peer->write("y"));
        QCOMPARE(peer->read(3).size(), qsizetype(3));
    }
}

void tst_socketremotereceiver::randomFrames()
{
    TestSocket peer(SERVER);
    const RandomSeed seed(1);
    std::srand(seed);
    for (int i = 0; i < 50; ++i) {
        QByteArray noise(20480, '\0');
        for (char& byte : noise)
            byte = static_cast<char>(std::rand());
        peer.write(noise);
        peer.readAvailable();
    }
    peer.write(frame(RECEIVER, OBJECT, 9, "x"));
    QTRY_COMPARE(m_adapter->calls.size(), 1);
    QCOMPARE(m_adapter->calls.front().method, 9L);
}

void tst_socketremotereceiver::floodIsHeldUp()
{
    TestSocket peer(SERVER);
    // Nothing is handled while this thread writes.
    const int written = peer.writeUntilBlocked(frame(RECEIVER, OBJECT, 1, "x"), 4000);
    QVERIFY(written < 4000);
    QCOMPARE(m_receiver->pendingEvents(), PTC::QtReceiver::MAX_PENDING_EVENTS);
    QTRY_COMPARE(m_adapter->calls.size(), written);
    QTRY_COMPARE(m_receiver->pendingEvents(), 0);
}

void tst_socketremotereceiver::destructionWhileHeldUp()
{
    TestSocket peer(SERVER);
    // More frames than may wait and than the socket buffers keep, none of them handled.
    QVERIFY(peer.writeUntilBlocked(frame(RECEIVER, OBJECT, 1, "x"), 4000) < 4000);
    QCOMPARE(m_adapter->calls.size(), 0);
    m_server.reset();
    QTRY_VERIFY(peer.isClosedByPeer());
}

void tst_socketremotereceiver::portTaken()
{
    SocketRemoteReceiver second(0);
    QVERIFY(!second.initialize(SERVER));
    m_server.reset();
    QVERIFY(second.initialize(SERVER)); // the port is free again at once
    QVERIFY(!second.initialize(SERVER));
}

void tst_socketremotereceiver::identityBeyondPorts()
{
    for (const long identity : {0L, -5L, 70000L, 1L << 40}) {
        SocketRemoteReceiver server(0);
        QVERIFY(!server.initialize(identity));
        SocketRemoteSender sender(1);
        QVERIFY(!sender.initialize(identity));
    }
}

void tst_socketremotereceiver::senderFrame()
{
    m_server.reset();
    TestListener listener(SERVER);
    SocketRemoteSender sender(4);
    QCOMPARE(sender.getIdentity(), -1L);
    QVERIFY(sender.initialize(SERVER));
    QCOMPARE(sender.getIdentity(), SERVER);
    char payload[] = "payload";
    sender.send(new PTC::Event(117, 5, payload, sizeof payload, true, false));
    sender.send(new PTC::Event(3, 6, payload, 1, false, true));
    sender.send(nullptr);
    TestSocket peer = listener.accept();
    const QByteArray first = peer.read(20480);
    QByteArray expected = frame(4, 117, 5, QByteArray(payload, sizeof payload));
    expected.replace(24, 8, first.mid(24, 8)); // any value
    QCOMPARE(first, expected);
    const QByteArray second = peer.read(20480);
    expected = TestSocket::frame(4, 3, 6, true, 1, false, "p");
    expected.replace(24, 8, second.mid(24, 8));
    QCOMPARE(second, expected);
}

void tst_socketremotereceiver::senderClearsTheRestOfTheFrame()
{
    m_server.reset();
    TestListener listener(SERVER);
    SocketRemoteSender sender(4);
    QVERIFY(sender.initialize(SERVER));
    QByteArray large(20424, 'L');
    sender.send(new PTC::Event(1, 1, large.data(), large.size(), true, false));
    sender.send(new PTC::Event(1, 2, large.data(), 2, true, false));
    TestSocket peer = listener.accept();
    QCOMPARE(peer.read(20480).mid(56), large);
    QCOMPARE(peer.read(20480).mid(56), QByteArray("LL") + QByteArray(20422, '\0'));
}

void tst_socketremotereceiver::senderRefusesOversize()
{
    m_server.reset();
    TestListener listener(SERVER);
    SocketRemoteSender sender(4);
    QVERIFY(sender.initialize(SERVER));
    QByteArray large(30000, 'L');
    for (const long size : {20425L, 30000L, 1L << 62, -1L})
        sender.send(new PTC::Event(1, 1, large.data(), size, true, false));
    sender.send(new PTC::Event(1, 2, large.data(), 3, true, false));
    TestSocket peer = listener.accept();
    QCOMPARE(peer.read(20480).mid(16, 1), QByteArray(1, '\2'));
    QVERIFY(peer.nothingToRead());
}

void tst_socketremotereceiver::senderDrainsAtMostTenBytes_data()
{
    QTest::addColumn<int>("acknowledgements");
    QTest::addColumn<int>("calls");
    QTest::addColumn<bool>("bytesAreLeft");
    QTest::newRow("9 bytes, one call") << 3 << 1 << false;
    QTest::newRow("15 bytes, one call") << 5 << 1 << true;
    QTest::newRow("15 bytes, two calls") << 5 << 2 << false;
}

void tst_socketremotereceiver::senderDrainsAtMostTenBytes()
{
    QFETCH(int, acknowledgements);
    QFETCH(int, calls);
    QFETCH(bool, bytesAreLeft);
    m_server.reset();
    TestListener listener(SERVER);
    auto sender = std::make_unique<SocketRemoteSender>(4);
    QVERIFY(sender->initialize(SERVER));
    TestSocket peer = listener.accept();
    peer.write(QByteArray("OK\0", 3).repeated(acknowledgements));
    char payload[4] = {};
    QTRY_VERIFY(peer.everythingDelivered());
    for (int i = 0; i < calls; ++i)
        sender->send(new PTC::Event(1, i, payload, 4, true, false));
    QCOMPARE(peer.read(calls * 20480).size(), calls * 20480);
    // A socket that is closed with unread bytes resets the connection, one without ends it in order.
    sender.reset();
    QCOMPARE(peer.readAll(), QByteArray());
    QCOMPARE(peer.endedByReset(), bytesAreLeft);
}

void tst_socketremotereceiver::senderToNobody()
{
    m_server.reset();
    SocketRemoteSender sender(4);
    QVERIFY(!sender.initialize(SERVER));
    QVERIFY(!sender.isConnected());
    char payload[4] = {};
    sender.send(new PTC::Event(1, 1, payload, 4, true, false));
    TestListener listener(SERVER);
    QVERIFY(sender.initialize(SERVER));
    QVERIFY(sender.isConnected());
}

void tst_socketremotereceiver::senderWhosePeerDied()
{
    m_server.reset();
    SocketRemoteSender sender(4);
    char payload[4] = {};
    {
        TestListener listener(SERVER);
        QVERIFY(sender.initialize(SERVER));
        TestSocket peer = listener.accept();
    }
    QTRY_VERIFY(!sender.isConnected());
    for (int i = 0; i < 5; ++i) // SIGPIPE would end this program
        sender.send(new PTC::Event(1, 1, payload, 4, true, false));
    QVERIFY(!sender.isConnected());
}

void tst_socketremotereceiver::senderSurvivesABlockedPeer()
{
    // A peer that does not read on while its many acknowledgements are not taken.
    m_server.reset();
    TestListener listener(SERVER);
    auto sender = std::make_unique<SocketRemoteSender>(4);
    QVERIFY(sender->initialize(SERVER));
    TestSocket peer = listener.accept();
    std::thread reader([&peer] {
        while (peer.read(20480).size() == 20480 && peer.write(QByteArray("OK\0", 3).repeated(7000))) {
        }
    });
    char payload[4] = {};
    for (int i = 0; i < 800; ++i)
        sender->send(new PTC::Event(1, i, payload, 4, true, false));
    const bool connected = sender->isConnected();
    sender.reset(); // ends the reader
    reader.join();
    QVERIFY(connected);
}

QTEST_GUILESS_MAIN(tst_socketremotereceiver)
#include "tst_socketremotereceiver.moc"
