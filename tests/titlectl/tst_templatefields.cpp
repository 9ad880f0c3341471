// The file beside a template that names its fields.
#include "tests/support/RandomSeed.h"
#include "titlectl/TemplateFields.h"

#include <QFile>
#include <QRandomGenerator>
#include <QTemporaryDir>
#include <QtTest/QTest>

namespace
{

const QByteArray WHOLE =
    "{\"fields\": {\"1\": {\"name\": \"Näme\", \"fit\": {\"width\": 600, \"smallest\": 24}}, "
    "\"3\": {\"fit\": {\"width\": 1280}}, \"4\": {\"name\": \"Role\"}}, \"picture\": \"Photo\"}";

} // namespace

class tst_templatefields : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void usual()
    {
        const TemplateFields fields;
        QCOMPARE(fields.field(1).name, QStringLiteral("1"));
        QCOMPARE(fields.field(4).name, QStringLiteral("4"));
        QVERIFY(!fields.field(2).fit);
        QCOMPARE(fields.picture(), QStringLiteral("picture"));
        QString error;
        QVERIFY(TemplateFields::fromJson("{}", error) == fields);
        QVERIFY(error.isEmpty());
    }

    void whole()
    {
        QString error = "before";
        const TemplateFields fields = TemplateFields::fromJson(WHOLE, error);
        QCOMPARE(error, QString());
        QCOMPARE(fields.field(1).name, QString::fromUtf8("Näme"));
        QVERIFY(fields.field(1).fit == (TemplateFields::Fit{600, 24}));
        QCOMPARE(fields.field(2).name, QStringLiteral("2"));
        QCOMPARE(fields.field(3).name, QStringLiteral("3"));
        QVERIFY(fields.field(3).fit == (TemplateFields::Fit{1280, 20}));
        QCOMPARE(fields.field(4).name, QStringLiteral("Role"));
        QVERIFY(!fields.field(4).fit);
        QCOMPARE(fields.picture(), QStringLiteral("Photo"));
    }

    void roundTrip()
    {
        QString error;
        for (const QByteArray& bytes :
             {QByteArray("{}"), WHOLE, QByteArray("{\"picture\": \"x\"}"),
              QByteArray("{\"fields\": {\"2\": {\"name\": \"3\"}, \"3\": {\"name\": \"2\"}}}")}) {
            const TemplateFields fields = TemplateFields::fromJson(bytes, error);
            QCOMPARE(error, QString());
            QVERIFY(TemplateFields::fromJson(fields.toJson(), error) == fields);
            QCOMPARE(error, QString());
        }
    }

    void refused_data()
    {
        QTest::addColumn<QByteArray>("bytes");
        QTest::addColumn<QString>("reason");
        QTest::newRow("nothing") << QByteArray() << "It is not JSON";
        QTest::newRow("list") << QByteArray("[]") << "It is not an object";
        QTest::newRow("fields") << QByteArray("{\"fields\": []}") << "\"fields\" is not an object";
        QTest::newRow("key") << QByteArray("{\"field\": {}}") << "\"field\" in the file is not known";
        QTest::newRow("id") << QByteArray("{\"fields\": {\"5\": {}}}") << "\"5\" is not the id of a text";
        QTest::newRow("id with a sign")
            << QByteArray("{\"fields\": {\"+1\": {}}}") << "\"+1\" is not the id of a text";
        QTest::newRow("field") << QByteArray("{\"fields\": {\"1\": \"x\"}}")
                               << "The field \"1\" is not an object";
        QTest::newRow("field key") << QByteArray("{\"fields\": {\"1\": {\"nmae\": \"x\"}}}")
                                   << "\"nmae\" in field \"1\" is not known";
        QTest::newRow("name") << QByteArray("{\"fields\": {\"1\": {\"name\": 5}}}")
                              << "The name in \"1\" is not a text";
        QTest::newRow("blank name") << QByteArray("{\"fields\": {\"1\": {\"name\": \" \"}}}")
                                    << "The name in \"1\" is not a text";
        QTest::newRow("brace") << QByteArray("{\"fields\": {\"1\": {\"name\": \"{a\"}}}")
                               << "The name \"{a\" has a brace";
        QTest::newRow("twice") << QByteArray(
                                      "{\"fields\": {\"1\": {\"name\": \"a\"}, \"2\": {\"name\": \"A\"}}}")
                               << "Two fields are named \"A\"";
        QTest::newRow("usual name twice")
            << QByteArray("{\"fields\": {\"1\": {\"name\": \"2\"}}}") << "Two fields are named \"2\"";
        QTest::newRow("picture twice") << QByteArray("{\"fields\": {\"1\": {\"name\": \"Picture\"}}}")
                                       << "Two fields are named \"picture\"";
        QTest::newRow("fit") << QByteArray("{\"fields\": {\"1\": {\"fit\": 600}}}")
                             << "\"fit\" of field \"1\" is not an object";
        QTest::newRow("no width") << QByteArray("{\"fields\": {\"1\": {\"fit\": {}}}}")
                                  << "\"width\" of field \"1\" is not a number from 1 to 1280";
        QTest::newRow("width 0") << QByteArray("{\"fields\": {\"1\": {\"fit\": {\"width\": 0}}}}")
                                 << "\"width\" of field \"1\" is not a number from 1 to 1280";
        QTest::newRow("half a pixel") << QByteArray("{\"fields\": {\"1\": {\"fit\": {\"width\": 10.5}}}}")
                                      << "\"width\" of field \"1\" is not a number from 1 to 1280";
        QTest::newRow("smallest")
            << QByteArray("{\"fields\": {\"1\": {\"fit\": {\"width\": 9, \"smallest\": 1000}}}}")
            << "\"smallest\" of field \"1\" is not a number from 1 to 999";
    }
    void refused()
    {
        QFETCH(QByteArray, bytes);
        QFETCH(QString, reason);
        QString error;
        QVERIFY(TemplateFields::fromJson(bytes, error) == TemplateFields());
        QVERIFY2(error.startsWith(reason), qPrintable(error));
    }

    void truncated()
    {
        QString error;
        for (qsizetype length = 0; length < WHOLE.size(); ++length) {
            TemplateFields::fromJson(WHOLE.left(length), error);
            QVERIFY(!error.isEmpty());
        }
    }

    void random()
    {
        const RandomSeed seed(18);
        QRandomGenerator generator(seed);
        for (int round = runLength("TITLER_ROUNDS", 3000); round > 0; --round) {
            QByteArray bytes = WHOLE;
            for (quint32 changes = 1 + generator.bounded(3U); changes > 0; --changes)
                bytes[generator.bounded(int(bytes.size()))] = "\"\\{}[],:\n1a\xFF"[generator.bounded(12)];
            QString error;
            const TemplateFields fields = TemplateFields::fromJson(bytes, error);
            QVERIFY2(error.isEmpty() || fields == TemplateFields(), bytes.constData());
        }
    }

    void files()
    {
        QCOMPARE(TemplateFields::pathFor("/a.xml/b.XML"), QStringLiteral("/a.xml/b.fields.json"));
        QCOMPARE(TemplateFields::pathFor("b"), QStringLiteral("b.fields.json"));
        QTemporaryDir folder;
        const QString title = folder.filePath("b.xml");
        QString error = "before";
        QVERIFY(TemplateFields::read(title, error) == TemplateFields());
        QCOMPARE(error, QString());
        QFile file(folder.filePath("b.fields.json"));
        QVERIFY(file.open(QIODevice::WriteOnly));
        file.write(WHOLE);
        file.close();
        QCOMPARE(TemplateFields::read(title, error).picture(), QStringLiteral("Photo"));
        QCOMPARE(error, QString());
        QVERIFY(file.open(QIODevice::WriteOnly));
        QVERIFY(file.resize(qint64(TemplateFields::FILE_LIMIT) + 1));
        QVERIFY(TemplateFields::read(title, error) == TemplateFields());
        QVERIFY(!error.isEmpty());
    }
};

QTEST_GUILESS_MAIN(tst_templatefields)
#include "tst_templatefields.moc"
