#include "CanvasFixture.h"

#include "canvas/StyleDispatch.h"

// The canvas: titles, objects, style changes, undo, touch and keyboard.
class tst_canvasscene : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();

    void showsATitle();
    void nullTitleEmptiesTheCanvas();
    void titleWithoutTexts();
    void missingFontWhileHidden();
    void missingFontWhileVisible();
    void missingFontWithoutMessages();

    void newText();
    void newObjectsCascade();
    void lowestIdIsReused();
    void fifthObjectIsRefused();
    void newObjectTakesThePanelsStyle();
    void languageChangeChoosesTheFamily();
    void chinaModel();

    void modeTable_data();
    void modeTable();
    void styleOfSelectedObject();
    void styleOfSelectedCharacters();
    void styleForNextCharacter();
    void styleWithoutActiveObject();

    void createTypeUndoRedo();
    void undoOfEditLeavesObjectSelected();
    void deleteAndUndo();
    void moveAndUndo();
    void undoWithoutObject();
    void stepsOfAnotherTitleChangeNothing();
    void anUndoneDeletionReplacesTheTextOfTheFile();
    void undoneObjectLeavesNoStep();

    void deleteSelectedLeavesEmptyOnes();
    void savesAtOnce();
    void picturesFollowTheTitle();
    void missingPictureIsMadeAgain();
    void withoutRender();
    void backgroundBrush();
    void safeArea();
    void generateThumbnail();
    void switchingTitlesFinishesEditing();
};

void tst_canvasscene::initTestCase()
{
    qRegisterMetaType<TText*>("TText*");
}

void tst_canvasscene::init()
{
    messages = new FakeMessageBoxController;
    InputLanguageFonts::resetLastFonts();
    InputLanguageFonts::mInputLanguage = 2;
    InputLanguageFonts::IS_CN_MODULE = false;
}

void tst_canvasscene::cleanup()
{
    delete messages;
    messages = nullptr;
    ICanvasHost::setInstance(nullptr);
}

void tst_canvasscene::showsATitle()
{
    Canvas canvas;
    QImage background(1280, 720, QImage::Format_RGB32);
    background.fill(Qt::blue);
    const QString path = canvas.folder.path() + "/bg.png";
    QVERIFY(background.save(path));
    canvas.title.setBgResource("bg.png");
    canvas.title.setBgPointX(3.0F);
    canvas.title.setBgPointZ(-2.0F);
    QSignalSpy button(canvas.scene.get(), &CanvasScene::signalDisableNewTextButton);
    TText second = makeRecord("two", 2);
    second.setZValue(7.0F);
    canvas.open({makeRecord("one", 1), second});

    QCOMPARE(button.last(), QVariantList({false}));
    QCOMPARE(canvas.scene->getTextItemList().size(), 2);
    QCOMPARE(canvas.text(1)->toPlainText(), QStringLiteral("one"));
    QCOMPARE(canvas.text(2)->zValue(), 7.0);
    QCOMPARE(canvas.text(2)->parentTextItem()->zValue(), 7.0);
    QCOMPARE(canvas.text(1)->parentTextItem()->pos(), QPointF(300.0, 200.0));
    QCOMPARE(canvas.text(1)->pos(), QPointF());
    int pictures = 0;
    const auto items = canvas.scene->items();
    for (QGraphicsItem* item : items) {
        if (item->type() != 65556)
            continue;
        ++pictures;
        QCOMPARE(item->pos(), QPointF(3.0, 0.0));
        QCOMPARE(item->zValue(), -2.0);
        QCOMPARE(static_cast<GraphicsPixmap*>(item)->getPixmapPath(), path);
        QVERIFY(!(item->flags() & QGraphicsItem::ItemIsMovable));
    }
    QCOMPARE(pictures, 1);
    // The canvas holds a copy.
    canvas.title.releaseVectorText();
    QCOMPARE(canvas.scene->archive()->getText().size(), size_t(2));
    QCOMPARE(canvas.text(1)->toPlainText(), QStringLiteral("one"));
}

void tst_canvasscene::nullTitleEmptiesTheCanvas()
{
    Canvas canvas;
    canvas.open({makeRecord("one")});
    canvas.scene->slotDrawSafeArea(true);
    canvas.scene->saveArchive();
    QSignalSpy button(canvas.scene.get(), &CanvasScene::signalDisableNewTextButton);
    canvas.scene->slotUpdateArchive(nullptr);
    QCOMPARE(button.last(), QVariantList({true}));
    QCOMPARE(canvas.scene->getTextItemList().size(), 0);
    QCOMPARE(canvas.scene->items().size(), 4);
    // The previous title does not change.
    canvas.scene->saveArchive();
    QCOMPARE(canvas.saved()->getText().size(), size_t(1));
}

void tst_canvasscene::titleWithoutTexts()
{
    Canvas canvas;
    canvas.open({});
    QCOMPARE(canvas.scene->items().size(), 0);
    QVERIFY(!canvas.scene->itemIsEditorInteraction());
    QVERIFY(!canvas.scene->itemIsSelectionMode());
    canvas.scene->saveArchive();
    QVERIFY(!QFileInfo::exists(QString::fromStdString(canvas.title.getPath())));
}

void tst_canvasscene::missingFontWhileHidden()
{
    Canvas canvas;
    FakeCanvasHost host;
    ICanvasHost::setInstance(&host);
    QSignalSpy later(canvas.scene.get(), &CanvasScene::signalHasMessageToShowInformation);
    canvas.open({makeRecord("one", 1, "No Such Family")});
    QCOMPARE(later.count(), 1);
    QCOMPARE(later.at(0), QVariantList({true, QStringLiteral("No Such Family")}));
    QVERIFY(messages->posted.isEmpty());
    QVERIFY(!QFileInfo::exists(QString::fromStdString(canvas.title.getPath())));
}

void tst_canvasscene::missingFontWhileVisible()
{
    Canvas canvas;
    FakeCanvasHost host;
    host.visible = true;
    ICanvasHost::setInstance(&host);
    QSignalSpy later(canvas.scene.get(), &CanvasScene::signalHasMessageToShowInformation);
    canvas.open({makeRecord("one", 1, "No Such Family")});
    QCOMPARE(later.count(), 0);
    QCOMPARE(messages->posted.size(), 1);
    QCOMPARE(messages->posted.at(0).first, 109);
    QCOMPARE(messages->posted.at(0).second, QStringLiteral("No Such Family"));
    // The substitute family is saved.
    const auto saved = canvas.saved();
    QVERIFY(saved);
    QCOMPARE(saved->getText()[0]->getTextItems()[0]->getFontFamily(), std::string("KST"));
    canvas.scene->slotMakeSceneThumnail();
    QCOMPARE(canvas.log.slow, 1);
}

void tst_canvasscene::missingFontWithoutMessages()
{
    delete messages;
    messages = nullptr;
    Canvas canvas;
    FakeCanvasHost host;
    host.visible = true;
    ICanvasHost::setInstance(&host);
    canvas.open({makeRecord("one", 1, "No Such Family")});
    QVERIFY(canvas.saved());
}

void tst_canvasscene::newText()
{
    Canvas canvas;
    canvas.open({});
    QSignalSpy begin(canvas.scene.get(), &CanvasScene::signalBeginNewTextItem);
    QSignalSpy inserted(canvas.scene.get(), &CanvasScene::signalTextInserted);
    QSignalSpy start(canvas.scene.get(), &CanvasScene::signalStartEditTextItem);
    QSignalSpy modes(canvas.scene.get(), &CanvasScene::signalSceneNotifyTextPropertyAreaObjectSelectionMode);
    canvas.scene->slotInsertNewTextItem();
    QCOMPARE(begin.count(), 1);
    QCOMPARE(inserted.count(), 1);
    QCOMPARE(start.count(), 1);
    QCOMPARE(modes.last(), QVariantList({false, false}));
    QCOMPARE(canvas.stack.count(), 1);
    GraphicsText* item = canvas.text(1);
    QVERIFY(item);
    QCOMPARE(item->getFocusFlag(), 0);
    QCOMPARE(item->textInteractionFlags(), Qt::TextEditorInteraction);
    QCOMPARE(item->getStatusId(), 2);
    QVERIFY(canvas.scene->itemIsEditorInteraction());
    const QRectF area = item->parentTextItem()->layoutRect();
    const QPointF center = canvas.scene->sceneRect().center();
    QCOMPARE(item->scenePos(), center - QPointF(area.width() / 2.0, area.height() / 2.0));
    QCOMPARE(item->getItemTText()->getXValue(), float(item->scenePos().x()));
    QCOMPARE(item->getItemTText()->getZValue(), 1.0F);
    QVERIFY(canvas.saved());
}

void tst_canvasscene::newObjectsCascade()
{
    Canvas canvas;
    canvas.open({});
    canvas.scene->slotDrawSafeArea(true);
    canvas.scene->slotInsertNewTextItem();
    typeText(*canvas.text(1), "ab");
    const QPointF first = canvas.scene->sceneRect().center();
    canvas.scene->slotInsertNewTextItem();
    GraphicsText* second = canvas.text(2);
    QVERIFY(second);
    const QRectF area = second->parentTextItem()->layoutRect();
    const QPointF offset = second->scenePos() + QPointF(area.width() / 2.0, area.height() / 2.0) - first;
    QVERIFY(offset.x() > 0.0);
    QCOMPARE(offset.x(), -offset.y());
    QCOMPARE(std::fmod(offset.x(), 20.0), 0.0);
    QCOMPARE(second->getItemTText()->getZValue(), 2.0F);
    // The lines of the safe area lie above all texts.
    const auto items = canvas.scene->items();
    for (QGraphicsItem* item : items)
        if (item->type() == QGraphicsRectItem::Type)
            QCOMPARE(item->zValue(), 6.0);
}

void tst_canvasscene::lowestIdIsReused()
{
    Canvas canvas;
    canvas.open({makeRecord("1", 1), makeRecord("2", 2), makeRecord("3", 3), makeRecord("4", 4)});
    canvas.text(2)->changeItemToSolidLineState();
    canvas.scene->deleteSelectedItems();
    QCOMPARE(canvas.text(2), nullptr);
    QCOMPARE(canvas.scene->getTextItemList().size(), 3);
    canvas.scene->slotInsertNewTextItem();
    QVERIFY(canvas.text(2));
    QCOMPARE(canvas.text(2)->toPlainText(), QString());
}

void tst_canvasscene::fifthObjectIsRefused()
{
    Canvas canvas;
    canvas.open({makeRecord("1", 1), makeRecord("2", 2), makeRecord("3", 3), makeRecord("4", 4)});
    QSignalSpy failed(canvas.scene.get(), &CanvasScene::signalNewTextInsertedFailed);
    QSignalSpy inserted(canvas.scene.get(), &CanvasScene::signalTextInserted);
    canvas.scene->slotInsertNewTextItem();
    QCOMPARE(failed.count(), 1);
    QCOMPARE(inserted.count(), 1);
    QCOMPARE(messages->posted.size(), 1);
    QCOMPARE(messages->posted.at(0).first, 110);
    QCOMPARE(canvas.scene->getTextItemList().size(), 4);
    QCOMPARE(canvas.stack.count(), 0);
    QCOMPARE(canvas.scene->initCGraphicsTextItem(), -1);
}

void tst_canvasscene::newObjectTakesThePanelsStyle()
{
    Canvas canvas;
    canvas.open({});
    connect(canvas.scene.get(), &CanvasScene::signalBeginNewTextItem, canvas.scene.get(), [&canvas] {
        TText property = makeSource(makeStyle("", "DejaVu Sans", 44), 1);
        property.setTextAlign(1);
        property.setShadowStyle(1);
        property.getTextShadow()->setShadowDirectionX(4);
        canvas.scene->slotUpdateCurrentTextProperty(property);
    });
    // Styles that were sent for another object before, or only previewed on it, are not used.
    canvas.scene->slotSceneInputLanguageChanged(SystemSetupDef::emInputLanguageKorean);
    for (const int undoFlag : {1, 0}) {
        TText sent = makeSource(makeStyle("", "KST", 72), 3);
        canvas.scene->slotChangeObjectTextStyle(&sent, 1, undoFlag);
    }
    canvas.scene->slotInsertNewTextItem();
    GraphicsText* item = canvas.text(1);
    QCOMPARE(item->getItemTText()->getTextAlign(), 1);
    QCOMPARE(item->getItemTText()->getShadowStyle(), 1);
    typeText(*item, "a");
    QCOMPARE(item->getItemTText()->textItems()[0]->getFontSize(), 44);
    QCOMPARE(item->getItemTText()->textItems()[0]->getFontFamily(), std::string("DejaVu Sans"));
    QCOMPARE(item->getItemTText()->getShadowStyle(), 1);
}

void tst_canvasscene::languageChangeChoosesTheFamily()
{
    Canvas canvas;
    canvas.open({});
    canvas.scene->slotSceneInputLanguageChanged(SystemSetupDef::emInputLanguageKorean);
    canvas.scene->slotInsertNewTextItem();
    QCOMPARE(canvas.text(1)->getLastAlpaTextStyleValue()->textItems()[0]->getFontFamily(),
             std::string("YDGothic 100 Pro"));
    QCOMPARE(InputLanguageFonts::mInputLanguage, 3);
    typeText(*canvas.text(1), "a");
    QCOMPARE(canvas.text(1)->getItemTText()->textItems()[0]->getFontFamily(), std::string("KST"));
    // Only the first object after the change of language gets that family.
    canvas.scene->slotInsertNewTextItem();
    QCOMPARE(canvas.text(2)->getLastAlpaTextStyleValue()->textItems()[0]->getFontFamily(),
             std::string("KST"));

    IInputLanguageSource source;
    IInputLanguageSource::setInstance(&source);
    GraphicsText listener(nullptr, 0, nullptr, nullptr);
    Q_EMIT source.signalsInputLanguageInfo(SystemSetupDef::emInputLanguageChineseSimplified);
    QCOMPARE(InputLanguageFonts::mInputLanguage, 0);
    IInputLanguageSource::setInstance(nullptr);
}

void tst_canvasscene::chinaModel()
{
    Canvas canvas;
    canvas.scene->setModuleInfo(SystemSetupDef::emInformationModelChina);
    QVERIFY(InputLanguageFonts::IS_CN_MODULE);
    for (const auto& row : InputLanguageFonts::LAST_KEEPED_FONT)
        for (const QString& family : row)
            QCOMPARE(family, QStringLiteral("DFHeiW5-A"));
    canvas.open({});
    canvas.scene->slotInsertNewTextItem();
    QCOMPARE(canvas.text(1)->getLastAlpaTextStyleValue()->textItems()[0]->getFontFamily(),
             std::string("DFHeiW5-A"));
    // A family that is chosen in the panel is used again.
    TText sent = makeSource(makeStyle("", "DejaVu Sans"), 1);
    canvas.scene->slotChangeObjectTextStyle(&sent, 0, 1);
    canvas.scene->slotInsertNewTextItem();
    QCOMPARE(
        canvas.scene->getTextItemList().last()->getLastAlpaTextStyleValue()->textItems()[0]->getFontFamily(),
        std::string("DejaVu Sans"));
    canvas.scene->setModuleInfo(SystemSetupDef::emInformationModelDefault);
    QVERIFY(!InputLanguageFonts::IS_CN_MODULE);
    QVERIFY(InputLanguageFonts::LAST_KEEPED_FONT == InputLanguageFonts::LANGUAGE_DEFAULT_FONT);
}

void tst_canvasscene::modeTable_data()
{
    QTest::addColumn<int>("status");
    QTest::addColumn<bool>("overall");
    QTest::addColumn<bool>("same");
    QTest::addColumn<int>("mode");
    for (const bool overall : {false, true}) {
        for (const bool same : {false, true}) {
            QTest::addRow("object %d %d", overall, same) << 0 << overall << same << 0;
            QTest::addRow("selection %d %d", overall, same) << 1 << overall << same << (overall ? 2 : 3);
            QTest::addRow("none %d %d", overall, same) << -1 << overall << same << -1;
        }
    }
    QTest::newRow("caret overall") << 2 << true << true << 1;
    QTest::newRow("caret part") << 2 << false << true << 4;
    QTest::newRow("caret mixed overall") << 2 << true << false << -1;
    QTest::newRow("caret mixed part") << 2 << false << false << -1;
}

void tst_canvasscene::modeTable()
{
    QFETCH(int, status);
    QFETCH(bool, overall);
    QFETCH(bool, same);
    QFETCH(int, mode);
    QCOMPARE(StyleDispatch::getItemTextEditId(status, overall, same), mode);
}

void tst_canvasscene::styleOfSelectedObject()
{
    Canvas canvas;
    canvas.open({makeRecord("abc")});
    canvas.text(1)->changeItemToSolidLineState();
    QCOMPARE(canvas.text(1)->getStatusId(), 0);
    TText sent = makeSource(makeStyle("", "KST", 40), 3);
    canvas.scene->slotChangeObjectTextStyle(&sent, 1, 1);
    QCOMPARE(canvas.text(1)->getItemTText()->textItems()[2]->getFontSize(), 40);
    QCOMPARE(canvas.stack.count(), 1);
    QCOMPARE(canvas.text(1)->getStatusId(), 0);
    sent.setXValue(301.0F);
    sent.setYValue(201.0F);
    canvas.scene->slotChangeObjectTextStyle(&sent, 11, 1);
    QCOMPARE(canvas.text(1)->scenePos(), QPointF(301.0, 201.0));
    QCOMPARE(canvas.stack.count(), 2);
    canvas.stack.undo();
    QCOMPARE(canvas.text(1)->scenePos(), QPointF(300.0, 200.0));
    canvas.stack.undo();
    QCOMPARE(canvas.text(1)->getItemTText()->textItems()[2]->getFontSize(), 96);
    canvas.stack.redo();
    QCOMPARE(canvas.text(1)->getItemTText()->textItems()[2]->getFontSize(), 40);
}

void tst_canvasscene::styleOfSelectedCharacters()
{
    Canvas canvas;
    canvas.open({makeRecord("abc")});
    canvas.text(1)->initNewTextSelectAll();
    selectRange(*canvas.text(1), 1, 3);
    TText sent = makeSource(makeStyle("", "KST", 40), 2);
    canvas.scene->slotChangeObjectTextStyle(&sent, 1, 1);
    QCOMPARE(canvas.text(1)->getItemTText()->textItems()[0]->getFontSize(), 96);
    QCOMPARE(canvas.text(1)->getItemTText()->textItems()[1]->getFontSize(), 40);
    QCOMPARE(canvas.text(1)->textCursor().selectionStart(), 1);
    // A property of the object ends editing.
    sent.setTextAlign(1);
    canvas.scene->slotChangeObjectTextStyle(&sent, 9, 1);
    QCOMPARE(canvas.text(1)->getItemTText()->getTextAlign(), 1);
    QCOMPARE(canvas.text(1)->getStatusId(), 0);
}

void tst_canvasscene::styleForNextCharacter()
{
    Canvas canvas;
    canvas.open({makeRecord("abc")});
    GraphicsText* item = canvas.text(1);
    item->initNewTextSelectAll();
    TText sent = makeSource(makeStyle("", "KST", 40), 1);
    canvas.scene->slotChangeObjectTextStyle(&sent, 1, 1);
    QCOMPARE(canvas.stack.count(), 0);
    QCOMPARE(item->getStatusId(), 2);
    typeText(*item, "x");
    const int at = item->textCursor().position() - 1;
    QCOMPARE(item->getItemTText()->textItems()[size_t(at)]->getFontSize(), 40);
}

void tst_canvasscene::styleWithoutActiveObject()
{
    Canvas canvas;
    canvas.open({makeRecord("abc")});
    TText sent = makeSource(makeStyle("", "KST", 40), 3);
    canvas.scene->slotChangeObjectTextStyle(&sent, 1, 1);
    QCOMPARE(canvas.text(1)->getItemTText()->textItems()[0]->getFontSize(), 96);
    canvas.scene->slotChangeObjectTextStyle(nullptr, 1, 1);
    TText empty;
    canvas.scene->slotChangeObjectTextStyle(&empty, 1, 1);
    QCOMPARE(canvas.stack.count(), 0);
}

void tst_canvasscene::createTypeUndoRedo()
{
    Canvas canvas;
    canvas.open({});
    canvas.scene->slotInsertNewTextItem();
    TText style = makeSource(makeStyle("", "DejaVu Sans", 40), 1);
    typeText(*canvas.text(1), "ab");
    canvas.text(1)->saveStyleForNextInsert(&style, 1, 0);
    typeText(*canvas.text(1), "c");
    canvas.text(1)->pushLastEditTextIntoStack();
    QCOMPARE(canvas.stack.count(), 2);
    const std::unique_ptr<TText> typed(canvas.text(1)->getTextList());

    canvas.stack.undo();
    QCOMPARE(canvas.text(1)->toPlainText(), QString());
    canvas.stack.undo();
    QCOMPARE(canvas.text(1), nullptr);
    QCOMPARE(canvas.scene->getTextItemList().size(), 0);
    canvas.stack.redo();
    QVERIFY(canvas.text(1));
    QCOMPARE(canvas.text(1)->toPlainText(), QString());
    canvas.stack.redo();
    const std::unique_ptr<TText> again(canvas.text(1)->getTextList());
    QCOMPARE(again->getText(), typed->getText());
    QVERIFY(again->textItemsIsTheSame(*typed));
    QCOMPARE(again->getTextObjectID(), 1);
    canvas.stack.undo();
    canvas.stack.undo();
    QCOMPARE(canvas.text(1), nullptr);
    canvas.stack.redo();
    canvas.stack.redo();
    QVERIFY(std::unique_ptr<TText>(canvas.text(1)->getTextList())->textItemsIsTheSame(*typed));
    QCOMPARE(canvas.saved()->getText()[0]->getText(), std::string("abc"));
}

void tst_canvasscene::undoOfEditLeavesObjectSelected()
{
    Canvas canvas;
    canvas.open({makeRecord("abc")});
    canvas.text(1)->initNewTextSelectAll();
    typeTextAt(*canvas.text(1), 3, "d");
    canvas.text(1)->pushLastEditTextIntoStack();
    canvas.stack.undo();
    QCOMPARE(canvas.text(1)->toPlainText(), QStringLiteral("abc"));
    QCOMPARE(canvas.text(1)->getStatusId(), 0);
    QCOMPARE(canvas.text(1)->textInteractionFlags(), Qt::NoTextInteraction);
    QCOMPARE(canvas.stack.command(0)->text(), QStringLiteral("edit undo"));
    canvas.stack.redo();
    QCOMPARE(canvas.text(1)->toPlainText(), QStringLiteral("abcd"));
    QCOMPARE(canvas.stack.command(0)->text(), QStringLiteral("edit redo"));
}

void tst_canvasscene::deleteAndUndo()
{
    Canvas canvas;
    canvas.open({makeRecord("abc"), makeRecord("other", 2)});
    TText last = makeSource(makeStyle("", "KST", 31), 1);
    canvas.text(1)->setLastAlpaTextStyleValue(last);
    canvas.text(1)->changeItemToSolidLineState();
    GraphicsText* gone = canvas.text(1);
    canvas.scene->deleteSelectedItems();
    QCOMPARE(canvas.text(1), nullptr);
    QVERIFY(!gone->isEnabled());
    QVERIFY(!gone->isVisible());
    QVERIFY(!canvas.scene->enableItems().contains(gone));
    QCOMPARE(canvas.saved()->getText().size(), size_t(1));
    canvas.stack.undo();
    QVERIFY(canvas.text(1));
    QVERIFY(canvas.text(1) != gone);
    QCOMPARE(canvas.text(1)->toPlainText(), QStringLiteral("abc"));
    QCOMPARE(canvas.text(1)->getLastAlpaTextStyleValue()->textItems()[0]->getFontSize(), 31);
    QCOMPARE(canvas.text(1)->getStatusId(), 0);
    QCOMPARE(canvas.saved()->getText().size(), size_t(2));
    canvas.stack.redo();
    QCOMPARE(canvas.text(1), nullptr);
    canvas.stack.undo();
    QVERIFY(canvas.text(1));
}

void tst_canvasscene::moveAndUndo()
{
    Canvas canvas;
    canvas.open({makeRecord("abc")});
    canvas.scene->slotCreateMoveUndoCommand(1, QPointF(1.0, 2.0), QPointF(1.0, 2.0 + 1e-13));
    QCOMPARE(canvas.stack.count(), 0);
    canvas.scene->slotCreateMoveUndoCommand(1, QPointF(300.0, 200.0), QPointF(10.0, 20.0));
    QCOMPARE(canvas.stack.count(), 1);
    QCOMPARE(canvas.text(1)->scenePos(), QPointF(10.0, 20.0));
    canvas.stack.undo();
    QCOMPARE(canvas.text(1)->scenePos(), QPointF(300.0, 200.0));
    QCOMPARE(canvas.text(1)->getItemTText()->getYValue(), 200.0F);
    QCOMPARE(canvas.saved()->getText()[0]->getXValue(), 300.0F);
    canvas.stack.redo();
    QCOMPARE(canvas.saved()->getText()[0]->getXValue(), 10.0F);
}

void tst_canvasscene::stepsOfAnotherTitleChangeNothing()
{
    Canvas canvas;
    canvas.open({makeRecord("abc")});
    canvas.scene->slotCreateMoveUndoCommand(1, QPointF(0, 0), QPointF(50, 60));
    canvas.text(1)->changeItemToSolidLineState();
    canvas.scene->deleteSelectedItems();
    canvas.stack.undo();
    canvas.stack.undo();
    Archive other;
    other.setPath((canvas.folder.path() + "/other.xml").toStdString());
    other.setText({new TText(makeRecord("xyz"))});
    canvas.scene->slotUpdateArchive(&other);
    const QPointF place = canvas.text(1)->scenePos();
    canvas.stack.redo();
    canvas.stack.redo();
    QVERIFY(canvas.text(1));
    QCOMPARE(canvas.text(1)->toPlainText(), QString("xyz"));
    QCOMPARE(canvas.text(1)->scenePos(), place);
    canvas.stack.undo();
    QCOMPARE(canvas.scene->getTextItemList().size(), 1);
}

// An emptied canvas is not saved, so the file still has the text when the title is shown again.
void tst_canvasscene::anUndoneDeletionReplacesTheTextOfTheFile()
{
    Canvas canvas;
    canvas.open({makeRecord("abc")});
    canvas.text(1)->changeItemToSolidLineState();
    canvas.scene->deleteSelectedItems();
    QCOMPARE(canvas.scene->getTextItemList().size(), 0);
    canvas.scene->slotUpdateArchive(&canvas.title);
    QCOMPARE(canvas.scene->getTextItemList().size(), 1);
    canvas.stack.undo();
    QCOMPARE(canvas.scene->getTextItemList().size(), 1);
    QCOMPARE(canvas.text(1)->toPlainText(), QString("abc"));
}

void tst_canvasscene::undoWithoutObject()
{
    Canvas canvas;
    canvas.open({makeRecord("abc")});
    TText text = makeRecord("x", 3);
    TText last;
    canvas.scene->slotCreateEditUndoCommand(&text, &text, &last, &last);
    canvas.scene->slotCreateMoveUndoCommand(3, QPointF(), QPointF(9.0, 9.0));
    QFile::remove(QString::fromStdString(canvas.title.getPath()));
    canvas.stack.undo();
    canvas.stack.undo();
    QCOMPARE(canvas.text(1)->toPlainText(), QStringLiteral("abc"));
    QVERIFY(canvas.saved());
}

void tst_canvasscene::undoneObjectLeavesNoStep()
{
    Canvas canvas;
    canvas.open({});
    canvas.scene->slotInsertNewTextItem();
    GraphicsText* item = canvas.text(1);
    typeText(*item, "abc");
    canvas.stack.undo();
    QCOMPARE(canvas.text(1), nullptr);
    // Unfinished typing and a long press have no effect on a deleted object.
    item->pushLastEditTextIntoStack();
    item->slotLongPressed();
    QCOMPARE(canvas.stack.count(), 1);
    QVERIFY(canvas.stack.canRedo());
    QVERIFY(!item->textCursor().hasSelection());
}

void tst_canvasscene::deleteSelectedLeavesEmptyOnes()
{
    Canvas canvas;
    canvas.open({makeRecord("abc")});
    canvas.scene->slotInsertNewTextItem();
    QSignalSpy selected(canvas.scene.get(), &CanvasScene::signalSceneNotifyIfExistSelectedObject);
    canvas.scene->deleteSelectedItems();
    QVERIFY(canvas.text(1));
    QVERIFY(canvas.text(2));
    QCOMPARE(selected.last(), QVariantList({false}));
}

void tst_canvasscene::savesAtOnce()
{
    Canvas canvas;
    TText record = makeRecord(QString::fromUtf8("a😀\nb"));
    record.textItems()[0]->setFontSize(41);
    canvas.title.setBgPointZ(-1.0F);
    canvas.title.setVersion("1");
    canvas.open({record, makeRecord("two", 2)});
    canvas.text(1)->parentTextItem()->setPos(12.5, 13.5);
    canvas.scene->slotSaveArchive(canvas.text(1));
    const auto saved = canvas.saved();
    QVERIFY(saved);
    const TText& first = *saved->getText()[0];
    QCOMPARE(first.getTextObjectID(), 1);
    QCOMPARE(first.getText(), std::string("a😀\nb"));
    QCOMPARE(first.getXValue(), 12.5F);
    QCOMPARE(first.textItems().size(), size_t(5));
    QCOMPARE(first.textItems()[0]->getFontSize(), 41);
    QCOMPARE(first.textItems()[1]->getText(), std::string("😀"));
    QCOMPARE(first.textItems()[2]->getText(), std::string());
    QCOMPARE(canvas.log.fast, 1);
    // A saved title is shown unchanged when it is opened again.
    canvas.scene->slotUpdateArchive(saved.get());
    QCOMPARE(canvas.text(1)->toPlainText(), QString::fromUtf8("a😀\nb"));
    QVERIFY(inStep(*canvas.text(1)));
}

void tst_canvasscene::picturesFollowTheTitle()
{
    Canvas canvas;
    QSignalSpy ready(canvas.scene.get(), &CanvasScene::signalSaveOk);
    canvas.scene->slotMakeSceneThumnail();
    canvas.scene->createThumnailPicture();
    QCOMPARE(canvas.log.fast + canvas.log.slow, 0);
    canvas.open({makeRecord("a")});
    canvas.scene->createThumnailPicture();
    QCOMPARE(canvas.log.fast, 1);
    // Without a file no pictures are made, and they are not made later either.
    canvas.scene->slotMakeSceneThumnail();
    QCOMPARE(canvas.log.slow, 0);
    canvas.scene->saveArchive();
    canvas.scene->slotMakeSceneThumnail();
    QCOMPARE(canvas.log.slow, 0);
    canvas.scene->saveArchiveFlag();
    canvas.scene->slotMakeSceneThumnail();
    canvas.scene->slotMakeSceneThumnail();
    QCOMPARE(canvas.log.slow, 1);
    Q_EMIT canvas.log.render->saveHalfThumbnailsOK("path", QImage());
    QCOMPARE(ready.count(), 1);
    QVERIFY(canvas.scene->isEditFinish());
    canvas.log.finished = false;
    QVERIFY(!canvas.scene->isEditFinish());
}

void tst_canvasscene::missingPictureIsMadeAgain()
{
    Canvas canvas;
    const QStringList names{"t_1920.png", "t_960.png", "t_240.png", "t_240S.png"};
    canvas.title.setThumbnailBig(names.at(0).toStdString());
    canvas.title.setThumbnailMiddle(names.at(1).toStdString());
    canvas.title.setThumbnailSmall(names.at(2).toStdString());
    canvas.title.setThumbnailBlack(names.at(3).toStdString());
    QVERIFY(TitleParser().writeOneTitle(&canvas.title) == 1);
    for (const QString& name : names)
        QVERIFY(QImage(4, 4, QImage::Format_RGB32).save(canvas.folder.filePath(name)));
    canvas.open({makeRecord("a")});
    QCOMPARE(canvas.log.slow, 0);
    for (const QString& name : names) {
        QVERIFY(QFile::remove(canvas.folder.filePath(name)));
        canvas.log.slow = 0;
        canvas.open({makeRecord("a")});
        QCOMPARE(canvas.log.slow, 1);
        QVERIFY(QImage(4, 4, QImage::Format_RGB32).save(canvas.folder.filePath(name)));
    }
    // Picture names that lead out of the folder are not the title's.
    canvas.log.slow = 0;
    canvas.title.setThumbnailBig("../elsewhere.png");
    canvas.open({makeRecord("a")});
    QCOMPARE(canvas.log.slow, 0);
}

void tst_canvasscene::withoutRender()
{
    CanvasScene scene(nullptr);
    QVERIFY(scene.isEditFinish());
    Archive title;
    title.setText({new TText(makeRecord("a"))});
    scene.slotUpdateArchive(&title);
    scene.createThumnailPicture();
    scene.slotMakeSceneThumnail();
    scene.saveArchive();
    // Without a stack and without a view.
    scene.slotInsertNewTextItem();
    scene.slotSendCustomEvent(nullptr);
    QCOMPARE(scene.getTextItemList().size(), 2);
}

void tst_canvasscene::backgroundBrush()
{
    Canvas canvas;
    QAction action;
    action.setData(1);
    canvas.scene->slotShowCanvasBG(&action);
    QCOMPARE(canvas.scene->backgroundBrush().color(), QColor(Qt::white));
    action.setData(0);
    canvas.scene->slotShowCanvasBG(&action);
    QCOMPARE(canvas.scene->backgroundBrush().color(), QColor(Qt::black));
    action.setData(2);
    canvas.scene->slotShowCanvasBG(&action);
    QCOMPARE(canvas.scene->backgroundBrush().color().alpha(), 0);
    canvas.scene->slotShowCanvasBG(nullptr);
    QCOMPARE(canvas.scene->backgroundBrush().color().alpha(), 0);
}

void tst_canvasscene::safeArea()
{
    Canvas canvas;
    canvas.open({makeRecord("a")});
    canvas.scene->slotDrawSafeArea(true);
    canvas.scene->slotDrawSafeArea(true);
    QList<QRectF> areas;
    int dotted = 0;
    const auto items = canvas.scene->items();
    for (QGraphicsItem* item : items) {
        if (item->type() != QGraphicsRectItem::Type)
            continue;
        auto* line = static_cast<QGraphicsRectItem*>(item);
        areas.append(line->rect());
        QCOMPARE(line->pen().widthF(), 2.0);
        dotted += line->pen().style() == Qt::DotLine && line->pen().color() == QColor(Qt::white);
        QCOMPARE(line->zValue(), 5.0);
    }
    QCOMPARE(areas.size(), 4);
    QCOMPARE(dotted, 2);
    QCOMPARE(areas.count(QRectF(64, 36, 1152, 648)), 2);
    QCOMPARE(areas.count(QRectF(128, 72, 1024, 576)), 2);
    canvas.open({makeRecord("b")});
    QCOMPARE(canvas.scene->items().size(), 6);
    canvas.scene->slotDrawSafeArea(false);
    QCOMPARE(canvas.scene->items().size(), 2);
}

void tst_canvasscene::generateThumbnail()
{
    Canvas canvas;
    canvas.open({makeRecord("abc")});
    const QString path = canvas.folder.path() + "/scene.png";
    canvas.scene->generateThumbnail(QSize(240, 135), path);
    QCOMPARE(QImage(path).size(), QSize(240, 135));
    canvas.scene->generateThumbnail(QSize(), canvas.folder.path() + "/none.png");
    QVERIFY(!QFileInfo::exists(canvas.folder.path() + "/none.png"));
}

void tst_canvasscene::switchingTitlesFinishesEditing()
{
    Canvas canvas;
    canvas.open({makeRecord("abc")});
    canvas.text(1)->initNewTextSelectAll();
    typeTextAt(*canvas.text(1), 3, "d");
    QSignalSpy selected(canvas.scene.get(), &CanvasScene::signalSceneNotifyIfExistSelectedObject);
    Archive other;
    other.setPath((canvas.folder.path() + "/other.xml").toStdString());
    canvas.scene->slotUpdateArchive(&other);
    QCOMPARE(selected.last(), QVariantList({false}));
    QCOMPARE(canvas.saved()->getText()[0]->getText(), std::string("abcd"));
    QCOMPARE(canvas.scene->getTextItemList().size(), 0);
    QVERIFY(!QFileInfo::exists(canvas.folder.path() + "/other.xml"));
}

QTEST_MAIN(tst_canvasscene)
#include "tst_canvasscene.moc"
