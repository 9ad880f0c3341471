// What a finger does to the title list: select, scroll, brake, open the menu and choose in it, and carry
// titles to other places.
#include "ItemLooks.h"
#include "TitleListFixture.h"

#include "tests/touchui/TouchDevice.h"
#include "touchui/KSEventMutexLockObject.h"

#include <QSignalSpy>
#include <functional>

using Change = std::function<void(const QString& folder)>;
using Names = QStringList;
using List = TitleListFixture;

class tst_archivelist_touch : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void tapSelects();
    void tapBesideTheTitlesSelectsNothing();
    void holdOpensTheMenuAndSelectsNothing();
    void holdOnEmptyAreaOffersCreateAndPaste();
    void motionCancelsTheHold();
    void heldFingerScrollsNothing();
    void pressBesideTheMenuOnlyClosesIt();
    void menuOpensDownwardsAboveAndUpwardsBelow();
    void dragScrollsAndSelectsNothing();
    void flickRunsOnAndRests();
    void brakeSelectsNothing();
    void copyPasteAndDelete();
    void saveAsTemplate();
    void templatesWithoutTheirPictures();
    void templateLimit();

    void carryDown();
    void carryUp();
    void carryToTheEnd();
    void carryToTheSamePlace();
    void carryOverTheEdges();
    void moveModeNeitherSelectsNorOpensTheMenu();
    void leavingMoveModeDropsTheTitle();
    void floatingTitleLooksLikeTheOne();
    void closingTheFolderWhileCarrying();
    void cancelledCarryKeepsEveryTitle();
    void lockDuringATapOpensNoMenu();
    void lockWhileCarryingPutsTheTitleBack();
    void titleGoneFromUnderTheFinger_data();
    void titleGoneFromUnderTheFinger();
    void ninetyNineTitles();

private:
    static Names numbered(int count)
    {
        Names result;
        for (int i = 0; i < count; ++i)
            result.append(QStringLiteral("t%1").arg(i, 2, 10, QLatin1Char('0')));
        return result;
    }
    QString folderOf(const QString& name, int titles)
    {
        const QString folder = m_fixture.makeFolder(name);
        LibraryFixture::fillFolder(folder, numbered(titles));
        return folder;
    }
    QString openFolder(const QString& name, int titles)
    {
        const QString folder = folderOf(name, titles);
        m->open(folder);
        m_folders.take();
        return folder;
    }
    Names enabledActions() const
    {
        Names result;
        for (const QAction* action : m->menu()->actions())
            if (action->isEnabled())
                result.append(action->text());
        return result;
    }
    void moveMode(bool on) { m->list->moveButtonClicked(on); }
    QString templateRoot() const { return QDir::cleanPath(m_fixture.titleRoot() + "/../usertemplates"); }

    LibraryFixture m_fixture;
    FakeEditContext m_context;
    FakeTitlerFolderReporter m_folders;
    FakeTitleChangeReporter m_reports;
    FakeMessageBoxController m_messages;
    TouchDevice m_device;
    std::unique_ptr<TitleListFixture> m;
};

void tst_archivelist_touch::init()
{
    m = std::make_unique<TitleListFixture>(m_device);
    m_messages.take();
    m_reports.take();
}

void tst_archivelist_touch::cleanup()
{
    const bool locked = m->isLocked();
    m.reset();
    QVERIFY2(!locked, "a touch lock is left");
}

void tst_archivelist_touch::tapSelects()
{
    openFolder(QStringLiteral("tap"), 4);
    m->tapTitle(2);
    QCOMPARE(m->takeCanvas(), Names{"t02"});
    QCOMPARE(m->selected(), 2);
    QCOMPARE(m->stack.count(), 1);
    m->tapTitle(2); // a second tap does nothing
    QCOMPARE(m->takeCanvas(), Names());
    QCOMPARE(m->stack.count(), 1);
    m->tap(List::TEXT_X, 60);
    QCOMPARE(m->takeCanvas(), Names{"t00"});
    QCOMPARE(m->clock.running(), 0);
}

void tst_archivelist_touch::tapBesideTheTitlesSelectsNothing()
{
    openFolder(QStringLiteral("beside"), 3);
    m->tap(10, 60);
    m->tap(List::PICTURE_X, 900);
    QCOMPARE(m->takeCanvas(), Names());
    QCOMPARE(m->selected(), 0);
}

void tst_archivelist_touch::holdOpensTheMenuAndSelectsNothing()
{
    openFolder(QStringLiteral("hold"), 4);
    m->press(List::PICTURE_X, 200);
    m->clock.advance(List::HOLD_TIME - 1);
    QVERIFY(!m->list->IsOptionMenuShowing());
    m->clock.advance(1);
    QVERIFY(m->list->IsOptionMenuShowing());
    QCOMPARE(m->item(1)->look(), ArchiveItem::OPERATE_AND_UN_SELECT_STATE);
    m->release(List::PICTURE_X, 200);
    QCOMPARE(m->takeCanvas(), Names());
    QVERIFY(m->list->IsOptionMenuShowing());
    QCOMPARE(enabledActions(), (Names{"Create New", "Copy", "Delete", "Save as Template"}));
    m->list->slotHideOptionMenu();
    QCOMPARE(m->item(1)->look(), ArchiveItem::UN_OPERATE_AND_UN_SELECT_STATE);
    m->tapTitle(1);
    QCOMPARE(m->takeCanvas(), Names{"t01"});
}

void tst_archivelist_touch::holdOnEmptyAreaOffersCreateAndPaste()
{
    openFolder(QStringLiteral("empty area"), 2);
    m->hold(List::PICTURE_X, 800);
    QCOMPARE(enabledActions(), Names{"Create New"});
    m->list->slotHideOptionMenu();
    m->holdAndChoose(0, ArchiveAction::ACTION_COPY);
    m->hold(List::PICTURE_X, 800);
    QCOMPARE(enabledActions(), (Names{"Create New", "Paste"}));
    m->choose(ArchiveAction::ACTION_PASTE);
    QCOMPARE(m->list->count(), 3);
    QCOMPARE(m->selected(), 2); // below the last title
}

void tst_archivelist_touch::motionCancelsTheHold()
{
    openFolder(QStringLiteral("motion"), 4);
    m->press(List::PICTURE_X, 200);
    m->move(List::PICTURE_X, 221);
    m->clock.advance(2000);
    QVERIFY(!m->list->IsOptionMenuShowing());
    m->release(List::PICTURE_X, 221);

    m->press(List::PICTURE_X, 200);
    m->move(List::PICTURE_X, 220); // within the tolerance of a tap
    m->clock.advance(List::HOLD_TIME);
    QVERIFY(m->list->IsOptionMenuShowing());
    m->release(List::PICTURE_X, 220);
    m->list->slotHideOptionMenu();
}

void tst_archivelist_touch::heldFingerScrollsNothing()
{
    openFolder(QStringLiteral("held"), 20);
    m->press(List::PICTURE_X, 700);
    m->clock.advance(List::HOLD_TIME);
    QVERIFY(m->list->IsOptionMenuShowing());
    m->drag(List::PICTURE_X, 700, 300, 8);
    m->release(List::PICTURE_X, 300);
    m->clock.advance(2000);
    QCOMPARE(m->value(), 0);
    QCOMPARE(m->takeCanvas(), Names());
    m->list->slotHideOptionMenu();
}

void tst_archivelist_touch::pressBesideTheMenuOnlyClosesIt()
{
    openFolder(QStringLiteral("outside"), 6);
    m->hold(List::PICTURE_X, 60);
    QVERIFY(m->list->IsOptionMenuShowing());
    m->tapTitle(5);
    QVERIFY(!m->list->IsOptionMenuShowing());
    QCOMPARE(m->takeCanvas(), Names());
    QCOMPARE(m->item(0)->look(), ArchiveItem::UN_OPERATE_AND_SELECT_STATE);
    m->tapTitle(5);
    QCOMPARE(m->takeCanvas(), Names{"t05"});
}

void tst_archivelist_touch::menuOpensDownwardsAboveAndUpwardsBelow()
{
    openFolder(QStringLiteral("places"), 7);
    const int border = 4 * (997 / 7);
    m->hold(List::PICTURE_X, border - 1);
    QVERIFY(m->menu()->y() >= m->list->mapToGlobal(QPoint(0, border - 1)).y());
    QVERIFY(m->window.frameGeometry().contains(m->menu()->geometry()));
    m->list->slotHideOptionMenu();
    m->hold(List::PICTURE_X, border);
    QVERIFY(m->menu()->y() < m->list->mapToGlobal(QPoint(0, border)).y() - m->menu()->height() / 2);
    m->list->slotHideOptionMenu();
    m->hold(List::PICTURE_X, 990);
    QVERIFY(m->window.frameGeometry().contains(m->menu()->geometry()));
    m->list->slotHideOptionMenu();
}

void tst_archivelist_touch::dragScrollsAndSelectsNothing()
{
    openFolder(QStringLiteral("drag"), 20);
    m->press(List::PICTURE_X, 700);
    m->drag(List::PICTURE_X, 700, 400, 10);
    for (int i = 0; i < 20; ++i) // the list comes to rest under the finger
        m->clock.advance(List::TICK);
    m->release(List::PICTURE_X, 400);
    // The way to the first place that is told counts for nothing, nor do the last five pixels, and each tick
    // gives away up to half a pixel.
    QVERIFY2(m->value() > 250 && m->value() <= 270, qPrintable(QString::number(m->value())));
    QCOMPARE(m->takeCanvas(), Names());
    QVERIFY(!m->list->IsOptionMenuShowing());
}

void tst_archivelist_touch::flickRunsOnAndRests()
{
    openFolder(QStringLiteral("flick"), 60);
    m->press(List::PICTURE_X, 900);
    m->drag(List::PICTURE_X, 900, 820, 2);
    m->move(List::PICTURE_X, 300);
    m->release(List::PICTURE_X, 300);
    QVERIFY(m->list->isAutoFilck());
    const int atRelease = m->value();
    m->clock.advance(20000);
    QVERIFY(m->value() > atRelease + 200);
    QVERIFY(!m->list->isAutoFilck());
    QCOMPARE(m->takeCanvas(), Names());
    QCOMPARE(m->clock.running(), 0);
}

void tst_archivelist_touch::brakeSelectsNothing()
{
    openFolder(QStringLiteral("brake"), 60);
    m->press(List::PICTURE_X, 900);
    m->drag(List::PICTURE_X, 900, 820, 2);
    m->move(List::PICTURE_X, 300);
    m->release(List::PICTURE_X, 300);
    m->clock.advance(3 * List::TICK);
    QVERIFY(m->list->isAutoFilck());
    m->press(List::PICTURE_X, 500);
    const int braked = m->value();
    m->clock.advance(2000); // and not a hold either
    m->release(List::PICTURE_X, 500);
    QCOMPARE(m->value(), braked);
    QCOMPARE(m->takeCanvas(), Names());
    QVERIFY(!m->list->IsOptionMenuShowing());
    m->tap(List::PICTURE_X, 500);
    QCOMPARE(m->takeCanvas().size(), 1);
}

void tst_archivelist_touch::copyPasteAndDelete()
{
    const QString folder = openFolder(QStringLiteral("copy"), 3);
    m->holdAndChoose(1, ArchiveAction::ACTION_COPY);
    QCOMPARE(m->item(1)->look(), ArchiveItem::OPERATE_AND_UN_SELECT_STATE); // the border is kept
    m->holdAndChoose(1, ArchiveAction::ACTION_DELETE);
    QCOMPARE(m->stems(), (Names{"t00", "t02"}));
    QVERIFY(QFile::remove(folder + "/t01.xml")); // the copy does not need its source
    QVERIFY(QFile::remove(folder + "/t01_240.png"));
    m->holdAndChoose(0, ArchiveAction::ACTION_PASTE);
    QCOMPARE(m->list->count(), 3);
    QCOMPARE(m->selected(), 1);
    QCOMPARE(textLines(m->item(1)).front(), QStringLiteral("t01"));
    QVERIFY(!QImage(m->item(1)->getArchiveData()->getFullPathOfThumbnailSmall()).isNull());
    QCOMPARE(LibraryFixture::order(folder), m->stems());
    m->stack.undo();
    QCOMPARE(m->stems(), (Names{"t00", "t02"}));
    QCOMPARE(LibraryFixture::order(folder), m->stems());
}

void tst_archivelist_touch::saveAsTemplate()
{
    QDir(templateRoot()).removeRecursively();
    const QString folder = openFolder(QStringLiteral("template"), 3);
    QImage(64, 36, QImage::Format_RGB32).save(folder + "/back_1280.png");
    auto archive = LibraryFixture::makeRecord(folder, QStringLiteral("t01"), QStringLiteral("模板 text"));
    archive->setBgResource("back_1280.png");
    QVERIFY(ArchiveController().saveNewArchive(folder, archive.get()));
    m->open(folder);
    QSignalSpy added(m->list, &ArchiveList::addUserSignal);
    QSignalSpy picker(m->list, &ArchiveList::startUserTemplatePicker);
    m_reports.take();

    m->holdAndChoose(1, ArchiveAction::ACTION_ADD_USER);
    QCOMPARE(added.size(), 1);
    QCOMPARE(picker.size(), 1);
    const QString name = added.at(0).at(0).toString();
    QCOMPARE(name, QStringLiteral("UserTemplate_001"));
    QCOMPARE(m_reports.take(), (Reports{{5, name}}));
    const QString made = templateRoot() + '/' + name;
    Archive saved;
    QVERIFY(ArchiveController().getOneArchive(made + "/Titler.xml", &saved));
    QCOMPARE(QString::fromStdString(saved.text().at(0)->getText()), QStringLiteral("模板 text"));
    QCOMPARE(saved.getBgResource(), std::string("Titler_source_1280.png"));
    QCOMPARE(QImage(made + "/Titler_source_1280.png").size(), QSize(64, 36));
    QCOMPARE(QImage(made + "/Titler_240.png").size(), QSize(240, 135));
    QCOMPARE(m->stems(), numbered(3)); // the list has not changed
    QCOMPARE(m->stack.count(), 0);

    LibraryFixture::writeOrder(templateRoot(), {name + "/Titler"}); // as the list of templates writes it
    m->holdAndChoose(0, ArchiveAction::ACTION_ADD_USER);            // the selected title
    QCOMPARE(added.at(1).at(0).toString(), QStringLiteral("UserTemplate_002"));
    QCOMPARE(m->selected(), 0);
}

void tst_archivelist_touch::templatesWithoutTheirPictures()
{
    QDir(templateRoot()).removeRecursively();
    const QString folder = openFolder(QStringLiteral("no pictures"), 1);
    QVERIFY(QFile::remove(folder + "/t00_240.png"));
    QSignalSpy added(m->list, &ArchiveList::addUserSignal);
    m->holdAndChoose(0, ArchiveAction::ACTION_ADD_USER);
    QCOMPARE(added.size(), 1);
    QVERIFY(QFile::exists(templateRoot() + "/UserTemplate_001/Titler.xml"));
    QVERIFY(!QFile::exists(templateRoot() + "/UserTemplate_001/Titler_240.png"));
}

void tst_archivelist_touch::templateLimit()
{
    QDir(templateRoot()).removeRecursively();
    QDir().mkpath(templateRoot());
    openFolder(QStringLiteral("limit"), 1);
    QSignalSpy added(m->list, &ArchiveList::addUserSignal);
    Names names;
    for (int i = 1; i <= 998; ++i)
        names.append(QStringLiteral("UserTemplate_%1/Titler").arg(i, 3, 10, QLatin1Char('0')));
    LibraryFixture::writeOrder(templateRoot(), names);
    m->holdAndChoose(0, ArchiveAction::ACTION_ADD_USER);
    QCOMPARE(added.size(), 1); // the 999th can be made
    QCOMPARE(m_messages.take(), Reports());
    names.append(QStringLiteral("UserTemplate_999/Titler"));
    LibraryFixture::writeOrder(templateRoot(), names);
    m->holdAndChoose(0, ArchiveAction::ACTION_ADD_USER);
    QCOMPARE(added.size(), 1);
    const Reports messages = m_messages.take();
    QCOMPARE(messages.size(), 1);
    QCOMPARE(messages.at(0).first, 196);
    QDir(templateRoot()).removeRecursively();
}

void tst_archivelist_touch::carryDown()
{
    const QString folder = openFolder(QStringLiteral("down"), 4);
    moveMode(true);
    m->liftTo(0, 65 + List::ROW);
    QVERIFY(m->list->getMoveState());
    QCOMPARE(m->list->count(), 3);
    QCOMPARE(m->list->getMoveItem()->parentWidget(), &m->window);
    QCOMPARE(m_folders.take(), Names());
    m->release(List::HANDLE_X, 65 + List::ROW);
    QVERIFY(!m->list->getMoveState());
    QCOMPARE(m->stems(), (Names{"t01", "t00", "t02", "t03"}));
    QCOMPARE(LibraryFixture::order(folder), m->stems());
    QCOMPARE(m_folders.take(), Names{"order down"});
    QCOMPARE(m->stack.count(), 1);
    QCOMPARE(m->selected(), 1); // the same title is on the canvas
    QCOMPARE(m->item(1)->look(), ArchiveItem::OPERATE_AND_SELECT_STATE);

    m->stack.undo();
    QCOMPARE(m->stems(), numbered(4));
    QCOMPARE(LibraryFixture::order(folder), m->stems());
    QCOMPARE(m_folders.take(), Names{"order down"});
    QCOMPARE(m->item(0)->look(), ArchiveItem::UN_OPERATE_AND_SELECT_STATE);
    m->stack.redo();
    QCOMPARE(m->stems(), (Names{"t01", "t00", "t02", "t03"}));
    QCOMPARE(m->takeCanvas(), Names());
}

void tst_archivelist_touch::carryUp()
{
    const QString folder = openFolder(QStringLiteral("up"), 4);
    moveMode(true);
    m->carry(3, 30);
    QCOMPARE(m->stems(), (Names{"t03", "t00", "t01", "t02"}));
    QCOMPARE(LibraryFixture::order(folder), m->stems());
    m->stack.undo();
    QCOMPARE(m->stems(), numbered(4));
}

void tst_archivelist_touch::carryToTheEnd()
{
    const QString folder = openFolder(QStringLiteral("end"), 4);
    moveMode(true);
    m->carry(1, 700);
    QCOMPARE(m->stems(), (Names{"t00", "t02", "t03", "t01"}));
    QCOMPARE(LibraryFixture::order(folder), m->stems());
}

void tst_archivelist_touch::carryToTheSamePlace()
{
    const QString folder = openFolder(QStringLiteral("same"), 4);
    moveMode(true);
    QVERIFY(QFile::remove(folder + "/.order.xml"));
    m->carry(1, List::ROW + 70);
    QCOMPARE(m->stems(), numbered(4));
    QCOMPARE(m->stack.count(), 0);
    QCOMPARE(LibraryFixture::order(folder), numbered(4)); // the order was saved although it is the same
    QCOMPARE(m_folders.take(), Names{"order same"});
    // A short tap on a handle does not lift the title.
    m->tap(List::HANDLE_X, 65);
    QCOMPARE(m->stems(), numbered(4));
    QVERIFY(!m->list->getMoveState());
}

void tst_archivelist_touch::carryOverTheEdges()
{
    const QString folder = openFolder(QStringLiteral("edges"), 20);
    moveMode(true);
    m->liftTo(2, 960); // hangs over the lower edge
    m->clock.advance(200 * List::EDGE_SCROLL_TIME);
    QCOMPARE(m->value(), m->maximum());
    m->move(List::HANDLE_X, 970);
    m->release(List::HANDLE_X, 970);
    QCOMPARE(m->stems().constLast(), QStringLiteral("t02"));
    QCOMPARE(LibraryFixture::order(folder), m->stems());
    QCOMPARE(m->clock.running(), 0);

    const int lastRow = m->list->mapFromGlobal(m->item(19)->mapToGlobal(QPoint(0, 65))).y();
    m->press(List::HANDLE_X, lastRow);
    m->clock.advance(List::LIFT_TIME);
    m->move(List::HANDLE_X, 500);
    m->move(List::HANDLE_X, -20);
    m->clock.advance(200 * List::EDGE_SCROLL_TIME);
    QCOMPARE(m->value(), 0);
    m->release(List::HANDLE_X, -20);
    QCOMPARE(m->stems().constFirst(), QStringLiteral("t02"));
    m->stack.undo();
    m->stack.undo();
    QCOMPARE(m->stems(), numbered(20));
    QCOMPARE(LibraryFixture::order(folder), m->stems());
}

void tst_archivelist_touch::moveModeNeitherSelectsNorOpensTheMenu()
{
    openFolder(QStringLiteral("mode"), 4);
    moveMode(true);
    m->tapTitle(2);
    m->hold(List::PICTURE_X, 200);
    QCOMPARE(m->takeCanvas(), Names());
    QVERIFY(!m->list->IsOptionMenuShowing());
    moveMode(false);
    m->press(List::HANDLE_X, 65);
    m->clock.advance(List::LIFT_TIME);
    QVERIFY(!m->list->getMoveState()); // handles do nothing outside of move mode
    m->release(List::HANDLE_X, 65);
}

void tst_archivelist_touch::leavingMoveModeDropsTheTitle()
{
    const QString folder = openFolder(QStringLiteral("leave"), 4);
    moveMode(true);
    m->liftTo(0, 65 + List::ROW);
    moveMode(false);
    QVERIFY(!m->list->getMoveState());
    QCOMPARE(m->stems(), (Names{"t01", "t00", "t02", "t03"}));
    QCOMPARE(LibraryFixture::order(folder), m->stems());
    m->move(List::HANDLE_X, 600); // the finger is still there
    m->release(List::HANDLE_X, 600);
    QCOMPARE(m->stems(), (Names{"t01", "t00", "t02", "t03"}));
    QCOMPARE(m->takeCanvas(), Names());
    QCOMPARE(m->item(1)->look(), ArchiveItem::UN_OPERATE_AND_SELECT_STATE);
    QVERIFY(!m->item(1)->hasDragFlag());
}

void tst_archivelist_touch::floatingTitleLooksLikeTheOne()
{
    openFolder(QStringLiteral("float"), 4);
    moveMode(true);
    m->liftTo(1, 400);
    const auto* floating = qobject_cast<ArchiveItem*>(m->list->getMoveItem());
    QVERIFY(floating && floating->isVisible());
    QCOMPARE(floating->size(), QSize(ArchiveItem::WIDGET_WIDTH, ArchiveItem::WIDGET_HEIGHT));
    QCOMPARE(textLines(floating).front(), QStringLiteral("t01"));
    QCOMPARE(floating->look(), ArchiveItem::OPERATE_AND_UN_SELECT_STATE);
    QVERIFY(floating->hasDragFlag());
    QCOMPARE(floating->x(), m->list->x() + 38 + 20); // aside from under the finger
    m->release(List::HANDLE_X, 400);
}

void tst_archivelist_touch::closingTheFolderWhileCarrying()
{
    const QString folder = openFolder(QStringLiteral("close"), 4);
    moveMode(true);
    m->liftTo(0, 400);
    m->stack.clear();
    m->list->cleanArchiveList();
    QVERIFY(!m->list->getMoveState());
    m->move(List::HANDLE_X, 500);
    m->release(List::HANDLE_X, 500);
    QVERIFY(m->list->isEmpty());
    QVERIFY(!m->isLocked());
    QCOMPARE(LibraryFixture::order(folder), numbered(4)); // the title was not moved
    m->open(folder);
    QCOMPARE(m->stems(), numbered(4));
}

void tst_archivelist_touch::cancelledCarryKeepsEveryTitle()
{
    const QString folder = openFolder(QStringLiteral("cancel"), 4);
    moveMode(true);
    m->liftTo(0, 65 + List::ROW);
    QTouchEvent cancel(QEvent::TouchCancel, m_device);
    QCoreApplication::sendEvent(m->list->viewport(), &cancel);
    QVERIFY(!m->list->getMoveState());
    QCOMPARE(m->stems(), numbered(4));
    QCOMPARE(LibraryFixture::order(folder), numbered(4));
    m->release(List::HANDLE_X, 65 + List::ROW);
}

void tst_archivelist_touch::lockDuringATapOpensNoMenu()
{
    openFolder(QStringLiteral("locked"), 4);
    const std::unique_ptr<KSLockObject> lock(KSEventMutexLockObject::createFactory(nullptr));
    m->press(List::PICTURE_X, List::ROW + 60);
    m->m_filter.lock(lock.get());
    m->release(List::PICTURE_X, List::ROW + 60);
    m->clock.advance(2 * List::HOLD_TIME);
    QVERIFY(!m->list->IsOptionMenuShowing());
    m->m_filter.unlock();
    m->takeCanvas();
    m->tapTitle(2);
    QCOMPARE(m->takeCanvas(), Names{"t02"});
}

void tst_archivelist_touch::lockWhileCarryingPutsTheTitleBack()
{
    const QString folder = openFolder(QStringLiteral("locked"), 4);
    const std::unique_ptr<KSLockObject> lock(KSEventMutexLockObject::createFactory(nullptr));
    moveMode(true);
    m->liftTo(0, 65 + 2 * List::ROW);
    QVERIFY(m->list->isDragging());
    m->m_filter.lock(lock.get());
    QVERIFY(!m->list->isDragging());
    QVERIFY(!m->list->getMoveState());
    QVERIFY(!m->list->getMoveItem());
    QCOMPARE(m->stems(), numbered(4));
    QCOMPARE(LibraryFixture::order(folder), numbered(4));
    QCOMPARE(m->stack.count(), 0);
    m->release(List::HANDLE_X, 65 + 2 * List::ROW);
    m->m_filter.unlock();
    m->carry(0, 65 + 2 * List::ROW);
    QCOMPARE(m->stems(), (Names{"t01", "t02", "t00", "t03"}));
    QCOMPARE(m->stack.count(), 1);
}

void tst_archivelist_touch::titleGoneFromUnderTheFinger_data()
{
    QTest::addColumn<Change>("change");
    QTest::newRow("its making is undone") << Change([this](const QString&) { m->stack.undo(); });
    QTest::newRow("another folder is opened") << Change([this](const QString&) {
        m->stack.clear();
        m->list->refreshArchiveList(folderOf(QStringLiteral("finger after"), 2));
    });
    QTest::newRow("its folder gets a new name") << Change([this](const QString& folder) {
        m->stack.clear();
        const QString after = m_fixture.titleRoot() + QStringLiteral("/finger after");
        QDir(after).removeRecursively();
        QVERIFY(QDir().rename(folder, after));
        m->list->refreshArchiveListForChangeFolderName(folder, after);
    });
    QTest::newRow("the folder is closed") << Change([this](const QString&) {
        m->stack.clear();
        m->list->cleanArchiveList();
    });
}

void tst_archivelist_touch::titleGoneFromUnderTheFinger()
{
    QFETCH(Change, change);
    const QString folder = openFolder(QStringLiteral("finger before"), 3);
    m->holdAndChoose(0, ArchiveAction::ACTION_COPY);
    m->holdAndChoose(0, ArchiveAction::ACTION_PASTE);
    m->press(List::PICTURE_X, List::ROW + 60);
    QVERIFY(m->isLocked());
    change(folder);
    QVERIFY(!m->isLocked()); // immediately, whether the finger is still down or not
    m->takeCanvas();
    m->move(List::PICTURE_X, List::ROW + 90);
    m->release(List::PICTURE_X, List::ROW + 60);
    m->clock.advance(List::HOLD_TIME);
    QCOMPARE(m->takeCanvas(), Names());
    QVERIFY(!m->list->IsOptionMenuShowing());
    if (m->list->isEmpty())
        return;
    m->tapTitle(m->selected() == 0 ? 1 : 0);
    QCOMPARE(m->takeCanvas().size(), 1);
}

void tst_archivelist_touch::ninetyNineTitles()
{
    const QString folder = openFolder(QStringLiteral("many"), 98);
    m->holdAndChoose(0, ArchiveAction::ACTION_COPY);
    m->holdAndChoose(0, ArchiveAction::ACTION_PASTE); // the 99th
    QCOMPARE(m->list->count(), 99);
    QCOMPARE(m_messages.take(), Reports());
    m->holdAndChoose(0, ArchiveAction::ACTION_PASTE);
    QCOMPARE(m_messages.take(), (Reports{{113, QStringLiteral("99")}}));
    m->holdAndChoose(0, ArchiveAction::ACTION_CREATE);
    QCOMPARE(m_messages.take(), (Reports{{112, QStringLiteral("99")}}));
    QCOMPARE(m->list->count(), 99);

    QSignalSpy picker(m->list, &ArchiveList::startTemplatePicker);
    m->holdAndChoose(2, ArchiveAction::ACTION_DELETE);
    m->holdAndChoose(0, ArchiveAction::ACTION_CREATE);
    QCOMPARE(picker.size(), 1);
    QCOMPARE(m_messages.take(), Reports());
    m->stack.undo();
    QCOMPARE(m->list->count(), 99);
    QCOMPARE(LibraryFixture::order(folder), m->stems());
    // Scrolls from one end to the other.
    m->list->moveToWidgetItem(98);
    QCOMPARE(m->value(), m->maximum());
    m->tap(List::PICTURE_X, 940);
    QCOMPARE(m->selected(), 98);
}

QTEST_MAIN(tst_archivelist_touch)
#include "tst_archivelist_touch.moc"
