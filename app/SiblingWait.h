#pragma once

#include <chrono>
#include <vector>

class SocketRemoteSender;

// Waits at the start until a sibling process listens. When this takes long, writes to standard error what it
// waits for.
class SiblingWait
{
public:
    static constexpr std::chrono::seconds QUIET{2};

    // missing: client numbers of the siblings that are not connected yet.
    explicit SiblingWait(std::vector<long> missing);

    // Blocks until the sender is connected to the client. Returns false when this process is told to end
    // before that.
    bool waitFor(SocketRemoteSender& sender, long client);

private:
    void report() const;

    std::vector<long> m_missing;
};
