// What is wrong with the pictures of a title.
#include "RenderedFolder.h"
#include "titlectl/PictureStates.h"

#include <QDateTime>
#include <QTest>

using State = PictureStates::State;

class tst_picturestates : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void states_data();
    void states();
    void goodTitleHasNoFault();
    void everyPictureIsLookedAt();

private:
    LibraryFixture m_fixture;
};

void tst_picturestates::states_data()
{
    QTest::addColumn<QByteArray>("damage");
    QTest::addColumn<State>("state");
    QTest::newRow("good") << QByteArray() << State::Good;
    QTest::newRow("missing") << QByteArray("remove") << State::Missing;
    QTest::newRow("torn") << QByteArray("tear") << State::Torn;
    QTest::newRow("empty") << QByteArray("empty") << State::Torn;
    QTest::newRow("another size") << QByteArray("resize") << State::WrongSize;
    QTest::newRow("old") << QByteArray("age") << State::Old;
}

void tst_picturestates::states()
{
    QFETCH(QByteArray, damage);
    QFETCH(State, state);
    const QString path = m_fixture.makeFolder("states") + "/p.png";
    QImage picture(64, 36, QImage::Format_RGB32);
    picture.fill(Qt::red);
    QVERIFY(picture.save(path));
    const QDateTime written = QFileInfo(path).lastModified();
    if (damage == "remove")
        QVERIFY(QFile::remove(path));
    if (damage == "tear")
        QVERIFY(QFile::resize(path, QFileInfo(path).size() / 2));
    if (damage == "empty")
        QVERIFY(QFile::resize(path, 0));
    const QSize size = damage == "resize" ? QSize(32, 18) : QSize(64, 36);
    QCOMPARE(PictureStates::stateOf(path, size, written.addSecs(damage == "age" ? 1 : 0)), state);
}

void tst_picturestates::goodTitleHasNoFault()
{
    const QString folder = renderedFolder(m_fixture, "good", {"a"});
    Archive archive;
    QVERIFY(ArchiveController().getOneArchive(folder + "/a.xml", &archive));
    QVERIFY(PictureStates(archive, QFileInfo(folder + "/a.xml").lastModified()).faults().isEmpty());
}

void tst_picturestates::everyPictureIsLookedAt()
{
    const QString folder = renderedFolder(m_fixture, "all", {"a"});
    Archive archive;
    QVERIFY(ArchiveController().getOneArchive(folder + "/a.xml", &archive));
    archive.setBgResource("gone_1280.png");
    archive.setBgResourceBig("gone_1920.png");
    for (const char* name : {"a_1920.png", "a_960.png", "a_240.png", "a_240S.png"})
        QVERIFY(QFile::remove(folder + '/' + name));
    QStringList pictures;
    const PictureStates found(archive, QDateTime());
    for (const PictureStates::Fault& fault : found.faults()) {
        QCOMPARE(fault.state, State::Missing);
        pictures.append(fault.picture);
    }
    QCOMPARE(pictures, (QStringList{"picture 1920", "picture 960", "picture 240", "picture 240 on black",
                                    "background 1280", "background 1920"}));
}

QTEST_MAIN(tst_picturestates)
#include "tst_picturestates.moc"
