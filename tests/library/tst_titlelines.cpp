// The lines of text of a title in the list: they look as labels do, and take the room they are given.
#include "library/TitleLines.h"

#include <QFontMetrics>
#include <QImage>
#include <QLabel>
#include <QTest>
#include <QTextLayout>
#include <QtMath>

class tst_titlelines : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void looksLikeALabel_data();
    void looksLikeALabel();
    void severalTexts();
    void paddingAndBackground();
    void narrowerLinesAreElided();

private:
    // Returns the height of the line, which may be more than that of its font, for substituted characters.
    static int lineHeight(const QString& text, const QFont& font)
    {
        QTextLayout layout(text, font);
        layout.beginLayout();
        const QTextLine line = layout.createLine();
        layout.endLayout();
        return line.isValid() ? qCeil(line.height()) : 0;
    }
    static TitleLines::Form form()
    {
        TitleLines::Form result;
        result.line = QSize(254, 33);
        result.fontHeight = 28;
        result.text = QColor(220, 220, 220);
        result.background = QColor(51, 51, 51);
        return result;
    }
};

void tst_titlelines::looksLikeALabel_data()
{
    QTest::addColumn<QString>("family");
    QTest::addColumn<QString>("text");
    QTest::newRow("Latin") << "KST" << QStringLiteral("Evening gjp");
    QTest::newRow("Chinese") << "KST" << QStringLiteral("快讯速報 news");
    QTest::newRow("Korean") << "KST" << QStringLiteral("생방송");
    QTest::newRow("from right to left") << "KST" << QStringLiteral("\u05d7\u05d3\u05e9\u05d5\u05ea 12");
    QTest::newRow("a tall family") << "DFHeiW5-A" << QStringLiteral("gjp 快讯");
    QTest::newRow("elided") << "KST" << QStringLiteral("Breaking news from the coast");
    QTest::newRow("nothing") << "KST" << QString();
}

void tst_titlelines::looksLikeALabel()
{
    QFETCH(const QString, family);
    QFETCH(const QString, text);
    TitleLines lines(form());
    lines.setFixedSize(form().line);
    lines.setTexts({text, QString()}, family);

    QWidget parent;
    parent.setFixedSize(form().line);
    parent.setStyleSheet(QStringLiteral("background: rgb(51, 51, 51); color: rgb(220, 220, 220);"));
    QLabel label(&parent);
    label.setTextFormat(Qt::PlainText);
    QFont font(family);
    font.setPixelSize(form().fontHeight);
    label.setFont(font);
    label.setFixedSize(form().line);
    label.setText(QFontMetrics(font).elidedText(text, Qt::ElideRight, form().line.width()));
    const bool fits = lineHeight(label.text(), font) <= form().line.height();
    label.setAlignment(Qt::AlignLeft | (fits ? Qt::AlignVCenter : Qt::AlignBottom));
    QCOMPARE(lines.lines().front(), label.text());
    QCOMPARE(lines.grab().toImage().convertToFormat(QImage::Format_RGB32),
             parent.grab().toImage().convertToFormat(QImage::Format_RGB32));
}

void tst_titlelines::severalTexts()
{
    TitleLines lines(form());
    const QStringList none = {QString(), QString(), QString(), QString()};
    QCOMPARE(lines.lines(), none);
    lines.setTexts({"a", " b\nc ", "d"}, "KST");
    QCOMPARE(lines.lines(), (QStringList{"a", "b c", "d", QString()}));
    lines.setTexts({"1", "2", "3", "4", "5"}, "KST");
    QCOMPARE(lines.lines(), (QStringList{"1", "2", "3", "4"}));
    lines.setTexts({}, "KST");
    QCOMPARE(lines.lines(), none);
}

void tst_titlelines::paddingAndBackground()
{
    TitleLines::Form padded = form();
    padded.top = 8;
    padded.padding = 12;
    TitleLines lines(padded);
    lines.setFixedSize(254, 150);
    lines.setTexts({QStringLiteral("█"), QStringLiteral("█")}, "KST");
    QCOMPARE(lines.lineRect(1), QRect(0, 8 + 33, 254, 33));
    QCOMPARE(lines.textRect(1), QRect(12, 8 + 33, 230, 33));
    const QImage look = lines.grab().toImage();
    for (int x = 0; x < 10; ++x)
        for (int y = 0; y < look.height(); ++y)
            QCOMPARE(look.pixelColor(x, y), padded.background);
    QCOMPARE(look.pixelColor(18, 8 + 16), padded.text);
    QCOMPARE(look.pixelColor(18, 8 + 33 + 16), padded.text);
    QCOMPARE(look.pixelColor(18, 4), padded.background);
}

void tst_titlelines::narrowerLinesAreElided()
{
    const QString text = QStringLiteral("Breaking news");
    TitleLines lines(form());
    lines.setTexts({text, QString()}, "KST");
    QCOMPARE(lines.lines().front(), text);
    lines.setLineWidth(100);
    QVERIFY(lines.lines().front().endsWith(QChar(0x2026)));
    lines.setLineWidth(254);
    QCOMPARE(lines.lines().front(), text);
}

QTEST_MAIN(tst_titlelines)
#include "tst_titlelines.moc"
