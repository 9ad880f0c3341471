#include "TextPair.h"
#include "tests/support/Patience.h"

#include "canvas/CaretGeometry.h"
#include "canvas/CharacterFormat.h"
#include "canvas/StyleDocument.h"

#include <QClipboard>
#include <QGraphicsDropShadowEffect>
#include <QGraphicsScene>
#include <QGraphicsView>
#include <QGuiApplication>
#include <QMimeData>
#include <QPainter>
#include <QSignalSpy>
#include <QTest>
#include <QTextBlock>
#include <QTextLayout>

namespace
{

void emptyText(GraphicsText& item)
{
    QTextCursor cursor = item.textCursor();
    cursor.select(QTextCursor::Document);
    cursor.removeSelectedText();
    item.setTextCursor(cursor);
}

} // namespace

// A text object as a styled document: the record follows the document and the other way round.
class tst_graphicstext : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { qRegisterMetaType<TText*>("TText*"); }
    void init();
    void typeAndFlags();
    void loadingKeepsOneStylePerCharacter();
    void loadingSevenOddTexts_data();
    void loadingSevenOddTexts();
    void typingKeepsStep();
    void typingTakesThePreviousStyle();
    void startOfLine();
    void emptyObjectTakesTheLastStyle();
    void ensureModeOneTakesTheScriptFamily();
    void limitOf300();
    void lineBreaksAreFree();
    void pairsAndMarks();
    void pastedTextIsPlain();
    void replacedSelectionIsOneStep();
    void typingBurstIsOneStep();
    void partStyleKeepsSelectionDirection();
    void partStyleStopsAtShortSource();
    void previewAndCommit();
    void secondCommitGoesBackToTheFirst();
    void overallChange();
    void savedStyleForNextCharacter();
    void statusIds();
    void moveByPanel();
    void alignKeepsTheAnchor_data();
    void alignKeepsTheAnchor();
    void shadowEffect();
    void missingFamily();
    void formatOfACharacter();
    void resetShowsTheRecord();
    void textListIsACopy();
    void hostileRecord();
};

void tst_graphicstext::init()
{
    InputLanguageFonts::resetLastFonts();
    InputLanguageFonts::mInputLanguage = 2;
    InputLanguageFonts::IS_CN_MODULE = false;
}

void tst_graphicstext::typeAndFlags()
{
    Pair pair(makeRecord("ab"));
    QCOMPARE(pair.child->type(), 65546);
    QCOMPARE(pair.child->type(), 0x1000a);
    QCOMPARE(pair.parent->type(), 65546);
    QVERIFY(pair.parent->isParentObject());
    QVERIFY(!pair.child->isParentObject());
    QVERIFY(pair.parent->isParentItem());
    QCOMPARE(pair.child->parentTextItem(), pair.parent);
    QCOMPARE(pair.parent->childTextItem(), pair.child);
    QCOMPARE(pair.child->getFocusFlag(), -1);
    QCOMPARE(pair.child->document()->documentMargin(), 27.0);
    pair.child->setRadio(1.0, true);
    QCOMPARE(pair.child->document()->documentMargin(), 40.5);
    pair.child->setRadio(TextObjectConstants::SCENEPERCENTAGE, false);
    QCOMPARE(pair.child->document()->documentMargin(), 27.0);
    QCOMPARE(int(Qt::TextEditorInteraction), 19);
}

void tst_graphicstext::loadingKeepsOneStylePerCharacter()
{
    TText record = makeRecord("one\ntwo");
    record.textItems()[2]->setFontSize(30);
    Pair pair(record);
    QCOMPARE(pair.child->toPlainText(), QStringLiteral("one\ntwo"));
    QVERIFY(inStep(*pair.child));
    QCOMPARE(pair.record().textItems()[2]->getFontSize(), 30);
    QCOMPARE(QString::fromStdString(pair.record().textItems()[3]->getText()), TextObjectConstants::ENTER);
    // Loading again shows the same.
    const QRectF before = pair.child->layoutRect();
    pair.child->initShowText();
    QCOMPARE(pair.child->layoutRect(), before);
    QCOMPARE(pair.child->toPlainText(), QStringLiteral("one\ntwo"));
}

void tst_graphicstext::loadingSevenOddTexts_data()
{
    QTest::addColumn<QString>("text");
    QTest::newRow("empty") << QString();
    QTest::newRow("breaks only") << QStringLiteral("\n\n");
    QTest::newRow("Chinese") << QString::fromUtf8("快讯");
    QTest::newRow("emoji") << QString::fromUtf8("a😀b🇫🇷");
    QTest::newRow("marks") << QString::fromUtf8("e\u0301a\u0308\u0301");
    QTest::newRow("tab") << QStringLiteral("a\tb");
    QTest::newRow("spaces") << QStringLiteral("  a  ");
}

void tst_graphicstext::loadingSevenOddTexts()
{
    QFETCH(QString, text);
    Pair pair(makeRecord(text));
    QCOMPARE(pair.child->toPlainText(), text);
    QVERIFY(inStep(*pair.child));
    const std::unique_ptr<TText> saved(pair.child->getTextList());
    Pair again(*saved);
    QCOMPARE(again.child->toPlainText(), text);
    QVERIFY(*saved == *std::unique_ptr<TText>(again.child->getTextList()));
}

void tst_graphicstext::typingKeepsStep()
{
    Pair pair(makeRecord(""));
    for (const QString& text :
         {QStringLiteral("Hello"), QStringLiteral("\n"), QString::fromUtf8("速報 속보 é"),
          QString::fromUtf8("😀"), QStringLiteral("z")}) {
        typeText(*pair.child, text);
        QVERIFY(inStep(*pair.child));
    }
    typeTextAt(*pair.child, 2, "XY");
    QVERIFY(inStep(*pair.child));
    QTextCursor cursor = pair.child->textCursor();
    cursor.setPosition(1);
    cursor.setPosition(9, QTextCursor::KeepAnchor);
    cursor.removeSelectedText();
    QVERIFY(inStep(*pair.child));
    cursor.movePosition(QTextCursor::End);
    while (cursor.position() > 0) {
        cursor.deletePreviousChar();
        QVERIFY(inStep(*pair.child));
    }
    QVERIFY(pair.record().textItems().empty());
}

void tst_graphicstext::typingTakesThePreviousStyle()
{
    TText record = makeRecord("ab");
    record.textItems()[0]->setFontSize(50);
    record.textItems()[1]->setFontColor("#112233");
    Pair pair(record);
    typeTextAt(*pair.child, 1, "x");
    QCOMPARE(pair.record().textItems()[1]->getFontSize(), 50);
    QCOMPARE(pair.record().textItems()[1]->getText(), std::string("x"));
    typeTextAt(*pair.child, 3, "y");
    QCOMPARE(pair.record().textItems()[3]->getFontColor(), std::string("#112233"));
    // Each character keeps the family that its language had when it was typed.
    QCOMPARE(pair.record().textItems()[3]->getAlphaDefaultFontOfInputLanguage(), std::string("KST"));
    typeText(*pair.child, QString::fromUtf8("快"));
    QCOMPARE(pair.record().textItems()[4]->getAlphaDefaultFontOfInputLanguage(),
             std::string("KST Japanese Pro"));
    QCOMPARE(pair.record().textItems()[4]->getFontFamily(), std::string("KST Japanese Pro"));
}

void tst_graphicstext::startOfLine()
{
    TText record = makeRecord("a\nb\n");
    record.textItems()[0]->setFontSize(30);
    record.textItems()[1]->setFontSize(40);
    record.textItems()[2]->setFontSize(50);
    record.textItems()[3]->setFontSize(60);
    Pair pair(record);
    typeTextAt(*pair.child, 2, "x");
    QCOMPARE(pair.record().textItems()[2]->getFontSize(), 50);
    // In an empty line the style of the line break before it is used.
    typeTextAt(*pair.child, 5, "y");
    QCOMPARE(pair.record().textItems()[5]->getFontSize(), 60);
    typeTextAt(*pair.child, 0, "z");
    QCOMPARE(pair.record().textItems()[0]->getFontSize(), 30);
}

void tst_graphicstext::emptyObjectTakesTheLastStyle()
{
    TText record = makeRecord("ab");
    record.textItems()[0]->setFontSize(71);
    Pair pair(record);
    QTextCursor cursor = pair.child->textCursor();
    cursor.setPosition(2);
    cursor.deletePreviousChar();
    QSignalSpy modes(pair.child, &GraphicsText::signalNotifyTextPropertyAreaObjectSelectionMode);
    cursor.deletePreviousChar();
    QCOMPARE(modes.count(), 1);
    QCOMPARE(modes.at(0), QVariantList({false, false}));
    QCOMPARE(pair.child->getLastAlpaTextStyleValue()->textItems()[0]->getFontSize(), 71);
    // The empty line keeps the height of the deleted characters.
    QCOMPARE(pair.child->font().pixelSize(), 47);
    typeText(*pair.child, "c");
    QCOMPARE(pair.record().textItems()[0]->getFontSize(), 71);
    QVERIFY(inStep(*pair.child));
}

void tst_graphicstext::ensureModeOneTakesTheScriptFamily()
{
    InputLanguageFonts::replaceLastFontWithCurrentCharFont(QChar('a'), "DejaVu Sans");
    TText last = makeSource(makeStyle("", "KST Japanese Pro"), 1);
    {
        Pair pair(makeRecord(""));
        pair.child->setLastAlpaTextStyleValue(last);
        pair.child->setFontFamilyEnsureMode(1);
        typeText(*pair.child, "a");
        QCOMPARE(pair.record().textItems()[0]->getFontFamily(), std::string("DejaVu Sans"));
    }
    {
        Pair pair(makeRecord(""));
        pair.child->setLastAlpaTextStyleValue(last);
        pair.child->setFontFamilyEnsureMode(2);
        typeText(*pair.child, "a");
        QCOMPARE(pair.record().textItems()[0]->getFontFamily(), std::string("KST Japanese Pro"));
    }
}

void tst_graphicstext::limitOf300()
{
    Pair pair(makeRecord(""));
    typeText(*pair.child, QString(301, 'a'));
    QCOMPARE(pair.child->toPlainText().size(), 300);
    QVERIFY(inStep(*pair.child));
    typeText(*pair.child, "b");
    QCOMPARE(pair.child->toPlainText(), QString(300, 'a'));
    typeTextAt(*pair.child, 10, "bcd");
    QCOMPARE(pair.child->toPlainText(), QString(300, 'a'));
    QVERIFY(inStep(*pair.child));
    selectRange(*pair.child, 0, 100);
    typeText(*pair.child, QString(120, 'c'));
    QCOMPARE(pair.child->toPlainText(), QString(100, 'c') + QString(200, 'a'));
    QVERIFY(inStep(*pair.child));
}

void tst_graphicstext::lineBreaksAreFree()
{
    Pair pair(makeRecord(""));
    typeText(*pair.child, QString(150, 'a') + "\n" + QString(150, 'b') + "\n");
    QCOMPARE(pair.child->toPlainText().size(), 302);
    typeText(*pair.child, "x");
    QCOMPARE(pair.child->toPlainText().size(), 302);
    typeText(*pair.child, "\n");
    QCOMPARE(pair.child->toPlainText().size(), 303);
    QVERIFY(inStep(*pair.child));
}

void tst_graphicstext::pairsAndMarks()
{
    Pair pair(makeRecord(QString::fromUtf8("a")));
    typeText(*pair.child, QString());
    typeTextAt(*pair.child, 1, QString::fromUtf8("😀"));
    QCOMPARE(pair.record().textItems().size(), size_t(3));
    QCOMPARE(pair.record().textItems()[1]->getText(), std::string("😀"));
    QCOMPARE(pair.record().textItems()[2]->getText(), std::string());
    // Typed in two halves, as some keyboards do.
    typeText(*pair.child, QString(QChar(0xD83D)));
    QTextCursor cursor = pair.child->textCursor();
    cursor.movePosition(QTextCursor::End);
    cursor.deletePreviousChar();
    QVERIFY(int(pair.record().textItems().size()) == pair.child->document()->characterCount() - 1);
    emptyText(*pair.child);
    QVERIFY(inStep(*pair.child));
}

void tst_graphicstext::pastedTextIsPlain()
{
    Pair pair(makeRecord("a"));
    QGraphicsView view(&pair.scene);
    view.show();
    QVERIFY(QTest::qWaitForWindowActive(&view, PATIENCE_MS));
    pair.child->initNewTextSelectAll();
    auto* rich = new QMimeData;
    rich->setHtml("<table><tr><td><b>x</b></td></tr></table><ul><li>y</li></ul>");
    rich->setText("x\ny");
    QGuiApplication::clipboard()->setMimeData(rich);
    QTest::keyClick(view.viewport(), Qt::Key_End);
    QTest::keySequence(&view, QKeySequence::Paste);
    QCOMPARE(pair.child->toPlainText(), QStringLiteral("ax\ny"));
    QVERIFY(inStep(*pair.child));
}

void tst_graphicstext::replacedSelectionIsOneStep()
{
    Pair pair(makeRecord("abcd"));
    QSignalSpy edited(pair.child, &GraphicsText::signalObjectContentsEdited);
    selectRange(*pair.child, 1, 3);
    typeText(*pair.child, "X");
    QCOMPARE(pair.child->toPlainText(), QStringLiteral("aXd"));
    QCOMPARE(edited.count(), 1);
    QVERIFY(inStep(*pair.child));
}

void tst_graphicstext::typingBurstIsOneStep()
{
    Pair pair(makeRecord("ab"));
    QString before;
    QString after;
    connect(pair.child, &GraphicsText::signalObjectContentsEdited, this,
            [&before, &after](TText* oldText, TText* newText) {
                before = textOfStyles(*oldText);
                after = textOfStyles(*newText);
            });
    QSignalSpy edited(pair.child, &GraphicsText::signalObjectContentsEdited);
    typeTextAt(*pair.child, 2, "c");
    typeText(*pair.child, "d");
    QCOMPARE(edited.count(), 0);
    pair.child->pushLastEditTextIntoStack();
    QCOMPARE(edited.count(), 1);
    QCOMPARE(before, QStringLiteral("ab"));
    QCOMPARE(after, QStringLiteral("abcd"));
    pair.child->pushLastEditTextIntoStack();
    QCOMPARE(edited.count(), 1);
    // Typing that is deleted again does not make an undo step.
    typeText(*pair.child, "e");
    QTextCursor cursor = pair.child->textCursor();
    cursor.deletePreviousChar();
    pair.child->slotUndoTimeOut();
    QCOMPARE(edited.count(), 1);
}

void tst_graphicstext::partStyleKeepsSelectionDirection()
{
    Pair pair(makeRecord("abcdef"));
    TText source = makeSource(makeStyle("", "KST", 40), 6);
    selectRange(*pair.child, 4, 1);
    pair.child->changePartStyleWhenHasSelection(&source, 1, 1);
    QCOMPARE(pair.child->textCursor().anchor(), 4);
    QCOMPARE(pair.child->textCursor().position(), 1);
    QCOMPARE(pair.record().textItems()[0]->getFontSize(), 96);
    QCOMPARE(pair.record().textItems()[1]->getFontSize(), 40);
    QCOMPARE(pair.record().textItems()[3]->getFontSize(), 40);
    QCOMPARE(pair.record().textItems()[4]->getFontSize(), 96);
    QVERIFY(inStep(*pair.child));

    selectRange(*pair.child, 0, 6);
    pair.child->changePartStyleWhenHasSelection(&source, 1, 1);
    QCOMPARE(pair.child->textCursor().anchor(), 0);
    QCOMPARE(pair.child->textCursor().position(), 6);
    QCOMPARE(pair.record().textItems().size(), size_t(6));
    QTextCursor cursor(pair.child->document());
    cursor.setPosition(3);
    QCOMPARE(cursor.charFormat().intProperty(QTextFormat::FontPixelSize), 27);
}

void tst_graphicstext::partStyleStopsAtShortSource()
{
    Pair pair(makeRecord("abcd"));
    TText source = makeSource(makeStyle("", "KST", 40), 2);
    selectRange(*pair.child, 0, 4);
    pair.child->changePartStyleWhenHasSelection(&source, 1, 1);
    QCOMPARE(pair.record().textItems()[1]->getFontSize(), 40);
    QCOMPARE(pair.record().textItems()[2]->getFontSize(), 96);
    QCOMPARE(pair.child->toPlainText(), QStringLiteral("abcd"));
    QVERIFY(inStep(*pair.child));
}

void tst_graphicstext::previewAndCommit()
{
    Pair pair(makeRecord("ab"));
    std::vector<std::string> before;
    connect(pair.child, &GraphicsText::signalObjectContentsEdited, this,
            [&before](TText* oldText) { before.push_back(oldText->textItems()[0]->getFontColor()); });
    TextStyle red = makeStyle("");
    red.setFontColor("#FF0000");
    TextStyle blue = makeStyle("");
    blue.setFontColor("#0000FF");
    TText preview = makeSource(red, 2);
    TText commit = makeSource(blue, 2);
    selectRange(*pair.child, 0, 2);
    pair.child->changePartStyleWhenHasSelection(&preview, 4, 0);
    QCOMPARE(pair.record().textItems()[0]->getFontColor(), std::string("#FF0000"));
    QVERIFY(before.empty());
    pair.child->changePartStyleWhenHasSelection(&commit, 4, 1);
    QCOMPARE(before.size(), size_t(1));
    QCOMPARE(before[0], std::string("#FFFFFF"));
    pair.child->changePartStyleWhenHasSelection(&preview, 4, 2);
    QCOMPARE(before.size(), size_t(1));
    QCOMPARE(pair.record().textItems()[1]->getFontColor(), std::string("#FF0000"));
}

void tst_graphicstext::secondCommitGoesBackToTheFirst()
{
    Pair pair(makeRecord("ab"));
    std::vector<int> before;
    connect(pair.child, &GraphicsText::signalObjectContentsEdited, this,
            [&before](TText* oldText) { before.push_back(oldText->textItems()[0]->getFontSize()); });
    TText first = makeSource(makeStyle("", "KST", 40), 2);
    TText second = makeSource(makeStyle("", "KST", 50), 2);
    selectRange(*pair.child, 0, 2);
    pair.child->changePartStyleWhenHasSelection(&first, 1, 1);
    pair.child->changePartStyleWhenHasSelection(&second, 1, 1);
    QCOMPARE(before, std::vector<int>({96, 40}));
}

void tst_graphicstext::overallChange()
{
    Pair pair(makeRecord("abc"));
    QSignalSpy edited(pair.child, &GraphicsText::signalObjectContentsEdited);
    QSignalSpy modes(pair.child, &GraphicsText::signalNotifyTextPropertyAreaObjectSelectionMode);
    TText source = makeSource(makeStyle(""), 1);
    source.setShadowStyle(1);
    source.getTextShadow()->setShadowDirectionX(4);
    source.getTextShadow()->setShadowDirectionY(4);
    pair.child->changeAllStyleWhenHasSelection(&source, 8);
    QCOMPARE(edited.count(), 1);
    QCOMPARE(modes.last(), QVariantList({true, true}));
    QCOMPARE(pair.record().getShadowStyle(), 1);
    QCOMPARE(pair.record().getTextShadow()->getShadowDirectionX(), 12);
    QCOMPARE(pair.child->getFocusFlag(), 1);
    QCOMPARE(pair.child->textInteractionFlags(), Qt::NoTextInteraction);
    QCOMPARE(pair.child->getStatusId(), 0);
    QCOMPARE(pair.parent->getFocusFlag(), 1);
    QVERIFY(inStep(*pair.child));
}

void tst_graphicstext::savedStyleForNextCharacter()
{
    Pair pair(makeRecord("ab"));
    pair.child->initNewTextSelectAll();
    QTextCursor cursor = pair.child->textCursor();
    cursor.setPosition(1);
    pair.child->setTextCursor(cursor);
    TText style = makeSource(makeStyle("", "DejaVu Sans", 33), 1);
    style.setTextAlign(0);
    int shown = 0;
    connect(pair.child, &GraphicsText::signalNotifyPropertyAreaObjectSelectionStyleChange, this,
            [&shown](TText* text) { shown = text->textItems()[0]->getFontSize(); });

    pair.child->saveStyleForNextInsert(&style, 0, 1);
    pair.child->showCurrentTextStyle();
    QCOMPARE(shown, 96);

    pair.child->saveStyleForNextInsert(&style, 1, 0);
    pair.child->showCurrentTextStyle();
    QCOMPARE(shown, 33);
    typeText(*pair.child, "x");
    QCOMPARE(pair.record().textItems()[1]->getFontSize(), 33);
    QCOMPARE(pair.record().textItems()[1]->getFontFamily(), std::string("DejaVu Sans"));
    QCOMPARE(pair.record().getTextAlign(), 0);
    QCOMPARE(InputLanguageFonts::LAST_KEEPED_FONT[4][InputLanguageFonts::Latin],
             QStringLiteral("DejaVu Sans"));

    // Moving the caret drops the style for the next character.
    pair.child->saveStyleForNextInsert(&style, 1, 1);
    cursor = pair.child->textCursor();
    cursor.setPosition(0);
    pair.child->setTextCursor(cursor);
    pair.child->showCurrentTextStyle();
    QCOMPARE(shown, 96);
    typeText(*pair.child, "y");
    QCOMPARE(pair.record().textItems()[0]->getFontSize(), 96);
}

void tst_graphicstext::statusIds()
{
    Pair pair(makeRecord("ab"));
    QCOMPARE(pair.child->getStatusId(), -1);
    pair.child->changeItemToSolidLineState();
    QCOMPARE(pair.child->getStatusId(), 0);
    QCOMPARE(pair.child->getBoundingLineStatus(), 1);
    pair.child->initNewTextSelectAll();
    QCOMPARE(pair.child->getStatusId(), 2);
    QCOMPARE(pair.child->getBoundingLineStatus(), 0);
    selectRange(*pair.child, 0, 1);
    QCOMPARE(pair.child->getStatusId(), 1);
}

void tst_graphicstext::moveByPanel()
{
    Pair pair(makeRecord("abc"));
    pair.child->changeItemToSolidLineState();
    QSignalSpy moved(pair.child, &GraphicsText::signalObjectPositionChanged);
    TText source = makeSource(makeStyle(""), 1);
    source.setXValue(310.0F);
    source.setYValue(220.0F);
    pair.child->changeAllStyleWhenSelectionMode(&source, 11, true, 1);
    QCOMPARE(pair.parent->pos(), QPointF(310.0, 220.0));
    QCOMPARE(pair.record().getXValue(), 310.0F);
    QCOMPARE(moved.count(), 1);
    QCOMPARE(moved.at(0).at(1).toPointF(), QPointF(300.0, 200.0));
    QCOMPARE(moved.at(0).at(2).toPointF(), QPointF(310.0, 220.0));

    // An object that is moved too far to the right stays inside by a hundred pixels.
    source.setXValue(5000.0F);
    pair.child->changeAllStyleWhenSelectionMode(&source, 11, true, 1);
    QCOMPARE(pair.parent->x(), TextObjectConstants::SCENE_RECT.width() - 100.0);
    source.setXValue(-5000.0F);
    pair.child->changeAllStyleWhenSelectionMode(&source, 11, true, 1);
    QCOMPARE(pair.parent->x(), -(pair.child->layoutRect().width() - 100.0));
}

void tst_graphicstext::alignKeepsTheAnchor_data()
{
    QTest::addColumn<int>("align");
    QTest::addColumn<double>("anchor");
    QTest::newRow("left") << -1 << 0.0;
    QTest::newRow("centre") << 0 << 0.5;
    QTest::newRow("right") << 1 << 1.0;
}

void tst_graphicstext::alignKeepsTheAnchor()
{
    QFETCH(int, align);
    QFETCH(double, anchor);
    TText record = makeRecord("ab");
    record.setTextAlign(align);
    Pair pair(record);
    const auto place = [&pair, anchor] {
        return pair.parent->x() + anchor * pair.child->layoutRect().width();
    };
    const double before = place();
    QCOMPARE(pair.parent->x(), 300.0);
    typeTextAt(*pair.child, 2, "WWW");
    QVERIFY(qAbs(place() - before) < 0.01);
    typeText(*pair.child, "\nshort");
    QVERIFY(qAbs(place() - before) < 0.01);
    QTextCursor cursor = pair.child->textCursor();
    for (int i = 0; i < 6; ++i)
        cursor.deletePreviousChar();
    QVERIFY(qAbs(place() - before) < 0.01);
    QCOMPARE(pair.record().getXValue(), float(pair.parent->x()));

    // The shorter line stands where the alignment says.
    typeText(*pair.child, "\ni");
    const QTextBlock last = pair.child->document()->lastBlock();
    const QTextLine line = last.layout()->lineAt(0);
    double widest = 0.0;
    for (QTextBlock block = pair.child->document()->begin(); block.isValid(); block = block.next())
        widest = qMax(widest, block.layout()->lineAt(0).naturalTextWidth());
    const double slack = widest - line.naturalTextWidth();
    QVERIFY(slack > 1.0);
    QVERIFY(qAbs(line.cursorToX(0) - line.x() - slack * anchor) < 1.0);
}

void tst_graphicstext::shadowEffect()
{
    TText record = makeRecord("ab", 1, "KST", 52);
    record.setShadowStyle(3);
    record.getTextShadow()->setShadowDirectionX(-4);
    record.getTextShadow()->setShadowDirectionY(4);
    Pair pair(record);
    QGraphicsDropShadowEffect* effect = pair.child->shadowEffect();
    QVERIFY(effect->isEnabled());
    QCOMPARE(effect->color(), QColor(0, 0, 0, 190));
    QCOMPARE(effect->xOffset(), -8.0 * TextObjectConstants::SCENEPERCENTAGE);
    QCOMPARE(effect->yOffset(), 8.0 * TextObjectConstants::SCENEPERCENTAGE);
    QCOMPARE(effect->blurRadius(), 32.0);
    QCOMPARE(pair.child->graphicsEffect(), effect);
    QVERIFY(!pair.parent->graphicsEffect()->isEnabled());

    Pair none(makeRecord("ab"));
    QVERIFY(!none.child->shadowEffect()->isEnabled());
    emptyText(*pair.child);
    QVERIFY(pair.child->shadowEffect()->isEnabled());
}

void tst_graphicstext::missingFamily()
{
    TText record = makeRecord("ab", 1, "No Such Family");
    auto* item = new GraphicsText(&record, 0, nullptr, nullptr);
    const std::unique_ptr<GraphicsText> owner(item);
    QStringList reported;
    connect(item, &GraphicsText::signalShowMessageWhenUsingDefaultFont, this,
            [&reported](const QString& family) { reported.append(family); });
    item->initShowText();
    QVERIFY(!reported.isEmpty());
    QCOMPARE(reported.first(), QStringLiteral("No Such Family"));
    QCOMPARE(item->getItemTText()->textItems()[0]->getFontFamily(), std::string("KST Japanese Pro"));
    QCOMPARE(item->getItemTText()->textItems()[1]->getFontFamily(), std::string("KST Japanese Pro"));

    TText nameless = makeRecord("a", 1, "");
    GraphicsText other(&nameless, 0, nullptr, nullptr);
    QSignalSpy spy(&other, &GraphicsText::signalShowMessageWhenUsingDefaultFont);
    other.initShowText();
    QCOMPARE(spy.count(), 1);

    InputLanguageFonts::IS_CN_MODULE = true;
    TText again = makeRecord("a", 1, "No Such Family");
    GraphicsText china(&again, 0, nullptr, nullptr);
    china.initShowText();
    QCOMPARE(china.getItemTText()->textItems()[0]->getFontFamily(), std::string("DFHeiW5-A"));
}

void tst_graphicstext::formatOfACharacter()
{
    TextStyle style = makeStyle("a", "KST", 64);
    style.setFontBold(1);
    style.setIsTextItalic(1);
    style.setTextKerning(120);
    style.setFontColor("#FF8000");
    const QTextCharFormat format = CharacterFormat::layoutFormat(style, TextObjectConstants::SCENEPERCENTAGE);
    QCOMPARE(format.intProperty(QTextFormat::FontPixelSize), 43);
    QCOMPARE(format.fontWeight(), int(QFont::Bold));
    QVERIFY(format.fontItalic());
    QCOMPARE(format.fontLetterSpacingType(), QFont::PercentageSpacing);
    QCOMPARE(format.fontLetterSpacing(), 120.0);
    QCOMPARE(format.foreground().color(), QColor(255, 128, 0, 0));
    QCOMPARE(format.textOutline().style(), Qt::NoPen);
    QVERIFY(format.hasProperty(QTextFormat::TextOutline));
    style.setIsTextEdge(1);
    QVERIFY(!CharacterFormat::layoutFormat(style, 1.0).hasProperty(QTextFormat::TextOutline));
    TEdge edge;
    edge.setEdgeWidth(4);
    style.setTextEdge(edge);
    QCOMPARE(CharacterFormat::outlineWidth(style, TextObjectConstants::SCENEPERCENTAGE), 5);
    QCOMPARE(CharacterFormat::font(style, 1.0).pixelSize(), 64);
    style.setFontSize(-3);
    QCOMPARE(CharacterFormat::pixelSize(style, 1.0), 1);
}

void tst_graphicstext::resetShowsTheRecord()
{
    Pair pair(makeRecord("abc"));
    typeTextAt(*pair.child, 3, "def");
    TText record = makeRecord("xy\nz");
    record.setXValue(11.0F);
    record.setYValue(22.0F);
    QSignalSpy edited(pair.child, &GraphicsText::signalObjectContentsEdited);
    pair.child->resetDocument(&record, 2);
    QCOMPARE(pair.child->toPlainText(), QStringLiteral("xy\nz"));
    QVERIFY(pair.record() == record);
    QCOMPARE(pair.parent->pos(), QPointF(11.0, 22.0));
    QCOMPARE(pair.child->textCursor().position(), 2);
    pair.child->resetDocument(&record, 4000);
    QCOMPARE(pair.child->textCursor().position(), 4);
    pair.child->resetDocument(nullptr, 0);
    QCOMPARE(edited.count(), 0);
    QVERIFY(inStep(*pair.child));
}

void tst_graphicstext::textListIsACopy()
{
    Pair pair(makeRecord("ab"));
    typeTextAt(*pair.child, 2, "c");
    const std::unique_ptr<TText> copy(pair.child->getTextList());
    QCOMPARE(copy->getText(), std::string("abc"));
    QCOMPARE(copy->textItems().size(), size_t(3));
    QVERIFY(copy->textItems()[0] != pair.record().textItems()[0]);
}

void tst_graphicstext::hostileRecord()
{
    TText record = makeRecord(QString(400, 'x'));
    record.setTextAlign(77);
    record.setXValue(-1e20F);
    record.getTextShadow()->setShadowDirectionX(2147483647);
    for (TextStyle* style : record.textItems()) {
        style->setFontSize(2147483647);
        style->setTextKerning(-2147483647);
        style->setFontColor("no colour");
        style->setIsTextEdge(1);
        TEdge edge;
        edge.setEdgeWidth(2147483647);
        edge.setEdgeColor("");
        style->setTextEdge(edge);
    }
    GraphicsText item(&record, 0, nullptr, nullptr);
    item.initShowText();
    QCOMPARE(item.toPlainText().size(), 300);
    QVERIFY(inStep(item));
    item.getSelectionInfo(-5, 1 << 30, 1 << 30, 1);
    QVERIFY(item.textCursor().selectionEnd() <= 300);
    item.getSelectionInfo(0, 0, -1, 0);
    QCOMPARE(item.textCursor().position(), 0);
    item.getSelectionInfo(0, 0, 0, 77);
}

QTEST_MAIN(tst_graphicstext)
#include "tst_graphicstext.moc"
