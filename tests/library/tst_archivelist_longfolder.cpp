// Folders of more titles than an operator can make: items come as they are looked at and go again, titles are
// read by and by, and every operation does what it does in a short folder.
#include "ItemLooks.h"
#include "TitleListFixture.h"
#include "tests/support/Patience.h"

#include "tests/touchui/TouchDevice.h"

#include <QLabel>
#include <QSignalSpy>
#include <unistd.h>

using Names = QStringList;
using List = TitleListFixture;

class tst_archivelist_longfolder : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void itemsAreMadeAsTheyComeIntoView();
    void itemsAreGivenBack();
    void givenBackItemShowsTheSameAgain();
    void selectedItemIsKept();
    void itemsOfUndoStepsAreKept();
    void closingGivesEverythingBack();
    void closingWhileTitlesAreRead();
    void unreadableTitlesDisappear();
    void unreadableTitlesAboveTheView();
    void unreadableTitleInView();
    void fileThatGoesLater();
    void firstHundredAreMissing();
    void orderIsWholeWhileTitlesAreRead();
    void opensATitleFarDown();
    void opensAnUnreadableTitleFarDown();
    void blankRowFarDown();
    void savedTitleFarDown();
    void renamedFolderKeepsTheSelection();
    void fullFolderTakesNoNewTitle();
    void manyUnreadableLeaveRoom();
    void deleteFarDown();
    void moveFarDown();
    void moveModeReachesLateItems();
    void languageReachesLateItems();
    void loadedByTheThread();

private:
    static constexpr int TITLES = 400;
    static constexpr int MOST_ITEMS = 120;
    static constexpr int MARGIN = 20; // of items that are made between two looks at their number

    static QString stem(int number) { return QStringLiteral("t%1").arg(number, 3, 10, QLatin1Char('0')); }
    static Names stems(int count = TITLES)
    {
        Names result;
        for (int i = 0; i < count; ++i)
            result.append(stem(i));
        return result;
    }
    static Names without(std::initializer_list<int> numbers)
    {
        Names result = stems();
        for (const int number : numbers)
            result.removeOne(stem(number));
        return result;
    }
    QString makeFolder()
    {
        const QString folder = m_fixture.titleRoot() + QStringLiteral("/long%1").arg(++m_folderNumber);
        if (m_pattern.isEmpty())
            makePattern();
        QDir().mkpath(folder);
        // Hard links are made quickly and are safe, since files are replaced, not written to.
        for (const QString& name : QDir(m_pattern).entryList(QDir::Files))
            ::link(qPrintable(m_pattern + '/' + name), qPrintable(folder + '/' + name));
        QFile::copy(m_pattern + "/.order.xml", folder + "/.order.xml");
        return folder;
    }
    // All titles are the first one with another name.
    void makePattern()
    {
        m_pattern = m_fixture.makeFolder(QStringLiteral("pattern"));
        LibraryFixture::fillFolder(m_pattern, {stem(0)});
        QFile first(m_pattern + '/' + stem(0) + ".xml");
        QVERIFY(first.open(QIODevice::ReadOnly));
        const QByteArray bytes = first.readAll();
        const QByteArray name = stem(0).toUtf8();
        for (int number = 1; number < TITLES; ++number) {
            QFile file(m_pattern + '/' + stem(number) + ".xml");
            QVERIFY(file.open(QIODevice::WriteOnly));
            file.write(QByteArray(bytes).replace(name, stem(number).toUtf8()));
            ::link(qPrintable(m_pattern + '/' + stem(0) + "_240.png"),
                   qPrintable(m_pattern + '/' + stem(number) + "_240.png"));
        }
        LibraryFixture::writeOrder(m_pattern, stems());
    }
    static void spoil(const QString& folder, int number)
    {
        QFile file(folder + '/' + stem(number) + ".xml");
        QVERIFY(file.remove());
        QVERIFY(file.open(QIODevice::WriteOnly));
        file.write("<manifest><meta-bg");
    }
    // Opens a long folder without waiting until its titles are read.
    QString openLong()
    {
        const QString folder = makeFolder();
        m->list->refreshArchiveList(folder);
        m->canvas.clear();
        m_folders.take();
        return folder;
    }
    // Returns the names without making items.
    Names listed() const
    {
        Names result;
        for (int i = 0; i < m->list->count(); ++i)
            result.append(QFileInfo(m->list->titlePath(i)).completeBaseName());
        return result;
    }
    int items() const { return static_cast<int>(m->list->findChildren<ArchiveItem*>().size()); }
    QString shownStem(int row) const
    {
        const ArchiveItem* item = m->item(row);
        return item ? QFileInfo(item->getArchiveDataPath()).completeBaseName() : QString();
    }
    void scrollThroughAll()
    {
        for (int row = 0; row < m->list->count(); row += 5) {
            m->list->moveToWidgetItem(row);
            QCoreApplication::processEvents();
        }
    }

    LibraryFixture m_fixture;
    FakeEditContext m_context;
    FakeTitlerFolderReporter m_folders;
    FakeTitleChangeReporter m_reports;
    FakeMessageBoxController m_messages;
    TouchDevice m_device;
    QString m_pattern;
    int m_folderNumber = 0;
    std::unique_ptr<TitleListFixture> m;
};

void tst_archivelist_longfolder::init()
{
    m = std::make_unique<TitleListFixture>(m_device);
    m_messages.take();
    m_reports.take();
}

void tst_archivelist_longfolder::cleanup()
{
    m.reset();
}

void tst_archivelist_longfolder::itemsAreMadeAsTheyComeIntoView()
{
    openLong();
    QCOMPARE(m->list->count(), TITLES);
    QCOMPARE(items(), 7);
    QCOMPARE(m->maximum(), TITLES * List::ROW - 4 - 997);
    QTRY_VERIFY(m->item(6)->hasChildWidgets());
    m->list->moveToWidgetItem(200);
    QCOMPARE(items(), 14);
    QCOMPARE(shownStem(203), stem(203));
    QTRY_VERIFY(m->item(206)->hasChildWidgets());
    QCOMPARE(textLines(m->item(203)).front(), stem(203));
    QCOMPARE(m->item(203)->grab().toImage().pixelColor(120, 70), QColor(Qt::red));
    m->tapTitle(3);
    QCOMPARE(m->takeCanvas(), Names{stem(203)});
    QCOMPARE(m->selected(), 203);
    QCOMPARE(listed(), stems());
}

void tst_archivelist_longfolder::itemsAreGivenBack()
{
    openLong();
    scrollThroughAll();
    QTRY_VERIFY2(items() <= MOST_ITEMS + MARGIN, qPrintable(QString::number(items())));
    QCOMPARE(listed(), stems());
    m->list->moveToWidgetItem(0);
    scrollThroughAll();
    QTRY_VERIFY2(items() <= MOST_ITEMS + MARGIN, qPrintable(QString::number(items())));
    QCOMPARE(m->takeCanvas(), Names());
    QCOMPARE(m->selected(), 0);
}

void tst_archivelist_longfolder::givenBackItemShowsTheSameAgain()
{
    openLong();
    m->list->selectArchive(300);
    QTRY_VERIFY(m->item(300)->hasChildWidgets());
    m->list->moveToWidgetItem(0);
    const QPointer<ArchiveItem> before = m->item(3);
    QTRY_VERIFY(before->hasChildWidgets());
    const QImage look = before->grab().toImage();
    scrollThroughAll();
    QTRY_VERIFY(!before);
    m->list->moveToWidgetItem(0);
    QTRY_VERIFY(m->item(3)->hasChildWidgets());
    QCOMPARE(m->item(3)->grab().toImage(), look);
    QCOMPARE(textLines(m->item(3)).front(), stem(3));
}

void tst_archivelist_longfolder::selectedItemIsKept()
{
    openLong();
    m->list->moveToWidgetItem(100);
    m->tapTitle(2);
    const QPointer<ArchiveItem> selected = m->list->getSelectedArchive();
    m->list->moveToWidgetItem(150);
    m->hold(List::PICTURE_X, 60);
    m->list->slotHideOptionMenu();
    const QPointer<ArchiveItem> operation = m->list->getCurrentOperationArchive();
    scrollThroughAll();
    QTRY_VERIFY(items() <= MOST_ITEMS + MARGIN);
    QVERIFY(selected && operation);
    QCOMPARE(m->selected(), 102);
    QCOMPARE(m->item(102), selected.data());
    QCOMPARE(m->item(150), operation.data());
    QCOMPARE(m->item(102)->look(), ArchiveItem::UN_OPERATE_AND_SELECT_STATE);
}

void tst_archivelist_longfolder::itemsOfUndoStepsAreKept()
{
    openLong();
    m->list->moveToWidgetItem(100);
    m->holdAndChoose(0, ArchiveAction::ACTION_DELETE);
    m->tapTitle(2); // 103: 100 is gone
    m->list->moveToWidgetItem(300);
    m->tapTitle(0);
    QCOMPARE(m->takeCanvas(), (Names{stem(103), stem(301)}));
    scrollThroughAll();
    QTRY_VERIFY(items() <= MOST_ITEMS + MARGIN);
    m->stack.undo(); // the run of taps
    QCOMPARE(m->takeCanvas(), Names{stem(0)});
    m->stack.redo();
    QCOMPARE(m->takeCanvas(), Names{stem(301)});
    QCOMPARE(m->selected(), 300);
    m->stack.undo();
    m->stack.undo(); // the deletion
    QCOMPARE(listed(), stems());
    QCOMPARE(shownStem(100), stem(100));
    m->stack.clear();
    scrollThroughAll();
    QTRY_VERIFY(items() <= MOST_ITEMS + MARGIN);
}

void tst_archivelist_longfolder::closingGivesEverythingBack()
{
    openLong();
    scrollThroughAll();
    m->list->cleanArchiveList();
    QVERIFY(m->list->isEmpty());
    QTRY_COMPARE(items(), 0);
    QCOMPARE(m->maximum(), 0);
}

void tst_archivelist_longfolder::closingWhileTitlesAreRead()
{
    for (int i = 0; i < 5; ++i) {
        const QString folder = openLong();
        m->list->cleanArchiveList();
        QVERIFY(m->list->isEmpty());
        QCOMPARE(LibraryFixture::order(folder), stems());
    }
    const QString folder = openLong();
    m->list->synchronizationFolderFile();
    m->list->refreshArchiveList(openLong());
    QCOMPARE(LibraryFixture::order(folder), stems());
    QVERIFY(QFile::exists(folder + '/' + stem(TITLES - 1) + ".xml"));
}

void tst_archivelist_longfolder::unreadableTitlesDisappear()
{
    const QString folder = makeFolder();
    spoil(folder, 5);
    spoil(folder, 150);
    QVERIFY(QFile::remove(folder + '/' + stem(399) + ".xml"));
    m->list->refreshArchiveList(folder);
    QTRY_COMPARE(m->list->count(), TITLES - 3);
    QCOMPARE(listed(), without({5, 150, 399}));
    QCOMPARE(shownStem(148), stem(149));
    QCOMPARE(shownStem(149), stem(151));
    QCOMPARE(m->maximum(), (TITLES - 3) * List::ROW - 4 - 997);
}

void tst_archivelist_longfolder::unreadableTitlesAboveTheView()
{
    const QString folder = makeFolder();
    for (int number = 120; number < 180; number += 2)
        spoil(folder, number);
    m->list->refreshArchiveList(folder);
    m->list->selectArchive(300); // the same title stays in view whether all titles have been read or not
    const QString selected =
        QFileInfo(m->list->getSelectedArchive()->getArchiveDataPath()).completeBaseName();
    const int top = m->list->getSelectedArchive()->mapTo(m->list, QPoint()).y();
    QTRY_COMPARE(m->list->count(), TITLES - 30);
    QCOMPARE(m->list->getSelectedArchive()->mapTo(m->list, QPoint()).y(), top);
    QCOMPARE(QFileInfo(m->list->getSelectedArchive()->getArchiveDataPath()).completeBaseName(), selected);
    QCOMPARE(shownStem(m->selected()), selected);
}

void tst_archivelist_longfolder::unreadableTitleInView()
{
    const QString folder = makeFolder();
    spoil(folder, 302);
    m->list->refreshArchiveList(folder);
    m->list->moveToWidgetItem(300);
    QTRY_COMPARE(m->list->count(), TITLES - 1);
    QCOMPARE(listed(), without({302}));
    QCOMPARE(m->list->firstVisibleItem(), 300);
    QTRY_VERIFY(m->item(302)->hasChildWidgets());
    QCOMPARE(textLines(m->item(302)).front(), stem(303));
    for (const ArchiveItem* item : m->list->findChildren<ArchiveItem*>())
        QVERIFY(!item->getArchiveDataPath().isEmpty());
}

void tst_archivelist_longfolder::fileThatGoesLater()
{
    const QString folder = openLong();
    m->list->moveButtonClicked(true); // all titles have been read by now
    m->list->moveButtonClicked(false);
    QVERIFY(QFile::remove(folder + '/' + stem(250) + ".xml"));
    m->list->selectArchive(250);
    QCOMPARE(m->list->count(), TITLES - 1);
    QCOMPARE(m->takeCanvas(), Names{stem(251)});
    QCOMPARE(m->selected(), 250);
    QVERIFY(QFile::remove(folder + '/' + stem(399) + ".xml"));
    m->list->selectArchive(398);
    QCOMPARE(m->takeCanvas(), Names{stem(398)});
    QCOMPARE(m->selected(), 397);
}

void tst_archivelist_longfolder::firstHundredAreMissing()
{
    const QString folder = makeFolder();
    for (int number = 0; number < 250; ++number)
        QVERIFY(QFile::remove(folder + '/' + stem(number) + ".xml"));
    QSignalSpy picker(m->list, &ArchiveList::startTemplatePicker);
    m->list->refreshArchiveList(folder);
    QCOMPARE(m->takeCanvas(), Names{stem(250)});
    QCOMPARE(picker.size(), 0);
    QTRY_COMPARE(listed(), stems().mid(250));

    for (int number = 250; number < TITLES; ++number)
        QVERIFY(QFile::remove(folder + '/' + stem(number) + ".xml"));
    m->list->refreshArchiveList(folder);
    QVERIFY(m->list->isEmpty());
    QCOMPARE(picker.size(), 1);
}

// A saved order that lacks the titles not read yet would lose them.
void tst_archivelist_longfolder::orderIsWholeWhileTitlesAreRead()
{
    const QString folder = openLong();
    m->list->saveArchiveListOrder();
    QCOMPARE(LibraryFixture::order(folder), stems());
    QCOMPARE(items(), 7);
}

void tst_archivelist_longfolder::opensATitleFarDown()
{
    const QString folder = makeFolder();
    m->list->refreshArchiveListInFile(folder, stem(350) + ".xml");
    QCOMPARE(m->takeCanvas(), Names{stem(350)});
    QCOMPARE(m->selected(), 350);
    QCOMPARE(m->list->firstVisibleItem(), 344); // in the 7th row
    QVERIFY(items() < 20);
}

void tst_archivelist_longfolder::opensAnUnreadableTitleFarDown()
{
    const QString folder = makeFolder();
    spoil(folder, 350);
    m->list->refreshArchiveListInFile(folder, stem(350) + ".xml");
    QCOMPARE(m->takeCanvas(), Names{stem(0)});
    QCOMPARE(m->selected(), 0);
    QTRY_COMPARE(listed(), without({350}));
    QCOMPARE(LibraryFixture::order(folder), stems()); // only saving changes the order file
}

void tst_archivelist_longfolder::blankRowFarDown()
{
    const QString folder = makeFolder();
    Names rows = stems();
    rows[200].clear();
    LibraryFixture::writeOrder(folder, rows);
    m->list->refreshArchiveList(folder);
    m->list->moveButtonClicked(true);
    m->list->moveButtonClicked(false);
    QCOMPARE(listed(), rows);
    m->list->selectArchive(200);
    QCOMPARE(m->selected(), 200);
    m->list->saveArchiveListOrder();
    QCOMPARE(LibraryFixture::order(folder), rows);
}

void tst_archivelist_longfolder::savedTitleFarDown()
{
    const QString folder = openLong();
    const auto changed = LibraryFixture::makeRecord(folder, stem(250), QStringLiteral("速報"));
    QVERIFY(ArchiveController().saveNewArchive(folder, changed.get()));
    QImage picture(240, 135, QImage::Format_ARGB32_Premultiplied);
    picture.fill(Qt::green);
    m->list->refreshBaseItem(folder + '/' + stem(250) + ".xml", picture);
    m->list->moveToWidgetItem(250);
    QCOMPARE(textLines(m->item(250)).front(), QStringLiteral("速報"));
    QCOMPARE(m->item(250)->grab().toImage().pixelColor(120, 70), QColor(Qt::green));
}

void tst_archivelist_longfolder::renamedFolderKeepsTheSelection()
{
    const QString folder = makeFolder();
    spoil(folder, 150);
    m->list->refreshArchiveList(folder);
    m->list->selectArchive(300);
    const QString selected = QFileInfo(m->list->getSelectedArchive()->getArchiveDataPath()).fileName();
    const QString after = folder + QStringLiteral(" after");
    QVERIFY(QDir().rename(folder, after));
    m->takeCanvas();
    m->list->refreshArchiveListForChangeFolderName(folder, after);
    QCOMPARE(m->list->getSelectedArchive()->getArchiveDataPath(), after + '/' + selected);
    QCOMPARE(m->takeCanvas().size(), 1);
    QTRY_COMPARE(m->list->count(), TITLES - 1);
}

void tst_archivelist_longfolder::fullFolderTakesNoNewTitle()
{
    openLong();
    QSignalSpy picker(m->list, &ArchiveList::startTemplatePicker);
    m->holdAndChoose(0, ArchiveAction::ACTION_COPY);
    m->holdAndChoose(0, ArchiveAction::ACTION_PASTE);
    QCOMPARE(m_messages.take(), (Reports{{113, QStringLiteral("99")}}));
    m->holdAndChoose(0, ArchiveAction::ACTION_CREATE);
    QCOMPARE(m_messages.take(), (Reports{{112, QStringLiteral("99")}}));
    QCOMPARE(picker.size(), 0);
    QCOMPARE(m->list->count(), TITLES);
}

// The limit counts titles, not rows whose files have been removed.
void tst_archivelist_longfolder::manyUnreadableLeaveRoom()
{
    const QString folder = makeFolder();
    for (int number = 50; number < TITLES; ++number)
        QVERIFY(QFile::remove(folder + '/' + stem(number) + ".xml"));
    m->list->refreshArchiveList(folder);
    m->holdAndChoose(0, ArchiveAction::ACTION_COPY);
    m->holdAndChoose(0, ArchiveAction::ACTION_PASTE);
    QCOMPARE(m_messages.take(), Reports());
    QCOMPARE(m->list->count(), 51);
    QCOMPARE(m->selected(), 1);
    QCOMPARE(LibraryFixture::order(folder), listed());
}

void tst_archivelist_longfolder::deleteFarDown()
{
    const QString folder = openLong();
    m->list->moveToWidgetItem(350);
    m->tapTitle(1);
    m->holdAndChoose(1, ArchiveAction::ACTION_DELETE);
    QCOMPARE(listed(), without({351}));
    QCOMPARE(LibraryFixture::order(folder), listed());
    QCOMPARE(m->takeCanvas(), (Names{stem(351), stem(352)}));
    QCOMPARE(m->selected(), 351);
    m->stack.undo();
    QCOMPARE(listed(), stems());
    QCOMPARE(LibraryFixture::order(folder), stems());
    QCOMPARE(m->selected(), 351);
    QCOMPARE(m->takeCanvas(), Names{stem(351)});
    m->stack.redo();
    QCOMPARE(listed(), without({351}));
    m->list->synchronizationFolderFile();
    QVERIFY(!QFile::exists(folder + '/' + stem(351) + ".xml"));
    QVERIFY(QFile::exists(folder + '/' + stem(352) + ".xml"));
    QCOMPARE(QDir(folder).entryList({QStringLiteral("*.xml")}, QDir::Files).size(), TITLES - 1);
}

void tst_archivelist_longfolder::moveFarDown()
{
    const QString folder = openLong();
    m->list->moveButtonClicked(true);
    m->list->moveToWidgetItem(200);
    m->carry(0, 65 + List::ROW);
    Names moved = stems();
    moved.move(200, 201);
    QCOMPARE(listed(), moved);
    QCOMPARE(LibraryFixture::order(folder), moved);
    scrollThroughAll();
    m->stack.undo();
    QCOMPARE(listed(), stems());
    QCOMPARE(LibraryFixture::order(folder), stems());
    m->list->moveButtonClicked(false);
}

void tst_archivelist_longfolder::moveModeReachesLateItems()
{
    openLong();
    m->list->moveButtonClicked(true);
    m->list->moveToWidgetItem(300);
    QVERIFY(m->item(300)->hasDragFlag());
    QTRY_VERIFY(m->item(300)->hasChildWidgets());
    const TitleLines* lines = textArea(m->item(300));
    const int narrow = lines->lineWidth();
    QVERIFY(lines->x() + narrow <= ArchiveItem::WIDGET_WIDTH - 22); // left of the handle
    m->list->moveButtonClicked(false);
    QVERIFY(!m->item(300)->hasDragFlag());
    QCOMPARE(lines->lineWidth(), ArchiveItem::DISPLY_TEXT_SIZE_LENTH);
    QVERIFY(narrow < lines->lineWidth());
}

void tst_archivelist_longfolder::languageReachesLateItems()
{
    openLong();
    m->list->setSystemLanFont(QStringLiteral("DFHeiW5-A"));
    m->list->moveToWidgetItem(250);
    QTRY_VERIFY(m->item(250)->hasChildWidgets());
    QCOMPARE(textArea(m->item(250))->lineFont().family(), QStringLiteral("DFHeiW5-A"));
    m->list->setSystemLanFont(QStringLiteral("KST"));
}

// Loads the folder as a list does that opens the last folder in its constructor.
void tst_archivelist_longfolder::loadedByTheThread()
{
    const QString folder = makeFolder();
    ArchiveController().setLastFolderPath(folder);
    QLabel label;
    ArchiveList list(&label, true);
    list.setFixedSize(549, 997);
    QTRY_COMPARE(list.count(), TITLES);
    QVERIFY(list.findChildren<ArchiveItem*>().size() < 20);
    for (int row = 0; row < TITLES; row += 5) {
        list.moveToWidgetItem(row);
        QCoreApplication::processEvents();
    }
    list.moveToWidgetItem(3);
    QCOMPARE(QFileInfo(list.archiveItem(3)->getArchiveDataPath()).completeBaseName(), stem(3));
    QTRY_VERIFY(list.archiveItem(3)->hasChildWidgets());
    QCOMPARE(textLines(list.archiveItem(3)).front(), stem(3));
}

QTEST_MAIN(tst_archivelist_longfolder)
#include "tst_archivelist_longfolder.moc"
