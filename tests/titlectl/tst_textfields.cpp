// Texts of a list in the place of texts of a template.
#include "ListTexts.h"
#include "titlectl/TextFields.h"

#include "canvas/StyleDocument.h"

#include <QHash>
#include <QtTest/QTest>
#include <optional>

class tst_textfields : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void partNames_data()
    {
        QTest::addColumn<QStringList>("text");
        QTest::addColumn<QStringList>("names");
        QTest::newRow("none") << QStringList{"Reporter"} << QStringList();
        QTest::newRow("whole") << QStringList{"{Name}"} << QStringList{"Name"};
        QTest::newRow("two, one twice") << QStringList{"{a} and { b } and {a}"} << QStringList{"a", "b"};
        QTest::newRow("across runs") << QStringList{"x{N", "am", "e}y"} << QStringList{"Name"};
        QTest::newRow("braces in braces") << QStringList{"{a{b}c}"} << QStringList{"b"};
        QTest::newRow("not closed") << QStringList{"{a"} << QStringList();
        QTest::newRow("not opened") << QStringList{"a}"} << QStringList();
        QTest::newRow("empty") << QStringList{"{}{ }"} << QStringList();
        QTest::newRow("line break") << QStringList{"{a\nb}{c}"} << QStringList{"c"};
        QTest::newRow("scripts") << QStringList{QString::fromUtf8("😀{名前}")}
                                 << QStringList{QString::fromUtf8("名前")};
    }
    void partNames()
    {
        QFETCH(QStringList, text);
        QTEST(TextFields::partNames(textOf(text)), "names");
    }

    void replaceAll_data()
    {
        QTest::addColumn<QStringList>("text");
        QTest::addColumn<QString>("value");
        QTest::addColumn<QString>("sizes");
        QTest::newRow("shorter") << QStringList{"Name", " of guest"} << "Ève"
                                 << "Ève:40";
        QTest::newRow("longer") << QStringList{"N", "x"} << "Anna Müller"
                                << "Anna Müller:40";
        QTest::newRow("lines") << QStringList{"N"} << "a\nb"
                               << "a\nb:40";
        QTest::newRow("empty") << QStringList{"N"} << ""
                               << "";
        QTest::newRow("braces") << QStringList{"N"} << "{x}"
                                << "{x}:40";
        QTest::newRow("pairs") << QStringList{QString::fromUtf8("😀x")} << QString::fromUtf8("é😀快")
                               << QString::fromUtf8("é😀快:40");
    }
    void replaceAll()
    {
        QFETCH(QString, value);
        QFETCH(QStringList, text);
        TText record = textOf(text);
        TextFields::replaceAll(record, value);
        QTEST(sizesOf(record), "sizes");
        QCOMPARE(record.getText(), value.toStdString());
        QCOMPARE(qsizetype(record.textItems().size()), value.size());
        QCOMPARE(record.getXValue(), 200.0F);
        isOneStylePerUnit(record);
    }

    void replaceParts_data()
    {
        QTest::addColumn<QStringList>("text");
        QTest::addColumn<QString>("sizes");
        QTest::newRow("whole") << QStringList{"{Name}"} << QString::fromUtf8("Ève 😀:40");
        QTest::newRow("inside") << QStringList{"by ", "{Name}", " now"}
                                << QString::fromUtf8("by :40 Ève 😀:50  now:60");
        QTest::newRow("across runs") << QStringList{"x{N", "am", "e}y"}
                                     << QString::fromUtf8("xÈve 😀:40 y:60");
        QTest::newRow("unknown") << QStringList{"{x} ", "{Role}"} << "{x} :40 {Name}:50";
        QTest::newRow("empty value") << QStringList{"a{Empty}", "b"} << "a:40 b:50";
        QTest::newRow("nothing") << QStringList{"a", "b"} << "a:40 b:50";
    }
    void replaceParts()
    {
        QFETCH(QStringList, text);
        const QHash<QString, QString> values = {
            {"Name", QString::fromUtf8("Ève 😀")}, {"Role", "{Name}"}, {"Empty", ""}};
        TText record = textOf(text);
        TextFields::replaceParts(record, [&](const QString& name) {
            return values.contains(name) ? std::optional<QString>(values.value(name)) : std::nullopt;
        });
        QTEST(sizesOf(record), "sizes");
        isOneStylePerUnit(record);
    }

    void plainTextHasPlainSpaces()
    {
        TText record = textOf({"N"});
        TextFields::replaceAll(record, QStringLiteral("a") + QChar(QChar::Nbsp) + QLatin1Char('b'));
        QCOMPARE(record.getText(), std::string("a b"));
        QCOMPARE(record.textItems()[1]->getText(), std::string("\xC2\xA0"));
    }

    void recordWithoutRuns()
    {
        TText record;
        QVERIFY(TextFields::isBlank(record));
        TextFields::replaceAll(record, "ab");
        QCOMPARE(record.textItems().size(), std::size_t(2));
        TText empty;
        TextFields::replaceParts(empty, [](const QString&) { return std::optional<QString>("x"); });
        QVERIFY(empty.textItems().empty());
    }

    void counts()
    {
        QCOMPARE(TextFields::characterCount(textOf({"ab\nc", QString::fromUtf8("😀")})), 5);
        QVERIFY(TextFields::isBlank(textOf({" \n", " "})));
        QVERIFY(!TextFields::isBlank(textOf({" \n", "."})));
    }

private:
    static void isOneStylePerUnit(const TText& text)
    {
        TText normal = text;
        StyleDocument::normalise(normal);
        QVERIFY(normal.textItemsIsTheSame(text));
    }
};

QTEST_GUILESS_MAIN(tst_textfields)
#include "tst_textfields.moc"
