// The threads that load a folder, write title files and open a picker.
#include "LibraryFixture.h"
#include "tests/support/Patience.h"

#include "library/ArchiveInitThread.h"
#include "library/ArchiveList.h"
#include "library/SceneThread.h"
#include "library/UndoThread.h"

#include <QLabel>
#include <QSignalSpy>
#include <QTest>

class tst_archiveinitthread : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void loaderHandsItsTitlesOver();
    void loaderKeepsWhatNobodyTakes();
    void loaderOfAMissingFolderGivesNothing();
    void cancelledLoaderAnnouncesNothing();
    void sceneThreadWritesCopiesInOrder();
    void sceneThreadPassesOverTitlesWithoutAPath();
    void undoThreadOpensThePickerOnce();

private:
    LibraryFixture m_fixture;
};

void tst_archiveinitthread::loaderHandsItsTitlesOver()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("loader"));
    LibraryFixture::fillFolder(folder, {QStringLiteral("b"), QStringLiteral("a")});
    QList<Archive*> taken;
    QThread* takenIn = nullptr;
    {
        ArchiveInitThread loader(folder);
        connect(
            &loader, &ArchiveInitThread::threadGetArchiveListFinished, this,
            [&](QList<Archive*> archives) {
                taken = archives;
                takenIn = QThread::currentThread();
            },
            Qt::BlockingQueuedConnection);
        loader.start(QThread::InheritPriority);
        QTRY_VERIFY(loader.isFinished());
    }
    QCOMPARE(takenIn, QThread::currentThread());
    QCOMPARE(taken.size(), 2);
    QCOMPARE(taken.front()->getName(), std::string("b"));
    QCOMPARE(taken.back()->getOrder(), std::string("2"));
    qDeleteAll(taken);
}

void tst_archiveinitthread::loaderKeepsWhatNobodyTakes()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("untaken"));
    LibraryFixture::fillFolder(folder, {QStringLiteral("a")});
    ArchiveInitThread loader(folder);
    loader.start(QThread::InheritPriority);
    QVERIFY(loader.wait(20000)); // the leak checker of the asan build sees the rest
}

void tst_archiveinitthread::loaderOfAMissingFolderGivesNothing()
{
    ArchiveInitThread loader(QStringLiteral("/nonexistent"));
    QSignalSpy spy(&loader, &ArchiveInitThread::threadGetArchiveListFinished);
    loader.start();
    QTRY_COMPARE(spy.count(), 1);
    QVERIFY(spy.front().front().value<QList<Archive*>>().isEmpty());
}

void tst_archiveinitthread::cancelledLoaderAnnouncesNothing()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("cancelled"));
    LibraryFixture::fillFolder(folder, {QStringLiteral("a")});
    ArchiveInitThread loader(folder);
    QSignalSpy spy(&loader, &ArchiveInitThread::threadGetArchiveListFinished);
    loader.cancel();
    loader.start();
    QVERIFY(loader.wait(20000));
    QCOMPARE(spy.count(), 0);
}

void tst_archiveinitthread::sceneThreadWritesCopiesInOrder()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("scene thread"));
    auto archive = LibraryFixture::makeRecord(folder, QStringLiteral("t"), QStringLiteral("first"));
    SceneThread thread;
    thread.addArchive(nullptr);
    thread.addArchive(archive.get());
    archive->text().front()->setText("second");
    thread.addArchive(archive.get());
    archive->text().front()->setText("never queued");

    ArchiveController controller;
    const QString path = QString::fromStdString(archive->getPath());
    const auto textOnDisk = [&] {
        Archive loaded;
        return controller.getOneArchive(path, &loaded) && !loaded.text().empty()
                   ? QString::fromStdString(loaded.text().front()->getText())
                   : QString();
    };
    QTRY_COMPARE(textOnDisk(), QStringLiteral("second"));
}

void tst_archiveinitthread::sceneThreadPassesOverTitlesWithoutAPath()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("no path"));
    const Archive blank;
    const auto archive = LibraryFixture::makeRecord(folder, QStringLiteral("t"), QStringLiteral("text"));
    SceneThread thread;
    thread.addArchive(&blank);
    thread.addArchive(archive.get());
    QTRY_VERIFY(QFile::exists(QString::fromStdString(archive->getPath())));
}

void tst_archiveinitthread::undoThreadOpensThePickerOnce()
{
    QLabel label;
    ArchiveList list(&label, false);
    QSignalSpy spy(&list, &ArchiveList::startTemplatePicker);
    QThread* pickerIn = nullptr;
    connect(&list, &ArchiveList::startTemplatePicker, this, [&] { pickerIn = QThread::currentThread(); });
    {
        UndoThread thread(&list, nullptr);
        thread.start(QThread::InheritPriority);
    }
    QTRY_COMPARE(pickerIn, QThread::currentThread());
    QCOMPARE(spy.count(), 1);
}

QTEST_MAIN(tst_archiveinitthread)
#include "tst_archiveinitthread.moc"
