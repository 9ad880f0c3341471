// What the template picker makes of the file manager's notices about template folders, told in each way a
// path can be told, and what it writes to the logs.
#include "TemplateFixture.h"
#include "tests/support/LogFixture.h"

#include "library/TemplateItem.h"
#include "library/TemplatePicker.h"
#include "library/TemplateTab.h"
#include "tests/support/Patience.h"
#include "touchui/KSPushbutton.h"

#include <QTest>
#include <cstdarg>
#include <cstdio>

namespace
{

QStringList systemLog;

} // namespace

// Replaces the function of the platform library and keeps what would go to the system log.
extern "C" void k2sys_syslog(int priority, const char* format, ...)
{
    char line[1024];
    va_list args;
    va_start(args, format);
    std::vsnprintf(line, sizeof(line), format, args);
    va_end(args);
    systemLog.append(QString::number(priority) + QLatin1Char(' ') + QString::fromUtf8(line));
}

class tst_templatepicker_notices : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { Q_INIT_RESOURCE(TitlerToolResource); }
    void init();
    void cleanup() { m_picker.reset(); }
    void deletePaths_data();
    void deletePaths();
    void theFolderOfThePathGoesFirst();
    void unknownDelete_data();
    void unknownDelete();
    void renamePaths_data();
    void renamePaths();
    void unknownRename();
    void importPaths_data();
    void importPaths();
    void importOfAFolderThatIsNotThere_data();
    void importOfAFolderThatIsNotThere();
    void pathsOutsideChangeNothing_data();
    void pathsOutsideChangeNothing();
    void foldersThatAreLinksElsewhere();
    void taps();

private:
    TemplateTab* users() const { return m_picker->userTab(); }
    QStringList names() const
    {
        QStringList result;
        for (int id = 0; id < users()->count(); ++id)
            result.append(TemplateTab::templateName(*users()->archive(id)));
        return result;
    }
    // "%1" stands for the root of the templates.
    QString told(QString path) const { return path.replace(QLatin1String("%1"), m_fixture.userRoot()); }

    TemplateFixture m_fixture;
    FakeTitleChangeReporter m_reports;
    FakeMessageBoxController m_messages;
    LogFixture m_log;
    std::unique_ptr<TemplatePicker> m_picker;
};

void tst_templatepicker_notices::init()
{
    m_fixture.resetTemplates();
    m_fixture.makeUserTemplates(3);
    m_picker = std::make_unique<TemplatePicker>();
    systemLog.clear();
    m_log.takeOperations();
    m_log.takeDebugLines();
}

void tst_templatepicker_notices::deletePaths_data()
{
    QTest::addColumn<QString>("path");
    QTest::newRow("title") << "%1/UserTemplate_002/Titler.xml";
    QTest::newRow("picture") << "%1/UserTemplate_002/Titler_240.png";
    QTest::newRow("file without an extension") << "%1/UserTemplate_002/Titler";
    QTest::newRow("file with the name of a template") << "%1/UserTemplate_002/UserTemplate_003";
    QTest::newRow("folder with a slash") << "%1/UserTemplate_002/";
    QTest::newRow("folder") << "%1/UserTemplate_002";
    QTest::newRow("folder with two slashes") << "%1/UserTemplate_002//";
    QTest::newRow("in the root") << "UserTemplate_002/Titler.xml";
    QTest::newRow("name") << "UserTemplate_002";
}

void tst_templatepicker_notices::deletePaths()
{
    QFETCH(QString, path);
    QVERIFY(QDir(m_fixture.userRoot() + "/UserTemplate_002").removeRecursively());
    m_picker->slotDeleteUserTemplate(told(path));
    QCOMPARE(names(), QStringList({"UserTemplate_001", "UserTemplate_003"}));
    QCOMPARE(m_fixture.userOrder(), names());
    QVERIFY(systemLog.isEmpty());
}

void tst_templatepicker_notices::theFolderOfThePathGoesFirst()
{
    m_fixture.makeUserTemplate("a.xml");
    m_picker->slotSaveAsTemplate("a.xml");
    QVERIFY(QDir(m_fixture.userRoot() + "/a.xml").removeRecursively());
    m_picker->slotDeleteUserTemplate(m_fixture.userRoot() + "/a.xml");
    QCOMPARE(names(), QStringList({"UserTemplate_001", "UserTemplate_002", "UserTemplate_003"}));
    QCOMPARE(m_fixture.userOrder(), names());
}

void tst_templatepicker_notices::unknownDelete_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<QString>("name");
    QTest::newRow("folder with a slash") << "%1/nobody/"
                                         << "nobody";
    QTest::newRow("title") << "%1/片头/Titler.xml"
                           << "片头";
    QTest::newRow("folder") << "%1/nobody"
                            << "usertemplates";
    QTest::newRow("root") << "/"
                          << "";
}

void tst_templatepicker_notices::unknownDelete()
{
    QFETCH(QString, path);
    QFETCH(QString, name);
    const QStringList before = names();
    m_picker->slotDeleteUserTemplate(told(path));
    QCOMPARE(systemLog,
             QStringList(QStringLiteral("4 TemplatePicker 400: slotDeleteUserTemplate() \"") + name +
                         QLatin1Char('(') + told(path) + QStringLiteral(")\" is not found.")));
    QCOMPARE(names(), before);
    QCOMPARE(m_fixture.userOrder(), before);
}

void tst_templatepicker_notices::renamePaths_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("path");
    QTest::newRow("title") << "after"
                           << "%1/after/Titler.xml";
    QTest::newRow("picture") << "after"
                             << "%1/after/Titler_240.png";
    QTest::newRow("file without an extension") << "after"
                                               << "%1/after/Titler";
    QTest::newRow("folder with a slash") << "after"
                                         << "%1/after/";
    QTest::newRow("folder") << "after"
                            << "%1/after";
    QTest::newRow("folder called like a file") << "片头.xml"
                                               << "%1/片头.xml";
    QTest::newRow("in a folder called like a file") << "a.png"
                                                    << "%1/a.png/Titler_240.png";
}

void tst_templatepicker_notices::renamePaths()
{
    QFETCH(QString, name);
    QFETCH(QString, path);
    users()->item(1)->clickTriggered();
    QVERIFY(QDir(m_fixture.userRoot()).rename("UserTemplate_002", name));
    m_picker->slotRenameUserTemplate("UserTemplate_002", name, told(path));
    QCOMPARE(names(), QStringList({"UserTemplate_001", name, "UserTemplate_003"}));
    QCOMPARE(QString::fromStdString(users()->archive(1)->getPath()), m_fixture.userTitle(name));
    QCOMPARE(m_fixture.userOrder(), names());
    QCOMPARE(QString::fromStdString(UserTemplatePickerController().getLastSelectedTemplate()),
             m_fixture.userTitle(name));
    QCOMPARE(
        m_log.takeDebugLines(),
        QStringList(QStringLiteral("[TemplatePicker] 200: slotRenameUserTemplate() UserTemplate_002 -> ") +
                    name));
    QVERIFY(systemLog.isEmpty());
}

void tst_templatepicker_notices::unknownRename()
{
    const QStringList before = names();
    m_picker->slotRenameUserTemplate("nobody", "片头", told("%1/片头/"));
    QCOMPARE(systemLog, QStringList("4 TemplatePicker 400: slotRenameUserTemplate() \"nobody\" is not found. "
                                    "cannot rename to \"片头\"."));
    QCOMPARE(m_log.takeDebugLines(),
             QStringList("[TemplatePicker] 200: slotRenameUserTemplate() nobody -> 片头"));
    QCOMPARE(names(), before);
    QCOMPARE(m_fixture.userOrder(), before);
}

void tst_templatepicker_notices::importPaths_data()
{
    QTest::addColumn<QString>("path");
    QTest::newRow("name") << "new one";
    QTest::newRow("folder") << "%1/new one";
    QTest::newRow("folder with a slash") << "%1/new one/";
    QTest::newRow("title") << "%1/new one/Titler.xml";
    QTest::newRow("picture") << "%1/new one/Titler_240.png";
}

void tst_templatepicker_notices::importPaths()
{
    QFETCH(QString, path);
    m_fixture.makeUserPictures("new one");
    m_picker->slotImportNewUserTemplate(told(path));
    QCOMPARE(names(), QStringList({"UserTemplate_001", "UserTemplate_002", "UserTemplate_003", "new one"}));
    QCOMPARE(m_fixture.userOrder(), names());
}

void tst_templatepicker_notices::importOfAFolderThatIsNotThere_data()
{
    QTest::addColumn<QString>("path");
    QTest::newRow("name") << "UserTemplate_002";
    QTest::newRow("folder") << "%1/UserTemplate_002";
    QTest::newRow("folder with a slash") << "%1/UserTemplate_002/";
}

void tst_templatepicker_notices::importOfAFolderThatIsNotThere()
{
    QFETCH(QString, path);
    // The times of the files give another order than the tiles.
    m_fixture.makeUserTemplate("UserTemplate_001");
    QVERIFY(QDir(m_fixture.userRoot() + "/UserTemplate_002").removeRecursively());
    users()->item(1)->clickTriggered();
    m_picker->slotImportNewUserTemplate(told(path));
    QCOMPARE(names(), QStringList({"UserTemplate_001", "UserTemplate_003"}));
    QCOMPARE(m_fixture.userOrder(), names());
    QVERIFY(!users()->selectedItem());
    // Reading the disk again gives the same.
    m_picker->reloadTemplates2();
    QCOMPARE(names(), QStringList({"UserTemplate_001", "UserTemplate_003"}));
}

void tst_templatepicker_notices::pathsOutsideChangeNothing_data()
{
    QTest::addColumn<QString>("folder");
    QTest::newRow("elsewhere") << "%2/elsewhere/UserTemplate_002";
    QTest::newRow("climbing") << "%1/../../elsewhere/UserTemplate_002";
    QTest::newRow("by a link") << "%1/link/UserTemplate_002";
    QTest::newRow("beside the root") << "%1 2/UserTemplate_002";
    QTest::newRow("of the titles") << "%2/defaultuser/titles/UserTemplate_002";
}

void tst_templatepicker_notices::pathsOutsideChangeNothing()
{
    QFETCH(QString, folder);
    const QString data = QFileInfo(QFileInfo(m_fixture.userRoot()).path()).path();
    folder.replace("%2", data);
    folder = told(folder);
    QVERIFY(QDir().mkpath(data + "/elsewhere"));
    QFile::remove(m_fixture.userRoot() + "/link");
    QVERIFY(QFile::link(data + "/elsewhere", m_fixture.userRoot() + "/link"));
    QVERIFY(QDir().mkpath(folder));
    for (const char* file : {"/Titler.xml", "/Titler_240.png"})
        QVERIFY(QFile::exists(folder + file) ||
                QFile::copy(m_fixture.userRoot() + "/UserTemplate_003" + file, folder + file));
    const QStringList before = names();
    const QString path = users()->archive(1)->getPath().c_str();
    const auto isUnchanged = [&] {
        return names() == before && m_fixture.userOrder() == before &&
               users()->archive(1)->getPath().c_str() == path && QFile::exists(path) &&
               QFile::exists(folder + "/Titler.xml") && QFile::exists(folder + "/Titler_240.png");
    };
    m_log.takeDebugLines();
    for (const QString& notice : {folder, folder + "/", folder + "/Titler.xml"}) {
        m_picker->slotDeleteUserTemplate(notice);
        QVERIFY2(isUnchanged(), qPrintable("delete " + notice));
        QCOMPARE(systemLog.size() + m_log.takeDebugLines().size(), 1);
        systemLog.clear();
        m_picker->slotImportNewUserTemplate(notice);
        QVERIFY2(isUnchanged(), qPrintable("import " + notice));
        QCOMPARE(m_log.takeDebugLines("ConfinedPath").size(), 1);
        m_picker->slotRenameUserTemplate("UserTemplate_002", "after", notice);
        QVERIFY2(isUnchanged(), qPrintable("rename " + notice));
        QCOMPARE(m_log.takeDebugLines("ConfinedPath").size(), 1);
    }
    QVERIFY(systemLog.isEmpty());
    // A record whose path leads outside does not delete files there.
    UserTemplatePickerController().deleteTemplate((folder + "/Titler.xml").toStdString());
    QVERIFY(isUnchanged());
}

void tst_templatepicker_notices::foldersThatAreLinksElsewhere()
{
    const QString elsewhere =
        QFileInfo(QFileInfo(m_fixture.userRoot()).path()).path() + "/elsewhere template";
    QVERIFY(QDir(m_fixture.userRoot()).rename("UserTemplate_003", elsewhere));
    QVERIFY(QFile::link(elsewhere, m_fixture.userRoot() + "/UserTemplate_003"));
    const QStringList before = names();
    QVERIFY(QFile::remove(elsewhere + "/Titler.xml"));
    m_picker->slotImportNewUserTemplate("UserTemplate_003");
    QCOMPARE(names(), before);
    QVERIFY(!QFile::exists(elsewhere + "/Titler.xml"));
    // The next reading does not list it.
    QVERIFY(QFile::copy(m_fixture.userTitle("UserTemplate_001"), elsewhere + "/Titler.xml"));
    UserTemplateManager::getInstance()->reCreateNewOrderXml();
    QCOMPARE(m_fixture.userOrder(), QStringList({"UserTemplate_001", "UserTemplate_002"}));
    Archive archive;
    QCOMPARE(UserTemplateManager::getInstance()->createNewTemplateXml("UserTemplate_003", &archive), 0);
    QCOMPARE(UserTemplateManager::getInstance()->loadTemplate("UserTemplate_003", &archive), 0);
    QDir(elsewhere).removeRecursively();
}

void tst_templatepicker_notices::taps()
{
    m_fixture.makePresets("templates_en", {"a", "b"});
    m_picker = std::make_unique<TemplatePicker>();
    m_picker->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_picker.get(), PATIENCE_MS));
    m_log.takeOperations();
    m_picker->presetTab()->item(1)->clickTriggered();
    m_picker->showUserTemplateTab();
    users()->item(2)->clickTriggered();
    QCOMPARE(m_log.takeOperations(), QStringList({"[Template Area] 200: Select the 1 thumnail",
                                                  "[Template Area] 200: Select the 2 thumnail"}));
    QTest::mouseClick(m_picker->findChild<KSPushbutton*>("cancelTemplateButton"), Qt::LeftButton);
    QVERIFY(!m_picker->isVisible());
    QCOMPARE(m_picker->result(), int(QDialog::Rejected));
    QCOMPARE(m_log.takeOperations(), QStringList("[Template Area] 200: Tap Cancel Button"));
    // Closing the dialog in another way is not logged as a tap.
    m_picker->show();
    m_picker->reject();
    QVERIFY(m_log.takeOperations().isEmpty());
}

QTEST_MAIN(tst_templatepicker_notices)
#include "tst_templatepicker_notices.moc"
