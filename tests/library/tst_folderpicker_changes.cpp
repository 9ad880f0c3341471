// What the file manager and other processes do to folders while the folder picker shows, while a name is
// being typed in it, and while it is hidden.
#include "FolderPickerFixture.h"
#include "tests/support/Patience.h"

#include "tests/support/RandomSeed.h"

#include <QLabel>
#include <QRandomGenerator>

class tst_folderpicker_changes : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        Q_INIT_RESOURCE(UILibrary);
        Q_INIT_RESOURCE(TitlerToolResource);
    }
    void init()
    {
        f.reset();
        f.make("a", {"t1", "t2"});
        f.make("b", {"t3"});
        f.make("c");
        f.open();
    }
    void cleanup() { f.close(); }

    // --- Links ----------------------------------------------------------------------------------------

    void linksElsewhereAreNoFolders()
    {
        const QString outside = QFileInfo(f.root()).path() + QStringLiteral("/outside");
        QDir(outside).removeRecursively();
        QVERIFY(QDir().mkpath(outside));
        LibraryFixture::fillFolder(outside, {"foreign"});
        QVERIFY(QFile::link(outside, f.path("link")));
        QVERIFY(QFile::link(f.path("a"), f.path("inside")));
        QVERIFY(QFile::link(outside + QStringLiteral("/foreign.xml"), f.path("a/foreign.xml")));
        LibraryFixture::writeOrder(f.path("a"), {"t1", "foreign", "t2"});
        f.picker->updateTreeView();
        QCOMPARE(f.names(), QStringList({"a", "b", "c", "inside"}));
        QCOMPARE(f.names(f.row("a")), QStringList({"t1", "t2"}));
        // A folder that is replaced by a link while it is listed is removed from the list when it is tapped.
        QVERIFY(QDir(f.path("c")).removeRecursively() && QFile::link(outside, f.path("c")));
        QSignalSpy folder(f.picker.get(), &FolderPicker::changeFolderPath);
        f.tap("c");
        f.tapButton("openFolderButton");
        QVERIFY(folder.isEmpty());
        QCOMPARE(f.names(), QStringList({"a", "b", "inside"}));
        // A notice about a link is ignored, too.
        QSignalSpy renamed(f.picker.get(), &FolderPicker::folderNameChange);
        f.picker->setCurrentFolderName(QStringLiteral("a"));
        renameOutside("b", "d");
        QVERIFY(f.picker->treeModel()->rowCount() == 3 && renamed.isEmpty());
        notify("a", "link");
        QVERIFY(renamed.isEmpty());
        QCOMPARE(f.names(), QStringList({"a", "d", "inside"}));
        // Files behind links are not copied.
        f.tap("a");
        f.tapButton("duplicateFolderButton");
        f.enter("copy");
        QVERIFY(QFile::exists(f.path("copy/t1.xml")));
        QVERIFY(!QFile::exists(f.path("copy/foreign.xml")));
        QFile::remove(f.path("link"));
        QFile::remove(f.path("c"));
        QVERIFY(QFile::exists(outside + QStringLiteral("/foreign.xml")));
    }

    // --- Renames --------------------------------------------------------------------------------------

    void renameOfAFolder_data()
    {
        QTest::addColumn<bool>("paths");
        QTest::newRow("names") << false;
        QTest::newRow("full paths") << true;
    }

    void renameOfAFolder()
    {
        QFETCH(bool, paths);
        f.tree()->expand(f.row("a"));
        f.tap(f.row("t2", f.row("a")));
        renameOutside("a", QStringLiteral("天气"), paths);
        QCOMPARE(f.names(), QStringList({QStringLiteral("天气"), "b", "c"}));
        QCOMPARE(f.names(f.row(QStringLiteral("天气"))), QStringList({"t1", "t2"}));
        QVERIFY(f.isEditable(QStringLiteral("天气")));
        QSignalSpy folder(f.picker.get(), &FolderPicker::changeFolderPath);
        f.tap(QStringLiteral("天气"));
        f.tapButton("openFolderButton");
        QCOMPARE(folder.at(0).at(0).toString(), f.path(QStringLiteral("天气")));
    }

    void renameOfTheNameThatIsBeingTyped()
    {
        f.hold("a");
        f.type("xyz");
        f.service->calls.clear();
        f.service->shown.clear();
        renameOutside("a", "later");
        QVERIFY(f.picker->editor());
        QCOMPARE(f.picker->editor()->text(), QStringLiteral("later"));
        // The keyboard is closed and opened again on the same field.
        QVERIFY(f.service->calls.indexOf("close") >= 0);
        QVERIFY(f.service->calls.indexOf("close") < f.service->calls.lastIndexOf("show"));
        QCOMPARE(f.service->shown.constLast().title, std::wstring(L"Folder Name"));
        QCOMPARE(f.service->shown.constLast().lastValue, 2);
        f.reports.take();
        f.enter("mine");
        QCOMPARE(f.folders(), QStringList({"b", "c", "mine"}));
        QCOMPARE(f.names(), QStringList({"mine", "b", "c"}));
        QCOMPARE(f.reports.take(), QStringList{"renamed later to mine"});
        QCOMPARE(f.names(f.row("mine")), QStringList({"t1", "t2"}));
    }

    void renameOfTheNameThatIsBeingTypedAndGivenUp()
    {
        f.hold("a");
        renameOutside("a", "later");
        f.escape();
        QVERIFY(!f.picker->editor());
        QCOMPARE(f.names(), QStringList({"later", "b", "c"}));
        QCOMPARE(f.folders(), QStringList({"b", "c", "later"}));
    }

    void renameOfAnotherFolderDuringAnEdit()
    {
        f.hold("b");
        renameOutside("a", "later");
        QVERIFY(f.picker->editor());
        QCOMPARE(f.picker->editor()->text(), QStringLiteral("b"));
        QCOMPARE(f.names(), QStringList({"later", "b", "c"}));
        // The new name of the other folder is in use now, its old name is free.
        f.enter("LATER");
        QCOMPARE(f.messages.take(), (Reports{{47, QStringLiteral("LATER")}}));
        f.answerClash();
        f.enter("a");
        QCOMPARE(f.folders(), QStringList({"a", "c", "later"}));
    }

    void renameOfASourceDuringItsDuplication()
    {
        f.tap("a");
        f.tapButton("duplicateFolderButton");
        renameOutside("a", "later");
        f.enter("copy");
        QCOMPARE(f.folders(), QStringList({"b", "c", "copy", "later"}));
        QCOMPARE(LibraryFixture::order(f.path("copy")), QStringList({"t1", "t2"}));
        QCOMPARE(f.names(f.row("later")), QStringList({"t1", "t2"}));
    }

    void renameToTheNameThatIsBeingMade()
    {
        f.tapButton("newFolderButton");
        renameOutside("a", "Untitled");
        f.enter();
        QCOMPARE(f.messages.take(), (Reports{{47, QStringLiteral("Untitled")}}));
        f.answerClash();
        f.enter("new");
        QCOMPARE(f.folders(), QStringList({"Untitled", "b", "c", "new"}));
        QCOMPARE(f.names(), QStringList({"Untitled", "b", "c", "new"}));
        QCOMPARE(f.names(f.row("Untitled")), QStringList({"t1", "t2"}));
    }

    void renameOfTheOpenFolder()
    {
        f.picker->setCurrentFolderName("a");
        QSignalSpy change(f.picker.get(), &FolderPicker::folderNameChange);
        QSignalSpy clear(f.picker.get(), &FolderPicker::clearUndoCommandStack);
        renameOutside("a", "later");
        QCOMPARE(change.count(), 1);
        QCOMPARE(change.at(0).at(0).toString(), f.path("a"));
        QCOMPARE(change.at(0).at(1).toString(), f.path("later"));
        // The undo steps are dropped, since their paths do not exist any more.
        QCOMPARE(clear.count(), 1);
        QCOMPARE(f.picker->currentFolderName(), QStringLiteral("later"));
        QVERIFY(!f.isEditable("later"));
        renameOutside("b", "other");
        QCOMPARE(change.count(), 1);
        QVERIFY(f.isEditable("other"));
    }

    void renameWhileHidden()
    {
        f.picker->setCurrentFolderName("a");
        f.picker->hide();
        QSignalSpy change(f.picker.get(), &FolderPicker::folderNameChange);
        renameOutside("a", "later");
        renameOutside("b", "other");
        QCOMPARE(f.picker->currentFolderName(), QStringLiteral("later"));
        QCOMPARE(change.count(), 1);
        QCOMPARE(f.names(), QStringList({"a", "b", "c"}));
        f.picker->updateTreeView();
        f.picker->show();
        QCOMPARE(f.names(), QStringList({"c", "later", "other"}));
        QVERIFY(!f.isEditable("later"));
        QVERIFY(f.isEditable("other"));
    }

    void renamesThatSaySomethingElse_data()
    {
        QTest::addColumn<QString>("before");
        QTest::addColumn<QString>("after");
        QTest::newRow("nothing") << QString() << QString();
        QTest::newRow("no new name") << "a" << QString();
        QTest::newRow("no old name") << QString() << "later";
        QTest::newRow("parent") << "a"
                                << "..";
        QTest::newRow("itself") << "."
                                << "later";
        QTest::newRow("slashes") << "///"
                                 << "///";
        QTest::newRow("unknown") << "gone"
                                 << "later";
        QTest::newRow("huge") << QString(100000, QLatin1Char('x')) << QString(100000, QLatin1Char('y'));
    }

    void renamesThatSaySomethingElse()
    {
        QFETCH(QString, before);
        QFETCH(QString, after);
        f.picker->setCurrentFolderName("a");
        QSignalSpy change(f.picker.get(), &FolderPicker::folderNameChange);
        notify(before, after);
        QCOMPARE(f.names(), QStringList({"a", "b", "c"}));
        QCOMPARE(f.picker->currentFolderName(), QStringLiteral("a"));
        QCOMPARE(change.count(), 0);
        QCOMPARE(f.folders(), QStringList({"a", "b", "c"}));
    }

    // --- Deletions ------------------------------------------------------------------------------------

    void deletionOfTheChosenFolder_data()
    {
        QTest::addColumn<QString>("name");
        QTest::newRow("its name") << "a";
        QTest::newRow("in another case") << "A";
        QTest::newRow("full path") << f.path("a");
        QTest::newRow("with a slash") << f.path("a") + "/";
    }

    void deletionOfTheChosenFolder()
    {
        QFETCH(QString, name);
        f.tree()->expand(f.row("a"));
        f.tap(f.row("t1", f.row("a")));
        QVERIFY(thumbnail()->isVisible());
        QDir(f.path("a")).removeRecursively();
        f.picker->slotDeleteFolder(name.toStdWString());
        QCOMPARE(f.buttons(), QStringLiteral("-+-+"));
        QCOMPARE(f.current(), QString());
        QVERIFY(!thumbnail()->isVisible());
        QCOMPARE(f.picker->findChild<QLabel*>("folderFileSize")->text(), QString());
        QCOMPARE(f.names(), QStringList({"b", "c"}));
    }

    void deletionOfAnotherFolder()
    {
        f.tap("b");
        deleteOutside("a");
        QCOMPARE(f.names(), QStringList({"b", "c"}));
        QCOMPARE(f.current(), QStringLiteral("b"));
        QCOMPARE(f.buttons(), QStringLiteral("++++"));
    }

    void deletionOfTheOpenFolder()
    {
        f.picker->setCurrentFolderName("a");
        deleteOutside("a");
        QCOMPARE(f.picker->currentFolderName(), QString());
        QCOMPARE(f.names(), QStringList({"b", "c"}));
    }

    void deletionOfTheNameThatIsBeingTyped()
    {
        f.hold("a");
        f.type("x");
        deleteOutside("a");
        QTRY_VERIFY(!f.picker->editor());
        QCOMPARE(f.picker->editAction(), FolderPicker::FOLDER_EDIT_NONE);
        QCOMPARE(f.names(), QStringList({"b", "c"}));
        QCOMPARE(f.folders(), QStringList({"b", "c"}));
        QVERIFY(f.service->calls.contains(QStringLiteral("close")));
        f.tapButton("newFolderButton");
        f.enter("new");
        QCOMPARE(f.folders(), QStringList({"b", "c", "new"}));
    }

    void deletionUnderAClash()
    {
        f.hold("a");
        f.enter("b");
        QCOMPARE(f.messages.take(), (Reports{{47, QStringLiteral("b")}}));
        deleteOutside("a");
        f.answerClash();
        QVERIFY(!f.picker->editor());
        f.tap("b");
        QCOMPARE(f.current(), QStringLiteral("b"));
    }

    void deletionOfAnotherFolderDuringAnEdit()
    {
        f.hold("a");
        deleteOutside("b");
        QVERIFY(f.picker->editor());
        f.enter("b");
        QCOMPARE(f.messages.take(), Reports());
        QCOMPARE(f.folders(), QStringList({"b", "c"}));
        QCOMPARE(f.names(f.row("b")), QStringList({"t1", "t2"}));
    }

    void deletionOfASourceDuringItsDuplication()
    {
        f.tap("a");
        f.tapButton("duplicateFolderButton");
        deleteOutside("a");
        f.enter("copy");
        // The source of the copy does not exist any more.
        QVERIFY(!f.picker->editor());
        QVERIFY(!QFileInfo::exists(f.path("copy")));
        QCOMPARE(f.titles.take(), Reports());
        QCOMPARE(f.messages.take(), (Reports{{115, QStringLiteral("folder")}}));
        // The row without a folder is removed together with the editor.
        QTRY_COMPARE(f.names(), QStringList({"b", "c"}));
        QVERIFY(f.picker->isVisible());
    }

    void deletionOfANameThatIsOnlyBeingMade()
    {
        f.tapButton("newFolderButton");
        f.picker->slotDeleteFolder(L"Untitled");
        QVERIFY(f.picker->editor());
        f.enter();
        QVERIFY(QFileInfo(f.path("Untitled")).isDir());
    }

    void deletionWhileHidden()
    {
        f.tap("a");
        f.picker->setCurrentFolderName("a");
        f.picker->hide();
        deleteOutside("a");
        QCOMPARE(f.picker->currentFolderName(), QString());
        QCOMPARE(f.names(), QStringList({"b", "c"}));
        f.picker->show();
        QVERIFY(!f.button("openFolderButton")->isEnabled() || f.current() != QStringLiteral("a"));
        f.picker->openFolder();
    }

    void deletionsThatSaySomethingElse()
    {
        f.tap("a");
        for (const wchar_t* name : {L"", L"/", L"gone", L"..", L"a/..", L"ab"})
            f.picker->slotDeleteFolder(name);
        f.picker->slotDeleteFolder(std::wstring(100000, L'x'));
        QCOMPARE(f.names(), QStringList({"a", "b", "c"}));
        QCOMPARE(f.current(), QStringLiteral("a"));
    }

    // --- Names that differ in case alone --------------------------------------------------------------

    void changesBesideTheOpenFolder_data()
    {
        QTest::addColumn<bool>("shown");
        QTest::newRow("shown") << true;
        QTest::newRow("hidden") << false;
    }

    void changesBesideTheOpenFolder()
    {
        QFETCH(bool, shown);
        f.make("A", {"t9"});
        f.picker->updateTreeView();
        f.picker->setCurrentFolderName("A");
        f.picker->setVisible(shown);
        QSignalSpy change(f.picker.get(), &FolderPicker::folderNameChange);
        QSignalSpy clear(f.picker.get(), &FolderPicker::clearUndoCommandStack);
        renameOutside("a", "later");
        QCOMPARE(f.picker->currentFolderName(), QStringLiteral("A"));
        QCOMPARE(change.count(), 0);
        QCOMPARE(clear.count(), 0);
        renameOutside("later", "a");
        deleteOutside("a");
        QCOMPARE(f.picker->currentFolderName(), QStringLiteral("A"));
        QCOMPARE(f.names(), QStringList({"A", "b", "c"}));
        QVERIFY(!f.isEditable("A"));
        // After the other folder is renamed, only the open folder can be meant.
        QVERIFY(QDir(f.root()).rename("A", "new"));
        notify("a", "new");
        QCOMPARE(f.picker->currentFolderName(), QStringLiteral("new"));
        QCOMPARE(change.count(), 1);
        QCOMPARE(clear.count(), 1);
    }

    void deletionOfTheOpenFolderInAnotherCase()
    {
        f.picker->setCurrentFolderName("a");
        QDir(f.path("a")).removeRecursively();
        f.picker->slotDeleteFolder(L"A");
        QCOMPARE(f.picker->currentFolderName(), QString());
        QCOMPARE(f.names(), QStringList({"b", "c"}));
    }

    void renameBesideTheNameThatIsBeingTyped()
    {
        f.make("A", {"t9"});
        f.picker->updateTreeView();
        f.hold("A");
        renameOutside("a", "later");
        QVERIFY(f.picker->editor());
        QCOMPARE(f.picker->editor()->text(), QStringLiteral("A"));
        f.reports.take();
        f.enter("mine");
        QCOMPARE(f.reports.take(), QStringList{"renamed A to mine"});
        QCOMPARE(f.folders(), QStringList({"b", "c", "later", "mine"}));
        QCOMPARE(f.names(f.row("mine")), QStringList{"t9"});
        QCOMPARE(f.names(f.row("later")), QStringList({"t1", "t2"}));
    }

    // --- Folders that come ----------------------------------------------------------------------------

    void importsShowWithTheNextReading()
    {
        f.tap("b");
        f.make("imported", {"t9"});
        f.picker->setCurrentFolderName("b");
        f.picker->updateTreeView();
        QCOMPARE(f.names(), QStringList({"a", "b", "c", "imported"}));
        QCOMPARE(f.names(f.row("imported")), QStringList{"t9"});
        QCOMPARE(f.picker->currentFolderName(), QStringLiteral("b"));
        QCOMPARE(f.buttons().at(0), QLatin1Char('-'));
        QCOMPARE(f.buttons().at(2), QLatin1Char('-'));
    }

    void anImportTakesTheNameThatIsBeingMade()
    {
        f.tapButton("newFolderButton");
        f.make("new", {"t9"}); // without a notice
        f.enter("new");
        QVERIFY(!f.picker->editor());
        QCOMPARE(f.names(), QStringList({"a", "b", "c", "new"}));
        QCOMPARE(f.names(f.row("new")), QStringList{"t9"});
        QCOMPARE(f.titles.take(), Reports());
    }

    void aReadingEndsAnEdit()
    {
        f.hold("a");
        f.picker->updateTreeView();
        QTRY_VERIFY(!f.picker->editor());
        QCOMPARE(f.names(), QStringList({"a", "b", "c"}));
        f.tapButton("newFolderButton");
        f.picker->updateTreeView();
        QTRY_VERIFY(!f.picker->editor());
        QTRY_COMPARE(f.names(), QStringList({"a", "b", "c"}));
        QCOMPARE(f.folders(), QStringList({"a", "b", "c"}));
    }

    // --- All of it, in any order ----------------------------------------------------------------------

    // After any order of actions the tree lists what is on the disk, and no edit is left half open.
    void inAnyOrder_data()
    {
        QTest::addColumn<quint32>("usualSeed");
        for (const quint32 usualSeed : {1U, 20261121U, 77U})
            QTest::addRow("%u", usualSeed) << usualSeed;
    }

    void inAnyOrder()
    {
        QFETCH(quint32, usualSeed);
        const RandomSeed seed(usualSeed);
        QRandomGenerator random(seed);
        f.tree()->touch()->setHoldInterval(1);
        for (int step = 0; step < 600; ++step) {
            const QString done = randomStep(random);
            QCoreApplication::processEvents();
            QVERIFY2(!QTest::currentTestFailed(), qPrintable(done));
            const bool editing = f.picker->editor() != nullptr;
            QCOMPARE(f.picker->editAction() != FolderPicker::FOLDER_EDIT_NONE, editing);
            QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
            QCOMPARE(f.tree()->findChildren<FolderEditor*>().size(), editing ? 1 : 0);
            QVERIFY2(f.picker->isVisible() || !editing, qPrintable(done));
            if (!f.picker->isVisible())
                continue;
            const QStringList names = f.names();
            const QStringList folders = f.folders();
            for (const QString& folder : folders) {
                const bool isListed = names.contains(folder);
                QVERIFY2(isListed, qPrintable(done + ": " + folder + " is not in " + names.join('|')));
            }
            QVERIFY2(names.size() - folders.size() <= 1 + m_refused,
                     qPrintable(done + ": " + names.join('|')));
        }
        // After it is read again, the tree equals the disk.
        f.picker->updateTreeView();
        QCoreApplication::processEvents();
        QStringList names = f.names();
        names.sort();
        QStringList folders = f.folders();
        folders.sort();
        QCOMPARE(names, folders);
    }

private:
    QString randomStep(QRandomGenerator& random)
    {
        const QStringList pool = {"a", "B", "b", "news", "NEWS", QStringLiteral("天气"), "x  ", "y", "q", ""};
        const QString name = pool.at(random.bounded(pool.size()));
        const QStringList folders = f.folders();
        const QString folder = folders.isEmpty() ? QString() : folders.at(random.bounded(folders.size()));
        const int rows = f.model()->rowCount();
        const QModelIndex row = rows > 0 ? f.model()->index(random.bounded(rows), 0) : QModelIndex();
        const char* buttons[] = {"newFolderButton", "duplicateFolderButton", "openFolderButton",
                                 "cancelFolderButton"};
        const int kind = random.bounded(16);
        if (!f.picker->isVisible()) {
            f.picker->updateTreeView();
            f.picker->show();
            f.picker->activateWindow();
            return QStringLiteral("open");
        }
        switch (kind) {
        case 0:
        case 1:
            f.tapButton(buttons[random.bounded(4)]);
            break;
        case 2:
        case 3:
            f.tapButton(buttons[random.bounded(2)]);
            break;
        case 4:
        case 5:
        case 6:
            f.enter(name);
            break;
        case 7:
            f.input()->sendInputStringOnTextChanged(random.bounded(2) ? L"a/b" : L"fine");
            break;
        case 8:
            f.closeKeyboard();
            break;
        case 9:
            if (f.picker->editor())
                f.escape();
            break;
        case 10:
            f.answerClash();
            break;
        case 11:
            if (!folder.isEmpty() && !name.isEmpty() && !folders.contains(name, Qt::CaseInsensitive))
                renameOutside(folder, name);
            break;
        case 12:
            if (folders.size() > 3) {
                // If the source of a copy is deleted, a row without a folder remains.
                m_refused += f.picker->editAction() == FolderPicker::FOLDER_EDIT_DUPLICATE ? 1 : 0;
                deleteOutside(folder);
            }
            break;
        case 13:
            if (row.isValid() && f.tree()->visualRect(row).isValid()) {
                const QPoint point = f.tree()->viewport()->mapTo(f.picker.get(), f.place(row));
                f.touch->press(f.picker.get(), point);
                QTest::qWait(5);
                f.touch->lift(f.picker.get(), point);
            }
            break;
        default:
            if (row.isValid() && f.tree()->visualRect(row).isValid())
                f.tap(row);
            break;
        }
        return QStringLiteral("%1 %2 %3").arg(kind).arg(name, folder);
    }

    void notify(const QString& before, const QString& after)
    {
        FileManagerDefine::tagChangeFolderNameParam param;
        param.oldPath = before.toStdWString();
        param.newPath = after.toStdWString();
        f.picker->folderNameChanged(param);
    }
    void renameOutside(const QString& before, const QString& after, bool paths = false)
    {
        QVERIFY(QDir(f.root()).rename(before, after));
        notify(paths ? f.path(before) : before, paths ? f.path(after) : after);
    }
    void deleteOutside(const QString& name)
    {
        QVERIFY(QDir(f.path(name)).removeRecursively());
        f.picker->slotDeleteFolder(name.toStdWString());
    }
    QLabel* thumbnail() const { return f.picker->findChild<QLabel*>("folderThumbnail"); }

    int m_refused = 0; // rows that may have no folder
    FolderPickerFixture f;
};

int main(int argc, char** argv)
{
    KSInputContext::install();
    QApplication app(argc, argv);
    app.setObjectName(QStringLiteral("Titler"));
    tst_folderpicker_changes test;
    QTEST_SET_MAIN_SOURCE_PATH
    return QTest::qExec(&test, argc, argv);
}

#include "tst_folderpicker_changes.moc"
