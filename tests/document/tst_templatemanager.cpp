// The preset templates and the operator's own ones, on folders.
#include "document/Archive.h"
#include "document/ArchiveController.h"
#include "document/ArchiveManager.h"
#include "document/ArchiveOrder.h"
#include "document/TText.h"
#include "document/TemplateManager.h"
#include "document/UserTemplateManager.h"
#include "support/FileSyncQueue.h"
#include "support/IPathManagerEx.h"
#include "support/LogManager.h"

#include <QDateTime>
#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <QtTest/QTest>
#include <fcntl.h>
#include <iostream>
#include <memory>
#include <sstream>
#include <sys/fsuid.h>
#include <sys/stat.h>
#include <unistd.h>

namespace
{

// What is printed to standard output while this lives.
class PrintedText
{
public:
    PrintedText() : m_buffer(std::cout.rdbuf(m_text.rdbuf())) {}
    ~PrintedText() { std::cout.rdbuf(m_buffer); }
    std::string text() const { return m_text.str(); }

private:
    std::ostringstream m_text;
    std::streambuf* m_buffer;
};

// Takes the rights of the superuser over files from this thread, so that read-only folders are read-only.
class OrdinaryUser
{
public:
    OrdinaryUser() : m_previous(::setfsuid(65534)) {}
    ~OrdinaryUser() { ::setfsuid(static_cast<uid_t>(m_previous)); }

private:
    int m_previous;
};

std::vector<std::unique_ptr<Archive>> own(const std::vector<Archive*>& templates)
{
    return {templates.begin(), templates.end()};
}

QStringList namesOf(const std::vector<std::unique_ptr<Archive>>& templates)
{
    QStringList names;
    for (const auto& archive : templates)
        names.append(QString::fromStdString(archive->getName()));
    return names;
}

} // namespace

class tst_templatemanager : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        qputenv("K2SYS_LOG_DIR", m_logs.path().toUtf8());
        INIT_LOGGING(L"test");
    }

    void cleanupTestCase() { UNINIT_LOGGING(); }

    void init()
    {
        m_root = std::make_unique<QTemporaryDir>();
        QVERIFY(m_root->path().size() < 90);
        qputenv("K2SYS_AC_DATA", m_root->path().toUtf8());
        qputenv("K2SYS_AC_ROOT", "");
        QVERIFY(QDir(m_root->path()).mkpath("defaultuser/user é"));
        QVERIFY(QDir(m_root->path()).mkpath("defaultuser/presets/templates_en"));
        QVERIFY(QDir(m_root->path()).mkpath("defaultuser/presets/templates_chs"));
        write(base("PathInfo.xml"), "<p><Template path=\"presets\"/><TitlerTemplate path=\"user é\"/>"
                                    "<SystemSetting path=\"settings\"/><TitleResource path=\"titles\"/></p>");
        m_user = base("user é");
    }

    void cleanup()
    {
        QVERIFY(FileSyncQueue::flush(std::chrono::seconds(30)));
        TemplateManager::cleanUp();
        UserTemplateManager::cleanUp();
        ArchiveManager::cleanUp();
        IPathManagerEx::clearUp();
    }

    void presetsOfBothLanguages()
    {
        makePreset("templates_en", "lower");
        makePreset("templates_en", "strap");
        makePreset("templates_chs", "下三分之一");
        setOrder(base("presets/templates_en"), {"strap.xml", "gone.xml", "lower.xml"});
        setOrder(base("presets/templates_chs"), {"下三分之一.xml"});
        ITemplateManager* const manager = TemplateManager::getInstance();
        QCOMPARE(manager, TemplateManager::getInstance());
        {
            const PrintedText printed;
            const auto templates = own(manager->getTemplates(TEMPLATE_LANGUAGE_EN));
            QCOMPARE(namesOf(templates), QStringList({"strap", "lower"}));
            QCOMPARE(templates[1]->getOrder(), std::string("3"));
            QCOMPARE(templates[0]->getPath(), base("presets/templates_en/strap.xml").toStdString());
            QCOMPARE(printed.text(), "mTemplateRootFolder = " + base("presets").toStdString() + "\n");
        }
        const PrintedText printed;
        const QStringList chinese{"下三分之一"};
        QCOMPARE(namesOf(own(manager->getTemplates(TEMPLATE_LANGUAGE_CHS))), chinese);
        QCOMPARE(namesOf(own(manager->getTemplates(static_cast<emTemplateLanguage>(2)))), chinese);
        QCOMPARE(namesOf(own(manager->getTemplates(static_cast<emTemplateLanguage>(-1)))), chinese);
        QVERIFY(printed.text().empty());
    }

    void lastPresetIsKeptWithItsLanguage()
    {
        TemplateManager* const manager = TemplateManager::getInstance();
        QVERIFY(manager->loadLastTemplatePath().empty());
        QCOMPARE(manager->saveLastTemplatePath("/before/any.xml"), 1);
        QVERIFY(read(base("settings/TitlerLastPathSetting.xml")).contains("/before/any.xml"));
        const PrintedText printed;
        own(manager->getTemplates(TEMPLATE_LANGUAGE_EN));
        QVERIFY(manager->loadLastTemplatePath().empty());
        QCOMPARE(manager->saveLastTemplatePath("/en/é.xml"), 1);
        own(manager->getTemplates(TEMPLATE_LANGUAGE_CHS));
        QVERIFY(manager->loadLastTemplatePath().empty());
        QCOMPARE(manager->saveLastTemplatePath("/chs/一.xml"), 1);
        own(manager->getTemplates(TEMPLATE_LANGUAGE_EN));
        QCOMPARE(manager->loadLastTemplatePath(), std::string("/en/é.xml"));
        QVERIFY(
            read(base("presets/templates_en/TitlerLastPathSetting.xml")).contains("<last-template path="));
        TemplateManager::cleanUp();
        own(TemplateManager::getInstance()->getTemplates(TEMPLATE_LANGUAGE_CHS));
        QCOMPARE(TemplateManager::getInstance()->loadLastTemplatePath(), std::string("/chs/一.xml"));
    }

    void readOnlyPresets()
    {
        makePreset("templates_en", "lower");
        setOrder(base("presets/templates_en"), {"lower.xml"});
        const ReadOnlyTree tree(m_root->path());
        const PrintedText printed;
        TemplateManager* const manager = TemplateManager::getInstance();
        QCOMPARE(namesOf(own(manager->getTemplates(TEMPLATE_LANGUAGE_EN))), QStringList{"lower"});
        QCOMPARE(manager->saveLastTemplatePath("/x.xml"), 0);
        QVERIFY(manager->loadLastTemplatePath().empty());
    }

    void noFoldersAtAll()
    {
        write(base("PathInfo.xml"), "<p/>");
        const PrintedText printed;
        QVERIFY(TemplateManager::getInstance()->getTemplates(TEMPLATE_LANGUAGE_EN).empty());
        UserTemplateManager* const manager = UserTemplateManager::getInstance();
        QVERIFY(manager->getTemplates(TEMPLATE_LANGUAGE_EN).empty());
        QCOMPARE(manager->makeFolderList(), 0);
        QCOMPARE(manager->createNewOrderXml(), 0);
        QCOMPARE(manager->addNewTemplateToLastInOrderXml("a"), 1);
        Archive archive;
        QCOMPARE(manager->createNewTemplateXml("tmp", &archive), 0);
        QCOMPARE(manager->deleteTemplatePath("/tmp/Titler.xml"), 0);
        QVERIFY(!QFile::exists("/.order.xml"));
    }

    void aTemplateFolderThatIsAFile()
    {
        QVERIFY(QDir(m_user).removeRecursively());
        QVERIFY(QDir(base("presets")).removeRecursively());
        write(m_user, "no folder");
        write(base("presets"), "no folder");
        const PrintedText printed;
        QVERIFY(TemplateManager::getInstance()->getTemplates(TEMPLATE_LANGUAGE_EN).empty());
        UserTemplateManager* const manager = UserTemplateManager::getInstance();
        QCOMPARE(manager->makeFolderList(), 0);
        QVERIFY(printed.text().find("S16 folderPath not a directory.") != std::string::npos);
        manager->reCreateNewOrderXml();
        QVERIFY(manager->getTemplates(TEMPLATE_LANGUAGE_EN).empty());
        QCOMPARE(read(m_user), QByteArray("no folder"));
    }

    void userTemplatesAreOrderedByTime()
    {
        makeUserTemplate("young", 300);
        makeUserTemplate("old", 100);
        makeUserTemplate("middle", 200);
        QVERIFY(QDir(m_user).mkpath("no title file"));
        write(m_user + "/no title file/other.xml", "<a/>");
        write(m_user + "/file", "x");
        setOrder(m_user, {"gone/Titler.xml", "young/Titler.xml"});
        UserTemplateManager* const manager = UserTemplateManager::getInstance();
        QCOMPARE(manager, UserTemplateManager::getInstance());
        QCOMPARE(rows(), QStringList({"old/Titler.xml", "middle/Titler.xml", "young/Titler.xml"}));
        const auto english = own(manager->getTemplates(TEMPLATE_LANGUAGE_EN));
        const auto chinese = own(manager->getTemplates(TEMPLATE_LANGUAGE_CHS));
        QCOMPARE(namesOf(english), QStringList({"old/Titler", "middle/Titler", "young/Titler"}));
        QCOMPARE(namesOf(chinese), namesOf(english));
        QCOMPARE(english[1]->getPath(), userFile("middle/Titler.xml").toStdString());
    }

    // A file named after its folder passes the first check of an entry; only the title file passes the
    // second.
    void titleFileNamedAfterItsFolder()
    {
        makeUserTemplate("a", 100);
        QVERIFY(QDir(m_user).mkpath("named"));
        write(userFile("named/named.xml"), "<a/>");
        const PrintedText printed;
        QCOMPARE(UserTemplateManager::getInstance()->makeFolderList(), 1);
        QCOMPARE(printed.text(), std::string("ERROR ERROR.\nERROR ERROR.\n"));
        QCOMPARE(rows(), QStringList{"a/Titler.xml"});
    }

    void nanosecondsCount()
    {
        makeUserTemplate("b", 100);
        makeUserTemplate("a", 100);
        const timespec later[2] = {{100, 2}, {100, 2}};
        const timespec earlier[2] = {{100, 1}, {100, 1}};
        QCOMPARE(::utimensat(AT_FDCWD, qPrintable(userFile("a/Titler.xml")), later, 0), 0);
        QCOMPARE(::utimensat(AT_FDCWD, qPrintable(userFile("b/Titler.xml")), earlier, 0), 0);
        UserTemplateManager::getInstance();
        QCOMPARE(rows(), QStringList({"b/Titler.xml", "a/Titler.xml"}));
    }

    void renameAndMoveToTheEnd()
    {
        for (int i = 1; i <= 3; ++i)
            makeUserTemplate(QStringLiteral("t%1").arg(i), i);
        UserTemplateManager* const manager = UserTemplateManager::getInstance();
        const QByteArray before = read(userFile(".order.xml"));
        QCOMPARE(manager->renameInOrderXml("unknown", "x"), 0);
        QCOMPARE(manager->renameInOrderXml("t2", "../x"), 0);
        QCOMPARE(read(userFile(".order.xml")), before);
        QCOMPARE(manager->renameInOrderXml("t2", "新 & <\"名\">"), 1);
        QCOMPARE(rows(), QStringList({"t1/Titler.xml", "新 & <\"名\">/Titler.xml", "t3/Titler.xml"}));
        QCOMPARE(manager->addNewTemplateToLastInOrderXml("t1"), 1);
        QCOMPARE(rows(), QStringList({"新 & <\"名\">/Titler.xml", "t3/Titler.xml", "t1/Titler.xml"}));
        QCOMPARE(manager->addNewTemplateToLastInOrderXml("t4"), 1);
        QCOMPARE(rows().last(), QString("t4/Titler.xml"));
        QCOMPARE(rows().size(), 4);
        for (const char* name : {"", ".", "..", "a/b", "\xff"})
            QCOMPARE(manager->addNewTemplateToLastInOrderXml(name), 1);
        QCOMPARE(rows().size(), 4);
    }

    void takingOneOutOfTheOrder()
    {
        for (int i = 1; i <= 3; ++i)
            makeUserTemplate(QStringLiteral("t%1").arg(i), i);
        UserTemplateManager* const manager = UserTemplateManager::getInstance();
        QCOMPARE(manager->addNewTemplateToLastInOrderXml("t1"), 1); // by the files' times it is the first
        const QByteArray before = read(userFile(".order.xml"));
        for (const char* name : {"unknown", "", "t2/Titler.xml"})
            QCOMPARE(manager->removeFromOrderXml(name), 0);
        QCOMPARE(read(userFile(".order.xml")), before);
        QCOMPARE(manager->removeFromOrderXml("t2"), 1);
        QCOMPARE(rows(), QStringList({"t3/Titler.xml", "t1/Titler.xml"}));
        QCOMPARE(manager->removeFromOrderXml("t2"), 0);
    }

    void loadingATemplate()
    {
        makeUserTemplate("a", 100);
        UserTemplateManager* const manager = UserTemplateManager::getInstance();
        Archive archive;
        QCOMPARE(manager->loadTemplate("a", &archive), 1);
        QCOMPARE(archive.getName(), std::string("a"));
        QCOMPARE(archive.getPath(), userFile("a/Titler.xml").toStdString());
        QCOMPARE(archive.text().size(), std::size_t(1));
        Archive missing;
        QCOMPARE(manager->loadTemplate("gone", &missing), 0);
        QCOMPARE(missing.getName(), std::string("gone"));
        QCOMPARE(manager->loadTemplate("a", nullptr), 0);
    }

    void newTitleFileForImportedPictures_data()
    {
        QTest::addColumn<QStringList>("files");
        QTest::addColumn<QString>("extension");
        QTest::newRow("png") << QStringList{"Titler_240.png"} << ".png";
        QTest::newRow("upper case") << QStringList{"Titler_240.JPG"} << ".JPG";
        QTest::newRow("any extension") << QStringList{"a.b.text"} << ".text";
        QTest::newRow("none") << QStringList{"picture"} << "";
        QTest::newRow("empty folder") << QStringList() << "";
        QTest::newRow("name without stem") << QStringList{".tif"} << ".tif";
    }

    void newTitleFileForImportedPictures()
    {
        QFETCH(QStringList, files);
        QFETCH(QString, extension);
        UserTemplateManager* const manager = UserTemplateManager::getInstance();
        QVERIFY(QDir(m_user).mkpath("新 template"));
        for (const QString& name : files)
            write(userFile("新 template/" + name), "picture");
        Archive archive;
        QCOMPARE(manager->createNewTemplateXml("新 template", &archive), 1);
        const std::string end = extension.toStdString();
        QCOMPARE(archive.getName(), std::string("新 template"));
        QCOMPARE(archive.getPath(), userFile("新 template/Titler.xml").toStdString());
        QCOMPARE(archive.getThumbnailSmall(), "Titler_240" + end);
        QCOMPARE(archive.getBgResource(), "Titler_source_1280" + end);
        QCOMPARE(archive.getBgResourceBig(), "Titler_source_1920" + end);
        Archive read;
        QCOMPARE(manager->loadTemplate("新 template", &read), 1);
        QCOMPARE(read.getThumbnailSmall(), archive.getThumbnailSmall());
        QCOMPARE(read.getBgResource(), archive.getBgResource());
        QCOMPARE(read.getBgResourceBig(), archive.getBgResourceBig());
        QVERIFY(read.text().empty());
    }

    void importOverAName()
    {
        makeUserTemplate("used", 100);
        makeUserTemplate("other", 200);
        UserTemplateManager* const manager = UserTemplateManager::getInstance();
        Archive archive;
        const PrintedText printed;
        QCOMPARE(manager->createNewTemplateXml("used", &archive), 1);
        QCOMPARE(printed.text(),
                 "S16 File is already exist. " + userFile("used/Titler.xml").toStdString() + "\n");
        QCOMPARE(manager->addNewTemplateToLastInOrderXml("used"), 1);
        QCOMPARE(rows(), QStringList({"other/Titler.xml", "used/Titler.xml"}));
        Archive read;
        QCOMPARE(manager->loadTemplate("used", &read), 1);
        QVERIFY(read.text().empty());
    }

    void refusedImports()
    {
        UserTemplateManager* const manager = UserTemplateManager::getInstance();
        write(userFile("file"), "x");
        Archive archive;
        {
            const PrintedText printed;
            QCOMPARE(manager->createNewTemplateXml("gone", &archive), 0);
            QCOMPARE(printed.text(), "S16 folderPath not found. " + userFile("gone").toStdString() + "\n");
        }
        const PrintedText printed;
        QCOMPARE(manager->createNewTemplateXml("file", &archive), 0);
        QCOMPARE(printed.text(), "S16 folderPath not a directory. " + userFile("file").toStdString() + "\n");
        for (const char* name : {"", ".", "..", "../presets", "\xff"})
            QCOMPARE(manager->createNewTemplateXml(name, &archive), 0);
        QCOMPARE(manager->createNewTemplateXml("x", nullptr), 0);
        QVERIFY(archive.getPath().empty());
        QCOMPARE(QDir(m_user).entryList(QDir::Files), QStringList{"file"});
        QVERIFY(!QFile::exists(base("presets/Titler.xml")));
    }

    void deletingATemplate()
    {
        makeUserTemplate("a", 100);
        makeUserTemplate("b", 200);
        write(userFile("a/anything else"), "x");
        UserTemplateManager* const manager = UserTemplateManager::getInstance();
        QCOMPARE(manager->deleteTemplatePath(userFile("a/Titler.xml").toStdString()), 1);
        QCOMPARE(rows(), QStringList{"b/Titler.xml"});
        QVERIFY(!QFile::exists(userFile("a")));
        QCOMPARE(manager->deleteTemplatePath(userFile("a/Titler.xml").toStdString()), 0);
        QCOMPARE(rows(), QStringList{"b/Titler.xml"});
        // A folder whose title file cannot be read is removed, too; the result reports that.
        write(userFile("b/Titler.xml"), "<torn");
        QCOMPARE(manager->deleteTemplatePath(userFile("b//Titler.xml").toStdString()), 0);
        QVERIFY(!QFile::exists(userFile("b")));
        QVERIFY(rows().isEmpty());
        QVERIFY(QFile::exists(userFile(".order.xml")));
    }

    void deletionStaysInTheRoot()
    {
        makeUserTemplate("a", 100);
        makePreset("templates_en", "lower");
        write(base("outside.xml"), "<a/>");
        UserTemplateManager* const manager = UserTemplateManager::getInstance();
        for (const QString& path :
             {QString(), QString("Titler.xml"), QString("/Titler.xml"), userFile("Titler.xml"),
              userFile("a/../Titler.xml"), userFile("../outside.xml"), userFile("a/deeper/Titler.xml"),
              base("presets/templates_en/gone.xml"), userFile("..") + "/.."})
            QCOMPARE(manager->deleteTemplatePath(path.toStdString()), 0);
        QCOMPARE(rows(), QStringList{"a/Titler.xml"});
        QVERIFY(QFile::exists(base("outside.xml")));
        QVERIFY(QFile::exists(base("presets/templates_en/lower.xml")));
        QVERIFY(QFile::exists(userFile("a/Titler_240.png")));
    }

    void lastUserTemplate()
    {
        UserTemplateManager* const manager = UserTemplateManager::getInstance();
        QVERIFY(manager->loadLastTemplatePath().empty());
        QCOMPARE(manager->saveLastTemplatePath("/a/Titler.xml"), 1);
        QVERIFY(QFile::exists(userFile("TitlerLastPathSetting.xml")));
        QCOMPARE(manager->loadLastTemplatePath(), std::string("/a/Titler.xml"));
        const QByteArray bytes = read(userFile("TitlerLastPathSetting.xml"));
        for (qsizetype length = 0; length < bytes.size(); ++length) {
            write(userFile("TitlerLastPathSetting.xml"), bytes.left(length));
            const std::string path = manager->loadLastTemplatePath();
            QVERIFY2(path.empty() || path == "/a/Titler.xml", path.c_str());
        }
        write(userFile("TitlerLastPathSetting.xml"), bytes.left(bytes.size() / 2));
        QCOMPARE(manager->saveLastTemplatePath("/b/Titler.xml"), 1);
        QCOMPARE(manager->loadLastTemplatePath(), std::string("/b/Titler.xml"));
    }

    void everyTruncationOfATitleFile()
    {
        makeUserTemplate("a", 100);
        makeUserTemplate("torn", 200);
        makeUserTemplate("z", 300);
        UserTemplateManager* const manager = UserTemplateManager::getInstance();
        const QByteArray bytes = read(userFile("torn/Titler.xml"));
        int unreadable = 0;
        for (qsizetype length = 0; length < bytes.size(); ++length) {
            write(userFile("torn/Titler.xml"), bytes.left(length));
            const QStringList names = namesOf(own(manager->getTemplates(TEMPLATE_LANGUAGE_EN)));
            QCOMPARE(names.first(), QString("a/Titler"));
            QCOMPARE(names.last(), QString("z/Titler"));
            unreadable += names.size() == 2;
            Archive archive;
            manager->loadTemplate("torn", &archive);
            QCOMPARE(archive.getName(), std::string("torn"));
        }
        QVERIFY(unreadable > bytes.size() - 10);
        write(userFile("torn/Titler.xml"), bytes);
        QCOMPARE(own(manager->getTemplates(TEMPLATE_LANGUAGE_EN)).size(), std::size_t(3));
    }

    void everyTruncationOfAnOrderFile()
    {
        for (const char* name : {"a", "b", "c"})
            makeUserTemplate(name, 100);
        UserTemplateManager* const manager = UserTemplateManager::getInstance();
        const QStringList all = namesOf(own(manager->getTemplates(TEMPLATE_LANGUAGE_EN)));
        QCOMPARE(all.size(), 3);
        const QByteArray bytes = read(userFile(".order.xml"));
        for (qsizetype length = 0; length < bytes.size(); ++length) {
            write(userFile(".order.xml"), bytes.left(length));
            const QStringList names = namesOf(own(manager->getTemplates(TEMPLATE_LANGUAGE_EN)));
            QVERIFY(names.isEmpty() || names == all);
        }
        // The names are still known, so that the next change writes a whole file.
        QCOMPARE(manager->createNewOrderXml(), 1);
        QCOMPARE(read(userFile(".order.xml")), bytes);
        QVERIFY(QFile::remove(userFile(".order.xml")));
        QVERIFY(own(manager->getTemplates(TEMPLATE_LANGUAGE_EN)).empty());
        UserTemplateManager::cleanUp();
        QCOMPARE(namesOf(own(UserTemplateManager::getInstance()->getTemplates(TEMPLATE_LANGUAGE_EN))).size(),
                 3);
    }

    void rowsThatCannotBeTitles()
    {
        makeUserTemplate("a", 100);
        makePreset("templates_en", "lower");
        UserTemplateManager* const manager = UserTemplateManager::getInstance();
        setOrder(m_user, {"x", "a/Titler.xml", "", "../outside.xml"});
        auto templates = own(manager->getTemplates(TEMPLATE_LANGUAGE_EN));
        QCOMPARE(namesOf(templates), QStringList({"a/Titler", ""}));
        setOrder(base("presets/templates_en"), {"xml", "lower.xml"});
        const PrintedText printed;
        templates = own(TemplateManager::getInstance()->getTemplates(TEMPLATE_LANGUAGE_EN));
        QCOMPARE(namesOf(templates), QStringList{"lower"});
    }

    // One name that cannot stand in XML must not hide the others.
    void foldersWithStrangeNames()
    {
        makeUserTemplate("plain", 100);
        makeUserTemplate("line\nbreak & 'quotes'", 200);
        const std::string bad = m_user.toStdString() + "/bad\xff\xfe";
        QCOMPARE(::mkdir(bad.c_str(), 0755), 0);
        QCOMPARE(::link(userFile("plain/Titler.xml").toUtf8().constData(), (bad + "/Titler.xml").c_str()), 0);
        UserTemplateManager* const manager = UserTemplateManager::getInstance();
        QCOMPARE(namesOf(own(manager->getTemplates(TEMPLATE_LANGUAGE_EN))),
                 QStringList({"plain/Titler", "line\nbreak & 'quotes'/Titler"}));
        // QTemporaryDir cannot remove such names.
        QVERIFY(::unlink((bad + "/Titler.xml").c_str()) == 0 && ::rmdir(bad.c_str()) == 0);
    }

    void readOnlyUserTemplates()
    {
        makeUserTemplate("a", 100);
        makeUserTemplate("b", 200);
        UserTemplateManager::getInstance();
        UserTemplateManager::cleanUp();
        const QByteArray order = read(userFile(".order.xml"));
        QVERIFY(QDir(m_user).mkpath("imported"));
        const ReadOnlyTree tree(m_root->path());
        UserTemplateManager* const manager = UserTemplateManager::getInstance();
        QCOMPARE(namesOf(own(manager->getTemplates(TEMPLATE_LANGUAGE_EN))),
                 QStringList({"a/Titler", "b/Titler"}));
        QCOMPARE(manager->saveLastTemplatePath("/x"), 0);
        QCOMPARE(manager->deleteTemplatePath(userFile("a/Titler.xml").toStdString()), 0);
        Archive archive;
        QCOMPARE(manager->createNewTemplateXml("imported", &archive), -1);
        QCOMPARE(manager->addNewTemplateToLastInOrderXml("imported"), 1);
        manager->renameInOrderXml("a", "c");
        QCOMPARE(read(userFile(".order.xml")), order);
        QVERIFY(QFile::exists(userFile("a/Titler.xml")));
        QVERIFY(QFile::exists(userFile("a/Titler_240.png")));
        QVERIFY(!QFile::exists(userFile("imported/Titler.xml")));
    }

    void namesUpToTheLastNumber()
    {
        const QByteArray title = titleBytes();
        for (int i = 1; i <= 998; ++i) {
            const QString name = QStringLiteral("UserTemplate_%1").arg(i, 3, 10, QChar('0'));
            QVERIFY(QDir(m_user).mkdir(name));
            write(userFile(name + "/Titler.xml"), title);
        }
        UserTemplateManager* const manager = UserTemplateManager::getInstance();
        QCOMPARE(rows().size(), 998);
        QCOMPARE(own(manager->getTemplates(TEMPLATE_LANGUAGE_EN)).size(), std::size_t(998));
        ArchiveController controller;
        QCOMPARE(controller.getFreeNameInUserTemplate(m_user), QString("UserTemplate_999"));
        manager->addNewTemplateToLastInOrderXml("UserTemplate_999");
        QCOMPARE(rows().size(), 999);
        QVERIFY(controller.getFreeNameInUserTemplate(m_user).isEmpty());
        // 999 stays; with two gaps there is room again, below.
        for (const char* name : {"UserTemplate_500", "UserTemplate_700"})
            QCOMPARE(manager->deleteTemplatePath(userFile(name).toStdString() + "/Titler.xml"), 1);
        manager->addNewTemplateToLastInOrderXml("UserTemplate_999");
        QCOMPARE(rows().size(), 997);
        QCOMPARE(controller.getFreeNameInUserTemplate(m_user), QString("UserTemplate_500"));
    }

private:
    // A folder in which nothing can be written, with all below it, as long as this lives.
    class ReadOnlyTree
    {
    public:
        explicit ReadOnlyTree(const QString& folder) : m_folder(folder)
        {
            change(QFile::ReadOwner | QFile::ExeOwner | QFile::ReadGroup | QFile::ExeGroup |
                   QFile::ReadOther | QFile::ExeOther);
            m_user = std::make_unique<OrdinaryUser>();
        }
        ~ReadOnlyTree()
        {
            m_user.reset();
            change(QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
        }

    private:
        void change(QFile::Permissions permissions)
        {
            QStringList folders{m_folder};
            while (!folders.isEmpty()) {
                const QString folder = folders.takeLast();
                QFile::setPermissions(folder, permissions);
                for (const QFileInfo& child : QDir(folder).entryInfoList(QDir::Dirs | QDir::NoDotAndDotDot))
                    folders.append(child.filePath());
            }
        }

        QString m_folder;
        std::unique_ptr<OrdinaryUser> m_user;
    };

    QString base(const QString& name) const { return m_root->path() + "/defaultuser/" + name; }
    QString userFile(const QString& name) const { return m_user + '/' + name; }

    static void fill(Archive& archive)
    {
        archive.setThumbnailSmall("Titler_240.png");
        archive.setBgResource("Titler_source_1280.png");
        archive.setBgResourceBig("Titler_source_1920.png");
        auto text = std::make_unique<TText>();
        text->setText("Name é 名");
        auto style = std::make_unique<TextStyle>();
        style->setText("N");
        text->setTextItems({style.release()});
        archive.setText({text.release()});
    }

    QByteArray titleBytes() const
    {
        Archive archive;
        fill(archive);
        archive.setPath(base("title.xml").toStdString());
        ArchiveManager().saveArchive(&archive);
        return read(base("title.xml"));
    }

    void makePreset(const QString& set, const QString& name) const
    {
        Archive archive;
        fill(archive);
        archive.setPath(base("presets/" + set + '/' + name + ".xml").toStdString());
        QCOMPARE(ArchiveManager().saveArchive(&archive), 1);
    }

    // Its title file was last changed so many seconds after 1970.
    void makeUserTemplate(const QString& name, int seconds) const
    {
        QVERIFY(QDir(m_user).mkpath(name));
        for (const char* picture : {"Titler_240.png", "Titler_source_1280.png", "Titler_source_1920.png"})
            write(userFile(name + '/' + picture), "picture");
        const QString path = userFile(name + "/Titler.xml");
        write(path, titleBytes());
        QFile file(path);
        QVERIFY(file.open(QIODevice::ReadWrite));
        QVERIFY(file.setFileTime(QDateTime::fromSecsSinceEpoch(seconds), QFile::FileModificationTime));
    }

    static void setOrder(const QString& folder, const QStringList& names)
    {
        std::vector<ArchiveOrder> rows;
        for (const QString& name : names) {
            ArchiveOrder row;
            row.setArchiveIndex(int(rows.size()));
            row.setArchivePath(name.toStdString());
            rows.push_back(row);
        }
        QCOMPARE(ArchiveManager().setArchivesSortUnderFolder(folder.toStdString(), rows), 1);
    }

    // What the order file of the user templates names.
    QStringList rows() const
    {
        QStringList paths;
        for (ArchiveOrder* row : ArchiveManager().getArchivesSortUnderFolder(m_user.toStdString())) {
            paths.append(QString::fromStdString(row->getArchivePath()));
            delete row;
        }
        return paths;
    }

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

    QTemporaryDir m_logs;
    std::unique_ptr<QTemporaryDir> m_root;
    QString m_user;
};

QTEST_GUILESS_MAIN(tst_templatemanager)
#include "tst_templatemanager.moc"
