// Create, paste, delete, move and focus through an undo stack: list, order file, request and reports.
#include "ItemLooks.h"
#include "LibraryFixture.h"
#include "tests/support/Patience.h"
#include "tests/support/SettledFolder.h"

#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/ArchiveMenu.h"
#include "library/CreateArchiveCommand.h"
#include "library/DeleteArchiveCommand.h"
#include "library/FocusArchiveCommand.h"
#include "library/MoveArchiveCommand.h"
#include "tests/fakes/FakeTitlerAPPEventFilterController.h"

#include <QLabel>
#include <QSignalSpy>
#include <QTest>
#include <QUndoStack>

class tst_archivelist_commands : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void deleteOfTheSelectedTitle();
    void deleteOfTheLastSelectedTitle();
    void deleteOfTheOnlyTitle();
    void deleteOfAnotherTitleLeavesTheSelection();
    void deletedTitleFollowsTheLanguage();
    void deletedFilesGoAtTheNextSynchronization();
    void deleteOfATitleMadeInThisRequest();
    void deleteOfTheCopiedTitleKeepsTheCopy();
    void pasteGoesBehindTheOperationItem();
    void pasteBehindTheLastTitle();
    void createInAnEmptyFolder();
    void createByRequestGoesToTheEnd();
    void createWithoutAFolderDoesNothing();
    void createFromABlankTemplate();
    void moveAndBack();
    void undoOfAMoveEndsTheOperation();
    void runOfTapsIsOneStep();
    void focusStepsAreRemembered();
    void focusOfTheSameItemChangesNothing();
    void commandsOutliveTheirItems();
    void createCommandIsEmpty();

private:
    using Names = QStringList;
    QString open(const QString& name,
                 const Names& stems = {QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")})
    {
        const QString folder = m_fixture.makeFolder(name);
        if (!stems.isEmpty())
            LibraryFixture::fillFolder(folder, stems);
        m_list->refreshArchiveList(folder);
        m_reports.take();
        m_folders.take();
        return folder;
    }
    ArchiveItem* item(int index) { return m_list->archiveItem(index); }
    int selected() const { return m_list->getItemIndex(m_list->getSelectedArchive()); }
    QString stem(int index) { return QFileInfo(item(index)->getArchiveDataPath()).completeBaseName(); }
    void choose(int index, ArchiveAction::ARCHIVE_ACTION_TYPE type)
    {
        if (index < 0)
            QTest::mouseClick(m_list->viewport(), Qt::RightButton, Qt::NoModifier, QPoint(200, 990));
        else
            QTest::mouseClick(item(index), Qt::RightButton, Qt::NoModifier, QPoint(20, 20));
        auto* menu = m_list->findChild<ArchiveMenu*>();
        menu->action(type)->trigger();
        m_list->slotHideOptionMenu();
    }
    void tap(int index) { QTest::mouseClick(item(index), Qt::LeftButton, Qt::NoModifier, QPoint(20, 20)); }

    LibraryFixture m_fixture;
    FakeTitleChangeReporter m_reports;
    FakeEditContext m_context;
    FakeTitlerFolderReporter m_folders;
    std::unique_ptr<QUndoStack> m_stack;
    std::unique_ptr<QLabel> m_label;
    std::unique_ptr<ArchiveList> m_list;
    QStringList m_canvas;
};

void tst_archivelist_commands::init()
{
    m_stack = std::make_unique<QUndoStack>();
    m_label = std::make_unique<QLabel>();
    m_list = std::make_unique<ArchiveList>(m_label.get(), false);
    m_list->setFixedSize(549, 997);
    for (auto signal : {&ArchiveList::deleteCommandSignal, &ArchiveList::pasteCommandSignal,
                        &ArchiveList::focusCommandSignal, &ArchiveList::moveCommandSignal})
        connect(m_list.get(), signal, m_stack.get(), &QUndoStack::push);
    connect(m_list.get(), &ArchiveList::signalUpdateCanvas, this, [this](const Archive* archive) {
        m_canvas.append(archive ? QString::fromStdString(archive->getName()) : QStringLiteral("null"));
    });
    m_list->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_list.get(), PATIENCE_MS));
    m_context.createNew = false;
    m_context.files.clear();
    m_canvas.clear();
}

void tst_archivelist_commands::cleanup()
{
    m_stack.reset();
    m_list.reset();
}

void tst_archivelist_commands::deleteOfTheSelectedTitle()
{
    const QString folder = open(QStringLiteral("delete"));
    tap(1);
    m_stack->clear();
    choose(1, ArchiveAction::ACTION_DELETE);
    QCOMPARE(LibraryFixture::order(folder), (Names{QStringLiteral("a"), QStringLiteral("c")}));
    QCOMPARE(selected(), 1);
    QCOMPARE(m_canvas.back(), QStringLiteral("c"));
    QCOMPARE(m_reports.take(), (Reports{{2, QStringLiteral("b")}}));
    QVERIFY(QFile::exists(folder + QStringLiteral("/b.xml")));

    m_stack->undo();
    QCOMPARE(LibraryFixture::order(folder),
             (Names{QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")}));
    QCOMPARE(selected(), 1);
    QVERIFY(item(1)->isVisible());
    QCOMPARE(m_canvas.back(), QStringLiteral("b"));
    QCOMPARE(m_reports.take(), (Reports{{4, QStringLiteral("b")}}));
    QVERIFY(m_context.files.isEmpty()); // it was not created by this request

    m_stack->redo();
    QCOMPARE(LibraryFixture::order(folder), (Names{QStringLiteral("a"), QStringLiteral("c")}));
}

void tst_archivelist_commands::deleteOfTheLastSelectedTitle()
{
    open(QStringLiteral("delete last"));
    tap(2);
    choose(2, ArchiveAction::ACTION_DELETE);
    QCOMPARE(selected(), 1);
    QCOMPARE(m_canvas.back(), QStringLiteral("b"));
    m_stack->undo();
    QCOMPARE(selected(), 2);
    QCOMPARE(stem(2), QStringLiteral("c"));
}

void tst_archivelist_commands::deleteOfTheOnlyTitle()
{
    const QString folder = open(QStringLiteral("delete only"), {QStringLiteral("a")});
    choose(0, ArchiveAction::ACTION_DELETE);
    QVERIFY(m_list->isEmpty());
    QVERIFY(!m_list->getSelectedArchive());
    QCOMPARE(m_canvas.back(), QStringLiteral("null"));
    QVERIFY(LibraryFixture::order(folder).isEmpty());
    m_stack->undo();
    QCOMPARE(selected(), 0);
    QCOMPARE(m_canvas.back(), QStringLiteral("a"));
}

void tst_archivelist_commands::deleteOfAnotherTitleLeavesTheSelection()
{
    open(QStringLiteral("delete other"));
    m_canvas.clear();
    choose(2, ArchiveAction::ACTION_DELETE);
    QCOMPARE(selected(), 0);
    QVERIFY(m_canvas.isEmpty());
    m_stack->undo();
    QCOMPARE(selected(), 0);
    QVERIFY(m_canvas.isEmpty());
}

void tst_archivelist_commands::deletedTitleFollowsTheLanguage()
{
    open(QStringLiteral("delete language"));
    QTRY_VERIFY(item(1)->hasChildWidgets());
    choose(1, ArchiveAction::ACTION_DELETE);
    m_list->setSystemLanFont(QStringLiteral("DFHeiW5-A"));
    m_stack->undo();
    QCOMPARE(textArea(item(1))->lineFont().family(), QStringLiteral("DFHeiW5-A"));
    m_list->setSystemLanFont(QStringLiteral("KST"));
}

void tst_archivelist_commands::deletedFilesGoAtTheNextSynchronization()
{
    const QString folder = open(QStringLiteral("deferred"));
    choose(1, ArchiveAction::ACTION_DELETE);
    m_reports.take();
    m_list->synchronizationFolderFile();
    QVERIFY(!QFile::exists(folder + QStringLiteral("/b.xml")));
    QVERIFY(!QFile::exists(folder + QStringLiteral("/b_240.png")));
    QVERIFY(QFile::exists(folder + QStringLiteral("/c.xml")));
    QCOMPARE(m_reports.take(), (Reports{{2, QStringLiteral("b")}}));
}

void tst_archivelist_commands::deleteOfATitleMadeInThisRequest()
{
    open(QStringLiteral("new one"));
    m_context.files = {QStringLiteral("b.xml")};
    choose(1, ArchiveAction::ACTION_DELETE);
    QVERIFY(m_context.files.isEmpty());
    m_stack->undo();
    QCOMPARE(m_context.files, (Names{QStringLiteral("b.xml")}));
    m_stack->redo();
    QVERIFY(m_context.files.isEmpty());
}

void tst_archivelist_commands::deleteOfTheCopiedTitleKeepsTheCopy()
{
    const QString folder = open(QStringLiteral("keep copy"));
    choose(1, ArchiveAction::ACTION_COPY);
    choose(1, ArchiveAction::ACTION_DELETE);
    m_list->synchronizationFolderFile();
    QVERIFY(!QFile::exists(folder + QStringLiteral("/b_240.png")));
    choose(0, ArchiveAction::ACTION_PASTE);
    QCOMPARE(m_list->count(), 3);
    QCOMPARE(textLines(item(1)).front(), QStringLiteral("b"));
    QVERIFY(QFile::exists(folder + QLatin1Char('/') + stem(1) + QStringLiteral("_240.png")));
}

void tst_archivelist_commands::pasteGoesBehindTheOperationItem()
{
    const QString folder = open(QStringLiteral("paste"));
    QSignalSpy pasted(m_list.get(), &ArchiveList::signalStartPasteArchive);
    tap(2);
    choose(0, ArchiveAction::ACTION_COPY);
    choose(0, ArchiveAction::ACTION_PASTE);
    QCOMPARE(pasted.count(), 1);
    const QString made = stem(1);
    QCOMPARE(LibraryFixture::order(folder),
             (Names{QStringLiteral("a"), made, QStringLiteral("b"), QStringLiteral("c")}));
    QCOMPARE(selected(), 1);
    QCOMPARE(m_list->getCurrentOperationArchive(), item(1));
    QCOMPARE(m_context.files, (Names{made + QStringLiteral(".xml")}));
    QCOMPARE(m_reports.take(), (Reports{{4, made}}));
    QCOMPARE(m_stack->undoText(), QStringLiteral("PasteArchiveCommand-redo"));

    m_stack->undo();
    QCOMPARE(LibraryFixture::order(folder),
             (Names{QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")}));
    QCOMPARE(selected(), 2); // the title that was selected before
    QVERIFY(m_context.files.isEmpty());
    QCOMPARE(m_reports.take(), (Reports{{2, made}}));
    QCOMPARE(m_stack->redoText(), QStringLiteral("PasteArchiveCommand-undo"));

    m_stack->redo();
    QCOMPARE(stem(1), made);
    QCOMPARE(selected(), 1);
    QCOMPARE(m_context.files, (Names{made + QStringLiteral(".xml")}));
}

void tst_archivelist_commands::pasteBehindTheLastTitle()
{
    open(QStringLiteral("paste last"));
    choose(0, ArchiveAction::ACTION_COPY);
    choose(-1, ArchiveAction::ACTION_PASTE);
    QCOMPARE(m_list->count(), 4);
    QCOMPARE(selected(), 3);
    m_stack->undo();
    QCOMPARE(selected(), 0);
}

void tst_archivelist_commands::createInAnEmptyFolder()
{
    const QString folder = open(QStringLiteral("create empty"), {});
    auto temp = LibraryFixture::makeRecord(m_fixture.makeFolder(QStringLiteral("presets")),
                                           QStringLiteral("p"), QStringLiteral("From a template"));
    m_list->createArchiveFromTemplate(temp.get());
    temp.reset();
    QCOMPARE(m_list->count(), 1);
    QCOMPARE(selected(), 0);
    QCOMPARE(LibraryFixture::order(folder), (Names{stem(0)}));
    QCOMPARE(item(0)->getArchiveData()->text().front()->getText(), std::string("From a template"));
    QVERIFY(QFile::exists(item(0)->getArchiveDataPath()));
    m_stack->undo();
    QVERIFY(m_list->isEmpty());
    QCOMPARE(m_canvas.back(), QStringLiteral("null"));
    m_stack->redo();
    QCOMPARE(m_list->count(), 1);
}

void tst_archivelist_commands::createByRequestGoesToTheEnd()
{
    m_context.createNew = true;
    const QString folder = open(QStringLiteral("create request"));
    const auto temp = LibraryFixture::makeRecord(m_fixture.makeFolder(QStringLiteral("presets")),
                                                 QStringLiteral("p"), QStringLiteral("New"));
    m_list->createArchiveFromTemplate(temp.get());
    QCOMPARE(selected(), 3);
    m_list->createArchiveFromTemplate(temp.get()); // the operation item is still that of the last command
    QCOMPARE(m_list->count(), 5);
    QCOMPARE(m_context.files.size(), 2);
    QCOMPARE(LibraryFixture::order(folder).size(), 5);
    QCOMPARE(LibraryFixture::order(folder).mid(0, 3),
             (Names{QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")}));
}

void tst_archivelist_commands::createWithoutAFolderDoesNothing()
{
    const auto temp =
        LibraryFixture::makeRecord(QStringLiteral("/nowhere"), QStringLiteral("p"), QStringLiteral("New"));
    m_list->createArchiveFromTemplate(temp.get());
    m_list->createArchiveFromTemplate(nullptr);
    QVERIFY(m_list->isEmpty());
    QCOMPARE(m_stack->count(), 0);
}

void tst_archivelist_commands::createFromABlankTemplate()
{
    const QString folder = open(QStringLiteral("blank template"), {});
    Archive blank;
    m_list->createArchiveFromTemplate(&blank);
    m_list->createArchiveFromTemplate(&blank);
    QCOMPARE(m_list->count(), 2);
    // The folder holds the titles and the order, but no pictures.
    QCOMPARE(settledEntries(folder).size(), 3);
    QVERIFY(stem(0) != stem(1));
}

void tst_archivelist_commands::moveAndBack()
{
    const QString folder = open(QStringLiteral("move"));
    ArchiveItem* moved = item(0);
    m_list->removeWidgetItem(moved);
    m_list->addWidgetItem(moved, 2);
    m_list->saveArchiveListOrder();
    m_stack->push(new MoveArchiveCommand(m_list.get(), moved, 0, 2));
    const Names after{QStringLiteral("b"), QStringLiteral("c"), QStringLiteral("a")};
    QCOMPARE(LibraryFixture::order(folder), after);
    QVERIFY(m_folders.take().isEmpty()); // the drag has reported it already
    m_stack->undo();
    QCOMPARE(LibraryFixture::order(folder),
             (Names{QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")}));
    QVERIFY(item(0)->isVisible());
    m_stack->redo();
    QCOMPARE(LibraryFixture::order(folder), after);
    QCOMPARE(m_folders.take(), (Names{QStringLiteral("order move"), QStringLiteral("order move")}));
}

void tst_archivelist_commands::undoOfAMoveEndsTheOperation()
{
    FakeTitlerAPPEventFilterController events;
    open(QStringLiteral("move border"));
    ArchiveItem* moved = item(1);
    m_list->removeWidgetItem(moved);
    m_list->addWidgetItem(moved, 2);
    m_list->selectOperationArchive(2);
    m_stack->push(new MoveArchiveCommand(m_list.get(), moved, 1, 2));
    QCOMPARE(moved->look(), ArchiveItem::OPERATE_AND_UN_SELECT_STATE);
    QVERIFY(events.take().isEmpty());
    m_stack->undo();
    QCOMPARE(moved->look(), ArchiveItem::UN_OPERATE_AND_UN_SELECT_STATE);
    QCOMPARE(events.take(), (QList<QPair<int, bool>>{{2, false}}));
    m_stack->redo();
    QVERIFY(events.take().isEmpty());

    // The chosen title keeps its border.
    m_list->selectOperationArchive(0);
    QCOMPARE(item(0)->look(), ArchiveItem::OPERATE_AND_SELECT_STATE);
    m_stack->undo();
    QCOMPARE(item(0)->look(), ArchiveItem::UN_OPERATE_AND_SELECT_STATE);
    QCOMPARE(events.take(), (QList<QPair<int, bool>>{{2, false}}));
}

void tst_archivelist_commands::runOfTapsIsOneStep()
{
    open(QStringLiteral("focus"),
         {QStringLiteral("before"), QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")});
    tap(1);
    tap(2);
    tap(3);
    QCOMPARE(m_stack->count(), 1);
    QCOMPARE(m_canvas.back(), QStringLiteral("c"));
    m_stack->undo();
    QCOMPARE(m_canvas.back(), QStringLiteral("before"));
    QCOMPARE(selected(), 0);
    QCOMPARE(item(3)->look(), ArchiveItem::UN_OPERATE_AND_UN_SELECT_STATE);
    m_stack->redo();
    QCOMPARE(m_canvas.back(), QStringLiteral("c"));
    QCOMPARE(selected(), 3);
}

void tst_archivelist_commands::focusStepsAreRemembered()
{
    const QString folder = open(QStringLiteral("focus path"));
    tap(2);
    QCOMPARE(ArchiveController().getLastArchivePath(), folder + QStringLiteral("/c.xml"));
    m_stack->undo();
    QCOMPARE(ArchiveController().getLastArchivePath(), folder + QStringLiteral("/a.xml"));
    m_stack->redo();
    QCOMPARE(ArchiveController().getLastArchivePath(), folder + QStringLiteral("/c.xml"));
}

void tst_archivelist_commands::focusOfTheSameItemChangesNothing()
{
    open(QStringLiteral("focus same"));
    m_stack->push(new FocusArchiveCommand(m_list.get(), item(0), item(0)));
    m_canvas.clear();
    m_stack->undo();
    m_stack->redo();
    QVERIFY(m_canvas.isEmpty());
}

void tst_archivelist_commands::commandsOutliveTheirItems()
{
    const QString folder = open(QStringLiteral("outlive"));
    tap(1);
    choose(0, ArchiveAction::ACTION_COPY);
    choose(0, ArchiveAction::ACTION_PASTE);
    choose(2, ArchiveAction::ACTION_DELETE);
    m_stack->push(new MoveArchiveCommand(m_list.get(), item(0), 0, 1));
    // The folder is opened anew without clearing the stack, as after a rename from outside.
    m_list->refreshArchiveList(folder);
    const QStringList order = LibraryFixture::order(folder);
    while (m_stack->canUndo())
        m_stack->undo();
    while (m_stack->canRedo())
        m_stack->redo();
    QCOMPARE(LibraryFixture::order(folder), order);
}

void tst_archivelist_commands::createCommandIsEmpty()
{
    const QString folder = open(QStringLiteral("create command"));
    m_stack->push(new CreateArchiveCommand);
    m_stack->undo();
    QCOMPARE(LibraryFixture::order(folder).size(), 3);
    QCOMPARE(CreateArchiveCommand().id(), -1);
    QCOMPARE(FocusArchiveCommand(m_list.get(), nullptr, nullptr).id(), 1);
}

QTEST_MAIN(tst_archivelist_commands)
#include "tst_archivelist_commands.moc"
