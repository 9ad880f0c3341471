#include "app/EarlyRequests.h"

#include "support/LogManager.h"

#include <QMetaObject>

#include <utility>

namespace
{
constexpr int LOG_NUMBER = 200;
}

EarlyRequests* EarlyRequests::mInstance = nullptr;

EarlyRequests* EarlyRequests::getInstance()
{
    if (!mInstance)
        mInstance = new EarlyRequests;
    return mInstance;
}

void EarlyRequests::clearInstance()
{
    delete mInstance;
    mInstance = nullptr;
}

EarlyRequests::EarlyRequests()
{
    mPatience.setSingleShot(true);
    mPatience.setInterval(PATIENCE);
    connect(&mPatience, &QTimer::timeout, this, &EarlyRequests::losePatience);
}

void EarlyRequests::expectClientId(long service)
{
    mExpected.insert(service);
}

void EarlyRequests::clientIdCame(long service)
{
    if (mExpected.remove(service) && mExpected.isEmpty())
        carryOutKept();
}

void EarlyRequests::carryOut(std::function<void()> request)
{
    if (mExpected.isEmpty() && mKept.empty()) {
        request();
        return;
    }
    if (mKept.size() >= MAX_KEPT)
        return;
    mKept.push_back(std::move(request));
    if (!mExpected.isEmpty() && !mPatience.isActive())
        mPatience.start();
}

void EarlyRequests::carryOutKept()
{
    mPatience.stop();
    if (!mKept.empty())
        QMetaObject::invokeMethod(this, &EarlyRequests::carryOutNext, Qt::QueuedConnection);
}

// Schedules the next request before this one is carried out, since this one may run an event loop of its own
// for a dialog.
void EarlyRequests::carryOutNext()
{
    if (mKept.empty())
        return;
    const std::function<void()> request = std::move(mKept.front());
    mKept.pop_front();
    carryOutKept();
    request();
}

void EarlyRequests::losePatience()
{
    LOG_DEBUG_OPERATE(L"EarlyRequests", LOG_NUMBER,
                      std::to_wstring(mExpected.size()) + L" services have given no client id yet");
    mExpected.clear();
    carryOutKept();
}
