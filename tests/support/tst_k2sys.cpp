// The stand-alone platform library and the conversion of text.
#include "support/LocaleText.h"
#include "support/k2sys/k2sys.h"

#include <QByteArray>
#include <QCoreApplication>
#include <QTemporaryDir>
#include <QTest>

#include <clocale>

class tst_k2sys : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void root();
    void data();
    void prefix();
    void smallBuffers();
    void logFolder();
    void portOffset_data();
    void portOffset();
    void fileSystem();
    void timeAndZone();
    void textBothWays();
    void textThatCannotBeExpressed();
    void textLeavesTheLocaleAlone();
};

void tst_k2sys::init()
{
    for (const char* name : {"K2SYS_AC_ROOT", "K2SYS_AC_DATA", "K2SYS_AC_PREFIX", "K2SYS_LOG_DIR",
                             "K2SYS_PORT_OFFSET", "K2SYS_FS_REMAIN", "XDG_DATA_HOME", "TZ"})
        qunsetenv(name);
}

void tst_k2sys::root()
{
    char buffer[128];
    QCOMPARE(k2sys_getenv_ac_root(buffer, sizeof buffer), 2);
    QCOMPARE(buffer, "");
    qputenv("K2SYS_AC_ROOT", "/");
    QCOMPARE(k2sys_getenv_ac_root(buffer, sizeof buffer), 1);
    QCOMPARE(buffer, "/");
    qputenv("K2SYS_AC_ROOT", "/mnt/root");
    QCOMPARE(k2sys_getenv_ac_root(buffer, sizeof buffer), 2);
    QCOMPARE(buffer, "/mnt/root");
}

void tst_k2sys::data()
{
    char buffer[4096];
    qputenv("HOME", "/home/operator");
    QVERIFY(k2sys_getenv_ac_data(buffer, sizeof buffer) > 0);
    QCOMPARE(buffer, "/home/operator/.local/share/titler");
    qputenv("XDG_DATA_HOME", "/data");
    QVERIFY(k2sys_getenv_ac_data(buffer, sizeof buffer) > 0);
    QCOMPARE(buffer, "/data/titler");
    qputenv("K2SYS_AC_DATA", "/own");
    QVERIFY(k2sys_getenv_ac_data(buffer, sizeof buffer) > 0);
    QCOMPARE(buffer, "/own");
    qputenv("K2SYS_AC_DATA", "relative");
    QVERIFY(k2sys_getenv_ac_data(buffer, sizeof buffer) > 0);
    QCOMPARE(buffer, "relative"); // for the program to refuse
}

void tst_k2sys::prefix()
{
    char buffer[4096];
    QVERIFY(k2sys_getenv_ac_prefix(buffer, sizeof buffer) > 0);
    QCOMPARE(QString::fromUtf8(buffer), QFileInfo(QCoreApplication::applicationDirPath()).path());
    qputenv("K2SYS_AC_PREFIX", "/usr/local");
    QVERIFY(k2sys_getenv_ac_prefix(buffer, sizeof buffer) > 0);
    QCOMPARE(buffer, "/usr/local");
}

void tst_k2sys::smallBuffers()
{
    qputenv("K2SYS_AC_ROOT", "/12345");
    qputenv("K2SYS_AC_DATA", "/12345");
    qputenv("K2SYS_AC_PREFIX", "/12345");
    qputenv("K2SYS_LOG_DIR", "/12345");
    for (int (*read)(char*, size_t) :
         {k2sys_getenv_ac_root, k2sys_getenv_ac_data, k2sys_getenv_ac_prefix, k2sys_log_dir}) {
        char buffer[7] = {'x'};
        QVERIFY(read(buffer, 6) < 0);
        QCOMPARE(buffer, "");
        QVERIFY(read(buffer, 7) > 0);
        QCOMPARE(buffer, "/12345");
        QVERIFY(read(buffer, 0) < 0);
        QVERIFY(read(nullptr, 10) < 0);
    }
}

void tst_k2sys::logFolder()
{
    char buffer[128];
    QVERIFY(k2sys_log_dir(buffer, sizeof buffer) > 0);
    QCOMPARE(buffer, "/var/log");
    qputenv("K2SYS_LOG_DIR", "/tmp/logs");
    QVERIFY(k2sys_log_dir(buffer, sizeof buffer) > 0);
    QCOMPARE(buffer, "/tmp/logs");
}

void tst_k2sys::portOffset_data()
{
    QTest::addColumn<QByteArray>("value");
    QTest::addColumn<int>("offset");
    QTest::newRow("unset") << QByteArray() << 0;
    QTest::newRow("0") << QByteArray("0") << 0;
    QTest::newRow("20000") << QByteArray("20000") << 20000;
    QTest::newRow("-500") << QByteArray("-500") << -500;
    QTest::newRow("word") << QByteArray("many") << 0;
    QTest::newRow("number and word") << QByteArray("12x") << 0;
    QTest::newRow("too much") << QByteArray("70000") << 0;
    QTest::newRow("far too much") << QByteArray("99999999999999999999") << 0;
}

void tst_k2sys::portOffset()
{
    QFETCH(QByteArray, value);
    QFETCH(int, offset);
    if (!value.isEmpty())
        qputenv("K2SYS_PORT_OFFSET", value);
    QCOMPARE(k2sys_port_offset(), offset);
}

void tst_k2sys::fileSystem()
{
    QTemporaryDir folder;
    const QByteArray path = folder.path().toUtf8();
    QVERIFY(k2sys_fs_size(path.constData()) > 0);
    QVERIFY(k2sys_fs_remain(path.constData()) >= 0);
    QVERIFY(k2sys_fs_remain(path.constData()) <= k2sys_fs_size(path.constData()));
    QCOMPARE(k2sys_fs_size("/not/there"), -1LL);
    QCOMPARE(k2sys_fs_remain("/not/there"), -1LL);
    QCOMPARE(k2sys_fs_remain(nullptr), -1LL);
    qputenv("K2SYS_FS_REMAIN", "199000000");
    QCOMPARE(k2sys_fs_remain(path.constData()), 199000000LL);
    qputenv("K2SYS_FS_REMAIN", "much");
    QVERIFY(k2sys_fs_remain(path.constData()) != 0);
}

void tst_k2sys::timeAndZone()
{
    tm now{};
    QCOMPARE(k2sys_get_time(&now), 1);
    QVERIFY(now.tm_year > 100);
    QVERIFY(k2sys_get_time(nullptr) < 0);
    char buffer[64];
    for (const char* zone : {"Europe/Berlin", ":Europe/Berlin", "/usr/share/zoneinfo/Europe/Berlin"}) {
        qputenv("TZ", zone);
        QCOMPARE(k2sys_get_current_timezone(buffer, sizeof buffer), 1);
        QCOMPARE(buffer, "Europe/Berlin");
    }
    QCOMPARE(k2sys_get_current_timezone(buffer, 5), 0);
}

void tst_k2sys::textBothWays()
{
    for (const char* utf8 : {"", "plain", "é", "速報 快讯", "속보", "e\xCC\x81", "\xF0\x9F\x98\x80"}) {
        const std::wstring wide = multiByteToWide(utf8);
        QCOMPARE(QString::fromStdWString(wide), QString::fromUtf8(utf8));
        QCOMPARE(wideToMultiByte(wide), std::string(utf8));
    }
    QVERIFY(wideToMultiByte(std::wstring(L"a\0b", 3)) == "a");
}

void tst_k2sys::textThatCannotBeExpressed()
{
    QCOMPARE(wideToMultiByte(L"ab" + std::wstring(1, static_cast<wchar_t>(0xD800)) + L"c"),
             std::string("ab"));
    QVERIFY(multiByteToWide("ab\x80"
                            "c") == L"ab");
    QVERIFY(multiByteToWide(std::string("ab\xE9\x80")) == L"ab");
    QVERIFY(multiByteToWide(nullptr, 3).empty());
}

void tst_k2sys::textLeavesTheLocaleAlone()
{
    std::setlocale(LC_ALL, "C");
    QCOMPARE(wideToMultiByte(L"é"), std::string("é"));
    QVERIFY(multiByteToWide(std::string("é")) == L"é");
    QCOMPARE(QByteArray(std::setlocale(LC_ALL, nullptr)), QByteArray("C"));
}

QTEST_GUILESS_MAIN(tst_k2sys)
#include "tst_k2sys.moc"
