// Where files lie: the path file, the cursor that reads it, and the queries of the platform.
#include "support/FileSyncQueue.h"
#include "support/FolderLookup.h"
#include "support/HiddenName.h"
#include "support/IPathManagerEx.h"
#include "support/PathManagerEx.h"
#include "support/SystemInfo.h"
#include "support/XMLLoader.h"

#include <QDir>
#include <QFile>
#include <QRegularExpression>
#include <QTemporaryDir>
#include <QtTest/QTest>
#include <boost/filesystem/exception.hpp>

class tst_pathmanagerex : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        m_folder = std::make_unique<QTemporaryDir>();
        QVERIFY(m_folder->path().size() < 90);
        qputenv("K2SYS_AC_DATA", m_folder->path().toUtf8());
        qputenv("K2SYS_AC_ROOT", "");
        QVERIFY(QDir(m_folder->path()).mkdir("defaultuser"));
    }

    void cleanup()
    {
        QVERIFY(FileSyncQueue::flush(std::chrono::seconds(30)));
        IPathManagerEx::clearUp();
        IXMLLoader::cleanUp();
        SystemInfo::cleanUp();
        qunsetenv("K2SYS_FS_REMAIN");
    }

    void gettersReadTheirNodes()
    {
        writePathFile("<PathInfo><TitleResource path=\"resources/标题\"/><Font path=\"字体 é\"/>"
                      "<group><Movie path=\"movies\"/></group><Movie path=\"second\"/><tmp/></PathInfo>");
        IPathManagerEx* const paths = IPathManagerEx::getInstance();
        QCOMPARE(QString::fromStdWString(paths->getTitleResourcesPath()), base() + "resources/标题");
        QVERIFY(QDir(base() + "resources/标题").exists());
        QCOMPARE(QString::fromStdWString(paths->getFontsPath()), base() + "字体 é");
        // The first in document order, wherever it stands; two getters share the node.
        QCOMPARE(QString::fromStdWString(paths->getMPMoviesPath()), base() + "movies");
        PathManagerEx own;
        QCOMPARE(QString::fromStdWString(own.getMoviesPath()), base() + "movies");
        QCOMPARE(QString::fromStdWString(paths->getTmpPath()), base());
        QVERIFY(paths->getLogosPath().empty());
    }

    void folderThatCannotBeMadeIsNone()
    {
        writePathFile("<PathInfo><TitleResource path=\"taken/titles\"/><Font path=\"字体\"/></PathInfo>");
        put((base() + "taken").toStdString(), "a file in the way");
        QVERIFY_EXCEPTION_THROWN(IPathManagerEx::getInstance()->getTitleResourcesPath(),
                                 boost::filesystem::filesystem_error);
        QCOMPARE(FolderLookup::multiByte(&IPathManagerEx::getTitleResourcesPath), std::string());
        QCOMPARE(FolderLookup::wide(&IPathManagerEx::getTitleResourcesPath), std::wstring());
        QCOMPARE(FolderLookup::multiByte(&IPathManagerEx::getFontsPath), (base() + "字体").toStdString());
        // There is no need to start anew once it can be made.
        QVERIFY(QFile::remove(base() + "taken"));
        QCOMPARE(FolderLookup::wide(&IPathManagerEx::getTitleResourcesPath),
                 (base() + "taken/titles").toStdWString());
    }

    void everyGetterHasItsNode_data()
    {
        QTest::addColumn<int>("index");
        for (int i = 0; i < int(getters().size()); ++i)
            QTest::newRow(getters()[std::size_t(i)].first) << i;
    }

    void everyGetterHasItsNode()
    {
        QFETCH(int, index);
        const auto& [node, getter] = getters()[std::size_t(index)];
        writePathFile(QByteArray("<p><") + node + " path=\"here\"/></p>");
        QCOMPARE(QString::fromStdWString((IPathManagerEx::getInstance()->*getter)()), base() + "here");
    }

    void answersAreCachedAndFailuresAreNot()
    {
        IPathManagerEx* const paths = IPathManagerEx::getInstance();
        QVERIFY(paths->getTitlerPath().empty());
        writePathFile("<p><Titler path=\"a\"/></p>");
        QCOMPARE(QString::fromStdWString(paths->getTitlerPath()), base() + "a");
        QVERIFY(QFile::remove(base() + "PathInfo.xml"));
        QCOMPARE(QString::fromStdWString(paths->getTitlerPath()), base() + "a");
        QVERIFY(paths->getDataPath().empty());
    }

    void hostilePathFiles_data()
    {
        QTest::addColumn<QByteArray>("bytes");
        QTest::newRow("empty") << QByteArray("");
        QTest::newRow("text") << QByteArray("no markup");
        QTest::newRow("deep") << QByteArray("<a>").repeated(50000);
        QTest::newRow("wide") << "<a" + QByteArray(" x=\"1\"").repeated(20000) + "/>";
        QTest::newRow("not UTF-8") << QByteArray("<p><Titler path=\"\xff\"/></p>");
    }

    void hostilePathFiles()
    {
        QFETCH(QByteArray, bytes);
        writePathFile(bytes);
        QVERIFY(IPathManagerEx::getInstance()->getTitlerPath().empty());
    }

    void rootPathTakesTheLeadingSlash()
    {
        qputenv("K2SYS_AC_ROOT", "/");
        PathManagerEx paths;
        QCOMPARE(QString::fromStdWString(paths.getDefaultPath()), base().mid(1));
        qputenv("K2SYS_AC_ROOT", "/other");
        QCOMPARE(QString::fromStdWString(paths.getDefaultPath()), base());
    }

    void newFoldersHaveUniqueNames()
    {
        PathManagerEx paths;
        const QString parent = m_folder->path();
        const QString one = QString::fromStdWString(paths.CreateNewFolder(parent.toStdWString()));
        const QString two = QString::fromStdWString(paths.CreateNewFolder((parent + "/").toStdWString()));
        const QRegularExpression form("^" + QRegularExpression::escape(parent) + "/[0-9A-F]{32}$");
        QVERIFY(form.match(one).hasMatch());
        QVERIFY(form.match(two).hasMatch());
        QVERIFY(one != two);
        QVERIFY(QDir(one).exists() && QDir(two).exists());
    }

    void loaderMovesItsCursor()
    {
        const std::string file = m_folder->filePath("x.xml").toStdString();
        put(file, "<root><a n=\"1\"><b n=\"2\">text</b></a><b n=\"3\"/><c n=\"4\"/></root>");
        XMLLoader loader;
        QVERIFY(!loader.selectRootNode());
        QVERIFY(!loader.selectNode("a"));
        QCOMPARE(loader.getAttribute("a", "n"), std::string());
        QVERIFY(!loader.load(file + "x"));
        QVERIFY(loader.load(file));
        QVERIFY(loader.selectNode("root"));
        QCOMPARE(loader.getAttribute("b", "n"), std::string("2"));
        QVERIFY(loader.selectNode("a"));
        QVERIFY(loader.selectNode("c"));
        QVERIFY(!loader.selectNode("a"));
        QVERIFY(loader.selectRootNode());
        QCOMPARE(loader.getText("b"), std::string("text"));
        QCOMPARE(loader.getText("c"), std::string());
        QCOMPARE(loader.getAttribute("c", "missing"), std::string());
        QVERIFY(loader.setAttribute("c", "n", "五"));
        QVERIFY(loader.deleteAttribute("a", "n"));
        QVERIFY(!loader.setAttribute("none", "n", "5"));
        QVERIFY(!loader.deleteAttribute("none", "n"));
        QVERIFY(loader.save(file));
        QVERIFY(loader.load(file));
        QCOMPARE(loader.getAttribute("c", "n"), std::string("五"));
        QCOMPARE(loader.getAttribute("a", "n"), std::string());
        QVERIFY(loader.createEmptyXML(file));
        QVERIFY(loader.load(file));
        QVERIFY(loader.selectNode("root"));
        QFile written(QString::fromStdString(file));
        QVERIFY(written.open(QIODevice::ReadOnly));
        QCOMPARE(written.readAll(), QByteArray("<?xml version=\"1.0\" encoding=\"utf-8\" ?>\n<root />\n"));
    }

    void environmentPaths()
    {
        QCOMPARE(QString::fromStdWString(SystemInfo::getDataPath()), m_folder->path());
        qputenv("K2SYS_AC_PREFIX", "/opt/标题");
        QCOMPARE(QString::fromStdWString(SystemInfo::getInstance()->getPrefixPath()), QString("/opt/标题"));
        qputenv("K2SYS_AC_PREFIX", QByteArray("/") + QByteArray(150, 'x'));
        QVERIFY(SystemInfo::getPrefixPath().empty());
        qunsetenv("K2SYS_AC_PREFIX");
        qputenv("K2SYS_AC_ROOT", "/");
        QCOMPARE(SystemInfo::getRootPath(), std::wstring(L"/"));
        std::tm* now = nullptr;
        QVERIFY(SystemInfo::getSystemTime(&now));
        const std::unique_ptr<std::tm> owner(now);
        QVERIFY(now->tm_year > 120);
        QVERIFY(!SystemInfo::getSystemTime(nullptr));
        std::wstring region, city;
        SystemInfo::getSystemTimeZone(region, city);
        QVERIFY(!region.empty());
    }

    void diskSizesAreInKilobytesOfAThousand()
    {
        const std::wstring folder = m_folder->path().toStdWString();
        qputenv("K2SYS_FS_REMAIN", "200000999");
        QCOMPARE(SystemInfo::getDiskRemainSize(folder), 200000LL);
        qputenv("K2SYS_FS_REMAIN", "199999999");
        QCOMPARE(SystemInfo::getDiskRemainSize(folder), 199999LL);
        qunsetenv("K2SYS_FS_REMAIN");
        QVERIFY(SystemInfo::getDiskSize(folder) > 0);
        QCOMPARE(SystemInfo::getDiskSize(folder + L"/missing"), -1LL);

        QCOMPARE(SystemInfo::getFolderSize(folder + L"/missing"), 0LL);
        put(m_folder->filePath("a").toStdString(), QByteArray(2500, 'x'));
        QVERIFY(QDir(m_folder->path()).mkpath("below/文件夹"));
        put(m_folder->filePath("below/文件夹/b").toStdString(), QByteArray(1500, 'x'));
        put(m_folder->filePath(".titler-new-1-1-1").toStdString(), QByteArray(9000, 'x'));
        QCOMPARE(SystemInfo::getFolderSize(folder), 4LL);
    }

    void copiesFilesAndFolders()
    {
        const QString from = m_folder->filePath("从"), to = m_folder->filePath("到");
        QVERIFY(SystemInfo::createFolders((from + "/sub/deep").toStdWString()));
        QVERIFY(!SystemInfo::createFolders((from + "/sub/deep").toStdWString()));
        put((from + "/a.xml").toStdString(), "new");
        put((from + "/sub/deep/b.png").toStdString(), "picture");
        put((from + "/.order.xml").toStdString(), "order");
        put(HiddenName::kept((from + "/a.xml").toStdString()), "kept");
        QVERIFY(SystemInfo::createFolders(to.toStdWString()));
        put((to + "/a.xml").toStdString(), "old");
        QVERIFY(SystemInfo::copyFolderFile(from.toStdString(), to.toStdString()));
        QCOMPARE(get(to + "/a.xml"), QByteArray("new"));
        QCOMPARE(get(to + "/sub/deep/b.png"), QByteArray("picture"));
        QVERIFY(FileSyncQueue::flush(std::chrono::seconds(30)));
        QCOMPARE(QDir(to).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot, QDir::Name),
                 QStringList({".order.xml", "a.xml", "sub"}));
        QVERIFY(SystemInfo::copyFolderFiles(from.toStdString(), (to + "2").toStdString()));
        QCOMPARE(get(to + "2/.order.xml"), QByteArray("order"));
        QVERIFY(
            SystemInfo::copyFile((from + "/a.xml").toStdString(), (to + "/new folder/c.xml").toStdString()));
        QCOMPARE(get(to + "/new folder/c.xml"), QByteArray("new"));

        QVERIFY(!SystemInfo::copyFolderFile((from + "/missing").toStdString(), to.toStdString()));
        QVERIFY(!SystemInfo::copyFolderFile("", (to + "/x").toStdString()));
        QVERIFY(
            !SystemInfo::copyFolderFile((from + "/a.xml").toStdString(), (from + "/a.xml").toStdString()));
        QCOMPARE(get(from + "/a.xml"), QByteArray("new"));
        QVERIFY(!SystemInfo::copyFolderFile(from.toStdString(), (from + "/sub/inside").toStdString()));
        QVERIFY(!SystemInfo::copyFolderFiles((from + "/a.xml").toStdString(), to.toStdString()));

        QVERIFY(SystemInfo::deleteFile((to + "/a.xml").toStdString()));
        QVERIFY(!SystemInfo::deleteFile((to + "/a.xml").toStdString()));
        QVERIFY(!SystemInfo::deleteFile(to.toStdString()));
    }

    void wideStrings()
    {
        const std::wstring wide = QString("aé中속😀").toStdWString();
        QCOMPARE(SystemInfo::wstringToStringType(wide), std::string("aé中속😀"));
        QCOMPARE(SystemInfo::stringToWstring("aé中속😀"), wide);
    }

private:
    using Getter = std::wstring (IPathManagerEx::*)();

    static const std::vector<std::pair<const char*, Getter>>& getters()
    {
        static const std::vector<std::pair<const char*, Getter>> all = {
            {"Titler", &IPathManagerEx::getTitlerPath},
            {"Project", &IPathManagerEx::getProjectPath},
            {"Projects", &IPathManagerEx::getProjectsPath},
            {"Template", &IPathManagerEx::getTemplatesPath},
            {"CurrentStatus", &IPathManagerEx::getCurrentStatusPath},
            {"StreamKey", &IPathManagerEx::getStreamKeyPath},
            {"SystemSetting", &IPathManagerEx::getSystemSettingPath},
            {"TitlerTemplate", &IPathManagerEx::getTitlerTemplatesPath},
            {"Movie", &IPathManagerEx::getMPMoviesPath},
            {"TitleImage", &IPathManagerEx::getTitleImagesPath},
            {"TitleResource", &IPathManagerEx::getTitleResourcesPath},
            {"Audio", &IPathManagerEx::getAudiosPath},
            {"Font", &IPathManagerEx::getFontsPath},
            {"VOD", &IPathManagerEx::getVODsPath},
            {"MXF", &IPathManagerEx::getMXFsPath},
            {"Logo", &IPathManagerEx::getLogosPath},
            {"Title", &IPathManagerEx::getTiltesPath},
            {"tmp", &IPathManagerEx::getTmpPath},
            {"Resource", &IPathManagerEx::getResourcesPath},
            {"Data", &IPathManagerEx::getDataPath},
        };
        return all;
    }

    QString base() const { return m_folder->path() + "/defaultuser/"; }

    void writePathFile(const QByteArray& bytes) { put((base() + "PathInfo.xml").toStdString(), bytes); }

    static void put(const std::string& file, const QByteArray& bytes)
    {
        QFile out(QString::fromStdString(file));
        if (!out.open(QIODevice::WriteOnly) || out.write(bytes) != bytes.size())
            qFatal("cannot write %s", file.c_str());
    }

    static QByteArray get(const QString& file)
    {
        QFile in(file);
        return in.open(QIODevice::ReadOnly) ? in.readAll() : QByteArray();
    }

    std::unique_ptr<QTemporaryDir> m_folder;
};

QTEST_GUILESS_MAIN(tst_pathmanagerex)
#include "tst_pathmanagerex.moc"
