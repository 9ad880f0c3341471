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
        return m_scene->archive()
                   ? QFileInfo(QString::fromStdString(m_scene->archive()->getPath())).completeBaseName()
                   : QString();
    }
    // Creates a title as the window does when a template is chosen.
    void createTitle(const QString& text)
    {
        const auto temp = LibraryFixture::makeRecord(m_fixture.makeFolder(QStringLiteral("presets")),
                                                     QStringLiteral("p"), text);
        m_list->createArchiveFromTemplate(temp.get());
        m_scene->createThumnailPicture();
    }

    LibraryFixture m_fixture;
    std::unique_ptr<QUndoStack> m_stack;
    std::unique_ptr<QLabel> m_label;
    std::unique_ptr<CanvasScene> m_scene;
    std::unique_ptr<ArchiveList> m_list;
};

void tst_archivelist_canvas::init()
{
    m_stack = std::make_unique<QUndoStack>();
    m_label = std::make_unique<QLabel>();
    m_scene = std::make_unique<CanvasScene>(std::make_unique<ThumbnailRender>());
    m_scene->setSceneRect(0, 0, 1280, 720);
    m_list = std::make_unique<ArchiveList>(m_label.get(), false);
    m_list->setFixedSize(549, 997);
    m_list->setMainScene(m_scene.get());
    for (auto signal : {&ArchiveList::deleteCommandSignal, &ArchiveList::pasteCommandSignal,
                        &ArchiveList::focusCommandSignal})
        connect(m_list.get(), signal, m_stack.get(), &QUndoStack::push);
    connect(m_list.get(), &ArchiveList::signalUpdateCanvas, m_scene.get(), &CanvasScene::slotUpdateArchive);
    connect(m_list.get(), &ArchiveList::itemSetDefaultState, m_scene.get(),
            &CanvasScene::slotMakeSceneThumnail);
    connect(m_scene.get(), &CanvasScene::signalSaveOk, m_list.get(), &ArchiveList::refreshBaseItem);
    m_list->show();
}

void tst_archivelist_canvas::cleanup()
{
    m_stack.reset();
    m_list.reset();
    m_scene.reset();
}

void tst_archivelist_canvas::selectedTitleIsOnTheCanvas()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("select"));
    LibraryFixture::fillFolder(folder, {QStringLiteral("a"), QStringLiteral("b")});
    m_list->refreshArchiveListInFile(folder, QStringLiteral("b.xml"));
    QCOMPARE(canvasTitle(), QStringLiteral("b"));
    QTest::mouseClick(m_list->archiveItem(0), Qt::LeftButton, Qt::NoModifier, QPoint(20, 20));
    QCOMPARE(canvasTitle(), QStringLiteral("a"));
    m_stack->undo();
    QCOMPARE(canvasTitle(), QStringLiteral("b"));
    QVERIFY(m_scene->isEditFinish()); // nothing was changed, so no picture is made
}

void tst_archivelist_canvas::newTitleShowsItsPictureAtOnce()
{
    m_list->refreshArchiveList(m_fixture.makeFolder(QStringLiteral("new")));
    createTitle(QStringLiteral("速報 New"));
    QCOMPARE(m_list->count(), 1);
    const ArchiveItem* item = m_list->archiveItem(0);
    QCOMPARE(textLines(item).front(), QStringLiteral("速報 New"));
    QCOMPARE(canvasTitle(), QString::fromStdString(item->getArchiveData()->getName()));
    QVERIFY(!QFile::exists(item->getArchiveData()->getFullPathOfThumbnailSmall()));
}

void tst_archivelist_canvas::leavingANewTitleWritesItsPictures()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("leave"));
    LibraryFixture::fillFolder(folder, {QStringLiteral("a")});
    m_list->refreshArchiveList(folder);
    createTitle(QStringLiteral("Left"));
    const QString stem = canvasTitle();
    QVERIFY(stem != QStringLiteral("a"));
    m_list->selectArchive(m_list->count() - 1 - m_list->getItemIndex(m_list->getSelectedArchive()));
    QCOMPARE(canvasTitle(), QStringLiteral("a"));
    QTRY_VERIFY(m_scene->isEditFinish());
    for (const char* suffix : {"_1920.png", "_960.png", "_240.png", "_240S.png"})
        QVERIFY(!QImage(folder + QLatin1Char('/') + stem + QLatin1String(suffix)).isNull());
}

void tst_archivelist_canvas::leavingATextThatIsTypedWritesItsPictures()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("typed"));
    LibraryFixture::fillFolder(folder, {QStringLiteral("a"), QStringLiteral("b")});
    m_list->refreshArchiveList(folder);
    connect(m_scene.get(), &CanvasScene::signalPushUndoCommandIntoStack, m_stack.get(), &QUndoStack::push);
    GraphicsText* text = m_scene->findTextItem(1);
    text->setTextInteractionFlags(Qt::TextEditorInteraction);
    text->textCursor().insertText(QStringLiteral("longer than before "));
    QTest::mouseClick(m_list->archiveItem(1), Qt::LeftButton, Qt::NoModifier, QPoint(20, 20));
    QCOMPARE(canvasTitle(), QStringLiteral("b"));
    QVERIFY(!m_scene->isEditFinish());
    QTRY_VERIFY(m_scene->isEditFinish());
    const QRect ink = inkIn(QImage(folder + QStringLiteral("/a_1920.png")));
    QVERIFY(ink.width() > 200);
    // The other title was shown but not changed.
    m_list->selectArchive(0);
    QVERIFY(m_scene->isEditFinish());
    QCOMPARE(QImage(folder + QStringLiteral("/b_1920.png")).size(), QSize(240, 135)); // not written again
}

// It is decoded while the copy is held, so a file that changes in between must be noticed.
void tst_archivelist_canvas::pastedTitleHasTheBackgroundOfItsFile()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("paste"));
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
        m_scene->render(&painter, QRectF(), QRectF(0, 0, 1280, 720));
        painter.end();
        return canvas.pixelColor(1270, 710);
    };
    ArchiveAction copy(QString(), ArchiveAction::ACTION_COPY, nullptr);
    ArchiveAction pasteIt(QString(), ArchiveAction::ACTION_PASTE, nullptr);
    QVERIFY(paint(Qt::darkRed));
    m_list->refreshArchiveListInFile(folder, QStringLiteral("b.xml"));

    m_list->selectOperationArchive(0);
    m_list->selectOptionMenuItem(&copy);
    m_list->selectOptionMenuItem(&pasteIt);
    QCOMPARE(m_list->count(), 3);
    QVERIFY(canvasTitle() != QStringLiteral("a") && canvasTitle() != QStringLiteral("b"));
    QCOMPARE(colourOnCanvas(), QColor(Qt::darkRed));

    QVERIFY(paint(Qt::darkBlue));
    m_list->selectOptionMenuItem(&pasteIt);
    QCOMPARE(m_list->count(), 4);
    QCOMPARE(colourOnCanvas(), QColor(Qt::darkBlue));
}

void tst_archivelist_canvas::deletedTitleLeavesTheCanvas()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("delete"));
    m_list->refreshArchiveList(folder);
    createTitle(QStringLiteral("Gone"));
    m_stack->undo();
    QVERIFY(m_list->isEmpty());
    QVERIFY(m_scene->getTextItemList().isEmpty());
    m_list->synchronizationFolderFile();
    QVERIFY(QDir(folder).entryList({QStringLiteral("*.xml")}, QDir::Files).isEmpty());
    m_stack->redo();
    QCOMPARE(m_scene->getTextItemList().size(), 1);
}

void tst_archivelist_canvas::deletedTitleLeavesNoPictures()
{
    FakeTitleChangeReporter reporter(FakeTitleChangeReporter::Pictures::Hold);
    const QString folder = m_fixture.makeFolder(QStringLiteral("trace"));
    m_list->refreshArchiveList(folder);
    createTitle(QStringLiteral("Kept"));
    const QString kept = canvasTitle();
    createTitle(QStringLiteral("Gone"));
    QTRY_COMPARE(reporter.reached.available(), 1); // the thread is busy with the first one
    const QString gone = canvasTitle();
    QVERIFY(gone != kept);
    m_stack->undo();
    m_list->synchronizationFolderFile();
    reporter.goOn.release(1000);
    QTRY_VERIFY(m_scene->isEditFinish());
    QCOMPARE(QDir(folder).entryList({gone + QLatin1Char('*')}, QDir::Files), QStringList());
    for (const char* suffix : {".xml", "_1920.png", "_960.png", "_240.png", "_240S.png"})
        QVERIFY(QFile::exists(folder + QLatin1Char('/') + kept + QLatin1String(suffix)));
}

// Another process renames the open folder while pictures are being written; its notice arrives later.
void tst_archivelist_canvas::picturesFollowTheirFolder()
{
    const QString before = m_fixture.makeFolder(QStringLiteral("before"));
    const QString after = before + QStringLiteral(" and after");
    QDir(after).removeRecursively();
    {
        FakeTitleChangeReporter reporter(FakeTitleChangeReporter::Pictures::Hold);
        m_list->refreshArchiveList(before);
        createTitle(QStringLiteral("One"));
        m_scene->slotMakeSceneThumnail();
        // The thread is busy with it.
        QTRY_COMPARE(reporter.reached.available(), 1);
        createTitle(QStringLiteral("Two"));
        createTitle(QStringLiteral("Three"));
        m_scene->slotMakeSceneThumnail();
        QVERIFY(QDir().rename(before, after));
        reporter.goOn.release(1000);
        QTRY_VERIFY(m_scene->isEditFinish()); // the pictures for the path that does not exist any more
        createTitle(QStringLiteral("lost with the folder"));
        m_list->refreshArchiveListForChangeFolderName(before, after);
        QTRY_VERIFY(m_scene->isEditFinish());
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
    const QString folder = m_fixture.makeFolder(QStringLiteral("same"));
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
    m_scene->slotUpdateArchive(archive.get());
    QImage canvas(1280, 720, QImage::Format_ARGB32_Premultiplied);
    canvas.fill(Qt::transparent);
    QPainter painter(&canvas);
    painter.setRenderHint(QPainter::Antialiasing);
    m_scene->render(&painter, QRectF(), QRectF(0, 0, 1280, 720));
    painter.end();

    m_scene->saveArchiveFlag();
    m_scene->slotMakeSceneThumnail();
    QTRY_VERIFY(m_scene->isEditFinish());
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
