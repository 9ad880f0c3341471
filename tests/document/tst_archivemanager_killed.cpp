// A process that is killed while it saves leaves whole files; readers beside it see only whole files; the
// next start finds no trace.
#include "document/Archive.h"
#include "document/ArchiveManager.h"
#include "document/PngWriter.h"
#include "document/TText.h"
#include "support/FileSyncQueue.h"
#include "support/LeftoverSweep.h"
#include "tests/support/Patience.h"
#include "tests/support/RandomSeed.h"

#include <QCoreApplication>
#include <QDir>
#include <QElapsedTimer>
#include <QFile>
#include <QImage>
#include <QProcess>
#include <QRandomGenerator>
#include <QTemporaryDir>
#include <QtTest/QTest>
#include <thread>

namespace
{

// Saves versions of one title and its picture until it is killed: on the main thread, on a worker, or on
// both.
int saveForEver(const QString& folder, const QString& mode)
{
    const auto work = [folder] {
        for (int version = 0;; ++version) {
            Archive archive;
            archive.setPath((folder + "/title.xml").toStdString());
            archive.setVersion(std::to_string(version));
            auto* text = new TText;
            std::vector<TextStyle*> items;
            for (int i = 0; i < 20 + version % 200; ++i)
                items.push_back(new TextStyle);
            text->setTextItems(items);
            archive.setText({text});
            ArchiveManager::getInstance()->saveArchive(&archive);
            QImage image(64 + version % 64, 64, QImage::Format_RGB32);
            image.fill(QRandomGenerator::global()->generate() | 0xFF000000u);
            PngWriter::save(image, folder + "/title_1920.png");
        }
    };
    std::thread worker;
    if (mode != "main")
        worker = std::thread(work);
    if (mode != "worker")
        work();
    worker.join();
    return 0;
}

} // namespace

class tst_archivemanager_killed : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void killedAtAnyMoment_data()
    {
        QTest::addColumn<QString>("mode");
        for (const char* mode : {"main", "worker", "both"})
            QTest::newRow(mode) << mode;
    }

    void killedAtAnyMoment()
    {
        QFETCH(QString, mode);
        QTemporaryDir folder;
        const RandomSeed seed(QRandomGenerator::global()->generate());
        QRandomGenerator random(seed);
        int reads = 0;
        for (int round = 0; round < 15; ++round) {
            QProcess child;
            child.start(QCoreApplication::applicationFilePath(), {"--save-for-ever", folder.path(), mode});
            QVERIFY(child.waitForStarted());
            QTRY_VERIFY(QFile::exists(folder.filePath("title_1920.png")));
            QElapsedTimer timer;
            timer.start();
            const int lifetime = 5 + random.bounded(60);
            while (timer.elapsed() < lifetime) {
                ++reads;
                QVERIFY2(filesAreWhole(folder.path()), qPrintable(mode));
            }
            child.kill();
            QVERIFY(child.waitForFinished());
            QVERIFY(filesAreWhole(folder.path()));
            LeftoverSweep::sweep(folder.path().toStdString());
            QVERIFY(FileSyncQueue::flush(std::chrono::seconds(30)));
            QCOMPARE(QDir(folder.path()).entryList(QDir::Files | QDir::Hidden, QDir::Name),
                     QStringList({"title.xml", "title_1920.png"}));
            QVERIFY(filesAreWhole(folder.path()));
        }
        QVERIFY(reads > 15);
    }

private:
    static bool endsWithLastChunk(const QString& path)
    {
        QFile file(path);
        return file.open(QIODevice::ReadOnly) && file.readAll().endsWith("IEND\xAE\x42\x60\x82");
    }

    static bool filesAreWhole(const QString& folder)
    {
        Archive archive;
        const int isRead =
            ArchiveManager::getInstance()->loadArchive((folder + "/title.xml").toStdString(), &archive);
        if (isRead != 1 || archive.getText().size() != 1)
            return false;
        const auto items = std::size_t(20 + std::stoi(archive.getVersion()) % 200);
        return archive.getText()[0]->getTextItems().size() == items &&
               !QImage(folder + "/title_1920.png").isNull() && endsWithLastChunk(folder + "/title_1920.png");
    }
};

int main(int argc, char** argv)
{
    QCoreApplication application(argc, argv);
    const QStringList arguments = QCoreApplication::arguments();
    if (arguments.size() == 4 && arguments[1] == "--save-for-ever")
        return saveForEver(arguments[2], arguments[3]);
    tst_archivemanager_killed test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_archivemanager_killed.moc"
