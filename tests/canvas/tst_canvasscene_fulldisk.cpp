// What becomes of an edit that the disk refuses.
#include "CanvasFixture.h"
#include "tests/support/FullDisk.h"

#include "support/RefusedWrites.h"
#include "tests/support/Patience.h"

namespace
{

using Posted = QList<QPair<int, QString>>;

} // namespace

class tst_canvasscene_fulldisk : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        MessageBoxController::setProvider([]() -> MessageBoxController* { return messages; }, [] {});
    }
    void init() { messages = new FakeMessageBoxController; }
    void cleanup()
    {
        delete messages;
        messages = nullptr;
        for (const RefusedWrites::File& file : RefusedWrites::files())
            RefusedWrites::forget(file.path);
    }
    void refusedEditIsToldOnceAndSavedWhenThereIsRoom();
    void refusedEditIsSavedWithTheNextChange();
    void refusedEditIsWhatIsReadAgain();
    void refusedEditFollowsItsFolder();

private:
    static QString onDisk(const QString& path)
    {
        QFile file(path);
        return file.open(QIODevice::ReadOnly) ? QString::fromUtf8(file.readAll()) : QString();
    }
    static void type(Canvas& canvas, const QString& text)
    {
        TText changed = *canvas.text(1)->getItemTText();
        canvas.text(1)->setTextInteractionFlags(Qt::TextEditorInteraction);
        QTextCursor cursor = canvas.text(1)->textCursor();
        cursor.movePosition(QTextCursor::End);
        cursor.insertText(text);
        canvas.scene->clearItemsSelectionAndFocus();
        canvas.scene->saveArchive();
    }
    static bool hasText(const QString& path, const QString& text)
    {
        Archive title;
        return TitleParser().readOneTitle(path.toStdString(), &title) == 1 && title.text().size() == 1 &&
               title.text().front()->getText() == text.toStdString();
    }
};

void tst_canvasscene_fulldisk::refusedEditIsToldOnceAndSavedWhenThereIsRoom()
{
    Canvas canvas;
    const QString path = canvas.folder.filePath("title.xml");
    canvas.open({makeRecord("a")});
    canvas.scene->saveArchive();
    const QString before = onDisk(path);
    QVERIFY(!before.isEmpty());
    {
        const FullDisk disk;
        type(canvas, "b");
        QTRY_COMPARE(messages->posted, (Posted{{114, "File"}}));
        type(canvas, "c");
        QCOMPARE(onDisk(path), before);
    }
    // The title is saved later without any action of the operator.
    QTRY_VERIFY(onDisk(path) != before);
    QVERIFY(hasText(path, "abc"));
    QCOMPARE(messages->posted, (Posted{{114, "File"}}));
    QVERIFY(RefusedWrites::isEmpty());
    {
        const FullDisk disk;
        type(canvas, "d");
        QTRY_COMPARE(messages->posted.size(), 2); // reported again for the next outage
    }
}

void tst_canvasscene_fulldisk::refusedEditIsSavedWithTheNextChange()
{
    Canvas canvas;
    const QString first = canvas.folder.filePath("title.xml");
    canvas.open({makeRecord("a")});
    canvas.scene->saveArchive();
    {
        const FullDisk disk;
        type(canvas, "b");
        QTRY_COMPARE(messages->posted.size(), 1);
    }
    // The same while another title is shown.
    canvas.title.setPath(canvas.folder.filePath("other.xml").toStdString());
    canvas.open({makeRecord("x")});
    type(canvas, "y");
    QVERIFY(onDisk(first).contains("text=\"ab\"") || hasText(first, "ab"));
    QVERIFY(RefusedWrites::isEmpty());
    QVERIFY(hasText(canvas.folder.filePath("other.xml"), "xy"));
    // The outage is over. The next one may begin immediately.
    QCoreApplication::processEvents();
    const FullDisk disk;
    type(canvas, "z");
    QTRY_COMPARE(messages->posted.size(), 2);
}

// The list reads a title again after each save.
void tst_canvasscene_fulldisk::refusedEditIsWhatIsReadAgain()
{
    Canvas canvas;
    const QString path = canvas.folder.filePath("title.xml");
    canvas.open({makeRecord("a")});
    canvas.scene->saveArchive();
    const FullDisk disk;
    type(canvas, "b");
    QVERIFY(!onDisk(path).contains("ab"));
    QVERIFY(hasText(path, "ab"));
    RefusedWrites::forget(path.toStdString());
    QVERIFY(hasText(path, "a"));
}

void tst_canvasscene_fulldisk::refusedEditFollowsItsFolder()
{
    Canvas canvas;
    const QString before = canvas.folder.filePath("before");
    const QString after = canvas.folder.filePath("after");
    QVERIFY(QDir().mkdir(before));
    canvas.title.setPath((before + "/title.xml").toStdString());
    canvas.open({makeRecord("a")});
    canvas.scene->saveArchive();
    {
        const FullDisk disk;
        type(canvas, "b");
        QVERIFY(QDir().rename(before, after));
        canvas.scene->folderRenamed(before, after);
    }
    QTRY_VERIFY(RefusedWrites::isEmpty());
    QVERIFY(hasText(after + "/title.xml", "ab"));
    QVERIFY(!QFileInfo::exists(before));
}

QTEST_MAIN(tst_canvasscene_fulldisk)
#include "tst_canvasscene_fulldisk.moc"
