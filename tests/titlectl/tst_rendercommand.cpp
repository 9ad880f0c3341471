// Which jobs the command makes of its options.
#include "titlectl/RenderCommand.h"

#include <QTest>

class tst_rendercommand : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void picturesOf_data();
    void picturesOf();
    void jobsFor_data();
    void jobsFor();
};

void tst_rendercommand::picturesOf_data()
{
    QTest::addColumn<QString>("only");
    QTest::addColumn<int>("pictures"); // -1: refused
    QTest::newRow("all") << "" << PictureFiles::ALL;
    QTest::newRow("1920") << "1920" << int(PictureFiles::Big);
    QTest::newRow("960") << "960" << int(PictureFiles::Middle);
    QTest::newRow("240") << "240" << int(PictureFiles::Reduced);
    QTest::newRow("other") << "1280" << -1;
    QTest::newRow("text") << "big" << -1;
}

void tst_rendercommand::picturesOf()
{
    QFETCH(QString, only);
    QFETCH(int, pictures);
    const auto result = RenderCommand::picturesOf(only);
    QCOMPARE(result ? int(*result) : -1, pictures);
}

void tst_rendercommand::jobsFor_data()
{
    QTest::addColumn<QString>("out");
    QTest::addColumn<QStringList>("folders");
    QTest::addColumn<QStringList>("targets");
    QTest::newRow("beside the title") << "" << QStringList{"/t/a", "/t/b"} << QStringList{"", ""};
    QTest::newRow("one folder") << "/out" << QStringList{"/t/a"} << QStringList{"/out"};
    QTest::newRow("two folders") << "/out" << QStringList{"/t/a", "/t/b"} << QStringList{"/out/a", "/out/b"};
}

void tst_rendercommand::jobsFor()
{
    QFETCH(QString, out);
    QFETCH(QStringList, folders);
    QFETCH(QStringList, targets);
    QList<TitlePaths::Folder> list;
    for (const QString& folder : folders)
        list.append(TitlePaths::Folder{folder, {folder + "/x.xml"}, true});
    QStringList result;
    const QList<RenderJob> jobs = RenderCommand::jobsFor(list, out, PictureFiles::Big);
    for (const RenderJob& job : jobs) {
        QCOMPARE(int(job.pictures), int(PictureFiles::Big));
        result.append(job.folder);
    }
    QCOMPARE(result, targets);
}

QTEST_APPLESS_MAIN(tst_rendercommand)
#include "tst_rendercommand.moc"
