// Names and files of titles that are made from a template or from a copy.
#include "LibraryFixture.h"
#include "tests/support/SettledFolder.h"

#include "library/TitleFileOperations.h"
#include "library/TitlerUtility.h"
#include "support/LogManager.h"

#include <QTemporaryFile>
#include <QTest>
#include <syslog.h>
#include <unistd.h>

namespace
{

// Collects what goes to the system log during its lifetime, from the standard error channel.
class SystemLogCatcher
{
public:
    SystemLogCatcher()
    {
        if (!m_file.open())
            qFatal("no file for the log");
        INIT_LOGGING(L"KS2Titler");
        ::openlog("KS2Titler", LOG_PERROR, LOG_USER);
        m_before = ::dup(STDERR_FILENO);
        ::dup2(m_file.handle(), STDERR_FILENO);
    }
    ~SystemLogCatcher()
    {
        ::dup2(m_before, STDERR_FILENO);
        ::close(m_before);
        ::closelog();
        UNINIT_LOGGING();
    }
    Q_DISABLE_COPY_MOVE(SystemLogCatcher)

    QByteArray text()
    {
        m_file.seek(0);
        return m_file.readAll();
    }

private:
    QTemporaryFile m_file;
    int m_before = -1;
};

} // namespace

class tst_titlefileoperations : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void thumbnailNames();
    void freeStemSkipsTakenNames();
    void emptyFolderMakesNothing();
    void presetKeepsItsBackground();
    void ownBackgroundIsCopiedUnderNewNames();
    void thumbnailWithoutExtensionSkipsTheBackground();
    void copySurvivesItsSource();
    void copyWithoutPicturesMakesTheTitleAlone();
    void noFileIsLeftAside();
    void templateFolderThatCannotBeMadeIsLogged();
    void templateThatIsThereStays();

private:
    static void writeFile(const QString& path, const QByteArray& bytes)
    {
        QFile file(path);
        QVERIFY(file.open(QIODevice::WriteOnly));
        file.write(bytes);
    }
    static QByteArray readFile(const QString& path)
    {
        QFile file(path);
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray("missing");
    }
    static QString beside(const Archive& archive, const std::string& name)
    {
        return QString::fromStdString(TitlerUtility::getThumbnailPathFromTitlePath(archive.getPath(), name));
    }

    LibraryFixture m_fixture;
    ArchiveController m_controller;
    TitleFileOperations m_files{m_controller};
};

void tst_titlefileoperations::thumbnailNames()
{
    QCOMPARE(TitlerUtility::getThumbnailNameFromTitlePath("/a/b/title.xml", "_960.png"), "title_960.png");
    QCOMPARE(TitlerUtility::getThumbnailPathFromTitlePath("/a/b/title.xml", "x.png"), "/a/b/x.png");
    QCOMPARE(TitlerUtility::getThumbnailPathFromTitlePath("title.xml", "x.png"), "./x.png");
    QCOMPARE(TitlerUtility::getThumbnailNameFromTitlePath("/報/題.xml", "_1920.png"), "題_1920.png");
}

void tst_titlefileoperations::freeStemSkipsTakenNames()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("stems"));
    const QDateTime now(QDate(2026, 1, 2), QTime(3, 4, 5, 998));
    QCOMPARE(TitleFileOperations::freeStem(folder, now), QStringLiteral("20260102030405998"));
    writeFile(folder + QStringLiteral("/20260102030405998.xml"), "x");
    writeFile(folder + QStringLiteral("/20260102030405999.xml"), "x");
    QCOMPARE(TitleFileOperations::freeStem(folder, now), QStringLiteral("20260102030406000"));
}

void tst_titlefileoperations::emptyFolderMakesNothing()
{
    const Archive archive;
    QVERIFY(!m_files.createFromTemplate(QString(), archive));
    QVERIFY(!m_files.createFromCopy(QString(), archive, TitlePictures()));
}

void tst_titlefileoperations::presetKeepsItsBackground()
{
    const QString templates = m_fixture.makeFolder(QStringLiteral("preset source"));
    const QString folder = m_fixture.makeFolder(QStringLiteral("preset target"));
    auto source = LibraryFixture::makeRecord(templates, QStringLiteral("p"), QStringLiteral("Preset"));
    source->setBgResource((templates + QStringLiteral("/bg_1280.jpg")).toStdString());
    source->setBgResourceBig((templates + QStringLiteral("/bg_1920.jpg")).toStdString());
    for (const char* name : {"/p_1920.png", "/p_960.png", "/p_240.png", "/p_240S.png"})
        writeFile(templates + QLatin1String(name), name);

    const auto made = m_files.createFromTemplate(folder, *source);
    QVERIFY(made);
    QCOMPARE(made->getBgResource(), source->getBgResource());
    QCOMPARE(made->getBgResourceBig(), source->getBgResourceBig());
    const std::string stem = made->getName();
    QCOMPARE(stem.size(), std::size_t(17));
    QCOMPARE(made->getPath(), folder.toStdString() + "/" + stem + ".xml");
    QCOMPARE(made->getThumbnailSmall(), stem + "_240.png");
    QCOMPARE(readFile(beside(*made, stem + "_1920.png")), QByteArray("/p_1920.png"));
    QCOMPARE(readFile(beside(*made, stem + "_960.png")), QByteArray("/p_960.png"));
    QCOMPARE(readFile(beside(*made, stem + "_240.png")), QByteArray("/p_240.png"));
    QCOMPARE(readFile(beside(*made, stem + "_240S.png")), QByteArray("/p_240S.png"));

    Archive loaded;
    QVERIFY(m_controller.getOneArchive(QString::fromStdString(made->getPath()), &loaded));
    QCOMPARE(loaded.text().size(), std::size_t(1));
    QCOMPARE(loaded.text().front()->getText(), std::string("Preset"));
}

void tst_titlefileoperations::ownBackgroundIsCopiedUnderNewNames()
{
    const QString templates = m_fixture.makeFolder(QStringLiteral("own source"));
    const QString folder = m_fixture.makeFolder(QStringLiteral("own 目标"));
    auto source = LibraryFixture::makeRecord(templates, QStringLiteral("t"), QStringLiteral("Own"));
    source->setThumbnailSmall("t_240.jpe");
    source->setBgResource("t_source_1280.jpe");
    source->setBgResourceBig("t_source_1920.jpe");
    for (const char* name : {"/t_240.jpe", "/t_source_1280.jpe", "/t_source_1920.jpe"})
        writeFile(templates + QLatin1String(name), name);

    const auto made = m_files.createFromTemplate(folder, *source);
    QVERIFY(made);
    const std::string stem = made->getName();
    QCOMPARE(made->getThumbnailSmall(), stem + "_240.jpe");
    QCOMPARE(made->getBgResource(), stem + "_source_1280.jpe");
    QCOMPARE(made->getBgResourceBig(), stem + "_source_1920.jpe");
    QCOMPARE(readFile(beside(*made, made->getThumbnailSmall())), QByteArray("/t_240.jpe"));
    QCOMPARE(readFile(made->getFullPathOfBgResource()), QByteArray("/t_source_1280.jpe"));
    QCOMPARE(readFile(made->getFullPathOfBgResourceBig()), QByteArray("/t_source_1920.jpe"));
}

void tst_titlefileoperations::thumbnailWithoutExtensionSkipsTheBackground()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("no extension"));
    auto source = LibraryFixture::makeRecord(folder, QStringLiteral("t"), QStringLiteral("T"));
    source->setThumbnailSmall("thumbnail");
    source->setBgResource("old.png");
    const auto made = m_files.createFromTemplate(folder, *source);
    QVERIFY(made);
    QCOMPARE(made->getThumbnailSmall(), made->getName() + "_240.png");
    QCOMPARE(made->getBgResource(), std::string("old.png"));

    // The name may be in use in another folder.
    const QString other = m_fixture.makeFolder(QStringLiteral("no extension elsewhere"));
    writeFile(folder + QStringLiteral("/old.png"), "background");
    writeFile(other + QStringLiteral("/old.png"), "of another title");
    QVERIFY(m_files.createFromTemplate(other, *source));
    QVERIFY(m_files.createFromCopy(other, *source, TitlePictures()));
    QCOMPARE(readFile(other + QStringLiteral("/old.png")), QByteArray("of another title"));
}

void tst_titlefileoperations::copySurvivesItsSource()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("copy"));
    const auto source = LibraryFixture::makeRecord(folder, QStringLiteral("s"), QStringLiteral("Copy me"));
    for (const char* name : {"/s_1920.png", "/s_960.png", "/s_240.png", "/s_240S.png"})
        writeFile(folder + QLatin1String(name), name);
    LibraryFixture::fillFolder(folder, {QStringLiteral("other")});
    QVERIFY(m_controller.saveNewArchive(folder, source.get()));
    const TitlePictures pictures = TitleFileOperations::loadPictures(*source);
    QVERIFY(m_controller.deleteArchive(QString::fromStdString(source->getPath())));
    QVERIFY(!QFile::exists(folder + QStringLiteral("/s_1920.png")));

    const auto first = m_files.createFromCopy(folder, *source, pictures);
    const auto second = m_files.createFromCopy(folder, *source, pictures);
    QVERIFY(first && second);
    QVERIFY(first->getPath() != second->getPath());
    for (const Archive* made : {first.get(), second.get()}) {
        QCOMPARE(readFile(beside(*made, made->getThumbnailBig())), QByteArray("/s_1920.png"));
        QCOMPARE(readFile(beside(*made, made->getThumbnailMiddle())), QByteArray("/s_960.png"));
        QCOMPARE(readFile(beside(*made, made->getThumbnailSmall())), QByteArray("/s_240.png"));
        QCOMPARE(readFile(beside(*made, made->getThumbnailBlack())), QByteArray("/s_240S.png"));
        QVERIFY(QFile::exists(QString::fromStdString(made->getPath())));
        QVERIFY(made->getBgResource().empty()); // a title without a background stays one
    }
}

void tst_titlefileoperations::copyWithoutPicturesMakesTheTitleAlone()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("bare copy"));
    const auto source = LibraryFixture::makeRecord(folder, QStringLiteral("s"), QStringLiteral("Bare"));
    const TitlePictures pictures = TitleFileOperations::loadPictures(*source);
    QVERIFY(pictures.big.isEmpty() && pictures.small.isEmpty());
    QVERIFY(m_files.createFromCopy(folder, *source, pictures));
    QCOMPARE(QDir(folder).entryList(QDir::Files).size(), 1);
}

void tst_titlefileoperations::noFileIsLeftAside()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("aside"));
    const auto source = LibraryFixture::makeRecord(folder, QStringLiteral("s"), QStringLiteral("A"));
    TitlePictures pictures;
    pictures.big = pictures.middle = pictures.black = pictures.small = QByteArray("picture");
    QVERIFY(m_files.createFromCopy(folder, *source, pictures));
    QCOMPARE(settledEntries(folder).size(), 5);
}

void tst_titlefileoperations::templateFolderThatCannotBeMadeIsLogged()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("no template folder"));
    const auto source = LibraryFixture::makeRecord(folder, QStringLiteral("s"), QStringLiteral("A"));
    const QString root = folder + QStringLiteral("/templates");
    writeFile(root, "a file where the folder should be");
    {
        SystemLogCatcher log;
        QVERIFY(!m_files.createUserTemplate(root, QStringLiteral("UserTemplate_001"), *source));
        QVERIFY2(log.text().contains("ERROR create dir."), log.text());
    }
    QCOMPARE(readFile(root), QByteArray("a file where the folder should be"));

    const QString good = m_fixture.makeFolder(QStringLiteral("template folder"));
    SystemLogCatcher log;
    QVERIFY(m_files.createUserTemplate(good, QStringLiteral("UserTemplate_001"), *source));
    QVERIFY2(!log.text().contains("ERROR"), log.text());
}

// The name is chosen from an order file, which may have been unreadable.
void tst_titlefileoperations::templateThatIsThereStays()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("templates"));
    const auto first = LibraryFixture::makeRecord(folder, QStringLiteral("s"), QStringLiteral("first"));
    const auto second = LibraryFixture::makeRecord(folder, QStringLiteral("t"), QStringLiteral("second"));
    const auto made = m_files.createUserTemplate(folder, QStringLiteral("UserTemplate_001"), *first);
    QVERIFY(made);
    const QString path = QString::fromStdString(made->getPath());
    const QByteArray before = readFile(path);
    QVERIFY(!before.isEmpty());
    QVERIFY(!m_files.createUserTemplate(folder, QStringLiteral("UserTemplate_001"), *second));
    QCOMPARE(readFile(path), before);
    // A folder without its title does not keep the name in use.
    QVERIFY(QFile::remove(path));
    QVERIFY(m_files.createUserTemplate(folder, QStringLiteral("UserTemplate_001"), *second));
}

QTEST_GUILESS_MAIN(tst_titlefileoperations)
#include "tst_titlefileoperations.moc"
