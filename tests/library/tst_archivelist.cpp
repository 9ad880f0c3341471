// The title list on folders: opening, selecting, the option menu, limits, saves that come back.
#include "ItemLooks.h"
#include "LibraryFixture.h"
#include "tests/support/Patience.h"

#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/ArchiveMenu.h"
#include "library/CheckeredPicture.h"

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
    ArchiveItem* item(int index) { return m_list->archiveItem(index); }
    QStringList stems() const
    {
        QStringList result;
        for (int i = 0; i < m_list->count(); ++i)
            result.append(QFileInfo(m_list->archiveItem(i)->getArchiveDataPath()).completeBaseName());
        return result;
    }
    void tap(int index)
    {
        ArchiveItem* target = item(index);
        QTest::mouseClick(target, Qt::LeftButton, Qt::NoModifier, QPoint(20, 20));
    }
    ArchiveMenu* menu() { return m_list->findChild<ArchiveMenu*>(); }
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
        const QString folder = m_fixture.makeFolder(name);
        LibraryFixture::fillFolder(folder, {QStringLiteral("c"), QStringLiteral("a"), QStringLiteral("b")});
        return folder;
    }

    LibraryFixture m_fixture;
    FakeEditContext m_context;
    FakeTitlerFolderReporter m_folders;
    FakeMessageBoxController m_messages;
    std::unique_ptr<QLabel> m_label;
    std::unique_ptr<ArchiveList> m_list;
    QUndoStack m_stack;
    QList<QString> m_canvas; // stems sent to the canvas; "null" for none
};

void tst_archivelist::init()
{
    m_label = std::make_unique<QLabel>();
    m_list = std::make_unique<ArchiveList>(m_label.get(), false);
    m_list->setFixedSize(549, 997);
    connect(m_list.get(), &ArchiveList::focusCommandSignal, &m_stack, &QUndoStack::push);
    connect(m_list.get(), &ArchiveList::signalUpdateCanvas, this, [this](const Archive* archive) {
        m_canvas.append(archive ? QString::fromStdString(archive->getName()) : QStringLiteral("null"));
    });
    m_list->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_list.get(), PATIENCE_MS));
    m_context.createNew = false;
    m_folders.take();
    m_messages.take();
    m_canvas.clear();
}

void tst_archivelist::cleanup()
{
    m_stack.clear();
    m_list.reset();
    qunsetenv("K2SYS_FS_REMAIN");
}

void tst_archivelist::opensAFolderInItsOrder()
{
    const QString folder = threeTitles(QStringLiteral("新闻 order"));
    QCOMPARE(m_label->text(), QStringLiteral("Folder"));
    m_list->refreshArchiveList(folder);
    QCOMPARE(m_list->getCurrentPath(), folder);
    QCOMPARE(m_label->text(), QStringLiteral("新闻 order"));
    QCOMPARE(stems(), (QStringList{QStringLiteral("c"), QStringLiteral("a"), QStringLiteral("b")}));
    QCOMPARE(m_canvas, (QStringList{QStringLiteral("c")}));
    QCOMPARE(m_list->getSelectedArchive(), item(0));
    // The thumbnails are loaded later.
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
    m_list->refreshArchiveList(folder);
    QCOMPARE(stems(), (QStringList{QStringLiteral("c"), QString(), QStringLiteral("b")}));
    QTRY_VERIFY(item(2)->hasChildWidgets());
    tap(1); // a title without a file
    QCOMPARE(m_list->getSelectedArchive(), item(1));
    m_list->saveArchiveListOrder();
    QCOMPARE(LibraryFixture::order(folder),
             (QStringList{QStringLiteral("c"), QString(), QStringLiteral("b")}));
}

void tst_archivelist::opensAFileInAFolder()
{
    QSignalSpy picker(m_list.get(), &ArchiveList::startTemplatePicker);
    const QString folder = threeTitles(QStringLiteral("in file"));
    m_list->refreshArchiveListInFile(folder, QStringLiteral("b.xml"));
    QCOMPARE(m_list->getSelectedArchive(), item(2));
    QCOMPARE(m_canvas, (QStringList{QStringLiteral("b")}));
    QCOMPARE(picker.count(), 0);
}

void tst_archivelist::missingFileSelectsTheFirst()
{
    const QString folder = threeTitles(QStringLiteral("no file"));
    m_list->refreshArchiveListInFile(folder, QStringLiteral("z.xml"));
    QCOMPARE(m_list->getSelectedArchive(), item(0));
    QCOMPARE(m_canvas, (QStringList{QStringLiteral("c")}));
}

void tst_archivelist::emptyAndMissingFolders()
{
    QSignalSpy picker(m_list.get(), &ArchiveList::startTemplatePicker);
    m_list->refreshArchiveList(m_fixture.makeFolder(QStringLiteral("empty")));
    QCOMPARE(picker.count(), 1);
    m_list->refreshArchiveList(QStringLiteral("/nonexistent/folder"));
    QCOMPARE(picker.count(), 2);
    m_list->refreshArchiveListInFile(m_fixture.makeFolder(QStringLiteral("empty")), QStringLiteral("a.xml"));
    QCOMPARE(picker.count(), 3);
    QCOMPARE(m_canvas, (QStringList{QStringLiteral("null"), QStringLiteral("null"), QStringLiteral("null")}));
    QVERIFY(m_list->isEmpty());
}

void tst_archivelist::createRequestOffersATemplate()
{
    QSignalSpy picker(m_list.get(), &ArchiveList::startTemplatePicker);
    m_context.createNew = true;
    const QString folder = threeTitles(QStringLiteral("create"));
    m_list->refreshArchiveList(folder);
    QCOMPARE(picker.count(), 1);
    QCOMPARE(m_canvas, (QStringList{QStringLiteral("null")}));
    QVERIFY(!m_list->getSelectedArchive());
    m_list->refreshArchiveListInFile(folder, QStringLiteral("a.xml"));
    QCOMPARE(picker.count(), 2);
    QCOMPARE(m_list->getSelectedArchive(), item(1));
}

void tst_archivelist::createRequestForAMissingFileSelectsNothing()
{
    QSignalSpy picker(m_list.get(), &ArchiveList::startTemplatePicker);
    m_context.createNew = true;
    m_list->refreshArchiveListInFile(threeTitles(QStringLiteral("create missing")), QStringLiteral("z.xml"));
    QCOMPARE(m_list->count(), 3);
    QVERIFY(!m_list->getSelectedArchive());
    QVERIFY(m_canvas.isEmpty());
    QCOMPARE(picker.count(), 1);
    QVERIFY(m_messages.take().isEmpty());

    const QString full = m_fixture.makeFolder(QStringLiteral("create missing in full"));
    LibraryFixture::fillFolder(full, numbered(99));
    m_list->refreshArchiveListInFile(full, QStringLiteral("z.xml"));
    QVERIFY(!m_list->getSelectedArchive());
    QVERIFY(m_canvas.isEmpty());
    QCOMPARE(picker.count(), 1);
    QCOMPARE(m_messages.take(), (Reports{{112, QStringLiteral("99")}}));
}

void tst_archivelist::fullFolderRefusesNewTitles()
{
    QSignalSpy picker(m_list.get(), &ArchiveList::startTemplatePicker);
    const QString folder = m_fixture.makeFolder(QStringLiteral("full"));
    LibraryFixture::fillFolder(folder, numbered(98));
    m_list->refreshArchiveList(folder);
    QVERIFY(!m_list->checkArchiveListIsFull()); // there is room for a 99th title
    LibraryFixture::fillFolder(folder, numbered(99));
    m_context.createNew = true;
    m_list->refreshArchiveList(folder);
    QVERIFY(m_list->checkArchiveListIsFull());
    QCOMPARE(m_messages.take(), (Reports{{112, QStringLiteral("99")}}));
    QCOMPARE(m_canvas.back(), QStringLiteral("t00"));
    m_list->refreshArchiveListInFile(folder, QStringLiteral("t05.xml"));
    QCOMPARE(m_messages.take(), (Reports{{112, QStringLiteral("99")}}));

    QTRY_VERIFY(item(0)->hasChildWidgets());
    choose(0, ArchiveAction::ACTION_CREATE);
    QCOMPARE(m_messages.take(), (Reports{{112, QStringLiteral("99")}}));
    choose(0, ArchiveAction::ACTION_COPY);
    choose(0, ArchiveAction::ACTION_PASTE);
    QCOMPARE(m_messages.take(), (Reports{{113, QStringLiteral("99")}}));
    QCOMPARE(picker.count(), 0);
    // The picker may still be open when the list is full.
    const auto temp = LibraryFixture::makeRecord(folder, QStringLiteral("t00"), QStringLiteral("text"));
    m_list->createArchiveFromTemplate(temp.get());
    QCOMPARE(m_messages.take(), (Reports{{112, QStringLiteral("99")}}));
    QCOMPARE(m_list->count(), 99);
}

void tst_archivelist::fullDiskRefusesNewTitles()
{
    QSignalSpy picker(m_list.get(), &ArchiveList::startTemplatePicker);
    m_list->refreshArchiveList(threeTitles(QStringLiteral("disk")));
    choose(0, ArchiveAction::ACTION_COPY);
    qputenv("K2SYS_FS_REMAIN", "199999999");
    QVERIFY(m_list->checkDiskSpaceIsFull());
    choose(0, ArchiveAction::ACTION_CREATE);
    QCOMPARE(m_messages.take(), (Reports{{114, QStringLiteral("File")}}));
    choose(0, ArchiveAction::ACTION_PASTE);
    QCOMPARE(m_messages.take(), (Reports{{116, QString()}}));
    choose(0, ArchiveAction::ACTION_ADD_USER);
    QCOMPARE(m_messages.take(), (Reports{{197, QStringLiteral("UserTemplate_001")}}));
    QCOMPARE(picker.count(), 0);
    qputenv("K2SYS_FS_REMAIN", "200000000");
    QVERIFY(!m_list->checkDiskSpaceIsFull());
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
    QCOMPARE(m_folders.take(), (QStringList{QStringLiteral("start last")}));
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
    const QString many = m_fixture.makeFolder(QStringLiteral("interrupted"));
    LibraryFixture::fillFolder(many, numbered(40));
    const QString folder = threeTitles(QStringLiteral("instead"));
    QLabel label;
    for (int i = 0; i < 10; ++i) {
        ArchiveController().setLastFolderPath(many);
        ArchiveList list(&label, true);
        if (i % 2 == 0) // otherwise the list is destroyed while its loader runs
            list.refreshArchiveList(folder);
        QCOMPARE(list.count(), i % 2 == 0 ? 3 : 0);
    }
}

void tst_archivelist::tapSelectsAndTellsTheCanvas()
{
    m_list->refreshArchiveList(threeTitles(QStringLiteral("tap")));
    QSignalSpy leaving(m_list.get(), &ArchiveList::itemSetDefaultState);
    m_canvas.clear();
    tap(2);
    QCOMPARE(m_canvas, (QStringList{QStringLiteral("b")}));
    QCOMPARE(leaving.count(), 1); // the pictures of the previous title are made
    QCOMPARE(m_stack.count(), 1);
    QCOMPARE(item(2)->styleSheet(), ArchiveItem::UN_OPERATE_AND_SELECT_STATE);
    QCOMPARE(item(0)->styleSheet(), ArchiveItem::UN_OPERATE_AND_UN_SELECT_STATE);
    QVERIFY(item(2)->isSelected() && !item(0)->isSelected());
}

void tst_archivelist::tapOnTheSelectedItemChangesNothing()
{
    m_list->refreshArchiveList(threeTitles(QStringLiteral("twice")));
    m_canvas.clear();
    m_list->selectOperationArchive(0);
    QCOMPARE(item(0)->styleSheet(), ArchiveItem::OPERATE_AND_SELECT_STATE);
    tap(0);
    QCOMPARE(item(0)->styleSheet(), ArchiveItem::UN_OPERATE_AND_SELECT_STATE); // only the border changes
    QVERIFY(m_canvas.isEmpty());
    QCOMPARE(m_stack.count(), 0);
}

void tst_archivelist::dragScrollsAndSelectsNothing()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("drag"));
    LibraryFixture::fillFolder(folder, numbered(12));
    m_list->refreshArchiveList(folder);
    m_canvas.clear();
    QWidget* port = m_list->viewport();
    QTest::mousePress(port, Qt::LeftButton, Qt::NoModifier, QPoint(100, 700));
    QTest::mouseMove(port, QPoint(100, 600));
    QTest::mouseMove(port, QPoint(100, 500));
    QTest::mouseRelease(port, Qt::LeftButton, Qt::NoModifier, QPoint(100, 500));
    QCOMPARE(m_list->verticalScrollBar()->value(), 200);
    QVERIFY(m_canvas.isEmpty());
}

void tst_archivelist::longHoldOpensTheMenuAndSelectsNothing()
{
    m_list->refreshArchiveList(threeTitles(QStringLiteral("hold")));
    m_canvas.clear();
    QSignalSpy shown(m_list.get(), &ArchiveList::archiveListMenuShow);
    QTest::mousePress(item(1), Qt::LeftButton, Qt::NoModifier, QPoint(20, 20));
    QTRY_COMPARE(shown.count(), 1);
    QVERIFY(m_list->IsOptionMenuShowing());
    QCOMPARE(item(1)->styleSheet(), ArchiveItem::OPERATE_AND_UN_SELECT_STATE);
    QTest::mouseRelease(item(1), Qt::LeftButton, Qt::NoModifier, QPoint(20, 20));
    QVERIFY(m_canvas.isEmpty());
    m_list->slotHideOptionMenu();
    QVERIFY(!m_list->IsOptionMenuShowing());
    QCOMPARE(item(1)->styleSheet(), ArchiveItem::UN_OPERATE_AND_UN_SELECT_STATE);
    tap(1);
    QCOMPARE(m_canvas, (QStringList{QStringLiteral("a")}));

    QTest::mousePress(item(2), Qt::LeftButton, Qt::NoModifier, QPoint(20, 20));
    m_list->stopArchiveListTapAndHoldTimer();
    QTest::mouseRelease(item(2), Qt::LeftButton, Qt::NoModifier, QPoint(20, 20));
    QCOMPARE(shown.count(), 1);
}

void tst_archivelist::menuOnEmptyArea()
{
    m_list->refreshArchiveList(threeTitles(QStringLiteral("area")));
    QTest::mouseClick(m_list->viewport(), Qt::RightButton, Qt::NoModifier, QPoint(200, 900));
    QCOMPARE(enabledActions(), (QStringList{QStringLiteral("Create New")}));
    m_list->slotHideOptionMenu();
    choose(0, ArchiveAction::ACTION_COPY);
    QTest::mouseClick(m_list->viewport(), Qt::RightButton, Qt::NoModifier, QPoint(200, 900));
    QCOMPARE(enabledActions(), (QStringList{QStringLiteral("Create New"), QStringLiteral("Paste")}));
    m_list->slotHideOptionMenu();
    m_list->clearCopyArchive();
    QTest::mouseClick(m_list->viewport(), Qt::RightButton, Qt::NoModifier, QPoint(200, 900));
    QCOMPARE(enabledActions(), (QStringList{QStringLiteral("Create New")}));
}

void tst_archivelist::menuOnAnItem()
{
    m_list->refreshArchiveList(threeTitles(QStringLiteral("on item")));
    QTest::mouseClick(item(1), Qt::RightButton, Qt::NoModifier, QPoint(20, 20));
    QCOMPARE(enabledActions(), (QStringList{QStringLiteral("Create New"), QStringLiteral("Copy"),
                                            QStringLiteral("Delete"), QStringLiteral("Save as Template")}));
    QList<int> types;
    for (QAction* action : menu()->actions())
        types.append(qobject_cast<ArchiveAction*>(action)->getActionType());
    QCOMPARE(types, (QList<int>{0, 1, 2, 3, 5}));
    QCOMPARE(m_list->getCurrentOperationArchive(), item(1));
    m_list->slotHideOptionMenu();
    QTest::mouseClick(item(2), Qt::RightButton, Qt::NoModifier, QPoint(20, 20));
    QCOMPARE(item(1)->styleSheet(), ArchiveItem::UN_OPERATE_AND_UN_SELECT_STATE);
    QCOMPARE(item(2)->styleSheet(), ArchiveItem::OPERATE_AND_UN_SELECT_STATE);
}

void tst_archivelist::wheelHidesTheMenu()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("wheel"));
    LibraryFixture::fillFolder(folder, numbered(12));
    m_list->refreshArchiveList(folder);
    QTest::mouseClick(item(1), Qt::RightButton, Qt::NoModifier, QPoint(20, 20));
    QVERIFY(m_list->IsOptionMenuShowing());
    const auto wheel = [this](int delta) {
        QWheelEvent event(QPointF(100, 100), m_list->mapToGlobal(QPointF(100, 100)), QPoint(),
                          QPoint(0, delta), Qt::NoButton, Qt::NoModifier, Qt::NoScrollPhase, false);
        // An open popup keeps wheel events that are sent through the application to itself.
        m_list->wheelEvent(&event);
    };
    wheel(-120);
    QVERIFY(!m_list->IsOptionMenuShowing());
    QCOMPARE(m_list->firstVisibleItem(), 1);
    wheel(120);
    QCOMPARE(m_list->firstVisibleItem(), 0);
    wheel(120);
    QCOMPARE(m_list->firstVisibleItem(), 0);
}

void tst_archivelist::saveRefreshesTheItem()
{
    const QString folder = threeTitles(QStringLiteral("saved"));
    m_list->refreshArchiveList(folder);
    QTRY_VERIFY(item(2)->hasChildWidgets());
    const auto changed = LibraryFixture::makeRecord(folder, QStringLiteral("a"), QStringLiteral("速報"));
    QVERIFY(ArchiveController().saveNewArchive(folder, changed.get()));
    QImage picture(240, 135, QImage::Format_ARGB32_Premultiplied);
    picture.fill(Qt::green);
    m_list->refreshBaseItem(folder + QStringLiteral("/a.xml"), picture);
    QCOMPARE(textLines(item(1)).front(), QStringLiteral("速報"));
    QCOMPARE(item(1)->getArchiveData()->getName(), std::string("a"));
    const QImage shown = item(1)->grab().toImage();
    QCOMPARE(shown.pixelColor(120, 70), QColor(Qt::green));
    m_list->refreshBaseItem(folder + QStringLiteral("/unknown.xml"), picture); // no title has this path
    m_list->refreshBaseItem(QString(), QImage());
}

// The pictures of an earlier visit to the folder may become ready while its rows are still being built.
void tst_archivelist::saveOvertakesTheFirstPicture()
{
    const QString folder = threeTitles(QStringLiteral("overtaken"));
    m_list->refreshArchiveList(folder);
    QVERIFY(!item(1)->hasChildWidgets());
    QImage picture(240, 135, QImage::Format_ARGB32_Premultiplied);
    picture.fill(Qt::green);
    m_list->refreshBaseItem(folder + QStringLiteral("/a.xml"), picture);
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

// The height of a line does not depend on the fonts that replace missing characters.
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
    const auto* picture = shown.findChild<CheckeredPicture*>();
    QCOMPARE(picture->geometry(), QRect(3, 2, 240, 135));
    shown.setStyleSheet(ArchiveItem::OPERATE_AND_UN_SELECT_STATE);
    QCOMPARE(shown.grab().toImage().pixelColor(250, 0), QColor(0, 186, 230));
    shown.setStyleSheet(ArchiveItem::UN_OPERATE_AND_SELECT_STATE);
    QVERIFY(shown.grab().toImage().pixelColor(246, 10).blue() > 150);
    shown.setStyleSheet(ArchiveItem::UN_OPERATE_AND_UN_SELECT_STATE);
    QCOMPARE(shown.grab().toImage().pixelColor(246, 10), QColor(51, 51, 51));

    ArchiveItem narrow(&archive, ArchiveItem::NARROW_ITEM);
    QCOMPARE(narrow.size(), QSize(254, 139));
    narrow.initArchiveItemChildWidget();
    QVERIFY(!narrow.findChild<CheckeredPicture*>());
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
    m_fixture.makeFolder(QStringLiteral("after"));
    const QString after = m_fixture.titleRoot() + QStringLiteral("/after");
    m_list->refreshArchiveList(before);
    m_list->selectArchive(1);
    QDir().rmdir(after);
    QVERIFY(QDir().rename(before, after));
    m_canvas.clear();
    m_folders.take();
    m_list->refreshArchiveListForChangeFolderName(QStringLiteral("/another"), after);
    QCOMPARE(m_list->getCurrentPath(), before);
    QVERIFY(m_canvas.isEmpty());
    QVERIFY(m_folders.take().isEmpty());
    m_list->refreshArchiveListForChangeFolderName(before, after);
    QCOMPARE(m_list->getCurrentPath(), after);
    QCOMPARE(m_list->getSelectedArchive(), item(1));
    QCOMPARE(m_canvas, (QStringList{QStringLiteral("a")}));
    QCOMPARE(ArchiveController().getLastFolderPath(), after);
    QCOMPARE(m_label->text(), QStringLiteral("after"));
    // the old path does not exist any more
    QCOMPARE(m_folders.take(), (QStringList{QStringLiteral("start after")}));
}

void tst_archivelist::renamedEmptyFolderOffersATemplate()
{
    const QString before = m_fixture.makeFolder(QStringLiteral("empty before"));
    const QString after = m_fixture.makeFolder(QStringLiteral("empty after"));
    m_list->refreshArchiveList(before);
    QVERIFY(QDir().rmdir(after));
    QVERIFY(QDir().rename(before, after));
    m_canvas.clear();
    QSignalSpy picker(m_list.get(), &ArchiveList::startTemplatePicker);
    m_list->refreshArchiveListForChangeFolderName(before, after);
    QCOMPARE(picker.count(), 1);
    QCOMPARE(m_list->getCurrentPath(), after);
    QCOMPARE(m_label->text(), QStringLiteral("empty after"));
    QVERIFY(!m_list->getSelectedArchive());
    QVERIFY(m_canvas.isEmpty()); // the canvas was empty before
}

void tst_archivelist::changeOfFolderIsReported()
{
    const QString first = threeTitles(QStringLiteral("one"));
    const QString second = threeTitles(QStringLiteral("two"));
    m_list->refreshArchiveList(first);
    m_list->refreshArchiveList(second);
    QCOMPARE(m_folders.take(), (QStringList{QStringLiteral("start one"), QStringLiteral("end one"),
                                            QStringLiteral("start two")}));
}

void tst_archivelist::synchronizationRemovesWhatTheOrderDoesNotName()
{
    m_list->synchronizationFolderFile(); // does nothing without a folder
    const QString folder = threeTitles(QStringLiteral("sync"));
    m_list->refreshArchiveList(folder);
    LibraryFixture::writeOrder(folder, {QStringLiteral("c"), QStringLiteral("b")});
    m_list->synchronizationFolderFile();
    QVERIFY(!QFile::exists(folder + QStringLiteral("/a.xml")));
    QVERIFY(!QFile::exists(folder + QStringLiteral("/a_240.png")));
    QVERIFY(QFile::exists(folder + QStringLiteral("/b.xml")));
}

void tst_archivelist::cleaningForgetsTheFolder()
{
    m_list->refreshArchiveList(threeTitles(QStringLiteral("clean")));
    m_list->cleanArchiveList();
    QVERIFY(m_list->isEmpty());
    QVERIFY(m_list->getCurrentPath().isEmpty());
    QVERIFY(m_label->text().isEmpty());
    QVERIFY(!m_list->getSelectedArchive());
    QCoreApplication::processEvents(); // items whose thumbnails had not been loaded
    QTRY_VERIFY(m_list->findChildren<ArchiveItem*>().isEmpty());
}

void tst_archivelist::selectionIsScrolledIntoView()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("scroll"));
    LibraryFixture::fillFolder(folder, numbered(20));
    m_list->refreshArchiveList(folder);
    m_list->selectArchive(10);
    QCOMPARE(m_list->firstVisibleItem(), 4); // the selected title is in the 7th row
    m_list->selectArchive(1);
    QCOMPARE(m_list->firstVisibleItem(), 1);
    m_list->selectArchive(3);
    QCOMPARE(m_list->firstVisibleItem(), 1);

    m_list->setFixedSize(549, 300);
    const QString six = m_fixture.makeFolder(QStringLiteral("six"));
    LibraryFixture::fillFolder(six, numbered(6));
    m_list->refreshArchiveList(six);
    m_list->selectArchive(5);
    QCOMPARE(m_list->firstVisibleItem(), 0);
}

void tst_archivelist::moveModeIgnoresTaps()
{
    m_list->refreshArchiveList(threeTitles(QStringLiteral("move mode")));
    QVERIFY(!m_list->isMoveMode());
    QSignalSpy drag(m_list.get(), &ArchiveList::signalItemsCanDrag);
    m_list->moveButtonClicked(true);
    QVERIFY(m_list->isMoveMode());
    m_canvas.clear();
    tap(1);
    QTest::mouseClick(item(1), Qt::RightButton, Qt::NoModifier, QPoint(20, 20));
    QVERIFY(m_canvas.isEmpty());
    QVERIFY(!m_list->IsOptionMenuShowing());
    m_list->moveButtonClicked(false);
    QVERIFY(!m_list->isMoveMode());
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
    m_list->refreshArchiveList(threeTitles(QStringLiteral("language")));
    QTRY_VERIFY(item(2)->hasChildWidgets());
    QTest::mouseClick(item(1), Qt::RightButton, Qt::NoModifier, QPoint(20, 20));
    QCOMPARE(menu()->font().family(), QStringLiteral("KST"));
    QCOMPARE(menu()->font().pixelSize(), 28);
    m_list->slotHideOptionMenu();
    m_list->translateText();
    m_list->setSystemLanFont(QStringLiteral("DFHeiW5-A"));
    const QFont font = item(0)->getRightChild()->findChild<QLabel*>()->font();
    QCOMPARE(font.family(), QStringLiteral("DFHeiW5-A"));
    QCOMPARE(font.pixelSize(), 28);
    QTest::mouseClick(item(1), Qt::RightButton, Qt::NoModifier, QPoint(20, 20));
    QCOMPARE(menu()->font().family(), QStringLiteral("DFHeiW5-A"));
    QCOMPARE(menu()->font().pixelSize(), 28);
    m_list->setSystemLanFont(QStringLiteral("KST"));
}

QTEST_MAIN(tst_archivelist)
#include "tst_archivelist.moc"
