#include "support/FileSyncQueue.h"

#include "support/AlternateStack.h"
#include "support/HiddenName.h"

#include <cerrno>
#include <condition_variable>
#include <cstdio>
#include <deque>
#include <fcntl.h>
#include <mutex>
#include <thread>
#include <unistd.h>
#include <unordered_map>

namespace
{

enum class SyncResult { Done, Missing, Failed };

SyncResult syncOne(const std::string& path, int flags)
{
    const int descriptor = ::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK | flags);
    if (descriptor < 0)
        return errno == ENOENT || errno == ENOTDIR ? SyncResult::Missing : SyncResult::Failed;
    const bool isDone = ::fsync(descriptor) == 0;
    ::close(descriptor);
    return isDone ? SyncResult::Done : SyncResult::Failed;
}

class Queue
{
public:
    // Never destroyed: its thread may be at work until the process has gone. What is left then is swept at
    // the next start.
    static Queue& instance()
    {
        static Queue* const queue = new Queue;
        return *queue;
    }

    bool publish(const std::string& temporary, const std::string& path)
    {
        const std::lock_guard lock(mMutex);
        // A file that is still queued is not on the disk, so what was kept for it before stays the one to
        // keep.
        const bool isQueued = mEntries.contains(path);
        const std::string kept = isQueued ? std::string() : HiddenName::kept(path);
        const bool isLinked = !kept.empty() && ::link(path.c_str(), kept.c_str()) == 0;
        const bool isKept = isLinked || (!kept.empty() && errno == EEXIST);
        if (std::rename(temporary.c_str(), path.c_str()) != 0) {
            if (isLinked)
                ::unlink(kept.c_str());
            return false;
        }
        add(path, isKept);
        return true;
    }

    bool publishSynced(const std::string& temporary, const std::string& path)
    {
        const std::lock_guard lock(mMutex);
        return std::rename(temporary.c_str(), path.c_str()) == 0;
    }

    void enqueue(const std::string& path)
    {
        const std::lock_guard lock(mMutex);
        add(path, false);
    }

    void settleKept(const std::string& path, FileSyncQueue::Kept decision)
    {
        const std::lock_guard lock(mMutex);
        if (mEntries.contains(path))
            return;
        const std::string kept = HiddenName::kept(path);
        if (decision == FileSyncQueue::Kept::Discard)
            ::unlink(kept.c_str());
        else if (decision == FileSyncQueue::Kept::DiscardAfterSync)
            add(path, true);
        else if (std::rename(kept.c_str(), path.c_str()) == 0)
            add(path, false);
    }

    bool flush(std::chrono::milliseconds deadline)
    {
        std::unique_lock lock(mMutex);
        return mIdle.wait_for(lock, deadline, [this] { return mEntries.empty() && !mIsDiscarding; });
    }

private:
    struct Entry {
        unsigned long generation = 0;
        bool isKept = false;
    };

    void add(const std::string& path, bool isKept)
    {
        Entry& entry = mEntries[path];
        if (entry.generation++ == 0)
            mOrder.push_back(path);
        entry.isKept |= isKept;
        if (!mIsRunning) {
            mIsRunning = true;
            std::thread(&Queue::run, this).detach();
        }
        mWork.notify_one();
    }

    void run()
    {
        AlternateStack::useInThisThread();
        std::unique_lock lock(mMutex);
        for (;;) {
            mWork.wait(lock, [this] { return !mOrder.empty(); });
            const std::string path = mOrder.front();
            mOrder.pop_front();
            const unsigned long generation = mEntries[path].generation;
            lock.unlock();
            SyncResult result = syncOne(path, 0);
            if (result != SyncResult::Failed &&
                syncOne(HiddenName::folderOf(path), O_DIRECTORY) == SyncResult::Failed)
                result = SyncResult::Failed;
            lock.lock();
            finish(path, generation, result, lock);
        }
    }

    void finish(const std::string& path, unsigned long generation, SyncResult result,
                std::unique_lock<std::mutex>& lock)
    {
        const auto entry = mEntries.find(path);
        if (entry->second.generation != generation) { // saved again meanwhile
            mOrder.push_back(path);
            return;
        }
        // The file is on the disk now, and a save from here on keeps it. Freeing the blocks of the old
        // version can take a while, and a save must not wait for that behind the lock: inside it the version
        // only gets another name.
        std::string discarded;
        if (entry->second.isKept && result != SyncResult::Failed) {
            discarded = HiddenName::temporary(HiddenName::folderOf(path));
            std::rename(HiddenName::kept(path).c_str(), discarded.c_str());
        }
        mEntries.erase(entry);
        if (!discarded.empty()) {
            mIsDiscarding = true;
            lock.unlock();
            ::unlink(discarded.c_str());
            lock.lock();
            mIsDiscarding = false;
        }
        if (mEntries.empty())
            mIdle.notify_all();
    }

    std::mutex mMutex;
    std::condition_variable mWork;
    std::condition_variable mIdle;
    std::unordered_map<std::string, Entry> mEntries;
    std::deque<std::string> mOrder;
    bool mIsRunning = false;
    bool mIsDiscarding = false;
};

} // namespace

bool FileSyncQueue::publish(const std::string& temporary, const std::string& path)
{
    return Queue::instance().publish(temporary, path);
}

bool FileSyncQueue::publishSynced(const std::string& temporary, const std::string& path)
{
    return Queue::instance().publishSynced(temporary, path);
}

void FileSyncQueue::enqueue(const std::string& path)
{
    Queue::instance().enqueue(path);
}

void FileSyncQueue::settleKept(const std::string& path, Kept decision)
{
    Queue::instance().settleKept(path, decision);
}

bool FileSyncQueue::flush(std::chrono::milliseconds deadline)
{
    return Queue::instance().flush(deadline);
}
