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
        const std::lock_guard lock(m_mutex);
        // A file that is still queued is not on the disk yet, so the version that was kept for it remains the
        // one to keep.
        const bool isQueued = m_entries.contains(path);
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
        const std::lock_guard lock(m_mutex);
        return std::rename(temporary.c_str(), path.c_str()) == 0;
    }

    void enqueue(const std::string& path)
    {
        const std::lock_guard lock(m_mutex);
        add(path, false);
    }

    void settleKept(const std::string& path, FileSyncQueue::Kept decision)
    {
        const std::lock_guard lock(m_mutex);
        if (m_entries.contains(path))
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
        const std::lock_guard lock(m_mutex);
        std::vector<std::string> paths(m_failed.begin(), m_failed.end());
        for (const auto& [path, entry] : m_entries)
            paths.push_back(path);
        return paths;
    }

    std::vector<std::string> failed()
    {
        const std::lock_guard lock(m_mutex);
        return {m_failed.begin(), m_failed.end()};
    }

    void forgetFailed(const std::string& path)
    {
        const std::lock_guard lock(m_mutex);
        m_failed.erase(path);
    }

    void setListener(std::function<void()> listener)
    {
        const std::lock_guard lock(m_mutex);
        m_listener = std::move(listener);
    }

    bool flush(std::chrono::milliseconds deadline)
    {
        std::unique_lock lock(m_mutex);
        const bool isIdle =
            m_idle.wait_for(lock, deadline, [this] { return m_entries.empty() && !m_isDiscarding; });
        return isIdle && m_failed.empty();
    }

private:
    struct Entry {
        unsigned long generation = 0;
        bool isKept = false;
    };

    void add(const std::string& path, bool isKept)
    {
        m_failed.erase(path);
        Entry& entry = m_entries[path];
        if (entry.generation++ == 0)
            m_order.push_back(path);
        entry.isKept |= isKept;
        if (!m_isRunning) {
            m_isRunning = true;
            std::thread(&Queue::run, this).detach();
        }
        m_work.notify_one();
    }

    void run()
    {
        AlternateStack::useInThisThread();
        std::unique_lock lock(m_mutex);
        for (;;) {
            m_work.wait(lock, [this] { return !m_order.empty(); });
            const std::string path = m_order.front();
            m_order.pop_front();
            const unsigned long generation = m_entries[path].generation;
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
        const auto entry = m_entries.find(path);
        if (entry->second.generation != generation) { // saved again in the meantime
            m_order.push_back(path);
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
        m_entries.erase(entry);
        if (result == SyncResult::Failed) {
            m_failed.insert(path);
            if (const std::function<void()> listener = m_listener) {
                lock.unlock();
                listener();
                lock.lock();
            }
        }
        if (!discarded.empty()) {
            m_isDiscarding = true;
            lock.unlock();
            ::unlink(discarded.c_str());
            lock.lock();
            m_isDiscarding = false;
        }
        if (m_entries.empty())
            m_idle.notify_all();
    }

    std::mutex m_mutex;
    std::condition_variable m_work;
    std::condition_variable m_idle;
    std::unordered_map<std::string, Entry> m_entries;
    std::deque<std::string> m_order;
    std::set<std::string> m_failed;
    std::function<void()> m_listener;
    bool m_isRunning = false;
    bool m_isDiscarding = false;
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
