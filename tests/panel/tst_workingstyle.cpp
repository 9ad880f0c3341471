#include "panel/WorkingStyle.h"

#include <QTest>
#include <functional>

// The panel's copy of the style of what is selected.
class tst_workingstyle : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void changesReachEveryCharacter_data();
    void changesReachEveryCharacter();
    void listsReachTheirCharacters();
    void edgeKeepsTheRest();
    void shadows();
    void place();
    void nothingWithoutACopy();
    void nextRunStartsWithTheFirstCharacter();
};

using Change = std::function<void(WorkingStyle&)>;
using Value = std::function<QString(const TextStyle&)>;
Q_DECLARE_METATYPE(Change)
Q_DECLARE_METATYPE(Value)

namespace
{

// Three characters with values of their own.
TText mixed()
{
    std::vector<TextStyle*> items;
    for (int i = 0; i < 3; ++i) {
        auto item = std::make_unique<TextStyle>();
        item->setFontFamily("Family" + std::to_string(i));
        item->setFontSize(40 + i);
        item->setFontColor("#00000" + std::to_string(i));
        item->setTextKerning(90 + i);
        TEdge edge;
        edge.setEdgeWidth(2 + i);
        edge.setEdgeColor("#FFFFF" + std::to_string(i));
        item->setTextEdge(edge);
        items.push_back(item.release());
    }
    TText record;
    record.setXValue(100.0F);
    record.setYValue(200.0F);
    record.setTextAlign(-1);
    record.setTextItems(std::move(items));
    return record;
}

const TextStyle& character(const WorkingStyle& style, size_t index)
{
    return *style.record()->textItems()[index];
}

} // namespace

void tst_workingstyle::changesReachEveryCharacter_data()
{
    QTest::addColumn<Change>("change");
    QTest::addColumn<Value>("value");
    QTest::addColumn<QString>("expected");
    QTest::newRow("family") << Change([](WorkingStyle& s) {
        s.setFamily("KST");
    }) << Value([](const TextStyle& c) { return QString::fromStdString(c.getFontFamily()); })
                            << "KST";
    QTest::newRow("bold") << Change([](WorkingStyle& s) { s.setBold(1); })
                          << Value([](const TextStyle& c) { return QString::number(c.isFontBold()); }) << "1";
    QTest::newRow("italic") << Change([](WorkingStyle& s) { s.setItalic(1); })
                            << Value([](const TextStyle& c) { return QString::number(c.isTextItalic()); })
                            << "1";
    QTest::newRow("colour") << Change([](WorkingStyle& s) {
        s.setColor("#123456");
    }) << Value([](const TextStyle& c) { return QString::fromStdString(c.getFontColor()); })
                            << "#123456";
    QTest::newRow("kerning") << Change([](WorkingStyle& s) { s.setKerning(110); })
                             << Value([](const TextStyle& c) { return QString::number(c.getTextKerning()); })
                             << "110";
    QTest::newRow("edge") << Change([](WorkingStyle& s) { s.setEdge(1); })
                          << Value([](const TextStyle& c) { return QString::number(c.isTextEdge()); }) << "1";
}

void tst_workingstyle::changesReachEveryCharacter()
{
    QFETCH(Change, change);
    QFETCH(Value, value);
    QFETCH(QString, expected);
    WorkingStyle style;
    style.set(mixed());
    change(style);
    for (size_t i = 0; i < 3; ++i)
        QCOMPARE(value(character(style, i)), expected);
}

void tst_workingstyle::listsReachTheirCharacters()
{
    WorkingStyle style;
    style.set(mixed());
    style.setSizes({60, 70});
    QCOMPARE(character(style, 0).getFontSize(), 60);
    QCOMPARE(character(style, 1).getFontSize(), 70);
    QCOMPARE(character(style, 2).getFontSize(), 42);
    style.setSizes({1, 2, 3, 4, 5});
    QCOMPARE(character(style, 2).getFontSize(), 3);

    const QList<QString> colors = style.colors();
    QCOMPARE(colors, (QList<QString>{"#000000", "#000001", "#000002"}));
    style.setColor("#ABCDEF");
    style.setColors(colors);
    QCOMPARE(style.colors(), colors);
    const QList<QString> edges = style.edgeColors();
    QCOMPARE(edges, (QList<QString>{"#FFFFF0", "#FFFFF1", "#FFFFF2"}));
    style.setEdgeColor("#ABCDEF");
    style.setEdgeColors(edges.mid(0, 2));
    QCOMPARE(style.edgeColors(), (QList<QString>{"#FFFFF0", "#FFFFF1", "#ABCDEF"}));
}

void tst_workingstyle::edgeKeepsTheRest()
{
    WorkingStyle style;
    style.set(mixed());
    style.setEdgeWidth(9);
    QCOMPARE(character(style, 1).textEdge().getEdgeWidth(), 9);
    QCOMPARE(character(style, 1).textEdge().getEdgeColor(), std::string("#FFFFF1"));
    style.set(mixed());
    style.setEdgeColor("#ABCDEF");
    QCOMPARE(character(style, 1).textEdge().getEdgeWidth(), 3);
    QCOMPARE(character(style, 1).textEdge().getEdgeColor(), std::string("#ABCDEF"));
}

void tst_workingstyle::shadows()
{
    WorkingStyle style;
    style.set(mixed());
    for (int i = 0; i < WorkingStyle::shadows().size(); ++i) {
        style.setShadow(i);
        QCOMPARE(style.record()->getShadowStyle(), i);
        QVERIFY(*style.record()->getTextShadow() == WorkingStyle::shadows().at(i));
    }
    const int last = style.record()->getShadowStyle();
    style.setShadow(-1);
    style.setShadow(int(WorkingStyle::shadows().size()));
    QCOMPARE(style.record()->getShadowStyle(), last);
}

void tst_workingstyle::place()
{
    WorkingStyle style;
    style.set(mixed());
    style.moveBy(-10.0F, 2.0F);
    QCOMPARE(style.record()->getXValue(), 90.0F);
    QCOMPARE(style.record()->getYValue(), 202.0F);
    style.setAlign(1);
    QCOMPARE(style.record()->getTextAlign(), 1);
}

void tst_workingstyle::nothingWithoutACopy()
{
    WorkingStyle style;
    style.setFamily("KST");
    style.setAlign(1);
    style.setShadow(1);
    style.moveBy(1.0F, 1.0F);
    QVERIFY(!style.record());
    QVERIFY(style.colors().isEmpty());
    QVERIFY(style.edgeColors().isEmpty());
    QCOMPARE(style.fontStyle().getFamily(), FontStyle().getFamily());
    style.set(mixed());
    QVERIFY(*style.record() == mixed());
    style.clear();
    QVERIFY(!style.record());
}

void tst_workingstyle::nextRunStartsWithTheFirstCharacter()
{
    WorkingStyle style;
    style.set(mixed());
    style.setShadow(2);
    const FontStyle next = style.fontStyle();
    QCOMPARE(next.getFamily(), std::string("Family0"));
    QCOMPARE(next.getSize(), 40);
    QCOMPARE(next.getColor(), std::string("#000000"));
    QCOMPARE(next.getKerning(), 90);
    QCOMPARE(next.getEdgePoint()->getEdgeWidth(), 2);
    QCOMPARE(next.getAlign(), -1);
    QCOMPARE(next.getShadowStyle(), 2);
}

QTEST_APPLESS_MAIN(tst_workingstyle)
#include "tst_workingstyle.moc"
