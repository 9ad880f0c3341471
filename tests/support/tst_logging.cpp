// The lines of the operation and debug log, and where they go.
#include "support/LocaleText.h"
#include "support/LogManager.h"

#include <QFile>
#include <QRegularExpression>
#include <QTemporaryDir>
#include <QTest>

#include <unistd.h>

#include <cstdarg>
#include <cstdlib>
#include <ctime>

namespace
{

QStringList linesOf(const QString& path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        return {};
    }
    QStringList lines = QString::fromUtf8(file.readAll()).split('\n');
    lines.removeLast();
    return lines;
}

void setTimeZone(const char* zone)
{
    qputenv("TZ", zone);
    tzset();
}

void put(FILE* file, const char* module, int line, const char* format, ...)
{
    va_list args;
    va_start(args, format);
    LogManager::getInstance()->putLog(file, module, line, format, args);
    va_end(args);
}

} // namespace

class TestLogging : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void operationLine();
    void debugLine();
    void numbers_data();
    void numbers();
    void wideTexts();
    void timeStamp_data();
    void timeStamp();
    void nothingBeforeAndAfter();
    void missingFolderCostsOnlyTheLines();
    void appendsToWhatIsThere();
    void percentSignsStayText();
    void putLogFormats();
    void putLogCutsLongFormats();
    void putLogWithoutFile();
    void systemLogTakesAnything();

private:
    QString operationLog() const { return m_folder->filePath("k2_ope.log"); }
    QString debugLog() const { return m_folder->filePath("k2_ope_debug.log"); }

    std::unique_ptr<QTemporaryDir> m_folder;
};

void TestLogging::init()
{
    m_folder = std::make_unique<QTemporaryDir>();
    qputenv("K2SYS_LOG_DIR", m_folder->path().toUtf8());
    setTimeZone("UTC");
}

void TestLogging::cleanup()
{
    UNINIT_LOGGING();
}

void TestLogging::operationLine()
{
    INIT_LOGGING(L"KS2Titler");
    LOG_USER_OPERATE(L"Tool Area", 200, L"Tap Close Button");
    const QStringList lines = linesOf(operationLog());
    QCOMPARE(lines.size(), 1);
    const QRegularExpression format(
        QString(
            R"(^\d{4}-\d\d-\d\dT\d\d:\d\d:\d\d\.\d{6}\+00:00 localhost KS2Titler\[%1\]: \[Tool Area\] 200: Tap Close Button$)")
            .arg(getpid()));
    QVERIFY2(format.match(lines.front()).hasMatch(), qPrintable(lines.front()));
    QCOMPARE(linesOf(debugLog()).size(), 0);
}

void TestLogging::debugLine()
{
    INIT_LOGGING(L"KS2Titler");
    LOG_DEBUG_OPERATE(L"Touch Event", 239, L"Outside!");
    QCOMPARE(linesOf(debugLog()).size(), 1);
    QVERIFY(linesOf(debugLog()).front().endsWith("]: [Touch Event] 239: Outside!"));
    QCOMPARE(linesOf(operationLog()).size(), 0);
}

void TestLogging::numbers_data()
{
    QTest::addColumn<int>("number");
    QTest::addColumn<QString>("text");
    QTest::newRow("7") << 7 << "007";
    QTest::newRow("42") << 42 << "042";
    QTest::newRow("1000") << 1000 << "1000";
    QTest::newRow("-5") << -5 << "-05";
}

void TestLogging::numbers()
{
    QFETCH(int, number);
    QFETCH(QString, text);
    INIT_LOGGING(L"KS2Titler");
    LOG_USER_OPERATE(L"A", number, L"x");
    QVERIFY(linesOf(operationLog()).front().endsWith("]: [A] " + text + ": x"));
}

void TestLogging::wideTexts()
{
    INIT_LOGGING(L"KS2Titler");
    LOG_USER_OPERATE(L"Text Input", 200, L"速報 속보 é \U0001F600");
    QVERIFY(linesOf(operationLog()).front().endsWith(QString::fromUtf8("200: 速報 속보 é \U0001F600")));
}

void TestLogging::timeStamp_data()
{
    QTest::addColumn<QByteArray>("zone");
    QTest::addColumn<QString>("stamp");
    // POSIX zones count westward.
    QTest::newRow("Tokyo") << QByteArray("JST-9") << "2026-11-12T17:21:42.000123+09:00";
    QTest::newRow("minus three and a half hours")
        << QByteArray("NST3:30") << "2026-11-12T04:51:42.000123-03:30";
    QTest::newRow("UTC") << QByteArray("UTC") << "2026-11-12T08:21:42.000123+00:00";
    QTest::newRow("Kathmandu") << QByteArray("NPT-5:45") << "2026-11-12T14:06:42.000123+05:45";
}

void TestLogging::timeStamp()
{
    QFETCH(QByteArray, zone);
    QFETCH(QString, stamp);
    setTimeZone(zone.constData());
    QCOMPARE(QString::fromStdString(LogManager::formatTime({1794471702, 123})), stamp);
}

void TestLogging::nothingBeforeAndAfter()
{
    const auto logAll = [] {
        LOG_USER_OPERATE(L"A", 1, L"x");
        LOG_DEBUG_OPERATE(L"A", 1, L"x");
        LOG_EVENT(L"A", 1, L"x", 6);
        LOG_EVENT("A", 1, "x", 6);
    };
    logAll();
    QVERIFY(!QFile::exists(operationLog()));
    INIT_LOGGING(L"KS2Titler");
    UNINIT_LOGGING();
    logAll();
    QCOMPARE(linesOf(operationLog()).size(), 0);
    QCOMPARE(linesOf(debugLog()).size(), 0);
    UNINIT_LOGGING();
}

void TestLogging::missingFolderCostsOnlyTheLines()
{
    qputenv("K2SYS_LOG_DIR", m_folder->filePath("not/there").toUtf8());
    INIT_LOGGING(L"KS2Titler");
    LOG_USER_OPERATE(L"A", 1, L"x");
    LOG_DEBUG_OPERATE(L"A", 1, L"x");
    LOG_EVENT(L"A", 1, L"x", 6);
    QVERIFY(!QFile::exists(m_folder->filePath("not")));
}

void TestLogging::appendsToWhatIsThere()
{
    for (int i = 0; i < 2; ++i) {
        INIT_LOGGING(L"KS2Titler");
        LOG_USER_OPERATE(L"A", i, L"x");
        UNINIT_LOGGING();
    }
    QCOMPARE(linesOf(operationLog()).size(), 2);
}

void TestLogging::percentSignsStayText()
{
    INIT_LOGGING(L"50%n%s");
    LOG_USER_OPERATE(L"%s%n", 1, L"100%s %d %n");
    QVERIFY(linesOf(operationLog()).front().endsWith("]: [%s%n] 001: 100%s %d %n"));
    QVERIFY(linesOf(operationLog()).front().contains(" localhost 50%n%s["));
}

void TestLogging::putLogFormats()
{
    INIT_LOGGING(L"KS2%dTitler");
    FILE* file = std::fopen(m_folder->filePath("own").toLocal8Bit().constData(), "a+");
    put(file, "mod%sule", 7, "%s is %d%%", "answer", 42);
    std::fclose(file);
    QCOMPARE(linesOf(m_folder->filePath("own")).size(), 1);
    QVERIFY(
        linesOf(m_folder->filePath("own"))
            .front()
            .endsWith(QString(" localhost KS2%dTitler[%1]: [mod%sule] 007: answer is 42%").arg(getpid())));
}

void TestLogging::putLogCutsLongFormats()
{
    INIT_LOGGING(L"KS2Titler");
    const QString path = m_folder->filePath("own");
    // Whatever the cut leaves of the conversion at the end is not read as one.
    for (int length = 380; length < 520; ++length) {
        FILE* file = std::fopen(path.toLocal8Bit().constData(), "w");
        const std::string format = std::string(static_cast<std::size_t>(length), 'x') + "%08ld";
        put(file, "module", 7, format.c_str(), 12345L);
        std::fclose(file);
        const QStringList lines = linesOf(path);
        QCOMPARE(lines.size(), 1);
        QVERIFY(lines.front().endsWith("x00012345") || lines.front().endsWith('x'));
        QVERIFY(lines.front().toUtf8().size() <= 511 + 8);
    }
    QVERIFY(linesOf(path).front().endsWith('x'));
}

void TestLogging::putLogWithoutFile()
{
    INIT_LOGGING(L"KS2Titler");
    put(nullptr, "module", 7, "%s", "x");
    QCOMPARE(linesOf(operationLog()).size(), 0);
}

void TestLogging::systemLogTakesAnything()
{
    INIT_LOGGING(L"KS2Titler");
    LOG_EVENT(L"%s%n", 200, L"100%n", 6);
    LOG_EVENT(std::string(1000, 'm'), 200, std::string(5000, '%'), 6);
    QCOMPARE(linesOf(operationLog()).size(), 0);
}

QTEST_GUILESS_MAIN(TestLogging)
#include "tst_logging.moc"
