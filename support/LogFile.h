#pragma once

#include <mutex>
#include <string>
#include <string_view>

// One log file of the appliance, to which several processes append whole lines.
//
// A full file is renamed to ".1", and the older ones to the next number; four old files are kept. The process
// that fills the file does this under a lock, for which no process waits: meanwhile the other processes write
// on into the full file, which exceeds its size by these lines. Then they notice that the path leads to
// another file and open that. If a file cannot be renamed it is emptied, so that a log never fills the disk.
// Any thread.
class LogFile
{
public:
    static constexpr long long MAX_BYTES = 1000000;
    static constexpr int OLD_FILES = 4;

    // Opens or creates the file, which its owner may write and its group may read. If path is a link, a pipe
    // or a device, it is not touched and all lines are dropped.
    explicit LogFile(std::string path);
    ~LogFile();
    LogFile(const LogFile&) = delete;
    LogFile& operator=(const LogFile&) = delete;

    // Appends a line, which ends with its only line feed. A line that cannot be written is lost.
    void write(std::string_view line);

private:
    void open();
    void close();
    bool isThatOfPath() const;
    bool isFullWith(std::size_t size) const;
    void makeRoomFor(std::size_t size);
    bool moveAside() const;

    std::string m_path;
    std::mutex m_mutex; // guards the members below
    int m_descriptor = -1;
};
