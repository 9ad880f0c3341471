// What the title list keeps and tells when the disk takes no more bytes, and what it makes of folders whose
// order is missing or damaged.
#include "TitleListFixture.h"
#include "tests/support/FullDisk.h"
#include "tests/support/Patience.h"
#include "tests/support/SettledFolder.h"

#include "document/FolderOrder.h"
#include "support/RefusedWrites.h"
#include "tests/touchui/TouchDevice.h"

using Names = QStringList;

namespace
{

void write(const QString& path, const QByteArray& bytes)
{
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size())
        qFatal("cannot write");
}

QByteArray read(const QString& path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

} // namespace

class tst_archivelist_fulldisk : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void deleteThatDoesNotFitCostsNoTitle();
    void orderIsToldOnceAndWrittenWhenThereIsRoom();
    void titlesOfADamagedOrderAreListedByName_data();
    void titlesOfADamagedOrderAreListedByName();
    void folderOfADamagedOrderIsNotCleanedUp();
    void orderOfAFullDiskIsShownFromMemory();
    void wholeOrderKeepsItsMeaning();
    void titleThatCouldNotBeReadForAMomentStays();
    void refusedTitlesLeaveNothingAndAreTold();

private:
    QString abc(const QString& name)
    {
        const QString folder = m_fixture.makeFolder(name);
        LibraryFixture::fillFolder(folder, {"a", "b", "c"});
        return folder;
    }
    Reports waitForMessage()
    {
        Reports posted;
        const auto isPosted = [&] {
            posted += m_messages.take();
            return !posted.isEmpty();
        };
        if (!QTest::qWaitFor(isPosted, PATIENCE_MS))
            qWarning("no message");
        return posted;
    }
    static void verifyTitles(const QString& folder, const Names& stems)
    {
        for (const QString& stem : stems) {
            Archive title;
            QVERIFY2(ArchiveController().getOneArchive(folder + '/' + stem + ".xml", &title),
                     qPrintable(stem));
            QVERIFY2(QFile::exists(folder + '/' + stem + "_240.png"), qPrintable(stem));
        }
    }

    LibraryFixture m_fixture;
    FakeMessageBoxController m_messages;
    TouchDevice m_device;
    std::unique_ptr<TitleListFixture> m;
};

void tst_archivelist_fulldisk::init()
{
    m = std::make_unique<TitleListFixture>(m_device);
    m_messages.take();
}

void tst_archivelist_fulldisk::cleanup()
{
    m.reset();
    RefusedWrites::forgetFolder(m_fixture.titleRoot().toStdString());
}

// The delete and the Close find a full disk; with room again the folder is opened once more in this process,
// gets a title and is closed.
void tst_archivelist_fulldisk::deleteThatDoesNotFitCostsNoTitle()
{
    const QString folder = abc(QStringLiteral("all deleted"));
    m->open(folder);
    {
        const FullDisk disk;
        m->holdAndChoose(1, ArchiveAction::ACTION_DELETE);
        QCOMPARE(m->stems(), (Names{"a", "c"}));
        m->stack.clear();
        m->list->synchronizationFolderFile();
        m->list->cleanArchiveList();
    }
    verifyTitles(folder, {"a", "b", "c"});
    m->list->refreshArchiveList(folder);
    const auto temp = LibraryFixture::makeRecord(m_fixture.makeFolder(QStringLiteral("presets")),
                                                 QStringLiteral("p"), QStringLiteral("New"));
    m->list->createArchiveFromTemplate(temp.get());
    m->list->synchronizationFolderFile();
    verifyTitles(folder, {"a", "b", "c"});
    const Names order = LibraryFixture::order(folder);
    QVERIFY(order.contains("a") && order.contains("c"));
}

void tst_archivelist_fulldisk::orderIsToldOnceAndWrittenWhenThereIsRoom()
{
    const QString folder = abc(QStringLiteral("told"));
    m->open(folder);
    const QByteArray before = read(folder + "/.order.xml");
    {
        const FullDisk disk;
        m->holdAndChoose(1, ArchiveAction::ACTION_DELETE);
        m->stack.undo();
        m->holdAndChoose(2, ArchiveAction::ACTION_DELETE);
        m->list->synchronizationFolderFile();
        QCOMPARE(waitForMessage(), (Reports{{114, QStringLiteral("File")}}));
        QCOMPARE(read(folder + "/.order.xml"), before);
    }
    // The order is written again without any action of the operator.
    QTRY_VERIFY(!read(folder + "/.order.xml").contains("\"c.xml\""));
    QCOMPARE(LibraryFixture::order(folder), (Names{"a", "b"}));
    QCOMPARE(m_messages.take(), Reports());
    // The order could not be written for a while, so titles that it does not list are kept.
    m->list->synchronizationFolderFile();
    verifyTitles(folder, {"a", "b", "c"});
    // After the folder is opened again, the order is trusted again.
    m->stack.clear();
    m->list->refreshArchiveList(folder);
    m->list->synchronizationFolderFile();
    QVERIFY(!QFile::exists(folder + "/c.xml"));
    verifyTitles(folder, {"a", "b"});
    // The next full disk is reported again.
    {
        const FullDisk disk;
        m->holdAndChoose(1, ArchiveAction::ACTION_DELETE);
        QCOMPARE(waitForMessage(), (Reports{{114, QStringLiteral("File")}}));
    }
}

void tst_archivelist_fulldisk::titlesOfADamagedOrderAreListedByName_data()
{
    QTest::addColumn<bool>("exists");
    QTest::addColumn<QByteArray>("order");
    QTest::newRow("missing") << false << QByteArray();
    QTest::newRow("empty") << true << QByteArray();
    QTest::newRow("torn") << true
                          << QByteArray("<?xml version=\"1.0\" encoding=\"utf-8\" ?>\n<manifest "
                                        "type=\"order\" index-count=\"3\">\n    <index value=\"0\" fi");
    QTest::newRow("no XML") << true << QByteArray(200, '\0');
}

void tst_archivelist_fulldisk::titlesOfADamagedOrderAreListedByName()
{
    QFETCH(bool, exists);
    QFETCH(QByteArray, order);
    const QString folder = m_fixture.makeFolder(QStringLiteral("by name"));
    LibraryFixture::fillFolder(folder, {"c", "d", "a", "b"});
    write(folder + "/d.xml", "torn");
    if (exists)
        write(folder + "/.order.xml", order);
    else
        QVERIFY(QFile::remove(folder + "/.order.xml"));
    m->open(folder);
    QCOMPARE(m->stems(), (Names{"a", "b", "c"}));
    QCOMPARE(FolderOrder::stateOf(folder.toStdString()), FolderOrder::State::Whole); // written again
    QCOMPARE(LibraryFixture::order(folder), (Names{"a", "b", "c", "d"}));
}

void tst_archivelist_fulldisk::folderOfADamagedOrderIsNotCleanedUp()
{
    const QString folder = abc(QStringLiteral("not cleaned"));
    write(folder + "/.order.xml", "<manifest");
    m->open(folder);
    m->holdAndChoose(1, ArchiveAction::ACTION_DELETE);
    QCOMPARE(LibraryFixture::order(folder), (Names{"a", "c"}));
    m->list->synchronizationFolderFile();
    verifyTitles(folder, {"a", "b", "c"});
    QCOMPARE(LibraryFixture::order(folder), (Names{"a", "c"}));
    // No other code removes titles either while the order is damaged or missing.
    for (const bool isGone : {false, true}) {
        write(folder + "/.order.xml", "<manifest");
        if (isGone)
            QVERIFY(QFile::remove(folder + "/.order.xml"));
        ArchiveController().deleteUnusefulArchives(folder);
        verifyTitles(folder, {"a", "b", "c"});
    }
}

void tst_archivelist_fulldisk::orderOfAFullDiskIsShownFromMemory()
{
    const QString folder = abc(QStringLiteral("memory"));
    QVERIFY(QFile::remove(folder + "/.order.xml"));
    {
        const FullDisk disk;
        m->open(folder);
        QCOMPARE(m->stems(), (Names{"a", "b", "c"}));
        m->list->moveButtonClicked(true);
        m->carry(0, 65 + TitleListFixture::ROW);
        m->list->moveButtonClicked(false);
        m->stack.clear();
        m->list->synchronizationFolderFile();
        m->list->cleanArchiveList();
        m->list->refreshArchiveList(folder);
        QCOMPARE(m->stems(), (Names{"b", "a", "c"}));
        QVERIFY(!QFile::exists(folder + "/.order.xml"));
    }
    QTRY_VERIFY(QFile::exists(folder + "/.order.xml"));
    QCOMPARE(LibraryFixture::order(folder), (Names{"b", "a", "c"}));
}

void tst_archivelist_fulldisk::wholeOrderKeepsItsMeaning()
{
    const QString folder = abc(QStringLiteral("whole"));
    LibraryFixture::writeOrder(folder, {"c", "a"});
    m->open(folder);
    QCOMPARE(m->stems(), (Names{"c", "a"}));
    m->list->synchronizationFolderFile();
    QVERIFY(!QFile::exists(folder + "/b.xml"));
    verifyTitles(folder, {"a", "c"});
}

// A file that the disk refuses to give once must not be taken for one that was deleted.
void tst_archivelist_fulldisk::titleThatCouldNotBeReadForAMomentStays()
{
    const QString folder = abc(QStringLiteral("for a moment"));
    const QString title = folder + "/b.xml";
    QVERIFY(QFile::rename(title, folder + "/b.bak"));
    QVERIFY(QDir().mkdir(title)); // exists, but cannot be read
    m->open(folder);
    QCOMPARE(m->stems(), (Names{"a", "c"}));
    QVERIFY(QDir().rmdir(title));
    QVERIFY(QFile::rename(folder + "/b.bak", title));
    m->holdAndChoose(0, ArchiveAction::ACTION_COPY);
    m->holdAndChoose(0, ArchiveAction::ACTION_PASTE);
    const QString pasted = m->stems().at(1);
    m->list->synchronizationFolderFile();
    verifyTitles(folder, {"a", "b", "c"});
    m->stack.clear();
    m->list->refreshArchiveList(folder);
    QCOMPARE(m->stems(), (Names{"a", "b", pasted, "c"}));
}

void tst_archivelist_fulldisk::refusedTitlesLeaveNothingAndAreTold()
{
    const QString folder = abc(QStringLiteral("refused"));
    m->open(folder);
    m->holdAndChoose(1, ArchiveAction::ACTION_COPY);
    const Names before = settledEntries(folder);
    const QString templates = QDir::cleanPath(m_fixture.titleRoot() + "/../usertemplates");
    const FullDisk disk;
    m_messages.take();
    m->holdAndChoose(0, ArchiveAction::ACTION_PASTE);
    QCOMPARE(m_messages.take(), (Reports{{116, QString()}}));
    const auto temp = LibraryFixture::makeRecord(folder, QStringLiteral("a"), QStringLiteral("New"));
    m->list->createArchiveFromTemplate(temp.get());
    QCOMPARE(m_messages.take(), (Reports{{114, QStringLiteral("File")}}));
    m->holdAndChoose(0, ArchiveAction::ACTION_ADD_USER);
    QCOMPARE(m_messages.take(), (Reports{{197, QStringLiteral("UserTemplate_001")}}));
    QCOMPARE(m->stems(), (Names{"a", "b", "c"}));
    QCOMPARE(settledEntries(folder), before);
    QVERIFY(!QFileInfo::exists(templates + "/UserTemplate_001"));
}

QTEST_MAIN(tst_archivelist_fulldisk)
#include "tst_archivelist_fulldisk.moc"
