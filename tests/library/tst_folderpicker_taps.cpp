// What fingers do to the tree of the folder picker besides choosing a row: folders are opened and closed, the
// header sorts. Which check comes first when a folder is opened in the editor. What the operator, the other
// processes and the operation log are told.
#include "FolderPickerFixture.h"
#include "tests/fakes/ManualClock.h"
#include "tests/support/LogFixture.h"
#include "tests/support/Patience.h"
#include "touchui/KSEventMutexLockObject.h"

#include <QHeaderView>
#include <QLabel>

class tst_folderpicker_taps : public QObject
{
    Q_OBJECT

public:
    explicit tst_folderpicker_taps(LogFixture& log) : m_log(log) {}

private Q_SLOTS:
    void initTestCase()
    {
        Q_INIT_RESOURCE(UILibrary);
        Q_INIT_RESOURCE(TitlerToolResource);
    }
    void init() { f.reset(); }
    void cleanup() { f.close(); }

    // --- Opening and closing --------------------------------------------------------------------------

    void closingTheFolderOfTheChosenTitle()
    {
        f.make("news", {"t1", "t2"});
        f.open();
        QSignalSpy folder(f.picker.get(), &FolderPicker::changeFolderPath);
        QSignalSpy file(f.picker.get(), &FolderPicker::changeFolderFile);
        tapMark("news");
        f.tap(f.row("t2", f.row("news")));
        QCOMPARE(f.buttons(), QStringLiteral("-+++"));
        QVERIFY(thumbnail()->isVisible());
        tapMark("news");
        QVERIFY(!f.tree()->isExpanded(f.row("news")));
        QCOMPARE(f.current(), QStringLiteral("news"));
        QCOMPARE(f.buttons(), QStringLiteral("++++"));
        QVERIFY(!thumbnail()->isVisible());
        QCOMPARE(sizeLabel()->text(), QString());
        // The folder stays selected when it is opened again.
        tapMark("news");
        QCOMPARE(f.current(), QStringLiteral("news"));
        QCOMPARE(f.buttons(), QStringLiteral("++++"));
        tapMark("news");
        f.tapButton("openFolderButton");
        QCOMPARE(folder.count(), 1);
        QCOMPARE(folder.at(0).at(0).toString(), f.path("news"));
        QCOMPARE(file.count(), 0);
    }

    void closingAnotherFolder()
    {
        f.make("news", {"t1", "t2"});
        f.make("sports", {"t3"});
        f.open();
        tapMark("sports");
        tapMark("news");
        f.tap(f.row("t2", f.row("news")));
        tapMark("sports");
        QVERIFY(!f.tree()->isExpanded(f.row("sports")));
        QCOMPARE(f.current(), QStringLiteral("sports"));
        QCOMPARE(f.buttons(), QStringLiteral("++++"));
        QVERIFY(!thumbnail()->isVisible());
        f.tapButton("duplicateFolderButton");
        QVERIFY(f.picker->editor());
        QCOMPARE(f.picker->editor()->text(), QStringLiteral("sports"));
    }

    // A title that is selected opens its folder, and stays selected.
    void openingTheFolderOfTheChosenTitle()
    {
        f.make("news", {"t1", "t2"});
        f.open();
        f.tree()->setCurrentIndex(f.row("t2", f.row("news")));
        QVERIFY(f.tree()->isExpanded(f.row("news")));
        QCOMPARE(f.current(), QStringLiteral("t2"));
        QCOMPARE(f.buttons(), QStringLiteral("-+++"));
        QVERIFY(thumbnail()->isVisible());
    }

    // --- A touch that a sibling's lock interrupts -----------------------------------------------------

    void aLockUnderTheFingerRenamesNothing()
    {
        f.make("news", {"t1"});
        f.make("sports", {});
        f.open();
        takeReports();
        ManualClock clock;
        const std::unique_ptr<KSLockObject> lock(KSEventMutexLockObject::createFactory(nullptr));
        const QPoint news = f.tree()->viewport()->mapTo(f.picker.get(), f.place(f.row("news")));
        f.touch->press(f.picker.get(), news);
        f.touch->filter->lock(lock.get());
        f.touch->lift(f.picker.get(), news);
        clock.advance(2000);
        QVERIFY(!f.picker->editor());
        QCOMPARE(takeReports(), QStringList());
        f.touch->filter->unlock();
        f.tap("sports");
        QCOMPARE(f.current(), QStringLiteral("sports"));
    }

    // --- Before a folder opens ------------------------------------------------------------------------

    void aFullDiskIsToldBeforeAFullFolder()
    {
        QStringList stems;
        for (int i = 0; i < 99; ++i)
            stems.append(QStringLiteral("t%1").arg(i, 2, 10, QLatin1Char('0')));
        f.make("full", stems);
        f.open();
        QSignalSpy folder(f.picker.get(), &FolderPicker::changeFolderPath);
        f.context.createNew = true;
        qputenv("K2SYS_FS_REMAIN", "199999000");
        f.tap("full");
        f.tapButton("openFolderButton");
        QCOMPARE(f.messages.take(), (Reports{{114, QStringLiteral("File")}}));
        qputenv("K2SYS_FS_REMAIN", "200000000");
        f.tapButton("openFolderButton");
        QCOMPARE(f.messages.take(), (Reports{{96, QString()}}));
        QCOMPARE(folder.count(), 0);
        QVERIFY(f.picker->isVisible());
    }

    void titlesOfAFullFolderOpen()
    {
        QStringList stems;
        for (int i = 0; i < 99; ++i)
            stems.append(QStringLiteral("t%1").arg(i, 2, 10, QLatin1Char('0')));
        f.make("full", stems);
        f.open();
        QSignalSpy file(f.picker.get(), &FolderPicker::changeFolderFile);
        tapMark("full");
        f.tap(f.row("t01", f.row("full")));
        f.context.createNew = true;
        f.tapButton("openFolderButton");
        QCOMPARE(f.messages.take(), (Reports{{96, QString()}}));
        QCOMPARE(file.count(), 0);
        f.context.createNew = false;
        f.tapButton("openFolderButton");
        QCOMPARE(f.messages.take(), Reports());
        QCOMPARE(file.count(), 1);
    }

    void theFocusGoesBackToTheWindow()
    {
        f.make("news");
        f.open();
        f.tap("news");
        m_log.takeDebugLines(QString());
        f.tapButton("openFolderButton");
        const QString id = QString::number(f.window->winId());
        QCOMPARE(m_log.takeDebugLines("KSInputContext"), QStringList("200: App Name:Titler***WID:" + id));
    }

    // --- Names ----------------------------------------------------------------------------------------

    void whatANewFolderShows()
    {
        f.make("news");
        f.open();
        const QDateTime before = QDateTime::currentDateTime();
        f.tapButton("newFolderButton");
        const QModelIndex name = f.row("Untitled");
        const QModelIndex date = name.siblingAtColumn(FolderPickerFactory::DateColumn);
        QCOMPARE(f.tree()->currentIndex(), name);
        QVERIFY(name.data(35).toBool());
        QVERIFY(name.data(34).toBool());
        QVERIFY(!date.data(34).toBool());
        QCOMPARE(name.data(Qt::TextAlignmentRole).toInt(), 129);
        QVERIFY(name.data(Qt::DecorationRole).isValid());
        const QDateTime time = name.data(50).toDateTime();
        QVERIFY(time >= before && time <= QDateTime::currentDateTime());
        QCOMPARE(date.data().toString(), time.toString("yyyy-MM-dd hh:mm"));
        const FolderEditor* editor = f.picker->editor();
        QCOMPARE(editor->focusPolicy(), Qt::StrongFocus);
        QCOMPARE(editor->contextMenuPolicy(), Qt::NoContextMenu);
        QCOMPARE(editor->font().pixelSize(), 24);
    }

    void theFontOfTheLanguage()
    {
        f.make("news");
        f.open();
        f.picker->setSystemLanFont(QFont("Other"));
        f.tapButton("newFolderButton");
        for (const char* name : {"news", "Untitled"}) {
            const QFont font = f.row(QLatin1String(name)).data(Qt::FontRole).value<QFont>();
            QCOMPARE(font.family(), QStringLiteral("Other"));
            QCOMPARE(font.pixelSize(), 24);
        }
    }

    void limitsAreToldInWords()
    {
        f.make("news");
        f.open();
        f.hold("news");
        f.limits();
        f.input()->sendInputStringOnTextChanged(L"a/");
        f.input()->sendInputStringOnTextChanged(std::wstring(21, L'n'));
        f.input()->sendInputStringOnTextChanged(L"a");
        QCOMPARE(f.service->limits.size(), 3);
        QCOMPARE(QString::fromStdWString(f.service->limits.at(0).text),
                 QStringLiteral("The following characters cannot be entered.\n"
                                "\\ / : , ; * ? \" < > | [ ] = ."));
        QCOMPARE(QString::fromStdWString(f.service->limits.at(1).text),
                 QStringLiteral("You can only enter up to 20 characters."));
        QCOMPARE(QString::fromStdWString(f.service->limits.at(2).text), QString());
    }

    void aClashGivesTheNameBack()
    {
        f.make("news");
        f.make("sports");
        f.open();
        f.tapButton("newFolderButton");
        f.service->calls.clear();
        f.enter("NEWS");
        QCOMPARE(f.messages.take(), (Reports{{47, QStringLiteral("NEWS")}}));
        QCOMPARE(f.picker->editor()->text(), QStringLiteral("Untitled"));
        QVERIFY(f.service->calls.contains(QStringLiteral("close")));
        QVERIFY(!f.service->calls.contains(QStringLiteral("show")));
        f.answerClash();
        f.escape();
        QTRY_COMPARE(f.names(), QStringList({"news", "sports"}));
        f.hold("sports");
        f.enter("news");
        QCOMPARE(f.messages.take(), (Reports{{47, QStringLiteral("news")}}));
        QCOMPARE(f.picker->editor()->text(), QStringLiteral("sports"));
    }

    void foldersAreToldByTheirPaths()
    {
        takeReports();
        f.make("news", {"t1"});
        f.open();
        f.hold("news");
        QCOMPARE(takeReports(), QStringList("rename " + f.path("news")));
        f.enter("later");
        QCOMPARE(takeReports(), QStringList("renamed " + f.path("news") + " to " + f.path("later")));
        const QString added = QString::number(FileManagerDefine::TITLE_ADDED) + QLatin1Char(' ');
        f.tapButton("newFolderButton");
        f.enter("made");
        QCOMPARE(takeReports(), QStringList(added + f.path("made")));
        f.tap("later");
        f.tapButton("duplicateFolderButton");
        f.enter("copy");
        QCOMPARE(takeReports(), QStringList(added + f.path("copy")));
    }

    // --- What the operation log tells -----------------------------------------------------------------

    void sortingIsLogged()
    {
        for (const char* name : {"b", "c", "a"})
            f.make(QLatin1String(name));
        m_log.takeOperations(QString());
        f.open();
        QCOMPARE(fileList(), QStringList());
        tapHeader(FolderPickerFactory::NameColumn);
        QCOMPARE(f.names(), QStringList({"a", "b", "c"}));
        QCOMPARE(fileList(), QStringList{"200: Sort by Column: Name in AscendingOrder order"});
        tapHeader(FolderPickerFactory::NameColumn);
        QCOMPARE(f.names(), QStringList({"c", "b", "a"}));
        QCOMPARE(fileList(), QStringList{"200: Sort by Column: Name in DescendingOrder order"});
        tapHeader(FolderPickerFactory::DateColumn);
        QCOMPARE(fileList(), QStringList{"200: Sort by Column: Date in AscendingOrder order"});
        tapHeader(FolderPickerFactory::DateColumn);
        QCOMPARE(fileList(), QStringList{"200: Sort by Column: Date in DescendingOrder order"});
        f.model()->setHeaderData(FolderPickerFactory::NameColumn, Qt::Horizontal, QStringLiteral("名称"));
        tapHeader(FolderPickerFactory::NameColumn);
        QCOMPARE(fileList(),
                 QStringList{QStringLiteral("200: Sort by Column: 名称 in AscendingOrder order")});
    }

    void sortingEndsAnEdit()
    {
        f.make("a");
        f.make("b");
        f.open();
        m_log.takeOperations(QString());
        f.hold("a");
        f.type("c");
        tapHeader(FolderPickerFactory::NameColumn);
        QVERIFY(!f.picker->editor());
        QCOMPARE(f.folders(), QStringList({"b", "c"}));
        QCOMPARE(f.names(), QStringList({"b", "c"}));
        QCOMPARE(fileList(), QStringList{"200: Sort by Column: Name in AscendingOrder order"});
    }

    void whatDoesNotSortIsNotLogged()
    {
        f.make("a");
        f.make("b");
        f.open();
        m_log.takeOperations(QString());
        const QWidget* header = f.tree()->header()->viewport();
        const QPoint name = header->mapTo(f.picker.get(), sectionCenter(FolderPickerFactory::NameColumn));
        const QPoint date = header->mapTo(f.picker.get(), sectionCenter(FolderPickerFactory::DateColumn));
        // A finger that leaves the section.
        f.touch->press(f.picker.get(), name);
        f.touch->move(f.picker.get(), date);
        f.touch->lift(f.picker.get(), date);
        QCOMPARE(fileList(), QStringList());
        // Sorting by the program reports nothing.
        f.tree()->sortByColumn(FolderPickerFactory::NameColumn, Qt::DescendingOrder);
        QCOMPARE(f.names(), QStringList({"b", "a"}));
        f.picker->updateTreeView();
        QCOMPARE(fileList(), QStringList());
        // While the message about a name in use is shown, the header ignores touches.
        f.tapButton("newFolderButton");
        f.enter("a");
        QCOMPARE(f.messages.take(), (Reports{{47, QStringLiteral("a")}}));
        tapHeader(FolderPickerFactory::NameColumn);
        QCOMPARE(fileList(), QStringList());
        QCOMPARE(f.tree()->header()->sortIndicatorOrder(), Qt::DescendingOrder);
    }

    void everyTapIsLogged()
    {
        f.make("news", {"t1"});
        m_log.takeOperations(QString());
        f.open();
        QCOMPARE(folderArea(), QStringList());
        f.tap("news");
        QCOMPARE(folderArea(), QStringList{"200: Select Folder or File"});
        tapMark("news");
        QCOMPARE(folderArea(), QStringList());
        f.tap(f.row("t1", f.row("news")));
        QCOMPARE(folderArea(), QStringList{"200: Select Folder or File"});
        f.tapButton("newFolderButton");
        QCOMPARE(folderArea(), QStringList{"200: Tap New Folder Button"});
        f.enter("made");
        QCOMPARE(folderArea(), QStringList());
        f.tapButton("duplicateFolderButton");
        QCOMPARE(folderArea(), QStringList{"200: Tap Duplicate Button"});
        f.enter("copy");
        f.tapButton("openFolderButton");
        QCOMPARE(folderArea(), QStringList{"200: Tap Open Button"});
        f.picker->show();
        f.tapButton("cancelFolderButton");
        QCOMPARE(folderArea(), QStringList{"200: Tap Cancel Button"});
        QVERIFY(!f.picker->isVisible());
    }

private:
    // Returns what the file manager was told since the last call, with full paths.
    QStringList takeReports()
    {
        QStringList lines = f.reports.takePaths();
        for (const auto& [change, path] : f.titles.takePaths())
            lines.append(QString::number(change) + QLatin1Char(' ') + path);
        return lines;
    }
    // The mark in front of the name.
    void tapMark(const QString& name)
    {
        f.tap(f.tree()->viewport(), f.tree()->getIndicatorRect(f.row(name)).center());
    }
    QPoint sectionCenter(int column) const
    {
        const QHeaderView* header = f.tree()->header();
        return {header->sectionViewportPosition(column) + header->sectionSize(column) / 2,
                header->height() / 2};
    }
    void tapHeader(int column) { f.tap(f.tree()->header()->viewport(), sectionCenter(column)); }
    QStringList fileList() { return m_log.takeOperations(QStringLiteral("File List")); }
    QStringList folderArea() { return m_log.takeOperations(QStringLiteral("Folder Area")); }
    QLabel* thumbnail() const { return f.picker->findChild<QLabel*>("folderThumbnail"); }
    QLabel* sizeLabel() const { return f.picker->findChild<QLabel*>("folderFileSize"); }

    LogFixture& m_log;
    FolderPickerFixture f;
};

int main(int argc, char** argv)
{
    LogFixture log;
    KSInputContext::install();
    QApplication app(argc, argv);
    app.setObjectName(QStringLiteral("Titler"));
    tst_folderpicker_taps test(log);
    QTEST_SET_MAIN_SOURCE_PATH
    return QTest::qExec(&test, argc, argv);
}

#include "tst_folderpicker_taps.moc"
