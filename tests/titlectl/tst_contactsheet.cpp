// The contact sheet of a folder as pictures and as PDF.
#include "RenderedFolder.h"
#include "titlectl/ContactSheet.h"
#include "titlectl/SheetLayout.h"

#include <QTest>

class tst_contactsheet : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void pagePaths_data();
    void pagePaths();
    void pictures();
    void pdf();
    void titleThatCannotBeRead();
    void unwritablePlace();

private:
    QStringList titles(const QString& folder, const QStringList& stems) const
    {
        QStringList paths;
        for (const QString& stem : stems)
            paths.append(folder + '/' + stem + ".xml");
        return paths;
    }

    LibraryFixture m_fixture;
};

void tst_contactsheet::pagePaths_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<int>("pages");
    QTest::addColumn<QString>("second");
    QTest::newRow("one page") << "/a/sheet.png" << 1 << "/a/sheet.png";
    QTest::newRow("several") << "/a/sheet.png" << 3 << "/a/sheet-2.png";
    QTest::newRow("dot in the folder") << "/a.b/sheet" << 3 << "/a.b/sheet-2";
}

void tst_contactsheet::pagePaths()
{
    QFETCH(QString, path);
    QFETCH(int, pages);
    QFETCH(QString, second);
    QCOMPARE(ContactSheet::pagePath(path, 1, pages), second);
}

void tst_contactsheet::pictures()
{
    const QString folder = renderedFolder(m_fixture, "sheet", {"one", "two"});
    QImage red(960, 540, QImage::Format_RGB32);
    red.fill(Qt::red);
    QVERIFY(red.save(folder + "/two_960.png"));
    QVERIFY(QFile::remove(folder + "/one_960.png")); // is drawn anew
    QStringList all;
    for (int i = 0; i < 9; ++i)
        all += titles(folder, {"one", "two"});
    ContactSheet sheet("Heading", all);
    int last = 0;
    const QString out = m_fixture.makeFolder("out");
    QCOMPARE(sheet.write(out + "/s.png", [&last](int done) { last = done; }), QString());
    QCOMPARE(last, 18);
    QVERIFY(sheet.unreadable().isEmpty());
    QCOMPARE(QDir(out).entryList(QDir::Files, QDir::Name), (QStringList{"s-1.png", "s-2.png"}));
    const QImage page(out + "/s-1.png");
    const SheetLayout layout{QSizeF(page.size())};
    QCOMPARE(page.pixelColor(layout.picture(1).center().toPoint()), QColor(Qt::red));
    QVERIFY(page.pixelColor(layout.picture(0).center().toPoint()) != QColor(Qt::white));
    QVERIFY(page.copy(layout.name(1).toRect()).convertToFormat(QImage::Format_Grayscale8) !=
            page.copy(layout.name(0).toRect()).convertToFormat(QImage::Format_Grayscale8));
}

void tst_contactsheet::pdf()
{
    const QString folder = renderedFolder(m_fixture, "sheet", {"one"});
    const QString out = m_fixture.makeFolder("out") + "/s.pdf";
    QCOMPARE(ContactSheet("Heading", titles(folder, QStringList(17, "one"))).write(out, [](int) {}),
             QString());
    QFile file(out);
    QVERIFY(file.open(QIODevice::ReadOnly));
    const QByteArray bytes = file.readAll();
    QVERIFY(bytes.startsWith("%PDF-"));
    QVERIFY(bytes.contains("/Count 2"));
    QVERIFY(bytes.contains("/MediaBox"));
}

void tst_contactsheet::titleThatCannotBeRead()
{
    const QString folder = renderedFolder(m_fixture, "sheet", {"one"});
    ContactSheet sheet("Heading", titles(folder, {"gone", "one"}));
    QCOMPARE(sheet.write(m_fixture.makeFolder("out") + "/s.png", [](int) {}), QString());
    QCOMPARE(sheet.unreadable(), titles(folder, {"gone"}));
}

void tst_contactsheet::unwritablePlace()
{
    for (const char* path : {"/nonexistent/s.png", "/nonexistent/s.pdf"})
        QVERIFY(ContactSheet("Heading", {}).write(path, [](int) {}).contains(path));
}

QTEST_MAIN(tst_contactsheet)
#include "tst_contactsheet.moc"
