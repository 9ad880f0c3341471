// Titles on disk: the archive manager, its facade for the widgets, and the remembered settings.
#include "document/Archive.h"
#include "document/ArchiveController.h"
#include "document/ArchiveManager.h"
#include "document/ArchiveOrder.h"
#include "document/CanvasController.h"
#include "document/FontStyle.h"
#include "document/LastSettingParser.h"
#include "document/SettingManager.h"
#include "document/TText.h"
#include "support/FileSyncQueue.h"
#include "support/IPathManagerEx.h"
#include "tests/fakes/FakeTitleChangeReporter.h"
#include "tests/support/LogFixture.h"
#include "tests/support/SettledFolder.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <QtTest/QTest>
#include <filesystem>
#include <fstream>
#include <memory>

class tst_archivemanager : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        m_root = std::make_unique<QTemporaryDir>();
        QVERIFY(m_root->path().size() < 90);
        qputenv("K2SYS_AC_DATA", m_root->path().toUtf8());
        qputenv("K2SYS_AC_ROOT", "");
        QVERIFY(QDir(m_root->path()).mkpath("defaultuser/titles/新闻 é"));
        write(base("PathInfo.xml"), "<p><TitleResource path=\"titles\"/><SystemSetting path=\"settings\"/>"
                                    "<Template path=\"templates\"/><TitlerTemplate path=\"usertemplates\"/>"
                                    "<Font path=\"fonts\"/></p>");
        m_folder = base("titles/新闻 é");
    }

    void cleanup()
    {
        QVERIFY(FileSyncQueue::flush(std::chrono::seconds(30)));
        ArchiveManager::cleanUp();
        IPathManagerEx::clearUp();
    }

    void rootAndFolders()
    {
        ArchiveManager* const manager = ArchiveManager::getInstance();
        QCOMPARE(manager, ArchiveManager::getInstance());
        QCOMPARE(manager->getTitleRootFolderPath(), base("titles").toStdString());
        QVERIFY(QDir(base("titles")).mkdir(".hidden"));
        QCOMPARE(manager->getArchiveFolderList(), std::vector<std::string>{m_folder.toStdString()});
        makeTitle("a");
        manager->createNewOrderXML(m_folder.toStdString());
        const auto all = manager->getAllArchives();
        QCOMPARE(all.size(), std::size_t(1));
        QCOMPARE(all[0]->getName(), std::string("a"));
        qDeleteAll(all);
        ArchiveController controller;
        QCOMPARE(controller.getFolderList(), QList<std::string>{m_folder.toStdString()});
        QVERIFY(controller.getArchiveList("").isEmpty());
    }

    void saveAndLoad()
    {
        ArchiveManager* const manager = ArchiveManager::getInstance();
        Archive archive;
        archive.setPath(file("a.xml").toStdString());
        QCOMPARE(manager->saveArchive("", &archive), 0);
        QCOMPARE(manager->saveArchive("x", nullptr), 0);
        QCOMPARE(manager->saveArchive(static_cast<Archive*>(nullptr)), 0);
        QVERIFY(!QFile::exists(file("a.xml")));
        QCOMPARE(manager->saveArchive("anything", &archive), 1);
        QVERIFY(QFile::exists(file("a.xml")));
        Archive empty;
        QCOMPARE(manager->saveArchive(&empty), 0);
        QCOMPARE(manager->saveArchive("path", &empty), 0);
        QCOMPARE(manager->saveArchive(&archive), 1);

        Archive loaded;
        QCOMPARE(manager->loadArchive(archive.getPath(), nullptr), 0);
        QCOMPARE(manager->loadArchive(archive.getPath(), &loaded), 1);
        QCOMPARE(loaded.getOrder(), std::string(1, '\xff'));
        QVERIFY(loaded.getName().empty());
        setOrder({"b.xml", "a.xml", "gone.xml", "a.xml"});
        QCOMPARE(manager->loadArchive(archive.getPath(), &loaded), 1);
        QCOMPARE(loaded.getOrder(), std::string("2"));
        QCOMPARE(manager->loadArchive(file("gone.xml").toStdString(), &loaded), 0);
        QCOMPARE(loaded.getOrder(), std::string("3"));
        QCOMPARE(manager->loadArchive("no-slash", &loaded), 0);
        QCOMPARE(manager->modifyProp(KeyDefine::TITLE_PROP_GAIN, archive.getPath(), "8"), 1);
        QCOMPARE(manager->modifyClip(archive.getPath(), "7"), 1);
        QCOMPARE(manager->modifyDensity(archive.getPath(), "9"), 1);
        QCOMPARE(manager->modifyGain(file("gone.xml").toStdString(), "9"), 0);
        QCOMPARE(manager->loadArchive(archive.getPath(), &loaded), 1);
        QCOMPARE(loaded.getClip() + loaded.getGain() + loaded.getDensity(), std::string("789"));
    }

    void deleteTakesThePicturesBesideTheTitle()
    {
        makeTitle("a");
        for (const char* name : {"a_1920.png", "a_960.png", "a_240.png", "a_240S.png", "a_source_1280.png",
                                 "a_source_1920.png", "other.png"})
            write(file(name), "picture");
        const QString shared = base("shared.png");
        write(shared, "template");
        Archive archive;
        ArchiveManager* const manager = ArchiveManager::getInstance();
        QCOMPARE(manager->deleteArchive(file("a.xml").toStdString()), 1);
        QCOMPARE(entries(), QStringList{"other.png"});

        makeTitle("b", shared.toStdString());
        QCOMPARE(manager->deleteArchive(file("b.xml").toStdString()), 1);
        QVERIFY(QFile::exists(shared));
        write(file("c.xml"), "<broken");
        QCOMPARE(manager->deleteArchive(file("c.xml").toStdString()), 0);
        QVERIFY(QFile::exists(file("c.xml")));
        QCOMPARE(manager->deleteArchive(file("none.xml").toStdString()), 0);
        ArchiveController controller;
        QVERIFY(!controller.deleteArchive(""));
        QVERIFY(!controller.deleteArchive(file("c.xml")));
    }

    void deleteTakesNothingElse()
    {
        makeTitle("kept");
        write(file("kept_1920.png"), "picture");
        QVERIFY(QDir(m_folder).mkpath("sub"));
        const QString outside = base("outside.png");
        write(outside, "of another folder");
        Archive archive;
        archive.setPath(file("foreign.xml").toStdString());
        archive.setThumbnailBig("../" + QFileInfo(m_folder).fileName().toStdString() + "/kept_1920.png");
        archive.setThumbnailMiddle("kept.xml");
        archive.setThumbnailBlack(".order.xml");
        archive.setThumbnailSmall(QDir(m_folder).relativeFilePath(outside).toStdString());
        archive.setBgResource("sub/");
        archive.setBgResourceBig("..");
        ArchiveManager* const manager = ArchiveManager::getInstance();
        QCOMPARE(manager->saveArchive(&archive), 1);
        QVERIFY(FileSyncQueue::flush(std::chrono::seconds(30)));
        setOrder({"kept.xml"});
        ArchiveController().deleteUnusefulArchives(m_folder);
        QCOMPARE(entries(), QStringList({".order.xml", "kept.xml", "kept_1920.png", "sub"}));
        QVERIFY(QFile::exists(outside));
        QVERIFY(QFileInfo(file("sub")).isDir());
    }

    void orderRowsStayInTheirFolder()
    {
        makeTitle("kept");
        QVERIFY(QDir(m_root->path()).mkpath("elsewhere"));
        QVERIFY(QFile::copy(file("kept.xml"), m_root->filePath("elsewhere/foreign.xml")));
        QVERIFY(QDir(m_root->path()).mkpath("defaultuser/titles/other"));
        QVERIFY(QFile::copy(file("kept.xml"), base("titles/other/next.xml")));
        QVERIFY(QFile::link(m_root->filePath("elsewhere/foreign.xml"), file("link.xml")));
        QVERIFY(QFile::link(m_root->filePath("elsewhere"), file("sub")));
        QVERIFY(QFile::link(base("titles/other/next.xml"), file("inside.xml")));
        setOrder({"../../../elsewhere/foreign.xml", "link.xml", "kept.xml", "sub/foreign.xml",
                  "../other/next.xml", "inside.xml"});
        const QList<Archive*> titles = ArchiveController().getArchiveList(m_folder);
        QStringList names;
        for (const Archive* title : titles)
            names.append(QString::fromStdString(title->getName()));
        qDeleteAll(titles);
        QCOMPARE(names, QStringList({"kept", "inside"}));
        // With a row that is too short for a title the list is read in another way.
        setOrder({"x", "../../../elsewhere/foreign.xml", "kept.xml"});
        const QList<Archive*> others = ArchiveController().getArchiveList(m_folder);
        QCOMPARE(others.size(), 1);
        qDeleteAll(others);
    }

    void picturesStayBelowTheRoots_data()
    {
        QTest::addColumn<QString>("name");
        QTest::addColumn<bool>("isOurs");
        QTest::newRow("beside the title") << "bg.png" << true;
        QTest::newRow("nothing yet") << "later.png" << true;
        QTest::newRow("in a folder below") << "sub/bg.png" << true;
        QTest::newRow("of another folder") << "../other/bg.png" << true;
        QTest::newRow("of a preset") << "%1/templates/bg.png" << true;
        QTest::newRow("of a user template") << "%1/usertemplates/T/bg.png" << true;
        QTest::newRow("a link to a preset") << "preset.png" << true;
        QTest::newRow("outside") << "%1/outside.png" << false;
        QTest::newRow("outside, climbing") << "../../outside.png" << false;
        QTest::newRow("outside, from a root") << "%1/templates/../outside.png" << false;
        QTest::newRow("outside, with a like name") << "%1/titles2/bg.png" << false;
        QTest::newRow("outside, by a link") << "link.png" << false;
        QTest::newRow("a link to nothing") << "dangling.png" << false;
        QTest::newRow("in a folder that is a link") << "linked/outside.png" << false;
        QTest::newRow("a root") << "%1/titles" << false;
        QTest::newRow("the system's") << "/etc/passwd" << false;
    }

    void picturesStayBelowTheRoots()
    {
        QFETCH(QString, name);
        QFETCH(bool, isOurs);
        name.replace("%1", base("").chopped(1));
        for (const char* folder : {"templates", "usertemplates/T", "titles/other", "titles2"})
            QVERIFY(QDir(base("")).mkpath(folder));
        QVERIFY(QDir(m_folder).mkpath("sub"));
        for (const QString& picture :
             {file("bg.png"), file("sub/bg.png"), base("titles/other/bg.png"), base("templates/bg.png"),
              base("usertemplates/T/bg.png"), base("outside.png"), base("titles2/bg.png")})
            write(picture, "picture");
        QVERIFY(QFile::link(base("outside.png"), file("link.png")));
        QVERIFY(QFile::link(base("nothing.png"), file("dangling.png")));
        QVERIFY(QFile::link(base("templates/bg.png"), file("preset.png")));
        QVERIFY(QFile::link(base(""), file("linked")));
        Archive source;
        source.setPath(file("t.xml").toStdString());
        source.setThumbnailSmall(name.toStdString());
        source.setThumbnailBig(name.toStdString());
        source.setThumbnailMiddle(name.toStdString());
        source.setThumbnailBlack(name.toStdString());
        source.setBgResource(name.toStdString());
        source.setBgResourceBig(name.toStdString());
        QCOMPARE(!source.getFullPathOfThumbnailSmall().isNull(), isOurs);
        QCOMPARE(!source.getFullPathOfBgResource().isNull(), isOurs);
        QCOMPARE(!source.getFullPathOfBgResourceBig().isNull(), isOurs);
        // The picture is not copied into the folder of another title, either.
        Archive target;
        target.setPath(base("titles/other/copy.xml").toStdString());
        target.setThumbnailSmall("small.png");
        target.setThumbnailBig("big.png");
        target.setThumbnailMiddle("middle.png");
        target.setThumbnailBlack("black.png");
        target.setBgResource("one.png");
        target.setBgResourceBig("two.png");
        ArchiveController().copyArchiveThumbnail(&source, &target);
        ArchiveController().copyArchiveBg(&source, &target);
        const bool isCopied = isOurs && name != "later.png";
        for (const char* copy : {"one.png", "two.png"})
            QCOMPARE(QFile::exists(base("titles/other/") + copy), isCopied);
        for (const char* copy :
             {"small.png", "big.png", "middle.png", "black.png"}) // always beside the title
            QCOMPARE(QFile::exists(base("titles/other/") + copy), isCopied && !name.startsWith('/'));
    }

    void namesOfPictures()
    {
        for (const char* name :
             {"t_1920.png", "t.jpg", "no extension", ".hidden.png", "xml", "a.xml.png", "片.png"})
            QVERIFY2(ArchiveManager::isPictureName(name), name);
        for (const char* name :
             {"", "/", "a/b.png", "../b.png", "..//", "t.xml", "T.XmL", ".xml", ".order.xml"})
            QVERIFY2(!ArchiveManager::isPictureName(name), name);
        QVERIFY(!ArchiveManager::isPictureName(std::string("t.xml\0.png", 10)));
    }

    void theFolderOutlivesItsLastTitle()
    {
        Archive archive; // without picture names
        archive.setPath(file("last.xml").toStdString());
        ArchiveManager* const manager = ArchiveManager::getInstance();
        QCOMPARE(manager->saveArchive(&archive), 1);
        QVERIFY(FileSyncQueue::flush(std::chrono::seconds(30)));
        QCOMPARE(manager->deleteArchive(archive.getPath()), 1);
        QVERIFY(QFileInfo(m_folder).isDir());
        QCOMPARE(entries(), QStringList());
    }

    void newOrderFiles()
    {
        ArchiveManager* const manager = ArchiveManager::getInstance();
        QCOMPARE(manager->setArchivesSortUnderFolder("", {}), 0);
        QCOMPARE(manager->createNewOrderXML(m_folder.toStdString()), 1);
        QVERIFY(read(file(".order.xml")).contains("index-count=\"0\""));
        makeTitle("标题");
        write(file("b.XML"), "x");
        write(file("c.xml.bak"), "x");
        write(file("d.xml.XML"), "x");
        QCOMPARE(manager->createNewOrderXML(m_folder.toStdString()), 1);
        auto rows = manager->getArchivesSortUnderFolder(m_folder.toStdString());
        QStringList names;
        for (const ArchiveOrder* row : rows) {
            QCOMPARE(row->getArchiveIndex(), int(names.size()));
            names.append(QString::fromStdString(row->getArchivePath()));
        }
        names.sort();
        QCOMPARE(names, QStringList({"d.xml.XML", "标题.xml"}));
        qDeleteAll(rows);
        QCOMPARE(manager->getFileListUnderFolder(m_folder.toStdString()).size(), std::size_t(4));
        QCOMPARE(manager->checkFilesUnderFolder(m_folder.toStdString()), 0);
        write(file(".order.xml"), "<m><index value=\"0\"/></m>");
        QCOMPARE(manager->checkFilesUnderFolder(m_folder.toStdString()), 1);
        QCOMPARE(manager->checkFilesUnderFolder(m_folder.toStdString()), 0);
        QVERIFY(read(file(".order.xml")).contains("标题.xml"));
    }

    void lastPaths()
    {
        ArchiveController controller;
        QVERIFY(controller.getLastFolderPath().isEmpty());
        QCOMPARE(controller.setLastFolderPath(m_folder), 1);
        QCOMPARE(controller.setLastArchivePath(file("😀.xml")), 1);
        QCOMPARE(controller.getLastFolderPath(), m_folder);
        QCOMPARE(controller.getLastArchivePath(), file("😀.xml"));
        QCOMPARE(read(base("settings/TitlerLastPathSetting.xml")),
                 QString("<?xml version=\"1.0\" encoding=\"utf-8\" ?>\n<manifest type=\"last-setting\">\n"
                         "    <lastfolder path=\"%1\" />\n    <lastarchive path=\"%2\" />\n</manifest>\n")
                     .arg(m_folder, file("😀.xml"))
                     .toUtf8());
    }

    void lastSettings()
    {
        const QString name = m_folder + "/TitlerLastPathSetting.xml";
        LastSettingParser parser(m_folder.toStdString());
        QCOMPARE(parser.getTempAttribute("e", "a"), std::string());
        QVERIFY(parser.editTempFile("last-template", "path", "one"));
        QVERIFY(read(name).contains("type=\"last-setting\""));
        QVERIFY(parser.editTempFile("other", "path", "t&w\"o"));
        QCOMPARE(parser.getTempAttribute("last-template", "path"), std::string("one"));
        QCOMPARE(parser.getTempAttribute("other", "path"), std::string("t&w\"o"));
        QCOMPARE(parser.getTempAttribute("other", "missing"), std::string());
        QCOMPARE(parser.getTempAttribute("missing", "path"), std::string());
        const QByteArray whole = read(name);
        for (qsizetype size = 0; size < whole.size() - 1; ++size) {
            write(name, whole.left(size));
            QCOMPARE(parser.getTempAttribute("other", "path"), std::string());
        }
        write(name, "<torn");
        QVERIFY(parser.editTempFile("new", "path", "three"));
        QCOMPARE(parser.getTempAttribute("new", "path"), std::string("three"));
        QCOMPARE(parser.getTempAttribute("other", "path"), std::string());
        write(name, "<?xml version=\"1.0\" ?>");
        QVERIFY(!parser.editTempFile("new", "path", "four"));
        QVERIFY(!LastSettingParser("/no/such/folder").editTempFile("e", "a", "v"));
        // Without a settings folder there is no file.
        QVERIFY(QFile::remove(base("PathInfo.xml")));
        IPathManagerEx::clearUp();
        QVERIFY(!LastSettingParser("").editTempFile("e", "a", "v"));
        QCOMPARE(LastSettingParser("").getTempAttribute("e", "a"), std::string());
    }

    void textStyle()
    {
        SettingManager manager;
        FontStyle style;
        style.setSize(50);
        QCOMPARE(manager.loadLastTextParameter(&style), 0);
        QCOMPARE(style.getSize(), 50);
        QCOMPARE(manager.loadLastTextParameter(nullptr), 0);
        QCOMPARE(manager.saveLastTextParameter(nullptr), 0);
        QCOMPARE(manager.resetTextParameter(), 1);
        const QString name = base("settings/TitlerFontPropertySetting.xml");
        QCOMPARE(read(name),
                 QByteArray(
                     "<?xml version=\"1.0\" encoding=\"utf-8\" ?>\n<manifest type=\"setting\">\n"
                     "    <font-style family=\"KST\" size=\"96\" color=\"#FFFFFF\" bold=\"0\" italic=\"0\" "
                     "kerning=\"100\" align=\"-1\" shadow=\"0\" shadow-color=\"#123123\" "
                     "shadow-direction-x=\"0\" shadow-direction-y=\"0\" shadow-blur-radius=\"18\" edge=\"0\" "
                     "edge-width=\"2\" edge-color=\"#000000\" />\n</manifest>\n"));
        style.setFamily("字体 é");
        style.setColor("#010203");
        style.setBold(1);
        style.setItalic(1);
        style.setKerning(-20);
        style.setAlign(1);
        style.setShadowStyle(3);
        style.getShadowPoint()->setShadowColor("#0000ff");
        style.getShadowPoint()->setShadowDirectionX(-4);
        style.getShadowPoint()->setShadowDirectionY(5);
        style.getShadowPoint()->setShadowBlurRadius(6.9);
        style.setEdge(1);
        style.getEdgePoint()->setEdgeWidth(8);
        style.getEdgePoint()->setEdgeColor("#00ff00");
        QCOMPARE(manager.saveLastTextParameter(&style), 1);
        FontStyle loaded;
        QCOMPARE(CanvasController().getTextStyle(&loaded), 1);
        QCOMPARE(loaded.getFamily(), std::string("字体 é"));
        QCOMPARE(loaded.getSize(), 50);
        QCOMPARE(loaded.getColor(), std::string("#010203"));
        QCOMPARE(loaded.getBold() + loaded.getItalic() + loaded.getAlign() + loaded.getEdge(), 4);
        QCOMPARE(loaded.getKerning(), -20);
        QCOMPARE(loaded.getShadowStyle(), 3);
        QCOMPARE(loaded.getShadowPoint()->getShadowColor(), std::string("#0000ff"));
        QCOMPARE(loaded.getShadowPoint()->getShadowDirectionX(), -4);
        QCOMPARE(loaded.getShadowPoint()->getShadowDirectionY(), 5);
        QCOMPARE(loaded.getShadowPoint()->getShadowBlurRadius(), 6.0);
        QCOMPARE(loaded.getEdgePoint()->getEdgeWidth(), 8);
        QCOMPARE(loaded.getEdgePoint()->getEdgeColor(), std::string("#00ff00"));

        const QByteArray whole = read(name);
        for (qsizetype size = 0; size < whole.size() - 1; ++size) {
            write(name, whole.left(size));
            FontStyle untouched;
            QCOMPARE(manager.loadLastTextParameter(&untouched), 0);
            QCOMPARE(untouched.getSize(), 96);
        }
        write(name, "<m><font-style shadow-blur-radius=\"18.3\"/></m>");
        QCOMPARE(manager.loadLastTextParameter(&loaded), 1);
        QCOMPARE(loaded.getSize(), 0);
        QVERIFY(loaded.getFamily().empty() && loaded.getColor().empty());
        QCOMPARE(loaded.getShadowPoint()->getShadowBlurRadius(), 18.0);
        write(name, "<m><other/></m>");
        FontStyle untouched;
        QCOMPARE(manager.loadLastTextParameter(&untouched), 0);
        QCOMPARE(untouched.getSize(), 96);
        QCOMPARE(QString::fromStdWString(manager.getImportFontsPath()), base("fonts"));
    }

    void controllersSayHowASaveWent()
    {
        Archive archive;
        archive.setPath(file("a.xml").toStdString());
        ArchiveController controller;
        QVERIFY(!controller.saveNewArchive("", &archive));
        QVERIFY(!controller.saveNewArchive(QString(), &archive));
        QVERIFY(!controller.saveNewArchive("x", nullptr));
        m_log.takeDebugLines();
        QVERIFY(controller.saveNewArchive("x", &archive));
        Archive empty;
        QVERIFY(!controller.saveNewArchive("x", &empty));
        CanvasController canvas;
        canvas.saveArchiveChange("x", &archive);
        canvas.saveArchiveChange("x", nullptr);
        canvas.saveArchiveChange("", nullptr);
        QCOMPARE(m_log.takeDebugLines(),
                 QStringList({"[ArchiveController] 200: Save new Archive Success !",
                              "[ArchiveController] 200: Save new Archive Path is invalid !",
                              "[CanvasController] 200: Save Archive Success !",
                              "[CanvasController] 200: Path is invalid !"}));
        Archive loaded;
        QVERIFY(controller.getOneArchive(file("a.xml"), &loaded));
        QVERIFY(!controller.getOneArchive(file("b.xml"), &loaded));
        setOrder({"a.xml"});
        const QList<Archive*> titles = controller.getArchiveList(m_folder);
        QCOMPARE(titles.size(), 1);
        qDeleteAll(titles);
        setOrder({"a.x"});
        QVERIFY(controller.getArchiveList(m_folder).isEmpty());
        // A row that cannot be a title does not hide the others.
        setOrder({"a.x", "a.xml", ""});
        const QList<Archive*> others = controller.getArchiveList(m_folder);
        QCOMPARE(others.size(), 2);
        QCOMPARE(others[0]->getName(), std::string("a"));
        QCOMPARE(others[0]->getOrder(), std::string("2"));
        QVERIFY(others[1]->getPath().empty());
        qDeleteAll(others);
    }

    void orderRows()
    {
        ArchiveController controller;
        ArchiveOrder a, b;
        a.setArchiveIndex(0);
        a.setArchivePath("b.xml");
        b.setArchiveIndex(1);
        b.setArchivePath("a.xml");
        QVERIFY(!controller.saveArchiveListOrder("", {&a}));
        QVERIFY(controller.saveArchiveListOrder(m_folder, {&a, nullptr, &b}));
        const auto rows = controller.getFileOrder(m_folder);
        QCOMPARE(rows.size(), std::size_t(2));
        QVERIFY(controller.getFileOrder(m_folder + "/none").empty());
        QCOMPARE(rows[0]->getArchivePath(), std::string("b.xml")); // not changed
        QCOMPARE(controller.getTargetFileList(rows, "/f"),
                 std::vector<std::string>({"/f/b.xml", "/f/a.xml"}));
        QCOMPARE(controller.getDeletedFileList(
                     {"/f/a.xml", "/f/c.xml", "/f/.order.xml", "/f/D.XML", "/f/e.xml.bak"}, {"/f/a.xml"}),
                 std::vector<std::string>({"/f/c.xml", "/f/D.XML"}));
    }

    void copiesPictures()
    {
        QVERIFY(QDir(base("titles")).mkdir("to"));
        Archive from, to;
        from.setPath(file("a.xml").toStdString());
        to.setPath(base("titles/to/b.xml").toStdString());
        from.setBgResource("a_1280.png");
        from.setBgResourceBig("a_big.png");
        from.setThumbnailBig("a_1920.png");
        from.setThumbnailMiddle("a_960.png");
        from.setThumbnailBlack("a_240S.png");
        to.setBgResource("b_1280.png");
        to.setBgResourceBig("b_big.png");
        to.setThumbnailBig("b_1920.png");
        to.setThumbnailMiddle("b_960.png");
        to.setThumbnailBlack("b_240S.png");
        for (const char* name : {"a_1280.png", "a_big.png", "a_1920.png", "a_960.png", "a_240S.png"})
            write(file(name), name);
        write(base("titles/to/b_1920.png"), "old");
        ArchiveController controller;
        QCOMPARE(controller.copyArchiveBg(&from, &to), 1);
        QCOMPARE(read(base("titles/to/b_1280.png")), QByteArray("a_1280.png"));
        QCOMPARE(read(base("titles/to/b_big.png")), QByteArray("a_big.png"));
        QCOMPARE(controller.copyArchiveThumbnail(&from, &to), 1);
        QCOMPARE(read(base("titles/to/b_1920.png")), QByteArray("a_1920.png"));
        QCOMPARE(read(base("titles/to/b_960.png")), QByteArray("a_960.png"));
        QCOMPARE(read(base("titles/to/b_240S.png")), QByteArray("a_240S.png"));
        QVERIFY(FileSyncQueue::flush(std::chrono::seconds(30)));
        QCOMPARE(
            QDir(base("titles/to")).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot).size(),
            5);
    }

    void freeTemplateNames_data()
    {
        QTest::addColumn<QStringList>("rows");
        QTest::addColumn<QString>("expected");
        const auto full = [](int first, int last) {
            QStringList rows;
            for (int i = first; i <= last; ++i)
                rows.append(QString("UserTemplate_%1/Titler.xml").arg(i, 3, 10, QChar('0')));
            return rows;
        };
        QTest::newRow("none") << QStringList() << "UserTemplate_001";
        QTest::newRow("after the largest") << (full(1, 1) + full(3, 3)) << "UserTemplate_004";
        QTest::newRow("other names") << QStringList(
                                            {"News/Titler.xml", "usertemplate_007/Titler.xml",
                                             "UserTemplate_0012/Titler.xml", "UserTemplate_01/Titler.xml",
                                             "UserTemplate_abc/Titler.xml", "UserTemplate_000/Titler.xml",
                                             "UserTemplate_005", "UserTemplate_-09/Titler.xml"})
                                     << "UserTemplate_001";
        QTest::newRow("to 998") << full(1, 998) << "UserTemplate_999";
        QTest::newRow("gap at 1") << full(999, 999) << "UserTemplate_001";
        QTest::newRow("gap at 4") << (full(1, 3) + full(5, 6) + full(999, 999)) << "UserTemplate_004";
        QTest::newRow("997 numbers") << (full(1, 996) + full(999, 999)) << "UserTemplate_997";
        QTest::newRow("998 numbers") << (full(1, 997) + full(999, 999)) << "";
    }

    void freeTemplateNames()
    {
        QFETCH(QStringList, rows);
        QFETCH(QString, expected);
        setOrder(rows);
        m_log.takeOperations();
        ArchiveController controller;
        QCOMPARE(controller.getFreeNameInUserTemplate(m_folder), expected);
        const QStringList logged = m_log.takeOperations("T");
        const bool isAtMax = !rows.isEmpty() && rows.last().contains("999");
        QCOMPARE(logged.contains("300: getFreeNameInUserTemplate() Counter is Max."), isAtMax);
        QCOMPARE(logged.contains("400: getFreeNameInUserTemplate() reach INT_MAX. Exit."),
                 expected.isEmpty());
    }

    void ordersAreRebuiltOnlyWithoutRows()
    {
        ArchiveController controller;
        QVERIFY(!controller.createNewOrderAccordingToFilesUnderFolder(m_folder));
        QVERIFY(!QFile::exists(file(".order.xml")));
        makeTitle("a");
        makeTitle("b");
        QVERIFY(QDir(base("titles")).mkdir("empty"));
        QCOMPARE(controller.reCreateOrderXml(), QList<std::string>{m_folder.toStdString()});
        QCOMPARE(controller.getFileOrder(m_folder).size(), std::size_t(2));
        setOrder({"b.xml"});
        const QByteArray bytes = read(file(".order.xml"));
        QVERIFY(!controller.createNewOrderAccordingToFilesUnderFolder(m_folder));
        QCOMPARE(read(file(".order.xml")), bytes);
        write(file(".order.xml"), bytes.left(bytes.size() / 2));
        QVERIFY(controller.createNewOrderAccordingToFilesUnderFolder(m_folder));
        QCOMPARE(controller.getFileOrder(m_folder).size(), std::size_t(2));
    }

    // Such a name would make the order file unreadable, and hide all titles.
    void namesThatAreNotUtf8HideNothing()
    {
        ArchiveController controller;
        makeTitle("a");
        makeTitle("b");
        const std::string foreign = m_folder.toStdString() + "/caf\xE9.xml";
        QFile title(file("a.xml"));
        QVERIFY(title.open(QIODevice::ReadOnly));
        std::ofstream(foreign) << title.readAll().toStdString();
        QCOMPARE(controller.reCreateOrderXml(), QList<std::string>{m_folder.toStdString()});
        const QList<Archive*> titles = controller.getArchiveList(m_folder);
        QCOMPARE(titles.size(), 2);
        qDeleteAll(titles);
        // The file is not removed with the titles that the order does not list, either.
        setOrder({"b.xml"});
        controller.deleteUnusefulArchives(m_folder);
        QVERIFY(!QFile::exists(file("a.xml")));
        QVERIFY(std::filesystem::exists(foreign));
    }

    void uselessTitlesAreDeleted()
    {
        FakeTitleChangeReporter reporter;
        ArchiveController controller;
        controller.deleteUnusefulArchives(m_folder + "/none");
        for (const char* name : {"a", "b", "c"}) {
            makeTitle(name);
            write(file(QString(name) + "_1920.png"), "picture");
        }
        setOrder({"b.xml", "a.xml"});
        controller.deleteUnusefulArchives(m_folder);
        QCOMPARE(entries(), QStringList({".order.xml", "a.xml", "a_1920.png", "b.xml", "b_1920.png"}));
        QCOMPARE(reporter.takePaths(), (QList<std::pair<int, QString>>{{2, file("c.xml")}}));
        // Two mismatches that balance each other out go unnoticed.
        setOrder({"b.xml", "gone.xml"});
        controller.deleteUnusefulArchives(m_folder);
        QVERIFY(QFile::exists(file("a.xml")));
        setOrder({});
        controller.deleteUnusefulArchives(m_folder);
        QCOMPARE(entries(), QStringList{".order.xml"});
        QCOMPARE(reporter.take().size(), 2);
    }

    void deletionWithoutAListener()
    {
        QVERIFY(!ITitleChangeReporter::instance());
        makeTitle("a");
        setOrder({});
        ArchiveController().deleteUnusefulArchives(m_folder);
        QCOMPARE(entries(), QStringList{".order.xml"});
    }

private:
    QString base(const QString& name) const { return m_root->path() + "/defaultuser/" + name; }
    QString file(const QString& name) const { return m_folder + '/' + name; }

    void makeTitle(const std::string& name, const std::string& bgResource = {})
    {
        Archive archive;
        archive.setPath(file(QString::fromStdString(name) + ".xml").toStdString());
        archive.setThumbnailBig(name + "_1920.png");
        archive.setThumbnailMiddle(name + "_960.png");
        archive.setThumbnailSmall(name + "_240.png");
        archive.setThumbnailBlack(name + "_240S.png");
        archive.setBgResource(bgResource.empty() ? name + "_source_1280.png" : bgResource);
        archive.setBgResourceBig(bgResource.empty() ? name + "_source_1920.png" : bgResource);
        QCOMPARE(ArchiveManager::getInstance()->saveArchive(&archive), 1);
        QVERIFY(FileSyncQueue::flush(std::chrono::seconds(30)));
    }

    void setOrder(const QStringList& names)
    {
        std::vector<ArchiveOrder> rows;
        for (const QString& name : names) {
            ArchiveOrder row;
            row.setArchiveIndex(int(rows.size()));
            row.setArchivePath(name.toStdString());
            rows.push_back(row);
        }
        QCOMPARE(ArchiveManager::getInstance()->setArchivesSortUnderFolder(m_folder.toStdString(), rows), 1);
    }

    QStringList entries() const { return settledEntries(m_folder); }

    static QByteArray read(const QString& name)
    {
        QFile in(name);
        return in.open(QIODevice::ReadOnly) ? in.readAll() : QByteArray();
    }

    static void write(const QString& name, const QByteArray& bytes)
    {
        QFile out(name);
        if (!out.open(QIODevice::WriteOnly) || out.write(bytes) != bytes.size())
            qFatal("cannot write %s", qPrintable(name));
    }

    LogFixture m_log;
    std::unique_ptr<QTemporaryDir> m_root;
    QString m_folder;
};

QTEST_GUILESS_MAIN(tst_archivemanager)
#include "tst_archivemanager.moc"
