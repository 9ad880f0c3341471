// The lines of the operation and debug log, and where they go.
#include "support/LocaleText.h"
#include "support/LogManager.h"

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QHash>
#include <QProcess>
#include <QRegularExpression>
#include <QSet>
#include <QTemporaryDir>
#include <QTest>

#include <sys/stat.h>
#include <unistd.h>

#include <cstdarg>
#include <cstdlib>
#include <ctime>

namespace
{

QStringList linesOf(const QString& path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        return {};
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

class tst_logmanager : public QObject
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
    void controlCharactersAreEscaped_data();
    void controlCharactersAreEscaped();
    void longTextsAreCut();
    void onlyTheOwnerWrites();
    void linksAreNotFollowed();
    void pipesAreNotWaitedFor();
    void logsRotate();
    void aRotationThatFailsStartsAnew();
    void aRemovedLogIsMadeAgain();
    void twoProcessesShareTheLogs();

private:
    // Starts this program again as one that writes so many numbered lines.
    void startWriter(QProcess& process, const char* name, int lines) const;
    static int mode(const QString& path);

    QString operationLog() const { return m_folder->filePath("k2_ope.log"); }
    QString debugLog() const { return m_folder->filePath("k2_ope_debug.log"); }

    std::unique_ptr<QTemporaryDir> m_folder;
};

void tst_logmanager::init()
{
    m_folder = std::make_unique<QTemporaryDir>();
    qputenv("K2SYS_LOG_DIR", m_folder->path().toUtf8());
    setTimeZone("UTC");
}

void tst_logmanager::cleanup()
{
    UNINIT_LOGGING();
}

void tst_logmanager::operationLine()
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

void tst_logmanager::debugLine()
{
    INIT_LOGGING(L"KS2Titler");
    LOG_DEBUG_OPERATE(L"Touch Event", 239, L"Outside!");
    QCOMPARE(linesOf(debugLog()).size(), 1);
    QVERIFY(linesOf(debugLog()).front().endsWith("]: [Touch Event] 239: Outside!"));
    QCOMPARE(linesOf(operationLog()).size(), 0);
}

void tst_logmanager::numbers_data()
{
    QTest::addColumn<int>("number");
    QTest::addColumn<QString>("text");
    QTest::newRow("7") << 7 << "007";
    QTest::newRow("42") << 42 << "042";
    QTest::newRow("1000") << 1000 << "1000";
    QTest::newRow("-5") << -5 << "-05";
}

void tst_logmanager::numbers()
{
    QFETCH(int, number);
    QFETCH(QString, text);
    INIT_LOGGING(L"KS2Titler");
    LOG_USER_OPERATE(L"A", number, L"x");
    QVERIFY(linesOf(operationLog()).front().endsWith("]: [A] " + text + ": x"));
}

void tst_logmanager::wideTexts()
{
    INIT_LOGGING(L"KS2Titler");
    LOG_USER_OPERATE(L"Text Input", 200, L"速報 속보 é \U0001F600");
    QVERIFY(linesOf(operationLog()).front().endsWith(QString::fromUtf8("200: 速報 속보 é \U0001F600")));
}

void tst_logmanager::timeStamp_data()
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

void tst_logmanager::timeStamp()
{
    QFETCH(QByteArray, zone);
    QFETCH(QString, stamp);
    setTimeZone(zone.constData());
    QCOMPARE(QString::fromStdString(LogManager::formatTime({1794471702, 123})), stamp);
}

void tst_logmanager::nothingBeforeAndAfter()
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

void tst_logmanager::missingFolderCostsOnlyTheLines()
{
    qputenv("K2SYS_LOG_DIR", m_folder->filePath("not/there").toUtf8());
    INIT_LOGGING(L"KS2Titler");
    LOG_USER_OPERATE(L"A", 1, L"x");
    LOG_DEBUG_OPERATE(L"A", 1, L"x");
    LOG_EVENT(L"A", 1, L"x", 6);
    QVERIFY(!QFile::exists(m_folder->filePath("not")));
}

void tst_logmanager::appendsToWhatIsThere()
{
    for (int i = 0; i < 2; ++i) {
        INIT_LOGGING(L"KS2Titler");
        LOG_USER_OPERATE(L"A", i, L"x");
        UNINIT_LOGGING();
    }
    QCOMPARE(linesOf(operationLog()).size(), 2);
}

void tst_logmanager::percentSignsStayText()
{
    INIT_LOGGING(L"50%n%s");
    LOG_USER_OPERATE(L"%s%n", 1, L"100%s %d %n");
    QVERIFY(linesOf(operationLog()).front().endsWith("]: [%s%n] 001: 100%s %d %n"));
    QVERIFY(linesOf(operationLog()).front().contains(" localhost 50%n%s["));
}

void tst_logmanager::putLogFormats()
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

void tst_logmanager::putLogCutsLongFormats()
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

void tst_logmanager::putLogWithoutFile()
{
    INIT_LOGGING(L"KS2Titler");
    put(nullptr, "module", 7, "%s", "x");
    QCOMPARE(linesOf(operationLog()).size(), 0);
}

void tst_logmanager::systemLogTakesAnything()
{
    INIT_LOGGING(L"KS2Titler");
    LOG_EVENT(L"%s%n", 200, L"100%n", 6);
    LOG_EVENT(std::string(1000, 'm'), 200, std::string(5000, '%'), 6);
    QCOMPARE(linesOf(operationLog()).size(), 0);
}

void tst_logmanager::controlCharactersAreEscaped_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("logged");
    QTest::newRow("line feed") << "a\nb"
                               << "a\\nb";
    QTest::newRow("carriage return") << "a\rb"
                                     << "a\\rb";
    QTest::newRow("tab") << "a\tb"
                         << "a\\tb";
    QTest::newRow("escape") << "\x1b[2J"
                            << "\\x1b[2J";
    QTest::newRow("delete") << "a\x7f"
                            << "a\\x7f";
    QTest::newRow("next line, of the second set") << QStringLiteral("a\u0085b") << "a\\x85b";
    QTest::newRow("control sequence introducer") << QStringLiteral("\u009b2J") << "\\x9b2J";
    QTest::newRow("line separator") << QStringLiteral("a\u2028b") << "a\\u2028b";
    QTest::newRow("writing direction") << QStringLiteral("a\u202eb") << "a\\u202eb";
    QTest::newRow("a backslash stays") << "a\\b"
                                       << "a\\b";
    QTest::newRow("ordinary texts stay")
        << QString::fromUtf8("速報 é \U0001F600") << QString::fromUtf8("速報 é \U0001F600");
}

void tst_logmanager::controlCharactersAreEscaped()
{
    QFETCH(QString, text);
    QFETCH(QString, logged);
    INIT_LOGGING(L"KS2\nTitler");
    LOG_USER_OPERATE(L"Text\nInput", 200, text.toStdWString());
    QCOMPARE(linesOf(operationLog()).size(), 1);
    QVERIFY2(linesOf(operationLog()).front().endsWith("]: [Text\\nInput] 200: " + logged),
             qPrintable(linesOf(operationLog()).front()));
    QVERIFY(linesOf(operationLog()).front().contains(" localhost KS2\\nTitler["));
    const QString own = m_folder->filePath("own");
    FILE* file = std::fopen(own.toLocal8Bit().constData(), "a+");
    put(file, "mod\nule", 7, "%s", text.toUtf8().constData());
    std::fclose(file);
    QCOMPARE(linesOf(own).size(), 1);
    QVERIFY2(linesOf(own).front().endsWith("[mod\\nule] 007: " + logged), qPrintable(linesOf(own).front()));
}

void tst_logmanager::longTextsAreCut()
{
    INIT_LOGGING(L"KS2Titler");
    LOG_USER_OPERATE(L"Text Input", 200, std::wstring(3000000, L'速'));
    LOG_USER_OPERATE(L"Text Input", 201, L"next");
    const QStringList lines = linesOf(operationLog());
    QCOMPARE(lines.size(), 2);
    QVERIFY(lines.front().contains(QString::fromUtf8("200: 速速速")));
    QVERIFY(lines.front().toUtf8().size() < 10000);
    QVERIFY(!lines.front().contains(QChar(QChar::ReplacementCharacter)));
}

int tst_logmanager::mode(const QString& path)
{
    struct stat status = {};
    return ::stat(path.toLocal8Bit().constData(), &status) == 0 ? int(status.st_mode & 07777) : -1;
}

void tst_logmanager::onlyTheOwnerWrites()
{
    for (const mode_t mask : {mode_t(0), mode_t(022), mode_t(077)}) {
        init();
        const mode_t before = ::umask(mask);
        INIT_LOGGING(L"KS2Titler");
        LOG_USER_OPERATE(L"A", 1, L"x");
        ::umask(before);
        QCOMPARE(mode(operationLog()), 0640);
        QCOMPARE(mode(debugLog()), 0640);
        cleanup();
    }
    // Also a log that an older program left.
    init();
    QFile old(operationLog());
    QVERIFY(old.open(QIODevice::WriteOnly));
    QVERIFY(::chmod(operationLog().toLocal8Bit().constData(), 0666) == 0);
    INIT_LOGGING(L"KS2Titler");
    QCOMPARE(mode(operationLog()), 0640);
}

void tst_logmanager::linksAreNotFollowed()
{
    const QString victim = m_folder->filePath("victim");
    QFile file(victim);
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write("kept");
    file.close();
    QVERIFY(QFile::link(victim, operationLog()));
    QVERIFY(QFile::link(m_folder->filePath("nothing"), debugLog()));
    INIT_LOGGING(L"KS2Titler");
    LOG_USER_OPERATE(L"A", 1, L"x");
    LOG_DEBUG_OPERATE(L"A", 1, L"x");
    QVERIFY(file.open(QIODevice::ReadOnly));
    QCOMPARE(file.readAll(), QByteArray("kept"));
    QVERIFY(!QFile::exists(m_folder->filePath("nothing")));
}

void tst_logmanager::pipesAreNotWaitedFor()
{
    QVERIFY(::mkfifo(operationLog().toLocal8Bit().constData(), 0600) == 0);
    INIT_LOGGING(L"KS2Titler");
    LOG_USER_OPERATE(L"A", 1, L"x");
    LOG_DEBUG_OPERATE(L"A", 1, L"x");
    QCOMPARE(linesOf(debugLog()).size(), 1);
}

void tst_logmanager::logsRotate()
{
    INIT_LOGGING(L"KS2Titler");
    const std::wstring filler(1000, L'x');
    const int lines = 7000;
    for (int i = 0; i < lines; ++i)
        LOG_USER_OPERATE(L"A", i, filler);
    const QStringList names = QDir(m_folder->path()).entryList({"k2_ope.log*"}, QDir::Files, QDir::Name);
    QCOMPARE(names,
             QStringList({"k2_ope.log", "k2_ope.log.1", "k2_ope.log.2", "k2_ope.log.3", "k2_ope.log.4"}));
    int next = -1;
    for (int i = 4; i >= 0; --i) { // the oldest first
        const QString path = operationLog() + (i == 0 ? QString() : QString(".%1").arg(i));
        QVERIFY(QFileInfo(path).size() <= 1000000);
        QCOMPARE(mode(path), 0640);
        for (const QString& line : linesOf(path)) {
            const int number = line.section("[A] ", 1).section(':', 0, 0).toInt();
            QVERIFY2(next == -1 || number == next, qPrintable(line.left(100)));
            next = number + 1;
        }
    }
    QCOMPARE(next, lines);
    QCOMPARE(QDir(m_folder->path()).entryList({"k2_ope_debug.log*"}, QDir::Files),
             QStringList("k2_ope_debug.log"));
}

void tst_logmanager::aRotationThatFailsStartsAnew()
{
    QVERIFY(QDir(m_folder->path()).mkpath("k2_ope.log.1/in the way"));
    INIT_LOGGING(L"KS2Titler");
    for (int i = 0; i < 3000; ++i)
        LOG_USER_OPERATE(L"A", i, std::wstring(1000, L'x'));
    QVERIFY(QFileInfo(operationLog()).size() <= 1000000);
    QVERIFY(linesOf(operationLog()).back().contains("[A] 2999: xxx"));
}

void tst_logmanager::aRemovedLogIsMadeAgain()
{
    INIT_LOGGING(L"KS2Titler");
    LOG_USER_OPERATE(L"A", 1, L"x");
    QVERIFY(QFile::remove(operationLog()));
    LOG_USER_OPERATE(L"A", 2, L"x");
    QCOMPARE(linesOf(operationLog()).size(), 1);
}

void tst_logmanager::startWriter(QProcess& process, const char* name, int lines) const
{
    process.setProcessChannelMode(QProcess::ForwardedErrorChannel);
    process.start(QCoreApplication::applicationFilePath(),
                  {QStringLiteral("--write"), QString::fromLatin1(name), QString::number(lines)});
}

void tst_logmanager::twoProcessesShareTheLogs()
{
    const int lines = 1800; // of both together nearly four files
    QProcess one;
    QProcess other;
    startWriter(one, "one", lines);
    startWriter(other, "other", lines);
    for (QProcess* process : {&one, &other}) {
        QVERIFY(process->waitForFinished(60000));
        QCOMPARE(process->exitCode(), 0);
    }
    // No line is lost, written twice or mixed with another. How far a file exceeds its size depends on how
    // long the process that rotates has to wait for a processor.
    QHash<QString, QSet<int>> found;
    for (int i = 4; i >= 0; --i) {
        const QString path = operationLog() + (i == 0 ? QString() : QString(".%1").arg(i));
        for (const QString& line : linesOf(path)) {
            static const QRegularExpression format(R"( localhost (one|other)\[\d+\]: \[A\] (\d+): x{1000}$)");
            const QRegularExpressionMatch match = format.match(line);
            QVERIFY2(match.hasMatch(), qPrintable(line.left(200)));
            QVERIFY(!found[match.captured(1)].contains(match.captured(2).toInt()));
            found[match.captured(1)].insert(match.captured(2).toInt());
        }
    }
    QCOMPARE(found.value("one").size(), lines);
    QCOMPARE(found.value("other").size(), lines);
}

namespace
{

int writeLines(const char* name, int lines)
{
    INIT_LOGGING(multiByteToWide(name));
    for (int i = 0; i < lines; ++i)
        LOG_USER_OPERATE(L"A", i, std::wstring(1000, L'x'));
    UNINIT_LOGGING();
    return 0;
}

} // namespace

int main(int argc, char** argv)
{
    if (argc == 4 && std::string(argv[1]) == "--write")
        return writeLines(argv[2], std::atoi(argv[3]));
    QCoreApplication application(argc, argv);
    tst_logmanager test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_logmanager.moc"
