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
        const QString folder = mFixture.makeFolder(name);
        if (!stems.isEmpty())
            LibraryFixture::fillFolder(folder, stems);
        mList->refreshArchiveList(folder);
        mReports.take();
        mFolders.take();
        return folder;
    }
    ArchiveItem* item(int index) { return mList->archiveItem(index); }
    int selected() const { return mList->getItemIndex(mList->getSelectedArchive()); }
    QString stem(int index) { return QFileInfo(item(index)->getArchiveDataPath()).completeBaseName(); }
    void choose(int index, ArchiveAction::ARCHIVE_ACTION_TYPE type)
    {
        if (index < 0)
            QTest::mouseClick(mList->viewport(), Qt::RightButton, Qt::NoModifier, QPoint(200, 990));
        else
            QTest::mouseClick(item(index), Qt::RightButton, Qt::NoModifier, QPoint(20, 20));
        auto* menu = mList->findChild<ArchiveMenu*>();
        menu->action(type)->trigger();
        mList->slotHideOptionMenu();
    }
    void tap(int index) { QTest::mouseClick(item(index), Qt::LeftButton, Qt::NoModifier, QPoint(20, 20)); }

    LibraryFixture mFixture;
    FakeTitleChangeReporter mReports;
    FakeEditContext mContext;
    FakeTitlerFolderReporter mFolders;
    std::unique_ptr<QUndoStack> mStack;
    std::unique_ptr<QLabel> mLabel;
    std::unique_ptr<ArchiveList> mList;
    QStringList mCanvas;
};

void tst_archivelist_commands::init()
{
    mStack = std::make_unique<QUndoStack>();
    mLabel = std::make_unique<QLabel>();
    mList = std::make_unique<ArchiveList>(mLabel.get(), false);
    mList->setFixedSize(549, 997);
    for (auto signal : {&ArchiveList::deleteCommandSignal, &ArchiveList::pasteCommandSignal,
                        &ArchiveList::focusCommandSignal, &ArchiveList::moveCommandSignal})
        connect(mList.get(), signal, mStack.get(), &QUndoStack::push);
    connect(mList.get(), &ArchiveList::signalUpdateCanvas, this, [this](const Archive* archive) {
        mCanvas.append(archive ? QString::fromStdString(archive->getName()) : QStringLiteral("null"));
    });
    mList->show();
    QVERIFY(QTest::qWaitForWindowExposed(mList.get(), PATIENCE_MS));
    mContext.createNew = false;
    mContext.files.clear();
    mCanvas.clear();
}

void tst_archivelist_commands::cleanup()
{
    mStack.reset();
    mList.reset();
}

void tst_archivelist_commands::deleteOfTheSelectedTitle()
{
    const QString folder = open(QStringLiteral("delete"));
    tap(1);
    mStack->clear();
    choose(1, ArchiveAction::ACTION_DELETE);
    QCOMPARE(LibraryFixture::order(folder), (Names{QStringLiteral("a"), QStringLiteral("c")}));
    QCOMPARE(selected(), 1);
    QCOMPARE(mCanvas.back(), QStringLiteral("c"));
    QCOMPARE(mReports.take(), (Reports{{2, QStringLiteral("b")}}));
    QVERIFY(QFile::exists(folder + QStringLiteral("/b.xml")));

    mStack->undo();
    QCOMPARE(LibraryFixture::order(folder),
             (Names{QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")}));
    QCOMPARE(selected(), 1);
    QVERIFY(item(1)->isVisible());
    QCOMPARE(mCanvas.back(), QStringLiteral("b"));
    QCOMPARE(mReports.take(), (Reports{{4, QStringLiteral("b")}}));
    QVERIFY(mContext.files.isEmpty()); // it was not made in this request

    mStack->redo();
    QCOMPARE(LibraryFixture::order(folder), (Names{QStringLiteral("a"), QStringLiteral("c")}));
}

void tst_archivelist_commands::deleteOfTheLastSelectedTitle()
{
    open(QStringLiteral("delete last"));
    tap(2);
    choose(2, ArchiveAction::ACTION_DELETE);
    QCOMPARE(selected(), 1);
    QCOMPARE(mCanvas.back(), QStringLiteral("b"));
    mStack->undo();
    QCOMPARE(selected(), 2);
    QCOMPARE(stem(2), QStringLiteral("c"));
}

void tst_archivelist_commands::deleteOfTheOnlyTitle()
{
    const QString folder = open(QStringLiteral("delete only"), {QStringLiteral("a")});
    choose(0, ArchiveAction::ACTION_DELETE);
    QVERIFY(mList->isEmpty());
    QVERIFY(!mList->getSelectedArchive());
    QCOMPARE(mCanvas.back(), QStringLiteral("null"));
    QVERIFY(LibraryFixture::order(folder).isEmpty());
    mStack->undo();
    QCOMPARE(selected(), 0);
    QCOMPARE(mCanvas.back(), QStringLiteral("a"));
}

void tst_archivelist_commands::deleteOfAnotherTitleLeavesTheSelection()
{
    open(QStringLiteral("delete other"));
    mCanvas.clear();
    choose(2, ArchiveAction::ACTION_DELETE);
    QCOMPARE(selected(), 0);
    QVERIFY(mCanvas.isEmpty());
    mStack->undo();
    QCOMPARE(selected(), 0);
    QVERIFY(mCanvas.isEmpty());
}

void tst_archivelist_commands::deletedTitleFollowsTheLanguage()
{
    open(QStringLiteral("delete language"));
    QTRY_VERIFY(item(1)->hasChildWidgets());
    choose(1, ArchiveAction::ACTION_DELETE);
    mList->setSystemLanFont(QStringLiteral("DFHeiW5-A"));
    mStack->undo();
    QCOMPARE(item(1)->getRightChild()->findChild<QLabel*>()->font().family(), QStringLiteral("DFHeiW5-A"));
    mList->setSystemLanFont(QStringLiteral("KST"));
}

void tst_archivelist_commands::deletedFilesGoAtTheNextSynchronization()
{
    const QString folder = open(QStringLiteral("deferred"));
    choose(1, ArchiveAction::ACTION_DELETE);
    mReports.take();
    mList->synchronizationFolderFile();
    QVERIFY(!QFile::exists(folder + QStringLiteral("/b.xml")));
    QVERIFY(!QFile::exists(folder + QStringLiteral("/b_240.png")));
    QVERIFY(QFile::exists(folder + QStringLiteral("/c.xml")));
    QCOMPARE(mReports.take(), (Reports{{2, QStringLiteral("b")}}));
}

void tst_archivelist_commands::deleteOfATitleMadeInThisRequest()
{
    open(QStringLiteral("new one"));
    mContext.files = {QStringLiteral("b.xml")};
    choose(1, ArchiveAction::ACTION_DELETE);
    QVERIFY(mContext.files.isEmpty());
    mStack->undo();
    QCOMPARE(mContext.files, (Names{QStringLiteral("b.xml")}));
    mStack->redo();
    QVERIFY(mContext.files.isEmpty());
}

void tst_archivelist_commands::deleteOfTheCopiedTitleKeepsTheCopy()
{
    const QString folder = open(QStringLiteral("keep copy"));
    choose(1, ArchiveAction::ACTION_COPY);
    choose(1, ArchiveAction::ACTION_DELETE);
    mList->synchronizationFolderFile();
    QVERIFY(!QFile::exists(folder + QStringLiteral("/b_240.png")));
    choose(0, ArchiveAction::ACTION_PASTE);
    QCOMPARE(mList->count(), 3);
    QCOMPARE(textLines(item(1)).front(), QStringLiteral("b"));
    QVERIFY(QFile::exists(folder + QLatin1Char('/') + stem(1) + QStringLiteral("_240.png")));
}

void tst_archivelist_commands::pasteGoesBehindTheOperationItem()
{
    const QString folder = open(QStringLiteral("paste"));
    QSignalSpy pasted(mList.get(), &ArchiveList::signalStartPasteArchive);
    tap(2);
    choose(0, ArchiveAction::ACTION_COPY);
    choose(0, ArchiveAction::ACTION_PASTE);
    QCOMPARE(pasted.count(), 1);
    const QString made = stem(1);
    QCOMPARE(LibraryFixture::order(folder),
             (Names{QStringLiteral("a"), made, QStringLiteral("b"), QStringLiteral("c")}));
    QCOMPARE(selected(), 1);
    QCOMPARE(mList->getCurrentOperationArchive(), item(1));
    QCOMPARE(mContext.files, (Names{made + QStringLiteral(".xml")}));
    QCOMPARE(mReports.take(), (Reports{{4, made}}));
    QCOMPARE(mStack->undoText(), QStringLiteral("PasteArchiveCommand-redo"));

    mStack->undo();
    QCOMPARE(LibraryFixture::order(folder),
             (Names{QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")}));
    QCOMPARE(selected(), 2); // the one that was selected before
    QVERIFY(mContext.files.isEmpty());
    QCOMPARE(mReports.take(), (Reports{{2, made}}));
    QCOMPARE(mStack->redoText(), QStringLiteral("PasteArchiveCommand-undo"));

    mStack->redo();
    QCOMPARE(stem(1), made);
    QCOMPARE(selected(), 1);
    QCOMPARE(mContext.files, (Names{made + QStringLiteral(".xml")}));
}

void tst_archivelist_commands::pasteBehindTheLastTitle()
{
    open(QStringLiteral("paste last"));
    choose(0, ArchiveAction::ACTION_COPY);
    choose(-1, ArchiveAction::ACTION_PASTE);
    QCOMPARE(mList->count(), 4);
    QCOMPARE(selected(), 3);
    mStack->undo();
    QCOMPARE(selected(), 0);
}

void tst_archivelist_commands::createInAnEmptyFolder()
{
    const QString folder = open(QStringLiteral("create empty"), {});
    auto temp = LibraryFixture::makeRecord(mFixture.makeFolder(QStringLiteral("presets")),
                                           QStringLiteral("p"), QStringLiteral("From a template"));
    mList->createArchiveFromTemplate(temp.get());
    temp.reset();
    QCOMPARE(mList->count(), 1);
    QCOMPARE(selected(), 0);
    QCOMPARE(LibraryFixture::order(folder), (Names{stem(0)}));
    QCOMPARE(item(0)->getArchiveData()->text().front()->getText(), std::string("From a template"));
    QVERIFY(QFile::exists(item(0)->getArchiveDataPath()));
    mStack->undo();
    QVERIFY(mList->isEmpty());
    QCOMPARE(mCanvas.back(), QStringLiteral("null"));
    mStack->redo();
    QCOMPARE(mList->count(), 1);
}

void tst_archivelist_commands::createByRequestGoesToTheEnd()
{
    mContext.createNew = true;
    const QString folder = open(QStringLiteral("create request"));
    const auto temp = LibraryFixture::makeRecord(mFixture.makeFolder(QStringLiteral("presets")),
                                                 QStringLiteral("p"), QStringLiteral("New"));
    mList->createArchiveFromTemplate(temp.get());
    QCOMPARE(selected(), 3);
    mList->createArchiveFromTemplate(temp.get()); // the operation item is still the last of before
    QCOMPARE(mList->count(), 5);
    QCOMPARE(mContext.files.size(), 2);
    QCOMPARE(LibraryFixture::order(folder).size(), 5);
    QCOMPARE(LibraryFixture::order(folder).mid(0, 3),
             (Names{QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")}));
}

void tst_archivelist_commands::createWithoutAFolderDoesNothing()
{
    const auto temp =
        LibraryFixture::makeRecord(QStringLiteral("/nowhere"), QStringLiteral("p"), QStringLiteral("New"));
    mList->createArchiveFromTemplate(temp.get());
    mList->createArchiveFromTemplate(nullptr);
    QVERIFY(mList->isEmpty());
    QCOMPARE(mStack->count(), 0);
}

void tst_archivelist_commands::createFromABlankTemplate()
{
    const QString folder = open(QStringLiteral("blank template"), {});
    Archive blank;
    mList->createArchiveFromTemplate(&blank);
    mList->createArchiveFromTemplate(&blank);
    QCOMPARE(mList->count(), 2);
    // The titles and the order, and no picture from nowhere.
    QCOMPARE(settledEntries(folder).size(), 3);
    QVERIFY(stem(0) != stem(1));
}

void tst_archivelist_commands::moveAndBack()
{
    const QString folder = open(QStringLiteral("move"));
    ArchiveItem* moved = item(0);
    mList->removeWidgetItem(moved);
    mList->addWidgetItem(moved, 2);
    mList->saveArchiveListOrder();
    mStack->push(new MoveArchiveCommand(mList.get(), moved, 0, 2));
    const Names after{QStringLiteral("b"), QStringLiteral("c"), QStringLiteral("a")};
    QCOMPARE(LibraryFixture::order(folder), after);
    QVERIFY(mFolders.take().isEmpty()); // the drag has told it already
    mStack->undo();
    QCOMPARE(LibraryFixture::order(folder),
             (Names{QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")}));
    QVERIFY(item(0)->isVisible());
    mStack->redo();
    QCOMPARE(LibraryFixture::order(folder), after);
    QCOMPARE(mFolders.take(), (Names{QStringLiteral("order move"), QStringLiteral("order move")}));
}

void tst_archivelist_commands::undoOfAMoveEndsTheOperation()
{
    FakeTitlerAPPEventFilterController events;
    open(QStringLiteral("move border"));
    ArchiveItem* moved = item(1);
    mList->removeWidgetItem(moved);
    mList->addWidgetItem(moved, 2);
    mList->selectOperationArchive(2);
    mStack->push(new MoveArchiveCommand(mList.get(), moved, 1, 2));
    QCOMPARE(moved->styleSheet(), ArchiveItem::OPERATE_AND_UN_SELECT_STATE);
    QVERIFY(events.take().isEmpty());
    mStack->undo();
    QCOMPARE(moved->styleSheet(), ArchiveItem::UN_OPERATE_AND_UN_SELECT_STATE);
    QCOMPARE(events.take(), (QList<QPair<int, bool>>{{2, false}}));
    mStack->redo();
    QVERIFY(events.take().isEmpty());

    // The border of the chosen title stays that of the chosen one.
    mList->selectOperationArchive(0);
    QCOMPARE(item(0)->styleSheet(), ArchiveItem::OPERATE_AND_SELECT_STATE);
    mStack->undo();
    QCOMPARE(item(0)->styleSheet(), ArchiveItem::UN_OPERATE_AND_SELECT_STATE);
    QCOMPARE(events.take(), (QList<QPair<int, bool>>{{2, false}}));
}

void tst_archivelist_commands::runOfTapsIsOneStep()
{
    open(QStringLiteral("focus"),
         {QStringLiteral("before"), QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")});
    tap(1);
    tap(2);
    tap(3);
    QCOMPARE(mStack->count(), 1);
    QCOMPARE(mCanvas.back(), QStringLiteral("c"));
    mStack->undo();
    QCOMPARE(mCanvas.back(), QStringLiteral("before"));
    QCOMPARE(selected(), 0);
    QCOMPARE(item(3)->styleSheet(), ArchiveItem::UN_OPERATE_AND_UN_SELECT_STATE);
    mStack->redo();
    QCOMPARE(mCanvas.back(), QStringLiteral("c"));
    QCOMPARE(selected(), 3);
}

void tst_archivelist_commands::focusStepsAreRemembered()
{
    const QString folder = open(QStringLiteral("focus path"));
    tap(2);
    QCOMPARE(ArchiveController().getLastArchivePath(), folder + QStringLiteral("/c.xml"));
    mStack->undo();
    QCOMPARE(ArchiveController().getLastArchivePath(), folder + QStringLiteral("/a.xml"));
    mStack->redo();
    QCOMPARE(ArchiveController().getLastArchivePath(), folder + QStringLiteral("/c.xml"));
}

void tst_archivelist_commands::focusOfTheSameItemChangesNothing()
{
    open(QStringLiteral("focus same"));
    mStack->push(new FocusArchiveCommand(mList.get(), item(0), item(0)));
    mCanvas.clear();
    mStack->undo();
    mStack->redo();
    QVERIFY(mCanvas.isEmpty());
}

void tst_archivelist_commands::commandsOutliveTheirItems()
{
    const QString folder = open(QStringLiteral("outlive"));
    tap(1);
    choose(0, ArchiveAction::ACTION_COPY);
    choose(0, ArchiveAction::ACTION_PASTE);
    choose(2, ArchiveAction::ACTION_DELETE);
    mStack->push(new MoveArchiveCommand(mList.get(), item(0), 0, 1));
    // The folder is opened anew without clearing the stack, as after a rename from outside.
    mList->refreshArchiveList(folder);
    const QStringList order = LibraryFixture::order(folder);
    while (mStack->canUndo())
        mStack->undo();
    while (mStack->canRedo())
        mStack->redo();
    QCOMPARE(LibraryFixture::order(folder), order);
}

void tst_archivelist_commands::createCommandIsEmpty()
{
    const QString folder = open(QStringLiteral("create command"));
    mStack->push(new CreateArchiveCommand);
    mStack->undo();
    QCOMPARE(LibraryFixture::order(folder).size(), 3);
    QCOMPARE(CreateArchiveCommand().id(), -1);
    QCOMPARE(FocusArchiveCommand(mList.get(), nullptr, nullptr).id(), 1);
}

QTEST_MAIN(tst_archivelist_commands)
#include "tst_archivelist_commands.moc"
