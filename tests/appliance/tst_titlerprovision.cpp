#include "appliance/PresetTemplates.h"
#include "appliance/SampleBackgrounds.h"
#include "appliance/SampleTitles.h"
#include "appliance/TitlerProvision.h"
#include "document/Archive.h"
#include "document/TText.h"
#include "document/TitleParser.h"
#include "support/IPathManagerEx.h"

#include <QDirIterator>
#include <QFile>
#include <QFileInfo>
#include <QImage>
#include <QTemporaryDir>
#include <QTest>
#include <QXmlStreamReader>
#include <memory>

namespace
{

QByteArray contents(const QString& path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

QMap<QString, QByteArray> tree(const QString& root)
{
    QMap<QString, QByteArray> files;
    QDirIterator walk(root, QDir::Files | QDir::Hidden, QDirIterator::Subdirectories);
    while (walk.hasNext()) {
        const QString path = walk.next();
        files.insert(path.mid(root.size()), contents(path));
    }
    return files;
}

std::vector<std::unique_ptr<Archive>> titlesOf(const QString& folder)
{
    std::vector<std::unique_ptr<Archive>> titles;
    for (Archive* archive : TitleParser().getFilsByOrderInFolder(folder.toStdString()))
        titles.emplace_back(archive);
    return titles;
}

// Edges of glyphs may differ by some shades when the process has drawn other text before.
constexpr double MEAN_SHADES = 0.25;

// The mean difference over all channels of all pixels; -1 if the pictures cannot be compared.
double meanDifference(const QByteArray& one, const QByteArray& two)
{
    const QImage first = QImage::fromData(one).convertToFormat(QImage::Format_RGBA8888);
    const QImage second = QImage::fromData(two).convertToFormat(QImage::Format_RGBA8888);
    if (first.isNull() || first.size() != second.size())
        return -1;
    qint64 sum = 0;
    for (int y = 0; y < first.height(); ++y) {
        const uchar* a = first.constScanLine(y);
        const uchar* b = second.constScanLine(y);
        for (int x = 0; x < 4 * first.width(); ++x)
            sum += qAbs(int(a[x]) - int(b[x]));
    }
    return double(sum) / (4.0 * first.width() * first.height());
}

// Makes the folder the data path of the process and gives its base path.
QString useDataPath(const QTemporaryDir& dir)
{
    qputenv("K2SYS_AC_DATA", dir.path().toLocal8Bit());
    IPathManagerEx::clearUp(); // what it knows of the folders is about the path before
    return TitlerProvision::basePathOfEnvironment();
}

} // namespace

class tst_titlerprovision : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void thePathFileHasEveryNode();
    void checkersHaveTwoShades();
    void checkerIsThatOfTheList();
    void sampleTitlesAreWhole();
    void samplesShowFourScriptsAnOutlineAndAShadow();
    void templatesAreReadInBothLanguages();
    void aSecondRunKeepsWhatTheUserMade();
    void itIsTheSameEveryTime();
    void anInterruptedRunIsMadeGood();
    void aPathThatCannotBeMadeIsReported();

private:
    QTemporaryDir m_dir;
    QString m_base;
};

void tst_titlerprovision::initTestCase()
{
    QVERIFY(m_dir.isValid());
    m_base = useDataPath(m_dir);
    QCOMPARE(m_base, m_dir.path() + "/defaultuser/");
    TitlerProvision provision(m_base);
    QVERIFY2(provision.writeMissing(), qPrintable(provision.error()));
    for (const QString& path : tree(m_base).keys())
        QVERIFY2(!path.contains(".making"), qPrintable(path));
}

void tst_titlerprovision::thePathFileHasEveryNode()
{
    QFile file(m_base + "PathInfo.xml");
    QVERIFY(file.open(QIODevice::ReadOnly));
    QXmlStreamReader xml(&file);
    QMap<QString, QString> paths;
    QVERIFY(xml.readNextStartElement());
    while (xml.readNextStartElement()) {
        paths.insert(xml.name().toString(), xml.attributes().value("path").toString());
        xml.skipCurrentElement();
    }
    QVERIFY(!xml.hasError());
    for (const char* node : {"Titler",        "Project",    "Projects",      "Template",
                             "CurrentStatus", "StreamKey",  "SystemSetting", "TitlerTemplate",
                             "Movie",         "TitleImage", "TitleResource", "Audio",
                             "Font",          "VOD",        "MXF",           "Logo",
                             "Title",         "tmp",        "Resource",      "Data"}) {
        QVERIFY2(!paths.value(node).isEmpty(), node);
        QVERIFY2(!paths.value(node).startsWith('/'), node);
    }
    QCOMPARE(paths.value("TitleResource"), QString("resources/Titles"));
}

void tst_titlerprovision::checkersHaveTwoShades()
{
    for (const QSize& size : {QSize(240, 135), QSize(135, 135)}) {
        const QImage checker(
            m_base + QString("resources/Templates/checker_%1x%2.png").arg(size.width()).arg(size.height()));
        QCOMPARE(checker.size(), size);
        QVERIFY(checker.pixel(0, 0) != checker.pixel(15, 0));
        QCOMPARE(checker.pixel(0, 0), checker.pixel(15, 15));
    }
}

// A title that is edited lies on the program's own checker, a saved one on that of the data path.
void tst_titlerprovision::checkerIsThatOfTheList()
{
    Q_INIT_RESOURCE(TitlerToolResource);
    const QImage saved(m_base + "resources/Templates/checker_240x135.png");
    const QImage tile(QStringLiteral(":/checker"));
    QVERIFY(!tile.isNull());
    for (int y = 0; y < saved.height(); ++y) {
        for (int x = 0; x < saved.width(); ++x) {
            const QColor wanted = tile.pixelColor(x % tile.width(), y % tile.height());
            QVERIFY2(saved.pixelColor(x, y) == wanted, qPrintable(QString("%1, %2").arg(x).arg(y)));
        }
    }
}

void tst_titlerprovision::sampleTitlesAreWhole()
{
    const auto titles = titlesOf(m_base + "resources/Titles/Welcome");
    QCOMPARE(titles.size(), std::size_t(4));
    QCOMPARE(titlesOf(m_base + QString::fromUtf8("resources/Titles/天气")).size(), std::size_t(2));
    for (const auto& title : titles) {
        const QString folder = QFileInfo(QString::fromStdString(title->getPath())).path() + '/';
        const auto picture = [&folder](const std::string& name) {
            return QImage(folder + QString::fromStdString(name));
        };
        QCOMPARE(picture(title->getThumbnailBig()).size(), QSize(1920, 1080));
        QCOMPARE(picture(title->getThumbnailMiddle()).size(), QSize(960, 540));
        QCOMPARE(picture(title->getThumbnailSmall()).size(), QSize(240, 135));
        QCOMPARE(picture(title->getThumbnailBlack()).size(), QSize(240, 135));
        if (!title->getBgResource().empty()) {
            QVERIFY(!title->isPreset());
            QCOMPARE(picture(title->getBgResource()).size(), QSize(1280, 720));
            QCOMPARE(picture(title->getBgResourceBig()).size(), QSize(1920, 1080));
        }
    }
}

void tst_titlerprovision::samplesShowFourScriptsAnOutlineAndAShadow()
{
    const auto titles = titlesOf(m_base + "resources/Titles/Welcome");
    QStringList families;
    for (const TText* text : titles.at(1)->text()) {
        families << QString::fromStdString(text->textItems().at(0)->getFontFamily());
        QCOMPARE(text->textItems().size(), std::size_t(QString::fromStdString(text->getText()).size()));
    }
    QCOMPARE(families, QStringList({"KST", "DFHeiW5-A", "KST Japanese Pro", "YDGothic 100 Pro"}));
    const auto& first = titles.at(0)->text();
    QCOMPARE(first.size(), std::size_t(2));
    QVERIFY(first.at(0)->textItems().at(0)->isTextEdge() != 0);
    QVERIFY(first.at(1)->getShadowStyle() != 0);
    QCOMPARE(first.at(1)->getText(), std::string("晚间新闻"));

    // The text is in the picture: it differs from the background where the text stands.
    const QString folder = m_base + "resources/Titles/Welcome/";
    const QImage shown(folder + QString::fromStdString(titles.at(0)->getThumbnailBig()));
    const QImage background(folder + QString::fromStdString(titles.at(0)->getBgResourceBig()));
    const QRect text(30, 780, 1000, 280);
    const QRect sky(30, 30, 1000, 280);
    QVERIFY(shown.convertToFormat(QImage::Format_RGB32).copy(text) !=
            background.convertToFormat(QImage::Format_RGB32).copy(text));
    QCOMPARE(shown.convertToFormat(QImage::Format_RGB32).copy(sky),
             background.convertToFormat(QImage::Format_RGB32).copy(sky));
}

void tst_titlerprovision::templatesAreReadInBothLanguages()
{
    for (const bool chinese : {false, true}) {
        const QString set = chinese ? "templates_chs" : "templates_en";
        const auto templates = titlesOf(m_base + "resources/Templates/" + set);
        const auto samples = PresetTemplates::samples(chinese);
        QCOMPARE(templates.size(), samples.size());
        for (std::size_t i = 0; i < samples.size(); ++i) {
            const Archive& preset = *templates.at(i);
            QCOMPARE(preset.getName(), samples.at(i).stem);
            QCOMPARE(preset.text().size(), samples.at(i).archive.text().size());
            QCOMPARE(preset.isPreset(), bool(samples.at(i).background));
            QCOMPARE(QImage(preset.getFullPathOfThumbnailSmall()).size(), QSize(240, 135));
            if (preset.isPreset()) {
                QCOMPARE(QImage(preset.getFullPathOfBgResource()).size(), QSize(1280, 720));
                QCOMPARE(QImage(preset.getFullPathOfBgResourceBig()).size(), QSize(1920, 1080));
            }
        }
    }
}

void tst_titlerprovision::aSecondRunKeepsWhatTheUserMade()
{
    QTemporaryDir dir;
    const QString base = useDataPath(dir);
    QVERIFY(TitlerProvision(base).writeMissing());
    const QString folder = base + "resources/Titles/Welcome/";
    QFile changed(folder + "20240101090000001.xml");
    QVERIFY(changed.open(QIODevice::WriteOnly));
    changed.write("<mine/>");
    changed.close();
    QVERIFY(QFile::remove(folder + "20240101090000002.xml"));
    QVERIFY(QDir(base + QString::fromUtf8("resources/Titles/天气")).removeRecursively());
    const QString presets = base + "resources/Templates/templates_en/";
    QVERIFY(QFile::remove(presets + "Quote.xml"));
    QFile changedPreset(presets + "Strap.xml");
    QVERIFY(changedPreset.open(QIODevice::WriteOnly));
    changedPreset.write("<mine/>");
    changedPreset.close();
    QVERIFY(QFile::remove(base + "resources/Templates/checker_240x135.png"));
    QMap<QString, QByteArray> expected = tree(base);

    QVERIFY(TitlerProvision(base).writeMissing());
    QVERIFY(QFileInfo::exists(base + "resources/Templates/checker_240x135.png"));
    QMap<QString, QByteArray> after = tree(base);
    after.remove("resources/Templates/checker_240x135.png");
    QCOMPARE(after, expected);
}

void tst_titlerprovision::itIsTheSameEveryTime()
{
    QTemporaryDir dir;
    const QString base = useDataPath(dir);
    QVERIFY(TitlerProvision(base).writeMissing());
    const QMap<QString, QByteArray> other = tree(base);
    const QMap<QString, QByteArray> first = tree(m_base);
    QCOMPARE(other.keys(), first.keys());
    for (auto file = first.cbegin(); file != first.cend(); ++file) {
        if (file.key().endsWith(".png")) {
            const double difference = meanDifference(file.value(), other.value(file.key()));
            QVERIFY2(difference >= 0 && difference <= MEAN_SHADES,
                     qPrintable(file.key() + QStringLiteral(": %1").arg(difference)));
        }
    }
}

void tst_titlerprovision::anInterruptedRunIsMadeGood()
{
    QTemporaryDir dir;
    const QString base = useDataPath(dir);
    QVERIFY(QDir().mkpath(base + "resources/Titles.making/Welcome.making"));
    QFile torn(base + "resources/Titles.making/Welcome.making/20240101090000001.xml");
    QVERIFY(torn.open(QIODevice::WriteOnly));
    torn.write("<manifest");
    torn.close();
    QVERIFY(TitlerProvision(base).writeMissing());
    QVERIFY(!QFileInfo::exists(base + "resources/Titles.making"));
    QCOMPARE(titlesOf(base + "resources/Titles/Welcome").size(), std::size_t(4));
}

void tst_titlerprovision::aPathThatCannotBeMadeIsReported()
{
    QTemporaryDir dir;
    QFile file(dir.path() + "/defaultuser");
    QVERIFY(file.open(QIODevice::WriteOnly));
    TitlerProvision provision(dir.path() + "/defaultuser/");
    QVERIFY(!provision.writeMissing());
    QVERIFY(provision.error().contains("defaultuser"));
}

QTEST_MAIN(tst_titlerprovision)
#include "tst_titlerprovision.moc"
