// The titles of a folder as rows of a list: finding them, and the rows of files that are not titles.
#include "LibraryFixture.h"

#include "document/ArchiveOrder.h"
#include "library/ArchiveItem.h"
#include "library/ListedTitles.h"
#include "touchui/KSScrollViewerWidget.h"

#include <QFileInfo>
#include <QSignalSpy>
#include <QTest>

class tst_listedtitles : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void rowAfterRemoval_data();
    void rowAfterRemoval();
    void findsTitlesWithoutItems();
    void itemOutsideTheList();
    void contentsAreRequestedOnce();
    void orderNamesAllRows();
    void recordsAsRows();

private:
    static constexpr int ROWS = 20;

    QString path(int number) const
    {
        return m_folder + QStringLiteral("/t%1.xml").arg(number, 2, 10, QChar('0'));
    }
    int items() const { return static_cast<int>(m_titles->items().size()); }

    LibraryFixture m_fixture;
    QString m_folder;
    std::unique_ptr<KSScrollViewerWidget> m_list;
    std::unique_ptr<ListedTitles> m_titles;
};

void tst_listedtitles::init()
{
    static int number = 0;
    m_folder = m_fixture.makeFolder(QStringLiteral("listed%1").arg(++number));
    QStringList stems;
    for (int i = 0; i < ROWS; ++i)
        stems.append(QFileInfo(path(i)).completeBaseName());
    LibraryFixture::fillFolder(m_folder, stems);
    m_list = std::make_unique<KSScrollViewerWidget>();
    m_titles = std::make_unique<ListedTitles>(*m_list);
    m_titles->add(m_folder);
}

void tst_listedtitles::cleanup()
{
    m_titles.reset();
    m_list.reset();
}

void tst_listedtitles::rowAfterRemoval_data()
{
    QTest::addColumn<int>("row");
    QTest::addColumn<QList<int>>("removed");
    QTest::addColumn<int>("after");
    QTest::newRow("none removed") << 3 << QList<int>() << 3;
    QTest::newRow("above") << 3 << QList<int>{0, 2} << 1;
    QTest::newRow("below") << 3 << QList<int>{4, 9} << 3;
    QTest::newRow("above and below") << 3 << QList<int>{1, 5} << 2;
    QTest::newRow("the row itself") << 3 << QList<int>{3} << 3;
    QTest::newRow("no row") << -1 << QList<int>{0, 1} << -1;
}

void tst_listedtitles::rowAfterRemoval()
{
    QFETCH(const int, row);
    QFETCH(const QList<int>, removed);
    QTEST(ListedTitles::rowAfterRemoval(row, removed), "after");
}

void tst_listedtitles::findsTitlesWithoutItems()
{
    const int made = items();
    QVERIFY(made < ROWS);
    QCOMPARE(m_titles->find(path(ROWS - 1)), ROWS - 1);
    QCOMPARE(m_titles->path(ROWS - 1), path(ROWS - 1));
    QCOMPARE(m_titles->find(m_folder + QStringLiteral("/other.xml")), -1);
    QCOMPARE(items(), made);
    const ArchiveItem* last = m_titles->findItem(path(ROWS - 1));
    QVERIFY(last);
    QCOMPARE(last->getArchiveDataPath(), path(ROWS - 1));
    QCOMPARE(items(), made + 1);
}

void tst_listedtitles::itemOutsideTheList()
{
    for (const int index : {-1, ROWS}) {
        QVERIFY(!m_titles->item(index));
        QVERIFY(!m_titles->readableItem(index));
        QVERIFY(m_titles->path(index).isEmpty());
    }
    QVERIFY(!m_titles->findItem(m_folder + QStringLiteral("/other.xml")));
}

void tst_listedtitles::contentsAreRequestedOnce()
{
    const QSignalSpy requested(m_titles.get(), &ListedTitles::contentsRequested);
    m_titles->item(ROWS - 1); // the rows in view have requested theirs
    QCOMPARE(requested.count(), 0);
    const QList<ArchiveItem*> incomplete = m_titles->beginToComplete();
    QCOMPARE(incomplete.size(), items());
    for (ArchiveItem* item : incomplete)
        m_titles->complete(item);
    m_titles->item(ROWS - 2);
    m_titles->item(ROWS - 3);
    QCOMPARE(requested.count(), 1);
    QCOMPARE(m_titles->beginToComplete().size(), 2);
}

void tst_listedtitles::orderNamesAllRows()
{
    const QList<ArchiveOrder*> order = m_titles->order();
    QCOMPARE(order.size(), ROWS);
    for (int i = 0; i < ROWS; ++i) {
        QCOMPARE(order.at(i)->getArchiveIndex(), i);
        QCOMPARE(order.at(i)->getArchivePath(), QFileInfo(path(i)).fileName().toStdString());
    }
    qDeleteAll(order);
    QCOMPARE(static_cast<int>(m_titles->fileNames().size()), items());
    QVERIFY(m_titles->fileNames().contains(QFileInfo(path(0)).fileName().toStdString()));
}

void tst_listedtitles::recordsAsRows()
{
    m_titles->clear();
    QVERIFY(m_list->isEmpty());
    QCOMPARE(items(), 0);
    QList<Archive*> records;
    for (const char* stem : {"b", "a"}) {
        auto record = LibraryFixture::makeRecord(m_folder, QLatin1String(stem), QStringLiteral("text"));
        records.append(record.release());
    }
    const QList<Archive*> expected = records;
    m_titles->add(records);
    QCOMPARE(m_list->count(), 2);
    QCOMPARE(m_titles->item(0)->getArchiveData(), expected.front());
    QCOMPARE(m_titles->item(1)->getArchiveData(), expected.back());
}

QTEST_MAIN(tst_listedtitles)
#include "tst_listedtitles.moc"
