#include "support/FileSyncQueue.h"

#include "support/AlternateStack.h"
#include "support/AtomicFile.h"
#include "support/HiddenName.h"

#include <cerrno>
#include <condition_variable>
#include <cstdio>
#include <deque>
#include <fcntl.h>
#include <mutex>
#include <set>
#include <thread>
#include <unistd.h>
#include <unordered_map>

namespace
{

constexpr std::size_t LARGEST_FILE = 256 * 1024 * 1024; // of any file that this program writes

enum class SyncResult { Done, Missing, Failed };

SyncResult syncOne(const std::string& path, int flags)
{
    const int descriptor = ::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK | flags);
    if (descriptor < 0)
        return errno == ENOENT || errno == ENOTDIR ? SyncResult::Missing : SyncResult::Failed;
    // Some file systems do not support fsync.
    const bool isDone = ::fsync(descriptor) == 0 || errno == EINVAL || errno == ENOTSUP || errno == EROFS;
    ::close(descriptor);
    return isDone ? SyncResult::Done : SyncResult::Failed;
}

class Queue
{
public:
    // Never destroyed, because its thread may run until the process ends. LeftoverSweep cleans up at the next
    // start.
    static Queue& instance()
    {
        static Queue* const queue = new Queue;
        return *queue;
    }

    bool publish(const std::string& temporary, const std::string& path)
    {
        const std::lock_guard lock(mMutex);
        // A file that is still queued is not on the disk yet, so the version that was kept for it remains the
        // one to keep.
        const bool isQueued = mEntries.contains(path);
        const std::string kept = isQueued ? std::string() : HiddenName::kept(path);
        const bool isLinked = !kept.empty() && ::link(path.c_str(), kept.c_str()) == 0;
        const bool isKept = isLinked || (!kept.empty() && errno == EEXIST);
        if (std::rename(temporary.c_str(), path.c_str()) != 0) {
            const int error = errno;
            if (isLinked)
                ::unlink(kept.c_str());
            errno = error;
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

    std::vector<std::string> unsynced()
    {
        const std::lock_guard lock(mMutex);
        std::vector<std::string> paths(mFailed.begin(), mFailed.end());
        for (const auto& [path, entry] : mEntries)
            paths.push_back(path);
        return paths;
    }

    std::vector<std::string> failed()
    {
        const std::lock_guard lock(mMutex);
        return {mFailed.begin(), mFailed.end()};
    }

    void forgetFailed(const std::string& path)
    {
        const std::lock_guard lock(mMutex);
        mFailed.erase(path);
    }

    void setListener(std::function<void()> listener)
    {
        const std::lock_guard lock(mMutex);
        mListener = std::move(listener);
    }

    bool flush(std::chrono::milliseconds deadline)
    {
        std::unique_lock lock(mMutex);
        const bool isIdle =
            mIdle.wait_for(lock, deadline, [this] { return mEntries.empty() && !mIsDiscarding; });
        return isIdle && mFailed.empty();
    }

private:
    struct Entry {
        unsigned long generation = 0;
        bool isKept = false;
    };

    void add(const std::string& path, bool isKept)
    {
        mFailed.erase(path);
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
        if (entry->second.generation != generation) { // saved again in the meantime
            mOrder.push_back(path);
            return;
        }
        // The file is on the disk now; the next save will keep it as the last synced version. The old version
        // is only renamed while the lock is held: freeing its blocks may take long, and a save must not wait
        // for that.
        std::string discarded;
        if (entry->second.isKept && result != SyncResult::Failed) {
            discarded = HiddenName::temporary(HiddenName::folderOf(path));
            std::rename(HiddenName::kept(path).c_str(), discarded.c_str());
        }
        mEntries.erase(entry);
        if (result == SyncResult::Failed) {
            mFailed.insert(path);
            if (const std::function<void()> listener = mListener) {
                lock.unlock();
                listener();
                lock.lock();
            }
        }
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
    std::set<std::string> mFailed;
    std::function<void()> mListener;
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

bool FileSyncQueue::syncFolder(const std::string& folder)
{
    return syncOne(folder, O_DIRECTORY) != SyncResult::Failed;
}

std::vector<std::string> FileSyncQueue::unsynced()
{
    return Queue::instance().unsynced();
}

bool FileSyncQueue::hasFailed()
{
    return !Queue::instance().failed().empty();
}

void FileSyncQueue::retryFailed()
{
    for (const std::string& path : Queue::instance().failed()) {
        // After a failed fsync the kernel may regard the pages as clean; only newly written ones are sure to
        // reach the disk.
        std::string bytes;
        if (AtomicFile::read(path, LARGEST_FILE, bytes))
            AtomicFile::write(path, bytes, AtomicFile::Durability::SyncLater);
        else if (errno == ENOENT || errno == ENOTDIR)
            Queue::instance().forgetFailed(path);
    }
}

void FileSyncQueue::setListener(std::function<void()> listener)
{
    Queue::instance().setListener(std::move(listener));
}

bool FileSyncQueue::flush(std::chrono::milliseconds deadline)
{
    return Queue::instance().flush(deadline);
}
