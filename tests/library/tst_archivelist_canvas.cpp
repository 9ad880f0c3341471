// The list, the canvas and the pictures together, wired as the window wires them.
#include "ItemLooks.h"
#include "LibraryFixture.h"

#include "canvas/CanvasScene.h"
#include "canvas/GraphicsText.h"
#include "library/ArchiveAction.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/ThumbnailRender.h"
#include "tests/support/Patience.h"

#include <QLabel>
#include <QPainter>
#include <QTest>
#include <QTextCursor>
#include <QUndoStack>

class tst_archivelist_canvas : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void selectedTitleIsOnTheCanvas();
    void newTitleShowsItsPictureAtOnce();
    void leavingANewTitleWritesItsPictures();
    void leavingATextThatIsTypedWritesItsPictures();
    void pastedTitleHasTheBackgroundOfItsFile();
    void deletedTitleLeavesTheCanvas();
    void deletedTitleLeavesNoPictures();
    void picturesFollowTheirFolder();
    void picturesShowWhatTheCanvasShows();

private:
    static QRect inkIn(const QImage& image)
    {
        QRect ink;
        for (int y = 0; y < image.height(); ++y) {
            for (int x = 0; x < image.width(); ++x)
                if (qAlpha(image.pixel(x, y)) > 127)
                    ink |= QRect(x, y, 1, 1);
        }
        return ink;
    }
    QString canvasTitle() const
    {
        return mScene->archive()
                   ? QFileInfo(QString::fromStdString(mScene->archive()->getPath())).completeBaseName()
                   : QString();
    }
    // As the window does on a template's choice.
    void createTitle(const QString& text)
    {
        const auto temp = LibraryFixture::makeRecord(mFixture.makeFolder(QStringLiteral("presets")),
                                                     QStringLiteral("p"), text);
        mList->createArchiveFromTemplate(temp.get());
        mScene->createThumnailPicture();
    }

    LibraryFixture mFixture;
    std::unique_ptr<QUndoStack> mStack;
    std::unique_ptr<QLabel> mLabel;
    std::unique_ptr<CanvasScene> mScene;
    std::unique_ptr<ArchiveList> mList;
};

void tst_archivelist_canvas::init()
{
    mStack = std::make_unique<QUndoStack>();
    mLabel = std::make_unique<QLabel>();
    mScene = std::make_unique<CanvasScene>(std::make_unique<ThumbnailRender>());
    mScene->setSceneRect(0, 0, 1280, 720);
    mList = std::make_unique<ArchiveList>(mLabel.get(), false);
    mList->setFixedSize(549, 997);
    mList->setMainScene(mScene.get());
    for (auto signal : {&ArchiveList::deleteCommandSignal, &ArchiveList::pasteCommandSignal,
                        &ArchiveList::focusCommandSignal})
        connect(mList.get(), signal, mStack.get(), &QUndoStack::push);
    connect(mList.get(), &ArchiveList::signalUpdateCanvas, mScene.get(), &CanvasScene::slotUpdateArchive);
    connect(mList.get(), &ArchiveList::itemSetDefaultState, mScene.get(),
            &CanvasScene::slotMakeSceneThumnail);
    connect(mScene.get(), &CanvasScene::signalSaveOk, mList.get(), &ArchiveList::refreshBaseItem);
    mList->show();
}

void tst_archivelist_canvas::cleanup()
{
    mStack.reset();
    mList.reset();
    mScene.reset();
}

void tst_archivelist_canvas::selectedTitleIsOnTheCanvas()
{
    const QString folder = mFixture.makeFolder(QStringLiteral("select"));
    LibraryFixture::fillFolder(folder, {QStringLiteral("a"), QStringLiteral("b")});
    mList->refreshArchiveListInFile(folder, QStringLiteral("b.xml"));
    QCOMPARE(canvasTitle(), QStringLiteral("b"));
    QTest::mouseClick(mList->archiveItem(0), Qt::LeftButton, Qt::NoModifier, QPoint(20, 20));
    QCOMPARE(canvasTitle(), QStringLiteral("a"));
    mStack->undo();
    QCOMPARE(canvasTitle(), QStringLiteral("b"));
    QVERIFY(mScene->isEditFinish()); // nothing was changed, so no picture is made
}

void tst_archivelist_canvas::newTitleShowsItsPictureAtOnce()
{
    mList->refreshArchiveList(mFixture.makeFolder(QStringLiteral("new")));
    createTitle(QStringLiteral("速報 New"));
    QCOMPARE(mList->count(), 1);
    const ArchiveItem* item = mList->archiveItem(0);
    QCOMPARE(textLines(item).front(), QStringLiteral("速報 New"));
    QCOMPARE(canvasTitle(), QString::fromStdString(item->getArchiveData()->getName()));
    QVERIFY(!QFile::exists(item->getArchiveData()->getFullPathOfThumbnailSmall()));
}

void tst_archivelist_canvas::leavingANewTitleWritesItsPictures()
{
    const QString folder = mFixture.makeFolder(QStringLiteral("leave"));
    LibraryFixture::fillFolder(folder, {QStringLiteral("a")});
    mList->refreshArchiveList(folder);
    createTitle(QStringLiteral("Left"));
    const QString stem = canvasTitle();
    QVERIFY(stem != QStringLiteral("a"));
    mList->selectArchive(mList->count() - 1 - mList->getItemIndex(mList->getSelectedArchive()));
    QCOMPARE(canvasTitle(), QStringLiteral("a"));
    QTRY_VERIFY(mScene->isEditFinish());
    for (const char* suffix : {"_1920.png", "_960.png", "_240.png", "_240S.png"})
        QVERIFY(!QImage(folder + QLatin1Char('/') + stem + QLatin1String(suffix)).isNull());
}

void tst_archivelist_canvas::leavingATextThatIsTypedWritesItsPictures()
{
    const QString folder = mFixture.makeFolder(QStringLiteral("typed"));
    LibraryFixture::fillFolder(folder, {QStringLiteral("a"), QStringLiteral("b")});
    mList->refreshArchiveList(folder);
    connect(mScene.get(), &CanvasScene::signalPushUndoCommandIntoStack, mStack.get(), &QUndoStack::push);
    GraphicsText* text = mScene->findTextItem(1);
    text->setTextInteractionFlags(Qt::TextEditorInteraction);
    text->textCursor().insertText(QStringLiteral("longer than before "));
    QTest::mouseClick(mList->archiveItem(1), Qt::LeftButton, Qt::NoModifier, QPoint(20, 20));
    QCOMPARE(canvasTitle(), QStringLiteral("b"));
    QVERIFY(!mScene->isEditFinish());
    QTRY_VERIFY(mScene->isEditFinish());
    const QRect ink = inkIn(QImage(folder + QStringLiteral("/a_1920.png")));
    QVERIFY(ink.width() > 200);
    // The other was only looked at.
    mList->selectArchive(0);
    QVERIFY(mScene->isEditFinish());
    QCOMPARE(QImage(folder + QStringLiteral("/b_1920.png")).size(), QSize(240, 135)); // as it was
}

// It is decoded while the copy is held, so a file that changes in between must be noticed.
void tst_archivelist_canvas::pastedTitleHasTheBackgroundOfItsFile()
{
    const QString folder = mFixture.makeFolder(QStringLiteral("paste"));
    LibraryFixture::fillFolder(folder, {QStringLiteral("a"), QStringLiteral("b")});
    const auto archive = LibraryFixture::makeRecord(folder, QStringLiteral("a"), QStringLiteral("A"));
    archive->setBgResource("a_source_1280.png");
    archive->setBgResourceBig("a_source_1920.png");
    QVERIFY(ArchiveController().saveNewArchive(folder, archive.get()));
    const auto paint = [&folder](const QColor& colour) {
        QImage image(1280, 720, QImage::Format_RGB32);
        image.fill(colour);
        return image.save(folder + QStringLiteral("/a_source_1280.png")) &&
               image.save(folder + QStringLiteral("/a_source_1920.png"));
    };
    const auto colourOnCanvas = [this] {
        QImage canvas(1280, 720, QImage::Format_RGB32);
        QPainter painter(&canvas);
        mScene->render(&painter, QRectF(), QRectF(0, 0, 1280, 720));
        painter.end();
        return canvas.pixelColor(1270, 710);
    };
    ArchiveAction copy(QString(), ArchiveAction::ACTION_COPY, nullptr);
    ArchiveAction pasteIt(QString(), ArchiveAction::ACTION_PASTE, nullptr);
    QVERIFY(paint(Qt::darkRed));
    mList->refreshArchiveListInFile(folder, QStringLiteral("b.xml"));

    mList->selectOperationArchive(0);
    mList->selectOptionMenuItem(&copy);
    mList->selectOptionMenuItem(&pasteIt);
    QCOMPARE(mList->count(), 3);
    QVERIFY(canvasTitle() != QStringLiteral("a") && canvasTitle() != QStringLiteral("b"));
    QCOMPARE(colourOnCanvas(), QColor(Qt::darkRed));

    QVERIFY(paint(Qt::darkBlue));
    mList->selectOptionMenuItem(&pasteIt);
    QCOMPARE(mList->count(), 4);
    QCOMPARE(colourOnCanvas(), QColor(Qt::darkBlue));
}

void tst_archivelist_canvas::deletedTitleLeavesTheCanvas()
{
    const QString folder = mFixture.makeFolder(QStringLiteral("delete"));
    mList->refreshArchiveList(folder);
    createTitle(QStringLiteral("Gone"));
    mStack->undo();
    QVERIFY(mList->isEmpty());
    QVERIFY(mScene->getTextItemList().isEmpty());
    mList->synchronizationFolderFile();
    QVERIFY(QDir(folder).entryList({QStringLiteral("*.xml")}, QDir::Files).isEmpty());
    mStack->redo();
    QCOMPARE(mScene->getTextItemList().size(), 1);
}

void tst_archivelist_canvas::deletedTitleLeavesNoPictures()
{
    FakeTitleChangeReporter reporter(FakeTitleChangeReporter::Pictures::Hold);
    const QString folder = mFixture.makeFolder(QStringLiteral("trace"));
    mList->refreshArchiveList(folder);
    createTitle(QStringLiteral("Kept"));
    const QString kept = canvasTitle();
    createTitle(QStringLiteral("Gone"));
    QTRY_COMPARE(reporter.reached.available(), 1); // the thread is busy with the first one
    const QString gone = canvasTitle();
    QVERIFY(gone != kept);
    mStack->undo();
    mList->synchronizationFolderFile();
    reporter.goOn.release(1000);
    QTRY_VERIFY(mScene->isEditFinish());
    QCOMPARE(QDir(folder).entryList({gone + QLatin1Char('*')}, QDir::Files), QStringList());
    for (const char* suffix : {".xml", "_1920.png", "_960.png", "_240.png", "_240S.png"})
        QVERIFY(QFile::exists(folder + QLatin1Char('/') + kept + QLatin1String(suffix)));
}

// Another process gives the open folder a new name while pictures are on their way; its notice comes later.
void tst_archivelist_canvas::picturesFollowTheirFolder()
{
    const QString before = mFixture.makeFolder(QStringLiteral("before"));
    const QString after = before + QStringLiteral(" and after");
    QDir(after).removeRecursively();
    {
        FakeTitleChangeReporter reporter(FakeTitleChangeReporter::Pictures::Hold);
        mList->refreshArchiveList(before);
        createTitle(QStringLiteral("One"));
        mScene->slotMakeSceneThumnail();
        // The thread is busy with it.
        QTRY_COMPARE(reporter.reached.available(), 1);
        createTitle(QStringLiteral("Two"));
        createTitle(QStringLiteral("Three"));
        mScene->slotMakeSceneThumnail();
        QVERIFY(QDir().rename(before, after));
        reporter.goOn.release(1000);
        QTRY_VERIFY(mScene->isEditFinish()); // those that went into the void
        createTitle(QStringLiteral("lost with the folder"));
        mList->refreshArchiveListForChangeFolderName(before, after);
        QTRY_VERIFY(mScene->isEditFinish());
    }
    QVERIFY(!QFileInfo::exists(before));
    const QStringList titles = QDir(after).entryList({QStringLiteral("*.xml")}, QDir::Files);
    QCOMPARE(titles.size(), 3);
    for (const QString& title : titles) {
        for (const char* suffix : {"_1920.png", "_960.png", "_240.png", "_240S.png"}) {
            const QString picture = after + QLatin1Char('/') + title.chopped(4) + QLatin1String(suffix);
            QTRY_VERIFY2(!QImage(picture).isNull(), qPrintable(picture));
        }
    }
}

void tst_archivelist_canvas::picturesShowWhatTheCanvasShows()
{
    const QString folder = mFixture.makeFolder(QStringLiteral("same"));
    const auto archive = LibraryFixture::makeRecord(folder, QStringLiteral("t"), QString());
    std::vector<TText*> texts;
    for (const int align : {-1, 0, 1}) {
        TText* text =
            LibraryFixture::makeText(align == 0 ? QStringLiteral("two\nlines") : QStringLiteral("Words"),
                                     align + 2, 200, 150.0F * static_cast<float>(align + 2));
        text->setTextAlign(align);
        for (TextStyle* style : text->textItems())
            style->setIsTextEdge(align == 0);
        texts.push_back(text);
    }
    archive->setText(texts);
    QVERIFY(ArchiveController().saveNewArchive(folder, archive.get()));
    mScene->slotUpdateArchive(archive.get());
    QImage canvas(1280, 720, QImage::Format_ARGB32_Premultiplied);
    canvas.fill(Qt::transparent);
    QPainter painter(&canvas);
    painter.setRenderHint(QPainter::Antialiasing);
    mScene->render(&painter, QRectF(), QRectF(0, 0, 1280, 720));
    painter.end();

    mScene->saveArchiveFlag();
    mScene->slotMakeSceneThumnail();
    QTRY_VERIFY(mScene->isEditFinish());
    const QRect onCanvas = inkIn(canvas);
    const QRect onAir = inkIn(QImage(folder + QStringLiteral("/t_1920.png")));
    QVERIFY(!onCanvas.isEmpty());
    // Both rasters round glyph places on their own.
    QVERIFY(qAbs(onAir.left() - onCanvas.left() * 1.5) <= 4);
    QVERIFY(qAbs(onAir.top() - onCanvas.top() * 1.5) <= 4);
    QVERIFY(qAbs(onAir.right() - onCanvas.right() * 1.5) <= 8);
    QVERIFY(qAbs(onAir.bottom() - onCanvas.bottom() * 1.5) <= 6);
}

QTEST_MAIN(tst_archivelist_canvas)
#include "tst_archivelist_canvas.moc"
