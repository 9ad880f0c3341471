// The option menu of the title list towards everything else: sibling processes, the operation log, the
// reports and the texts of its messages.
#include "TitleListFixture.h"

#include "tests/fakes/FakeTitlerAPPEventFilterController.h"
#include "tests/support/LogFixture.h"
#include "tests/touchui/TouchDevice.h"

#include <QSignalSpy>
#include <QTemporaryDir>
#include <QWheelEvent>
#include <functional>

using Names = QStringList;
using List = TitleListFixture;
using Closing = std::function<void()>;
using Events = QList<QPair<int, bool>>;

namespace
{

Names templates(int first, int last)
{
    Names names;
    for (int i = first; i <= last; ++i)
        names.append(QStringLiteral("UserTemplate_%1/Titler").arg(i, 3, 10, QLatin1Char('0')));
    return names;
}

} // namespace

class tst_archivemenu : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanupTestCase();
    void init();
    void cleanup();

    void siblingsHearOfTheMenuOnce_data();
    void siblingsHearOfTheMenuOnce();
    void requestToGiveWayWithoutAMenuIsNothing();
    void tapsAreLogged();
    void choicesAreLogged_data();
    void choicesAreLogged();
    void choiceOnEmptyAreaIsLoggedWithTheLastTitle();
    void savingTheShownTitleSelectsNothing();
    void templateIsReportedWithItsFolder();
    void fullTemplateListTellsTheFreeName_data();
    void fullTemplateListTellsTheFreeName();
    void blankLabelStaysBlank();

private:
    QString openFolder(const QString& name, int titles)
    {
        Names stems;
        for (int i = 0; i < titles; ++i)
            stems.append(QStringLiteral("t%1").arg(i, 2, 10, QLatin1Char('0')));
        const QString folder = m_fixture.makeFolder(name);
        LibraryFixture::fillFolder(folder, stems);
        m->open(folder);
        newLogLines();
        return folder;
    }
    QString templateRoot() const { return QDir::cleanPath(m_fixture.titleRoot() + "/../usertemplates"); }
    // "[area] number: text" of what the operator did to the titles since the last call.
    Names newLogLines() { return m_log.takeOperations().filter(QStringLiteral("[Thumbnail]")); }

    LibraryFixture m_fixture;
    LogFixture m_log;
    FakeMessageBoxController m_messages;
    TouchDevice m_device;
    std::unique_ptr<FakeTitlerAPPEventFilterController> m_events;
    std::unique_ptr<TitleListFixture> m;
};

void tst_archivemenu::cleanupTestCase()
{
}

void tst_archivemenu::init()
{
    QDir(templateRoot()).removeRecursively();
    QVERIFY(QDir().mkpath(templateRoot()));
    m_events = std::make_unique<FakeTitlerAPPEventFilterController>();
    m = std::make_unique<TitleListFixture>(m_device);
    m_messages.take();
}

void tst_archivemenu::cleanup()
{
    m.reset();
    m_events.reset();
}

void tst_archivemenu::siblingsHearOfTheMenuOnce_data()
{
    QTest::addColumn<Closing>("closing");
    QTest::newRow("a choice") << Closing([this] { m->choose(ArchiveAction::ACTION_COPY); });
    QTest::newRow("a press outside") << Closing([this] { m->tapTitle(5); });
    QTest::newRow("a key") << Closing([this] { QTest::keyClick(m->menu(), Qt::Key_Escape); });
    QTest::newRow("a sibling that asks to give way")
        << Closing([this] { Q_EMIT m_events->signalRestoreOriginal(); });
    QTest::newRow("the window that closes") << Closing([this] { m->list->slotHideOptionMenu(); });
    QTest::newRow("a turn of the wheel") << Closing([this] {
        QWheelEvent event(QPointF(100, 100), m->list->mapToGlobal(QPointF(100, 100)), QPoint(),
                          QPoint(0, -120), Qt::NoButton, Qt::NoModifier, Qt::NoScrollPhase, false);
        m->list->wheelEvent(&event);
    });
}

void tst_archivemenu::siblingsHearOfTheMenuOnce()
{
    QFETCH(Closing, closing);
    openFolder(QStringLiteral("events"), 6);
    for (int round = 0; round < 2; ++round) { // the link is only looked for when the first menu opens
        QCOMPARE(m_events->take(), Events());
        m->hold(List::PICTURE_X, 200);
        QVERIFY(m->list->IsOptionMenuShowing());
        QCOMPARE(m_events->take(), (Events{{2, true}}));
        closing();
        QVERIFY(!m->list->IsOptionMenuShowing());
        QCOMPARE(m_events->take(), (Events{{2, false}}));
    }
}

void tst_archivemenu::requestToGiveWayWithoutAMenuIsNothing()
{
    openFolder(QStringLiteral("no menu"), 2);
    m->hold(List::PICTURE_X, 60);
    m->list->slotHideOptionMenu();
    m_events->take();
    Q_EMIT m_events->signalRestoreOriginal();
    m->list->slotHideOptionMenu();
    QCOMPARE(m_events->take(), Events());
    // Without a link the menu is this process's own.
    m_events.reset();
    m->hold(List::PICTURE_X, 60);
    QVERIFY(m->list->IsOptionMenuShowing());
    m->list->slotHideOptionMenu();
    QVERIFY(!m->list->IsOptionMenuShowing());
}

void tst_archivemenu::tapsAreLogged()
{
    openFolder(QStringLiteral("taps"), 4);
    m->tapTitle(2);
    QCOMPARE(newLogLines(), Names{QStringLiteral("[Thumbnail] 200: Select  the 2 Thumbnail")});
    m->tapTitle(2); // it is selected already
    QCOMPARE(newLogLines(), Names());
    m->tapTitle(0);
    QCOMPARE(newLogLines(), Names{QStringLiteral("[Thumbnail] 200: Select  the 0 Thumbnail")});
}

void tst_archivemenu::choicesAreLogged_data()
{
    QTest::addColumn<int>("type");
    QTest::addColumn<Names>("lines");
    const auto row = [](const char* name, ArchiveAction::ARCHIVE_ACTION_TYPE type, const Names& lines) {
        QTest::newRow(name) << static_cast<int>(type) << lines;
    };
    const QString begin = QStringLiteral("[Thumbnail] 200: ");
    row("create", ArchiveAction::ACTION_CREATE, {begin + "Select  Create New in the 1 Thumbnail"});
    row("copy", ArchiveAction::ACTION_COPY, {begin + "Select Copy in the 1 Thumbnail"});
    row("paste", ArchiveAction::ACTION_PASTE,
        {begin + "Select Paste in the 1 Thumbnail", begin + "Select  the 2 Thumbnail"}); // the new one
    row("delete", ArchiveAction::ACTION_DELETE, {begin + "Select Delete in the 1 Thumbnail"});
    row("template", ArchiveAction::ACTION_ADD_USER, {begin + "Select Add User in the 1 Thumbnail"});
}

void tst_archivemenu::choicesAreLogged()
{
    QFETCH(const int, type);
    QFETCH(const Names, lines);
    openFolder(QStringLiteral("choices"), 4);
    m->holdAndChoose(3, ArchiveAction::ACTION_COPY);
    newLogLines();
    m->holdAndChoose(1, static_cast<ArchiveAction::ARCHIVE_ACTION_TYPE>(type));
    QCOMPARE(newLogLines(), lines);
}

void tst_archivemenu::choiceOnEmptyAreaIsLoggedWithTheLastTitle()
{
    openFolder(QStringLiteral("choice on nothing"), 3);
    m->hold(List::PICTURE_X, 800);
    m->choose(ArchiveAction::ACTION_CREATE);
    QCOMPARE(newLogLines(), Names{QStringLiteral("[Thumbnail] 200: Select  Create New in the 2 Thumbnail")});
}

// The title leaves the canvas for a moment while it is saved, which is not an action of the operator.
void tst_archivemenu::savingTheShownTitleSelectsNothing()
{
    openFolder(QStringLiteral("shown"), 20);
    m->list->setFixedSize(549, 900);
    m->list->selectArchive(7);
    m->list->verticalScrollBar()->setValue(120); // the title is cut at the lower edge
    newLogLines();
    m->takeCanvas();
    QSignalSpy leaving(m->list, &ArchiveList::itemSetDefaultState);
    QSignalSpy added(m->list, &ArchiveList::addUserSignal);
    m->hold(List::PICTURE_X, 7 * List::ROW + 10 - 120);
    QCOMPARE(m->value(), 120);
    QCOMPARE(m->item(7)->look(), ArchiveItem::OPERATE_AND_SELECT_STATE);
    m->choose(ArchiveAction::ACTION_ADD_USER);
    QCOMPARE(added.size(), 1);
    QCOMPARE(leaving.size(), 1);
    QCOMPARE(newLogLines(), Names{QStringLiteral("[Thumbnail] 200: Select Add User in the 7 Thumbnail")});
    QCOMPARE(m->value(), 120);
    QCOMPARE(m->selected(), 7);
    QVERIFY(m->item(7)->isSelected());
    QCOMPARE(m->item(7)->look(), ArchiveItem::UN_OPERATE_AND_SELECT_STATE);
    QCOMPARE(m->takeCanvas(), Names());
}

void tst_archivemenu::templateIsReportedWithItsFolder()
{
    FakeTitleChangeReporter reporter;
    openFolder(QStringLiteral("reported"), 2);
    m->holdAndChoose(1, ArchiveAction::ACTION_ADD_USER);
    QCOMPARE(reporter.takePaths(), (Reports{{5, templateRoot() + QStringLiteral("/UserTemplate_001")}}));
}

void tst_archivemenu::fullTemplateListTellsTheFreeName_data()
{
    QTest::addColumn<Names>("rows");
    QTest::addColumn<Reports>("messages");
    const Names foreign{QStringLiteral("News/Titler")};
    QTest::newRow("none free of 999") << templates(1, 999) << Reports{{196, QString()}};
    QTest::newRow("one free of 999") << (templates(1, 998) + foreign)
                                     << Reports{{196, QStringLiteral("UserTemplate_999")}};
    QTest::newRow("one free of 998") << (templates(1, 997) + foreign) << Reports();
    QTest::newRow("none free of 998")
        << (templates(1, 997) + templates(999, 999)) << Reports{{196, QString()}};
}

void tst_archivemenu::fullTemplateListTellsTheFreeName()
{
    QFETCH(const Names, rows);
    QFETCH(const Reports, messages);
    openFolder(QStringLiteral("many templates"), 1);
    LibraryFixture::writeOrder(templateRoot(), rows);
    QSignalSpy added(m->list, &ArchiveList::addUserSignal);
    m->holdAndChoose(0, ArchiveAction::ACTION_ADD_USER);
    QCOMPARE(m_messages.take(), messages);
    QCOMPARE(added.size(), messages.isEmpty() ? 1 : 0);
}

void tst_archivemenu::blankLabelStaysBlank()
{
    m->label.setText(QStringLiteral("in another language"));
    m->list->translateText();
    QCOMPARE(m->label.text(), QStringLiteral("Folder"));
    openFolder(QStringLiteral("named"), 1);
    m->list->translateText();
    QCOMPARE(m->label.text(), QStringLiteral("named"));
    m->list->cleanArchiveList();
    m->list->translateText();
    QCOMPARE(m->label.text(), QString());
}

QTEST_MAIN(tst_archivemenu)
#include "tst_archivemenu.moc"
