// Rendering in several processes: every title once, the same pictures, and a process that fails costs one
// title.
#include "RenderedFolder.h"
#include "titlectl/RenderWorker.h"
#include "titlectl/RenderWorkers.h"

#include <QTest>
#include <sstream>

class tst_renderworkers : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void jobsAsLines();
    void damagedLines_data();
    void damagedLines();
    void everyTitleOnce_data();
    void everyTitleOnce();
    void titleThatCannotBeRead();
    void programThatDoesNotExist();
    void programThatEndsAtOnce();
    void workerAnswersEachLine();

private:
    static QMap<qsizetype, QString> run(const QString& program, int count, const QList<RenderJob>& jobs)
    {
        QMap<qsizetype, QString> errors;
        int calls = 0;
        RenderWorkers(program, count).run(jobs, [&](qsizetype job, const QString& error) {
            errors.insert(job, error);
            ++calls;
        });
        return calls == jobs.size() ? errors : QMap<qsizetype, QString>();
    }
    static QList<RenderJob> jobsFor(const QString& folder, const QStringList& stems, const QString& target)
    {
        QList<RenderJob> jobs;
        for (const QString& stem : stems)
            jobs.append(
                RenderJob{folder + '/' + stem + ".xml", target, PictureFiles::Pictures(PictureFiles::ALL)});
        return jobs;
    }

    LibraryFixture m_fixture;
};

void tst_renderworkers::jobsAsLines()
{
    const RenderJob job{"/a/\"b\"\n\u4e2d.xml", "/out", PictureFiles::Middle};
    const QByteArray line = job.toLine();
    QCOMPARE(line.count('\n'), 1);
    QVERIFY(line.endsWith('\n'));
    const auto read = RenderJob::fromLine(line);
    QVERIFY(read);
    QCOMPARE(read->title, job.title);
    QCOMPARE(read->folder, job.folder);
    QCOMPARE(int(read->pictures), int(job.pictures));
}

void tst_renderworkers::damagedLines_data()
{
    QTest::addColumn<QByteArray>("line");
    QTest::newRow("empty") << QByteArray();
    QTest::newRow("no JSON") << QByteArray("render this");
    QTest::newRow("no title") << QByteArray("{\"pictures\":7}");
    QTest::newRow("no pictures") << QByteArray("{\"title\":\"/a.xml\"}");
    QTest::newRow("unknown pictures") << QByteArray("{\"title\":\"/a.xml\",\"pictures\":64}");
}

void tst_renderworkers::damagedLines()
{
    QFETCH(QByteArray, line);
    QVERIFY(!RenderJob::fromLine(line));
}

void tst_renderworkers::everyTitleOnce_data()
{
    QTest::addColumn<int>("count");
    QTest::newRow("one process") << 1;
    QTest::newRow("two processes") << 2;
    QTest::newRow("more processes than titles") << 9;
}

void tst_renderworkers::everyTitleOnce()
{
    QFETCH(int, count);
    const QStringList stems{"a", "b", "c", "d", "e"};
    const QString folder = renderedFolder(m_fixture, "all", stems);
    const QString target = m_fixture.makeFolder("target");
    const auto errors = run(TITLECTL_PROGRAM, count, jobsFor(folder, stems, target));
    QCOMPARE(errors.size(), stems.size());
    for (const QString& error : errors)
        QCOMPARE(error, QString());
    QCOMPARE(picturesIn(target), picturesIn(folder));
}

void tst_renderworkers::titleThatCannotBeRead()
{
    const QString folder = renderedFolder(m_fixture, "torn", {"a", "b"});
    const auto errors =
        run(TITLECTL_PROGRAM, 2, jobsFor(folder, {"a", "gone", "b"}, m_fixture.makeFolder("target")));
    QCOMPARE(errors, (QMap<qsizetype, QString>{{0, ""}, {1, "the title cannot be read"}, {2, ""}}));
}

void tst_renderworkers::programThatDoesNotExist()
{
    const auto errors = run("/nonexistent/program", 2, jobsFor("/nowhere", {"a", "b", "c"}, ""));
    QCOMPARE(errors.size(), 3);
    for (const QString& error : errors)
        QVERIFY(error.contains("has ended"));
}

void tst_renderworkers::programThatEndsAtOnce()
{
    const auto errors = run("/bin/true", 2, jobsFor("/nowhere", {"a", "b", "c"}, ""));
    QCOMPARE(errors.size(), 3);
}

void tst_renderworkers::workerAnswersEachLine()
{
    const QString folder = renderedFolder(m_fixture, "worker", {"a"});
    const QList<RenderJob> jobs = jobsFor(folder, {"a", "gone"}, m_fixture.makeFolder("target"));
    std::istringstream input(jobs.at(0).toLine().toStdString() + "noise\n" +
                             jobs.at(1).toLine().toStdString());
    std::ostringstream output;
    RenderWorker::serve(input, output);
    QCOMPARE(QString::fromStdString(output.str()), QString("\nnot a job\nthe title cannot be read\n"));
}

QTEST_MAIN(tst_renderworkers)
#include "tst_renderworkers.moc"
