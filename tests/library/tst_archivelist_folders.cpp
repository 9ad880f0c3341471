// Folders as other programs, full disks and torn writes leave them: what the title list makes of them.
#include "ItemLooks.h"
#include "TitleListFixture.h"
#include "support/FolderLock.h"
#include "tests/support/FullDisk.h"
#include "tests/touchui/TouchDevice.h"

#include "library/CheckeredPicture.h"

#include <QFileDevice>
#include <QSet>
#include <QSignalSpy>
#include <functional>
#include <unistd.h>

using Names = QStringList;
using Damage = std::function<void(const QString& folder)>;

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

void cutInHalf(const QString& path)
{
    const QByteArray bytes = read(path);
    write(path, bytes.left(bytes.size() / 2));
}

// Makes the folder unreadable, also for the superuser, whom the mode of a folder does not stop.
class Unreadable
{
public:
    explicit Unreadable(const QString& folder) : m_folder(folder)
    {
        QFile::setPermissions(m_folder, QFileDevice::Permissions());
        m_isRoot = ::geteuid() == 0;
        if (m_isRoot && ::seteuid(NOBODY) != 0)
            qFatal("cannot leave the superuser");
    }
    ~Unreadable()
    {
        if (m_isRoot && ::seteuid(0) != 0)
            qFatal("cannot come back");
        QFile::setPermissions(m_folder, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    }
    Q_DISABLE_COPY_MOVE(Unreadable)

private:
    static constexpr uid_t NOBODY = 65534;
    QString m_folder;
    bool m_isRoot = false;
};

} // namespace

class tst_archivelist_folders : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void orderFiles_data();
    void orderFiles();
    void folderWithoutAnOrderGetsOneAtTheStart();
    void orderThatDoesNotFitCostsNoTitle();
    void unreadableOrderCostsNoTitle_data();
    void unreadableOrderCostsNoTitle();
    void skippedTitlesKeepTheirPlaceInTheOrder();
    void unreadableFolder();
    void unwritableFolderMakesNoTitle();
    void readOnlyTemplateFolderTakesNoTemplate();
    void badPictures_data();
    void badPictures();
    void folderGoneWhileOpen();
    void titleGoneWhileOpen();
    void titlesOfOneMoment();
    void openFolderIsLocked();
    void folderLockedByAnotherProgramOpens();

private:
    QString abc(const QString& name)
    {
        const QString folder = m_fixture.makeFolder(name);
        LibraryFixture::fillFolder(folder, {"a", "b", "c"});
        return folder;
    }

    LibraryFixture m_fixture;
    FakeEditContext m_context;
    FakeTitlerFolderReporter m_folders;
    FakeTitleChangeReporter m_reports;
    FakeMessageBoxController m_messages;
    TouchDevice m_device;
    std::unique_ptr<TitleListFixture> m;
};

void tst_archivelist_folders::init()
{
    m = std::make_unique<TitleListFixture>(m_device);
}

void tst_archivelist_folders::cleanup()
{
    m.reset();
}

void tst_archivelist_folders::orderFiles_data()
{
    QTest::addColumn<Damage>("damage");
    QTest::addColumn<Names>("shown");
    const auto row = [](const char* name, const Damage& damage, const Names& shown) {
        QTest::newRow(name) << damage << shown;
    };
    row("as it should be", [](const QString&) {}, {"a", "b", "c"});
    row("another order",
        [](const QString& folder) {
            LibraryFixture::writeOrder(folder, {"c", "a", "b"});
        },
        {"c", "a", "b"});
    row("a title that is missing", [](const QString& folder) { QFile::remove(folder + "/b.xml"); },
        {"a", "c"});
    row("a torn title", [](const QString& folder) { cutInHalf(folder + "/b.xml"); }, {"a", "c"});
    row("an empty title", [](const QString& folder) { write(folder + "/b.xml", {}); }, {"a", "c"});
    row("a folder for a title",
        [](const QString& folder) {
            QFile::remove(folder + "/b.xml");
            QDir(folder).mkdir("b.xml");
        },
        {"a", "c"});
    row("a link to itself",
        [](const QString& folder) {
            QFile::remove(folder + "/b.xml");
            QFile::link("b.xml", folder + "/b.xml");
        },
        {"a", "c"});
    row("a title that is not named",
        [](const QString& folder) {
            LibraryFixture::writeOrder(folder, {"a", "c"});
        },
        {"a", "c"});
    // Without an order that can be read all titles are shown, by name.
    const Names byName{"a", "b", "c"};
    row(
        "no order file",
        [](const QString& folder) {
            LibraryFixture::writeOrder(folder, {"c", "a"});
            QFile::remove(folder + "/.order.xml");
        },
        byName);
    row(
        "an empty order file", [](const QString& folder) { write(folder + "/.order.xml", {}); }, byName);
    row("an order without rows", [](const QString& folder) { LibraryFixture::writeOrder(folder, {}); }, {});
    row(
        "a torn order file", [](const QString& folder) { cutInHalf(folder + "/.order.xml"); }, byName);
    row(
        "noise for an order",
        [](const QString& folder) { write(folder + "/.order.xml", QByteArray(4000, '\x9c')); }, byName);
    row("all titles torn",
        [](const QString& folder) {
            for (const char* name : {"/a.xml", "/b.xml", "/c.xml"})
                cutInHalf(folder + name);
        },
        {});
}

void tst_archivelist_folders::orderFiles()
{
    QFETCH(Damage, damage);
    QFETCH(Names, shown);
    const QString folder = abc(QStringLiteral("order files"));
    damage(folder);
    QSignalSpy picker(m->list, &ArchiveList::startTemplatePicker);
    m->list->refreshArchiveList(folder);
    QCOMPARE(m->stems(), shown);
    QCOMPARE(picker.size(), shown.isEmpty() ? 1 : 0); // an empty folder asks for a template
    QCOMPARE(m->takeCanvas(), Names{shown.isEmpty() ? "null" : shown.constFirst()});
    QCOMPARE(m->selected(), shown.isEmpty() ? -1 : 0);
}

void tst_archivelist_folders::folderWithoutAnOrderGetsOneAtTheStart()
{
    const QString folder = abc(QStringLiteral("orderless"));
    QVERIFY(QFile::remove(folder + "/.order.xml"));
    m = nullptr;
    m = std::make_unique<TitleListFixture>(m_device);
    m->open(folder);
    Names stems = m->stems();
    stems.sort();
    QCOMPARE(stems, (Names{"a", "b", "c"}));
}

void tst_archivelist_folders::orderThatDoesNotFitCostsNoTitle()
{
    const QString folder = abc(QStringLiteral("full"));
    const auto assertAllThere = [&folder] {
        for (const char* name : {"/a.xml", "/b.xml", "/c.xml", "/a_240.png", "/b_240.png", "/c_240.png"})
            QVERIFY2(QFile::exists(folder + name), name);
    };
    m->open(folder);
    m->list->moveButtonClicked(true);
    {
        const QByteArray before = read(folder + "/.order.xml");
        const FullDisk disk;
        m->carry(0, 65 + TitleListFixture::ROW);
        QCOMPARE(read(folder + "/.order.xml"), before); // neither torn nor replaced
        m->list->synchronizationFolderFile();
        assertAllThere();
    }
    // There is room again when the folder is closed.
    m->list->synchronizationFolderFile();
    assertAllThere();
    QVERIFY(read(folder + "/.order.xml").contains("\"b.xml\""));
    QCOMPARE(LibraryFixture::order(folder), m->stems());
    QCOMPARE(m->stems(), (Names{"b", "a", "c"}));

    // It was opened without an order.
    QVERIFY(QFile::remove(folder + "/.order.xml"));
    m->list->refreshArchiveList(folder);
    QCOMPARE(m->stems(), (Names{"a", "b", "c"})); // by their file names
    m->list->synchronizationFolderFile();
    assertAllThere();
}

void tst_archivelist_folders::unreadableOrderCostsNoTitle_data()
{
    QTest::addColumn<QByteArray>("order");
    QTest::newRow("no bytes") << QByteArray();
    QTest::newRow("torn") << QByteArray("<root><archive index=\"0\" pat");
    QTest::newRow("not UTF-8") << QByteArray("<root><archive path=\"\xff.xml\"/></root>");
}

void tst_archivelist_folders::unreadableOrderCostsNoTitle()
{
    QFETCH(QByteArray, order);
    const QString folder = abc(QStringLiteral("torn"));
    const auto damage = [&] {
        QFile file(folder + "/.order.xml");
        QVERIFY(file.open(QIODevice::WriteOnly) && file.write(order) == order.size());
    };
    const auto assertAllThere = [&folder] {
        for (const char* name : {"/a.xml", "/b.xml", "/c.xml"})
            QVERIFY2(QFile::exists(folder + name), name);
    };
    // Damaged while its titles are shown: the list still knows the order.
    m->open(folder);
    damage();
    m->list->synchronizationFolderFile();
    assertAllThere();
    QCOMPARE(LibraryFixture::order(folder), m->stems());

    // Before it was opened: the titles are shown by their file names, and get a new order.
    damage();
    m->list->refreshArchiveList(folder);
    QCOMPARE(m->stems(), (Names{"a", "b", "c"}));
    QCOMPARE(LibraryFixture::order(folder), m->stems());
    m->list->synchronizationFolderFile();
    assertAllThere();
}

void tst_archivelist_folders::skippedTitlesKeepTheirPlaceInTheOrder()
{
    const QString folder = abc(QStringLiteral("skipped"));
    const QByteArray foreign("not ours");
    write(folder + "/notes.txt", foreign);
    write(folder + "/picture.png", foreign);
    cutInHalf(folder + "/b.xml");
    m->open(folder);
    // opening a folder does not write its order
    QCOMPARE(LibraryFixture::order(folder), (Names{"a", "b", "c"}));
    m->list->moveButtonClicked(true);
    m->carry(0, 65 + TitleListFixture::ROW);
    // a title that was not shown keeps its place
    QCOMPARE(LibraryFixture::order(folder), (Names{"c", "a", "b"}));
    m->list->synchronizationFolderFile();
    for (const char* name : {"/a.xml", "/a_240.png", "/c.xml", "/c_240.png"})
        QVERIFY(QFile::exists(folder + name));
    QCOMPARE(read(folder + "/notes.txt"), foreign);
    QCOMPARE(read(folder + "/picture.png"), foreign);
}

void tst_archivelist_folders::unreadableFolder()
{
    const QString good = abc(QStringLiteral("good"));
    const QString folder = abc(QStringLiteral("unreadable"));
    m->open(good);
    QSignalSpy picker(m->list, &ArchiveList::startTemplatePicker);
    {
        const Unreadable rights(folder);
        m->list->refreshArchiveList(folder);
        QCOMPARE(m->stems(), Names());
        QCOMPARE(picker.size(), 1);
        m_messages.take();
        m->hold(TitleListFixture::PICTURE_X, 400);
        // no picker is shown, since a new title could not be shown either
        m->choose(ArchiveAction::ACTION_CREATE);
        QCOMPARE(m_messages.take(), (Reports{{114, QStringLiteral("File")}}));
        QCOMPARE(picker.size(), 1);
        Archive blank;
        m->list->createArchiveFromTemplate(&blank); // refused with a message
        QCOMPARE(m_messages.take(), (Reports{{114, QStringLiteral("File")}}));
        QCOMPARE(m->list->count(), 0);
        m->list->synchronizationFolderFile();
    }
    m->list->refreshArchiveList(folder);
    QCOMPARE(m->stems(), (Names{"a", "b", "c"})); // nothing was lost
}

void tst_archivelist_folders::unwritableFolderMakesNoTitle()
{
    const QString folder = abc(QStringLiteral("unwritable"));
    m->open(folder);
    m->holdAndChoose(1, ArchiveAction::ACTION_COPY);
    QSignalSpy pasted(m->list, &ArchiveList::signalStartPasteArchive);
    {
        const Unreadable rights(folder);
        m_messages.take();
        m->holdAndChoose(1, ArchiveAction::ACTION_PASTE);
        QCOMPARE(m_messages.take(), (Reports{{116, QString()}}));
    }
    QCOMPARE(m->stems(), (Names{"a", "b", "c"}));
    QCOMPARE(m->stack.count(), 0);
    QCOMPARE(pasted.size(), 0);
    QCOMPARE(LibraryFixture::order(folder), m->stems());
    m->holdAndChoose(1, ArchiveAction::ACTION_PASTE); // possible now
    QCOMPARE(m->list->count(), 4);
}

void tst_archivelist_folders::readOnlyTemplateFolderTakesNoTemplate()
{
    const QString templates = QDir::cleanPath(m_fixture.titleRoot() + "/../usertemplates");
    QDir(templates).removeRecursively();
    QVERIFY(QDir().mkpath(templates));
    const QString folder = abc(QStringLiteral("as template"));
    m->open(folder);
    QSignalSpy added(m->list, &ArchiveList::addUserSignal);
    QSignalSpy picker(m->list, &ArchiveList::startUserTemplatePicker);
    m_messages.take();
    m_reports.take();
    // Other users and the group may read the title, but not the templates.
    const QString root = QDir::cleanPath(m_fixture.titleRoot() + "/../..");
    QVERIFY(QFile::setPermissions(root, QFile::permissions(root) | QFile::ReadGroup | QFile::ExeGroup |
                                            QFile::ReadOther | QFile::ExeOther));
    {
        const Unreadable rights(templates);
        m->holdAndChoose(1, ArchiveAction::ACTION_ADD_USER);
    }
    QCOMPARE(added.size(), 0);
    QCOMPARE(m_messages.take(), (Reports{{197, QStringLiteral("UserTemplate_001")}}));
    QCOMPARE(picker.size(), 0);
    QCOMPARE(m_reports.take(), Reports());
    QCOMPARE(m->stems(), (Names{"a", "b", "c"}));
    QCOMPARE(QDir(templates).entryList(QDir::AllEntries | QDir::NoDotAndDotDot), Names());
    m->holdAndChoose(1, ArchiveAction::ACTION_ADD_USER); // possible now
    QCOMPARE(added.size(), 1);
    QVERIFY(QFile::exists(templates + "/UserTemplate_001/Titler.xml"));
    QDir(templates).removeRecursively();
}

void tst_archivelist_folders::badPictures_data()
{
    QTest::addColumn<Damage>("damage");
    const auto row = [](const char* name, const Damage& damage) { QTest::newRow(name) << damage; };
    row("missing", [](const QString& path) { QFile::remove(path); });
    row("truncated", [](const QString& path) { cutInHalf(path); });
    row("empty", [](const QString& path) { write(path, {}); });
    row("noise", [](const QString& path) { write(path, QByteArray(5000, '\x5a')); });
    row("a folder", [](const QString& path) {
        QFile::remove(path);
        QDir().mkdir(path);
    });
    row("20,000 pixels wide", [](const QString& path) {
        QImage image(20000, 200, QImage::Format_RGB32);
        image.fill(Qt::blue);
        image.save(path);
    });
    row("20,000 pixels both ways", [](const QString& path) {
        QImage image(20000, 20000, QImage::Format_Mono);
        image.fill(0);
        image.save(path);
    });
}

void tst_archivelist_folders::badPictures()
{
    QFETCH(Damage, damage);
    const QString folder = abc(QStringLiteral("pictures"));
    damage(folder + "/b_240.png");
    m->open(folder);
    QCOMPARE(m->stems(), (Names{"a", "b", "c"}));
    QCOMPARE(textLines(m->item(1)).front(), QStringLiteral("b"));
    const QSize shown = m->item(1)->findChild<CheckeredPicture*>()->picture().size();
    QVERIFY2(shown.width() <= 240 && shown.height() <= 135, qPrintable(QString::number(shown.width())));
    // The title itself works like any other.
    m->tapTitle(1);
    QCOMPARE(m->takeCanvas(), Names{"b"});
    m->holdAndChoose(1, ArchiveAction::ACTION_COPY);
    m->holdAndChoose(2, ArchiveAction::ACTION_PASTE);
    QCOMPARE(m->list->count(), 4);
    QCOMPARE(textLines(m->item(3)).front(), QStringLiteral("b"));
}

void tst_archivelist_folders::folderGoneWhileOpen()
{
    const QString other = abc(QStringLiteral("other"));
    const QString folder = abc(QStringLiteral("gone"));
    m->open(folder);
    m->holdAndChoose(0, ArchiveAction::ACTION_COPY);
    QVERIFY(QDir(folder).removeRecursively());

    m->tapTitle(1);
    QCOMPARE(m->takeCanvas(), Names{"b"}); // the record is still in memory
    m->holdAndChoose(2, ArchiveAction::ACTION_DELETE);
    QCOMPARE(m->stems(), (Names{"a", "b"}));
    m->stack.undo();
    QCOMPARE(m->stems(), (Names{"a", "b", "c"}));
    m->list->moveButtonClicked(true);
    m->carry(0, 65 + TitleListFixture::ROW);
    QCOMPARE(m->stems(), (Names{"b", "a", "c"}));
    m->list->moveButtonClicked(false);
    m->holdAndChoose(0, ArchiveAction::ACTION_ADD_USER);
    m->holdAndChoose(0, ArchiveAction::ACTION_PASTE);
    m->list->refreshBaseItem(folder + "/a.xml", QImage());
    m->list->synchronizationFolderFile();

    m->stack.clear();
    m->open(other);
    QCOMPARE(m->stems(), (Names{"a", "b", "c"}));
    m->holdAndChoose(0, ArchiveAction::ACTION_PASTE); // the copy outlives its folder
    QCOMPARE(m->list->count(), 4);
    QCOMPARE(textLines(m->item(1)).front(), QStringLiteral("a"));
}

void tst_archivelist_folders::titleGoneWhileOpen()
{
    const QString folder = abc(QStringLiteral("title gone"));
    m->open(folder);
    QVERIFY(QFile::remove(folder + "/b.xml"));
    m->list->refreshBaseItem(folder + "/b.xml", QImage());
    QCOMPARE(textLines(m->item(1)).front(), QStringLiteral("b"));
    m->tapTitle(1);
    QCOMPARE(m->takeCanvas(), Names{"b"});
    m->list->saveArchiveListOrder();
    m->open(folder);
    QCOMPARE(m->stems(), (Names{"a", "c"}));
}

void tst_archivelist_folders::titlesOfOneMoment()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("moment"));
    // Two names of the same second, and one that only resembles them.
    const Names names{"20260101120000000", "20260101120000001", "20260101120000"};
    LibraryFixture::fillFolder(folder, names);
    m->open(folder);
    QCOMPARE(m->stems(), names);
    m->tapTitle(1);
    QCOMPARE(m->takeCanvas(), Names{names.at(1)});
    m->holdAndChoose(1, ArchiveAction::ACTION_DELETE);
    m->list->synchronizationFolderFile();
    QVERIFY(!QFile::exists(folder + "/" + names.at(1) + ".xml"));
    for (const QString& name : {names.at(0), names.at(2)}) {
        QVERIFY(QFile::exists(folder + "/" + name + ".xml"));
        QVERIFY(QFile::exists(folder + "/" + name + "_240.png"));
    }
    // Titles that are made faster than the clock ticks.
    Archive blank;
    for (int i = 0; i < 20; ++i)
        m->list->createArchiveFromTemplate(&blank);
    const Names stems = m->stems();
    QCOMPARE(QSet<QString>(stems.begin(), stems.end()).size(), 22);
    for (const QString& stem : stems)
        QVERIFY(QFile::exists(folder + "/" + stem + ".xml"));
}

void tst_archivelist_folders::openFolderIsLocked()
{
    const QString first = abc(QStringLiteral("first"));
    const QString second = abc(QStringLiteral("second"));
    const auto isLocked = [](const QString& folder) {
        return FolderLock().take(folder.toStdString(), FolderLock::Kind::Shared) == FolderLock::Result::Busy;
    };
    m->open(first);
    QVERIFY(isLocked(first));
    m->open(second);
    QVERIFY(!isLocked(first));
    QVERIFY(isLocked(second));
    m->list->cleanArchiveList();
    QVERIFY(!isLocked(second));
}

void tst_archivelist_folders::folderLockedByAnotherProgramOpens()
{
    const QString folder = abc(QStringLiteral("locked"));
    FolderLock other;
    QCOMPARE(other.take(folder.toStdString(), FolderLock::Kind::Exclusive), FolderLock::Result::Taken);
    m->open(folder);
    QCOMPARE(m->stems(), (Names{"a", "b", "c"}));
    other.release();
    m->list->selectArchive(1); // gets the lock as soon as it is free
    QCOMPARE(other.take(folder.toStdString(), FolderLock::Kind::Exclusive), FolderLock::Result::Busy);
}

QTEST_MAIN(tst_archivelist_folders)
#include "tst_archivelist_folders.moc"
