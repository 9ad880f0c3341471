// Bytes that the disk refused: kept, read in place of the file, written when there is room, and moved or
// forgotten with their folder.
#include "FullDisk.h"
#include "Patience.h"

#include "support/AtomicFile.h"
#include "support/FileSyncQueue.h"
#include "support/RefusedWrites.h"
#include "support/XmlFile.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <QtTest/QTest>
#include <atomic>
#include <cerrno>
#include <sys/syscall.h>
#include <thread>
#include <tinyxml.h>
#include <unistd.h>

namespace
{

std::atomic<int> gSyncError = 0; // errno of the next syncs

} // namespace

// In place of the system's, for all threads of this process.
extern "C" int fsync(int descriptor)
{
    if (const int error = gSyncError) {
        errno = error;
        return -1;
    }
    return static_cast<int>(::syscall(SYS_fsync, descriptor));
}

class tst_refusedwrites : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        m_folder = std::make_unique<QTemporaryDir>();
        m_calls = 0;
        RefusedWrites::setListener([this] { ++m_calls; });
    }
    void cleanup()
    {
        RefusedWrites::setListener(nullptr);
        for (const RefusedWrites::File& file : RefusedWrites::files())
            RefusedWrites::forget(file.path);
        QVERIFY(RefusedWrites::isEmpty());
        QVERIFY(FileSyncQueue::flush(std::chrono::seconds(30)));
    }

    void keptBytesAreReadAndWritten()
    {
        const std::string file = path("title.xml");
        QVERIFY(AtomicFile::write(file, "<old/>"));
        {
            const FullDisk disk;
            QVERIFY(!AtomicFile::write(file, "<new/>"));
            QCOMPARE(errno, EFBIG);
            RefusedWrites::keep(path("./title.xml"), "<new/>", EFBIG);
            QCOMPARE(m_calls.load(), 1);
            QVERIFY(RefusedWrites::retry().empty());
        }
        QCOMPARE(read("title.xml"), QByteArray("<old/>"));
        QCOMPARE(rootOf(file), std::string("new"));
        QCOMPARE(RefusedWrites::files().size(), std::size_t(1));
        QCOMPARE(RefusedWrites::files().front().error, EFBIG);

        QCOMPARE(RefusedWrites::retry().front().path, file);
        QCOMPARE(read("title.xml"), QByteArray("<new/>"));
        QVERIFY(RefusedWrites::isEmpty());
        QVERIFY(RefusedWrites::retry().empty());
    }

    void laterWriteReplacesWhatWasKept()
    {
        RefusedWrites::keep(path("a.xml"), "<first/>", ENOSPC);
        RefusedWrites::keep(path("a.xml"), "<second/>", ENOSPC);
        QCOMPARE(RefusedWrites::files().size(), std::size_t(1));
        QCOMPARE(rootOf(path("a.xml")), std::string("second"));
        QVERIFY(AtomicFile::write(path("a.xml"), "<third/>"));
        QVERIFY(RefusedWrites::isEmpty());
        QCOMPARE(rootOf(path("a.xml")), std::string("third"));
    }

    void picturesGoWithTheirTitle()
    {
        QVERIFY(AtomicFile::write(path("t.xml"), "<t/>"));
        RefusedWrites::keep(path("t_960.png"), "png", ENOSPC, path("t.xml"));
        QVERIFY(QFile::remove(name("t.xml")));
        QVERIFY(RefusedWrites::retry().empty());
        QVERIFY(RefusedWrites::isEmpty());
        QVERIFY(!QFile::exists(name("t_960.png")));
    }

    void folderIsRenamedBeforeAndAfter()
    {
        QVERIFY(QDir().mkdir(name("before")));
        QVERIFY(AtomicFile::write(path("before/t.xml"), "<t/>"));
        RefusedWrites::keep(path("before/t_960.png"), "one", ENOSPC, path("before/t.xml"));
        QVERIFY(QDir().rename(name("before"), name("after")));
        QVERIFY(RefusedWrites::retry().empty()); // there is no notice yet
        QVERIFY(!RefusedWrites::isEmpty());
        RefusedWrites::folderRenamed(path("before"), path("after/"));
        // A job that was begun under the old name ends.
        RefusedWrites::keep(path("before/t_1920.png"), "two", ENOENT, path("before/t.xml"));
        QCOMPARE(RefusedWrites::retry().size(), std::size_t(2));
        QCOMPARE(read("after/t_960.png"), QByteArray("one"));
        QCOMPARE(read("after/t_1920.png"), QByteArray("two"));
        // The old name is another folder's now.
        QVERIFY(QDir().mkdir(name("before")));
        RefusedWrites::keep(path("before/u.xml"), "<u/>", ENOSPC);
        QCOMPARE(RefusedWrites::retry().front().path, path("before/u.xml"));
    }

    void foldersAreForgotten()
    {
        QVERIFY(QDir().mkpath(name("a/b")));
        RefusedWrites::keep(path("a/b/t.xml"), "<t/>", ENOSPC);
        RefusedWrites::keep(path("ab.xml"), "<t/>", ENOSPC);
        RefusedWrites::keep(path("gone/t.xml"), "<t/>", ENOSPC);
        RefusedWrites::forgetFolder(path("a"));
        QCOMPARE(RefusedWrites::files().size(), std::size_t(2));
        const auto vanished = RefusedWrites::forgetVanished();
        QCOMPARE(vanished.size(), std::size_t(1));
        QCOMPARE(vanished.front().path, path("gone/t.xml"));
        QCOMPARE(RefusedWrites::files().front().path, path("ab.xml"));
    }

    void picturesAreKeptWithinLimits()
    {
        const std::string large(RefusedWrites::PICTURE_BYTES / 4 + 1, 'x');
        for (int i = 0; i < 5; ++i)
            RefusedWrites::keep(path("p" + std::to_string(i)), large, ENOSPC, path("t.xml"));
        QCOMPARE(RefusedWrites::files().size(), std::size_t(3));
        RefusedWrites::keep(path("p0"), large, ENOSPC, path("t.xml")); // in the place of itself
        QCOMPARE(RefusedWrites::files().size(), std::size_t(3));
        RefusedWrites::keep(path("title.xml"), "<t/>", ENOSPC); // always
        QCOMPARE(RefusedWrites::files().size(), std::size_t(4));
    }

    void manyThreads()
    {
        std::vector<std::thread> threads;
        for (int t = 0; t < 4; ++t) {
            threads.emplace_back([this, t] {
                for (int i = 0; i < 200; ++i) {
                    RefusedWrites::keep(path("f" + std::to_string(i % 7) + ".xml"), "<a/>", ENOSPC);
                    std::string bytes;
                    RefusedWrites::find(path("f1.xml"), bytes);
                    if (t == 0)
                        RefusedWrites::retry();
                    if (t == 1)
                        AtomicFile::write(path("f2.xml"), "<b/>");
                }
            });
        }
        for (std::thread& thread : threads)
            thread.join();
        RefusedWrites::retry();
        QVERIFY(RefusedWrites::isEmpty());
        for (int i = 0; i < 7; ++i)
            QVERIFY(!read("f" + QByteArray::number(i) + ".xml").isEmpty());
    }

    // In its place for every reader, but the disk does not take it: the version before is kept until it does.
    void failedSyncIsToldAndTriedAgain()
    {
        const std::string file = path("title.xml");
        QVERIFY(AtomicFile::write(file, "<old/>", AtomicFile::Durability::SyncNow));
        std::atomic<int> failures = 0;
        FileSyncQueue::setListener([&failures] { ++failures; });
        gSyncError = EIO;
        QVERIFY(AtomicFile::write(file, "<new/>"));
        QTRY_COMPARE(failures.load(), 1);
        QVERIFY(FileSyncQueue::hasFailed());
        QVERIFY(!FileSyncQueue::flush(std::chrono::seconds(30)));
        QCOMPARE(FileSyncQueue::unsynced(), std::vector<std::string>{file});
        QCOMPARE(read("title.xml"), QByteArray("<new/>"));
        QCOMPARE(files().size(), 2); // with the version that is on the disk
        FileSyncQueue::retryFailed();
        QTRY_COMPARE(failures.load(), 2);
        gSyncError = 0;
        FileSyncQueue::retryFailed();
        QVERIFY(FileSyncQueue::flush(std::chrono::seconds(30)));
        QVERIFY(!FileSyncQueue::hasFailed());
        QCOMPARE(files(), QStringList{"title.xml"});
        QCOMPARE(read("title.xml"), QByteArray("<new/>"));
        // Not every file system can sync.
        gSyncError = EINVAL;
        QVERIFY(AtomicFile::write(file, "<newer/>"));
        QVERIFY(FileSyncQueue::flush(std::chrono::seconds(30)));
        gSyncError = 0;
        QCOMPARE(failures.load(), 2);
        FileSyncQueue::setListener(nullptr);
    }

private:
    QString name(const QString& file) const { return m_folder->filePath(file); }
    std::string path(const std::string& file) const { return (m_folder->path().toStdString() + '/') + file; }
    QByteArray read(const QString& file) const
    {
        QFile opened(name(file));
        return opened.open(QIODevice::ReadOnly) ? opened.readAll() : QByteArray();
    }
    QStringList files() const
    {
        return QDir(m_folder->path()).entryList(QDir::Files | QDir::Hidden, QDir::Name);
    }
    static std::string rootOf(const std::string& file)
    {
        TiXmlDocument document;
        return XmlFile::load(file, document) && document.RootElement() ? document.RootElement()->ValueStr()
                                                                       : std::string();
    }

    std::unique_ptr<QTemporaryDir> m_folder;
    std::atomic<int> m_calls = 0;
};

QTEST_GUILESS_MAIN(tst_refusedwrites)
#include "tst_refusedwrites.moc"
