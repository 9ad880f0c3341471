// The folder picker in the main window: who opens it, where Cancel leads, what it does to the session, and
// the notices of the file manager that reach it.
#include "app/APPEventFilter.h"
#include "app/EditContextController.h"
#include "app/EditTitlerController.h"
#include "app/ShowMessageController.h"
#include "app/TitlerWindow.h"
#include "app/ToolsBar.h"
#include "canvas/CanvasScene.h"
#include "canvas/GraphicsText.h"
#include "library/ArchiveList.h"
#include "library/FolderPicker.h"
#include "library/TemplatePicker.h"
#include "support/FileSyncQueue.h"
#include "tests/app/Siblings.h"
#include "tests/library/LibraryFixture.h"
#include "tests/support/Patience.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSPushbutton.h"
#include "touchui/KSTreeModel.h"
#include "touchui/KSTreeView.h"

#include <QAction>
#include <QApplication>
#include <QLabel>
#include <QSignalSpy>
#include <QTest>
#include <QTextCursor>
#include <QTimer>
#include <chrono>
#include <functional>

class tst_windowdialogs_folder : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cleanupTestCase();
    void init();
    void cleanup();

    void createRequestAsksForAFolder();
    void createRequestIsCancelled();
    void subPanelMayMakeFolders();
    void folderButtonOpensItFromTheEditor();
    void cancelGoesBackToTheEditor();
    void anEmptyListHasNoWayBack();
    void theOpenFolderTakesNoName();
    void noticesOfTheFileManager();
    void noticesWhileHidden();
    void renameOfTheFolderThatIsEdited();
    void renameUnderATextThatIsTyped_data();
    void renameUnderATextThatIsTyped();
    void noTemplateLeadsBackToThePicker();
    void masksLieOnTheDialog();
    void languageAndFont();

private:
    // Runs steps once the dialog shows; the call that opens it returns when they have closed it.
    void inDialog(const std::function<void()>& open, const std::function<void()>& steps);
    void request(const QString& path, int mode = _titler_paramter::CREATE_OR_EDIT)
    {
        m_window->showTitlerWindow({mode, path.toStdWString()});
    }
    void choose(const QString& name)
    {
        const QModelIndex index = row(name);
        QVERIFY(index.isValid());
        const QPoint place = tree()->visualRect(index).center();
        QTest::mouseClick(tree()->viewport(), Qt::LeftButton, {}, place);
    }
    void press(const char* name) { QTest::mouseClick(button(name), Qt::LeftButton); }
    QModelIndex row(const QString& name) const
    {
        for (int i = 0; i < picker()->treeModel()->rowCount(); ++i) {
            const QModelIndex index = picker()->treeModel()->index(i, 0);
            if (index.data().toString() == name)
                return index;
        }
        return {};
    }
    KSPushbutton* button(const char* name) const
    {
        return picker()->findChild<KSPushbutton*>(QLatin1String(name));
    }
    bool isMasked(const QWidget* owner) const
    {
        for (const QWidget* child : owner->findChildren<QWidget*>(Qt::FindDirectChildrenOnly))
            if (child->isVisible() && child->palette().color(QPalette::Window) == QColor(0, 0, 0, 166))
                return true;
        return false;
    }
    FolderPicker* picker() const { return m_window->findChild<FolderPicker*>(); }
    KSTreeView* tree() const { return picker()->treeView(); }
    ArchiveList* list() const { return m_window->findChild<ArchiveList*>(); }
    QString path(const QString& name) const { return m_files.titleRoot() + QLatin1Char('/') + name; }

    LibraryFixture m_files;
    Siblings m_siblings;
    TitlerWindow* m_window = nullptr;
};

void tst_windowdialogs_folder::initTestCase()
{
    QVERIFY(m_siblings.listenOnFreePorts());
    APPEventFilter::instance();
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
    m_window = new TitlerWindow(true, nullptr);
    pMainWindow = m_window;
    m_window->setRealClose(false);
}

void tst_windowdialogs_folder::cleanupTestCase()
{
    delete m_window;
    pMainWindow = nullptr;
    APPEventFilter::release();
}

void tst_windowdialogs_folder::init()
{
    QVERIFY(FileSyncQueue::flush(
        std::chrono::milliseconds(PATIENCE_MS))); // keeps versions in the folders until then
    QVERIFY(QDir(m_files.titleRoot()).removeRecursively());
    LibraryFixture::fillFolder(m_files.makeFolder("news"), {"t1", "t2"});
    LibraryFixture::fillFolder(m_files.makeFolder("sports"), {"t3"});
}

void tst_windowdialogs_folder::cleanup()
{
    EditContextController::getInstance()->setITitlerNoCallBack();
    if (picker()->isVisible())
        picker()->done(QDialog::Rejected);
    if (m_window->isVisible())
        m_window->closeTitlerWindow();
    QVERIFY(!m_window->isVisible());
    QVERIFY(picker()->currentFolderName().isEmpty());
}

void tst_windowdialogs_folder::inDialog(const std::function<void()>& open, const std::function<void()>& steps)
{
    bool ran = false;
    QTimer::singleShot(0, picker(), [&] {
        ran = picker()->isVisible();
        if (ran)
            steps();
        picker()->done(QDialog::Rejected);
    });
    open();
    QVERIFY(ran);
    QVERIFY(!picker()->isVisible());
    QVERIFY(!isMasked(m_window));
}

void tst_windowdialogs_folder::createRequestAsksForAFolder()
{
    EditContextController::getInstance()->showTitlerEdit({});
    inDialog([this] { request(QString()); },
             [this] {
                 QVERIFY(m_window->isVisible());
                 QCOMPARE(picker()->windowModality(), Qt::WindowModal);
                 QVERIFY(isMasked(m_window));
                 QVERIFY(!button("duplicateFolderButton")->isEnabled());
                 QVERIFY(!button("newFolderButton")->isEnabled());
                 QVERIFY(!button("openFolderButton")->isEnabled());
                 QVERIFY(button("cancelFolderButton")->isEnabled());
                 choose("sports");
                 press("openFolderButton");
                 QCOMPARE(list()->getCurrentPath(), path("sports"));
             });
    QVERIFY(m_window->isVisible());
    QCOMPARE(list()->count(), 1);
    QCOMPARE(picker()->currentFolderName(), QStringLiteral("sports"));
}

void tst_windowdialogs_folder::createRequestIsCancelled()
{
    m_siblings.forget();
    inDialog([this] { request(QString()); }, [this] { press("cancelFolderButton"); });
    QVERIFY(!m_window->isVisible());
    QVERIFY(list()->getCurrentPath().isEmpty());
    // The next request is not dropped.
    request(path("news"));
    QVERIFY(m_window->isVisible());
    QCOMPARE(list()->getCurrentPath(), path("news"));
}

void tst_windowdialogs_folder::subPanelMayMakeFolders()
{
    inDialog([this] { request(QString(), _titler_paramter::SUB_PANEL); },
             [this] {
                 QVERIFY(button("newFolderButton")->isEnabled());
                 press("newFolderButton");
                 QVERIFY(row("Untitled").isValid());
                 QTest::mouseClick(tree()->viewport(), Qt::LeftButton, {},
                                   tree()->visualRect(row("news")).center());
                 QVERIFY(QFileInfo(path("Untitled")).isDir());
                 press("openFolderButton");
             });
    QCOMPARE(list()->getCurrentPath(), path("news"));
}

void tst_windowdialogs_folder::folderButtonOpensItFromTheEditor()
{
    inDialog([this] { request(QString(), _titler_paramter::SUB_PANEL); },
             [this] {
                 choose("news");
                 press("openFolderButton");
             });
    m_window->pushUndoStack(new QUndoCommand);
    inDialog([this] { QMetaObject::invokeMethod(m_window->findChild<ToolsBar*>(), "folderButtonClick"); },
             [this] {
                 choose("sports");
                 press("openFolderButton");
             });
    QVERIFY(m_window->isVisible());
    QCOMPARE(list()->getCurrentPath(), path("sports"));
    m_window->closeTitlerWindow();
    m_window->openFolderDialog(); // nothing shows for a hidden window
    QVERIFY(!picker()->isVisible());
}

void tst_windowdialogs_folder::cancelGoesBackToTheEditor()
{
    request(path("news"));
    inDialog([this] { m_window->openFolderDialog(); }, [this] { press("cancelFolderButton"); });
    QVERIFY(m_window->isVisible());
    QCOMPARE(list()->getCurrentPath(), path("news"));
    QCOMPARE(list()->count(), 2);
}

void tst_windowdialogs_folder::anEmptyListHasNoWayBack()
{
    request(path("news"));
    list()->cleanArchiveList();
    inDialog([this] { m_window->openFolderDialog(); },
             [this] {
                 QVERIFY(!button("cancelFolderButton")->isEnabled());
                 picker()->reject();
                 QVERIFY(picker()->isVisible());
                 choose("news");
                 press("openFolderButton");
             });
    QCOMPARE(list()->count(), 2);
}

void tst_windowdialogs_folder::theOpenFolderTakesNoName()
{
    request(path("news"));
    inDialog([this] { m_window->openFolderDialog(); },
             [this] {
                 QVERIFY(!row("news").data(34).toBool());
                 QVERIFY(row("sports").data(34).toBool());
             });
    m_window->closeTitlerWindow();
    inDialog([this] { request(QString(), _titler_paramter::SUB_PANEL); },
             [this] {
                 QVERIFY(row("news").data(34).toBool());
                 press("cancelFolderButton");
             });
}

void tst_windowdialogs_folder::noticesOfTheFileManager()
{
    EditTitlerController* files = EditTitlerController::getInstance();
    inDialog([this] { request(QString()); },
             [this, files] {
                 QVERIFY(QDir(m_files.titleRoot()).rename("news", QStringLiteral("速報")));
                 files->updateFolderNameInCurrentProjectNotify(
                     {1, path("news").toStdWString(), path(QStringLiteral("速報")).toStdWString()});
                 QVERIFY(row(QStringLiteral("速報")).isValid());
                 QVERIFY(!row("news").isValid());
                 choose("sports");
                 QDir(path("sports")).removeRecursively();
                 files->updateTitlerFolderInFileManagerDelete(L"sports");
                 QVERIFY(!row("sports").isValid());
                 QVERIFY(!button("openFolderButton")->isEnabled());
                 QVERIFY(!button("duplicateFolderButton")->isEnabled());
                 choose(QStringLiteral("速報"));
                 press("openFolderButton");
             });
    QCOMPARE(list()->getCurrentPath(), path(QStringLiteral("速報")));
    QCOMPARE(list()->count(), 2);
}

void tst_windowdialogs_folder::noticesWhileHidden()
{
    EditTitlerController* files = EditTitlerController::getInstance();
    files->updateFolderNameInCurrentProjectNotify({1, L"news", L"later"});
    files->updateTitlerFolderInFileManagerDelete(L"sports");
    files->updateTitlerFolderInFileManagerDelete(L"");
    // What is on the disk counts when the picker opens.
    inDialog([this] { request(QString()); },
             [this] {
                 QVERIFY(row("news").isValid());
                 QVERIFY(row("sports").isValid());
                 press("cancelFolderButton");
             });
}

void tst_windowdialogs_folder::renameOfTheFolderThatIsEdited()
{
    request(path("news") + "/t2.xml");
    QVERIFY(QDir(m_files.titleRoot()).rename("news", "later"));
    EditTitlerController::getInstance()->updateFolderNameInCurrentProjectNotify(
        {1, path("news").toStdWString(), path("later").toStdWString()});
    QCOMPARE(list()->getCurrentPath(), path("later"));
    QCOMPARE(list()->count(), 2);
    const auto* scene = m_window->findChild<CanvasScene*>();
    QCOMPARE(QString::fromStdString(scene->archive()->getPath()), path("later") + "/t2.xml");
    QCOMPARE(picker()->currentFolderName(), QStringLiteral("later"));
    QVERIFY(!QFileInfo::exists(path("news")));
}

void tst_windowdialogs_folder::renameUnderATextThatIsTyped_data()
{
    QTest::addColumn<QString>("opened");
    QTest::newRow("a title") << "/t1.xml";
    QTest::newRow("a folder") << "";
    QTest::newRow("a folder with a slash behind it") << "/";
}

void tst_windowdialogs_folder::renameUnderATextThatIsTyped()
{
    QFETCH(QString, opened);
    request(path("news") + opened);
    auto* scene = m_window->findChild<CanvasScene*>();
    GraphicsText* item = scene->findTextItem(1);
    item->setTextInteractionFlags(Qt::TextEditorInteraction);
    item->textCursor().insertText(QStringLiteral("快讯"));
    QVERIFY(scene->itemIsEditorInteraction());
    QVERIFY(QDir(m_files.titleRoot()).rename("news", "later"));
    EditTitlerController::getInstance()->updateFolderNameInCurrentProjectNotify(
        {1, path("news").toStdWString(), path("later").toStdWString()});
    // What was typed is neither lost nor a step that would go back to the old folder.
    QCOMPARE(scene->findTextItem(1)->toPlainText(), QStringLiteral("t1快讯"));
    for (QAction* action : m_window->findChildren<QAction*>(QString(), Qt::FindDirectChildrenOnly))
        QVERIFY(!action->text().startsWith("Undo") || !action->isEnabled());
    m_window->closeTitlerWindow();
    Archive archive;
    QVERIFY(ArchiveController().getOneArchive(path("later") + "/t1.xml", &archive));
    QCOMPARE(QString::fromStdString(archive.text().front()->getText()), QStringLiteral("t1快讯"));
    for (const char* picture : {"_1920.png", "_960.png", "_240.png", "_240S.png"})
        QVERIFY2(!QImage(path("later") + "/t1" + picture).isNull(), picture);
    QVERIFY(!QFileInfo::exists(path("news")));
}

void tst_windowdialogs_folder::noTemplateLeadsBackToThePicker()
{
    m_files.makeFolder("empty");
    auto* templates = m_window->findChild<TemplatePicker*>();
    bool shown = false;
    m_siblings.forget();
    inDialog([this] { request(QString(), _titler_paramter::SUB_PANEL); },
             [&] {
                 choose("empty");
                 QTimer::singleShot(0, templates, [&] {
                     shown = templates->isVisible() && picker()->isVisible() && isMasked(picker());
                     // A box of another process lies on the upper dialog alone.
                     ShowMessageController::getInstance()->showMessageOpacityWidget();
                     ShowMessageController::getInstance()->hideMessageOpacityWidget();
                     templates->reject();
                 });
                 press("openFolderButton");
                 QVERIFY(picker()->isVisible());
                 QVERIFY(!isMasked(picker()));
                 QVERIFY(isMasked(m_window));
                 choose("news");
                 press("openFolderButton");
             });
    QVERIFY(shown);
    QCOMPARE(list()->getCurrentPath(), path("news"));
    QVERIFY(QDir(path("empty")).entryList({"*.xml"}, QDir::Files).isEmpty());
}

void tst_windowdialogs_folder::masksLieOnTheDialog()
{
    ShowMessageController* messages = ShowMessageController::getInstance();
    inDialog([this] { request(QString()); },
             [this, messages] {
                 messages->showMessageOpacityWidget();
                 QVERIFY(isMasked(picker()));
                 messages->hideMessageOpacityWidget();
                 QVERIFY(!isMasked(picker()));
                 messages->showDialogOpacityWidget();
                 QVERIFY(isMasked(picker()));
                 messages->hideDialogOpacityWidget();
                 QVERIFY(!isMasked(picker()));
                 press("cancelFolderButton");
             });
    request(path("news"));
    messages->showMessageOpacityWidget();
    QVERIFY(!isMasked(picker()));
    messages->hideMessageOpacityWidget();
}

void tst_windowdialogs_folder::languageAndFont()
{
    m_window->slotSystemLanguageChanged(SystemSetupDef::emSystemLanguageChinese);
    const auto* label = picker()->findChild<QLabel*>("folderPickerTitle");
    QCOMPARE(label->font().family(), QStringLiteral("DFHeiW5-A"));
    inDialog([this] { request(QString()); },
             [this] {
                 QCOMPARE(row("news").data(Qt::FontRole).value<QFont>().family(),
                          QStringLiteral("DFHeiW5-A"));
                 press("cancelFolderButton");
             });
    m_window->slotSystemLanguageChanged(SystemSetupDef::emSystemLanguageEnglish);
    QCOMPARE(label->font().family(), QStringLiteral("KST"));
}

int main(int argc, char** argv)
{
    KSInputContext::install();
    QApplication application(argc, argv);
    application.setObjectName("Titler");
    QApplication::setQuitOnLastWindowClosed(false);
    tst_windowdialogs_folder test;
    QTEST_SET_MAIN_SOURCE_PATH
    return QTest::qExec(&test, argc, argv);
}

#include "tst_windowdialogs_folder.moc"
