// The folder picker without its dialog: which names are taken, what is done on the disk, and what the tree is
// filled with.
#include "LibraryFixture.h"
#include "tests/support/SettledFolder.h"

#include "library/EditorRegExpValidator.h"
#include "library/FolderEditor.h"
#include "library/FolderNameRules.h"
#include "library/FolderPicker.h"
#include "library/FolderPickerController.h"
#include "library/FolderPickerFactory.h"
#include "touchui/KSModelDataItem.h"
#include "touchui/KSTreeModel.h"
#include "touchui/KSVIEW.h"

#include <QAbstractItemModelTester>
#include <QApplication>
#include <QClipboard>
#include <QFont>
#include <QSignalSpy>
#include <QTest>
#include <sys/fsuid.h>

namespace
{

const char FORBIDDEN[] = "\\/:,;*?\"<>|[]=.";

QString repeated(const QString& character, int count)
{
    return character.repeated(count);
}

// What a folder holds, each file with its bytes.
QMap<QString, QByteArray> contents(const QString& folder)
{
    QMap<QString, QByteArray> files;
    for (const QString& name : settledEntries(folder)) {
        QFile file(folder + QLatin1Char('/') + name);
        if (file.open(QIODevice::ReadOnly))
            files.insert(name, file.readAll());
    }
    return files;
}

} // namespace

class tst_foldernamerules : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        QDir(m_fixture.titleRoot()).removeRecursively();
        QDir().mkpath(m_fixture.titleRoot());
        qunsetenv("K2SYS_FS_REMAIN");
    }

    void verdicts_data()
    {
        QTest::addColumn<QString>("name");
        QTest::addColumn<int>("verdict"); // 0 taken, 1 invalid, 2 too long
        QTest::newRow("empty") << QString() << 0;
        QTest::newRow("20") << repeated("a", 20) << 0;
        QTest::newRow("21") << repeated("a", 21) << 2;
        QTest::newRow("500") << repeated("a", 500) << 2;
        QTest::newRow("blanks around") << QStringLiteral("  name  ") << 0;
        QTest::newRow("allowed signs") << QStringLiteral("a-b_c+(d)!@#$%^&'~`") << 0;
        QTest::newRow("Chinese, 20") << repeated(QStringLiteral("天"), 20) << 0;
        QTest::newRow("Chinese, 21") << repeated(QStringLiteral("天"), 21) << 2;
        QTest::newRow("Japanese") << QStringLiteral("ニュース速報") << 0;
        QTest::newRow("Korean") << QStringLiteral("날씨 예보") << 0;
        QTest::newRow("outside the first plane, 20") << repeated(QStringLiteral("𠮷"), 20) << 0;
        QTest::newRow("outside the first plane, 21") << repeated(QStringLiteral("𠮷"), 21) << 2;
        QTest::newRow("too long and invalid") << repeated("a/", 20) << 2;
        for (const char* sign = FORBIDDEN; *sign != '\0'; ++sign) {
            const QLatin1Char character(*sign);
            QTest::addRow("%c alone", *sign) << QString(character) << 1;
            QTest::addRow("%c within", *sign) << QStringLiteral("ab") + character + QStringLiteral("cd") << 1;
            QTest::addRow("%c last", *sign) << QStringLiteral("天气") + character << 1;
        }
    }

    void verdicts()
    {
        QFETCH(QString, name);
        QFETCH(int, verdict);
        EditorRegExpValidator validator(FolderPicker::FOLDER_NAME_REGEXP);
        QSignalSpy valid(&validator, &EditorRegExpValidator::validText);
        QSignalSpy invalid(&validator, &EditorRegExpValidator::invalidText);
        QSignalSpy tooLong(&validator, &EditorRegExpValidator::longText);
        int position = 0;
        const QValidator::State state = validator.validate(name, position);
        QCOMPARE(state, verdict == 0 ? QValidator::Acceptable : QValidator::Invalid);
        QCOMPARE(valid.count(), verdict == 0 ? 1 : 0);
        QCOMPARE(invalid.count(), verdict == 1 ? 1 : 0);
        QCOMPARE(tooLong.count(), verdict == 2 ? 1 : 0);
    }

    void theEditorRefusesTypedAndPastedText()
    {
        QCOMPARE(FolderEditor::FOLDER_PICKER_REGEXP, FolderPicker::FOLDER_NAME_REGEXP);
        FolderEditor editor;
        QSignalSpy invalid(&editor, &FolderEditor::signalInvalidInput);
        QSignalSpy tooLong(&editor, &FolderEditor::signalLongInput);
        QSignalSpy valid(&editor, &FolderEditor::signalValidInput);
        QTest::keyClicks(&editor, repeated("b", 20));
        QCOMPARE(valid.count(), 20);
        QTest::keyClicks(&editor, "c");
        QCOMPARE(tooLong.count(), 1);
        QCOMPARE(editor.text(), repeated("b", 20));
        editor.clear();
        for (const char* sign = FORBIDDEN; *sign != '\0'; ++sign) {
            invalid.clear();
            QTest::keyClicks(&editor, QString(QLatin1Char(*sign)));
            QCOMPARE(invalid.count(), 1);
            QCOMPARE(editor.text(), QString());
            QApplication::clipboard()->setText(QStringLiteral("a") + QLatin1Char(*sign));
            editor.paste();
            QCOMPARE(invalid.count(), 2);
            QCOMPARE(editor.text(), QString());
        }
        QApplication::clipboard()->setText(QStringLiteral("天气 weather"));
        editor.paste();
        QCOMPARE(editor.text(), QStringLiteral("天气 weather"));
        QApplication::clipboard()->setText(repeated("d", 20));
        editor.paste();
        QCOMPARE(tooLong.count(), 2);
        QCOMPARE(editor.text(), QStringLiteral("天气 weather"));
    }

    void sameNames_data()
    {
        QTest::addColumn<QString>("first");
        QTest::addColumn<QString>("second");
        QTest::addColumn<bool>("same");
        QTest::newRow("equal") << "News"
                               << "News" << true;
        QTest::newRow("case") << "News"
                              << "nEWS" << true;
        QTest::newRow("case with accents") << QStringLiteral("Élan") << QStringLiteral("éLAN") << true;
        QTest::newRow("trailing blank") << "News"
                                        << "News " << false;
        QTest::newRow("leading blank") << "News"
                                       << " News" << false;
        QTest::newRow("Chinese") << QStringLiteral("天气") << QStringLiteral("天气") << true;
        QTest::newRow("prefix") << "New"
                                << "News" << false;
    }

    void sameNames()
    {
        QFETCH(QString, first);
        QFETCH(QString, second);
        QFETCH(bool, same);
        QCOMPARE(FolderNameRules::isSameName(first, second), same);
        QCOMPARE(FolderNameRules::isSameName(second, first), same);
    }

    void onlyFoldersOfTheRoot()
    {
        for (const char* name : {"", ".", "..", "/", "a/b", "../a", "/tmp"})
            QVERIFY2(!FolderNameRules::isFolderName(QLatin1String(name)), name);
        QVERIFY(!FolderNameRules::isFolderName(QString(QChar(u'\0')) + QLatin1Char('a')));
        QVERIFY(FolderNameRules::isFolderName(QStringLiteral("...")));
        QVERIFY(FolderNameRules::isFolderName(QStringLiteral(" ")));
    }

    // --- On the disk ----------------------------------------------------------------------------------

    void makesFolders_data() { scripts(); }

    void makesFolders()
    {
        QFETCH(QString, name);
        FolderPickerController disk;
        QCOMPARE(disk.getTitlerRootFolder(), m_fixture.titleRoot());
        QVERIFY(disk.createFolder(root(), name));
        QVERIFY(QFileInfo(path(name)).isDir());
        QVERIFY(disk.isNullDirectory(QFileInfo(path(name))));
        QVERIFY(!disk.createFolder(root(), name)); // it exists already
    }

    void makesNothingElsewhere()
    {
        FolderPickerController disk;
        for (const char* name : {"", ".", "..", "../stray", "a/b"}) {
            QVERIFY(!disk.createFolder(root(), QLatin1String(name)));
            QVERIFY(!disk.duplicateFolder(root(), path("News"), QLatin1String(name)));
        }
        QVERIFY(!disk.createFolder(QString(), "News"));
        QVERIFY(!QFileInfo::exists(QFileInfo(root()).path() + "/stray"));
        QVERIFY(QDir(root()).isEmpty());
    }

    void renames_data() { scripts(); }

    void renames()
    {
        QFETCH(QString, name);
        FolderPickerController disk;
        LibraryFixture::fillFolder(m_fixture.makeFolder("old"), {"t1", "t2"});
        const auto before = contents(path("old"));
        QVERIFY(disk.renameFolder(root(), "old", name));
        QVERIFY(!QFileInfo::exists(path("old")));
        QCOMPARE(contents(path(name)), before);
    }

    void renamesToAnotherCase()
    {
        FolderPickerController disk;
        m_fixture.makeFolder("news");
        QVERIFY(disk.renameFolder(root(), "news", "NEWS"));
        QCOMPARE(folders(), QStringList{"NEWS"});
        QVERIFY(!disk.renameFolder(root(), "NEWS", "NEWS"));
    }

    void aRenameNeverReplaces()
    {
        FolderPickerController disk;
        LibraryFixture::fillFolder(m_fixture.makeFolder("full"), {"t1"});
        m_fixture.makeFolder("empty");
        m_fixture.makeFolder("other");
        const auto before = contents(path("full"));
        QVERIFY(!disk.renameFolder(root(), "other", "full"));
        QVERIFY(!disk.renameFolder(root(), "other", "empty"));
        QVERIFY(!disk.renameFolder(root(), "gone", "new"));
        QVERIFY(!disk.renameFolder(root(), "other", "../other"));
        QVERIFY(!disk.renameFolder(root(), "../titles", "other2"));
        QCOMPARE(folders(), QStringList({"empty", "full", "other"}));
        QCOMPARE(contents(path("full")), before);
    }

    void duplicates_data() { scripts(); }

    void duplicates()
    {
        QFETCH(QString, name);
        FolderPickerController disk;
        LibraryFixture::fillFolder(m_fixture.makeFolder("source"), {"t2", "t1"});
        QVERIFY(disk.duplicateFolder(root(), path("source"), name));
        QCOMPARE(contents(path(name)), contents(path("source")));
        QCOMPARE(LibraryFixture::order(path(name)), QStringList({"t2", "t1"}));
    }

    void aDuplicateNeverReplaces()
    {
        FolderPickerController disk;
        LibraryFixture::fillFolder(m_fixture.makeFolder("source"), {"t1"});
        LibraryFixture::fillFolder(m_fixture.makeFolder("other"), {"t9"});
        const auto before = contents(path("other"));
        QVERIFY(!disk.duplicateFolder(root(), path("source"), "other"));
        QVERIFY(!disk.duplicateFolder(root(), path("source"), "source"));
        QVERIFY(!disk.duplicateFolder(root(), path("gone"), "new"));
        QCOMPARE(contents(path("other")), before);
        QCOMPARE(folders(), QStringList({"other", "source"}));
    }

    void foldersThatCannotBeRead()
    {
        FolderPickerController disk;
        LibraryFixture::fillFolder(m_fixture.makeFolder("source"), {"t1"});
        LibraryFixture::fillFolder(m_fixture.makeFolder("locked"), {"t1"});
        QFile::setPermissions(path("locked"), QFileDevice::Permissions());
        QFile::setPermissions(root(), QFileDevice::ReadOwner | QFileDevice::ExeOwner |
                                          QFileDevice::ReadOther | QFileDevice::ExeOther);
        // Root may write everywhere, so the test takes the file system rights of another user.
        const bool isRoot = geteuid() == 0;
        if (isRoot)
            setfsuid(65534);
        const bool made = disk.createFolder(root(), "new");
        const bool renamed = disk.renameFolder(root(), "source", "new");
        const bool isNull = disk.isNullDirectory(QFileInfo(path("locked")));
        FolderPickerFactory factory;
        factory.setRootPath(root());
        const qsizetype titles = factory.getTitlerFiles(0, path("locked")).size();
        if (isRoot)
            setfsuid(0);
        QFile::setPermissions(root(),
                              QFileDevice::ReadOwner | QFileDevice::WriteOwner | QFileDevice::ExeOwner);
        QFile::setPermissions(path("locked"),
                              QFileDevice::ReadOwner | QFileDevice::WriteOwner | QFileDevice::ExeOwner);
        QVERIFY(!made);
        QVERIFY(!renamed);
        QVERIFY(isNull);
        QCOMPARE(titles, 0);
        QCOMPARE(folders(), QStringList({"locked", "source"}));
    }

    void fullDisks_data()
    {
        QTest::addColumn<QByteArray>("remain");
        QTest::addColumn<bool>("full");
        // The room is in bytes, 1,000 to a kilobyte. The disk counts as full below 200,000 kilobytes.
        QTest::newRow("none") << QByteArray("0") << true;
        QTest::newRow("199,999") << QByteArray("199999000") << true;
        QTest::newRow("200,000") << QByteArray("200000000") << false;
        QTest::newRow("much") << QByteArray("9000000000000") << false;
    }

    void fullDisks()
    {
        QFETCH(QByteArray, remain);
        QFETCH(bool, full);
        qputenv("K2SYS_FS_REMAIN", remain);
        m_fixture.makeFolder("empty");
        QCOMPARE(FolderPickerController().isDiskFull(root(), false), full);
        QCOMPARE(FolderPickerController().isDiskFull(path("empty"), true), full);
    }

    void aDuplicateNeedsItsOwnRoom()
    {
        const QString folder = m_fixture.makeFolder("source");
        QFile file(folder + "/data");
        QVERIFY(file.open(QIODevice::WriteOnly));
        file.write(QByteArray(50000, 'x'));
        file.close();
        qputenv("K2SYS_FS_REMAIN", "200049000");
        QVERIFY(FolderPickerController().isDiskFull(folder, true));
        QVERIFY(!FolderPickerController().isDiskFull(folder, false));
        qputenv("K2SYS_FS_REMAIN", "200050000");
        QVERIFY(!FolderPickerController().isDiskFull(folder, true));
    }

    // --- In the tree ----------------------------------------------------------------------------------

    void theTreeShowsFoldersWithTheirTitles()
    {
        LibraryFixture::fillFolder(m_fixture.makeFolder("news"), {"t2", "t1", "t3"});
        QFile::remove(path("news") + "/t3.xml");
        m_fixture.makeFolder(QStringLiteral("天气"));
        m_fixture.makeFolder("Arts");
        LibraryFixture::fillFolder(m_fixture.makeFolder("zoo"), {"a", "b"});
        QFile::remove(path("zoo") + "/.order.xml");
        QFile stray(root() + "/stray.xml");
        QVERIFY(stray.open(QIODevice::WriteOnly));
        stray.close();
        Tree tree(root());
        QCOMPARE(tree.names(), QStringList({"Arts", "news", "zoo", QStringLiteral("天气")}));
        QCOMPARE(tree.names(tree.row("news")), QStringList({"t2", "t1"}));
        QCOMPARE(tree.names(tree.row("Arts")), QStringList());
        QCOMPARE(tree.names(tree.row("zoo")), QStringList({"a", "b"})); // without an order by name
    }

    void attributesOfRows()
    {
        LibraryFixture::fillFolder(m_fixture.makeFolder("news"), {"t1"});
        Tree tree(root());
        const QModelIndex folder = tree.row("news");
        const QModelIndex date = folder.siblingAtColumn(FolderPickerFactory::DateColumn);
        const QDateTime time = QFileInfo(path("news")).lastModified();
        QCOMPARE(date.data().toString(), time.toString("yyyy-MM-dd hh:mm"));
        QCOMPARE(folder.data(50).toDateTime(), time);
        QVERIFY(folder.data(35).toBool());
        QVERIFY(folder.data(34).toBool());
        QVERIFY(!date.data(34).toBool());
        QCOMPARE(folder.data(Qt::TextAlignmentRole).toInt(), 129);
        QVERIFY(folder.data(Qt::DecorationRole).isValid());
        QCOMPARE(folder.data(Qt::EditRole).toString(), QStringLiteral("news"));
        const QModelIndex title = tree.model.index(0, 0, folder);
        QVERIFY(!title.data(35).toBool());
        QVERIFY(!title.data(34).toBool());
        QVERIFY(!title.data(Qt::DecorationRole).isValid());
        const QFileInfo info =
            tree.factory.getNodeInfo(tree.model.itemOf(title)->dataItem()->getSourceData());
        QCOMPARE(info.filePath(), path("news") + "/t1.xml");
        QCOMPARE(tree.factory.getColumnDataType(0), KSModelDataFactory::NameDataType);
        QCOMPARE(tree.factory.getColumnDataType(1), KSModelDataFactory::DateDataType);
    }

    void ordersThatNameStrangeThings()
    {
        const QString folder = m_fixture.makeFolder("news");
        LibraryFixture::fillFolder(m_fixture.makeFolder("other"), {"o1"});
        LibraryFixture::fillFolder(folder, {"t1", "t2"});
        LibraryFixture::writeOrder(folder, {"t2", "../other/o1", "", "gone", "t1"});
        QDir(folder).mkdir("gone.xml");
        Tree tree(root());
        QCOMPARE(tree.names(tree.row("news")), QStringList({"t2", "t1"}));
        QFile order(folder + "/.order.xml");
        QVERIFY(order.open(QIODevice::WriteOnly | QIODevice::Truncate));
        order.write("<manifest type=\"order\"><index");
        order.close();
        Tree torn(root());
        QCOMPARE(torn.names(torn.row("news")), QStringList({"t1", "t2"}));
    }

    void whetherAFolderHasTitles()
    {
        LibraryFixture::fillFolder(m_fixture.makeFolder("gaps"), {"t1", "t2", "t3"});
        LibraryFixture::fillFolder(m_fixture.makeFolder("none"), {"t1"});
        for (const char* title : {"gaps/t1.xml", "gaps/t2.xml", "none/t1.xml"})
            QVERIFY(QFile::remove(path(title)));
        FolderPickerFactory factory;
        factory.setRootPath(root());
        QVERIFY(!factory.hasChildNode(nullptr));
        factory.importSourceData();
        QVERIFY(factory.hasChildNode(nullptr));
        void* gaps = factory.getChildNode(nullptr);
        void* none = factory.getNextNode(gaps);
        QVERIFY(factory.hasChildNode(gaps));
        QVERIFY(!factory.hasChildNode(none));
        QVERIFY(!factory.hasChildNode(factory.getChildNode(gaps)));
        QCOMPARE(factory.getNodeInfo(factory.getChildNode(gaps)).fileName(), QStringLiteral("t3.xml"));
        // The result is kept until the folder is read again.
        LibraryFixture::fillFolder(path("none"), {"t1"});
        QVERIFY(!factory.hasChildNode(none));
        factory.takeFolder("none");
        QVERIFY(factory.hasChildNode(none));
        QVERIFY(QFile::remove(path("none/t1.xml")));
        factory.importSourceData();
        QVERIFY(!factory.hasChildNode(none));
    }

    void handlesOutliveRenamesAndReadings()
    {
        LibraryFixture::fillFolder(m_fixture.makeFolder("a"), {"t1"});
        LibraryFixture::fillFolder(m_fixture.makeFolder("b"), {"t2"});
        FolderPickerFactory factory;
        factory.setRootPath(root());
        factory.importSourceData();
        void* a = factory.getChildNode(nullptr);
        void* b = factory.getNextNode(a);
        QCOMPARE(factory.getNodeInfo(a).fileName(), QStringLiteral("a"));
        QVERIFY(QDir(root()).rename("a", "c"));
        factory.renameFolder("a", "c");
        factory.importSourceData();
        QCOMPARE(factory.getNodeInfo(a).fileName(), QStringLiteral("c"));
        QCOMPARE(factory.getNodeInfo(factory.getChildNode(a)).fileName(), QStringLiteral("t1.xml"));
        QCOMPARE(factory.getChildNode(nullptr), b);
        QDir(path("b")).removeRecursively();
        factory.importSourceData();
        QCOMPARE(factory.getNextNode(b), nullptr);
        QCOMPARE(factory.getChildNode(b), nullptr);
        // The folder gets the name that the other folder had before.
        factory.renameFolder("c", "b");
        QVERIFY(QDir(root()).rename("c", "b"));
        factory.importSourceData();
        QCOMPARE(factory.getChildNode(nullptr), a);
        QCOMPARE(factory.getNodeInfo(b).fileName(), QString());
        QCOMPARE(factory.getNodeInfo(a).fileName(), QStringLiteral("b"));
    }

    void aRootThatIsNotThere()
    {
        Tree tree(root() + "/gone");
        QCOMPARE(tree.names(), QStringList());
        Tree none{QString()};
        QCOMPARE(none.names(), QStringList());
    }

private:
    struct Tree {
        explicit Tree(const QString& path) : model(&factory, FolderPickerFactory::ColumnCount)
        {
            factory.setRootPath(path);
            model.createDataItems();
        }
        QStringList names(const QModelIndex& parent = QModelIndex())
        {
            QStringList found;
            for (int row = 0; row < model.rowCount(parent); ++row)
                found.append(model.index(row, 0, parent).data().toString());
            return found;
        }
        QModelIndex row(const QString& name)
        {
            return model.index(static_cast<int>(names().indexOf(name)), 0);
        }

        FolderPickerFactory factory;
        KSTreeModel model;
        QAbstractItemModelTester tester{&model, QAbstractItemModelTester::FailureReportingMode::QtTest};
    };

    static void scripts()
    {
        QTest::addColumn<QString>("name");
        QTest::newRow("Latin") << QStringLiteral("Évening news");
        QTest::newRow("Chinese") << QStringLiteral("天气预报天气预报天气预报天气预报天气预报");
        QTest::newRow("Japanese") << QStringLiteral("ニュース速報");
        QTest::newRow("Korean") << QStringLiteral("날씨 예보");
        QTest::newRow("trailing blanks") << QStringLiteral("news  ");
        QTest::newRow("a blank") << QStringLiteral(" ");
        QTest::newRow("as an option") << QStringLiteral("-rf");
    }

    QString root() const { return m_fixture.titleRoot(); }
    QString path(const QString& name) const { return root() + QLatin1Char('/') + name; }
    QStringList folders() const
    {
        return QDir(root()).entryList(QDir::Dirs | QDir::NoDotAndDotDot, QDir::Name);
    }

    LibraryFixture m_fixture;
};

QTEST_MAIN(tst_foldernamerules)
#include "tst_foldernamerules.moc"
