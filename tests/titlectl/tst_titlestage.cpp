// The hidden folder in which the files of titles are completed.
#include "titlectl/TitleStage.h"

#include <QDir>
#include <QFile>
#include <QStringList>
#include <QTemporaryDir>
#include <QTest>
#include <memory>

class tst_titlestage : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init() { m_dir = std::make_unique<QTemporaryDir>(); }
    void placesOneTitle();
    void placesAll();
    void replacesFiles();
    void dropsWhatCannotBePlaced();
    void dropsOneTitle();
    void isRemovedWithTheObject();
    void sweepsWhatWasLeft();

private:
    QString folder() const { return m_dir->path(); }
    QStringList files() const { return filesIn(folder()); }
    static QStringList filesIn(const QString& folder)
    {
        return QDir(folder).entryList(QDir::Files, QDir::Name);
    }
    static void write(const QString& path, const QByteArray& bytes)
    {
        QFile file(path);
        QVERIFY(file.open(QIODevice::WriteOnly));
        file.write(bytes);
    }
    static void fill(const TitleStage& stage, const QStringList& names)
    {
        for (const QString& name : names)
            write(stage.path() + '/' + name, "new");
    }

    std::unique_ptr<QTemporaryDir> m_dir;
};

void tst_titlestage::placesOneTitle()
{
    const TitleStage stage(folder());
    QVERIFY2(stage.isValid(), qPrintable(stage.error()));
    fill(stage, {"a.xml", "a_240.png", "a_source_1280.png", "ab.xml", "b_240.png"});
    QCOMPARE(stage.place("a"), QString());
    QCOMPARE(files(), (QStringList{"a.xml", "a_240.png", "a_source_1280.png"}));
    QCOMPARE(filesIn(stage.path()), (QStringList{"ab.xml", "b_240.png"}));
}

void tst_titlestage::placesAll()
{
    const TitleStage stage(folder());
    fill(stage, {"a.xml", "other.png"});
    QCOMPARE(stage.place(), QString());
    QCOMPARE(files(), (QStringList{"a.xml", "other.png"}));
}

void tst_titlestage::replacesFiles()
{
    write(folder() + "/a.xml", "old");
    const TitleStage stage(folder());
    fill(stage, {"a.xml"});
    QCOMPARE(stage.place("a"), QString());
    QFile file(folder() + "/a.xml");
    QVERIFY(file.open(QIODevice::ReadOnly));
    QCOMPARE(file.readAll(), QByteArray("new"));
}

void tst_titlestage::dropsWhatCannotBePlaced()
{
    QVERIFY(QDir(folder()).mkpath("a.xml/not-empty"));
    const TitleStage stage(folder());
    fill(stage, {"a.xml", "a_240.png", "a_source_1280.png"});
    const QString error = stage.place("a");
    QVERIFY2(error.startsWith("a.xml: "), qPrintable(error));
    // The background comes first, the pictures come last.
    QCOMPARE(files(), QStringList{"a_source_1280.png"});
    QCOMPARE(filesIn(stage.path()), QStringList());
}

void tst_titlestage::dropsOneTitle()
{
    const TitleStage stage(folder());
    fill(stage, {"a.xml", "a_240.png", "b.xml"});
    stage.drop("a");
    QCOMPARE(filesIn(stage.path()), QStringList{"b.xml"});
}

void tst_titlestage::isRemovedWithTheObject()
{
    {
        const TitleStage stage(folder());
        fill(stage, {"a.xml"});
    }
    QVERIFY(QDir(folder()).isEmpty(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot));
}

void tst_titlestage::sweepsWhatWasLeft()
{
    QVERIFY(QDir(folder()).mkpath(".titlectl-abcdef"));
    write(folder() + "/.titlectl-abcdef/a.xml", "half");
    const TitleStage stage(folder());
    fill(stage, {"b.xml"});
    QVERIFY(!QFile::exists(folder() + "/.titlectl-abcdef"));
    // A stage in use is not one that was left.
    QCOMPARE(TitleStage::abandonedIn(folder()), QStringList());
    const TitleStage other(folder());
    QVERIFY(QFile::exists(stage.path() + "/b.xml"));
    QVERIFY(QDir(folder()).mkpath(".titlectl-ghijkl"));
    QCOMPARE(TitleStage::abandonedIn(folder()), QStringList{".titlectl-ghijkl"});
}

QTEST_GUILESS_MAIN(tst_titlestage)
#include "tst_titlestage.moc"
