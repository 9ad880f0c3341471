// The sender to a process that does not read, does not accept, ends, or is started anew.
#include "messaging/ptc/Event.h"
#include "messaging/ptc/SocketFrame.h"
#include "messaging/ptc/SocketRemoteSender.h"
#include "support/LogManager.h"
#include "tests/messaging/TestPorts.h"
#include "tests/messaging/TestSocket.h"
#include "tests/support/Patience.h"

#include <QElapsedTimer>
#include <QFile>
#include <QTemporaryDir>
#include <QTest>

#include <atomic>
#include <csignal>
#include <memory>
#include <thread>
#include <vector>

namespace
{

const long PEER = 1000;
// Below the 10 s for which a blocking call would wait for its peer, and enough for a busy machine.
const int MOST_GUI_MS = 8000;
const int FLOOD = 3000;

void call(SocketRemoteSender& sender, long method)
{
    char payload[4] = {};
    sender.send(new PTC::Event(1, method, payload, 4, true, false));
}

qint64 methodOf(const QByteArray& frame)
{
    return frame.size() == SocketFrame::FRAME_SIZE ? TestSocket::longAt(frame, SocketFrame::METHOD_ID) : -1;
}

// Connections that fill a listener's backlog, so that the next one is left waiting.
std::vector<std::unique_ptr<TestSocket>> fillBacklog()
{
    std::vector<std::unique_ptr<TestSocket>> fillers;
    for (int i = 0; i < 64; ++i) {
        fillers.push_back(std::make_unique<TestSocket>(PEER, TestSocket::DoNotWait));
        QTest::qWait(5);
        if (!fillers.back()->isConnected())
            break;
    }
    return fillers;
}

} // namespace

class tst_socketremotesender_outage : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cleanupTestCase();
    void init();
    void aPeerThatDoesNotReadHoldsNobodyUp();
    void aPeerThatReadsAgainGetsTheNewestCalls();
    void aPeerThatWasStartedAnewIsReached();
    void aStuckPeerThatWasStartedAnewIsReached();
    void aPeerThatClosesEachConnectionEndsTheTry();
    void nobodyListens();
    void connectingIsGivenUp();
    void callsWaitForAListenerWithoutRoom();
    void endingWaitsForWhatIsOnItsWay();
    void endingDoesNotWaitForAStuckPeer();
    void endingWhileConnecting();

private:
    int logLines() const;

    QTemporaryDir m_logs;
    int m_linesBefore = 0;
};

void tst_socketremotesender_outage::initTestCase()
{
    TestPorts::useFreeOffset();
    qputenv("K2SYS_LOG_DIR", m_logs.path().toUtf8());
    INIT_LOGGING(L"test");
    std::signal(SIGPIPE, SIG_DFL); // a write that raises SIGPIPE would end this program
}

void tst_socketremotesender_outage::cleanupTestCase()
{
    UNINIT_LOGGING();
}

void tst_socketremotesender_outage::init()
{
    m_linesBefore = 0;
    m_linesBefore = logLines();
}

// Returns the time since the test began.
int tst_socketremotesender_outage::logLines() const
{
    QFile log(m_logs.filePath("k2_ope_debug.log"));
    return log.open(QIODevice::ReadOnly) ? int(log.readAll().count('\n')) - m_linesBefore : 0;
}

void tst_socketremotesender_outage::aPeerThatDoesNotReadHoldsNobodyUp()
{
    TestListener listener(PEER);
    SocketRemoteSender sender(4);
    QVERIFY(sender.initialize(PEER));
    TestSocket peer = listener.accept();
    QElapsedTimer timer;
    timer.start();
    for (int i = 0; i < FLOOD; ++i)
        call(sender, i);
    QVERIFY2(timer.elapsed() < MOST_GUI_MS, qPrintable(QString::number(timer.elapsed())));
    QVERIFY(sender.isConnected());
    QCOMPARE(logLines(), 1);
}

void tst_socketremotesender_outage::aPeerThatReadsAgainGetsTheNewestCalls()
{
    TestListener listener(PEER);
    SocketRemoteSender sender(4);
    QVERIFY(sender.initialize(PEER));
    TestSocket peer = listener.accept();
    for (int i = 0; i < FLOOD; ++i)
        call(sender, i);
    // Only whole frames arrive, in their order, without the dropped ones; all of the newest arrive.
    qint64 last = -1;
    int received = 0;
    int newest = 0;
    while (last < FLOOD - 1) {
        const qint64 method = methodOf(peer.read(SocketFrame::FRAME_SIZE));
        QVERIFY2(method > last, qPrintable(QString("%1 after %2").arg(method).arg(last)));
        last = method;
        ++received;
        newest += method >= FLOOD - SocketRemoteSender::MAX_WAITING_FRAMES + 1 ? 1 : 0;
    }
    QVERIFY(received < FLOOD);
    QCOMPARE(newest, SocketRemoteSender::MAX_WAITING_FRAMES - 1);
    for (int i = 0; i < 3; ++i) {
        call(sender, FLOOD + i);
        QCOMPARE(methodOf(peer.read(SocketFrame::FRAME_SIZE)), qint64(FLOOD + i));
    }
    QCOMPARE(logLines(), 1);
    // A second outage is logged with a line of its own.
    for (int i = 0; i < FLOOD; ++i)
        call(sender, i);
    QCOMPARE(logLines(), 2);
}

void tst_socketremotesender_outage::aPeerThatWasStartedAnewIsReached()
{
    SocketRemoteSender sender(4);
    for (int start = 0; start < 3; ++start) {
        TestListener listener(PEER);
        if (start == 0)
            QVERIFY(sender.initialize(PEER));
        else
            QVERIFY(!sender.isConnected());
        call(sender, start);
        TestSocket peer = listener.accept();
        QCOMPARE(methodOf(peer.read(SocketFrame::FRAME_SIZE)), qint64(start));
        peer.write(QByteArray("OK\0", 3).repeated(9)); // more than is taken before the next frame
    }
    QTRY_VERIFY(!sender.isConnected());
    TestListener listener(PEER);
    QVERIFY(sender.reconnect());
    QCOMPARE(logLines(), 0);
}

void tst_socketremotesender_outage::aStuckPeerThatWasStartedAnewIsReached()
{
    SocketRemoteSender sender(4);
    {
        TestListener listener(PEER);
        QVERIFY(sender.initialize(PEER));
        TestSocket peer = listener.accept();
        for (int i = 0; i < FLOOD; ++i)
            call(sender, i);
    }
    TestListener listener(PEER);
    call(sender, FLOOD);
    TestSocket peer = listener.accept();
    qint64 method = -1;
    while (method < FLOOD) {
        const QByteArray frame = peer.read(SocketFrame::FRAME_SIZE);
        QCOMPARE(frame.size(), qsizetype(SocketFrame::FRAME_SIZE));
        QVERIFY(methodOf(frame) > method);
        method = methodOf(frame);
    }
    QCOMPARE(method, qint64(FLOOD));
}

void tst_socketremotesender_outage::aPeerThatClosesEachConnectionEndsTheTry()
{
    TestListener listener(PEER);
    SocketRemoteSender sender(4);
    QVERIFY(sender.initialize(PEER));
    auto peer = std::make_unique<TestSocket>(listener.accept());
    for (int i = 0; i < FLOOD; ++i)
        call(sender, i);
    std::atomic<bool> isOver = false;
    std::thread closer([&] {
        peer.reset();
        while (!isOver)
            listener.accept();
    });
    QTRY_COMPARE(logLines(), 1);
    sender.finish(std::chrono::steady_clock::now() + std::chrono::seconds(1));
    isOver = true;
    TestSocket last(PEER);
    closer.join();
}

void tst_socketremotesender_outage::nobodyListens()
{
    SocketRemoteSender sender(4);
    QVERIFY(!sender.beginConnect(PEER));
    for (int i = 0; i < 20; ++i) {
        call(sender, i);
        QVERIFY(!sender.reconnect());
    }
    QCOMPARE(logLines(), 1);
    TestListener listener(PEER);
    call(sender, 77);
    TestSocket peer = listener.accept();
    QCOMPARE(methodOf(peer.read(SocketFrame::FRAME_SIZE)), qint64(77));
}

void tst_socketremotesender_outage::connectingIsGivenUp()
{
    TestListener listener(PEER);
    const auto fillers = fillBacklog();
    SocketRemoteSender sender(4);
    QElapsedTimer timer;
    timer.start();
    QVERIFY(!sender.initialize(PEER));
    QVERIFY(timer.elapsed() < 10 * SocketRemoteSender::CONNECT_TIMEOUT_MS);
    // The result is that a process listens, without waiting for the connection.
    timer.start();
    QVERIFY(sender.beginConnect(PEER));
    for (int i = 0; i < 10; ++i) {
        call(sender, i);
        QVERIFY(sender.beginConnect(PEER));
        QVERIFY(!sender.reconnect());
    }
    QVERIFY2(timer.elapsed() < MOST_GUI_MS, qPrintable(QString::number(timer.elapsed())));
    // The connection is never made: the calls are dropped after the deadline.
    QTRY_COMPARE_WITH_TIMEOUT(logLines(), 1, 10 * SocketRemoteSender::CONNECT_TIMEOUT_MS);
}

void tst_socketremotesender_outage::callsWaitForAListenerWithoutRoom()
{
    TestListener listener(PEER);
    auto fillers = fillBacklog();
    SocketRemoteSender sender(4);
    sender.setConnectTimeout(60000);
    QVERIFY(sender.beginConnect(PEER));
    for (int i = 0; i < 3; ++i)
        call(sender, i);
    std::vector<std::unique_ptr<TestSocket>> accepted;
    QByteArray received;
    QDeadlineTimer deadline(60000);
    while (received.isEmpty() && !deadline.hasExpired()) {
        accepted.push_back(std::make_unique<TestSocket>(listener.accept()));
        fillers.clear(); // what is accepted from now on is theirs, which ends, or the sender's
        received = accepted.back()->read(3 * SocketFrame::FRAME_SIZE);
    }
    QCOMPARE(received.size(), qsizetype(3 * SocketFrame::FRAME_SIZE));
    for (int i = 0; i < 3; ++i)
        QCOMPARE(methodOf(received.mid(i * SocketFrame::FRAME_SIZE, SocketFrame::FRAME_SIZE)), qint64(i));
    QCOMPARE(logLines(), 0);
}

void tst_socketremotesender_outage::endingWaitsForWhatIsOnItsWay()
{
    TestListener listener(PEER);
    auto sender = std::make_unique<SocketRemoteSender>(4);
    QVERIFY(sender->initialize(PEER));
    TestSocket peer = listener.accept();
    int sent = 0;
    while (logLines() == 0) // until all that can wait does
        call(*sender, sent++);
    qint64 last = -1;
    std::thread reader([&peer, &last] {
        std::this_thread::sleep_for(std::chrono::milliseconds(50));
        QByteArray frame = peer.read(SocketFrame::FRAME_SIZE);
        while (frame.size() == SocketFrame::FRAME_SIZE) {
            last = methodOf(frame);
            peer.write(QByteArray("OK\0", 3));
            frame = peer.read(SocketFrame::FRAME_SIZE);
        }
    });
    call(*sender, sent);
    sender->finish(std::chrono::steady_clock::now() + std::chrono::seconds(20));
    sender.reset();
    reader.join();
    QCOMPARE(last, qint64(sent));
}

void tst_socketremotesender_outage::endingDoesNotWaitForAStuckPeer()
{
    TestListener listener(PEER);
    auto sender = std::make_unique<SocketRemoteSender>(4);
    QVERIFY(sender->initialize(PEER));
    TestSocket peer = listener.accept();
    for (int i = 0; i < FLOOD; ++i)
        call(*sender, i);
    QElapsedTimer timer;
    timer.start();
    sender.reset();
    QVERIFY(timer.elapsed() >= SocketRemoteSender::FINISH_TIMEOUT_MS - 50);
    QVERIFY(timer.elapsed() < PATIENCE_MS);
}

void tst_socketremotesender_outage::endingWhileConnecting()
{
    TestListener listener(PEER);
    const auto fillers = fillBacklog();
    auto sender = std::make_unique<SocketRemoteSender>(4);
    sender->setConnectTimeout(600000);
    QVERIFY(sender->beginConnect(PEER));
    call(*sender, 1);
    QElapsedTimer timer;
    timer.start();
    sender->finish(std::chrono::steady_clock::now());
    sender.reset();
    QVERIFY2(timer.elapsed() < MOST_GUI_MS, qPrintable(QString::number(timer.elapsed())));
}

QTEST_GUILESS_MAIN(tst_socketremotesender_outage)
#include "tst_socketremotesender_outage.moc"
