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

QImage picture(QGraphicsScene& scene)
{
    QImage image(1280, 720, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    scene.render(&painter, QRectF(0, 0, 1280, 720), QRectF(0, 0, 1280, 720));
    return image;
}

// Pixels that are nearly the colour.
int count(const QImage& image, const QColor& color)
{
    int found = 0;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            const QColor pixel = image.pixelColor(x, y);
            if (pixel.alpha() > 200 && qAbs(pixel.red() - color.red()) < 16 &&
                qAbs(pixel.green() - color.green()) < 16 && qAbs(pixel.blue() - color.blue()) < 16)
                ++found;
        }
    }
    return found;
}

// The rectangle around all pixels that are not transparent.
QRect paintedRect(const QImage& image)
{
    QRect painted;
    for (int y = 0; y < image.height(); ++y)
        for (int x = 0; x < image.width(); ++x)
            if (qAlpha(image.pixel(x, y)) > 0)
                painted |= QRect(x, y, 1, 1);
    return painted;
}

// Whether the ink covers all that is painted, and reaches at most two pixels farther.
bool isInk(const QRectF& ink, const QRect& painted)
{
    const QRectF within = QRectF(painted).adjusted(1.0, 1.0, -1.0, -1.0);
    const QRectF around = QRectF(painted).adjusted(-2.0, -2.0, 2.0, 2.0);
    return ink.contains(within) && around.contains(ink);
}

} // namespace

// Geometry and looks of a text object.
class tst_textpainter : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void boundingRectIsCropped();
    void marginsFollowTheTallestLine();
    void glyphsAreDrawnOnce();
    void outlineUnderGlyphs();
    void everyScriptLeavesInk_data();
    void everyScriptLeavesInk();
    void inkOfAllParagraphs();
    void frames();
    void unpaintedCaretOfDocument();
    void paintedInAViewInsideAWindow();
    void caretPoints();
};

void tst_textpainter::init()
{
    InputLanguageFonts::resetLastFonts();
    InputLanguageFonts::mInputLanguage = 2;
    InputLanguageFonts::IS_CN_MODULE = false;
}

void tst_textpainter::boundingRectIsCropped()
{
    TText record = makeRecord(QString(60, 'W'));
    GraphicsText item(&record, 0, nullptr, nullptr);
    item.initShowText();
    QVERIFY(item.layoutRect().width() > 1700.0);
    QCOMPARE(item.boundingRect(), item.layoutRect());
    item.setBoundingRectFlag(true);
    item.setPos(200.0, 0.0);
    QCOMPARE(item.boundingRect().left(), 0.0);
    QCOMPARE(item.boundingRect().right(), 1280.0 + 100.0 - 200.0);
    item.setPos(-500.0, 0.0);
    QCOMPARE(item.boundingRect().left(), 400.0);
    QCOMPARE(item.boundingRect().right(), 1280.0 + 100.0 + 500.0);
    item.setPos(0.0, -150.0);
    QCOMPARE(item.boundingRect().top(), 50.0);
    item.setBoundingRectFlag(false);
    QCOMPARE(item.boundingRect(), item.layoutRect());
}

void tst_textpainter::marginsFollowTheTallestLine()
{
    TText record = makeRecord("ab\ncd");
    record.textItems()[3]->setFontSize(200);
    Pair pair(record);
    double tallest = 0.0;
    for (QTextBlock block = pair.child->document()->begin(); block.isValid(); block = block.next())
        tallest = qMax(tallest, block.layout()->lineAt(0).height());
    for (QTextBlock block = pair.child->document()->begin(); block.isValid(); block = block.next()) {
        QCOMPARE(block.blockFormat().leftMargin(), 0.3 * tallest);
        QCOMPARE(block.blockFormat().rightMargin(), 0.3 * tallest);
        QCOMPARE(block.layout()->lineCount(), 1);
    }
    QCOMPARE(pair.parent->layoutRect().width(), pair.child->layoutRect().width());
}

void tst_textpainter::glyphsAreDrawnOnce()
{
    TText record = makeRecord("IIII");
    for (TextStyle* style : record.textItems())
        style->setFontColor("#00FF00");
    Pair pair(record);
    const int green = count(picture(pair.scene), QColor(0, 255, 0));
    QVERIFY(green > 300);
    // The glyphs of the document itself are not painted, so no other colour is found.
    QCOMPARE(count(picture(pair.scene), QColor(0, 0, 0)), 0);
    typeTextAt(*pair.child, 4, "I");
    QVERIFY(count(picture(pair.scene), QColor(0, 255, 0)) > green);
    TextStyle blue = makeStyle("");
    blue.setFontColor("#0000FF");
    TText source = makeSource(blue, 5);
    selectRange(*pair.child, 0, 5);
    pair.child->changePartStyleWhenHasSelection(&source, 4, 1);
    selectRange(*pair.child, 0, 0);
    QCOMPARE(count(picture(pair.scene), QColor(0, 255, 0)), 0);
    QVERIFY(count(picture(pair.scene), QColor(0, 0, 255)) > green);
}

void tst_textpainter::outlineUnderGlyphs()
{
    TText record = makeRecord("HHHH");
    TEdge edge;
    edge.setEdgeWidth(6);
    edge.setEdgeColor("#FF0000");
    for (TextStyle* style : record.textItems()) {
        style->setIsTextEdge(1);
        style->setTextEdge(edge);
        style->setTextKerning(90);
    }
    Pair outlined(record);
    for (TextStyle* style : record.textItems())
        style->setIsTextEdge(0);
    Pair plain(record);
    const QImage with = picture(outlined.scene);
    const QImage without = picture(plain.scene);
    QVERIFY(count(with, QColor(255, 0, 0)) > 500);
    QCOMPARE(count(without, QColor(255, 0, 0)), 0);
    // No outline covers a glyph, not even that of a neighbour.
    int covered = 0;
    int white = 0;
    for (int y = 0; y < without.height(); ++y) {
        for (int x = 0; x < without.width(); ++x) {
            if (without.pixel(x, y) != 0xFFFFFFFF)
                continue;
            ++white;
            covered += with.pixel(x, y) != 0xFFFFFFFF;
        }
    }
    QVERIFY(white > 500);
    QCOMPARE(covered, 0);
}

void tst_textpainter::everyScriptLeavesInk_data()
{
    QTest::addColumn<QString>("text");
    QTest::newRow("Latin") << QStringLiteral("Breaking");
    QTest::newRow("Chinese") << QString::fromUtf8("快讯");
    QTest::newRow("Japanese") << QString::fromUtf8("速報");
    QTest::newRow("Korean") << QString::fromUtf8("속보");
    QTest::newRow("mark") << QString::fromUtf8("e\u0301");
}

void tst_textpainter::everyScriptLeavesInk()
{
    QFETCH(QString, text);
    Pair pair(makeRecord(text));
    QVERIFY(count(picture(pair.scene), QColor(255, 255, 255)) > 100);
}

void tst_textpainter::inkOfAllParagraphs()
{
    // The longest line is the second one, with an outline; the last one has a descender.
    TText record = makeRecord("I\nWWW\ng");
    TEdge edge;
    edge.setEdgeWidth(6);
    for (std::size_t i = 2; i < 5; ++i) {
        record.textItems()[i]->setIsTextEdge(1);
        record.textItems()[i]->setTextEdge(edge);
    }
    Pair pair(record);
    const auto ink = [&] { return pair.child->mapRectToScene(pair.child->inkRect()); };
    const QRectF before = ink();
    QVERIFY(isInk(before, paintedRect(picture(pair.scene))));
    typeTextAt(*pair.child, 1, "IIIIIIIIIIIIIIIIIIII");
    QVERIFY(ink().width() > before.width() + 20.0);
    QVERIFY(isInk(ink(), paintedRect(picture(pair.scene))));
    TText blank = makeRecord(" \n ");
    QVERIFY(Pair(blank).child->inkRect().isEmpty());
}

void tst_textpainter::frames()
{
    Pair pair(makeRecord("ab"));
    const QImage none = picture(pair.scene);
    pair.child->changeItemToSolidLineState();
    const QImage solid = picture(pair.scene);
    QVERIFY(solid != none);
    QVERIFY(count(solid, QColor("#0099FF")) > 200);
    pair.child->initNewTextSelectAll();
    const QImage dotted = picture(pair.scene);
    QCOMPARE(count(dotted, QColor("#0099FF")), 0);
    QVERIFY(count(dotted, QColor("#3366FF")) > 50);
    // The caret.
    QVERIFY(count(dotted, QColor(0, 232, 0)) > 20);
    QCOMPARE(count(solid, QColor(0, 232, 0)), 0);
}

void tst_textpainter::unpaintedCaretOfDocument()
{
    Pair pair(makeRecord("ab"));
    pair.child->initNewTextSelectAll();
    picture(pair.scene);
    // Painting leaves the state alone.
    QCOMPARE(pair.child->textInteractionFlags(), Qt::TextEditorInteraction);
    QVERIFY(pair.child->flags() & QGraphicsItem::ItemIsFocusable);
    selectRange(*pair.child, 0, 2);
    const QImage selected = picture(pair.scene);
    QVERIFY(count(selected, QGuiApplication::palette().color(QPalette::Inactive, QPalette::Highlight)) +
                count(selected, QGuiApplication::palette().color(QPalette::Active, QPalette::Highlight)) >
            100);
}

void tst_textpainter::paintedInAViewInsideAWindow()
{
    TText record = makeRecord("HHHH");
    record.setXValue(900.0F);
    Pair pair(record);
    const int whole = count(picture(pair.scene), QColor(255, 255, 255));
    QVERIFY(whole > 500);
    // The picture does not depend on the place of the view in its window.
    QWidget window;
    window.setStyleSheet("background-color:black");
    window.resize(1900, 850);
    QGraphicsView view(&pair.scene, &window);
    view.setFrameStyle(0);
    view.setRenderHint(QPainter::Antialiasing);
    view.setGeometry(600, 100, 1280, 720);
    window.show();
    QVERIFY(QTest::qWaitForWindowExposed(&window, PATIENCE_MS));
    QVERIFY(count(window.grab().toImage(), QColor(255, 255, 255)) >= whole * 9 / 10);
}

void tst_textpainter::caretPoints()
{
    Pair pair(makeRecord("ab\ncd\n"));
    CaretGeometry carets(*pair.child->document());
    QLineF line;
    QPointF point;
    int block = -7;
    QVERIFY(!carets.caretPoint(line, point, block, -1));
    QVERIFY(!carets.caretPoint(line, point, block, 99));
    QCOMPARE(block, -7);
    const QTextDocument& document = *pair.child->document();
    const QTextLine first = document.begin().layout()->lineAt(0);
    QVERIFY(carets.caretPoint(line, point, block, 1));
    QCOMPARE(block, 0);
    QCOMPARE(line.x1(), first.cursorToX(1) + 1.0 + 27.0);
    QCOMPARE(line.y2(), first.height() + 27.0);
    QCOMPARE(line.length(), first.height());
    QCOMPARE(point, QPointF(line.x1() - 12.0, line.y2()));
    QVERIFY(carets.caretPoint(line, point, block, 4));
    QCOMPARE(block, 1);
    QCOMPARE(line.y2(), 2.0 * first.height() + 27.0);
    QVERIFY(carets.caretPoint(line, point, block, 6));
    QCOMPARE(block, 2);
    QCOMPARE(line.y2(), pair.child->layoutRect().height() - 3.0 - 27.0);
}

QTEST_MAIN(tst_textpainter)
#include "tst_textpainter.moc"
