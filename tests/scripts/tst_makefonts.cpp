#include <QFontDatabase>
#include <QFontInfo>
#include <QFontMetricsF>
#include <QImage>
#include <QPainter>
#include <QTest>

// The families that title files name must resolve to themselves wherever the project is built.
class tst_makefonts : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void family_data();
    void family();
    void applicationFontIsAnAliasOfKst();
    void boldIsARealFace();
    void nothingElseIsSeen();
    void everyScriptHasGlyphs_data();
    void everyScriptHasGlyphs();
};

void tst_makefonts::family_data()
{
    QTest::addColumn<QString>("name");
    for (const char* name :
         {"KST", "KST Japanese Pro", "DFHeiW5-A", "YDGothic 100 Pro", "Nimbus Sans L", "Nimbus Roman No9 L",
          "Nimbus Mono L", "DejaVu Sans", "DejaVu Serif", "URW Bookman L", "URW Gothic L", "URW Chancery L",
          "URW Palladio L", "IPAGothic", "IPAMincho", "IPAPGothic", "IPAPMincho"})
        QTest::newRow(name) << QString::fromLatin1(name);
}

void tst_makefonts::family()
{
    QFETCH(QString, name);
    QCOMPARE(QFontInfo(QFont(name)).family(), name);
    QVERIFY(QFontDatabase::families().contains(name));
}

void tst_makefonts::applicationFontIsAnAliasOfKst()
{
    QCOMPARE(QFontMetricsF(QFont("KST-Medium", 12)).horizontalAdvance("Titler"),
             QFontMetricsF(QFont("KST", 12)).horizontalAdvance("Titler"));
}

void tst_makefonts::boldIsARealFace()
{
    QFont bold("KST");
    bold.setWeight(QFont::Bold);
    QCOMPARE(QFontInfo(bold).weight(), int(QFont::Bold));
    QVERIFY(QFontMetricsF(bold).horizontalAdvance("Breaking") >
            QFontMetricsF(QFont("KST")).horizontalAdvance("Breaking"));
}

void tst_makefonts::nothingElseIsSeen()
{
    QCOMPARE(QFontDatabase::families().filter("Noto"), QStringList("Noto Color Emoji"));
    QVERIFY(!QFontDatabase::families().contains("DejaVu Sans Mono"));
}

void tst_makefonts::everyScriptHasGlyphs_data()
{
    QTest::addColumn<QString>("family");
    QTest::addColumn<QString>("text");
    QTest::newRow("latin") << "KST" << QString::fromUtf8("Breaking \xC3\xA9");
    QTest::newRow("chinese") << "DFHeiW5-A" << QString::fromUtf8("快讯");
    QTest::newRow("japanese") << "KST Japanese Pro" << QString::fromUtf8("速報");
    QTest::newRow("korean") << "YDGothic 100 Pro" << QString::fromUtf8("속보");
    QTest::newRow("by fallback") << "KST" << QString::fromUtf8("快讯速報속보");
}

void tst_makefonts::everyScriptHasGlyphs()
{
    QFETCH(QString, family);
    QFETCH(QString, text);
    QFont font(family);
    font.setPixelSize(64);
    const auto draw = [&font](const QString& what) {
        QImage image(128, 128, QImage::Format_ARGB32_Premultiplied);
        image.fill(Qt::transparent);
        QPainter painter(&image);
        painter.setFont(font);
        painter.drawText(QPointF(16, 96), what);
        return image;
    };
    // A private-use code point has no glyph anywhere: it shows the box of a missing one.
    const QImage missing = draw(QString(QChar(0xE123)));
    for (const QChar c : text) {
        if (!c.isSpace()) {
            const QImage drawn = draw(QString(c));
            QVERIFY2(drawn != missing, qPrintable(QString(c)));
            QVERIFY2(drawn != draw(QString()), qPrintable(QString(c)));
        }
    }
}

QTEST_MAIN(tst_makefonts)
#include "tst_makefonts.moc"
