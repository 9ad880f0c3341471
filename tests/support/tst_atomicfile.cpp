// Saves that are whole or not there, and the sweep after those that were cut off.
#include "support/AtomicFile.h"
#include "support/FileSyncQueue.h"
#include "support/HiddenName.h"
#include "support/LeftoverSweep.h"

#include <QBuffer>
#include <QDir>
#include <QFile>
#include <QImage>
#include <QTemporaryDir>
#include <QtTest/QTest>
#include <csignal>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <thread>
#include <unistd.h>

namespace
{

using namespace std::chrono_literals;

const std::string GOOD_XML = "<?xml version=\"1.0\" ?>\n<manifest><meta-bg /></manifest>\n";

} // namespace

class tst_atomicfile : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init() { m_folder = std::make_unique<QTemporaryDir>(); }

    void cleanup()
    {
        QVERIFY(FileSyncQueue::flush(30s));
        m_folder.reset();
    }

    void writesAndReplaces_data()
    {
        QTest::addColumn<int>("durability");
        QTest::newRow("automatic") << int(AtomicFile::Durability::Automatic);
        QTest::newRow("now") << int(AtomicFile::Durability::SyncNow);
        QTest::newRow("later") << int(AtomicFile::Durability::SyncLater);
    }

    void writesAndReplaces()
    {
        QFETCH(int, durability);
        const auto how = static_cast<AtomicFile::Durability>(durability);
        const std::string file = path("標題 속보 é́ 😀.xml");
        QVERIFY(AtomicFile::write(file, "one", how));
        QCOMPARE(read(file), QByteArray("one"));
        QVERIFY(AtomicFile::write(file, "", how));
        QCOMPARE(read(file), QByteArray(""));
        QVERIFY(AtomicFile::write(file, std::string(1000000, 'x'), how));
        QCOMPARE(read(file).size(), 1000000);
        QVERIFY(FileSyncQueue::flush(30s));
        QCOMPARE(entries(), QStringList{QStringLiteral("標題 속보 é́ 😀.xml")});
    }

    void refusals()
    {
        QVERIFY(!AtomicFile::write("", "x"));
        QVERIFY(!AtomicFile::write(path("no/such/folder.xml"), "x"));
        QVERIFY(!AtomicFile::write(m_folder->path().toStdString(), "x"));
        QVERIFY(!AtomicFile::write("/dev/full", "x"));
        QVERIFY(AtomicFile::write("/dev/null", "x"));
        QVERIFY(!AtomicFile::copy(path("missing"), path("copy")));
        QVERIFY(!AtomicFile::copy(m_folder->path().toStdString(), path("copy")));
        QVERIFY(entries().isEmpty());
    }

    void keepsPermissionsAndFollowsLinks()
    {
        const std::string file = path("a.xml");
        QVERIFY(AtomicFile::write(file, "old"));
        QVERIFY(::chmod(file.c_str(), 0640) == 0);
        QVERIFY(::symlink(file.c_str(), path("link.xml").c_str()) == 0);
        QVERIFY(AtomicFile::write(path("link.xml"), "new"));
        QCOMPARE(read(file), QByteArray("new"));
        struct stat status = {};
        QVERIFY(::stat(file.c_str(), &status) == 0);
        QCOMPARE(int(status.st_mode & 07777), 0640);
        QVERIFY(::lstat(path("link.xml").c_str(), &status) == 0);
        QVERIFY(S_ISLNK(status.st_mode));
    }

    void nobodyElseMayWrite()
    {
        const mode_t before = ::umask(0);
        const std::string file = path("new.xml");
        QVERIFY(AtomicFile::write(file, "bytes"));
        put(path("open.xml"), "old");
        QVERIFY(::chmod(path("open.xml").c_str(), 0666) == 0);
        QVERIFY(AtomicFile::write(path("open.xml"), "new"));
        QVERIFY(AtomicFile::copy(file, path("copy.xml")));
        ::umask(before);
        for (const char* name : {"new.xml", "open.xml", "copy.xml"}) {
            struct stat status = {};
            QVERIFY(::stat(path(name).c_str(), &status) == 0);
            QCOMPARE(int(status.st_mode & 07777), 0644);
        }
    }

    void aNameThatFillsTheLimitIsSaved()
    {
        const std::string file = path(QString(240, QLatin1Char('n')) + ".xml");
        QVERIFY(AtomicFile::write(file, "old"));
        QVERIFY(AtomicFile::write(file, "new"));
        QCOMPARE(read(file), QByteArray("new"));
    }

    // A disk that takes no more bytes, shown by the limit on the size of files in a child process.
    void aFullDiskLeavesTheOldFile()
    {
        const std::string file = path("title.xml");
        QVERIFY(AtomicFile::write(file, "old"));
        QVERIFY(FileSyncQueue::flush(30s)); // its thread holds no lock while the process is doubled
        const pid_t child = ::fork();
        if (child == 0) {
            ::signal(SIGXFSZ, SIG_IGN);
            const rlimit limit = {1000, 1000};
            ::setrlimit(RLIMIT_FSIZE, &limit);
            const bool isSaved =
                AtomicFile::write(file, std::string(5000, 'x'), AtomicFile::Durability::SyncNow);
            ::_exit(isSaved ? 1 : 0);
        }
        int status = -1;
        QCOMPARE(::waitpid(child, &status, 0), child);
        QVERIFY(WIFEXITED(status) && WEXITSTATUS(status) == 0);
        QCOMPARE(read(file), QByteArray("old"));
        QVERIFY(FileSyncQueue::flush(30s));
        QCOMPARE(entries(), QStringList{"title.xml"});
    }

    void copiesWhole()
    {
        const std::string bytes(300000, 'c');
        QVERIFY(AtomicFile::write(path("from"), bytes));
        QVERIFY(AtomicFile::write(path("to"), "old"));
        QVERIFY(AtomicFile::copy(path("from"), path("to")));
        QCOMPARE(read(path("to")).toStdString(), bytes);
    }

    void readsUpToALimit()
    {
        QVERIFY(AtomicFile::write(path("f"), "12345"));
        std::string bytes;
        QVERIFY(AtomicFile::read(path("f"), 5, bytes));
        QCOMPARE(bytes, std::string("12345"));
        QVERIFY(!AtomicFile::read(path("f"), 4, bytes));
        QVERIFY(!AtomicFile::read(path("g"), 4, bytes));
        QVERIFY(!AtomicFile::read("/dev/zero", 4, bytes));
    }

    void hiddenNames()
    {
        const std::string kept = HiddenName::kept("/a/b%c.d.xml");
        QCOMPARE(HiddenName::folderOf(kept), std::string("/a"));
        const std::string name = kept.substr(3);
        QVERIFY(HiddenName::isHidden(name));
        QVERIFY(name.front() == '.' && name.find(".xml") == std::string::npos);
        QCOMPARE(HiddenName::keptTarget(name), std::string("b%c.d.xml"));
        QVERIFY(HiddenName::keptTarget("b.xml").empty());
        const std::string temporary = HiddenName::temporary("/a").substr(3);
        QVERIFY(HiddenName::isHidden(temporary) && HiddenName::isTemporary(temporary));
        QVERIFY(temporary != HiddenName::temporary("/a").substr(3));
        QVERIFY(HiddenName::hasLivingOwner(temporary));
        QVERIFY(!HiddenName::isHidden("20261121.xml") && !HiddenName::isHidden(".order.xml"));
        QVERIFY(HiddenName::kept("/a/" + std::string(250, 'n')).empty());
    }

    void manyThreadsSaveOneFile()
    {
        const std::string file = path("title.xml");
        std::vector<std::thread> threads;
        std::atomic<int> failures{0};
        for (int t = 0; t < 4; ++t) {
            threads.emplace_back([&, t] {
                const auto how = t % 2 ? AtomicFile::Durability::SyncLater : AtomicFile::Durability::SyncNow;
                for (int i = 0; i < 25; ++i)
                    failures += !AtomicFile::write(file, std::string(20000, static_cast<char>('a' + t)), how);
            });
        }
        for (std::thread& thread : threads)
            thread.join();
        QCOMPARE(failures.load(), 0);
        const QByteArray bytes = read(file);
        QCOMPARE(bytes, QByteArray(20000, bytes.at(0)));
        QVERIFY(FileSyncQueue::flush(30s));
        QCOMPARE(entries(), QStringList{"title.xml"});
    }

    void sweepRemovesWhatTheDeadLeft()
    {
        // Process 1 runs, but did not start at that moment; the others do not run or are not even numbers.
        for (const char* name :
             {".titler-new-1-1-0", ".titler-new-99999999-5-0", ".titler-new-", ".titler-new-x-y-z"})
            QVERIFY(AtomicFile::write(path(name), "half"));
        const std::string inUse = HiddenName::temporary(m_folder->path().toStdString());
        QVERIFY(AtomicFile::write(inUse, "half"));
        QVERIFY(AtomicFile::write(path("title.xml"), GOOD_XML));
        QVERIFY(FileSyncQueue::flush(30s));
        LeftoverSweep::sweep(m_folder->path().toStdString());
        QCOMPARE(entries(), QStringList({QString::fromStdString(inUse).section('/', -1), "title.xml"}));
    }

    void sweepRestoresWhatIsTorn_data()
    {
        QTest::addColumn<QString>("name");
        QTest::addColumn<QByteArray>("now");
        QTest::addColumn<QByteArray>("kept");
        QTest::addColumn<QByteArray>("expected");
        const QByteArray good = QByteArray::fromStdString(GOOD_XML);
        const QByteArray newer("<manifest version=\"2\"/>");
        QByteArray png = encodedPng(Qt::red);
        QByteArray newPng = encodedPng(Qt::blue);
        QByteArray tornPng = newPng;
        tornPng.replace(40, 4, QByteArray(4, '\0'));
        QTest::newRow("whole XML stays") << "a.xml" << newer << good << newer;
        QTest::newRow("torn XML") << "a.xml" << newer.left(10) << good << good;
        QTest::newRow("empty XML") << "a.xml" << QByteArray("") << good << good;
        QTest::newRow("zeros") << "a.xml" << QByteArray(100, '\0') << good << good;
        QTest::newRow("both torn") << "a.xml" << newer.left(10) << good.left(30) << newer.left(10);
        QTest::newRow("whole PNG stays") << "a.png" << newPng << png << newPng;
        QTest::newRow("PNG with a hole") << "a.png" << tornPng << png << png;
        QTest::newRow("cut PNG") << "a.png" << newPng.left(newPng.size() - 12) << png << png;
        QTest::newRow("other, empty") << "a.jpg" << QByteArray("") << png << png;
    }

    void sweepRestoresWhatIsTorn()
    {
        QFETCH(QString, name);
        QFETCH(QByteArray, now);
        QFETCH(QByteArray, kept);
        QFETCH(QByteArray, expected);
        put(path(name), now);
        put(HiddenName::kept(path(name)), kept);
        LeftoverSweep::sweep(m_folder->path().toStdString() + '/');
        QVERIFY(FileSyncQueue::flush(30s));
        QCOMPARE(read(path(name)), expected);
        QCOMPARE(entries(), QStringList{name});
    }

    void sweepDoesNotBringDeletedFilesBack()
    {
        put(HiddenName::kept(path("gone.xml")), QByteArray::fromStdString(GOOD_XML));
        LeftoverSweep::sweep(m_folder->path().toStdString());
        QVERIFY(FileSyncQueue::flush(30s));
        QVERIFY(entries().isEmpty());
    }

    void sweepLooksIntoTheFoldersBelow()
    {
        QVERIFY(QDir(m_folder->path()).mkdir("新闻"));
        put(path("新闻/.titler-new-99999999-5-0"), "half");
        put(HiddenName::kept(path("新闻/a.xml")), QByteArray::fromStdString(GOOD_XML));
        put(path("新闻/a.xml"), "<manif");
        LeftoverSweep::sweepWithChildren(m_folder->path().toStdString());
        QVERIFY(FileSyncQueue::flush(30s));
        QCOMPARE(read(path("新闻/a.xml")).toStdString(), GOOD_XML);
        QCOMPARE(QDir(m_folder->filePath("新闻"))
                     .entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot),
                 QStringList{"a.xml"});
    }

    // As after a cut power: what was on the disk stays at hand until what replaced it is there, too.
    void theLastSyncedVersionIsKept()
    {
        const std::string file = path("title.xml");
        put(file, QByteArray::fromStdString(GOOD_XML));
        const std::string kept = HiddenName::kept(file);
        const std::string temporary = HiddenName::temporary(m_folder->path().toStdString());
        put(temporary, "<manifest/>");
        QVERIFY(FileSyncQueue::publish(temporary, file));
        QCOMPARE(read(file), QByteArray("<manifest/>"));
        // The background may be done already; then nothing is pending and nothing kept.
        const QByteArray bytes = read(kept);
        QVERIFY(bytes.isEmpty() || bytes.toStdString() == GOOD_XML);
        QVERIFY(FileSyncQueue::flush(30s));
        QVERIFY(!QFile::exists(QString::fromStdString(kept)));
        QVERIFY(!FileSyncQueue::publish(path("missing"), file));
        QCOMPARE(read(file), QByteArray("<manifest/>"));
        QCOMPARE(entries(), QStringList{"title.xml"});
    }

    void aFileDeletedBeforeTheSyncLeavesNothing()
    {
        for (int i = 0; i < 50; ++i) {
            const std::string file = path(QString::number(i) + ".xml");
            put(file, "old");
            QVERIFY(AtomicFile::write(file, "new", AtomicFile::Durability::SyncLater));
            QVERIFY(QFile::remove(QString::fromStdString(file)));
        }
        QVERIFY(FileSyncQueue::flush(30s));
        QVERIFY(entries().isEmpty());
    }

private:
    std::string path(const QString& name) const { return m_folder->filePath(name).toStdString(); }

    QStringList entries() const
    {
        return QDir(m_folder->path())
            .entryList(QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot);
    }

    static QByteArray read(const std::string& file)
    {
        QFile in(QString::fromStdString(file));
        return in.open(QIODevice::ReadOnly) ? in.readAll() : QByteArray();
    }

    static void put(const std::string& file, const QByteArray& bytes)
    {
        QFile out(QString::fromStdString(file));
        if (!out.open(QIODevice::WriteOnly) || out.write(bytes) != bytes.size())
            qFatal("cannot write %s", file.c_str());
    }

    static QByteArray encodedPng(Qt::GlobalColor color)
    {
        QImage image(20, 20, QImage::Format_RGB32);
        image.fill(color);
        QByteArray bytes;
        QBuffer buffer(&bytes);
        buffer.open(QIODevice::WriteOnly);
        image.save(&buffer, "png");
        return bytes;
    }

    std::unique_ptr<QTemporaryDir> m_folder;
};

QTEST_GUILESS_MAIN(tst_atomicfile)
#include "tst_atomicfile.moc"
