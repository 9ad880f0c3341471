// The title file and the order file of a folder.
#include "document/Archive.h"
#include "document/ArchiveOrder.h"
#include "document/FolderTitles.h"
#include "document/TText.h"
#include "document/TitleParser.h"
#include "document/TitleParserUtility.h"
#include "support/FileSyncQueue.h"
#include "tests/support/Patience.h"

#include <QDir>
#include <QElapsedTimer>
#include <QFile>
#include <QTemporaryDir>
#include <QXmlStreamReader>
#include <QtTest/QTest>
#include <cerrno>
#include <clocale>
#include <memory>
#include <stdexcept>
#include <tinyxml.h>

namespace
{

const QByteArray ONE_ITEM = "<text-item text=\"x\" />";

QByteArray title(const QByteArray& metaText)
{
    return "<manifest><meta-bg/>" + metaText + "</manifest>";
}

QByteArray content(const QByteArray& attributes, const QByteArray& items = ONE_ITEM)
{
    return "<content " + attributes + ">" + items + "</content>";
}

std::unique_ptr<Archive> richTitle(const std::string& path)
{
    auto archive = std::make_unique<Archive>();
    archive->setPath(path);
    archive->setVersion("1.2 <&\"'>");
    archive->setThumbnailSmall("标题_240.png");
    archive->setThumbnailBlack("s_240S.png");
    archive->setThumbnailBig("s_1920.png");
    archive->setThumbnailMiddle("s_960.png");
    archive->setClip("1");
    archive->setGain("2");
    archive->setDensity("3");
    archive->setBgResource("/templates/é bg.png");
    archive->setBgResourceBig("/templates/é big.png");
    archive->setBgPointX(-12.5f);
    archive->setBgPointY(1234567.0f);
    archive->setBgPointZ(-2.0f);
    std::vector<TText*> texts;
    const std::vector<std::vector<std::string>> objects = {
        {"A", "快", "讯", "\n", " "},
        {"速", "속", "é", "e\xCC\x81", "😀", "👩‍👩‍👧"},
        {"&", "#", "x", "<", ">", "\"", "'", "\t"}};
    for (const auto& characters : objects) {
        auto* text = new TText;
        std::string whole;
        std::vector<TextStyle*> items;
        for (const std::string& character : characters) {
            whole += character;
            auto* style = new TextStyle;
            style->setText(character);
            style->setFontFamily("Família 字");
            style->setFontSize(20 + int(items.size()));
            style->setFontColor("#0a0B0c");
            style->setFontBold(1);
            style->setIsTextItalic(int(items.size() % 2));
            style->setTextKerning(-5);
            style->setIsTextEdge(1);
            style->setAlphaDefaultFontOfInputLanguage("Default 體");
            TEdge edge;
            edge.setEdgeWidth(11);
            edge.setEdgeColor("#abcdef");
            style->setTextEdge(edge);
            items.push_back(style);
        }
        text->setText(whole);
        text->setTextItems(items);
        text->setTextObjectID(int(texts.size()) + 1);
        text->setXValue(100.5f);
        text->setYValue(-0.25f);
        text->setZValue(float(texts.size()));
        text->setTextAlign(int(texts.size()) - 1);
        text->setShadowStyle(2);
        text->getTextShadow()->setShadowBlurRadius(18);
        text->getTextShadow()->setShadowDirectionX(-3);
        text->getTextShadow()->setShadowDirectionY(4);
        text->getTextShadow()->setShadowColor("#010203");
        texts.push_back(text);
    }
    archive->setText(texts);
    return archive;
}

} // namespace

class tst_titleparser : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init() { m_folder = std::make_unique<QTemporaryDir>(); }

    void cleanup() { QVERIFY(FileSyncQueue::flush(std::chrono::seconds(30))); }

    void roundTrip()
    {
        const std::string file = path("标题 한국 é.xml");
        const auto written = richTitle(file);
        QCOMPARE(m_parser.writeOneTitle(written.get()), 1);
        Archive read;
        QCOMPARE(m_parser.readOneTitle(file, &read), 1);
        QCOMPARE(read.getPath(), file);
        QVERIFY(read.getName().empty());
        QCOMPARE(read.getOrder(), std::string(1, '\xff'));
        QCOMPARE(read.getVersion(), written->getVersion());
        QCOMPARE(read.getThumbnailSmall(), written->getThumbnailSmall());
        QCOMPARE(read.getThumbnailBlack(), written->getThumbnailBlack());
        QCOMPARE(read.getThumbnailBig(), written->getThumbnailBig());
        QCOMPARE(read.getThumbnailMiddle(), written->getThumbnailMiddle());
        QCOMPARE(read.getClip(), std::string("1"));
        QCOMPARE(read.getGain(), std::string("2"));
        QCOMPARE(read.getDensity(), std::string("3"));
        QCOMPARE(read.getBgResource(), written->getBgResource());
        QCOMPARE(read.getBgResourceBig(), written->getBgResourceBig());
        QCOMPARE(read.getBgPointX(), -12.5f);
        QCOMPARE(read.getBgPointY(), 1234570.0f); // six digits
        QCOMPARE(read.getBgPointZ(), -2.0f);
        QCOMPARE(read.getText().size(), written->getText().size());
        for (std::size_t i = 0; i < read.getText().size(); ++i) {
            QVERIFY(*read.getText()[i] == *written->getText()[i]);
            QCOMPARE(read.getText()[i]->getTextItems()[0]->getAlphaDefaultFontOfInputLanguage(),
                     std::string("Default 體"));
        }
    }

    void writtenBytes()
    {
        Archive archive;
        archive.setPath(path("t.xml"));
        archive.setBgPointX(0.1f);
        auto* text = new TText;
        text->setText("é");
        auto* style = new TextStyle;
        style->setText("é");
        text->setTextItems({style});
        archive.setText({text});
        QCOMPARE(m_parser.writeOneTitle(&archive), 1);
        QCOMPARE(
            read("t.xml"),
            QByteArray("<?xml version=\"1.0\" encoding=\"utf-8\" ?>\n"
                       "<manifest type=\"archive\" version=\"\" thumbnail-small=\"\" thumbnail-black=\"\" "
                       "thumbnail-big=\"\" thumbnail-mid=\"\" clip=\"0\" gain=\"0\" density=\"100\">\n"
                       "    <meta-bg resource=\"\" resource-big=\"\" position-X=\"0.1\" position-Y=\"0\" "
                       "position-Z=\"-1\" />\n"
                       "    <meta-text content-count=\"1\">\n"
                       "        <content text=\"é\" id=\"0\" position-X=\"-1\" position-Y=\"-1\" "
                       "position-Z=\"-1\" text-align=\"-1\" text-shadow=\"0\" shadow-color=\"#123123\" "
                       "shadow-direction-x=\"0\" shadow-direction-y=\"0\" shadow-blur-radius=\"18\" "
                       "item-count=\"1\">\n"
                       "            <text-item text=\"é\" font=\"KST\" size=\"96\" color=\"#FFFFFF\" "
                       "bold=\"0\" text-kerning=\"100\" text-italic=\"0\" text-edge=\"0\" "
                       "default-font=\"KST\" edge-width=\"2\" edge-color=\"#000000\" />\n"
                       "        </content>\n"
                       "    </meta-text>\n"
                       "</manifest>\n"));
    }

    // TinyXML's own writer makes the same bytes of the same document.
    void writtenBytesAreThoseOfTinyXml()
    {
        const auto archive = richTitle(path("t.xml"));
        archive->getText()[2]->setText("no reference");
        m_parser.writeOneTitle(archive.get());
        TiXmlDocument document;
        QVERIFY(document.LoadFile(path("t.xml").c_str(), TIXML_ENCODING_UNKNOWN));
        QVERIFY(document.SaveFile(path("u.xml").c_str()));
        QCOMPARE(read("t.xml"), read("u.xml"));
    }

    void refusals()
    {
        Archive archive;
        QCOMPARE(m_parser.writeOneTitle(&archive), 0);
        QCOMPARE(m_parser.writeOneTitle(nullptr), 0);
        QVERIFY(QDir(m_folder->path()).isEmpty());
        QCOMPARE(m_parser.readOneTitle(path("missing.xml"), &archive), 0);
        QVERIFY(archive.getPath().empty());
        QCOMPARE(m_parser.readOneTitle(path("missing.xml"), nullptr), 0);
        archive.setPath(path("no/folder.xml"));
        QCOMPARE(m_parser.writeOneTitle(&archive), -1);
        QCOMPARE(errno, ENOENT);
        archive.setPath("/dev/full");
        QCOMPARE(m_parser.writeOneTitle(&archive), -1);
        QCOMPARE(errno, ENOSPC);
    }

    void rootOfAnyName()
    {
        write("t.xml", "<anything type=\"no\" version=\"7\"><meta-bg/><meta-text/></anything>");
        Archive archive;
        QCOMPARE(m_parser.readOneTitle(path("t.xml"), &archive), 1);
        QCOMPARE(archive.getVersion(), std::string("7"));
        QVERIFY(archive.getText().empty());
    }

    void missingAttributesAreEmptyOrZero()
    {
        write("t.xml", title("<meta-text>" + content("text=\"x\"") + "</meta-text>"));
        Archive archive;
        archive.setClip("9");
        QCOMPARE(m_parser.readOneTitle(path("t.xml"), &archive), 1);
        QVERIFY(archive.getClip().empty() && archive.getGain().empty() && archive.getDensity().empty());
        QCOMPARE(archive.getBgPointZ(), 0.0f);
        const TText& text = *archive.getText()[0];
        QCOMPARE(text.getXValue(), 0.0f);
        QCOMPARE(text.getTextAlign(), 0);
        QCOMPARE(text.getTextObjectID(), 0);
        QVERIFY(text.getTextShadow()->getShadowColor().empty());
        QCOMPARE(text.getTextShadow()->getShadowBlurRadius(), 0.0);
        const TextStyle& style = *text.getTextItems()[0];
        QCOMPARE(style.getText(), std::string("x"));
        QVERIFY(style.getFontFamily().empty() && style.getFontColor().empty());
        QCOMPARE(style.getFontSize(), 0);
        QCOMPARE(style.getTextKerning(), 0);
        QCOMPARE(style.getTextEdge().getEdgeWidth(), 0);
        QVERIFY(style.getTextEdge().getEdgeColor().empty());
        QCOMPARE(style.getAlphaDefaultFontOfInputLanguage(), std::string("KST"));
    }

    void attributesInAnyOrder()
    {
        write("t.xml",
              title("<meta-text>" +
                    content("text=\"x\"", "<text-item edge-color=\"#111111\" more=\"1\" size=\" +12px\" "
                                          "default-font=\"\" bold=\"0x1\" text-edge=\"99999999999\" "
                                          "text-kerning=\"word\" text=\"y\" font=\"F\"/>") +
                    "</meta-text>"));
        Archive archive;
        QCOMPARE(m_parser.readOneTitle(path("t.xml"), &archive), 1);
        const TextStyle& style = *archive.getText()[0]->getTextItems()[0];
        QCOMPARE(style.getText(), std::string("y"));
        QCOMPARE(style.getFontFamily(), std::string("F"));
        QCOMPARE(style.getFontSize(), 12);
        QCOMPARE(style.isFontBold(), 0);
        QCOMPARE(style.getTextKerning(), 0);
        QCOMPARE(style.getTextEdge().getEdgeColor(), std::string("#111111"));
        QCOMPARE(style.getAlphaDefaultFontOfInputLanguage(), std::string("KST"));
    }

    void partsThatAreMissing()
    {
        Archive archive;
        write("a.xml", "<m version=\"5\" thumbnail-big=\"b\"><meta-text/></m>");
        QCOMPARE(m_parser.readOneTitle(path("a.xml"), &archive), 0);
        QCOMPARE(archive.getVersion(), std::string("5"));
        QCOMPARE(archive.getThumbnailBig(), std::string("b"));
        write("b.xml", "<m><meta-bg resource=\"r\"/></m>");
        QCOMPARE(m_parser.readOneTitle(path("b.xml"), &archive), 0);
        QCOMPARE(archive.getBgResource(), std::string("r"));
        write("c.xml", "<?xml version=\"1.0\" ?>");
        QCOMPARE(m_parser.readOneTitle(path("c.xml"), &archive), 0);
        QCOMPARE(archive.getPath(), path("c.xml"));
    }

    void unreadableTextObjectsAreDropped()
    {
        write("t.xml", title("<meta-text content-count=\"77\">" + content("text=\"one\" item-count=\"0\"") +
                             content("text=\"\"") + content("id=\"2\"") + content("text=\"no items\"", "") +
                             content("text=\"two\"", ONE_ITEM + "<other/>" + ONE_ITEM) + "</meta-text>"));
        Archive archive;
        QCOMPARE(m_parser.readOneTitle(path("t.xml"), &archive), 1);
        QCOMPARE(archive.getText().size(), std::size_t(2));
        QCOMPARE(archive.getText()[0]->getText(), std::string("one"));
        QCOMPARE(archive.getText()[1]->getText(), std::string("two"));
        QCOMPARE(archive.getText()[1]->getTextItems().size(), std::size_t(2));
    }

    void blurLosesItsFractionOnWriting()
    {
        Archive archive;
        archive.setPath(path("t.xml"));
        auto* text = new TText;
        text->setTextItems({new TextStyle});
        archive.setText({text});
        m_parser.writeOneTitle(&archive);
        QVERIFY(read("t.xml").contains("shadow-blur-radius=\"18\""));
        for (const auto& [value, expected] : {std::pair(1e300, "2147483647"), std::pair(-7.9, "-7")}) {
            text->getTextShadow()->setShadowBlurRadius(value);
            m_parser.writeOneTitle(&archive);
            QVERIFY(read("t.xml").contains("shadow-blur-radius=\"" + QByteArray(expected) + "\""));
        }
        write("t.xml",
              title("<meta-text>" + content("text=\"x\" shadow-blur-radius=\"18.3\"") + "</meta-text>"));
        Archive loaded;
        QCOMPARE(m_parser.readOneTitle(path("t.xml"), &loaded), 1);
        QCOMPARE(loaded.getText()[0]->getTextShadow()->getShadowBlurRadius(), 18.3);
    }

    // XML has no form for control characters; strict readers would refuse the whole title.
    void charactersThatXmlCannotHoldAreReplaced()
    {
        Archive archive;
        archive.setPath(path("t.xml"));
        auto* text = new TText;
        text->setText("a\x01\x1F\xEF\xBF\xBE\xEF\xBF\xBF\xEF\xBF\xBD\t\nz");
        auto* style = new TextStyle;
        style->setText("\x08");
        text->setTextItems({style});
        archive.setText({text});
        QCOMPARE(m_parser.writeOneTitle(&archive), 1);

        QXmlStreamReader strict(read("t.xml"));
        while (!strict.atEnd())
            strict.readNext();
        QVERIFY2(!strict.hasError(), qPrintable(strict.errorString()));
        Archive loaded;
        QCOMPARE(m_parser.readOneTitle(path("t.xml"), &loaded), 1);
        QCOMPARE(loaded.getText()[0]->getText(), std::string("a\uFFFD\uFFFD\uFFFD\uFFFD\uFFFD\t\nz"));
        QCOMPARE(loaded.getText()[0]->getTextItems()[0]->getText(), std::string("\uFFFD"));
    }

    // A file without an encoding brings single bytes, which must not make the next file unreadable.
    void bytesThatAreNoCharactersAreReplaced()
    {
        Archive archive;
        archive.setPath(path("u.xml"));
        for (const char* bytes : {"caf\xE9", "\xE9\x80", "\xC0\x80z", "\xED\xA0\x80", "\xF5", "a\x80"}) {
            archive.releaseVectorText();
            auto* text = new TText;
            text->setText(bytes);
            text->setTextItems({new TextStyle});
            archive.setText({text});
            QCOMPARE(m_parser.writeOneTitle(&archive), 1);
            Archive loaded;
            QCOMPARE(m_parser.readOneTitle(path("u.xml"), &loaded), 1);
            const QString read = QString::fromStdString(loaded.text().front()->getText());
            QVERIFY2(read.contains(QChar::ReplacementCharacter), bytes);
            QCOMPARE(read, QString::fromUtf8(bytes));
        }
    }

    void emptyTextIsLostOnTheNextLoad()
    {
        Archive archive;
        archive.setPath(path("t.xml"));
        auto* text = new TText;
        text->setText("");
        text->setTextItems({new TextStyle});
        archive.setText({text, nullptr});
        QCOMPARE(m_parser.writeOneTitle(&archive), 1);
        QVERIFY(read("t.xml").contains("content-count=\"2\"") && read("t.xml").contains("<content />"));
        Archive loaded;
        QCOMPARE(m_parser.readOneTitle(path("t.xml"), &loaded), 1);
        QVERIFY(loaded.getText().empty());
        archive.setText({text});
    }

    void numbersHaveAPointInEveryLocale()
    {
        // A locale with a decimal comma, when the machine has one; the result is the same without.
        const std::string before = std::setlocale(LC_ALL, nullptr);
        for (const char* name : {"de_DE.UTF-8", "fr_FR.UTF-8"})
            std::setlocale(LC_ALL, name);
        const auto archive = richTitle(path("t.xml"));
        m_parser.writeOneTitle(archive.get());
        Archive loaded;
        m_parser.readOneTitle(path("t.xml"), &loaded);
        std::setlocale(LC_ALL, before.c_str());
        QVERIFY(read("t.xml").contains("position-X=\"-12.5\""));
        QCOMPARE(loaded.getBgPointX(), -12.5f);
        QCOMPARE(TitleParserUtility::toDouble(" +1.5e2x"), 150.0);
        QCOMPARE(TitleParserUtility::toDouble("x"), 0.0);
        for (const double value : {0.0, -0.0, 1e-5, 123456.0, 1234567.0, 0.1, 1.0 / 3, -1e300}) {
            char expected[64];
            std::snprintf(expected, sizeof expected, "%g", value);
            QCOMPARE(TitleParserUtility::fromDouble(value), std::string(expected));
        }
    }

    void propertiesChangeInPlace()
    {
        const auto archive = richTitle(path("t.xml"));
        m_parser.writeOneTitle(archive.get());
        QByteArray expected = read("t.xml");
        expected.replace(" clip=\"1\"", " clip=\"é&lt;\"").replace(" gain=\"2\"", " gain=\"20\"");
        expected.replace(" density=\"3\"", " density=\"\"");
        QCOMPARE(m_parser.modifyProp(KeyDefine::TITLE_PROP_CLIP, path("t.xml"), "é<"), 1);
        QCOMPARE(m_parser.modifyGain(path("t.xml"), "20"), 1);
        QCOMPARE(m_parser.modifyProp(KeyDefine::TITLE_PROP_ID_t(2), path("t.xml"), ""), 1);
        QCOMPARE(read("t.xml"), expected);
        QCOMPARE(m_parser.modifyProp(KeyDefine::TITLE_PROP_ID_t(3), path("t.xml"), "7"), 0);
        QCOMPARE(read("t.xml"), expected);
        QCOMPARE(m_parser.modifyAttributeValue(path("t.xml"), "new", "v"), 1);
        QVERIFY(read("t.xml").contains(" new=\"v\">"));
        QCOMPARE(m_parser.modifyDensity(path("missing.xml"), "7"), 0);
        QVERIFY(!QFile::exists(m_folder->filePath("missing.xml")));
    }

    void findsNodesByName()
    {
        TiXmlDocument document;
        document.Parse("<a><b n=\"1\"><c n=\"2\"/></b><c n=\"3\"/></a>");
        TiXmlElement* found = nullptr;
        QVERIFY(m_parser.getNodePointerByName(document.RootElement(), "c", found));
        QCOMPARE(m_parser.getIntAttribute(found, "n"), 2);
        QVERIFY(m_parser.getNodePointerByName(document.RootElement(), "a", found));
        QCOMPARE(found, document.RootElement());
        // Siblings of the start are not searched.
        QVERIFY(!m_parser.getNodePointerByName(document.RootElement()->FirstChildElement("b"), "a", found));
        QVERIFY(!m_parser.getNodePointerByName(nullptr, "a", found));
        QCOMPARE(m_parser.getAttribute(nullptr, "n"), std::string());
        QCOMPARE(m_parser.getDoubleAttribute(found, "n"), 0.0);
    }

    void hostileTitles_data()
    {
        QTest::addColumn<QByteArray>("bytes");
        QTest::newRow("empty") << QByteArray();
        QTest::newRow("text") << QByteArray("hello");
        QTest::newRow("picture") << QByteArray("\x89PNG\r\n\x1a\n\0\0\0\rIHDR", 16);
        QTest::newRow("zeros") << QByteArray(4096, '\0');
        QTest::newRow("deep") << title(QByteArray("<a>").repeated(50000));
        QTest::newRow("wide") << "<m" + QByteArray(" a=\"1\"").repeated(20000) +
                                     "><meta-bg/><meta-text/></m>";
        QTest::newRow("large") << title("<meta-text/>" + QByteArray(9 << 20, ' '));
        QTest::newRow("latin1") << title("<meta-text><content text=\"\xe9\"/></meta-text>");
    }

    void hostileTitles()
    {
        QFETCH(QByteArray, bytes);
        write("t.xml", bytes);
        write(".order.xml", bytes);
        Archive archive;
        QElapsedTimer timer;
        timer.start();
        QCOMPARE(m_parser.readOneTitle(path("t.xml"), &archive), 0);
        QCOMPARE(m_parser.modifyClip(path("t.xml"), "1"), 0);
        QVERIFY(m_parser.readFileOrderInFolder(folder()).empty());
        QVERIFY(m_parser.getFilsByOrderInFolder(folder()).empty());
        QVERIFY(timer.elapsed() < PATIENCE_MS);
        QCOMPARE(read("t.xml"), bytes);
    }

    void everyTruncation()
    {
        const auto archive = richTitle(path("whole.xml"));
        m_parser.writeOneTitle(archive.get());
        const QByteArray bytes = read("whole.xml");
        int readable = 0;
        for (qsizetype size = 0; size < bytes.size(); ++size) {
            write("t.xml", bytes.left(size));
            Archive loaded;
            readable += m_parser.readOneTitle(path("t.xml"), &loaded);
        }
        QCOMPARE(readable, 1); // without its last line feed
    }

    void orderTruncations()
    {
        m_parser.writeFileOrderInFolder(folder(), {row(0, "标题.xml"), row(1, "b.xml")});
        const QByteArray bytes = read(".order.xml");
        for (qsizetype size = 0; size < bytes.size(); ++size) {
            write(".order.xml", bytes.left(size));
            const auto rows = m_parser.readFileOrderInFolder(folder());
            QCOMPARE(rows.size(), size == bytes.size() - 1 ? std::size_t(2) : std::size_t(0));
            qDeleteAll(rows);
        }
    }

    void orderFile()
    {
        QVERIFY(m_parser.readFileOrderInFolder(folder()).empty());
        QCOMPARE(m_parser.writeFileOrderInFolder(folder(), {row(5, "a.xml"), row(3, "é 中.xml"), row(1, "")}),
                 1);
        QCOMPARE(read(".order.xml"), QByteArray("<?xml version=\"1.0\" encoding=\"utf-8\" ?>\n"
                                                "<manifest type=\"order\" index-count=\"3\">\n"
                                                "    <index value=\"5\" file-path=\"a.xml\" />\n"
                                                "    <index value=\"3\" file-path=\"é 中.xml\" />\n"
                                                "    <index value=\"1\" file-path=\"\" />\n"
                                                "</manifest>\n"));
        auto rows = m_parser.readFileOrderInFolder(folder());
        QCOMPARE(rows.size(), std::size_t(3));
        QCOMPARE(rows[0]->getArchiveIndex(), 5);
        QCOMPARE(rows[1]->getArchivePath(), std::string("é 中.xml"));
        QVERIFY(rows[2]->getArchivePath().empty());
        qDeleteAll(rows);
        QCOMPARE(m_parser.writeFileOrderInFolder(folder() + "/missing", {}), -1);
        QCOMPARE(m_parser.writeFileOrderInFolder(folder(), {}), 1);
        QVERIFY(read(".order.xml").contains("index-count=\"0\""));
    }

    void titlesInOrder()
    {
        for (const char* name : {"a.xml", "b.xml", "c.xml", "unnamed.xml"}) {
            const auto archive = richTitle(path(name));
            m_parser.writeOneTitle(archive.get());
        }
        write("broken.xml", "<m>");
        write(".order.xml",
              "<any><index value=\"5\" file-path=\"c.xml\"/><index file-path=\"x.xml\"/>"
              "<index value=\"no\" file-path=\"x.xml\"/><other/><index value=\"3\" "
              "file-path=\"broken.xml\"/><index value=\"1\"/><index value=\"1\" file-path=\"a.xml\"/>"
              "</any>");
        for (int variant = 0; variant < 2; ++variant) {
            const auto titles = variant == 0 ? m_parser.getFilsByOrderInFolder(folder())
                                             : m_parser.getFilesByOrderInFolderWithoutCheck(folder());
            QCOMPARE(titles.size(), std::size_t(3));
            QCOMPARE(titles[0]->getName(), std::string("c"));
            QCOMPARE(titles[0]->getOrder(), std::string("1"));
            QCOMPARE(titles[0]->getPath(), path("c.xml"));
            // The row without a path is a blank record; the broken title took position 2.
            QVERIFY(titles[1]->getName().empty() && titles[1]->getPath().empty());
            QCOMPARE(titles[1]->getOrder(), std::string(1, '\xff'));
            QCOMPARE(titles[2]->getName(), std::string("a"));
            QCOMPARE(titles[2]->getOrder(), std::string("4"));
            QCOMPARE(titles[2]->getText().size(), std::size_t(3));
            qDeleteAll(titles);
        }
    }

    // Of so many each core reads some.
    void titlesOfALongFolderInOrder()
    {
        constexpr int ROWS = 99;
        std::vector<ArchiveOrder> rows;
        std::vector<std::string> wanted;
        for (int i = ROWS; i > 0; --i) {
            const std::string name = "title" + std::to_string(i);
            rows.push_back(row(ROWS - i, (name + ".xml").c_str()));
            if (i % 7 == 0)
                continue; // missing
            if (i % 5 == 0) {
                write((name + ".xml").c_str(), "<torn");
                continue;
            }
            const auto archive = richTitle(path((name + ".xml").c_str()));
            m_parser.writeOneTitle(archive.get());
            wanted.push_back(name + " at " + std::to_string(ROWS - i + 1));
        }
        m_parser.writeFileOrderInFolder(folder(), rows);
        std::vector<std::string> found;
        const auto titles = m_parser.getFilsByOrderInFolder(folder());
        for (const Archive* title : titles) {
            QCOMPARE(title->getText().size(), std::size_t(3));
            found.push_back(title->getName() + " at " + title->getOrder());
        }
        QCOMPARE(found, wanted);
        qDeleteAll(titles);
    }

    void someTitlesOfALongFolder()
    {
        std::vector<ArchiveOrder> rows{row(0, ""), row(1, "ab"), row(2, "torn.xml"), row(3, "gone.xml")};
        write("torn.xml", "<torn");
        for (int i = 4; i < 60; ++i) {
            const std::string name = "title" + std::to_string(i) + ".xml";
            rows.push_back(row(i, name.c_str()));
            const auto archive = richTitle(path(name.c_str()));
            m_parser.writeOneTitle(archive.get());
        }
        m_parser.writeFileOrderInFolder(folder(), rows);
        const FolderTitles titles(folder());
        QCOMPARE(titles.count(), rows.size());
        QVERIFY(titles.read(0) && titles.read(0)->getPath().empty());
        QVERIFY(titles.path(0).empty());
        QVERIFY(!titles.read(1) && !titles.canBeTitle(1));
        QVERIFY(!titles.read(2) && titles.canBeTitle(2));
        QVERIFY(!titles.read(3));
        QCOMPARE(titles.fileName(40), std::string("title40.xml"));
        QCOMPARE(titles.path(40), path("title40.xml"));
        const auto slice = titles.read(30, 30);
        QCOMPARE(slice.size(), std::size_t(30));
        QCOMPARE(slice[10]->getName(), std::string("title40"));
        QCOMPARE(slice[10]->getOrder(), std::string("41"));
        QCOMPARE(slice[10]->getPath(), path("title40.xml"));
        QCOMPARE(slice[10]->getText().size(), std::size_t(3));
        QCOMPARE(FolderTitles(folder() + "/missing").count(), std::size_t(0));
        QCOMPARE(FolderTitles(std::string()).count(), std::size_t(0));
    }

    void templateRowsPointIntoFolders()
    {
        QVERIFY(QDir(m_folder->path()).mkdir("UserTemplate_001"));
        const auto archive = richTitle(path("UserTemplate_001/Titler.xml"));
        m_parser.writeOneTitle(archive.get());
        m_parser.writeFileOrderInFolder(folder(), {row(0, "UserTemplate_001/Titler.xml")});
        const auto titles = m_parser.getFilsByOrderInFolder(folder());
        QCOMPARE(titles.size(), std::size_t(1));
        QCOMPARE(titles[0]->getName(), std::string("UserTemplate_001/Titler"));
        qDeleteAll(titles);
        m_parser.writeFileOrderInFolder(folder(), {row(0, "a.x")});
        QVERIFY_EXCEPTION_THROWN(m_parser.getFilsByOrderInFolder(folder()), std::out_of_range);
    }

    void listings()
    {
        QVERIFY(TitleParserUtility::queryFilesInFolder(folder() + "/missing").empty());
        QVERIFY(TitleParserUtility::queryChildFolders(folder() + "/missing").empty());
        for (const char* name : {"a.xml", "b.xml.bak", "C.XML", "d.png", ".order.xml", "中.xml"})
            write(name, "x");
        for (const char* name : {"dir.xml", ".hidden", "with.dot", "新闻"})
            QVERIFY(QDir(m_folder->path()).mkdir(name));
        auto files = TitleParserUtility::queryFilesInFolder(folder());
        std::sort(files.begin(), files.end());
        QCOMPARE(files, std::vector<std::string>(
                            {path(".order.xml"), path("a.xml"), path("b.xml.bak"), path("中.xml")}));
        auto folders = TitleParserUtility::queryChildFolders(folder());
        std::sort(folders.begin(), folders.end());
        QCOMPARE(folders, std::vector<std::string>({path("dir.xml"), path("with.dot"), path("新闻")}));
    }

    void strings()
    {
        const std::string text = "aé中속😀" + std::string(3000, 'x');
        QCOMPARE(TitleParserUtility::wstring2String(TitleParserUtility::string2Wstring(text)), text);
        QCOMPARE(TitleParserUtility::string2Wstring("a\xff"), std::wstring(L"a"));
        QCOMPARE(TitleParserUtility::char2String(0x0f), std::string("0F"));
        QCOMPARE(TitleParserUtility::char2String(0xa9), std::string("A9"));
    }

private:
    static ArchiveOrder row(int index, const std::string& path)
    {
        ArchiveOrder order;
        order.setArchiveIndex(index);
        order.setArchivePath(path);
        return order;
    }

    std::string folder() const { return m_folder->path().toStdString(); }
    std::string path(const QString& name) const { return m_folder->filePath(name).toStdString(); }

    QByteArray read(const QString& name) const
    {
        QFile file(m_folder->filePath(name));
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
    }

    void write(const QString& name, const QByteArray& bytes) const
    {
        QFile file(m_folder->filePath(name));
        if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size())
            qFatal("cannot write %s", qPrintable(name));
    }

    std::unique_ptr<QTemporaryDir> m_folder;
    TitleParser m_parser;
};

QTEST_GUILESS_MAIN(tst_titleparser)
#include "tst_titleparser.moc"
