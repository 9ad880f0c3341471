// The factory of the titler's side of the wire while it begins to listen.
#include "Siblings.h"
#include "app/TitlerToolFactory.h"
#include "messaging/ptc/SocketRemoteSender.h"
#include "messaging/services/ServiceFamilies.h"
#include "messaging/services/ServiceTable.h"
#include "tests/fakes/FakeTitler.h"

#include <QTest>

#include <atomic>
#include <chrono>
#include <functional>
#include <memory>
#include <thread>

namespace
{

constexpr long TITLER_ID = 117; // of the service
constexpr long TITLER_KEY = 4;  // of the receiver in the titler's process

// Connects to the titler's port as soon as it listens, and sends one request.
void requestAtOnce(const std::atomic<bool>& isGivenUp)
{
    SocketRemoteSender sender(TITLER_KEY);
    while (!sender.initialize(ServiceTable::TITLER_CLIENT))
        if (isGivenUp)
            return;
    TitlerRemoteProxy proxy(TITLER_ID);
    proxy.setSender(&sender);
    proxy.showTitlerCreate(1);
    sender.finish(std::chrono::steady_clock::now() + std::chrono::seconds(10));
}

} // namespace

class tst_titlertoolfactory : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void requestOfTheFirstMomentArrives();
};

// The accept thread can read a whole request before initialize has returned.
void tst_titlertoolfactory::requestOfTheFirstMomentArrives()
{
    Siblings siblings;
    QVERIFY(siblings.listenOnFreePorts());
    for (int start = 0; start < 100; ++start) {
        std::atomic<bool> isGivenUp = false;
        std::thread sibling(requestAtOnce, std::cref(isGivenUp));
        auto* titler = new FakeTitler;
        TitlerToolFactory factory;
        factory.RegisterObject(TITLER_ID, titler);
        const bool listens = factory.initialize();
        isGivenUp = !listens;
        sibling.join();
        QVERIFY(listens);
        QTRY_COMPARE_WITH_TIMEOUT(titler->calls.size(), 1, 30000);
    }
}

QTEST_GUILESS_MAIN(tst_titlertoolfactory)
#include "tst_titlertoolfactory.moc"
