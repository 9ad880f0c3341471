// Which paths count as lying below a folder, whatever they are written like and wherever links lead.
#include "LogFixture.h"

#include "support/ConfinedPath.h"
#include "support/IPathManagerEx.h"
#include "support/IXMLLoader.h"
#include "support/OwnerOnlyFiles.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <QtTest/QTest>
#include <sys/stat.h>

class tst_confinedpath : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        QVERIFY(QDir(m_root.path()).mkpath("defaultuser/titles/news"));
        QVERIFY(QDir(m_root.path()).mkpath("defaultuser/titles2"));
        QVERIFY(QDir(m_root.path()).mkpath("outside"));
        put("defaultuser/PathInfo.xml", "<p><TitleResource path=\"titles\"/></p>");
        put("defaultuser/titles/news/a.xml", "a");
        put("outside/b.xml", "b");
        link("outside", "defaultuser/titles/folder");
        link("outside/b.xml", "defaultuser/titles/news/file.xml");
        link("nothing", "defaultuser/titles/dangling");
        link("defaultuser/titles/loop", "defaultuser/titles/loop");
        link("defaultuser/titles/news", "defaultuser/titles/inside");
        link("defaultuser/titles", "root");
        qputenv("K2SYS_AC_DATA", m_root.path().toUtf8());
    }

    void init()
    {
        qputenv("K2SYS_AC_ROOT", "");
        IPathManagerEx::clearUp();
    }

    void cleanupTestCase()
    {
        IPathManagerEx::clearUp();
        IXMLLoader::cleanUp();
    }

    void below_data()
    {
        QTest::addColumn<QString>("folder");
        QTest::addColumn<QString>("path");
        QTest::addColumn<bool>("isBelow");
        const QString titles = QStringLiteral("%1/defaultuser/titles");
        const auto row = [&](const char* name, const QString& path, bool isBelow) {
            QTest::newRow(name) << titles << QString(path).replace("%2", titles) << isBelow;
        };
        row("file", "%2/news/a.xml", true);
        row("folder", "%2/news", true);
        row("with slashes", "%2//news///", true);
        row("with dots", "%2/./news/../news/a.xml", true);
        row("not there yet", "%2/later/more/c.xml", true);
        row("link within", "%2/inside/a.xml", true);
        row("from elsewhere by a link", "%1/root/news/a.xml", true);
        row("the folder itself", "%2", false);
        row("the folder itself, with a slash", "%2/", false);
        row("the folder itself, climbing", "%2/news/..", false);
        row("like name",
            "%2"
            "2/a.xml",
            false);
        row("outside", "%1/outside/b.xml", false);
        row("climbing", "%2/news/../../../outside/b.xml", false);
        row("climbing from what is not there", "%2/later/../../outside/b.xml", false);
        row("linked folder", "%2/folder", false);
        row("in a linked folder", "%2/folder/b.xml", false);
        row("back from a linked folder", "%2/folder/../news/a.xml", false);
        row("linked file", "%2/news/file.xml", false);
        row("link to nothing", "%2/dangling", false);
        row("below a link to nothing", "%2/dangling/c.xml", false);
        row("link to itself", "%2/loop", false);
        row("below a file", "%2/news/a.xml/b", false);
        row("nothing", QString(), false);
        row("root of the system", "/", false);
        row("NUL", QStringLiteral("%2/news") + QChar(u'\0') + QStringLiteral("/a.xml"), false);
        row("too long", "%2/" + QString(5000, 'x'), false);
        QTest::newRow("below the root of the system") << "/"
                                                      << "%1/outside" << true;
        QTest::newRow("not there, below the root of the system") << "/"
                                                                 << "/no such folder of the test" << true;
        QTest::newRow("folder that is a link") << "%1/root"
                                               << "%1/defaultuser/titles/news" << true;
        QTest::newRow("folder that is not there") << "%1/later"
                                                  << "%1/later/a" << true;
        QTest::newRow("no folder") << QString() << "%1/outside/b.xml" << false;
    }

    void below()
    {
        QFETCH(QString, folder);
        QFETCH(QString, path);
        QFETCH(bool, isBelow);
        QCOMPARE(ConfinedPath::isBelow(told(folder), told(path)), isBelow);
    }

    // Under the root "/" the appliance's own paths are not absolute; the process works in "/" then.
    void relativePaths()
    {
        const QString before = QDir::currentPath();
        QVERIFY(QDir::setCurrent("/"));
        const std::string root = m_root.path().toStdString().substr(1);
        QVERIFY(ConfinedPath::isBelow(root + "/defaultuser/titles", root + "/defaultuser/titles/news"));
        QVERIFY(ConfinedPath::isBelow(root + "/defaultuser/titles", told("%1/defaultuser/titles/news")));
        QVERIFY(!ConfinedPath::isBelow(root + "/defaultuser/titles", root + "/outside"));
        qputenv("K2SYS_AC_ROOT", "/");
        IPathManagerEx::clearUp();
        QVERIFY(ConfinedPath::isBelow(&IPathManagerEx::getTitleResourcesPath,
                                      told("%1/defaultuser/titles/news")));
        QVERIFY(!ConfinedPath::isBelow(&IPathManagerEx::getTitleResourcesPath, told("%1/outside/b.xml")));
        QVERIFY(QDir::setCurrent(before));
    }

    void foldersOfTheAppliance()
    {
        QVERIFY(ConfinedPath::isBelow(&IPathManagerEx::getTitleResourcesPath,
                                      told("%1/defaultuser/titles/news/a.xml")));
        QVERIFY(!ConfinedPath::isBelow(&IPathManagerEx::getTitleResourcesPath, told("%1/outside/b.xml")));
        // Not told of in the path file: nothing lies below it.
        QVERIFY(!ConfinedPath::isBelow(&IPathManagerEx::getTemplatesPath, told("%1/outside/b.xml")));
    }

    void aRefusalIsLoggedOnce()
    {
        LogFixture log;
        const std::string folder = told("%1/defaultuser/titles/news");
        for (int i = 0; i < 3; ++i) {
            QVERIFY(ConfinedPath::namedByTitle(folder, told("%1/outside/b.xml")).empty());
            QVERIFY(ConfinedPath::namedByOrder(folder, "../../../outside/b.xml").empty());
            QVERIFY(ConfinedPath::namedByOrder(folder, "").empty());
        }
        QCOMPARE(log.takeDebugLines("ConfinedPath"),
                 QStringList({"400: Refused, a title names what lies outside: " +
                                  QString::fromStdString(told("%1/outside/b.xml")),
                              "400: Refused, an order names what lies outside: " +
                                  QString::fromStdString(folder + "/../../../outside/b.xml")}));
    }

    void theUmaskIsOnlyNarrowed()
    {
        const mode_t before = ::umask(0);
        OwnerOnlyFiles::setUmask();
        const mode_t fromNone = ::umask(0077);
        OwnerOnlyFiles::setUmask();
        const mode_t fromNarrow = ::umask(before);
        QCOMPARE(int(fromNone), 0022);
        QCOMPARE(int(fromNarrow), 0077);
    }

private:
    std::string told(QString path) const { return path.replace("%1", m_root.path()).toStdString(); }

    void put(const QString& name, const QByteArray& bytes) const
    {
        QFile file(m_root.filePath(name));
        QVERIFY(file.open(QIODevice::WriteOnly));
        file.write(bytes);
    }

    void link(const QString& target, const QString& name) const
    {
        QVERIFY(QFile::link(m_root.filePath(target), m_root.filePath(name)));
    }

    QTemporaryDir m_root;
};

QTEST_GUILESS_MAIN(tst_confinedpath)
#include "tst_confinedpath.moc"
