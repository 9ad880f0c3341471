// Which reader a file gets, and what is not read at all.
#include "ListTools.h"

#include "titlectl/ListReader.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <QtTest/QTest>
#include <sys/stat.h>

class tst_listreader : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void formats_data()
    {
        QTest::addColumn<QString>("path");
        QTest::addColumn<ListReader::Format>("format");
        QTest::newRow("csv") << "/a/b.csv" << ListReader::Format::Csv;
        QTest::newRow("tsv") << "b.tsv" << ListReader::Format::Csv;
        QTest::newRow("none") << "/a.json/b" << ListReader::Format::Csv;
        QTest::newRow("json") << "b.JSON" << ListReader::Format::Json;
        QTest::newRow("xlsx") << "b.csv.Xlsx" << ListReader::Format::Xlsx;
    }
    void formats()
    {
        QFETCH(QString, path);
        QTEST(ListReader::formatOf(path), "format");
    }

    void files()
    {
        QTemporaryDir folder;
        write(folder.filePath("a.tsv"), "x\ty\n1\t2\n");
        QCOMPARE(rowsOf(ListReader::read(folder.filePath("a.tsv"))), QStringList{"2: 1|2"});
        write(folder.filePath("a.json"), "[{\"x\": 1}]");
        QCOMPARE(rowsOf(ListReader::read(folder.filePath("a.json"))), QStringList{"1: 1"});
        write(folder.filePath("a.xlsx"), "x\ty\n1\t2\n");
        QCOMPARE(rowsOf(ListReader::read(folder.filePath("a.xlsx"))),
                 QStringList{"The workbook cannot be read: It is not a zip file"});
    }

    void notFiles()
    {
        QTemporaryDir folder;
        QCOMPARE(ListReader::read(folder.filePath("none.csv")).error(),
                 QStringLiteral("There is no such file"));
        QCOMPARE(ListReader::read(folder.path()).error(), QStringLiteral("It is not a file"));
        // A pipe that nobody writes to must not be waited for.
        const QString pipe = folder.filePath("pipe.csv");
        QCOMPARE(::mkfifo(QFile::encodeName(pipe).constData(), 0600), 0);
        QCOMPARE(ListReader::read(pipe).error(), QStringLiteral("It is not a file"));
        QCOMPARE(ListReader::read("/dev/zero").error(), QStringLiteral("It is not a file"));
        QFile large(folder.filePath("large.csv"));
        QVERIFY(large.open(QIODevice::WriteOnly));
        QVERIFY(large.resize(ListTable::FILE_LIMIT + 1));
        QCOMPARE(ListReader::read(large.fileName()).error(),
                 QStringLiteral("The file is longer than 268435456 bytes"));
    }

private:
    static void write(const QString& path, const QByteArray& bytes)
    {
        QFile file(path);
        QVERIFY(file.open(QIODevice::WriteOnly));
        file.write(bytes);
    }
};

QTEST_GUILESS_MAIN(tst_listreader)
#include "tst_listreader.moc"
