// The thread that writes a title's pictures: what it writes, when it counts as finished, what it drops.
#include "LibraryFixture.h"
#include "tests/support/Patience.h"
#include "tests/support/SettledFolder.h"

#include "library/PictureThread.h"

#include <QElapsedTimer>
#include <QSemaphore>
#include <QTest>

namespace
{

QList<QImage> pictures(const QColor& colour)
{
    QImage big(1920, 1080, QImage::Format_ARGB32_Premultiplied);
    big.fill(colour);
    return {big, big.scaled(960, 540)};
}

// Releases the semaphore when the last copy of the picture is destroyed.
QImage watchedPicture(QSemaphore& gone)
{
    static uchar pixels[16 * 16 * 4] = {};
    return QImage(
        pixels, 16, 16, QImage::Format_ARGB32_Premultiplied,
        [](void* info) { static_cast<QSemaphore*>(info)->release(); }, &gone);
}

} // namespace

class tst_picturethread : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void finishedStates();
    void waitingEndsWithTheJob();
    void refusedJobs();
    void filesAndSizes();
    void transparentParts();
    void jobQueuedAtTheEndIsNeverWritten();
    void jobsAreWrittenInOrder();
    void unwritableFolderIsPassedOver();
    void namesThatLeaveTheFolderAreNotWritten();
    void namesOfTitlesAreNoPictures_data();
    void namesOfTitlesAreNoPictures();
    void deletedTitleKeepsNoPictures_data();
    void deletedTitleKeepsNoPictures();

private:
    LibraryFixture m_fixture;
};

void tst_picturethread::finishedStates()
{
    FakeTitleChangeReporter reporter(FakeTitleChangeReporter::Pictures::Hold);
    const auto archive = LibraryFixture::makeRecord(m_fixture.makeFolder(QStringLiteral("states")),
                                                    QStringLiteral("t"), QString());
    PictureThread thread;
    QVERIFY(thread.isThreadWaiting());
    thread.addArchive(archive.get(), pictures(Qt::red));
    QVERIFY(!thread.isThreadWaiting()); // from the moment it is queued
    QVERIFY(reporter.reached.tryAcquire(1, 20000));
    QVERIFY(!thread.isThreadWaiting());
    reporter.goOn.release();
    QTRY_VERIFY(thread.isThreadWaiting());
}

void tst_picturethread::waitingEndsWithTheJob()
{
    FakeTitleChangeReporter reporter(FakeTitleChangeReporter::Pictures::Hold);
    const auto archive = LibraryFixture::makeRecord(m_fixture.makeFolder(QStringLiteral("waiting")),
                                                    QStringLiteral("t"), QString());
    PictureThread thread;
    thread.waitForProgress(PATIENCE_MS); // comes back at once, since there is nothing to wait for
    thread.addArchive(archive.get(), pictures(Qt::red));
    QVERIFY(reporter.reached.tryAcquire(1, 20000));
    thread.waitForProgress(10);
    QVERIFY(!thread.isThreadWaiting());
    reporter.goOn.release();
    QElapsedTimer timer;
    timer.start();
    thread.waitForProgress(PATIENCE_MS);
    QVERIFY(thread.isThreadWaiting());
    QVERIFY(!timer.hasExpired(PATIENCE_MS));
}

void tst_picturethread::refusedJobs()
{
    const auto archive = LibraryFixture::makeRecord(m_fixture.makeFolder(QStringLiteral("refused")),
                                                    QStringLiteral("t"), QString());
    PictureThread thread;
    thread.addArchive(nullptr, pictures(Qt::red));
    QVERIFY(thread.isThreadWaiting());
    thread.addArchive(archive.get(), {});
    thread.addArchive(archive.get(), {pictures(Qt::red).front()});
    QVERIFY(thread.isThreadWaiting());
}

void tst_picturethread::filesAndSizes()
{
    FakeTitleChangeReporter reports;
    const QString folder = m_fixture.makeFolder(QStringLiteral("sizes"));
    const auto archive = LibraryFixture::makeRecord(folder, QStringLiteral("t"), QString());
    PictureThread thread;
    thread.addArchive(archive.get(), pictures(QColor(10, 120, 230)));
    QTRY_VERIFY(thread.isThreadWaiting());

    QCOMPARE(settledEntries(folder),
             (QStringList{QStringLiteral("t_1920.png"), QStringLiteral("t_240.png"),
                          QStringLiteral("t_240S.png"), QStringLiteral("t_960.png")}));
    QCOMPARE(QImage(folder + QStringLiteral("/t_1920.png")).size(), QSize(1920, 1080));
    QCOMPARE(QImage(folder + QStringLiteral("/t_960.png")).size(), QSize(960, 540));
    QCOMPARE(QImage(folder + QStringLiteral("/t_240.png")).size(), QSize(240, 135));
    QCOMPARE(QImage(folder + QStringLiteral("/t_240S.png")).size(), QSize(240, 135));
    for (const char* name : {"/t_1920.png", "/t_960.png", "/t_240S.png"}) {
        const QImage image(folder + QLatin1String(name));
        QCOMPARE(image.pixelColor(image.width() / 2, image.height() / 2), QColor(10, 120, 230));
    }
    QCOMPARE(reports.take(), (Reports{{1, QStringLiteral("t")}}));
}

void tst_picturethread::transparentParts()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("transparent"));
    const auto archive = LibraryFixture::makeRecord(folder, QStringLiteral("t"), QString());
    PictureThread thread;
    thread.addArchive(archive.get(), pictures(Qt::transparent));
    QTRY_VERIFY(thread.isThreadWaiting());
    QCOMPARE(QImage(folder + QStringLiteral("/t_1920.png")).pixelColor(3, 3).alpha(), 0);
    QCOMPARE(QImage(folder + QStringLiteral("/t_960.png")).pixelColor(3, 3).alpha(), 0);
    const QImage black(folder + QStringLiteral("/t_240S.png"));
    QVERIFY(!black.hasAlphaChannel());
    QCOMPARE(black.pixelColor(3, 3), QColor(Qt::black));
    const QImage small = QImage(folder + QStringLiteral("/t_240.png")).convertToFormat(QImage::Format_RGB32);
    QCOMPARE(small, LibraryFixture::checker());
}

void tst_picturethread::jobQueuedAtTheEndIsNeverWritten()
{
    FakeTitleChangeReporter reporter(FakeTitleChangeReporter::Pictures::Hold);
    const QString folder = m_fixture.makeFolder(QStringLiteral("dropped"));
    const auto first = LibraryFixture::makeRecord(folder, QStringLiteral("first"), QString());
    const auto second = LibraryFixture::makeRecord(folder, QStringLiteral("second"), QString());
    auto thread = std::make_unique<PictureThread>();
    thread->addArchive(first.get(), pictures(Qt::red));
    QVERIFY(reporter.reached.tryAcquire(1, 20000));
    QSemaphore dropped;
    thread->addArchive(second.get(), {watchedPicture(dropped), pictures(Qt::red).back()});

    std::unique_ptr<QThread> ending(QThread::create([&] { thread.reset(); }));
    ending->start();
    // The destructor drops the second job before it waits for the first one.
    QVERIFY(dropped.tryAcquire(1, 20000));
    reporter.goOn.release();
    QVERIFY(ending->wait(20000));
    QVERIFY(QFile::exists(folder + QStringLiteral("/first_1920.png")));
    QVERIFY(!QFile::exists(folder + QStringLiteral("/second_1920.png")));
    QCOMPARE(reporter.reached.available(), 0);
}

void tst_picturethread::jobsAreWrittenInOrder()
{
    FakeTitleChangeReporter reports;
    const QString folder = m_fixture.makeFolder(QStringLiteral("in order"));
    PictureThread thread;
    Reports expected;
    for (int i = 0; i < 4; ++i) {
        const QString stem = QStringLiteral("t%1").arg(i);
        const auto archive = LibraryFixture::makeRecord(folder, stem, QString());
        thread.addArchive(archive.get(), pictures(Qt::red));
        expected.append({1, stem});
    }
    QTRY_VERIFY(thread.isThreadWaiting());
    QCOMPARE(reports.take(), expected);
}

void tst_picturethread::unwritableFolderIsPassedOver()
{
    FakeTitleChangeReporter reports;
    const auto archive =
        LibraryFixture::makeRecord(QStringLiteral("/nonexistent/folder"), QStringLiteral("t"), QString());
    PictureThread thread;
    thread.addArchive(archive.get(), pictures(Qt::red));
    QTRY_VERIFY(thread.isThreadWaiting());
    QCOMPARE(reports.take(), (Reports{{1, QStringLiteral("t")}}));
}

void tst_picturethread::namesThatLeaveTheFolderAreNotWritten()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("names"));
    const auto archive = LibraryFixture::makeRecord(folder, QStringLiteral("t"), QString());
    archive->setThumbnailBig("../stray.png");
    archive->setThumbnailBlack("");
    PictureThread thread;
    thread.addArchive(archive.get(), pictures(Qt::red));
    QTRY_VERIFY(thread.isThreadWaiting());
    QVERIFY(!QFile::exists(m_fixture.titleRoot() + QStringLiteral("/stray.png")));
    QCOMPARE(settledEntries(folder), (QStringList{QStringLiteral("t_240.png"), QStringLiteral("t_960.png")}));
}

void tst_picturethread::namesOfTitlesAreNoPictures_data()
{
    QTest::addColumn<bool>("isDeletedMeanwhile");
    QTest::newRow("written") << false;
    QTest::newRow("removed with the title") << true;
}

void tst_picturethread::namesOfTitlesAreNoPictures()
{
    QFETCH(bool, isDeletedMeanwhile);
    FakeTitleChangeReporter reporter(FakeTitleChangeReporter::Pictures::Hold);
    const QString folder = m_fixture.makeFolder(QStringLiteral("titles"));
    LibraryFixture::fillFolder(folder, {QStringLiteral("t"), QStringLiteral("other")});
    const auto archive = LibraryFixture::makeRecord(folder, QStringLiteral("t"), QString());
    archive->setThumbnailBig("other.xml");
    archive->setThumbnailMiddle(".order.xml");
    archive->setThumbnailBlack("other.XML");
    PictureThread thread;
    thread.addArchive(archive.get(), pictures(Qt::red));
    QVERIFY(reporter.reached.tryAcquire(1, 20000));
    if (isDeletedMeanwhile)
        QVERIFY(QFile::remove(folder + QStringLiteral("/t.xml")));
    reporter.goOn.release();
    QTRY_VERIFY(thread.isThreadWaiting());
    QVERIFY(!QFile::exists(folder + QStringLiteral("/other.XML")));
    QCOMPARE(LibraryFixture::order(folder), (QStringList{QStringLiteral("t"), QStringLiteral("other")}));
    Archive other;
    QVERIFY(ArchiveController().getOneArchive(folder + QStringLiteral("/other.xml"), &other));
    QCOMPARE(other.text().size(), std::size_t(1));
    QCOMPARE(QFile::exists(folder + QStringLiteral("/t_240.png")), !isDeletedMeanwhile);
}

void tst_picturethread::deletedTitleKeepsNoPictures_data()
{
    QTest::addColumn<bool>("isBeingWritten");
    QTest::newRow("waiting") << false;
    QTest::newRow("being written") << true;
}

void tst_picturethread::deletedTitleKeepsNoPictures()
{
    QFETCH(bool, isBeingWritten);
    FakeTitleChangeReporter reporter(FakeTitleChangeReporter::Pictures::Hold);
    const QString folder = m_fixture.makeFolder(QStringLiteral("deleted"));
    LibraryFixture::fillFolder(folder, {QStringLiteral("gone"), QStringLiteral("kept")});
    const auto gone = LibraryFixture::makeRecord(folder, QStringLiteral("gone"), QString());
    const auto kept = LibraryFixture::makeRecord(folder, QStringLiteral("kept"), QString());
    PictureThread thread;
    thread.addArchive(isBeingWritten ? gone.get() : kept.get(), pictures(Qt::red));
    thread.addArchive(isBeingWritten ? kept.get() : gone.get(), pictures(Qt::red));
    QVERIFY(reporter.reached.tryAcquire(1, 20000));
    // Removes the files as the clean-up does; pictures written later would belong to no title.
    QVERIFY(QFile::remove(folder + QStringLiteral("/gone.xml")));
    if (!isBeingWritten)
        QVERIFY(QFile::remove(folder + QStringLiteral("/gone_240.png")));
    reporter.goOn.release(2);
    QTRY_VERIFY(thread.isThreadWaiting());
    QCOMPARE(QDir(folder).entryList(QDir::Files, QDir::Name),
             (QStringList{QStringLiteral("kept.xml"), QStringLiteral("kept_1920.png"),
                          QStringLiteral("kept_240.png"), QStringLiteral("kept_240S.png"),
                          QStringLiteral("kept_960.png")}));
}

QTEST_GUILESS_MAIN(tst_picturethread)
#include "tst_picturethread.moc"
