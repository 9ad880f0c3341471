// The lock of a folder: who excludes whom, and that it leaves nothing behind.
#include "support/FolderLock.h"

#include <QDir>
#include <QTemporaryDir>
#include <QTest>
#include <csignal>
#include <memory>
#include <sys/wait.h>
#include <unistd.h>

class tst_folderlock : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void kindsThatExcludeEachOther_data();
    void kindsThatExcludeEachOther();
    void missingFolderFails();
    void takingItAgainKeepsIt();
    void anotherFolderReleasesTheFirst();
    void destructionReleases();
    void leavesNoFile();
    void followsARenamedFolder();
    void killedHolderReleases();

private:
    std::string path() const { return m_dir.path().toStdString(); }

    QTemporaryDir m_dir;
};

void tst_folderlock::kindsThatExcludeEachOther_data()
{
    QTest::addColumn<FolderLock::Kind>("first");
    QTest::addColumn<FolderLock::Kind>("second");
    QTest::addColumn<FolderLock::Result>("result");
    QTest::newRow("readers") << FolderLock::Kind::Shared << FolderLock::Kind::Shared
                             << FolderLock::Result::Taken;
    QTest::newRow("reader, writer") << FolderLock::Kind::Shared << FolderLock::Kind::Exclusive
                                    << FolderLock::Result::Busy;
    QTest::newRow("writer, reader") << FolderLock::Kind::Exclusive << FolderLock::Kind::Shared
                                    << FolderLock::Result::Busy;
    QTest::newRow("writers") << FolderLock::Kind::Exclusive << FolderLock::Kind::Exclusive
                             << FolderLock::Result::Busy;
}

void tst_folderlock::kindsThatExcludeEachOther()
{
    QFETCH(FolderLock::Kind, first);
    QFETCH(FolderLock::Kind, second);
    QFETCH(FolderLock::Result, result);
    FolderLock one;
    FolderLock other;
    QCOMPARE(one.take(path(), first), FolderLock::Result::Taken);
    QCOMPARE(other.take(path(), second), result);
    QCOMPARE(other.isHeld(), result == FolderLock::Result::Taken);
    one.release();
    QCOMPARE(other.take(path(), second), FolderLock::Result::Taken);
}

void tst_folderlock::missingFolderFails()
{
    FolderLock lock;
    QCOMPARE(lock.take(path() + "/gone", FolderLock::Kind::Shared), FolderLock::Result::Failed);
    QVERIFY(!lock.isHeld());
}

void tst_folderlock::takingItAgainKeepsIt()
{
    FolderLock lock;
    FolderLock other;
    QCOMPARE(lock.take(path(), FolderLock::Kind::Exclusive), FolderLock::Result::Taken);
    QCOMPARE(lock.take(path(), FolderLock::Kind::Exclusive), FolderLock::Result::Taken);
    QCOMPARE(other.take(path(), FolderLock::Kind::Shared), FolderLock::Result::Busy);
}

void tst_folderlock::anotherFolderReleasesTheFirst()
{
    QVERIFY(QDir(m_dir.path()).mkpath(QStringLiteral("other")));
    FolderLock lock;
    FolderLock second;
    QCOMPARE(lock.take(path(), FolderLock::Kind::Exclusive), FolderLock::Result::Taken);
    QCOMPARE(lock.take(path() + "/other", FolderLock::Kind::Exclusive), FolderLock::Result::Taken);
    QCOMPARE(second.take(path(), FolderLock::Kind::Exclusive), FolderLock::Result::Taken);
}

void tst_folderlock::destructionReleases()
{
    auto lock = std::make_unique<FolderLock>();
    FolderLock other;
    QCOMPARE(lock->take(path(), FolderLock::Kind::Exclusive), FolderLock::Result::Taken);
    lock.reset();
    QCOMPARE(other.take(path(), FolderLock::Kind::Exclusive), FolderLock::Result::Taken);
}

void tst_folderlock::leavesNoFile()
{
    const QTemporaryDir dir;
    FolderLock lock;
    QCOMPARE(lock.take(dir.path().toStdString(), FolderLock::Kind::Exclusive), FolderLock::Result::Taken);
    QVERIFY(QDir(dir.path()).isEmpty(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot));
}

void tst_folderlock::followsARenamedFolder()
{
    const QTemporaryDir dir;
    QVERIFY(QDir(dir.path()).mkpath(QStringLiteral("before")));
    FolderLock lock;
    FolderLock other;
    const std::string after = dir.path().toStdString() + "/after";
    QCOMPARE(lock.take(dir.path().toStdString() + "/before", FolderLock::Kind::Exclusive),
             FolderLock::Result::Taken);
    QVERIFY(QDir(dir.path()).rename(QStringLiteral("before"), QStringLiteral("after")));
    QCOMPARE(other.take(after, FolderLock::Kind::Shared), FolderLock::Result::Busy);
    QCOMPARE(lock.take(after, FolderLock::Kind::Exclusive), FolderLock::Result::Taken);
}

void tst_folderlock::killedHolderReleases()
{
    int ready[2];
    QCOMPARE(::pipe(ready), 0);
    const pid_t child = ::fork();
    if (child == 0) {
        FolderLock lock;
        const bool isTaken = lock.take(path(), FolderLock::Kind::Exclusive) == FolderLock::Result::Taken;
        const char answer = isTaken ? 'y' : 'n';
        if (::write(ready[1], &answer, 1) == 1)
            ::pause();
        ::_exit(0);
    }
    char answer = 0;
    QCOMPARE(::read(ready[0], &answer, 1), ssize_t(1));
    QCOMPARE(answer, 'y');
    FolderLock lock;
    QCOMPARE(lock.take(path(), FolderLock::Kind::Exclusive), FolderLock::Result::Busy);
    QCOMPARE(::kill(child, SIGKILL), 0);
    QCOMPARE(::waitpid(child, nullptr, 0), child);
    QCOMPARE(lock.take(path(), FolderLock::Kind::Exclusive), FolderLock::Result::Taken);
    ::close(ready[0]);
    ::close(ready[1]);
}

QTEST_APPLESS_MAIN(tst_folderlock)
#include "tst_folderlock.moc"
