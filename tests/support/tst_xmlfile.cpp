// The check in front of TinyXML, and loading and saving through it.
#include "Patience.h"
#include "support/AtomicFile.h"
#include "support/XmlFile.h"
#include "support/XmlFileGuard.h"
#include "tests/support/RandomSeed.h"

#include <QElapsedTimer>
#include <QFile>
#include <QRandomGenerator>
#include <QTemporaryDir>
#include <QtTest/QTest>
#include <sys/stat.h>
#include <tinyxml.h>

namespace
{

std::string repeated(const std::string& text, int count)
{
    std::string result;
    for (int i = 0; i < count; ++i)
        result += text;
    return result;
}

std::string nested(int depth)
{
    return repeated("<a>", depth) + repeated("</a>", depth);
}

std::string withAttributes(int count)
{
    std::string text = "<a";
    for (int i = 0; i < count; ++i)
        text += " k" + std::to_string(i) + "=\"v\"";
    return text + "/>";
}

int depthOf(const TiXmlNode* node)
{
    int depth = 0;
    for (const TiXmlElement* child = node->FirstChildElement(); child; child = child->NextSiblingElement())
        depth = std::max(depth, 1 + depthOf(child));
    return depth;
}

bool tinyXmlAccepts(const std::string& bytes, int* depth = nullptr)
{
    TiXmlDocument document;
    document.Parse(bytes.c_str(), nullptr, TIXML_ENCODING_UTF8);
    if (depth)
        *depth = depthOf(&document);
    return !document.Error();
}

const std::string SAMPLE = "<?xml version=\"1.0\" encoding=\"utf-8\" ?>\n"
                           "<!-- a <comment> with </tags> -->\n"
                           "<manifest type=\"archive\" version='1 \"quoted\"'>\n"
                           "  <meta-bg resource=\"a&amp;b&#x4E2D;\" position-X=\"-1.5\" />\n"
                           "  <meta-text content-count=\"1\"><content text=\"é中文한국어😀\" id=1 >\n"
                           "    plain text <![CDATA[ <raw> </raw> ]]> tail <unknown:x/> <!DOCTYPE y>\n"
                           "  </content></meta-text>\n"
                           "</manifest>\n";

} // namespace

class tst_xmlfile : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { QVERIFY(m_folder.isValid()); }

    void limits_data()
    {
        QTest::addColumn<QByteArray>("bytes");
        QTest::addColumn<bool>("isAccepted");
        const auto row = [](const char* name, const std::string& bytes, bool isAccepted) {
            QTest::newRow(name) << QByteArray::fromStdString(bytes) << isAccepted;
        };
        row("sample", SAMPLE, true);
        row("empty", "", false);
        row("depth 64", nested(64), true);
        row("depth 65", nested(65), false);
        row("depth 50000", nested(50000), false);
        row("50000 open only", repeated("<a>", 50000), false);
        row("256 attributes", withAttributes(256), true);
        row("257 attributes", withAttributes(257), false);
        row("20000 attributes", withAttributes(20000), false);
        row("depth behind a quoted end", repeated("<a b=\"</a></a>\">", 65) + repeated("</a>", 65), false);
        row("depth behind a declaration",
            repeated("<a><?xml version=\"></a>\" ?>", 65) + repeated("</a>", 65), false);
        row("depth behind a mark", "<r/>\xEF\xBB\xBF" + nested(65), false);
        row("depth behind a comment", "<r/><!-- -->" + nested(65), false);
        row("many siblings", "<r>" + repeated("<a/>", 100000) + "</r>", true);
        row("depth behind a reference", repeated("<a b=\"&#x\"></a>&#x41;\">", 65) + repeated("</a>", 65),
            false);
        row("good references", "<r a=\"&#x4E2D;&#65;&amp;&other;&\">&#x41;&</r>", true);
        row("open reference", "<r a=\"&#x41\"/>", false);
        row("reference without digits", "<r>&#x;</r>", false);
        row("reference to a surrogate", "<r a=\"&#xD800;\"/>", false);
        row("reference beyond Unicode", "<r>&#1114112;</r>", false);
        row("reference to the last character", "<r>&#x10FFFD;&#55295;</r>", true);
        row("reference to NUL", "<r a=\"&#x00;\"/>", false);
        row("byte order mark", "\xEF\xBB\xBF<r/>", true);
        row("cut sequence", "<r a=\"\xE4\xB8\"/>", false);
        row("overlong", "<r a=\"\xC0\x80\"/>", false);
        row("surrogate", "<r a=\"\xED\xA0\x80\"/>", false);
        row("beyond Unicode", "<r a=\"\xF4\x90\x80\x80\"/>", false);
        row("stray continuation", "<r a=\"\x80\"/>", false);
        row("last code point", "<r a=\"\xF4\x8F\xBF\xBF\"/>", true);
        row("open quote", "<r a=\"x/>", false);
        row("open element", "<r><a/>", false);
        row("8 MB", "<r>" + std::string(XmlFileGuard::MAX_BYTES - 7, ' ') + "</r>", true);
        row("more than 8 MB", "<r>" + std::string(XmlFileGuard::MAX_BYTES - 6, ' ') + "</r>", false);
    }

    void limits()
    {
        QFETCH(QByteArray, bytes);
        QFETCH(bool, isAccepted);
        QElapsedTimer timer;
        timer.start();
        QCOMPARE(XmlFileGuard::accepts(bytes.toStdString()), isAccepted);
        const QString path = write(bytes);
        TiXmlDocument document;
        QCOMPARE(XmlFile::load(path.toStdString(), document), isAccepted);
        QVERIFY(timer.elapsed() < PATIENCE_MS);
    }

    // Whatever is made of a good file, what the check lets through is shallow, and what it refuses TinyXML
    // refuses.
    void agreesWithTinyXml()
    {
        static const std::vector<std::string> PIECES = {
            "<",         ">",          "</",      "/>",        "\"",  "'",           "=",
            " ",         "<!--",       "-->",     "<![CDATA[", "]]>", "<?xml",       "version=",
            "encoding=", "standalone", "&",       ";",         "<a>", "</a>",        "<a b=\"c\">",
            "<a b='",    "?>",         "<!",      "\n",        "x",   "</manifest>", "<?XML",
            "<_",        "\x7f",       "<a b=c>", "<a b=c/>",  "中",  "\r"};
        const RandomSeed seed(0);
        QRandomGenerator random(seed);
        const int ROUNDS = runLength("TITLER_ROUNDS", 60000);
        // Without character references: those that are broken are refused, and TinyXML takes some of them.
        std::string sample = SAMPLE;
        sample.erase(sample.find("&#"), 8);
        int accepted = 0;
        for (int round = 0; round < ROUNDS; ++round) {
            std::string bytes = round % 3 == 0 ? std::string("<r>") : sample;
            const int changes = 1 + random.bounded(round % 3 == 0 ? 20 : 4);
            for (int i = 0; i < changes; ++i) {
                const auto at = static_cast<std::size_t>(random.bounded(static_cast<int>(bytes.size() + 1)));
                const std::string& piece =
                    PIECES[static_cast<std::size_t>(random.bounded(int(PIECES.size())))];
                if (random.bounded(2) != 0)
                    bytes.insert(at, piece);
                else if (at < bytes.size())
                    bytes.erase(at, 1 + static_cast<std::size_t>(random.bounded(6)));
            }
            const QByteArray shown = QByteArray::fromStdString(bytes);
            if (QString::fromUtf8(shown).contains(QChar::ReplacementCharacter))
                continue;
            int depth = 0;
            const bool isParsed = tinyXmlAccepts(bytes, &depth);
            if (XmlFileGuard::accepts(bytes)) {
                ++accepted;
                QVERIFY2(depth <= XmlFileGuard::MAX_DEPTH, shown);
            } else {
                // Where TinyXML stops in the declaration it reports no error, and finds no root.
                QVERIFY2(!isParsed || depth == 0, shown);
            }
        }
        QVERIFY(accepted > 1000);
    }

    void depthIsNeverHidden()
    {
        // Deep documents between pieces that could mislead a reader about where an element ends.
        static const std::vector<std::string> HIDES = {"<a b=\"</a>\">",
                                                       "<a b='/>'>",
                                                       "<a><!-- </a> -->",
                                                       "<a><![CDATA[</a>]]>",
                                                       "<a><?xml version='</a>'?>",
                                                       "<a><?xml x='</a>'?>",
                                                       "<a><!x </a>",
                                                       "<a b=c>",
                                                       "<a >",
                                                       "<a\xEF\xBB\xBF>",
                                                       "<a>\xEF\xBB\xBF",
                                                       "<a>&#x3C;/a>",
                                                       "<a><?XML encoding=\"></a>\">",
                                                       "<a>text",
                                                       "<a b=\"&#x\"></a>&#x41;\">",
                                                       "<a>&#x</a>&#x41;",
                                                       "<a b='&#'></a>&#65;'>",
                                                       "<a/><a>",
                                                       "<a b=\"'\" c='\"'>",
                                                       "<a><b></b>"};
        const RandomSeed seed(64);
        QRandomGenerator random(seed);
        for (int round = 0; round < 20000; ++round) {
            std::string bytes;
            for (int i = 0; i < 90; ++i)
                bytes += HIDES[static_cast<std::size_t>(random.bounded(int(HIDES.size())))];
            bytes += repeated("</a>", random.bounded(91));
            int depth = 0;
            tinyXmlAccepts(bytes, &depth);
            if (XmlFileGuard::accepts(bytes))
                QVERIFY2(depth <= XmlFileGuard::MAX_DEPTH, bytes.c_str());
        }
    }

    void everyTruncationIsReadSafely()
    {
        QElapsedTimer timer;
        timer.start();
        for (std::size_t size = 0; size < SAMPLE.size(); ++size) {
            const std::string cut = SAMPLE.substr(0, size);
            TiXmlDocument document;
            const QString path = write(QByteArray::fromStdString(cut));
            const bool isLoaded = XmlFile::load(path.toStdString(), document);
            // TinyXML itself takes what ends outside the root.
            if (isLoaded)
                QVERIFY(tinyXmlAccepts(cut));
        }
        QVERIFY(timer.elapsed() < PATIENCE_MS);
    }

    void loadsAsTinyXmlLoads_data()
    {
        QTest::addColumn<QByteArray>("bytes");
        QTest::newRow("sample") << QByteArray::fromStdString(SAMPLE);
        QTest::newRow("carriage returns") << QByteArray("<r a=\"1\r\n2\r3\n\r\n\r\r4\">x\r\ny\rz</r>\r");
        QTest::newRow("mark") << QByteArray("\xEF\xBB\xBF<?xml version=\"1.0\" ?><r a=\"é\"/>");
        QTest::newRow("NUL ends the file") << QByteArray("<r a=\"1\"/>\0<b><b>", 17);
        QTest::newRow("other encoding")
            << QByteArray("<?xml version=\"1.0\" encoding=\"latin1\"?><r a=\"\xC3\xA9\"/>");
    }

    // Saving what was loaded gives the bytes that TinyXML's own LoadFile and SaveFile give.
    void loadsAsTinyXmlLoads()
    {
        QFETCH(QByteArray, bytes);
        const std::string path = write(bytes).toStdString();
        TiXmlDocument expected;
        QVERIFY(expected.LoadFile(path.c_str(), TIXML_ENCODING_UNKNOWN));
        TiXmlDocument document;
        QVERIFY(XmlFile::load(path, document));
        QCOMPARE(document.ValueStr(), path);

        const QString expectedPath = m_folder.filePath("expected.xml");
        QVERIFY(expected.SaveFile(expectedPath.toLocal8Bit().constData()));
        QVERIFY(XmlFile::save(document, path));
        QCOMPARE(read(QString::fromStdString(path)), read(expectedPath));
    }

    void referencesAreCharactersInEveryEncoding_data()
    {
        QTest::addColumn<QByteArray>("declaration");
        QTest::newRow("none") << QByteArray();
        QTest::newRow("no encoding") << QByteArray("<?xml version=\"1.0\"?>");
        QTest::newRow("UTF-8") << QByteArray("<?xml version=\"1.0\" encoding=\"utf-8\"?>");
        QTest::newRow("another") << QByteArray("<?xml version=\"1.0\" encoding=\"latin1\"?>");
        QTest::newRow("unknown") << QByteArray("<?xml version=\"1.0\" encoding=\"T8-UF\"?>");
    }

    // As bytes, some of them would be NUL or no UTF-8, and the saved file could not be read.
    void referencesAreCharactersInEveryEncoding()
    {
        QFETCH(QByteArray, declaration);
        const std::string path =
            write(declaration + "<r a=\"&#xA0;&#xE4;&#x1F600;&#x100;\">&#xFF;<b/></r>").toStdString();
        TiXmlDocument document;
        QVERIFY(XmlFile::load(path, document));
        QVERIFY(XmlFile::save(document, path));
        QVERIFY(XmlFileGuard::accepts(read(QString::fromStdString(path)).toStdString()));
        TiXmlDocument again;
        QVERIFY(XmlFile::load(path, again));
        QCOMPARE(QByteArray(again.RootElement()->Attribute("a")), QByteArray("\u00A0ä\U0001F600\u0100"));
        QCOMPARE(QByteArray(again.RootElement()->FirstChild()->Value()), QByteArray("ÿ"));
    }

    void refusesWhatIsNoPlainFile()
    {
        TiXmlDocument document;
        QVERIFY(!XmlFile::load(m_folder.filePath("missing.xml").toStdString(), document));
        QVERIFY(!XmlFile::load(m_folder.path().toStdString(), document));
        QVERIFY(!XmlFile::load("", document));
        QVERIFY(!XmlFile::load("/dev/zero", document));
        const std::string pipe = m_folder.filePath("pipe.xml").toStdString();
        QVERIFY(::mkfifo(pipe.c_str(), 0600) == 0);
        QVERIFY(!XmlFile::load(pipe, document));
    }

private:
    QString write(const QByteArray& bytes)
    {
        const QString path = m_folder.filePath("file.xml");
        QFile file(path);
        if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size())
            qFatal("cannot write %s", qPrintable(path));
        return path;
    }

    static QByteArray read(const QString& path)
    {
        QFile file(path);
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
    }

    QTemporaryDir m_folder;
};

QTEST_GUILESS_MAIN(tst_xmlfile)
#include "tst_xmlfile.moc"
