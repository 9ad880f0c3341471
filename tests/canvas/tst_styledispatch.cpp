#include "CanvasFixture.h"
#include "StyleProperties.h"

#include "canvas/StyleComparison.h"

#include <QInputMethodEvent>

// Style changes as the panel sends them: every property at every scope, previews, and what comes back.
class tst_styledispatch : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
    void rowsOfTheTable_data();
    void rowsOfTheTable();
    void everyPropertyOfAnObject_data() { properties(); }
    void everyPropertyOfAnObject();
    void everyPropertyOfASelection_data() { properties(); }
    void everyPropertyOfASelection();
    void everyPropertyOfTheNextCharacter_data() { properties(); }
    void everyPropertyOfTheNextCharacter();
    void everyPropertyOfAnEmptyObject_data() { properties(); }
    void everyPropertyOfAnEmptyObject();
    void previewThenCommit_data() { scopes(); }
    void previewThenCommit();
    void previewThenCancel_data() { scopes(); }
    void previewThenCancel();
    void sliderMovedAndReturned();
    void mixedColoursComeBack();
    void sizesStepFromMixedSelections();
    void previewLeftByTyping();
    void inputMethodKeepsTheStyles();
    void movedCaretForgetsTheStyle();
    void styleAfterTyping();
    void unknownProperty();
    void asymmetricFlags_data();
    void asymmetricFlags();
    void picturesAreMarkedOutOfDate_data();
    void picturesAreMarkedOutOfDate();

private:
    static void properties();
    static void scopes();
    // The styles under the selection, as the panel sends them back with one property changed.
    static TText sent(const GraphicsText& item, int id, int value);
    static QStringList stylesOf(const GraphicsText& item);
};

void tst_styledispatch::initTestCase()
{
    qRegisterMetaType<TText*>("TText*");
}

void tst_styledispatch::init()
{
    messages = new FakeMessageBoxController;
    InputLanguageFonts::resetLastFonts();
    InputLanguageFonts::mInputLanguage = 2;
    InputLanguageFonts::IS_CN_MODULE = false;
}

void tst_styledispatch::cleanup()
{
    delete messages;
    messages = nullptr;
}

void tst_styledispatch::properties()
{
    QTest::addColumn<int>("id");
    const char* names[] = {"family",       "size",        "bold",   "italic", "colour",  "edge",
                           "edge preview", "edge colour", "shadow", "align",  "kerning", "position"};
    for (int id = 0; id < 12; ++id)
        QTest::newRow(names[id]) << id;
}

void tst_styledispatch::scopes()
{
    QTest::addColumn<int>("id");
    QTest::addColumn<bool>("object");
    for (int id = 0; id < 12; ++id) {
        if (StyleProperties::isOverall(id))
            continue;
        QTest::addRow("object %d", id) << id << true;
        QTest::addRow("selection %d", id) << id << false;
    }
}

TText tst_styledispatch::sent(const GraphicsText& item, int id, int value)
{
    TText source = *item.getItemTText();
    const QTextCursor cursor = item.textCursor();
    if (cursor.hasSelection()) {
        std::vector<TextStyle*> selected;
        for (int i = cursor.selectionStart(); i < cursor.selectionEnd(); ++i)
            selected.push_back(new TextStyle(*source.textItems()[size_t(i)]));
        source.releaseVectorTextStyle();
        source.setTextItems(std::move(selected));
    }
    if (source.textItems().empty())
        source.setTextItems({new TextStyle(*item.getLastAlpaTextStyleValue()->textItems().front())});
    StyleProperties::set(id, source, value);
    return source;
}

QStringList tst_styledispatch::stylesOf(const GraphicsText& item)
{
    QStringList styles;
    for (const TextStyle* style : item.getItemTText()->textItems())
        styles.append(StyleProperties::describe(*style));
    return styles;
}

void tst_styledispatch::rowsOfTheTable_data()
{
    QTest::addColumn<int>("status");
    QTest::addColumn<bool>("overall");
    QTest::addColumn<bool>("same");
    QTest::addColumn<int>("changed"); // characters that look different afterwards
    QTest::addColumn<int>("after");   // status afterwards
    QTest::addColumn<int>("commands");
    QTest::newRow("object, part") << 0 << false << true << 6 << 0 << 1;
    QTest::newRow("object, part, mixed") << 0 << false << false << 6 << 0 << 1;
    QTest::newRow("object, overall") << 0 << true << true << 0 << 0 << 1;
    QTest::newRow("object, overall, mixed") << 0 << true << false << 0 << 0 << 1;
    QTest::newRow("selection, part") << 1 << false << true << 2 << 1 << 1;
    QTest::newRow("selection, part, mixed") << 1 << false << false << 2 << 1 << 1;
    QTest::newRow("selection, overall") << 1 << true << true << 0 << 0 << 1;
    QTest::newRow("selection, overall, mixed") << 1 << true << false << 0 << 0 << 1;
    QTest::newRow("caret, part") << 2 << false << true << 0 << 2 << 0;
    QTest::newRow("caret, part, mixed") << 2 << false << false << 0 << 2 << 0;
    QTest::newRow("caret, overall") << 2 << true << true << 0 << 0 << 1;
    QTest::newRow("caret, overall, mixed") << 2 << true << false << 0 << 2 << 0;
    QTest::newRow("none, part") << -1 << false << true << 0 << -1 << 0;
    QTest::newRow("none, overall") << -1 << true << true << 0 << -1 << 0;
}

void tst_styledispatch::rowsOfTheTable()
{
    QFETCH(int, status);
    QFETCH(bool, overall);
    QFETCH(bool, same);
    QFETCH(int, changed);
    QFETCH(int, after);
    QFETCH(int, commands);
    Canvas canvas;
    canvas.open({makeRecord("abcdef")});
    GraphicsText* item = canvas.text(1);
    if (status == 0)
        item->changeItemToSolidLineState();
    else if (status > 0)
        item->initNewTextSelectAll();
    if (status == 1)
        selectRange(*item, 4, 2);
    QCOMPARE(item->getStatusId(), status);
    const QStringList before = stylesOf(*item);
    TText source = sent(*item, TextObjectConstants::PropertySize, 0);
    if (!same)
        source.textItems()[1]->setFontColor("#010203");
    source.setTextAlign(1);
    QCOMPARE(canvas.scene->isTheSame(&source), same);
    canvas.scene->slotChangeObjectTextStyle(
        &source, overall ? TextObjectConstants::PropertyAlign : TextObjectConstants::PropertySize, 1);
    const QStringList now = stylesOf(*item);
    int different = 0;
    for (int i = 0; i < now.size(); ++i)
        different += now.at(i) != before.at(i);
    QCOMPARE(different, changed);
    QCOMPARE(item->getItemTText()->getTextAlign(), overall && commands > 0 ? 1 : -1);
    QCOMPARE(item->getStatusId(), after);
    QCOMPARE(canvas.stack.count(), commands);
    if (after == 1) {
        QCOMPARE(item->textCursor().anchor(), 4);
        QCOMPARE(item->textCursor().position(), 2);
    }
    QVERIFY(inStep(*item));
}

void tst_styledispatch::everyPropertyOfAnObject()
{
    QFETCH(int, id);
    Canvas canvas;
    TText record = makeRecord(QString::fromUtf8("ab\n快d"));
    record.textItems()[1]->setFontColor("#123456");
    canvas.open({record, makeRecord("other", 2)});
    GraphicsText* item = canvas.text(1);
    const QString other = StyleProperties::describe(*canvas.text(2)->getItemTText());
    item->changeItemToSolidLineState();
    const QString before = StyleProperties::describe(*item->getItemTText());
    TText source = sent(*item, id, 0);
    canvas.scene->slotChangeObjectTextStyle(&source, id, 1);
    const QString after = StyleProperties::describe(*item->getItemTText());
    QVERIFY(after != before);
    QCOMPARE(canvas.stack.count(), 1);
    QCOMPARE(item->getStatusId(), 0);
    QCOMPARE(item->toPlainText(), QString::fromUtf8("ab\n快d"));
    QVERIFY(inStep(*item));
    if (StyleProperties::isOverall(id)) {
        // Places and sizes of the shadow may follow; the characters stay as they are.
        QCOMPARE(after.section('\n', 1), before.section('\n', 1));
    } else {
        for (int i = 0; i < 5; ++i)
            QCOMPARE(stylesOf(*item).at(i), StyleProperties::describe(*source.textItems()[size_t(i)]));
    }
    QCOMPARE(StyleProperties::describe(*canvas.text(2)->getItemTText()), other);
    canvas.stack.undo();
    QCOMPARE(StyleProperties::describe(*canvas.text(1)->getItemTText()), before);
    canvas.stack.redo();
    QCOMPARE(StyleProperties::describe(*canvas.text(1)->getItemTText()), after);
    // The saved title equals the shown one.
    const auto saved = canvas.saved();
    QVERIFY(saved->getText()[0]->textItemsIsTheSame(*canvas.text(1)->getItemTText()));
    QCOMPARE(saved->getText()[0]->getTextAlign(), canvas.text(1)->getItemTText()->getTextAlign());
    QCOMPARE(saved->getText()[0]->getShadowStyle(), canvas.text(1)->getItemTText()->getShadowStyle());
}

void tst_styledispatch::everyPropertyOfASelection()
{
    QFETCH(int, id);
    for (const bool forward : {true, false}) {
        Canvas canvas;
        canvas.open({makeRecord("abcdef")});
        GraphicsText* item = canvas.text(1);
        item->initNewTextSelectAll();
        selectRange(*item, forward ? 1 : 4, forward ? 4 : 1);
        const QStringList before = stylesOf(*item);
        const QString record = StyleProperties::describe(*item->getItemTText());
        TText source = sent(*item, id, 0);
        canvas.scene->slotChangeObjectTextStyle(&source, id, 1);
        QCOMPARE(canvas.stack.count(), 1);
        const QStringList after = stylesOf(*item);
        if (StyleProperties::isOverall(id)) {
            QCOMPARE(after, before);
            QCOMPARE(item->getStatusId(), 0);
            // Only the move buttons place an object, and they are off while characters are selected.
            QCOMPARE(StyleProperties::describe(*item->getItemTText()) == record,
                     id == TextObjectConstants::PropertyPosition);
            QCOMPARE(item->scenePos().y(), 200.0);
        } else {
            for (int i = 0; i < 6; ++i) {
                const bool inside = i >= 1 && i < 4;
                QCOMPARE(after.at(i), inside ? StyleProperties::describe(*source.textItems()[size_t(i - 1)])
                                             : before.at(i));
                QCOMPARE(after.at(i) != before.at(i), inside);
            }
            QCOMPARE(item->textCursor().anchor(), forward ? 1 : 4);
            QCOMPARE(item->textCursor().position(), forward ? 4 : 1);
            QCOMPARE(item->getStatusId(), 1);
        }
        QVERIFY(inStep(*item));
        canvas.stack.undo();
        QCOMPARE(StyleProperties::describe(*item->getItemTText()), record);
    }
}

void tst_styledispatch::everyPropertyOfTheNextCharacter()
{
    QFETCH(int, id);
    Canvas canvas;
    canvas.show();
    canvas.open({makeRecord("abc")});
    GraphicsText* item = canvas.text(1);
    item->initNewTextSelectAll();
    item->getSelectionInfo(0, 0, 2, 0);
    QString shown;
    connect(item, &GraphicsText::signalNotifyPropertyAreaObjectSelectionStyleChange, item,
            [&shown](TText* style) { shown = StyleProperties::describe(*style->textItems().front()); });
    const QStringList before = stylesOf(*item);
    TText source = sent(*item, id, 0);
    canvas.scene->slotChangeObjectTextStyle(&source, id, 1);
    QCOMPARE(stylesOf(*item), before);
    if (StyleProperties::isOverall(id)) {
        QCOMPARE(canvas.stack.count(), 1);
        QCOMPARE(item->getStatusId(), 0);
        return;
    }
    QCOMPARE(canvas.stack.count(), 0);
    QCOMPARE(item->getStatusId(), 2);
    QVERIFY(item->hasFocus());
    item->showCurrentTextStyle();
    QCOMPARE(shown, StyleProperties::describe(*source.textItems().front()));
    typeText(*item, "x");
    QCOMPARE(stylesOf(*item).at(2), StyleProperties::describe(*source.textItems().front()));
    QCOMPARE(stylesOf(*item).at(1), before.at(1));
    QCOMPARE(stylesOf(*item).at(3), before.at(2));
    // The next character gets the style, too.
    typeText(*item, "y");
    QCOMPARE(stylesOf(*item).at(3), StyleProperties::describe(*source.textItems().front()));
    item->pushLastEditTextIntoStack();
    QCOMPARE(canvas.stack.count(), 1);
    canvas.stack.undo();
    QCOMPARE(stylesOf(*item), before);
}

void tst_styledispatch::everyPropertyOfAnEmptyObject()
{
    QFETCH(int, id);
    Canvas canvas;
    canvas.open({});
    canvas.scene->slotInsertNewTextItem();
    GraphicsText* item = canvas.text(1);
    TText source = sent(*item, id, 0);
    const int commands = canvas.stack.count();
    const float x = item->getItemTText()->getXValue();
    canvas.scene->slotChangeObjectTextStyle(&source, id, 1);
    QCOMPARE(canvas.stack.count(), commands + (StyleProperties::isOverall(id) ? 1 : 0));
    QCOMPARE(item->toPlainText(), QString());
    QCOMPARE(item->getItemTText()->getXValue() != x, id == TextObjectConstants::PropertyPosition);
    if (item->getStatusId() != 2)
        item->initNewTextSelectAll();
    typeText(*item, "a");
    if (!StyleProperties::isOverall(id))
        QCOMPARE(stylesOf(*item).first(), StyleProperties::describe(*source.textItems().front()));
    QCOMPARE(item->getItemTText()->getTextAlign(), id == TextObjectConstants::PropertyAlign ? 1 : -1);
    QVERIFY(inStep(*item));
}

void tst_styledispatch::previewThenCommit()
{
    QFETCH(int, id);
    QFETCH(bool, object);
    Canvas canvas;
    canvas.open({makeRecord("abcdef")});
    GraphicsText* item = canvas.text(1);
    item->initNewTextSelectAll();
    if (object)
        item->changeItemToSolidLineState();
    else
        selectRange(*item, 1, 3);
    const QString before = StyleProperties::describe(*item->getItemTText());
    for (const int value : {1, 0}) {
        TText preview = sent(*item, id, value);
        canvas.scene->slotChangeObjectTextStyle(&preview, id, 0);
        QCOMPARE(canvas.stack.count(), 0);
        QCOMPARE(stylesOf(*item).at(1), StyleProperties::describe(*preview.textItems()[object ? 1 : 0]));
    }
    TText commit = sent(*item, id, 0);
    canvas.scene->slotChangeObjectTextStyle(&commit, id, 1);
    QCOMPARE(canvas.stack.count(), 1);
    const QString after = StyleProperties::describe(*item->getItemTText());
    // The step goes back to before the first preview.
    canvas.stack.undo();
    QCOMPARE(StyleProperties::describe(*item->getItemTText()), before);
    canvas.stack.redo();
    QCOMPARE(StyleProperties::describe(*item->getItemTText()), after);
}

void tst_styledispatch::previewThenCancel()
{
    QFETCH(int, id);
    QFETCH(bool, object);
    Canvas canvas;
    canvas.open({makeRecord("abcdef")});
    GraphicsText* item = canvas.text(1);
    item->initNewTextSelectAll();
    if (object)
        item->changeItemToSolidLineState();
    else
        selectRange(*item, 3, 1);
    const QString before = StyleProperties::describe(*item->getItemTText());
    TText original = sent(*item, 99, 0);
    for (const int value : {1, 0}) {
        TText preview = sent(*item, id, value);
        canvas.scene->slotChangeObjectTextStyle(&preview, id, 0);
    }
    canvas.scene->slotChangeObjectTextStyle(&original, id, 2);
    QCOMPARE(canvas.stack.count(), 0);
    QCOMPARE(StyleProperties::describe(*item->getItemTText()), before);
    // The next undo step starts from the state before the preview.
    TText commit = sent(*item, TextObjectConstants::PropertyKerning, 0);
    canvas.scene->slotChangeObjectTextStyle(&commit, TextObjectConstants::PropertyKerning, 1);
    canvas.stack.undo();
    QCOMPARE(StyleProperties::describe(*item->getItemTText()), before);
}

void tst_styledispatch::sliderMovedAndReturned()
{
    Canvas canvas;
    TText record = makeRecord("abc");
    for (TextStyle* style : record.textItems())
        style->setIsTextEdge(1);
    canvas.open({record});
    GraphicsText* item = canvas.text(1);
    item->changeItemToSolidLineState();
    const QString before = StyleProperties::describe(*item->getItemTText());
    const TText original = sent(*item, 99, 0);
    for (const int width : {3, 8, 5, 2}) {
        TText preview = original;
        for (TextStyle* style : preview.textItems()) {
            TEdge edge = style->textEdge();
            edge.setEdgeWidth(width);
            style->setTextEdge(edge);
        }
        canvas.scene->slotChangeObjectTextStyle(&preview, TextObjectConstants::PropertyEdgeWidthPreview, 0);
    }
    TText commit = original;
    canvas.scene->slotChangeObjectTextStyle(&commit, TextObjectConstants::PropertyEdgeWidthOrColor, 1);
    QCOMPARE(StyleProperties::describe(*item->getItemTText()), before);
    while (canvas.stack.canUndo())
        canvas.stack.undo();
    QCOMPARE(StyleProperties::describe(*item->getItemTText()), before);
}

void tst_styledispatch::mixedColoursComeBack()
{
    Canvas canvas;
    TText record = makeRecord("abcd");
    const char* colours[] = {"#FF0000", "#00FF00", "#0000FF", "#FFFF00"};
    for (size_t i = 0; i < 4; ++i)
        record.textItems()[i]->setFontColor(colours[i]);
    canvas.open({record});
    GraphicsText* item = canvas.text(1);
    item->initNewTextSelectAll();
    selectRange(*item, 0, 4);
    TText original = sent(*item, 99, 0);
    TText preview = sent(*item, TextObjectConstants::PropertyColor, 1);
    canvas.scene->slotChangeObjectTextStyle(&preview, TextObjectConstants::PropertyColor, 0);
    QCOMPARE(item->getItemTText()->textItems()[3]->getFontColor(), std::string("#00AA00"));
    canvas.scene->slotChangeObjectTextStyle(&original, TextObjectConstants::PropertyColor, 2);
    for (size_t i = 0; i < 4; ++i)
        QCOMPARE(item->getItemTText()->textItems()[i]->getFontColor(), std::string(colours[i]));
    // OK makes them one colour; undo makes them many again.
    canvas.scene->slotChangeObjectTextStyle(&preview, TextObjectConstants::PropertyColor, 1);
    QCOMPARE(canvas.stack.count(), 1);
    canvas.stack.undo();
    for (size_t i = 0; i < 4; ++i)
        QCOMPARE(item->getItemTText()->textItems()[i]->getFontColor(), std::string(colours[i]));
}

// The panel steps each size on its own: every character takes its own new value.
void tst_styledispatch::sizesStepFromMixedSelections()
{
    Canvas canvas;
    TText record = makeRecord("abcd");
    const int sizes[] = {20, 36, 96, 999};
    const int stepped[] = {24, 40, 100, 999};
    for (size_t i = 0; i < 4; ++i)
        record.textItems()[i]->setFontSize(sizes[i]);
    canvas.open({record});
    GraphicsText* item = canvas.text(1);
    item->changeItemToSolidLineState();
    TText source = sent(*item, 99, 0);
    for (size_t i = 0; i < 4; ++i)
        source.textItems()[i]->setFontSize(stepped[i]);
    canvas.scene->slotChangeObjectTextStyle(&source, TextObjectConstants::PropertySize, 1);
    for (size_t i = 0; i < 4; ++i)
        QCOMPARE(item->getItemTText()->textItems()[i]->getFontSize(), stepped[i]);
    QVERIFY(inStep(*item));
    canvas.stack.undo();
    for (size_t i = 0; i < 4; ++i)
        QCOMPARE(item->getItemTText()->textItems()[i]->getFontSize(), sizes[i]);
}

void tst_styledispatch::previewLeftByTyping()
{
    Canvas canvas;
    canvas.open({makeRecord("abcd")});
    GraphicsText* item = canvas.text(1);
    item->initNewTextSelectAll();
    selectRange(*item, 0, 4);
    TText preview = sent(*item, TextObjectConstants::PropertyColor, 0);
    canvas.scene->slotChangeObjectTextStyle(&preview, TextObjectConstants::PropertyColor, 0);
    typeTextAt(*item, 4, "e");
    for (const TextStyle* style : item->getItemTText()->textItems())
        QCOMPARE(style->getFontColor(), std::string("#FFFFFF"));
    item->pushLastEditTextIntoStack();
    while (canvas.stack.canUndo())
        canvas.stack.undo();
    QCOMPARE(item->toPlainText(), QStringLiteral("abcd"));
    QVERIFY(inStep(*item));
}

// An empty event comes when move mode begins; the document reports the whole paragraph each time.
void tst_styledispatch::inputMethodKeepsTheStyles()
{
    Canvas canvas;
    TText record = makeRecord("abc\ndef");
    const char* const colors[] = {"#C80000", "#0D5EFF", "#FFF700", "#FFFFFF",
                                  "#00C743", "#F250B2", "#393939"};
    for (size_t i = 0; i < record.textItems().size(); ++i)
        record.textItems()[i]->setFontColor(colors[i]);
    canvas.open({record});
    GraphicsText* item = canvas.text(1);
    item->initNewTextSelectAll();
    QTextCursor cursor = item->textCursor();
    cursor.setPosition(2);
    item->setTextCursor(cursor);
    canvas.scene->setFocusItem(item);
    const QStringList before = stylesOf(*item);
    const auto send = [&](const QString& composed, const QString& committed) {
        QInputMethodEvent event(composed, {});
        event.setCommitString(committed);
        QCoreApplication::sendEvent(canvas.scene.get(), &event);
    };
    send(QString(), QString());
    send(QStringLiteral("x"), QString());
    send(QStringLiteral("xy"), QString());
    QCOMPARE(stylesOf(*item), before);
    QCOMPARE(item->toPlainText(), QStringLiteral("abc\ndef"));
    send(QString(), QStringLiteral("快"));
    QCOMPARE(item->toPlainText(), QStringLiteral("ab快c\ndef"));
    QVERIFY(inStep(*item));
    QStringList after = stylesOf(*item);
    QCOMPARE(item->getItemTText()->textItems()[2]->getFontColor(), std::string("#0D5EFF"));
    after.removeAt(2);
    QCOMPARE(after, before);
    item->pushLastEditTextIntoStack();
    QCOMPARE(canvas.stack.count(), 1);
    canvas.stack.undo();
    QCOMPARE(stylesOf(*item), before);
}

void tst_styledispatch::movedCaretForgetsTheStyle()
{
    Canvas canvas;
    canvas.open({makeRecord("abc")});
    GraphicsText* item = canvas.text(1);
    item->initNewTextSelectAll();
    item->getSelectionInfo(0, 0, 2, 0);
    TText source = sent(*item, TextObjectConstants::PropertySize, 0);
    canvas.scene->slotChangeObjectTextStyle(&source, TextObjectConstants::PropertySize, 1);
    item->getSelectionInfo(0, 0, 3, 0);
    item->getSelectionInfo(0, 0, 2, 0);
    typeText(*item, "x");
    QCOMPARE(item->getItemTText()->textItems()[2]->getFontSize(), 96);
}

void tst_styledispatch::styleAfterTyping()
{
    Canvas canvas;
    canvas.open({makeRecord("abc")});
    GraphicsText* item = canvas.text(1);
    item->initNewTextSelectAll();
    typeTextAt(*item, 3, "d");
    selectRange(*item, 0, 4);
    TText source = sent(*item, TextObjectConstants::PropertySize, 0);
    canvas.scene->slotChangeObjectTextStyle(&source, TextObjectConstants::PropertySize, 1);
    // Typing is a step of its own below that of the style.
    QCOMPARE(canvas.stack.count(), 2);
    canvas.stack.undo();
    QCOMPARE(item->toPlainText(), QStringLiteral("abcd"));
    QCOMPARE(item->getItemTText()->textItems()[0]->getFontSize(), 96);
    canvas.stack.undo();
    QCOMPARE(item->toPlainText(), QStringLiteral("abc"));
}

void tst_styledispatch::unknownProperty()
{
    Canvas canvas;
    canvas.open({makeRecord("abc")});
    GraphicsText* item = canvas.text(1);
    item->changeItemToSolidLineState();
    const QString before = StyleProperties::describe(*item->getItemTText());
    for (const int id : {-1, 12, 99}) {
        TText source = sent(*item, TextObjectConstants::PropertySize, 0);
        canvas.scene->slotChangeObjectTextStyle(&source, id, 1);
        QCOMPARE(StyleProperties::describe(*item->getItemTText()), before);
    }
    QVERIFY(inStep(*item));
}

void tst_styledispatch::asymmetricFlags_data()
{
    QTest::addColumn<int>("id");
    QTest::addColumn<bool>("firstOn");
    QTest::addColumn<bool>("same");
    for (const int id : {2, 3, 5}) {
        QTest::addRow("on then off %d", id) << id << true << false;
        QTest::addRow("off then on %d", id) << id << false << true;
    }
}

void tst_styledispatch::asymmetricFlags()
{
    QFETCH(int, id);
    QFETCH(bool, firstOn);
    QFETCH(bool, same);
    TText on = makeSource(makeStyle("a"), 1);
    StyleProperties::set(id, on, 0);
    TText source = makeSource(makeStyle("a"), 3);
    *source.textItems()[firstOn ? 0 : 2] = *on.textItems().front();
    QCOMPARE(StyleComparison::isTheSame(source), same);
}

void tst_styledispatch::picturesAreMarkedOutOfDate_data()
{
    QTest::addColumn<int>("status");
    QTest::addColumn<bool>("same");
    QTest::addColumn<int>("pictures");
    QTest::newRow("object") << 0 << true << 1;
    QTest::newRow("selection") << 1 << true << 1;
    QTest::newRow("next character") << 2 << true << 0;
    QTest::newRow("refused") << 2 << false << 1;
    QTest::newRow("nothing active") << -1 << true << 0;
}

void tst_styledispatch::picturesAreMarkedOutOfDate()
{
    QFETCH(int, status);
    QFETCH(bool, same);
    QFETCH(int, pictures);
    Canvas canvas;
    canvas.open({makeRecord("abc")});
    canvas.scene->saveArchive();
    GraphicsText* item = canvas.text(1);
    if (status == 0)
        item->changeItemToSolidLineState();
    else if (status > 0)
        item->initNewTextSelectAll();
    if (status == 1)
        selectRange(*item, 0, 2);
    TText source = makeSource(makeStyle(""), 3);
    if (!same)
        source.textItems()[1]->setFontColor("#010203");
    canvas.scene->slotChangeObjectTextStyle(&source, TextObjectConstants::PropertySize, 0);
    canvas.scene->slotMakeSceneThumnail();
    QCOMPARE(canvas.log.slow, pictures);
}

QTEST_MAIN(tst_styledispatch)
#include "tst_styledispatch.moc"
