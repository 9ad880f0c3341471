// The folder picker under a finger: choosing, opening, making, copying and renaming folders.
#include "FolderPickerFixture.h"
#include "tests/support/Patience.h"

#include <QLabel>

class tst_folderpicker : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        Q_INIT_RESOURCE(UILibrary);
        Q_INIT_RESOURCE(TitlerToolResource);
    }
    void init() { f.reset(); }
    void cleanup() { f.close(); }

    // --- Choosing and opening -------------------------------------------------------------------------

    void buttonStates_data()
    {
        QTest::addColumn<int>("state");
        QTest::addColumn<QString>("buttons");
        QTest::newRow("0") << 0 << "++++";
        QTest::newRow("1") << 1 << "-+++";
        QTest::newRow("2") << 2 << "--++";
        QTest::newRow("3") << 3 << "----";
        QTest::newRow("4") << 4 << "-+-+";
        QTest::newRow("5") << 5 << "++++";
        QTest::newRow("-1") << -1 << "++++";
    }

    void buttonStates()
    {
        QFETCH(int, state);
        QFETCH(QString, buttons);
        f.open();
        f.picker->ChangeButtonState(static_cast<FolderPicker::folderButtonState>(state));
        QCOMPARE(f.buttons(), buttons);
    }

    void tapsChoose()
    {
        f.make("news", {"t1", "t2"});
        f.make("sports");
        f.open();
        QCOMPARE(f.names(), QStringList({"news", "sports"}));
        QCOMPARE(f.buttons(), QStringLiteral("-+-+"));
        f.tap("sports");
        QCOMPARE(f.current(), QStringLiteral("sports"));
        QCOMPARE(f.buttons(), QStringLiteral("++++"));
        QVERIFY(!thumbnail()->isVisible());
        // The mark in front of the name opens the folder, which is then the chosen one.
        const QModelIndex news = f.row("news");
        f.tap(f.tree()->viewport(), f.tree()->getIndicatorRect(news).center());
        QVERIFY(f.tree()->isExpanded(news));
        QCOMPARE(f.current(), QStringLiteral("news"));
        QCOMPARE(f.buttons(), QStringLiteral("++++"));
        f.tap(f.row("t2", news));
        QCOMPARE(f.current(), QStringLiteral("t2"));
        QCOMPARE(f.buttons(), QStringLiteral("-+++"));
        QVERIFY(thumbnail()->isVisible());
        QCOMPARE(thumbnail()->pixmap().size(), QSize(240, 135));
        QCOMPARE(thumbnail()->pixmap().toImage().pixelColor(120, 67), QColor(Qt::red));
        QCOMPARE(sizeLabel()->text(), QStringLiteral("1920 x 1080"));
        f.tap("sports");
        QVERIFY(!thumbnail()->isVisible());
        QCOMPARE(sizeLabel()->text(), QString());
    }

    // The line of the frame is seven columns before the last one.
    void nothingTouchesTheFrame()
    {
        f.open();
        const int line = FolderPicker::FOLDER_PICKER_SIZE.width() - 8;
        for (const char* name : {"folderTree", "cancelFolderButton"}) {
            const auto* widget = f.picker->findChild<QWidget*>(QLatin1String(name));
            QVERIFY2(widget->geometry().right() < line - 8, name);
            QVERIFY2(widget->geometry().left() > 8 + 7, name);
        }
    }

    void picturesThatAreNone()
    {
        f.make("news", {"gone", "torn", "folder"});
        QFile::remove(f.path("news") + "/gone_240.png");
        QVERIFY(QFile::resize(f.path("news") + "/torn_240.png", 60));
        QFile::remove(f.path("news") + "/folder_240.png");
        QDir(f.path("news")).mkdir("folder_240.png");
        f.open();
        f.tree()->expand(f.row("news"));
        for (const char* name : {"gone", "torn", "folder"}) {
            f.tap(f.row(QLatin1String(name), f.row("news")));
            QVERIFY(thumbnail()->isVisible());
            QCOMPARE(thumbnail()->pixmap().size(), QSize(240, 135));
        }
    }

    void thePictureThatATitleNames()
    {
        f.make("news", {"own", "torn"});
        const QString folder = f.path("news");
        QVERIFY(QFile::remove(folder + "/own_240.png"));
        QImage small(240, 135, QImage::Format_RGB32);
        small.fill(Qt::blue);
        QVERIFY(small.save(folder + "/own_240.jpg"));
        const auto record = LibraryFixture::makeRecord(folder, "own", "own");
        record->setThumbnailSmall("own_240.jpg");
        QVERIFY(ArchiveController().saveNewArchive(folder, record.get()));
        QVERIFY(QFile::resize(folder + "/torn.xml", 60));
        f.open();
        f.tree()->expand(f.row("news"));
        f.tap(f.row("own", f.row("news")));
        QVERIFY(thumbnail()->pixmap().toImage().pixelColor(120, 67).blue() > 240);
        f.tap(f.row("torn", f.row("news")));
        QCOMPARE(thumbnail()->pixmap().toImage().pixelColor(120, 67), QColor(Qt::red));
    }

    void opensAFolder()
    {
        f.make("news", {"t1"});
        f.open();
        QSignalSpy folder(f.picker.get(), &FolderPicker::changeFolderPath);
        QSignalSpy file(f.picker.get(), &FolderPicker::changeFolderFile);
        QSignalSpy clear(f.picker.get(), &FolderPicker::clearUndoCommandStack);
        f.tap("news");
        f.tapButton("openFolderButton");
        QCOMPARE(folder.count(), 1);
        QCOMPARE(folder.takeFirst().at(0).toString(), f.path("news"));
        QCOMPARE(file.count(), 0);
        QCOMPARE(clear.count(), 1);
        QVERIFY(!f.picker->isVisible());
        QCOMPARE(f.picker->currentFolderName(), QStringLiteral("news"));
    }

    void opensATitle()
    {
        f.make(QStringLiteral("天气"), {"t1", "t2"});
        f.open();
        QSignalSpy folder(f.picker.get(), &FolderPicker::changeFolderPath);
        QSignalSpy file(f.picker.get(), &FolderPicker::changeFolderFile);
        const QModelIndex parent = f.row(QStringLiteral("天气"));
        f.tree()->expand(parent);
        f.tap(f.row("t2", parent));
        f.tapButton("openFolderButton");
        QCOMPARE(folder.count(), 0);
        QCOMPARE(file.count(), 1);
        QCOMPARE(file.at(0).at(0).toString(), f.path(QStringLiteral("天气")));
        QCOMPARE(file.at(0).at(1).toString(), QStringLiteral("t2.xml"));
        QCOMPARE(f.picker->currentFolderName(), QStringLiteral("天气"));
    }

    void nothingIsChosen()
    {
        f.make("news");
        f.open();
        QSignalSpy folder(f.picker.get(), &FolderPicker::changeFolderPath);
        f.picker->openFolder();
        f.picker->duplicateFolder();
        QCOMPARE(folder.count(), 0);
        QVERIFY(f.picker->isVisible());
        QCOMPARE(f.folders(), QStringList{"news"});
    }

    void theDialogStaysWhenNothingWasPickedAboveIt()
    {
        f.make("news");
        f.open();
        QSignalSpy clear(f.picker.get(), &FolderPicker::clearUndoCommandStack);
        connect(f.picker.get(), &FolderPicker::changeFolderPath, this,
                [this] { f.picker->setKeepFolderDialog(); });
        f.tap("news");
        f.tapButton("openFolderButton");
        QVERIFY(f.picker->isVisible());
        QCOMPARE(clear.count(), 0);
        f.picker->disconnect(this);
        f.tapButton("openFolderButton");
        QVERIFY(!f.picker->isVisible());
    }

    void aFolderThatHasVanished()
    {
        f.make("news", {"t1"});
        f.make("sports");
        f.open();
        QSignalSpy folder(f.picker.get(), &FolderPicker::changeFolderPath);
        f.tap("news");
        QDir(f.path("news")).removeRecursively();
        f.tapButton("openFolderButton");
        QCOMPARE(folder.count(), 0);
        QCOMPARE(f.names(), QStringList{"sports"});
        QCOMPARE(f.buttons(), QStringLiteral("-+-+"));
        f.tap("sports");
        QDir(f.path("sports")).removeRecursively();
        f.tapButton("duplicateFolderButton");
        QCOMPARE(f.names(), QStringList());
        QVERIFY(!f.picker->editor());
    }

    void aFullFolderTakesNoNewTitles()
    {
        QStringList stems;
        for (int i = 0; i < 99; ++i)
            stems.append(QStringLiteral("t%1").arg(i, 2, 10, QLatin1Char('0')));
        f.make("full", stems);
        f.make("almost", stems.mid(1));
        f.open();
        QSignalSpy folder(f.picker.get(), &FolderPicker::changeFolderPath);
        f.context.createNew = true;
        f.tap("full");
        f.tapButton("openFolderButton");
        QCOMPARE(f.messages.take(), (Reports{{96, QString()}}));
        QVERIFY(f.picker->isVisible());
        QCOMPARE(folder.count(), 0);
        f.tap("almost");
        f.tapButton("openFolderButton");
        QCOMPARE(folder.count(), 1);
        f.picker->show();
        f.context.createNew = false;
        f.tap("full");
        f.tapButton("openFolderButton");
        QCOMPARE(folder.count(), 2);
        QCOMPARE(f.messages.take(), Reports());
    }

    void aFullDiskTakesNoNewTitles()
    {
        f.make("empty");
        f.make("news", {"t1"});
        f.open();
        QSignalSpy folder(f.picker.get(), &FolderPicker::changeFolderPath);
        qputenv("K2SYS_FS_REMAIN", "199999000");
        f.tap("empty");
        f.tapButton("openFolderButton");
        QCOMPARE(f.messages.take(), (Reports{{114, QStringLiteral("File")}}));
        f.context.createNew = true;
        f.tap("news");
        f.tapButton("openFolderButton");
        QCOMPARE(f.messages.take(), (Reports{{114, QStringLiteral("File")}}));
        QCOMPARE(folder.count(), 0);
        f.context.createNew = false;
        f.tapButton("openFolderButton");
        QCOMPARE(folder.count(), 1);
    }

    void cancels()
    {
        f.make("news");
        f.open();
        QSignalSpy cancelled(f.picker.get(), &FolderPicker::signalCancelClicked);
        f.tapButton("cancelFolderButton");
        QCOMPARE(cancelled.count(), 1);
        QVERIFY(!f.picker->isVisible());
        f.picker->show();
        f.picker->setCancelButtonEnabled(false);
        f.picker->reject();
        QVERIFY(f.picker->isVisible());
        QCOMPARE(cancelled.count(), 1);
        f.picker->setCancelButtonEnabled(true);
        QTest::keyClick(f.picker.get(), Qt::Key_Escape);
        QVERIFY(!f.picker->isVisible());
        QCOMPARE(cancelled.count(), 2);
    }

    void keysThatWouldJump()
    {
        f.make("a");
        f.make("b");
        f.make("c");
        f.open();
        f.tap("b");
        for (const Qt::Key key :
             {Qt::Key_Home, Qt::Key_End, Qt::Key_PageUp, Qt::Key_PageDown, Qt::Key_Down}) {
            QTest::keyClick(f.tree(), key);
            QCOMPARE(f.current(), QStringLiteral("b"));
        }
    }

    // --- New folders ----------------------------------------------------------------------------------

    void makesAFolder_data() { scripts(); }

    void makesAFolder()
    {
        QFETCH(QString, name);
        f.make("news");
        f.open();
        f.tapButton("newFolderButton");
        QVERIFY(f.picker->editor());
        QCOMPARE(f.picker->editAction(), FolderPicker::FOLDER_EDIT_CREATE);
        QCOMPARE(f.picker->editor()->selectedText(), QStringLiteral("Untitled"));
        QCOMPARE(f.service->shown.size(), 1);
        const auto& data = f.service->shown.constFirst();
        QCOMPARE(data.keyboardType, 2);
        QCOMPARE(data.title, std::wstring(L"Folder Name"));
        QCOMPARE(data.selectionMode, 0);
        QCOMPARE(data.lastValue, 2);
        QCOMPARE(data.text, std::wstring(L"Untitled"));
        QCOMPARE(data.limitCondition, FolderPicker::FOLDER_NAME_REGEXP.toStdWString());
        f.enter(name);
        QVERIFY(!f.picker->editor());
        QCOMPARE(f.picker->editAction(), FolderPicker::FOLDER_EDIT_NONE);
        QVERIFY(QFileInfo(f.path(name)).isDir());
        QCOMPARE(f.folders().size(), 2);
        QCOMPARE(f.names(), QStringList({"news", name}));
        QCOMPARE(f.current(), name);
        QVERIFY(f.isEditable(name));
        QCOMPARE(f.buttons(), QStringLiteral("++++"));
        QCOMPARE(f.titles.take(), (Reports{{FileManagerDefine::TITLE_ADDED, name}}));
        QVERIFY(f.service->calls.contains(QStringLiteral("close")));
        QSignalSpy folder(f.picker.get(), &FolderPicker::changeFolderPath);
        f.tapButton("openFolderButton");
        QCOMPARE(folder.at(0).at(0).toString(), f.path(name));
    }

    void aNewFolderKeepsItsFirstName()
    {
        f.open();
        f.tapButton("newFolderButton");
        f.enter();
        QCOMPARE(f.folders(), QStringList{"Untitled"});
        // An empty name is replaced by the former one.
        f.tapButton("newFolderButton");
        f.enter("x");
        f.hold("x");
        QVERIFY(f.picker->editor());
        f.enter(QString());
        QCOMPARE(f.folders(), QStringList({"Untitled", "x"}));
        QVERIFY(!f.picker->editor());
    }

    void aNewFolderIsGivenUp()
    {
        f.make("news");
        f.open();
        f.tap("news");
        f.tapButton("newFolderButton");
        QCOMPARE(f.names(), QStringList({"news", "Untitled"}));
        f.escape();
        QTRY_COMPARE(f.names(), QStringList{"news"});
        QCOMPARE(f.folders(), QStringList{"news"});
        QCOMPARE(f.titles.take(), Reports());
        QVERIFY(!f.picker->editor());
        f.tapButton("newFolderButton");
        f.tapButton("cancelFolderButton");
        QTRY_COMPARE(f.names(), QStringList{"news"});
        QVERIFY(!f.picker->isVisible());
        QCOMPARE(f.folders(), QStringList{"news"});
    }

    void theDialogClosesDuringAnEdit()
    {
        f.make("news");
        f.open();
        f.tapButton("newFolderButton");
        f.picker->done(QDialog::Rejected);
        QTRY_COMPARE(f.names(), QStringList{"news"});
        f.picker->show();
        f.hold("news");
        QVERIFY(f.picker->editor());
        f.reports.take();
        f.picker->hide();
        QVERIFY(!f.picker->editor());
        QCOMPARE(f.reports.take(), QStringList{"renamed news to news"});
        QCOMPARE(f.folders(), QStringList{"news"});
    }

    void aFullDiskTakesNoNewFolder()
    {
        f.make("news", {"t1"});
        f.open();
        f.tap("news");
        qputenv("K2SYS_FS_REMAIN", "199999000");
        f.tapButton("newFolderButton");
        QCOMPARE(f.messages.take(), (Reports{{114, QStringLiteral("folder")}}));
        f.tapButton("duplicateFolderButton");
        QCOMPARE(f.messages.take(), (Reports{{115, QStringLiteral("folder")}}));
        QVERIFY(!f.picker->editor());
        QCOMPARE(f.names(), QStringList{"news"});
        // There is room for an empty folder, but not for a copy of this one.
        qputenv("K2SYS_FS_REMAIN", "200000000");
        f.tapButton("duplicateFolderButton");
        QCOMPARE(f.messages.take(), (Reports{{115, QStringLiteral("folder")}}));
        f.tapButton("newFolderButton");
        QVERIFY(f.picker->editor());
        f.escape();
        // A rename needs no room.
        qputenv("K2SYS_FS_REMAIN", "0");
        f.hold("news");
        f.enter("later");
        QCOMPARE(f.folders(), QStringList{"later"});
        QCOMPARE(f.messages.take(), Reports());
    }

    // --- Names ----------------------------------------------------------------------------------------

    void renames_data() { scripts(); }

    void renames()
    {
        QFETCH(QString, name);
        f.make("news", {"t1", "t2"});
        f.make("sports");
        f.open();
        f.hold("news");
        QVERIFY(f.picker->editor());
        QCOMPARE(f.picker->editAction(), FolderPicker::FOLDER_EDIT_RENAME);
        QCOMPARE(f.reports.take(), QStringList{"rename news"});
        QCOMPARE(f.picker->editor()->text(), QStringLiteral("news"));
        f.enter(name);
        QCOMPARE(f.reports.take(), QStringList{"renamed news to " + name});
        QVERIFY(!f.picker->editor());
        QCOMPARE(f.names(), QStringList({name, "sports"}));
        QVERIFY(QFileInfo(f.path(name)).isDir());
        QVERIFY(!QFileInfo::exists(f.path("news")));
        QCOMPARE(f.names(f.row(name)), QStringList({"t1", "t2"}));
        // The titles' pictures are found in the folder's new place.
        f.tree()->expand(f.row(name));
        f.tap(f.row("t1", f.row(name)));
        QCOMPARE(thumbnail()->pixmap().toImage().pixelColor(120, 67), QColor(Qt::red));
        QCOMPARE(f.titles.take(), Reports());
    }

    void aNameInAnotherCase()
    {
        f.make("news");
        f.open();
        f.hold("news");
        f.enter("NEWS");
        QCOMPARE(f.messages.take(), Reports());
        QCOMPARE(f.folders(), QStringList{"NEWS"});
        QCOMPARE(f.names(), QStringList{"NEWS"});
        // The name is accepted without a change.
        f.hold("NEWS");
        f.enter();
        QCOMPARE(f.folders(), QStringList{"NEWS"});
        QVERIFY(!f.picker->editor());
    }

    void blanksCount()
    {
        f.make("news");
        f.open();
        f.tapButton("newFolderButton");
        f.enter("news ");
        QCOMPARE(f.messages.take(), Reports());
        QCOMPARE(f.folders(), QStringList({"news", "news "}));
        f.tapButton("newFolderButton");
        f.enter("NEWS ");
        QCOMPARE(f.messages.take(), (Reports{{47, QStringLiteral("NEWS ")}}));
    }

    void longNames()
    {
        f.make("news");
        f.open();
        f.hold("news");
        f.limits();
        const QString twenty(20, QLatin1Char('n'));
        f.input()->sendInputStringOnTextChanged(twenty.toStdWString());
        QCOMPARE(f.limits(), QList<int>{0});
        f.input()->sendInputStringOnTextChanged((twenty + "n").toStdWString());
        QCOMPARE(f.limits(), QList<int>{4002});
        QCOMPARE(f.service->limits.size(), 0);
        // The field keeps its text, and Enter does not accept the text that was refused.
        QCOMPARE(f.picker->editor()->text(), QStringLiteral("news"));
        f.enter(twenty + "n");
        QVERIFY(f.picker->editor());
        QCOMPARE(f.folders(), QStringList{"news"});
        f.limits();
        f.enter(twenty);
        QCOMPARE(f.limits().constLast(), 0);
        QCOMPARE(f.folders(), QStringList{twenty});
    }

    void forbiddenCharacters()
    {
        f.make("news");
        f.open();
        f.hold("news");
        for (const char sign : {'\\', '/', ':', ',', ';', '*', '?', '"', '<', '>', '|', '[', ']', '=', '.'}) {
            f.limits();
            f.input()->sendInputStringOnTextChanged((QStringLiteral("a") + QLatin1Char(sign)).toStdWString());
            QCOMPARE(f.limits(), QList<int>{4001});
            f.enter(QStringLiteral("a") + QLatin1Char(sign));
            QVERIFY(f.picker->editor());
            QCOMPARE(f.picker->editor()->text(), QStringLiteral("news"));
        }
        QCOMPARE(f.folders(), QStringList{"news"});
        // The editor stays open with a refused name: the keyboard is shown again.
        f.service->calls.clear();
        f.closeKeyboard();
        QVERIFY(f.picker->editor());
        QVERIFY(f.service->calls.contains(QStringLiteral("show")));
        f.input()->sendInputStringOnTextChanged(L"a");
        f.closeKeyboard();
        QVERIFY(!f.picker->editor());
        QCOMPARE(f.folders(), QStringList{"news"});
    }

    void whatTakesNoName()
    {
        f.make("news", {"t1"});
        f.make("open");
        f.open();
        f.picker->setCurrentFolderName("OPEN");
        f.tree()->expand(f.row("news"));
        f.hold(f.row("t1", f.row("news")));
        QVERIFY(!f.picker->editor());
        f.hold(f.row("news").siblingAtColumn(1));
        QVERIFY(!f.picker->editor());
        f.hold("open");
        QVERIFY(!f.picker->editor());
        QVERIFY(!f.isEditable("open"));
        QCOMPARE(f.reports.take(), QStringList());
        // The other folder is open now.
        f.picker->setCurrentFolderName("news");
        QVERIFY(f.isEditable("open"));
        QVERIFY(!f.isEditable("news"));
        f.picker->updateTreeView();
        QVERIFY(!f.isEditable("news"));
        f.picker->setCurrentFolderName(QString());
        QVERIFY(f.isEditable("news"));
        f.hold("news");
        QVERIFY(f.picker->editor());
    }

    void aFolderThatHasVanishedTakesNoName()
    {
        f.make("news");
        f.open();
        QDir(f.root()).rmdir("news");
        f.hold("news");
        QVERIFY(!f.picker->editor());
        QCOMPARE(f.names(), QStringList());
    }

    void touchesElsewhereEndAnEdit()
    {
        f.make("news");
        f.make("sports");
        f.open();
        f.hold("news");
        f.type("2");
        f.tap("sports");
        QVERIFY(!f.picker->editor());
        QCOMPARE(f.current(), QStringLiteral("sports"));
        QCOMPARE(f.folders(), QStringList({"2", "sports"})); // the name was selected
        // A finger can be used in the editor.
        f.hold("sports");
        f.tap(f.picker->editor(), QPoint(20, 20));
        QVERIFY(f.picker->editor());
        // A button ends the edit before it acts.
        f.type("2");
        f.tapButton("newFolderButton");
        QVERIFY(f.picker->editor());
        QCOMPARE(f.picker->editAction(), FolderPicker::FOLDER_EDIT_CREATE);
        QCOMPARE(f.folders().size(), 2);
        QVERIFY(!f.folders().contains("sports"));
        QCOMPARE(f.folders().filter("2").size(), 2);
    }

    // --- A name in use --------------------------------------------------------------------------------

    void aClashOverAnOpenEditor()
    {
        f.make("news");
        f.make("sports");
        f.open();
        f.tapButton("newFolderButton");
        f.enter("NEWS");
        QCOMPARE(f.messages.take(), (Reports{{47, QStringLiteral("NEWS")}}));
        FolderEditor* editor = f.picker->editor();
        QVERIFY(editor);
        QCOMPARE(f.folders(), QStringList({"news", "sports"}));
        // While the message is shown, the tree ignores touches, and the edit does not end.
        f.tap("sports");
        QCOMPARE(f.picker->editor(), editor);
        QCOMPARE(f.current(), QStringLiteral("Untitled"));
        f.tapButton("openFolderButton");
        f.tapButton("duplicateFolderButton");
        QCOMPARE(f.picker->editor(), editor);
        QCOMPARE(f.messages.take(), Reports());
        // An answer to another message is ignored.
        MessageDefine::tagCloseParam other;
        other.messageId = MessageDef::MESSAGE_CONFIRM_CLOSE;
        Q_EMIT f.messages.signalCloseMessage(other);
        f.tap("sports");
        QCOMPARE(f.picker->editor(), editor);
        f.service->calls.clear();
        f.answerClash();
        QVERIFY(f.service->calls.contains(QStringLiteral("show")));
        QVERIFY(editor->hasFocus());
        f.enter("weather");
        QVERIFY(!f.picker->editor());
        QCOMPARE(f.folders(), QStringList({"news", "sports", "weather"}));
    }

    void aClashOnRename()
    {
        f.make("news");
        f.make("Sports");
        f.open();
        f.hold("news");
        f.enter("sportS");
        QCOMPARE(f.messages.take(), (Reports{{47, QStringLiteral("sportS")}}));
        QVERIFY(f.picker->editor());
        f.answerClash();
        f.escape();
        QVERIFY(!f.picker->editor());
        QCOMPARE(f.names(), QStringList({"news", "Sports"}));
        QCOMPARE(f.folders(), QStringList({"Sports", "news"}));
        QCOMPARE(f.reports.take(), QStringList({"rename news", "renamed news to news"}));
    }

    void theDialogClosesUnderAClash()
    {
        f.make("Untitled");
        f.open();
        f.tapButton("newFolderButton");
        f.enter();
        QCOMPARE(f.messages.take(), (Reports{{47, QStringLiteral("Untitled")}}));
        f.tapButton("cancelFolderButton");
        QVERIFY(!f.picker->isVisible());
        f.answerClash();
        f.picker->show();
        QTRY_COMPARE(f.names(), QStringList{"Untitled"});
        f.tap("Untitled");
        QCOMPARE(f.current(), QStringLiteral("Untitled"));
    }

    // --- Copies ---------------------------------------------------------------------------------------

    void duplicates_data() { scripts(); }

    void duplicates()
    {
        QFETCH(QString, name);
        f.make("a", {"t2", "t1"});
        f.make("b");
        f.open();
        f.tree()->expand(f.row("a"));
        f.tap("a");
        f.tapButton("duplicateFolderButton");
        QVERIFY(f.picker->editor());
        QCOMPARE(f.picker->editAction(), FolderPicker::FOLDER_EDIT_DUPLICATE);
        QCOMPARE(f.picker->editor()->selectedText(), QStringLiteral("a"));
        QCOMPARE(f.names(), QStringList({"a", "a", "b"}));
        f.enter(name);
        QVERIFY(!f.picker->editor());
        QCOMPARE(f.names(), QStringList({"a", name, "b"}));
        QCOMPARE(f.names(f.row(name)), QStringList({"t2", "t1"}));
        QCOMPARE(LibraryFixture::order(f.path(name)), QStringList({"t2", "t1"}));
        for (const char* file : {"/t1.xml", "/t2.xml", "/t1_240.png", "/t2_240.png"})
            QVERIFY(QFileInfo(f.path(name) + QLatin1String(file)).isFile());
        QCOMPARE(f.titles.take(), (Reports{{FileManagerDefine::TITLE_ADDED, name}}));
        QCOMPARE(LibraryFixture::order(f.path("a")), QStringList({"t2", "t1"}));
    }

    void aDuplicateNeedsAnotherName()
    {
        f.make("a", {"t1"});
        f.open();
        f.tap("a");
        f.tapButton("duplicateFolderButton");
        f.enter();
        QCOMPARE(f.messages.take(), (Reports{{47, QStringLiteral("a")}}));
        f.answerClash();
        f.enter("A");
        QCOMPARE(f.messages.take(), (Reports{{47, QStringLiteral("A")}}));
        f.answerClash();
        f.escape();
        QTRY_COMPARE(f.names(), QStringList{"a"});
        QCOMPARE(f.folders(), QStringList{"a"});
        // The folder that was copied is selected again.
        QCOMPARE(f.current(), QStringLiteral("a"));
        QCOMPARE(f.buttons(), QStringLiteral("++++"));
    }

    void aDuplicateThatTheDiskRefuses()
    {
        f.make("a", {"t1"});
        f.open();
        f.make("later", {"t9"}); // without a notice
        f.tap("a");
        f.tapButton("duplicateFolderButton");
        f.enter("later");
        // Nothing was copied; the row stays and shows what is there.
        QCOMPARE(f.names(), QStringList({"a", "later"}));
        QCOMPARE(f.names(f.row("later")), QStringList{"t9"});
        QCOMPARE(f.titles.take(), Reports());
        QVERIFY(!QFileInfo::exists(f.path("later") + "/t1.xml"));
    }

    // --- Looks ----------------------------------------------------------------------------------------

    void masks()
    {
        f.open();
        const auto masked = [this] {
            QRect area;
            for (const QWidget* child : f.picker->findChildren<QWidget*>(Qt::FindDirectChildrenOnly))
                if (child->autoFillBackground() && child->isVisible() &&
                    child->palette().color(QPalette::Window) == QColor(0, 0, 0, 166))
                    area |= child->geometry();
            return area;
        };
        f.picker->showDialogMaskWidget(true);
        QCOMPARE(masked(), QRect(7, 9, 1088 - 14, 742 - 18));
        QVERIFY(!f.picker->testAttribute(Qt::WA_AcceptTouchEvents));
        f.picker->showMessageMaskWidget(true);
        f.picker->showMessageMaskWidget(false);
        QVERIFY(!f.picker->testAttribute(Qt::WA_AcceptTouchEvents));
        f.picker->showDialogMaskWidget(false);
        QVERIFY(f.picker->testAttribute(Qt::WA_AcceptTouchEvents));
        QCOMPARE(masked(), QRect());
        f.picker->showOpacityWidget(true);
        QCOMPARE(masked(), f.picker->rect());
        f.picker->showOpacityWidget(false);
        QCOMPARE(masked(), QRect());
    }

    void liesInTheMiddleOfItsWindow()
    {
        f.open();
        QCOMPARE(f.picker->size(), QSize(1088, 742));
        QCOMPARE(f.tree()->size(), QSize(802, 570));
        for (const char* name :
             {"duplicateFolderButton", "newFolderButton", "openFolderButton", "cancelFolderButton"})
            QCOMPARE(f.button(name)->size(), QSize(160, 48));
    }

private:
    static void scripts()
    {
        QTest::addColumn<QString>("name");
        QTest::newRow("Latin") << QStringLiteral("Évening");
        QTest::newRow("Chinese") << QStringLiteral("天气预报");
        QTest::newRow("Japanese") << QStringLiteral("ニュース速報");
        QTest::newRow("Korean") << QStringLiteral("날씨 예보");
        QTest::newRow("trailing blanks") << QStringLiteral("x  ");
        QTest::newRow("20 wide characters") << QStringLiteral("天").repeated(20);
    }

    QLabel* thumbnail() const { return f.picker->findChild<QLabel*>("folderThumbnail"); }
    QLabel* sizeLabel() const { return f.picker->findChild<QLabel*>("folderFileSize"); }

    FolderPickerFixture f;
};

int main(int argc, char** argv)
{
    KSInputContext::install();
    QApplication app(argc, argv);
    app.setObjectName(QStringLiteral("Titler"));
    tst_folderpicker test;
    QTEST_SET_MAIN_SOURCE_PATH
    return QTest::qExec(&test, argc, argv);
}

#include "tst_folderpicker.moc"
