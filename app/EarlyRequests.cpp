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
    m_patience.setSingleShot(true);
    m_patience.setInterval(PATIENCE);
    connect(&m_patience, &QTimer::timeout, this, &EarlyRequests::losePatience);
}

void EarlyRequests::expectClientId(long service)
{
    m_expected.insert(service);
}

void EarlyRequests::clientIdCame(long service)
{
    if (m_expected.remove(service) && m_expected.isEmpty())
        carryOutKept();
}

void EarlyRequests::carryOut(std::function<void()> request)
{
    if (m_expected.isEmpty() && m_kept.empty()) {
        request();
        return;
    }
    if (m_kept.size() >= MAX_KEPT)
        return;
    m_kept.push_back(std::move(request));
    if (!m_expected.isEmpty() && !m_patience.isActive())
        m_patience.start();
}

void EarlyRequests::carryOutKept()
{
    m_patience.stop();
    if (!m_kept.empty())
        QMetaObject::invokeMethod(this, &EarlyRequests::carryOutNext, Qt::QueuedConnection);
}

// Schedules the next request before this one is carried out, since this one may run an event loop of its own
// for a dialog.
void EarlyRequests::carryOutNext()
{
    if (m_kept.empty())
        return;
    const std::function<void()> request = std::move(m_kept.front());
    m_kept.pop_front();
    carryOutKept();
    request();
}

void EarlyRequests::losePatience()
{
    LOG_DEBUG_OPERATE(L"EarlyRequests", LOG_NUMBER,
                      std::to_wstring(m_expected.size()) + L" services have given no client id yet");
    m_expected.clear();
    carryOutKept();
}
