// The title list on folders: opening, selecting, the option menu, limits, saves that come back.
#include "ItemLooks.h"
#include "LibraryFixture.h"
#include "tests/support/Patience.h"

#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/ArchiveMenu.h"

#include <QGraphicsView>
#include <QLabel>
#include <QScopeGuard>
#include <QScrollBar>
#include <QSignalSpy>
#include <QTest>
#include <QUndoStack>
#include <QWheelEvent>

class tst_archivelist : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void opensAFolderInItsOrder();
    void gapsAndBlankRows();
    void opensAFileInAFolder();
    void missingFileSelectsTheFirst();
    void emptyAndMissingFolders();
    void createRequestOffersATemplate();
    void createRequestForAMissingFileSelectsNothing();
    void fullFolderRefusesNewTitles();
    void fullDiskRefusesNewTitles();
    void autoInitTakesTheLastFolder();
    void autoInitFallsBackToTheFirstFolder();
    void autoInitCanBeInterrupted();
    void tapSelectsAndTellsTheCanvas();
    void tapOnTheSelectedItemChangesNothing();
    void dragScrollsAndSelectsNothing();
    void longHoldOpensTheMenuAndSelectsNothing();
    void menuOnEmptyArea();
    void menuOnAnItem();
    void wheelHidesTheMenu();
    void saveRefreshesTheItem();
    void saveOvertakesTheFirstPicture();
    void textLinesOfOneAndOfManyObjects();
    void letterTailsAreWhole_data();
    void letterTailsAreWhole();
    void itemStyles();
    void itemText_data();
    void itemText();
    void cloneOfAnItem();
    void followsARenamedFolder();
    void renamedEmptyFolderOffersATemplate();
    void changeOfFolderIsReported();
    void synchronizationRemovesWhatTheOrderDoesNotName();
    void cleaningForgetsTheFolder();
    void selectionIsScrolledIntoView();
    void moveModeIgnoresTaps();
    void leftoversOfAKilledSaveAreSwept();
    void language();

private:
    ArchiveItem* item(int index) { return mList->archiveItem(index); }
    QStringList stems() const
    {
        QStringList result;
        for (int i = 0; i < mList->count(); ++i)
            result.append(QFileInfo(mList->archiveItem(i)->getArchiveDataPath()).completeBaseName());
        return result;
    }
    void tap(int index)
    {
        ArchiveItem* target = item(index);
        QTest::mouseClick(target, Qt::LeftButton, Qt::NoModifier, QPoint(20, 20));
    }
    ArchiveMenu* menu() { return mList->findChild<ArchiveMenu*>(); }
    // Opens the menu on the item and chooses an entry.
    void choose(int index, ArchiveAction::ARCHIVE_ACTION_TYPE type)
    {
        QTest::mouseClick(item(index), Qt::RightButton, Qt::NoModifier, QPoint(20, 20));
        const auto row = static_cast<int>(menu()->actions().indexOf(menu()->action(type)));
        QTest::mouseClick(menu(), Qt::LeftButton, Qt::NoModifier, menu()->getMenuItemRect(row).center());
    }
    QStringList enabledActions()
    {
        QStringList result;
        for (const QAction* action : menu()->actions())
            if (action->isEnabled())
                result.append(action->text());
        return result;
    }
    static QStringList numbered(int count)
    {
        QStringList result;
        for (int i = 0; i < count; ++i)
            result.append(QStringLiteral("t%1").arg(i, 2, 10, QLatin1Char('0')));
        return result;
    }
    QString threeTitles(const QString& name)
    {
        const QString folder = mFixture.makeFolder(name);
        LibraryFixture::fillFolder(folder, {QStringLiteral("c"), QStringLiteral("a"), QStringLiteral("b")});
        return folder;
    }

    LibraryFixture mFixture;
    FakeEditContext mContext;
    FakeTitlerFolderReporter mFolders;
    FakeMessageBoxController mMessages;
    std::unique_ptr<QLabel> mLabel;
    std::unique_ptr<ArchiveList> mList;
    QUndoStack mStack;
    QList<QString> mCanvas; // stems sent to the canvas; "null" for none
};

void tst_archivelist::init()
{
    mLabel = std::make_unique<QLabel>();
    mList = std::make_unique<ArchiveList>(mLabel.get(), false);
    mList->setFixedSize(549, 997);
    connect(mList.get(), &ArchiveList::focusCommandSignal, &mStack, &QUndoStack::push);
    connect(mList.get(), &ArchiveList::signalUpdateCanvas, this, [this](const Archive* archive) {
        mCanvas.append(archive ? QString::fromStdString(archive->getName()) : QStringLiteral("null"));
    });
    mList->show();
    QVERIFY(QTest::qWaitForWindowExposed(mList.get(), PATIENCE_MS));
    mContext.createNew = false;
    mFolders.take();
    mMessages.take();
    mCanvas.clear();
}

void tst_archivelist::cleanup()
{
    mStack.clear();
    mList.reset();
    qunsetenv("K2SYS_FS_REMAIN");
}

void tst_archivelist::opensAFolderInItsOrder()
{
    const QString folder = threeTitles(QStringLiteral("新闻 order"));
    QCOMPARE(mLabel->text(), QStringLiteral("Folder"));
    mList->refreshArchiveList(folder);
    QCOMPARE(mList->getCurrentPath(), folder);
    QCOMPARE(mLabel->text(), QStringLiteral("新闻 order"));
    QCOMPARE(stems(), (QStringList{QStringLiteral("c"), QStringLiteral("a"), QStringLiteral("b")}));
    QCOMPARE(mCanvas, (QStringList{QStringLiteral("c")}));
    QCOMPARE(mList->getSelectedArchive(), item(0));
    // The thumbnails follow by and by.
    QTRY_VERIFY(item(2)->hasChildWidgets());
    QCOMPARE(textLines(item(2)).front(), QStringLiteral("b"));
    QCOMPARE(ArchiveController().getLastFolderPath(), folder);
    QCOMPARE(ArchiveController().getLastArchivePath(), folder + QStringLiteral("/c.xml"));
}

void tst_archivelist::gapsAndBlankRows()
{
    const QString folder = threeTitles(QStringLiteral("gaps"));
    QFile::remove(folder + QStringLiteral("/a.xml"));
    LibraryFixture::writeOrder(folder,
                               {QStringLiteral("c"), QStringLiteral("a"), QString(), QStringLiteral("b")});
    mList->refreshArchiveList(folder);
    QCOMPARE(stems(), (QStringList{QStringLiteral("c"), QString(), QStringLiteral("b")}));
    QTRY_VERIFY(item(2)->hasChildWidgets());
    tap(1); // a title without a file
    QCOMPARE(mList->getSelectedArchive(), item(1));
    mList->saveArchiveListOrder();
    QCOMPARE(LibraryFixture::order(folder),
             (QStringList{QStringLiteral("c"), QString(), QStringLiteral("b")}));
}

void tst_archivelist::opensAFileInAFolder()
{
    QSignalSpy picker(mList.get(), &ArchiveList::startTemplatePicker);
    const QString folder = threeTitles(QStringLiteral("in file"));
    mList->refreshArchiveListInFile(folder, QStringLiteral("b.xml"));
    QCOMPARE(mList->getSelectedArchive(), item(2));
    QCOMPARE(mCanvas, (QStringList{QStringLiteral("b")}));
    QCOMPARE(picker.count(), 0);
}

void tst_archivelist::missingFileSelectsTheFirst()
{
    const QString folder = threeTitles(QStringLiteral("no file"));
    mList->refreshArchiveListInFile(folder, QStringLiteral("z.xml"));
    QCOMPARE(mList->getSelectedArchive(), item(0));
    QCOMPARE(mCanvas, (QStringList{QStringLiteral("c")}));
}

void tst_archivelist::emptyAndMissingFolders()
{
    QSignalSpy picker(mList.get(), &ArchiveList::startTemplatePicker);
    mList->refreshArchiveList(mFixture.makeFolder(QStringLiteral("empty")));
    QCOMPARE(picker.count(), 1);
    mList->refreshArchiveList(QStringLiteral("/nonexistent/folder"));
    QCOMPARE(picker.count(), 2);
    mList->refreshArchiveListInFile(mFixture.makeFolder(QStringLiteral("empty")), QStringLiteral("a.xml"));
    QCOMPARE(picker.count(), 3);
    QCOMPARE(mCanvas, (QStringList{QStringLiteral("null"), QStringLiteral("null"), QStringLiteral("null")}));
    QVERIFY(mList->isEmpty());
}

void tst_archivelist::createRequestOffersATemplate()
{
    QSignalSpy picker(mList.get(), &ArchiveList::startTemplatePicker);
    mContext.createNew = true;
    const QString folder = threeTitles(QStringLiteral("create"));
    mList->refreshArchiveList(folder);
    QCOMPARE(picker.count(), 1);
    QCOMPARE(mCanvas, (QStringList{QStringLiteral("null")}));
    QVERIFY(!mList->getSelectedArchive());
    mList->refreshArchiveListInFile(folder, QStringLiteral("a.xml"));
    QCOMPARE(picker.count(), 2);
    QCOMPARE(mList->getSelectedArchive(), item(1));
}

void tst_archivelist::createRequestForAMissingFileSelectsNothing()
{
    QSignalSpy picker(mList.get(), &ArchiveList::startTemplatePicker);
    mContext.createNew = true;
    mList->refreshArchiveListInFile(threeTitles(QStringLiteral("create missing")), QStringLiteral("z.xml"));
    QCOMPARE(mList->count(), 3);
    QVERIFY(!mList->getSelectedArchive());
    QVERIFY(mCanvas.isEmpty());
    QCOMPARE(picker.count(), 1);
    QVERIFY(mMessages.take().isEmpty());

    const QString full = mFixture.makeFolder(QStringLiteral("create missing in full"));
    LibraryFixture::fillFolder(full, numbered(99));
    mList->refreshArchiveListInFile(full, QStringLiteral("z.xml"));
    QVERIFY(!mList->getSelectedArchive());
    QVERIFY(mCanvas.isEmpty());
    QCOMPARE(picker.count(), 1);
    QCOMPARE(mMessages.take(), (Reports{{112, QStringLiteral("99")}}));
}

void tst_archivelist::fullFolderRefusesNewTitles()
{
    QSignalSpy picker(mList.get(), &ArchiveList::startTemplatePicker);
    const QString folder = mFixture.makeFolder(QStringLiteral("full"));
    LibraryFixture::fillFolder(folder, numbered(98));
    mList->refreshArchiveList(folder);
    QVERIFY(!mList->checkArchiveListIsFull()); // the 99th can be made
    LibraryFixture::fillFolder(folder, numbered(99));
    mContext.createNew = true;
    mList->refreshArchiveList(folder);
    QVERIFY(mList->checkArchiveListIsFull());
    QCOMPARE(mMessages.take(), (Reports{{112, QStringLiteral("99")}}));
    QCOMPARE(mCanvas.back(), QStringLiteral("t00"));
    mList->refreshArchiveListInFile(folder, QStringLiteral("t05.xml"));
    QCOMPARE(mMessages.take(), (Reports{{112, QStringLiteral("99")}}));

    QTRY_VERIFY(item(0)->hasChildWidgets());
    choose(0, ArchiveAction::ACTION_CREATE);
    QCOMPARE(mMessages.take(), (Reports{{112, QStringLiteral("99")}}));
    choose(0, ArchiveAction::ACTION_COPY);
    choose(0, ArchiveAction::ACTION_PASTE);
    QCOMPARE(mMessages.take(), (Reports{{113, QStringLiteral("99")}}));
    QCOMPARE(picker.count(), 0);
    // The picker may be open over a full list, which was saved from.
    const auto temp = LibraryFixture::makeRecord(folder, QStringLiteral("t00"), QStringLiteral("text"));
    mList->createArchiveFromTemplate(temp.get());
    QCOMPARE(mMessages.take(), (Reports{{112, QStringLiteral("99")}}));
    QCOMPARE(mList->count(), 99);
}

void tst_archivelist::fullDiskRefusesNewTitles()
{
    QSignalSpy picker(mList.get(), &ArchiveList::startTemplatePicker);
    mList->refreshArchiveList(threeTitles(QStringLiteral("disk")));
    choose(0, ArchiveAction::ACTION_COPY);
    qputenv("K2SYS_FS_REMAIN", "199999999");
    QVERIFY(mList->checkDiskSpaceIsFull());
    choose(0, ArchiveAction::ACTION_CREATE);
    QCOMPARE(mMessages.take(), (Reports{{114, QStringLiteral("File")}}));
    choose(0, ArchiveAction::ACTION_PASTE);
    QCOMPARE(mMessages.take(), (Reports{{116, QString()}}));
    choose(0, ArchiveAction::ACTION_ADD_USER);
    QCOMPARE(mMessages.take(), (Reports{{197, QStringLiteral("UserTemplate_001")}}));
    QCOMPARE(picker.count(), 0);
    qputenv("K2SYS_FS_REMAIN", "200000000");
    QVERIFY(!mList->checkDiskSpaceIsFull());
    choose(0, ArchiveAction::ACTION_CREATE);
    QCOMPARE(picker.count(), 1);
}

void tst_archivelist::autoInitTakesTheLastFolder()
{
    const QString folder = threeTitles(QStringLiteral("last"));
    ArchiveController().setLastFolderPath(folder);
    QLabel label;
    ArchiveList list(&label, true);
    QTRY_COMPARE(list.count(), 3);
    QCOMPARE(list.getCurrentPath(), folder);
    QCOMPARE(label.text(), QStringLiteral("last"));
    QCOMPARE(list.getSelectedArchive(), list.archiveItem(0));
    QCOMPARE(mFolders.take(), (QStringList{QStringLiteral("start last")}));
}

void tst_archivelist::autoInitFallsBackToTheFirstFolder()
{
    threeTitles(QStringLiteral("first"));
    const QString expected = QString::fromStdString(ArchiveController().getFolderList().front());
    for (const QString& last : {QString(), QStringLiteral("/nonexistent")}) {
        ArchiveController().setLastFolderPath(last);
        QLabel label;
        ArchiveList list(&label, true);
        QCOMPARE(list.getCurrentPath(), expected);
    }
}

void tst_archivelist::autoInitCanBeInterrupted()
{
    const QString many = mFixture.makeFolder(QStringLiteral("interrupted"));
    LibraryFixture::fillFolder(many, numbered(40));
    const QString folder = threeTitles(QStringLiteral("instead"));
    QLabel label;
    for (int i = 0; i < 10; ++i) {
        ArchiveController().setLastFolderPath(many);
        ArchiveList list(&label, true);
        if (i % 2 == 0) // otherwise the list goes while its loader runs
            list.refreshArchiveList(folder);
        QCOMPARE(list.count(), i % 2 == 0 ? 3 : 0);
    }
}

void tst_archivelist::tapSelectsAndTellsTheCanvas()
{
    mList->refreshArchiveList(threeTitles(QStringLiteral("tap")));
    QSignalSpy leaving(mList.get(), &ArchiveList::itemSetDefaultState);
    mCanvas.clear();
    tap(2);
    QCOMPARE(mCanvas, (QStringList{QStringLiteral("b")}));
    QCOMPARE(leaving.count(), 1); // the title before gets its pictures
    QCOMPARE(mStack.count(), 1);
    QCOMPARE(item(2)->styleSheet(), ArchiveItem::UN_OPERATE_AND_SELECT_STATE);
    QCOMPARE(item(0)->styleSheet(), ArchiveItem::UN_OPERATE_AND_UN_SELECT_STATE);
    QVERIFY(item(2)->isSelected() && !item(0)->isSelected());
}

void tst_archivelist::tapOnTheSelectedItemChangesNothing()
{
    mList->refreshArchiveList(threeTitles(QStringLiteral("twice")));
    mCanvas.clear();
    mList->selectOperationArchive(0);
    QCOMPARE(item(0)->styleSheet(), ArchiveItem::OPERATE_AND_SELECT_STATE);
    tap(0);
    QCOMPARE(item(0)->styleSheet(), ArchiveItem::UN_OPERATE_AND_SELECT_STATE); // but the border
    QVERIFY(mCanvas.isEmpty());
    QCOMPARE(mStack.count(), 0);
}

void tst_archivelist::dragScrollsAndSelectsNothing()
{
    const QString folder = mFixture.makeFolder(QStringLiteral("drag"));
    LibraryFixture::fillFolder(folder, numbered(12));
    mList->refreshArchiveList(folder);
    mCanvas.clear();
    QWidget* port = mList->viewport();
    QTest::mousePress(port, Qt::LeftButton, Qt::NoModifier, QPoint(100, 700));
    QTest::mouseMove(port, QPoint(100, 600));
    QTest::mouseMove(port, QPoint(100, 500));
    QTest::mouseRelease(port, Qt::LeftButton, Qt::NoModifier, QPoint(100, 500));
    QCOMPARE(mList->verticalScrollBar()->value(), 200);
    QVERIFY(mCanvas.isEmpty());
}

void tst_archivelist::longHoldOpensTheMenuAndSelectsNothing()
{
    mList->refreshArchiveList(threeTitles(QStringLiteral("hold")));
    mCanvas.clear();
    QSignalSpy shown(mList.get(), &ArchiveList::archiveListMenuShow);
    QTest::mousePress(item(1), Qt::LeftButton, Qt::NoModifier, QPoint(20, 20));
    QTRY_COMPARE(shown.count(), 1);
    QVERIFY(mList->IsOptionMenuShowing());
    QCOMPARE(item(1)->styleSheet(), ArchiveItem::OPERATE_AND_UN_SELECT_STATE);
    QTest::mouseRelease(item(1), Qt::LeftButton, Qt::NoModifier, QPoint(20, 20));
    QVERIFY(mCanvas.isEmpty());
    mList->slotHideOptionMenu();
    QVERIFY(!mList->IsOptionMenuShowing());
    QCOMPARE(item(1)->styleSheet(), ArchiveItem::UN_OPERATE_AND_UN_SELECT_STATE);
    tap(1);
    QCOMPARE(mCanvas, (QStringList{QStringLiteral("a")}));

    QTest::mousePress(item(2), Qt::LeftButton, Qt::NoModifier, QPoint(20, 20));
    mList->stopArchiveListTapAndHoldTimer();
    QTest::mouseRelease(item(2), Qt::LeftButton, Qt::NoModifier, QPoint(20, 20));
    QCOMPARE(shown.count(), 1);
}

void tst_archivelist::menuOnEmptyArea()
{
    mList->refreshArchiveList(threeTitles(QStringLiteral("area")));
    QTest::mouseClick(mList->viewport(), Qt::RightButton, Qt::NoModifier, QPoint(200, 900));
    QCOMPARE(enabledActions(), (QStringList{QStringLiteral("Create New")}));
    mList->slotHideOptionMenu();
    choose(0, ArchiveAction::ACTION_COPY);
    QTest::mouseClick(mList->viewport(), Qt::RightButton, Qt::NoModifier, QPoint(200, 900));
    QCOMPARE(enabledActions(), (QStringList{QStringLiteral("Create New"), QStringLiteral("Paste")}));
    mList->slotHideOptionMenu();
    mList->clearCopyArchive();
    QTest::mouseClick(mList->viewport(), Qt::RightButton, Qt::NoModifier, QPoint(200, 900));
    QCOMPARE(enabledActions(), (QStringList{QStringLiteral("Create New")}));
}

void tst_archivelist::menuOnAnItem()
{
    mList->refreshArchiveList(threeTitles(QStringLiteral("on item")));
    QTest::mouseClick(item(1), Qt::RightButton, Qt::NoModifier, QPoint(20, 20));
    QCOMPARE(enabledActions(), (QStringList{QStringLiteral("Create New"), QStringLiteral("Copy"),
                                            QStringLiteral("Delete"), QStringLiteral("Save as Template")}));
    QList<int> types;
    for (QAction* action : menu()->actions())
        types.append(qobject_cast<ArchiveAction*>(action)->getActionType());
    QCOMPARE(types, (QList<int>{0, 1, 2, 3, 5}));
    QCOMPARE(mList->getCurrentOperationArchive(), item(1));
    mList->slotHideOptionMenu();
    QTest::mouseClick(item(2), Qt::RightButton, Qt::NoModifier, QPoint(20, 20));
    QCOMPARE(item(1)->styleSheet(), ArchiveItem::UN_OPERATE_AND_UN_SELECT_STATE);
    QCOMPARE(item(2)->styleSheet(), ArchiveItem::OPERATE_AND_UN_SELECT_STATE);
}

void tst_archivelist::wheelHidesTheMenu()
{
    const QString folder = mFixture.makeFolder(QStringLiteral("wheel"));
    LibraryFixture::fillFolder(folder, numbered(12));
    mList->refreshArchiveList(folder);
    QTest::mouseClick(item(1), Qt::RightButton, Qt::NoModifier, QPoint(20, 20));
    QVERIFY(mList->IsOptionMenuShowing());
    const auto wheel = [this](int delta) {
        QWheelEvent event(QPointF(100, 100), mList->mapToGlobal(QPointF(100, 100)), QPoint(),
                          QPoint(0, delta), Qt::NoButton, Qt::NoModifier, Qt::NoScrollPhase, false);
        // An open popup keeps wheel events that are sent through the application to itself.
        mList->wheelEvent(&event);
    };
    wheel(-120);
    QVERIFY(!mList->IsOptionMenuShowing());
    QCOMPARE(mList->firstVisibleItem(), 1);
    wheel(120);
    QCOMPARE(mList->firstVisibleItem(), 0);
    wheel(120);
    QCOMPARE(mList->firstVisibleItem(), 0);
}

void tst_archivelist::saveRefreshesTheItem()
{
    const QString folder = threeTitles(QStringLiteral("saved"));
    mList->refreshArchiveList(folder);
    QTRY_VERIFY(item(2)->hasChildWidgets());
    const auto changed = LibraryFixture::makeRecord(folder, QStringLiteral("a"), QStringLiteral("速報"));
    QVERIFY(ArchiveController().saveNewArchive(folder, changed.get()));
    QImage picture(240, 135, QImage::Format_ARGB32_Premultiplied);
    picture.fill(Qt::green);
    mList->refreshBaseItem(folder + QStringLiteral("/a.xml"), picture);
    QCOMPARE(textLines(item(1)).front(), QStringLiteral("速報"));
    QCOMPARE(item(1)->getArchiveData()->getName(), std::string("a"));
    const QImage shown = item(1)->grab().toImage();
    QCOMPARE(shown.pixelColor(120, 70), QColor(Qt::green));
    mList->refreshBaseItem(folder + QStringLiteral("/unknown.xml"), picture); // nobody's
    mList->refreshBaseItem(QString(), QImage());
}

// The pictures of an earlier visit to the folder may become ready while its rows are still being built.
void tst_archivelist::saveOvertakesTheFirstPicture()
{
    const QString folder = threeTitles(QStringLiteral("overtaken"));
    mList->refreshArchiveList(folder);
    QVERIFY(!item(1)->hasChildWidgets());
    QImage picture(240, 135, QImage::Format_ARGB32_Premultiplied);
    picture.fill(Qt::green);
    mList->refreshBaseItem(folder + QStringLiteral("/a.xml"), picture);
    QTRY_VERIFY(item(2)->hasChildWidgets());
    QCOMPARE(item(1)->grab().toImage().pixelColor(120, 70), QColor(Qt::green));
    QVERIFY(item(0)->grab().toImage().pixelColor(120, 70) != QColor(Qt::green));
}

void tst_archivelist::textLinesOfOneAndOfManyObjects()
{
    Archive archive;
    archive.setText({LibraryFixture::makeText(QStringLiteral("one\n two"), 1)});
    ArchiveItem one(&archive, ArchiveItem::LIST_ITEM);
    QVERIFY(textLines(&one).isEmpty());
    one.initArchiveItemChildWidget();
    QCOMPARE(textLines(&one), (QStringList{QStringLiteral("one two"), QString(), QString(), QString()}));

    archive.releaseVectorText();
    archive.setText({LibraryFixture::makeText(QString(300, QLatin1Char('W')), 1)});
    one.updateRightChild();
    for (const QString& line : textLines(&one)) {
        QVERIFY(line.startsWith(QLatin1Char('W')));
        QCOMPARE(line.endsWith(QChar(0x2026)), line == textLines(&one).last());
    }

    archive.releaseVectorText();
    archive.setText({LibraryFixture::makeText(QStringLiteral("third"), 3),
                     LibraryFixture::makeText(QStringLiteral("<b>first</b>"), 1),
                     LibraryFixture::makeText(QStringLiteral("fifth"), 5),
                     LibraryFixture::makeText(QStringLiteral("fourth"), 4),
                     LibraryFixture::makeText(QStringLiteral("sec  ond"), 2)});
    one.updateRightChild();
    QCOMPARE(textLines(&one), (QStringList{QStringLiteral("<b>first</b>"), QStringLiteral("sec ond"),
                                           QStringLiteral("third"), QStringLiteral("fourth")}));
    archive.releaseVectorText();
    one.updateRightChild();
    QCOMPARE(textLines(&one), (QStringList{QString(), QString(), QString(), QString()}));
}

void tst_archivelist::letterTailsAreWhole_data()
{
    QTest::addColumn<QString>("family");
    QTest::addColumn<QString>("text");
    QTest::newRow("one script") << "KST"
                                << "gjp";
    QTest::newRow("characters of another family between") << "KST" << QStringLiteral("gjp 快讯 생방송");
    QTest::newRow("a tall family") << "DFHeiW5-A" << QStringLiteral("gjp 快讯");
}

// A line is as high as it is, whatever the families need that stand in for missing characters.
void tst_archivelist::letterTailsAreWhole()
{
    QFETCH(const QString, family);
    QFETCH(const QString, text);
    const QString before = ArchiveItem::SYSTEM_FONT_FAMILY;
    const auto restore = qScopeGuard([&before] { ArchiveItem::setSystemFontFamily(before); });
    ArchiveItem::setSystemFontFamily(family);
    Archive archive;
    archive.setText({LibraryFixture::makeText(text, 1)});
    ArchiveItem shown(&archive, ArchiveItem::LIST_ITEM);
    shown.initArchiveItemChildWidget();
    auto* label = shown.findChild<QLabel*>();
    QVERIFY(label);
    QCOMPARE(label->text(), text);
    const int letters = QFontMetrics(label->font()).horizontalAdvance(QStringLiteral("gjp"));
    const auto ink = [label, letters] {
        const QImage image = label->grab().toImage();
        int pixels = 0;
        for (int y = 0; y < image.height(); ++y)
            for (int x = 0; x < letters; ++x)
                pixels += image.pixelColor(x, y).lightness() > 128 ? 1 : 0;
        return pixels;
    };
    const int inTheLine = ink();
    QVERIFY(inTheLine > 0);
    label->setFixedHeight(4 * label->height());
    QCOMPARE(inTheLine, ink());
}

void tst_archivelist::itemStyles()
{
    Archive archive;
    ArchiveItem shown(&archive, ArchiveItem::LIST_ITEM);
    QCOMPARE(shown.size(), QSize(505, 139));
    shown.initArchiveItemChildWidget();
    const auto* view = shown.findChild<QGraphicsView*>();
    QCOMPARE(view->geometry(), QRect(3, 2, 240, 135));
    shown.setStyleSheet(ArchiveItem::OPERATE_AND_UN_SELECT_STATE);
    QCOMPARE(shown.grab().toImage().pixelColor(250, 0), QColor(0, 186, 230));
    shown.setStyleSheet(ArchiveItem::UN_OPERATE_AND_SELECT_STATE);
    QVERIFY(shown.grab().toImage().pixelColor(246, 10).blue() > 150);
    shown.setStyleSheet(ArchiveItem::UN_OPERATE_AND_UN_SELECT_STATE);
    QCOMPARE(shown.grab().toImage().pixelColor(246, 10), QColor(51, 51, 51));

    ArchiveItem narrow(&archive, ArchiveItem::NARROW_ITEM);
    QCOMPARE(narrow.size(), QSize(254, 139));
    narrow.initArchiveItemChildWidget();
    QVERIFY(!narrow.findChild<QGraphicsView*>());
}

void tst_archivelist::itemText_data()
{
    QTest::addColumn<int>("type");
    QTest::addColumn<QSize>("line");
    QTest::addColumn<QString>("lineStyle");
    QTest::addColumn<QString>("areaStyle");
    QTest::addColumn<int>("top");
    QTest::newRow("list") << int(ArchiveItem::LIST_ITEM) << QSize(254, 33)
                          << " background: transparent; color:rgb(220, 220, 220);" << QString() << 0;
    QTest::newRow("narrow") << int(ArchiveItem::NARROW_ITEM) << QSize(250, 24)
                            << " background: transparent; color:rgb(178, 178, 178);"
                            << " QWidget#mTextWidget { background:rgb(38, 38, 38); }" << 8;
}

void tst_archivelist::itemText()
{
    QFETCH(const int, type);
    QFETCH(const QSize, line);
    QFETCH(const QString, lineStyle);
    QFETCH(const QString, areaStyle);
    QFETCH(const int, top);
    Archive archive;
    ArchiveItem shown(&archive, type);
    shown.initArchiveItemChildWidget();
    const QWidget* area = shown.getRightChild();
    QVERIFY(area);
    QCOMPARE(area->objectName(), QStringLiteral("mTextWidget"));
    QCOMPARE(area->styleSheet(), areaStyle);
    QCOMPARE(area->size(), QSize(254, 135));
    const QList<QLabel*> lines = area->findChildren<QLabel*>();
    QCOMPARE(lines.size(), 4);
    for (int i = 0; i < 4; ++i) {
        QCOMPARE(lines.at(i)->geometry(), QRect(QPoint(0, top + i * line.height()), line));
        QCOMPARE(lines.at(i)->styleSheet(), lineStyle);
    }
}

void tst_archivelist::cloneOfAnItem()
{
    auto archive =
        LibraryFixture::makeRecord(QStringLiteral("/f"), QStringLiteral("t"), QStringLiteral("twin"));
    auto original = std::make_unique<ArchiveItem>(archive.get(), ArchiveItem::LIST_ITEM);
    original->setSelected(true);
    const std::unique_ptr<ArchiveItem> clone(original->clone());
    original.reset();
    archive.reset();
    QCOMPARE(textLines(clone.get()).front(), QStringLiteral("twin"));
    QCOMPARE(clone->styleSheet(), ArchiveItem::OPERATE_AND_SELECT_STATE);
}

void tst_archivelist::followsARenamedFolder()
{
    const QString before = threeTitles(QStringLiteral("before"));
    mFixture.makeFolder(QStringLiteral("after"));
    const QString after = mFixture.titleRoot() + QStringLiteral("/after");
    mList->refreshArchiveList(before);
    mList->selectArchive(1);
    QDir().rmdir(after);
    QVERIFY(QDir().rename(before, after));
    mCanvas.clear();
    mFolders.take();
    mList->refreshArchiveListForChangeFolderName(QStringLiteral("/another"), after);
    QCOMPARE(mList->getCurrentPath(), before);
    QVERIFY(mCanvas.isEmpty());
    QVERIFY(mFolders.take().isEmpty());
    mList->refreshArchiveListForChangeFolderName(before, after);
    QCOMPARE(mList->getCurrentPath(), after);
    QCOMPARE(mList->getSelectedArchive(), item(1));
    QCOMPARE(mCanvas, (QStringList{QStringLiteral("a")}));
    QCOMPARE(ArchiveController().getLastFolderPath(), after);
    QCOMPARE(mLabel->text(), QStringLiteral("after"));
    QCOMPARE(mFolders.take(), (QStringList{QStringLiteral("start after")})); // the old one is no more
}

void tst_archivelist::renamedEmptyFolderOffersATemplate()
{
    const QString before = mFixture.makeFolder(QStringLiteral("empty before"));
    const QString after = mFixture.makeFolder(QStringLiteral("empty after"));
    mList->refreshArchiveList(before);
    QVERIFY(QDir().rmdir(after));
    QVERIFY(QDir().rename(before, after));
    mCanvas.clear();
    QSignalSpy picker(mList.get(), &ArchiveList::startTemplatePicker);
    mList->refreshArchiveListForChangeFolderName(before, after);
    QCOMPARE(picker.count(), 1);
    QCOMPARE(mList->getCurrentPath(), after);
    QCOMPARE(mLabel->text(), QStringLiteral("empty after"));
    QVERIFY(!mList->getSelectedArchive());
    QVERIFY(mCanvas.isEmpty()); // it is empty already
}

void tst_archivelist::changeOfFolderIsReported()
{
    const QString first = threeTitles(QStringLiteral("one"));
    const QString second = threeTitles(QStringLiteral("two"));
    mList->refreshArchiveList(first);
    mList->refreshArchiveList(second);
    QCOMPARE(mFolders.take(), (QStringList{QStringLiteral("start one"), QStringLiteral("end one"),
                                           QStringLiteral("start two")}));
}

void tst_archivelist::synchronizationRemovesWhatTheOrderDoesNotName()
{
    mList->synchronizationFolderFile(); // no folder: nothing
    const QString folder = threeTitles(QStringLiteral("sync"));
    mList->refreshArchiveList(folder);
    LibraryFixture::writeOrder(folder, {QStringLiteral("c"), QStringLiteral("b")});
    mList->synchronizationFolderFile();
    QVERIFY(!QFile::exists(folder + QStringLiteral("/a.xml")));
    QVERIFY(!QFile::exists(folder + QStringLiteral("/a_240.png")));
    QVERIFY(QFile::exists(folder + QStringLiteral("/b.xml")));
}

void tst_archivelist::cleaningForgetsTheFolder()
{
    mList->refreshArchiveList(threeTitles(QStringLiteral("clean")));
    mList->cleanArchiveList();
    QVERIFY(mList->isEmpty());
    QVERIFY(mList->getCurrentPath().isEmpty());
    QVERIFY(mLabel->text().isEmpty());
    QVERIFY(!mList->getSelectedArchive());
    QCoreApplication::processEvents(); // items whose thumbnails were still to come
    QTRY_VERIFY(mList->findChildren<ArchiveItem*>().isEmpty());
}

void tst_archivelist::selectionIsScrolledIntoView()
{
    const QString folder = mFixture.makeFolder(QStringLiteral("scroll"));
    LibraryFixture::fillFolder(folder, numbered(20));
    mList->refreshArchiveList(folder);
    mList->selectArchive(10);
    QCOMPARE(mList->firstVisibleItem(), 4); // the selection stands in the 7th row
    mList->selectArchive(1);
    QCOMPARE(mList->firstVisibleItem(), 1);
    mList->selectArchive(3);
    QCOMPARE(mList->firstVisibleItem(), 1);

    mList->setFixedSize(549, 300);
    const QString six = mFixture.makeFolder(QStringLiteral("six"));
    LibraryFixture::fillFolder(six, numbered(6));
    mList->refreshArchiveList(six);
    mList->selectArchive(5);
    QCOMPARE(mList->firstVisibleItem(), 0);
}

void tst_archivelist::moveModeIgnoresTaps()
{
    mList->refreshArchiveList(threeTitles(QStringLiteral("move mode")));
    QVERIFY(!mList->isMoveMode());
    QSignalSpy drag(mList.get(), &ArchiveList::signalItemsCanDrag);
    mList->moveButtonClicked(true);
    QVERIFY(mList->isMoveMode());
    mCanvas.clear();
    tap(1);
    QTest::mouseClick(item(1), Qt::RightButton, Qt::NoModifier, QPoint(20, 20));
    QVERIFY(mCanvas.isEmpty());
    QVERIFY(!mList->IsOptionMenuShowing());
    mList->moveButtonClicked(false);
    QVERIFY(!mList->isMoveMode());
    QCOMPARE(drag.count(), 2);
}

void tst_archivelist::leftoversOfAKilledSaveAreSwept()
{
    const QString folder = threeTitles(QStringLiteral("leftovers"));
    const QString aside = folder + QStringLiteral("/.titler-new-0-0-1");
    QFile file(aside);
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write("half a pict");
    file.close();
    QLabel label;
    const ArchiveList list(&label, false);
    QVERIFY(!QFile::exists(aside));
    QVERIFY(QFile::exists(folder + QStringLiteral("/a.xml")));
}

void tst_archivelist::language()
{
    mList->refreshArchiveList(threeTitles(QStringLiteral("language")));
    QTRY_VERIFY(item(2)->hasChildWidgets());
    QTest::mouseClick(item(1), Qt::RightButton, Qt::NoModifier, QPoint(20, 20));
    QCOMPARE(menu()->font().family(), QStringLiteral("KST"));
    QCOMPARE(menu()->font().pixelSize(), 28);
    mList->slotHideOptionMenu();
    mList->translateText();
    mList->setSystemLanFont(QStringLiteral("DFHeiW5-A"));
    const QFont font = item(0)->getRightChild()->findChild<QLabel*>()->font();
    QCOMPARE(font.family(), QStringLiteral("DFHeiW5-A"));
    QCOMPARE(font.pixelSize(), 28);
    QTest::mouseClick(item(1), Qt::RightButton, Qt::NoModifier, QPoint(20, 20));
    QCOMPARE(menu()->font().family(), QStringLiteral("DFHeiW5-A"));
    QCOMPARE(menu()->font().pixelSize(), 28);
    mList->setSystemLanFont(QStringLiteral("KST"));
}

QTEST_MAIN(tst_archivelist)
#include "tst_archivelist.moc"
