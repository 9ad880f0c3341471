// One log file of the appliance, to which several processes append whole lines.
//
// A file that has reached its size gets a number behind its name, ".1", and the older ones the next; four old
// files are kept. Whoever fills the file does this, under a lock on it that nobody waits for; the others
// notice that the name stands for another file and open that. A file that cannot be renamed is emptied
// instead, so that a log never fills the disk. Any thread.
#pragma once

#include <mutex>
#include <string>
#include <string_view>

class LogFile
{
public:
    static constexpr long long MAX_BYTES = 1000000;
    static constexpr int OLD_FILES = 4;

    // Makes the file, which only its owner may write and his group read. A link, a pipe or a device at this
    // path is left alone, and lines go nowhere.
    explicit LogFile(std::string path);
    ~LogFile();
    LogFile(const LogFile&) = delete;
    LogFile& operator=(const LogFile&) = delete;

    // Appends a line, which ends with a line feed and holds no other. What cannot be written is lost.
    void write(std::string_view line);

private:
    void open();
    void close();
    bool isThatOfPath() const;
    bool isFullWith(std::size_t size) const;
    void makeRoomFor(std::size_t size);
    bool moveAside() const;

    std::string mPath;
    std::mutex mMutex; // of what follows
    int mDescriptor = -1;
};
