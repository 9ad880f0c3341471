// Which titles the paths of a command line stand for.
#include "tests/library/LibraryFixture.h"
#include "titlectl/TitlePaths.h"

#include <QTest>

class tst_titlepaths : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void folderInItsOrder();
    void folderWithoutAnOrderByName();
    void singleTitles();
    void folderOfFolders();
    void folderThatIsNamedTwiceCountsOnce();
    void folderWithoutTitles();
    void refused_data();
    void refused();

private:
    QStringList stems(const QStringList& paths) const
    {
        QStringList names;
        for (const QString& path : paths)
            names.append(QFileInfo(path).completeBaseName());
        return names;
    }

    LibraryFixture m_fixture;
    QString m_first;
    QString m_second;
};

void tst_titlepaths::initTestCase()
{
    m_first = m_fixture.makeFolder("first");
    LibraryFixture::fillFolder(m_first, {"c", "a", "b"});
    m_second = m_fixture.makeFolder("second");
    LibraryFixture::fillFolder(m_second, {"d"});
}

void tst_titlepaths::folderInItsOrder()
{
    const TitlePaths paths({m_first});
    QVERIFY(paths.isValid());
    QCOMPARE(paths.folders().size(), 1);
    QVERIFY(paths.folders().first().isWhole);
    QCOMPARE(stems(paths.titles()), (QStringList{"c", "a", "b"}));
    QCOMPARE(paths.folderPaths(), QStringList{m_first});
}

void tst_titlepaths::folderWithoutAnOrderByName()
{
    const QString folder = m_fixture.makeFolder("no order");
    LibraryFixture::fillFolder(folder, {"c", "a"});
    QVERIFY(QFile::remove(folder + "/.order.xml"));
    QCOMPARE(stems(TitlePaths::titlesIn(folder)), (QStringList{"a", "c"}));
}

void tst_titlepaths::singleTitles()
{
    const TitlePaths paths({m_first + "/b.xml", m_first + "/a.xml", m_first + "/b.xml"});
    QVERIFY(paths.isValid());
    QCOMPARE(paths.folders().size(), 1);
    QVERIFY(!paths.folders().first().isWhole);
    QCOMPARE(stems(paths.titles()), (QStringList{"b", "a"}));
}

void tst_titlepaths::folderOfFolders()
{
    const QString root = m_fixture.makeFolder("root");
    for (const char* name : {"two", "one", "empty"})
        QVERIFY(QDir(root).mkdir(name));
    LibraryFixture::fillFolder(root + "/two", {"x"});
    LibraryFixture::fillFolder(root + "/one", {"y", "z"});
    const TitlePaths paths({root});
    QVERIFY(paths.isValid());
    QCOMPARE(paths.folderPaths(), (QStringList{root + "/one", root + "/two"}));
    QCOMPARE(stems(paths.titles()), (QStringList{"y", "z", "x"}));
}

void tst_titlepaths::folderThatIsNamedTwiceCountsOnce()
{
    const TitlePaths paths({m_first + "/a.xml", m_second, m_first + "/", m_first});
    QVERIFY(paths.isValid());
    QCOMPARE(paths.folders().size(), 2);
    QVERIFY(paths.folders().first().isWhole);
    QCOMPARE(stems(paths.titles()), (QStringList{"c", "a", "b", "d"}));
}

void tst_titlepaths::folderWithoutTitles()
{
    const TitlePaths paths({m_fixture.makeFolder("empty")});
    QVERIFY(paths.isValid());
    QCOMPARE(paths.folders().size(), 1);
    QVERIFY(paths.titles().isEmpty());
}

void tst_titlepaths::refused_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("reason");
    QTest::newRow("missing") << "gone.xml"
                             << "does not exist";
    QTest::newRow("a picture") << "a_1920.png"
                               << "neither a title file nor a folder";
    QTest::newRow("the order") << ".order.xml"
                               << "neither a title file nor a folder";
}

void tst_titlepaths::refused()
{
    QFETCH(QString, name);
    QFETCH(QString, reason);
    const TitlePaths paths({m_second, m_first + '/' + name});
    QVERIFY(!paths.isValid());
    QVERIFY2(paths.error().endsWith(reason) && paths.error().contains(name), qPrintable(paths.error()));
}

QTEST_GUILESS_MAIN(tst_titlepaths)
#include "tst_titlepaths.moc"
