#pragma once

#include <QObject>
#include <QSet>
#include <QTimer>

#include <chrono>
#include <deque>
#include <functional>

// Queues the requests of sibling processes until the hand-shakes with their services are complete: a window
// shown earlier would have no client id to send to them. If a service gives no client id, its requests wait
// for PATIENCE at most.
//
// GUI thread.
class EarlyRequests : public QObject
{
    Q_OBJECT

public:
    static constexpr std::chrono::seconds PATIENCE{5};
    // When so many requests are queued, further ones are dropped.
    static constexpr int MAX_KEPT = 64;

    static EarlyRequests* getInstance();
    // Deletes the instance and the queued requests.
    static void clearInstance();

    // Called when the hand-shake with a service has begun, and when the service has given the client id.
    void expectClientId(long service);
    void clientIdCame(long service);

    // Carries out the request, at once or after the hand-shakes and the requests queued before it.
    void carryOut(std::function<void()> request);

private Q_SLOTS:
    void carryOutNext();
    void losePatience();

private:
    EarlyRequests();

    void carryOutKept();

    static EarlyRequests* mInstance;

    QSet<long> m_expected; // ids of the services whose client id is missing
    std::deque<std::function<void()>> m_kept;
    QTimer m_patience;
};
