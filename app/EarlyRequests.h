// Keeps what siblings ask for until the hand-shakes with their services are through: a window that is shown
// before would introduce itself without a client id. A service that never gives one holds no request up for
// longer than PATIENCE.
//
// GUI thread.
#pragma once

#include <QObject>
#include <QSet>
#include <QTimer>

#include <chrono>
#include <deque>
#include <functional>

class EarlyRequests : public QObject
{
    Q_OBJECT

public:
    static constexpr std::chrono::seconds PATIENCE{5};
    // What comes while so many are kept is dropped.
    static constexpr int MAX_KEPT = 64;

    static EarlyRequests* getInstance();
    // Drops what is kept.
    static void clearInstance();

    // The hand-shake with a service has begun, and it has given the client id.
    void expectClientId(long service);
    void clientIdCame(long service);

    // Carries the request out at once, or after the hand-shakes and those that came before it.
    void carryOut(std::function<void()> request);

private Q_SLOTS:
    void carryOutNext();
    void losePatience();

private:
    EarlyRequests();

    void carryOutKept();

    static EarlyRequests* mInstance;

    QSet<long> mExpected; // services
    std::deque<std::function<void()>> mKept;
    QTimer mPatience;
};
