#include "CanvasFixture.h"
#include "StyleProperties.h"

#include "tests/support/RandomSeed.h"

#include <QFontDatabase>
#include <QRandomGenerator>

// The edges of editing: long texts, many objects, smallest and largest characters, empty objects, fonts that
// disappear.
class tst_canvasscene_limits : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
    void threeHundredOfEveryStyle();
    void limitInEveryPlace_data();
    void limitInEveryPlace();
    void emojiAtTheLimit();
    void limitCountsNoLineBreaks();
    void fullTextTakesAReplacement();
    void fourObjects();
    void idsComeBack();
    void sizes_data();
    void sizes();
    void emptyObjectsAreSwept();
    void blankObjectsAreSwept_data();
    void blankObjectsAreSwept();
    void emptiedObjectKeepsItsLook();
    void removedFont();
    void typedCombinations();

private:
    static QString look(const GraphicsText& item)
    {
        return StyleProperties::describe(*item.getItemTText()->textItems().front());
    }
};

void tst_canvasscene_limits::initTestCase()
{
    qRegisterMetaType<TText*>("TText*");
}

void tst_canvasscene_limits::init()
{
    messages = new FakeMessageBoxController;
    InputLanguageFonts::resetLastFonts();
    InputLanguageFonts::mInputLanguage = 2;
    InputLanguageFonts::IS_CN_MODULE = false;
}

void tst_canvasscene_limits::cleanup()
{
    delete messages;
    messages = nullptr;
}

void tst_canvasscene_limits::threeHundredOfEveryStyle()
{
    Canvas canvas;
    TText record = makeRecord(QString(300, 'x'), 1, "KST", 20);
    for (size_t i = 0; i < 300; ++i) {
        TextStyle& style = *record.textItems()[i];
        style.setText(std::string(1, char('a' + i % 26)));
        style.setFontSize(20 + int(i % 7));
        style.setFontColor(QString("#%1").arg(i * 5000, 6, 16, QLatin1Char('0')).toStdString());
        style.setFontBold(int(i % 2));
        style.setIsTextItalic(int(i % 3 == 0));
        style.setIsTextEdge(int(i % 5 == 0));
        style.setTextKerning(80 + int(i % 40));
    }
    canvas.open({record});
    GraphicsText* item = canvas.text(1);
    QVERIFY(inStep(*item));
    QCOMPARE(item->toPlainText().size(), 300);
    QVERIFY(item->getItemTText()->textItemsIsTheSame(record));
    canvas.scene->saveArchive();
    QVERIFY(canvas.saved()->getText()[0]->textItemsIsTheSame(record));
    // Changes one property of all characters; their other properties stay different.
    item->changeItemToSolidLineState();
    TText source = record;
    StyleProperties::set(TextObjectConstants::PropertySize, source, 0);
    canvas.scene->slotChangeObjectTextStyle(&source, TextObjectConstants::PropertySize, 1);
    QVERIFY(item->getItemTText()->textItemsIsTheSame(source));
    canvas.stack.undo();
    QVERIFY(item->getItemTText()->textItemsIsTheSame(record));
    canvas.stack.redo();
    QVERIFY(canvas.saved()->getText()[0]->textItemsIsTheSame(source));
}

void tst_canvasscene_limits::limitInEveryPlace_data()
{
    QTest::addColumn<int>("at");
    QTest::addColumn<int>("typed");
    QTest::addColumn<QString>("result");
    const QString a(100, 'a');
    const QString b(190, 'b');
    QTest::newRow("room for ten at the start") << 0 << 10 << QString(10, 'x') + a + b;
    QTest::newRow("one too many at the start") << 0 << 11 << QString(10, 'x') + a + b;
    QTest::newRow("many in the middle") << 100 << 200 << a + QString(10, 'x') + b;
    QTest::newRow("many at the end") << 290 << 10000 << a + b + QString(10, 'x');
}

void tst_canvasscene_limits::limitInEveryPlace()
{
    QFETCH(int, at);
    QFETCH(int, typed);
    QFETCH(QString, result);
    Canvas canvas;
    canvas.open({makeRecord(QString(100, 'a') + QString(190, 'b'), 1, "KST", 20)});
    GraphicsText* item = canvas.text(1);
    item->initNewTextSelectAll();
    typeTextAt(*item, at, QString(typed, 'x'));
    QCOMPARE(item->toPlainText(), result);
    QCOMPARE(item->textCursor().position(), at + 10);
    QVERIFY(inStep(*item));
    // Nothing can be inserted into a full text, at any position.
    typeTextAt(*item, at, "yz");
    QCOMPARE(item->toPlainText(), result);
    QVERIFY(inStep(*item));
    item->pushLastEditTextIntoStack();
    canvas.stack.undo();
    QCOMPARE(item->toPlainText().size(), 290);
}

void tst_canvasscene_limits::emojiAtTheLimit()
{
    Canvas canvas;
    canvas.open({makeRecord(QString(299, 'a'), 1, "KST", 20)});
    GraphicsText* item = canvas.text(1);
    item->initNewTextSelectAll();
    // A character of two units does not fit into the room for one.
    typeTextAt(*item, 299, QString::fromUtf8("😀"));
    QCOMPARE(item->toPlainText(), QString(299, 'a'));
    QVERIFY(inStep(*item));
    typeTextAt(*item, 10, QString::fromUtf8("b😀"));
    QCOMPARE(item->toPlainText(), QString(10, 'a') + 'b' + QString(289, 'a'));
    QVERIFY(inStep(*item));
}

void tst_canvasscene_limits::limitCountsNoLineBreaks()
{
    Canvas canvas;
    canvas.open({});
    canvas.scene->slotInsertNewTextItem();
    GraphicsText* item = canvas.text(1);
    QString text;
    for (int i = 0; i < 60; ++i)
        text += QStringLiteral("12345\n");
    typeText(*item, text);
    QCOMPARE(item->toPlainText(), text);
    QCOMPARE(item->getItemTText()->textItems().size(), size_t(360));
    typeText(*item, "6");
    QCOMPARE(item->toPlainText(), text);
    typeText(*item, "\n\n\n");
    QCOMPARE(item->toPlainText(), text + "\n\n\n");
    QVERIFY(inStep(*item));
    item->pushLastEditTextIntoStack();
    canvas.scene->slotUpdateArchive(canvas.saved().get());
    QCOMPARE(canvas.text(1)->toPlainText(), text + "\n\n\n");
}

void tst_canvasscene_limits::fullTextTakesAReplacement()
{
    Canvas canvas;
    canvas.open({makeRecord(QString(300, 'a'), 1, "KST", 20)});
    GraphicsText* item = canvas.text(1);
    item->initNewTextSelectAll();
    selectRange(*item, 50, 60);
    typeText(*item, QString(20, 'b'));
    QCOMPARE(item->toPlainText(), QString(50, 'a') + QString(10, 'b') + QString(240, 'a'));
    QVERIFY(inStep(*item));
    QCOMPARE(canvas.stack.count(), 1);
    canvas.stack.undo();
    QCOMPARE(item->toPlainText(), QString(300, 'a'));
}

void tst_canvasscene_limits::fourObjects()
{
    Canvas canvas;
    canvas.open({});
    QSignalSpy failed(canvas.scene.get(), &CanvasScene::signalNewTextInsertedFailed);
    for (int id = 1; id <= 4; ++id) {
        canvas.scene->slotInsertNewTextItem();
        QVERIFY(canvas.text(id));
        typeText(*canvas.text(id), QString(300, QLatin1Char(char('0' + id))));
        QCOMPARE(canvas.text(id)->getItemTText()->getZValue(), float(id));
    }
    canvas.scene->slotInsertNewTextItem();
    QCOMPARE(failed.count(), 1);
    QCOMPARE(messages->posted.size(), 1);
    QCOMPARE(messages->posted.last().first, 110);
    QCOMPARE(canvas.scene->getTextItemList().size(), 4);
    // The refused attempt has ended editing and saved what was typed.
    QVERIFY(!canvas.scene->itemIsEditorInteraction());
    const auto saved = canvas.saved();
    QCOMPARE(saved->getText().size(), size_t(4));
    for (size_t i = 0; i < 4; ++i) {
        QCOMPARE(saved->getText()[i]->getTextObjectID(), int(i) + 1);
        QCOMPARE(saved->getText()[i]->textItems().size(), size_t(300));
    }
    while (canvas.stack.canUndo())
        canvas.stack.undo();
    QCOMPARE(canvas.scene->getTextItemList().size(), 0);
    while (canvas.stack.canRedo())
        canvas.stack.redo();
    for (int id = 1; id <= 4; ++id)
        QCOMPARE(canvas.text(id)->toPlainText(), QString(300, QLatin1Char(char('0' + id))));
}

void tst_canvasscene_limits::idsComeBack()
{
    Canvas canvas;
    canvas.open({makeRecord("one", 1), makeRecord("two", 2), makeRecord("three", 3)});
    canvas.text(2)->changeItemToSolidLineState();
    canvas.scene->deleteSelectedItems();
    canvas.scene->slotInsertNewTextItem();
    typeText(*canvas.text(2), "new two");
    canvas.scene->clearItemsSelectionAndFocus();
    canvas.text(1)->changeItemToSolidLineState();
    canvas.scene->deleteSelectedItems();
    QCOMPARE(canvas.text(1), nullptr);
    // After everything is undone, the first "two" has its number again.
    while (canvas.stack.canUndo())
        canvas.stack.undo();
    QCOMPARE(canvas.scene->getTextItemList().size(), 3);
    QCOMPARE(canvas.text(1)->toPlainText(), QStringLiteral("one"));
    QCOMPARE(canvas.text(2)->toPlainText(), QStringLiteral("two"));
    while (canvas.stack.canRedo())
        canvas.stack.redo();
    QCOMPARE(canvas.text(1), nullptr);
    QCOMPARE(canvas.text(2)->toPlainText(), QStringLiteral("new two"));
    QCOMPARE(canvas.text(3)->toPlainText(), QStringLiteral("three"));
}

void tst_canvasscene_limits::sizes_data()
{
    QTest::addColumn<int>("size");
    QTest::newRow("smallest") << 20;
    QTest::newRow("largest") << 999;
}

void tst_canvasscene_limits::sizes()
{
    QFETCH(int, size);
    Canvas canvas;
    TText record = makeRecord("MM\nM");
    record.setShadowStyle(1);
    record.getTextShadow()->setShadowDirectionX(1);
    record.getTextShadow()->setShadowDirectionY(1);
    for (TextStyle* style : record.textItems()) {
        style->setIsTextEdge(1);
        style->setFontColor("#FF0000");
    }
    canvas.open({record});
    GraphicsText* item = canvas.text(1);
    item->changeItemToSolidLineState();
    TText source = record;
    for (TextStyle* style : source.textItems())
        style->setFontSize(size);
    canvas.scene->slotChangeObjectTextStyle(&source, TextObjectConstants::PropertySize, 1);
    QVERIFY(inStep(*item));
    for (const TextStyle* style : item->getItemTText()->textItems())
        QCOMPARE(style->getFontSize(), size);
    QLineF line;
    QPointF point;
    int block = 0;
    QVERIFY(CaretGeometry(*item->document()).caretPoint(line, point, block, 1));
    // A line is about as high as its characters at two thirds of their size.
    QVERIFY(line.length() > size * 0.6 && line.length() < size * 1.2);
    // The shadow scales with the size.
    const int step = size / 34 + (size % 34 > 17 ? 1 : 0);
    QCOMPARE(item->getItemTText()->getTextShadow()->getShadowDirectionX(), step * 4);
    QCOMPARE(item->getItemTText()->getTextShadow()->getShadowBlurRadius(), step * 16.0);
    // The object can be drawn and edited like any other.
    canvas.show();
    item->initNewTextSelectAll();
    QVERIFY(!canvas.view.grab().isNull());
    typeTextAt(*item, 2, "W");
    QCOMPARE(item->getItemTText()->textItems()[2]->getFontSize(), size);
    QVERIFY(inStep(*item));
    item->pushLastEditTextIntoStack();
    QCOMPARE(canvas.saved()->getText()[0]->textItems()[2]->getFontSize(), size);
}

void tst_canvasscene_limits::emptyObjectsAreSwept()
{
    Canvas canvas;
    canvas.open({makeRecord("kept", 1)});
    canvas.scene->slotInsertNewTextItem();
    QVERIFY(canvas.text(2));
    // The next new object removes the blank one and takes its number.
    canvas.scene->slotInsertNewTextItem();
    QVERIFY(canvas.text(2));
    QVERIFY(!canvas.text(3));
    // Showing another title removes it, too.
    Archive other;
    other.setPath((canvas.folder.path() + "/other.xml").toStdString());
    canvas.scene->slotUpdateArchive(&other);
    QCOMPARE(canvas.saved()->getText().size(), size_t(1));
    QCOMPARE(canvas.saved()->getText()[0]->getText(), std::string("kept"));
}

void tst_canvasscene_limits::blankObjectsAreSwept_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<bool>("swept");
    QTest::newRow("nothing") << QString() << true;
    QTest::newRow("space") << QStringLiteral(" ") << true;
    QTest::newRow("line breaks") << QStringLiteral("\n\n") << true;
    QTest::newRow("tab and em space") << QString("\t") + QChar(0x2003) << true;
    QTest::newRow("ideographic space") << QString(QChar(0x3000)) << true;
    QTest::newRow("dot") << QStringLiteral(" . ") << false;
}

void tst_canvasscene_limits::blankObjectsAreSwept()
{
    QFETCH(QString, text);
    QFETCH(bool, swept);
    Canvas canvas;
    canvas.open({makeRecord("other", 2)});
    canvas.scene->slotInsertNewTextItem();
    typeText(*canvas.text(1), text);
    canvas.text(1)->pushLastEditTextIntoStack();
    const int steps = canvas.stack.count();
    canvas.scene->slotDeleteEmptyItems();
    QCOMPARE(canvas.text(1) == nullptr, swept);
    QVERIFY(canvas.text(2));
    QCOMPARE(canvas.stack.count(), steps + (swept ? 1 : 0));
    canvas.stack.undo();
    // The object with its blanks is restored if it was removed; otherwise the typing is undone.
    QVERIFY(canvas.text(1));
    QCOMPARE(canvas.text(1)->toPlainText(), swept ? text : QString());
}

void tst_canvasscene_limits::emptiedObjectKeepsItsLook()
{
    Canvas canvas;
    TText record = makeRecord("ab", 1, "DejaVu Sans", 70);
    record.textItems()[0]->setFontColor("#AB12CD");
    record.setShadowStyle(2);
    record.getTextShadow()->setShadowDirectionX(-1);
    record.getTextShadow()->setShadowDirectionY(1);
    record.setTextAlign(1);
    canvas.open({record, makeRecord("other", 2)});
    GraphicsText* item = canvas.text(1);
    item->initNewTextSelectAll();
    const QString before = look(*item);
    const double right = item->scenePos().x() + item->layoutRect().width();
    QTextCursor cursor = item->textCursor();
    cursor.setPosition(2);
    for (int i = 0; i < 2; ++i)
        cursor.deletePreviousChar();
    QCOMPARE(item->toPlainText(), QString());
    canvas.scene->slotDeleteEmptyItems();
    QCOMPARE(canvas.text(1), nullptr);
    // Brought back by undo it still knows what it looked like.
    canvas.stack.undo();
    item = canvas.text(1);
    QVERIFY(item);
    item->initNewTextSelectAll();
    typeText(*item, "z");
    QCOMPARE(look(*item), before);
    QCOMPARE(item->getItemTText()->getTextAlign(), 1);
    QCOMPARE(item->getItemTText()->getShadowStyle(), 2);
    QVERIFY(qAbs(item->scenePos().x() + item->layoutRect().width() - right) < 0.01);
    item->pushLastEditTextIntoStack();
    while (canvas.stack.canUndo())
        canvas.stack.undo();
    QCOMPARE(canvas.text(1)->toPlainText(), QStringLiteral("ab"));
    QCOMPARE(look(*canvas.text(1)), before);
}

void tst_canvasscene_limits::removedFont()
{
    const int font = QFontDatabase::addApplicationFont("/usr/share/fonts/truetype/dejavu/DejaVuSansMono.ttf");
    QVERIFY(font >= 0);
    const QByteArray family = QFontDatabase::applicationFontFamilies(font).value(0).toUtf8();
    QCOMPARE(family, QByteArray("DejaVu Sans Mono"));
    Canvas canvas;
    canvas.show();
    FakeCanvasHost host;
    host.visible = true;
    ICanvasHost::setInstance(&host);
    canvas.open({makeRecord("ab", 1, family.constData())});
    QVERIFY(messages->posted.isEmpty());
    GraphicsText* item = canvas.text(1);
    item->initNewTextSelectAll();
    QVERIFY(!canvas.view.grab().isNull());

    QVERIFY(QFontDatabase::removeApplicationFont(font));
    QStringList reported;
    connect(item, &GraphicsText::signalShowMessageWhenUsingDefaultFont, item,
            [&reported](const QString& name) { reported.append(name); });
    QVERIFY(!canvas.view.grab().isNull());
    // Text that is typed now gets a family that exists.
    typeTextAt(*item, 2, "c");
    QCOMPARE(item->toPlainText(), QStringLiteral("abc"));
    QCOMPARE(item->getItemTText()->textItems()[2]->getFontFamily(), std::string("KST"));
    QVERIFY(reported.contains(QString::fromUtf8(family)));
    QVERIFY(!canvas.view.grab().isNull());
    // So does text that is styled, undone and redone.
    selectRange(*item, 0, 1);
    TText source = makeSource(makeStyle("", family.constData(), 50), 1);
    canvas.scene->slotChangeObjectTextStyle(&source, TextObjectConstants::PropertySize, 1);
    QCOMPARE(item->getItemTText()->textItems()[0]->getFontSize(), 50);
    QCOMPARE(item->getItemTText()->textItems()[0]->getFontFamily(), std::string("KST"));
    while (canvas.stack.canUndo())
        canvas.stack.undo();
    QCOMPARE(item->toPlainText(), QStringLiteral("ab"));
    while (canvas.stack.canRedo())
        canvas.stack.redo();
    QCOMPARE(item->toPlainText(), QStringLiteral("abc"));
    QVERIFY(inStep(*item));
    QVERIFY(!canvas.view.grab().isNull());
    // Opened again the title says so, and is saved with the family that stands in.
    messages->posted.clear();
    TText again = makeRecord("ab", 1, family.constData());
    canvas.open({again});
    QCOMPARE(messages->posted.size(), 1);
    QCOMPARE(messages->posted.at(0).first, 109);
    QCOMPARE(messages->posted.at(0).second, QString::fromUtf8(family));
    QCOMPARE(canvas.saved()->getText()[0]->textItems()[1]->getFontFamily(), std::string("KST"));
    ICanvasHost::setInstance(nullptr);
}

// Whatever is inserted, removed and replaced, each position has its one style, on disk as well.
void tst_canvasscene_limits::typedCombinations()
{
    const QStringList pieces{QStringLiteral("a"),       QString::fromUtf8("快"),
                             QString::fromUtf8("😀"),    QString::fromUtf8("e\u0301"),
                             QStringLiteral("\n"),      QStringLiteral(" "),
                             QString::fromUtf8("속보"), QString::fromUtf8("👨‍👩‍👧"),
                             QStringLiteral("xyz\n")};
    const RandomSeed seed(7);
    QRandomGenerator random(seed);
    Canvas canvas;
    canvas.open({makeRecord("start")});
    GraphicsText* item = canvas.text(1);
    item->initNewTextSelectAll();
    for (int i = 0; i < 400; ++i) {
        QTextCursor cursor = item->textCursor();
        const int length = item->document()->characterCount();
        cursor.setPosition(random.bounded(length));
        if (random.bounded(3) == 0)
            cursor.setPosition(random.bounded(length), QTextCursor::KeepAnchor);
        if (random.bounded(4) == 0)
            cursor.deleteChar();
        else
            cursor.insertText(pieces.at(random.bounded(int(pieces.size()))));
        item->setTextCursor(cursor);
        const auto& styles = item->getItemTText()->textItems();
        QCOMPARE(int(styles.size()), item->document()->characterCount() - 1);
    }
    item->pushLastEditTextIntoStack();
    canvas.scene->saveArchive();
    if (item->toPlainText().isEmpty())
        return;
    const QString text = item->toPlainText();
    const auto saved = canvas.saved();
    QVERIFY(saved->getText()[0]->textItemsIsTheSame(*item->getItemTText()));
    canvas.scene->slotUpdateArchive(saved.get());
    QCOMPARE(canvas.text(1)->toPlainText(), text);
    QVERIFY(inStep(*canvas.text(1)));
}

QTEST_MAIN(tst_canvasscene_limits)
#include "tst_canvasscene_limits.moc"
