// What the canvas writes to the title's file when objects are blank, or gone.
#include "CanvasFixture.h"

#include "document/TitleParser.h"

#include <QDateTime>
#include <QFile>
#include <QFileInfo>
#include <QImage>
#include <QXmlStreamReader>

class tst_canvasscene_saving : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
    void blankObjectIsNotSaved_data();
    void blankObjectIsNotSaved();
    void leavingTheTitleTakesBlanksAway();
    void deletedLastObjectIsSaved();
    void newObjectThatWasUndoneIsSaved();
    void titleThatNeverHadObjectsIsLeftAlone();
    void nextTitleDoesNotEmptyThePreviousOne();
    void picturesOlderThanTheTitleAreMadeAgain();

private:
    // The texts of all objects in the file, also of those that a reader would skip.
    static QStringList textsInFile(const Canvas& canvas);
};

void tst_canvasscene_saving::initTestCase()
{
    qRegisterMetaType<TText*>("TText*");
}

void tst_canvasscene_saving::init()
{
    messages = new FakeMessageBoxController;
    InputLanguageFonts::resetLastFonts();
    InputLanguageFonts::mInputLanguage = 2;
    InputLanguageFonts::IS_CN_MODULE = false;
}

void tst_canvasscene_saving::cleanup()
{
    delete messages;
    messages = nullptr;
}

void tst_canvasscene_saving::picturesOlderThanTheTitleAreMadeAgain()
{
    Canvas canvas;
    const QStringList names{"t_1920.png", "t_960.png", "t_240.png", "t_240S.png"};
    canvas.title.setThumbnailBig(names.at(0).toStdString());
    canvas.title.setThumbnailMiddle(names.at(1).toStdString());
    canvas.title.setThumbnailSmall(names.at(2).toStdString());
    canvas.title.setThumbnailBlack(names.at(3).toStdString());
    QVERIFY(TitleParser().writeOneTitle(&canvas.title) == 1);
    const QDateTime written = QFileInfo(QString::fromStdString(canvas.title.getPath())).lastModified();
    for (const QString& name : names)
        QVERIFY(QImage(4, 4, QImage::Format_RGB32).save(canvas.folder.filePath(name)));
    canvas.open({makeRecord("a")});
    QCOMPARE(canvas.log.slow, 0);
    for (const QString& name : names) {
        QFile picture(canvas.folder.filePath(name));
        QVERIFY(picture.open(QIODevice::ReadWrite));
        QVERIFY(picture.setFileTime(written.addSecs(-1), QFile::FileModificationTime));
        canvas.log.slow = 0;
        canvas.open({makeRecord("a")});
        QCOMPARE(canvas.log.slow, 1);
        QVERIFY(picture.setFileTime(written.addSecs(1), QFile::FileModificationTime));
    }
}

QStringList tst_canvasscene_saving::textsInFile(const Canvas& canvas)
{
    QFile file(QString::fromStdString(canvas.title.getPath()));
    if (!file.open(QIODevice::ReadOnly))
        return {QStringLiteral("no file")};
    QStringList texts;
    QXmlStreamReader reader(&file);
    while (!reader.atEnd())
        if (reader.readNext() == QXmlStreamReader::StartElement && reader.name() == QLatin1String("content"))
            texts.append(reader.attributes().value(QLatin1String("text")).toString());
    return reader.hasError() ? QStringList{reader.errorString()} : texts;
}

void tst_canvasscene_saving::blankObjectIsNotSaved_data()
{
    QTest::addColumn<QString>("typed");
    QTest::newRow("nothing typed") << QString();
    QTest::newRow("spaces") << QStringLiteral("  ");
    QTest::newRow("lines") << QStringLiteral("\n \n");
    QTest::newRow("wide spaces") << QString::fromUtf8("\u3000\u3000");
}

void tst_canvasscene_saving::blankObjectIsNotSaved()
{
    QFETCH(QString, typed);
    Canvas canvas;
    canvas.show();
    canvas.open({makeRecord("kept")});
    canvas.scene->slotInsertNewTextItem();
    QCOMPARE(textsInFile(canvas), QStringList{"kept"});
    typeText(*canvas.text(2), typed);
    canvas.text(2)->pushLastEditTextIntoStack();
    QCOMPARE(textsInFile(canvas), QStringList{"kept"});
    // What a tap beside it takes away, undo brings back.
    canvas.tap(EmptyPlace);
    canvas.scene->slotDeleteEmptyItems(); // as the window does it when a finger is lifted
    QCOMPARE(canvas.text(2), nullptr);
    canvas.stack.undo();
    QVERIFY(canvas.text(2));
    QCOMPARE(textsInFile(canvas), QStringList{"kept"});
    // The object is saved as soon as it has visible characters.
    canvas.text(2)->initNewTextSelectAll();
    typeText(*canvas.text(2), QStringLiteral("x"));
    canvas.text(2)->pushLastEditTextIntoStack();
    QCOMPARE(textsInFile(canvas).size(), 2);
    QVERIFY(textsInFile(canvas).constLast().contains(QLatin1Char('x')));
    // Everything that was typed is taken back.
    canvas.scene->clearItemsSelectionAndFocus();
    while (canvas.stack.canUndo() && !canvas.text(2)->isBlank())
        canvas.stack.undo();
    QVERIFY(canvas.text(2) && canvas.text(2)->isBlank());
    QCOMPARE(textsInFile(canvas), QStringList{"kept"});
}

void tst_canvasscene_saving::leavingTheTitleTakesBlanksAway()
{
    Canvas canvas;
    canvas.show();
    canvas.open({makeRecord("kept")});
    // Neither a blank object that is neither edited nor selected, nor one under a finger, is saved.
    canvas.scene->slotInsertNewTextItem();
    canvas.scene->clearItemsSelectionAndFocus();
    canvas.scene->slotSetCurrentMousePressedObjectId(2);
    QVERIFY(canvas.text(2));
    canvas.scene->leaveTitle();
    QCOMPARE(canvas.text(2), nullptr);
    QVERIFY(canvas.text(1));
    QVERIFY(!canvas.scene->itemIsEditorInteraction() && !canvas.scene->itemIsSelectionMode());
    QCOMPARE(textsInFile(canvas), QStringList{"kept"});
    QCOMPARE(canvas.log.slow, 1);
    // A blank object does not count among the four objects, either.
    canvas.open({makeRecord("1", 1), makeRecord("2", 2), makeRecord("3", 3)});
    canvas.scene->slotInsertNewTextItem();
    canvas.scene->clearItemsSelectionAndFocus();
    QVERIFY(canvas.text(4));
    canvas.scene->slotInsertNewTextItem();
    QVERIFY(messages->posted.isEmpty());
    QVERIFY(canvas.text(4) && canvas.text(4)->getFocusFlag() == TextObjectConstants::FocusEdit);
}

void tst_canvasscene_saving::deletedLastObjectIsSaved()
{
    Canvas canvas;
    canvas.show();
    canvas.open({makeRecord("only")});
    canvas.tap(canvas.pointOn(1));
    canvas.scene->deleteSelectedItems();
    QVERIFY(canvas.scene->getTextItemList().isEmpty());
    QCOMPARE(textsInFile(canvas), QStringList());
    QCOMPARE(canvas.log.fast, 1);
    canvas.scene->leaveTitle();
    QCOMPARE(canvas.log.slow, 1);
    canvas.stack.undo();
    QCOMPARE(textsInFile(canvas), QStringList{"only"});
    canvas.stack.redo();
    QCOMPARE(textsInFile(canvas), QStringList());
    QVERIFY(canvas.saved());
}

void tst_canvasscene_saving::newObjectThatWasUndoneIsSaved()
{
    Canvas canvas;
    canvas.show();
    canvas.open({});
    canvas.scene->slotInsertNewTextItem();
    typeText(*canvas.text(1), QStringLiteral("abc"));
    canvas.scene->clearItemsSelectionAndFocus();
    QCOMPARE(textsInFile(canvas), QStringList{"abc"});
    while (canvas.stack.canUndo())
        canvas.stack.undo();
    QCOMPARE(canvas.text(1), nullptr);
    QCOMPARE(textsInFile(canvas), QStringList());
}

void tst_canvasscene_saving::titleThatNeverHadObjectsIsLeftAlone()
{
    Canvas canvas;
    canvas.open({});
    canvas.scene->saveArchive();
    canvas.scene->leaveTitle();
    QCOMPARE(textsInFile(canvas), QStringList{"no file"});
    QCOMPARE(canvas.log.fast + canvas.log.slow, 0);
}

void tst_canvasscene_saving::nextTitleDoesNotEmptyThePreviousOne()
{
    Canvas canvas;
    canvas.open({makeRecord("first")});
    canvas.scene->saveArchive();
    canvas.tap(canvas.pointOn(1));
    Archive next;
    next.setPath((canvas.folder.path() + "/next.xml").toStdString());
    canvas.scene->slotUpdateArchive(&next);
    canvas.scene->saveArchive();
    canvas.scene->slotUpdateArchive(nullptr);
    canvas.scene->saveArchive();
    canvas.open({makeRecord("first")});
    canvas.scene->clearCanvas();
    canvas.scene->saveArchive();
    QCOMPARE(textsInFile(canvas), QStringList{"first"});
    QVERIFY(!QFile::exists(canvas.folder.path() + "/next.xml"));
}

QTEST_MAIN(tst_canvasscene_saving)
#include "tst_canvasscene_saving.moc"
