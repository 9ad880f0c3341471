// The wait of the start for a sibling process to listen. Says on standard error what is waited for when that
// takes long.
#pragma once

#include <chrono>
#include <vector>

class SocketRemoteSender;

class SiblingWait
{
public:
    static constexpr std::chrono::seconds QUIET{2};

    // Client numbers of the siblings that are not connected yet.
    explicit SiblingWait(std::vector<long> missing);

    // Blocks until the sender is connected to that client. False when this process is told to end first.
    bool waitFor(SocketRemoteSender& sender, long client);

private:
    void report() const;

    std::vector<long> mMissing;
};
