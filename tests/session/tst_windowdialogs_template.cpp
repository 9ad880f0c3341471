// The window and its template picker: how the dialog opens and closes, and what reaches it from list,
// siblings and language.
#include "app/APPEventFilter.h"
#include "app/EditContextController.h"
#include "app/EditTitlerController.h"
#include "app/ShowMessageController.h"
#include "app/SystemSetupInfoController.h"
#include "app/TitlerWindow.h"
#include "canvas/CanvasScene.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/TemplateItem.h"
#include "library/TemplatePicker.h"
#include "library/TemplateTab.h"
#include "tests/app/Siblings.h"
#include "tests/library/TemplateFixture.h"
#include "tests/support/Patience.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSPushbutton.h"

#include <QApplication>
#include <QSignalSpy>
#include <QTest>
#include <QTimer>
#include <functional>

namespace
{

// Notes the user events that an object gets.
class UserEvents : public QObject
{
public:
    using QObject::QObject;
    QList<int> types;

protected:
    bool eventFilter(QObject*, QEvent* event) override
    {
        if (event->type() == 1150 || event->type() == 1151)
            types << event->type();
        return false;
    }
};

} // namespace

class tst_windowdialogs_template : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cleanupTestCase();
    void init();
    void cleanup();

    void opensModalOverADarkenedWindow();
    void aSecondRequestChangesNothing();
    void openingBreaksTouchLocks();
    void cancelMakesNoTitle();
    void theChosenTemplateBecomesATitle();
    void anEmptyFolderAsksForATemplate();
    void beginsWithTheOperatorsTemplates();
    void presetsFollowTheSystemLanguage();
    void noticesOfTheFileManager();
    void aSavedTitleJoinsTheTemplates();
    void masksGoOverTheOpenDialogOnly();
    void theEndOfTheSessionClosesIt();

private:
    // Calls while the dialog is open, and cancels it if it still is after that.
    void whenOpen(std::function<void()> action);
    void request(const QString& folder);
    QWidget* opacityMask() const;
    QStringList userNames() const;
    ArchiveList* list() const { return m_window->findChild<ArchiveList*>(); }
    TemplatePicker* picker() const { return m_window->findChild<TemplatePicker*>(); }

    TemplateFixture m_fixture;
    Siblings m_siblings;
    TitlerWindow* m_window = nullptr;
    int m_opened = 0;
    int m_folders = 0;
    QString m_folder;
};

void tst_windowdialogs_template::initTestCase()
{
    QVERIFY(m_siblings.listenOnFreePorts());
    m_fixture.resetTemplates();
    m_fixture.makePresets("templates_en", {"lower", "strap"});
    m_fixture.makePresets("templates_chs", {"xia", "tiao", "jiao"});
    m_fixture.makeUserTemplates(2);
    APPEventFilter::instance();
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
    m_window = new TitlerWindow(true, nullptr);
    pMainWindow = m_window;
    m_window->setRealClose(false);
}

void tst_windowdialogs_template::cleanupTestCase()
{
    delete m_window;
    pMainWindow = nullptr;
    APPEventFilter::release();
}

void tst_windowdialogs_template::init()
{
    m_opened = 0;
    m_folder = m_fixture.makeFolder(QStringLiteral("folder%1").arg(++m_folders));
    LibraryFixture::fillFolder(m_folder, {"t1", "t2"});
    request(m_folder);
}

void tst_windowdialogs_template::cleanup()
{
    m_window->closeTitlerWindow();
    QVERIFY(!m_window->isVisible());
}

void tst_windowdialogs_template::request(const QString& folder)
{
    m_window->showTitlerWindow({_titler_paramter::CREATE_OR_EDIT, folder.toStdWString()});
}

void tst_windowdialogs_template::whenOpen(std::function<void()> action)
{
    QTimer::singleShot(0, this, [this, action] {
        if (!picker()->isVisible())
            return;
        ++m_opened;
        action();
        picker()->reject();
    });
}

// The one dark child that is no mask for messages: those do not exist before their first use.
QWidget* tst_windowdialogs_template::opacityMask() const
{
    for (QWidget* child : m_window->findChildren<QWidget*>(QString(), Qt::FindDirectChildrenOnly))
        if (child->size() == m_window->size() && child->autoFillBackground() && !child->isWindow())
            return child;
    return nullptr;
}

QStringList tst_windowdialogs_template::userNames() const
{
    QStringList names;
    for (int i = 0; i < picker()->userTab()->count(); ++i)
        names << TemplateTab::templateName(*picker()->userTab()->archive(i));
    return names;
}

void tst_windowdialogs_template::opensModalOverADarkenedWindow()
{
    UserEvents events;
    m_window->installEventFilter(&events);
    QVERIFY(opacityMask());
    QVERIFY(!opacityMask()->isVisible());
    whenOpen([this, &events] {
        QVERIFY(picker()->isModal());
        QVERIFY(opacityMask()->isVisible());
        QCOMPARE(opacityMask()->palette().color(QPalette::Window), QColor(0, 0, 0, 166));
        QCOMPARE(events.types, QList<int>{1150});
    });
    m_window->showTemplateDialog();
    QCOMPARE(m_opened, 1);
    QVERIFY(!opacityMask()->isVisible());
    QCOMPARE(events.types, (QList<int>{1150, 1151}));
    events.types.clear();
    whenOpen([] {});
    m_window->showTemplateDialog();
    QCOMPARE(events.types, (QList<int>{1150, 1151}));
}

void tst_windowdialogs_template::aSecondRequestChangesNothing()
{
    whenOpen([this] {
        m_window->showTemplateDialog();
        QVERIFY(picker()->isVisible());
        QVERIFY(opacityMask()->isVisible());
    });
    m_window->showTemplateDialog();
    QCOMPARE(m_opened, 1);
}

void tst_windowdialogs_template::openingBreaksTouchLocks()
{
    APPEventFilter* filter = APPEventFilter::instance();
    KSPushbutton* move = m_window->findChild<KSPushbutton*>();
    QVERIFY(move);
    QCOMPARE(filter->tryLock(move, LOCKMETHOD_TOUCH), 0);
    QVERIFY(filter->isLock(move, LOCKMETHOD_TOUCH));
    whenOpen([filter, move] { QVERIFY(!filter->isLock(move, LOCKMETHOD_TOUCH)); });
    m_window->showTemplateDialog();
    QCOMPARE(m_opened, 1);
}

void tst_windowdialogs_template::cancelMakesNoTitle()
{
    whenOpen([this] {
        TemplateTab* presets = picker()->presetTab();
        presets->select(presets->item(1));
        QTest::mouseClick(picker()->findChild<KSPushbutton*>("cancelTemplateButton"), Qt::LeftButton);
        QVERIFY(!picker()->isVisible());
    });
    Q_EMIT list()->startTemplatePicker();
    QCOMPARE(m_opened, 1);
    QVERIFY(!picker()->isSelectedItem());
    QCOMPARE(list()->count(), 2);
    QCOMPARE(LibraryFixture::order(m_folder), QStringList({"t1", "t2"}));
}

void tst_windowdialogs_template::theChosenTemplateBecomesATitle()
{
    whenOpen([this] {
        TemplateTab* presets = picker()->presetTab();
        presets->select(presets->item(1));
        QTest::mouseClick(picker()->findChild<KSPushbutton*>("selectPresetButton"), Qt::LeftButton);
    });
    Q_EMIT list()->startTemplatePicker();
    QCOMPARE(m_opened, 1);
    QVERIFY(picker()->isSelectedItem());
    QCOMPARE(list()->count(), 3);
    const Archive* made = list()->getSelectedArchive()->getArchiveData();
    QCOMPARE(QString::fromStdString(made->getText().front()->getText()), QString("strap"));
    auto* scene = m_window->findChild<CanvasScene*>();
    QCOMPARE(scene->archive()->getPath(), made->getPath());
    QTRY_COMPARE(LibraryFixture::order(m_folder).size(), 3);
}

void tst_windowdialogs_template::anEmptyFolderAsksForATemplate()
{
    m_window->closeTitlerWindow();
    const QString empty = m_fixture.makeFolder(QStringLiteral("empty%1").arg(m_folders));
    whenOpen([this] { QVERIFY(list()->isEmpty()); });
    request(empty);
    QCOMPARE(m_opened, 1);
    QVERIFY(m_window->isVisible());
    QVERIFY(!m_window->findChild<CanvasScene*>()->archive());
}

void tst_windowdialogs_template::beginsWithTheOperatorsTemplates()
{
    auto* tabs = picker()->findChild<QTabWidget*>();
    tabs->setCurrentIndex(0);
    whenOpen([tabs] { QCOMPARE(tabs->currentIndex(), 1); });
    Q_EMIT list()->startUserTemplatePicker();
    QCOMPARE(m_opened, 1);
}

void tst_windowdialogs_template::presetsFollowTheSystemLanguage()
{
    auto* setup = SystemSetupInfoController::getInstance();
    setup->setSystemLanguageNotify(SystemSetupDef::emSystemLanguageChinese);
    QCOMPARE(picker()->presetTab()->count(), 3);
    setup->setSystemLanguageNotify(SystemSetupDef::emSystemLanguageEnglish);
    QCOMPARE(picker()->presetTab()->count(), 2);
    // The same language again reads nothing: what was added on disk does not show.
    m_fixture.makePresets("templates_en", {"lower", "strap", "quote"});
    setup->setSystemLanguageNotify(SystemSetupDef::emSystemLanguageEnglish);
    QCOMPARE(picker()->presetTab()->count(), 2);
}

void tst_windowdialogs_template::noticesOfTheFileManager()
{
    auto* fileManager = EditTitlerController::getInstance();
    QCOMPARE(userNames(), QStringList({"UserTemplate_001", "UserTemplate_002"}));

    m_fixture.makeUserPictures("Imported 导入");
    FileManagerDefine::tagImportNotify import;
    import.fileType = FileManagerDefine::FILE_TYPE_TITLER_TEMPLATE;
    import.path = L"Imported 导入";
    fileManager->importNotify(import);
    QCOMPARE(userNames(), QStringList({"UserTemplate_001", "UserTemplate_002", "Imported 导入"}));
    // A font with the name of a template is none.
    import.fileType = FileManagerDefine::FILE_TYPE_FONT;
    fileManager->importNotify(import);
    QCOMPARE(userNames().size(), 3);

    QVERIFY(QDir(m_fixture.userRoot()).rename("UserTemplate_001", "Renamed"));
    FileManagerDefine::tagRenameNotify rename;
    rename.fileType = FileManagerDefine::FILE_TYPE_TITLER_TEMPLATE;
    rename.strings[0] = L"UserTemplate_001";
    rename.strings[2] = L"Renamed";
    rename.strings[3] = (m_fixture.userRoot() + "/Renamed/").toStdWString();
    fileManager->renameTitlerTemplateNotify(rename);
    QCOMPARE(userNames(), QStringList({"Renamed", "UserTemplate_002", "Imported 导入"}));
    QCOMPARE(QString::fromStdString(picker()->userTab()->archive(0)->getPath()),
             m_fixture.userTitle("Renamed"));
    QCOMPARE(m_fixture.userOrder(), userNames());

    FileManagerDefine::tagDeleteNotify gone;
    gone.fileType = FileManagerDefine::FILE_TYPE_TITLER_TEMPLATE;
    gone.result = 1; // refused there
    gone.path = m_fixture.userTitle("UserTemplate_002").toStdWString();
    fileManager->deleteNotify(gone);
    QCOMPARE(userNames().size(), 3);
    gone.result = 0;
    QVERIFY(QDir(m_fixture.userRoot() + "/UserTemplate_002").removeRecursively());
    fileManager->deleteNotify(gone);
    QCOMPARE(userNames(), QStringList({"Renamed", "Imported 导入"}));
}

void tst_windowdialogs_template::aSavedTitleJoinsTheTemplates()
{
    m_fixture.makeUserTemplate("UserTemplate_009", {"saved text"});
    const qsizetype before = userNames().size();
    Q_EMIT list()->addUserSignal("UserTemplate_009");
    QCOMPARE(userNames().size(), before + 1);
    QCOMPARE(userNames().last(), QString("UserTemplate_009"));
    QCOMPARE(m_fixture.userOrder().last(), QString("UserTemplate_009"));
}

void tst_windowdialogs_template::masksGoOverTheOpenDialogOnly()
{
    ShowMessageController* messages = ShowMessageController::getInstance();
    const QRect area(10, 6, TemplatePicker::SCREEN_WIDTH - 19, TemplatePicker::SCREEN_HEIGHT - 18);
    const auto shownMasks = [this, area] {
        int masks = 0;
        for (QWidget* child : picker()->findChildren<QWidget*>(QString(), Qt::FindDirectChildrenOnly))
            masks += child->geometry() == area && !child->isHidden() ? 1 : 0;
        return masks;
    };
    messages->showDialogOpacityWidget();
    QCOMPARE(shownMasks(), 0);
    messages->hideDialogOpacityWidget();
    whenOpen([this, messages, shownMasks] {
        messages->showMessageOpacityWidget();
        QCOMPARE(shownMasks(), 1);
        QVERIFY(!picker()->testAttribute(Qt::WA_AcceptTouchEvents));
        messages->showDialogOpacityWidget();
        QCOMPARE(shownMasks(), 2);
        messages->hideMessageOpacityWidget();
        QVERIFY(!picker()->testAttribute(Qt::WA_AcceptTouchEvents));
        messages->hideDialogOpacityWidget();
        QCOMPARE(shownMasks(), 0);
        QVERIFY(picker()->testAttribute(Qt::WA_AcceptTouchEvents));
    });
    m_window->showTemplateDialog();
    QCOMPARE(m_opened, 1);
}

void tst_windowdialogs_template::theEndOfTheSessionClosesIt()
{
    whenOpen([this] {
        m_window->continueCloseTitler({1, MessageDefine::CLOSE_OK, MessageDef::MESSAGE_CONFIRM_CLOSE});
        QVERIFY(!picker()->isVisible());
    });
    m_window->showTemplateDialog();
    QCOMPARE(m_opened, 1);
    QVERIFY(!m_window->isVisible());
    QVERIFY(list()->isEmpty());
}

int main(int argc, char** argv)
{
    KSInputContext::install();
    QApplication application(argc, argv);
    application.setObjectName("Titler");
    QApplication::setQuitOnLastWindowClosed(false);
    tst_windowdialogs_template test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_windowdialogs_template.moc"
