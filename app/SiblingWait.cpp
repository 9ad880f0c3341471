#include "app/SiblingWait.h"

#include "messaging/ptc/SocketFrame.h"
#include "messaging/ptc/SocketRemoteSender.h"
#include "support/SystemSignalHandler.h"

#include <cstdio>
#include <string>
#include <unistd.h>
#include <utility>

namespace
{
constexpr int RETRY_MS = 20;
}

SiblingWait::SiblingWait(std::vector<long> missing) : m_missing(std::move(missing))
{
}

bool SiblingWait::waitFor(SocketRemoteSender& sender, long client)
{
    using Clock = std::chrono::steady_clock;
    const auto reportTime = Clock::now() + QUIET;
    bool isReported = false;
    sender.setConnectTimeout(RETRY_MS);
    while (!sender.initialize(client)) {
        if (isTerminationRequested())
            return false;
        if (!isReported && Clock::now() >= reportTime) {
            report();
            isReported = true;
        }
        ::usleep(RETRY_MS * 1000); // a signal interrupts it
    }
    sender.setConnectTimeout(SocketRemoteSender::CONNECT_TIMEOUT_MS);
    return true;
}

void SiblingWait::report() const
{
    std::string ports;
    for (const long client : m_missing)
        ports += (ports.empty() ? "port " : ", port ") + std::to_string(SocketFrame::portOf(client));
    std::fprintf(stderr, "titler: waiting for sibling processes to listen on 127.0.0.1: %s\n", ports.c_str());
}
