// The check before air: a good folder has no findings, and each fault gives exactly its own.
#include "RenderedFolder.h"
#include "titlectl/Checker.h"

#include <QDateTime>
#include <QTest>
#include <functional>

using Damage = std::function<void(const QString& folder)>;

namespace
{

// Changes the title b and makes its pictures again.
void edit(const QString& folder, const std::function<void(Archive& archive)>& change)
{
    Archive archive;
    const QString path = folder + "/b.xml";
    if (!ArchiveController().getOneArchive(path, &archive))
        qFatal("no title");
    change(archive);
    ArchiveController().saveNewArchive(path, &archive);
    RenderJob job;
    job.title = path;
    if (!TitleRenderer().render(job).isEmpty())
        qFatal("no pictures");
    FileSyncQueue::flush(std::chrono::seconds(30));
}

void editText(const QString& folder, const std::function<void(TText& text)>& change)
{
    edit(folder, [&change](Archive& archive) { change(*archive.text().front()); });
}

void editStyles(const QString& folder, const std::function<void(TextStyle& style)>& change)
{
    editText(folder, [&change](TText& text) {
        for (TextStyle* style : text.textItems())
            change(*style);
    });
}

void write(const QString& path, const QByteArray& bytes)
{
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size())
        qFatal("cannot write");
}

} // namespace

class tst_checker : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void idsAreUnique();
    void goodFolder();
    void eachFaultAlone_data();
    void eachFaultAlone();
    void rulesOfFoldersNeedTheWholeFolder();
    void unknownRule();

private:
    static FindingList check(const QString& path, const QStringList& off = {})
    {
        Checker checker;
        for (const QString& id : off)
            checker.switchOff(id);
        return checker.check(TitlePaths({path}).folders(), [](int) {});
    }

    LibraryFixture m_fixture;
};

void tst_checker::idsAreUnique()
{
    QStringList ids;
    const Checker checker;
    for (const CheckRule& rule : checker.rules()) {
        QVERIFY(!rule.summary.isEmpty());
        QVERIFY((rule.checkFolder == nullptr) != (rule.checkTitle == nullptr));
        ids.append(rule.id);
    }
    QCOMPARE(QSet<QString>(ids.begin(), ids.end()).size(), ids.size());
}

void tst_checker::goodFolder()
{
    const FindingList findings = check(renderedFolder(m_fixture, "good", {"a", "b", "c"}));
    QVERIFY2(findings.isEmpty(), qPrintable(findings.value(0).file + findings.value(0).reason));
}

void tst_checker::eachFaultAlone_data()
{
    QTest::addColumn<Damage>("damage");
    QTest::addColumn<QString>("rule");
    QTest::addColumn<QString>("file");
    QTest::addColumn<QString>("object");
    const auto row = [](const char* rule, const char* file, const char* object, const Damage& damage) {
        QTest::addRow("%s %s %s", rule, file, object)
            << damage << QString(rule) << QString(file) << QString(object);
    };
    row("order-unreadable", ".order.xml", "", [](const QString& folder) {
        QFile::resize(folder + "/.order.xml", QFileInfo(folder + "/.order.xml").size() / 2);
    });
    row("order-names-missing", ".order.xml", "gone.xml", [](const QString& folder) {
        LibraryFixture::writeOrder(folder, {"a", "gone", "b", "c"});
    });
    row("order-names-missing", ".order.xml", "a.xml", [](const QString& folder) {
        LibraryFixture::writeOrder(folder, {"a", "b", "c", "a"});
    });
    row("order-omits", "b.xml", "", [](const QString& folder) {
        LibraryFixture::writeOrder(folder, {"a", "c"});
    });
    row("order-omits", "", "", [](const QString& folder) { QFile::remove(folder + "/.order.xml"); });
    row("leftover", "old_1920.png", "",
        [](const QString& folder) { QFile::copy(folder + "/a_1920.png", folder + "/old_1920.png"); });
    row("title-unreadable", "b.xml", "",
        [](const QString& folder) { write(folder + "/b.xml", "<manifest"); });
    row("font-missing", "b.xml", "text 1", [](const QString& folder) {
        editStyles(folder, [](TextStyle& style) { style.setFontFamily("No Such Font"); });
    });
    row("glyph-missing", "b.xml", "text 1", [](const QString& folder) {
        editStyles(folder,
                   [](TextStyle& style) { style.setText("\xF3\xB0\x80\x80"); }); // a private character
    });
    row("text-empty", "b.xml", "text 1",
        [](const QString& folder) { editStyles(folder, [](TextStyle& style) { style.setText(" "); }); });
    row("text-empty", "b.xml", "",
        [](const QString& folder) { edit(folder, [](Archive& archive) { archive.releaseVectorText(); }); });
    row("text-invisible", "b.xml", "text 1",
        [](const QString& folder) { editStyles(folder, [](TextStyle& style) { style.setFontSize(0); }); });
    row("text-outside", "b.xml", "text 1",
        [](const QString& folder) { editText(folder, [](TText& text) { text.setXValue(4000); }); });
    row("text-cut-off", "b.xml", "text 1",
        [](const QString& folder) { editText(folder, [](TText& text) { text.setYValue(-60); }); });
    row("text-outside-safe-area", "b.xml", "text 1",
        [](const QString& folder) { editText(folder, [](TText& text) { text.setXValue(-20); }); });
    row("picture-missing", "b.xml", "picture 960",
        [](const QString& folder) { QFile::remove(folder + "/b_960.png"); });
    row("picture-torn", "b.xml", "picture 1920",
        [](const QString& folder) { QFile::resize(folder + "/b_1920.png", 500); });
    row("picture-size", "b.xml", "picture 240", [](const QString& folder) {
        QImage small(100, 50, QImage::Format_RGB32);
        small.fill(Qt::red);
        small.save(folder + "/b_240.png");
    });
    row("picture-old", "b.xml", "picture 240 on black", [](const QString& folder) {
        QFile picture(folder + "/b_240S.png");
        if (picture.open(QIODevice::ReadWrite))
            picture.setFileTime(QDateTime::currentDateTime().addDays(-1), QFileDevice::FileModificationTime);
    });
}

void tst_checker::eachFaultAlone()
{
    QFETCH(Damage, damage);
    QFETCH(QString, rule);
    QFETCH(QString, file);
    QFETCH(QString, object);
    const QString folder = renderedFolder(m_fixture, "fault", {"a", "b", "c"});
    damage(folder);
    FileSyncQueue::flush(std::chrono::seconds(30));
    const FindingList findings = check(folder);
    QStringList found;
    for (const Finding& finding : findings)
        found.append(finding.rule + ' ' + QFileInfo(finding.file).fileName() + ' ' + finding.object);
    const QString name = file.isEmpty() ? "fault" : file;
    QCOMPARE(found, QStringList{rule + ' ' + name + ' ' + object});
    QVERIFY(!findings.first().reason.isEmpty());
    QVERIFY(check(folder, {rule}).isEmpty());
}

void tst_checker::rulesOfFoldersNeedTheWholeFolder()
{
    const QString folder = renderedFolder(m_fixture, "title", {"a", "b"});
    LibraryFixture::writeOrder(folder, {"a"});
    FileSyncQueue::flush(std::chrono::seconds(30));
    QCOMPARE(check(folder).size(), 1);
    QVERIFY(check(folder + "/b.xml").isEmpty());
}

void tst_checker::unknownRule()
{
    Checker checker;
    QVERIFY(!checker.switchOff("no-such-rule"));
    const qsizetype count = checker.rules().size();
    QVERIFY(checker.switchOff("leftover"));
    QCOMPARE(checker.rules().size(), count - 1);
}

QTEST_MAIN(tst_checker)
#include "tst_checker.moc"
