// How often a text object lays its document out, and that the result is that of a layout from scratch.
#include "TextPair.h"

#include <QAbstractTextDocumentLayout>
#include <QSignalSpy>
#include <QTest>
#include <QTextBlock>
#include <QTextLayout>
#include <functional>

namespace
{

constexpr int LEFT = -1;
constexpr int CENTRE = 0;
constexpr int RIGHT = 1;
const QString LINES = QStringLiteral("first\nthe longest line of all\n\nlast");

using Change = std::function<void(Pair&)>;

TText aligned(int align, const QString& text = LINES)
{
    TText record = makeRecord(text, 1, "KST", 60);
    record.setTextAlign(align);
    return record;
}

// Returns what makes the given property that of the style, for the characters from begin to before end.
Change restyle(int property, int begin, int end, const std::function<void(TextStyle&)>& set)
{
    return [=](Pair& pair) {
        TextStyle style = makeStyle("", "KST", 60);
        set(style);
        TText source = makeSource(style, end - begin);
        selectRange(*pair.child, begin, end);
        pair.child->changePartStyleWhenHasSelection(&source, property, 1);
    };
}

Change bold(int begin, int end)
{
    return restyle(TextObjectConstants::PropertyBold, begin, end, [](TextStyle& s) { s.setFontBold(1); });
}

Change size(int begin, int end, int size)
{
    return restyle(TextObjectConstants::PropertySize, begin, end,
                   [size](TextStyle& s) { s.setFontSize(size); });
}

Change color(int begin, int end)
{
    return restyle(TextObjectConstants::PropertyColor, begin, end,
                   [](TextStyle& s) { s.setFontColor("#00AA00"); });
}

Change typing(int position, const QString& text)
{
    return [=](Pair& pair) { typeTextAt(*pair.child, position, text); };
}

Change erasing(int position, int count)
{
    return [=](Pair& pair) {
        selectRange(*pair.child, position, position + count);
        pair.child->textCursor().removeSelectedText();
    };
}

// Returns the places of all lines, and the size.
QStringList places(const GraphicsText& item)
{
    const auto text = [](double value) { return QString::number(value, 'f', 3); };
    const QRectF area = item.layoutRect();
    QStringList result{text(area.width()) + QLatin1Char('x') + text(area.height())};
    const QAbstractTextDocumentLayout* layout = item.document()->documentLayout();
    for (QTextBlock block = item.document()->begin(); block.isValid(); block = block.next()) {
        const double top = layout->blockBoundingRect(block).top();
        for (int i = 0; i < block.layout()->lineCount(); ++i) {
            const QTextLine line = block.layout()->lineAt(i);
            result += text(line.cursorToX(line.textStart())) + QLatin1Char(' ') + text(top + line.y()) +
                      QLatin1Char(' ') + text(line.height());
        }
    }
    return result;
}

} // namespace

class tst_recordlayout : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void layouts_data();
    void layouts();
    void undoLaysOutOnce();
    void isThatOfAFreshLayout_data();
    void isThatOfAFreshLayout();
    void parentIsAsWide_data();
    void parentIsAsWide();
};

void tst_recordlayout::init()
{
    InputLanguageFonts::resetLastFonts();
    InputLanguageFonts::mInputLanguage = 2;
    InputLanguageFonts::IS_CN_MODULE = false;
}

void tst_recordlayout::layouts_data()
{
    QTest::addColumn<int>("align");
    QTest::addColumn<Change>("change");
    QTest::addColumn<int>("expected");
    const int count = int(LINES.size());
    QTest::newRow("all bold") << LEFT << bold(0, count) << 1;
    QTest::newRow("a word bold") << LEFT << bold(6, 9) << 1;
    QTest::newRow("all larger") << LEFT << size(0, count, 90) << 1;
    QTest::newRow("all smaller") << LEFT << size(0, count, 30) << 1;
    QTest::newRow("a word larger") << LEFT << size(6, 9, 90) << 1;
    QTest::newRow("a colour") << LEFT << color(0, count) << 1;
    QTest::newRow("a colour, centred") << CENTRE << color(0, count) << 1;
    // Lines that are not at the left margin need the new width, which is known after a layout.
    QTest::newRow("all larger, centred") << CENTRE << size(0, count, 90) << 2;
    QTest::newRow("all bold, right") << RIGHT << bold(0, count) << 2;
    QTest::newRow("another record") << LEFT << Change([](Pair& pair) {
        TText other = aligned(LEFT, QStringLiteral("another text\nof two lines"));
        for (TextStyle* style : other.textItems())
            style->setFontSize(90);
        pair.child->resetDocument(&other, 0);
    }) << 1;
}

void tst_recordlayout::layouts()
{
    QFETCH(int, align);
    QFETCH(Change, change);
    QFETCH(int, expected);
    Pair pair(aligned(align));
    // The document asks for a repaint after every layout.
    const QSignalSpy layouts(pair.child->document()->documentLayout(), &QAbstractTextDocumentLayout::update);
    change(pair);
    QCOMPARE(layouts.count(), expected);
}

// Fallback fonts and lines of several fonts are taller than the tallest font of the record.
void tst_recordlayout::undoLaysOutOnce()
{
    TText record = aligned(LEFT, QStringLiteral("news \u5feb\u8baf\u901f\u5831 live\nmore"));
    record.textItems()[2]->setFontSize(80);
    record.textItems()[12]->setFontFamily("DejaVu Sans");
    Pair pair(record);
    const TText before = pair.record();
    bold(0, int(before.textItems().size()))(pair);
    const QSignalSpy layouts(pair.child->document()->documentLayout(), &QAbstractTextDocumentLayout::update);
    TText undone = before;
    pair.child->resetDocument(&undone, 0);
    QCOMPARE(layouts.count(), 1);
    QVERIFY(!pair.record().textItems()[0]->isFontBold());
}

void tst_recordlayout::isThatOfAFreshLayout_data()
{
    QTest::addColumn<int>("align");
    QTest::addColumn<Change>("change");
    const int count = int(LINES.size());
    for (const int align : {LEFT, CENTRE, RIGHT}) {
        const auto row = [align](const char* name, const Change& change) {
            QTest::addRow("%s, align %d", name, align) << align << change;
        };
        row("all bold", bold(0, count));
        row("a word bold", bold(6, 9));
        row("all larger", size(0, count, 90));
        row("all smaller", size(0, count, 30));
        row("the longest line larger", size(6, 29, 90));
        row("a colour", color(0, count));
        row("typed in the longest line", typing(29, "a"));
        row("typed in another line", typing(5, "a"));
        row("typed in the empty line", typing(30, "a"));
        row("a new line", typing(5, "\nb"));
        row("erased in the longest line", erasing(10, 2));
        row("erased in another line", erasing(0, 1));
        row("a line erased", erasing(0, 6));
        row("all erased", erasing(0, count));
        row("mirrored text", typing(0, QString(QChar(0x05D0)) + QChar(0x05D1)));
        row("mirrored text erased", [](Pair& pair) {
            typing(0, QString(QChar(0x05D0)))(pair);
            erasing(0, 1)(pair);
        });
    }
}

void tst_recordlayout::isThatOfAFreshLayout()
{
    QFETCH(int, align);
    QFETCH(Change, change);
    Pair pair(aligned(align));
    change(pair);
    const QStringList changed = places(*pair.child);
    TText record = pair.record();
    TText lastStyle = *pair.child->getLastAlpaTextStyleValue();
    Pair fresh(aligned(align));
    fresh.child->setLastAlpaTextStyleValue(lastStyle);
    fresh.child->resetDocument(&record, -1);
    QCOMPARE(changed, places(*fresh.child));
}

void tst_recordlayout::parentIsAsWide_data()
{
    QTest::addColumn<int>("align");
    QTest::newRow("left") << LEFT;
    QTest::newRow("centre") << CENTRE;
    QTest::newRow("right") << RIGHT;
}

void tst_recordlayout::parentIsAsWide()
{
    QFETCH(int, align);
    Pair pair(aligned(align));
    for (const Change& change : {typing(29, "more"), erasing(20, 9), size(6, 9, 90), erasing(0, 20)}) {
        change(pair);
        QCOMPARE(pair.parent->layoutRect().width(), pair.child->layoutRect().width());
    }
}

QTEST_MAIN(tst_recordlayout)
#include "tst_recordlayout.moc"
