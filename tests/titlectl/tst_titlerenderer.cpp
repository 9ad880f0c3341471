// Pictures without a window: the same bytes as the titler's own road gives.
#include "RenderedFolder.h"
#include "library/ThumbnailRender.h"
#include "tests/support/Patience.h"

#include <QColor>
#include <QFile>
#include <QImage>
#include <QTest>
#include <string>

class tst_titlerenderer : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void sameBytesAsTheWindow();
    void anotherFolder();
    void oneSize_data();
    void oneSize();
    void backgroundIsFoundFromAnotherFolder();
    void eachTitleHasItsOwnBackground();
    void errors_data();
    void errors();

private:
    LibraryFixture m_fixture;
};

void tst_titlerenderer::sameBytesAsTheWindow()
{
    const QString folder = renderedFolder(m_fixture, "same", {"one", "two"});
    const QMap<QString, QByteArray> rendered = picturesIn(folder);
    QCOMPARE(rendered.size(), 8);
    ThumbnailRender window;
    for (const char* name : {"/one.xml", "/two.xml"}) {
        Archive archive;
        QVERIFY(ArchiveController().getOneArchive(folder + name, &archive));
        window.makeThumbnail(&archive, true);
    }
    for (const QString& name : rendered.keys())
        QVERIFY(QFile::remove(folder + '/' + name));
    QTRY_VERIFY(window.makePictureThreadIsFinished());
    QCOMPARE(picturesIn(folder), rendered);
}

void tst_titlerenderer::anotherFolder()
{
    const QString folder = renderedFolder(m_fixture, "here", {"one"});
    const QMap<QString, QByteArray> rendered = picturesIn(folder);
    const QString other = m_fixture.makeFolder("there");
    QCOMPARE(TitleRenderer().render({folder + "/one.xml", other, PictureFiles::Pictures(PictureFiles::ALL)}),
             QString());
    QCOMPARE(picturesIn(other), rendered);
}

void tst_titlerenderer::oneSize_data()
{
    QTest::addColumn<int>("pictures");
    QTest::addColumn<QStringList>("names");
    QTest::newRow("big") << int(PictureFiles::Big) << QStringList{"one_1920.png"};
    QTest::newRow("middle") << int(PictureFiles::Middle) << QStringList{"one_960.png"};
    QTest::newRow("reduced") << int(PictureFiles::Reduced) << QStringList{"one_240.png", "one_240S.png"};
}

void tst_titlerenderer::oneSize()
{
    QFETCH(int, pictures);
    QFETCH(QStringList, names);
    const QString folder = renderedFolder(m_fixture, "size", {"one"});
    const QString other = m_fixture.makeFolder("sizes");
    QCOMPARE(TitleRenderer().render({folder + "/one.xml", other, PictureFiles::Pictures(pictures)}),
             QString());
    QCOMPARE(QStringList(picturesIn(other).keys()), names);
}

void tst_titlerenderer::backgroundIsFoundFromAnotherFolder()
{
    const QString folder = m_fixture.makeFolder("background");
    QImage green(1920, 1080, QImage::Format_RGB32);
    green.fill(Qt::green);
    QVERIFY(green.save(folder + "/one_source_1920.png"));
    const auto archive = LibraryFixture::makeRecord(folder, "one", "text");
    archive->setBgResource("one_source_1920.png");
    archive->setBgResourceBig("one_source_1920.png");
    QVERIFY(ArchiveController().saveNewArchive(folder, archive.get()));
    const QString other = m_fixture.makeFolder("elsewhere");
    QCOMPARE(TitleRenderer().render({folder + "/one.xml", other, PictureFiles::Big}), QString());
    QCOMPARE(QImage(other + "/one_1920.png").pixelColor(1900, 1000), QColor(Qt::green));
}

// The renderer keeps the background of a title for the next one.
void tst_titlerenderer::eachTitleHasItsOwnBackground()
{
    const QString folder = m_fixture.makeFolder("backgrounds");
    const auto paint = [&](const QString& stem, const QColor& color) {
        QImage image(1920, 1080, QImage::Format_RGB32);
        image.fill(color);
        return image.save(folder + '/' + stem + "_source_1920.png");
    };
    TitleRenderer renderer;
    const auto corner = [&](const QString& stem) {
        Archive archive;
        ArchiveController().getOneArchive(folder + '/' + stem + ".xml", &archive);
        return renderer.draw(archive).at(0).pixelColor(1900, 1000);
    };
    for (const char* stem : {"one", "two", "three"}) {
        const auto archive = LibraryFixture::makeRecord(folder, stem, "text");
        if (stem != std::string("three"))
            archive->setBgResourceBig(stem + std::string("_source_1920.png"));
        QVERIFY(ArchiveController().saveNewArchive(folder, archive.get()));
    }
    QVERIFY(paint("one", Qt::green));
    QVERIFY(paint("two", Qt::green));
    QCOMPARE(corner("one"), QColor(Qt::green));
    QCOMPARE(corner("two"), QColor(Qt::green));
    QVERIFY(paint("two", Qt::red));
    QCOMPARE(corner("two"), QColor(Qt::red));
    QCOMPARE(corner("three").alpha(), 0);
    QCOMPARE(corner("one"), QColor(Qt::green));
    QVERIFY(QFile::remove(folder + "/one_source_1920.png"));
    QCOMPARE(corner("one").alpha(), 0);
}

void tst_titlerenderer::errors_data()
{
    QTest::addColumn<QString>("title");
    QTest::addColumn<QString>("folder");
    QTest::addColumn<QString>("reason");
    QTest::newRow("no title") << "gone.xml"
                              << ""
                              << "cannot be read";
    QTest::newRow("no folder") << "one.xml"
                               << "/nonexistent/folder"
                               << "No such file or directory";
}

void tst_titlerenderer::errors()
{
    QFETCH(QString, title);
    QFETCH(QString, folder);
    QFETCH(QString, reason);
    const QString titles = renderedFolder(m_fixture, "errors", {"one"});
    const QString error =
        TitleRenderer().render({titles + '/' + title, folder, PictureFiles::Pictures(PictureFiles::ALL)});
    QVERIFY2(error.contains(reason), qPrintable(error));
}

QTEST_MAIN(tst_titlerenderer)
#include "tst_titlerenderer.moc"
