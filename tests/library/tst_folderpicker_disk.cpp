// Folders that the disk refuses to make, to copy or to rename: the operator is told, and nothing half is
// left.
#include "FolderPickerFixture.h"

#include "tests/support/FileSizeLimit.h"

class tst_folderpicker_disk : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        Q_INIT_RESOURCE(UILibrary);
        Q_INIT_RESOURCE(TitlerToolResource);
    }
    void init() { f.reset(); }
    void cleanup() { f.close(); }

    void aRenameThatTheDiskRefuses()
    {
        f.make("news");
        f.open();
        f.make("later"); // without a notice
        f.hold("news");
        f.enter("later");
        QVERIFY(!f.picker->editor());
        QCOMPARE(f.names(), QStringList{"news"});
        QCOMPARE(f.folders(), QStringList({"later", "news"}));
        QCOMPARE(f.reports.take(), QStringList({"rename news", "renamed news to news"}));
        QCOMPARE(f.messages.take(), (Reports{{47, QStringLiteral("later")}}));
    }

    void aNewFolderThatTheDiskRefuses()
    {
        f.make("news");
        f.open();
        QFile file(f.path("later")); // without a notice
        QVERIFY(file.open(QIODevice::WriteOnly));
        f.tap("news");
        f.tapButton("newFolderButton");
        f.enter("later");
        QVERIFY(!f.picker->editor());
        QCOMPARE(f.folders(), QStringList{"news"});
        QCOMPARE(f.titles.take(), Reports());
        QCOMPARE(f.messages.take(), (Reports{{114, QStringLiteral("folder")}}));
    }

    void aCopyThatTheDiskRefuses()
    {
        f.make("news", {"a", "b"});
        f.open();
        f.tap("news");
        f.tapButton("duplicateFolderButton");
        {
            const FileSizeLimit limit(64); // like a full disk
            f.enter("copy");
        }
        QVERIFY(!f.picker->editor());
        // An incomplete copy would look like a complete one, so it is removed.
        QCOMPARE(f.folders(), QStringList{"news"});
        QCOMPARE(LibraryFixture::order(f.path("news")), QStringList({"a", "b"}));
        QCOMPARE(f.titles.take(), Reports());
        QCOMPARE(f.messages.take(), (Reports{{115, QStringLiteral("folder")}}));
    }

private:
    FolderPickerFixture f;
};

int main(int argc, char** argv)
{
    KSInputContext::install();
    QApplication app(argc, argv);
    app.setObjectName(QStringLiteral("Titler"));
    tst_folderpicker_disk test;
    QTEST_SET_MAIN_SOURCE_PATH
    return QTest::qExec(&test, argc, argv);
}

#include "tst_folderpicker_disk.moc"
