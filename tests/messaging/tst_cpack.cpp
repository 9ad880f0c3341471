// The packed form of single values, and reading them back from good and bad messages.
#include "messaging/ptc/CPack.h"
#include "messaging/ptc/CPack_Simplebuffer.h"
#include "messaging/ptc/CUnpack.h"

#include <QByteArray>
#include <QTest>

#include <climits>
#include <cstdlib>
#include <limits>
#include <memory>

namespace
{

int allocations = 0;
int releases = 0;
bool allocationsFail = false;

void* countingMalloc(unsigned long size)
{
    if (allocationsFail)
        return nullptr;
    ++allocations;
    return std::malloc(size);
}

void countingFree(void* memory)
{
    ++releases;
    std::free(memory);
}

QByteArray bytesOf(const simplebuffer& buffer)
{
    return QByteArray(reinterpret_cast<const char*>(buffer.data), static_cast<qsizetype>(buffer.size));
}

template <typename Function>
QByteArray packed(Function function)
{
    simplebuffer buffer;
    function(&buffer);
    const QByteArray bytes = bytesOf(buffer);
    CSimpleBuffer::simplebuffer_destroy(&buffer);
    return bytes;
}

// Reads from heap memory of exactly the message's size, so that a sanitizer reports any read beyond it.
unsigned long readValue(const QByteArray& message, unpack_info_t* info)
{
    const auto size = static_cast<std::size_t>(message.size());
    const std::unique_ptr<unsigned char[]> copy(new unsigned char[size == 0 ? 1 : size]);
    std::memcpy(copy.get(), message.constData(), size);
    const unsigned long consumed = CUnpack::unpack(info, copy.get(), size);
    info->raw = nullptr;
    return consumed;
}

} // namespace

class tst_cpack : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void intsTakeTheSmallestForm_data();
    void intsTakeTheSmallestForm();
    void fixedForms();
    void unsignedInts();
    void floatsAndConstants();
    void rawHeaders();
    void stringsCountTheirNul();
    void wideStrings();
    void wideStringStopsAtWhatCannotBeExpressed();
    void emptyHeaders();
    void unpackTable_data();
    void unpackTable();
    void unknownTagsConsumeNothing();
    void nilLeavesTheValue();
    void boundedReadRefusesWhatIsCut();
    void unboundedReadOfAWholeMessage();
    void s2wsEndsAtNulAndAtLength();
    void bufferGrowth();
    void bufferOfForeignData();
    void bufferRelease();
    void bufferWithoutMemory();
};

void tst_cpack::init()
{
    CSimpleBuffer::simplebuffer_system_init(4, countingMalloc, countingFree);
    allocations = 0;
    releases = 0;
    allocationsFail = false;
}

void tst_cpack::intsTakeTheSmallestForm_data()
{
    QTest::addColumn<int>("value");
    QTest::addColumn<QByteArray>("bytes");
    const auto row = [](int value, const char* hex) {
        QTest::addRow("%d", value) << value << QByteArray::fromHex(hex);
    };
    row(0, "00");
    row(127, "7f");
    row(128, "cc80");
    row(255, "ccff");
    row(256, "cd0100");
    row(65535, "cdffff");
    row(65536, "ce00010000");
    row(INT_MAX, "ce7fffffff");
    row(-1, "ff");
    row(-32, "e0");
    row(-33, "d0df");
    row(-128, "d080");
    row(-129, "d1ff7f");
    row(-32768, "d18000");
    row(-32769, "d2ffff7fff");
    row(INT_MIN, "d280000000");
}

void tst_cpack::intsTakeTheSmallestForm()
{
    QFETCH(int, value);
    QFETCH(QByteArray, bytes);
    QCOMPARE(packed([&](simplebuffer* b) { CPack_Simplebuffer::pack_simplebuffer_int(b, value); }), bytes);
    unsigned char plain[CPack::MAX_SCALAR_SIZE];
    const unsigned long count = CPack::pack_int(plain, value);
    QCOMPARE(QByteArray(reinterpret_cast<char*>(plain), static_cast<qsizetype>(count)), bytes);
    unpack_info_t info;
    QCOMPARE(readValue(bytes, &info), static_cast<unsigned long>(bytes.size()));
    QCOMPARE(info.type, value < 0 ? UNPACK_SIGNED : UNPACK_UNSIGNED);
    QCOMPARE(info.value.i64, static_cast<std::int64_t>(value));
}

void tst_cpack::fixedForms()
{
    using P = CPack_Simplebuffer;
    const auto hex = [](const QByteArray& bytes) { return bytes.toHex(); };
    QCOMPARE(hex(packed([](simplebuffer* b) { P::pack_simplebuffer_int32(b, 1); })), "d200000001");
    QCOMPARE(hex(packed([](simplebuffer* b) { P::pack_simplebuffer_int32(b, -2); })), "d2fffffffe");
    QCOMPARE(hex(packed([](simplebuffer* b) { P::pack_simplebuffer_int8(b, -1); })), "d0ff");
    QCOMPARE(hex(packed([](simplebuffer* b) { P::pack_simplebuffer_int16(b, 258); })), "d10102");
    QCOMPARE(hex(packed([](simplebuffer* b) { P::pack_simplebuffer_int64(b, -1); })), "d3ffffffffffffffff");
    QCOMPARE(hex(packed([](simplebuffer* b) { P::pack_simplebuffer_uint8(b, 1); })), "cc01");
    QCOMPARE(hex(packed([](simplebuffer* b) { P::pack_simplebuffer_uint16(b, 1); })), "cd0001");
    QCOMPARE(hex(packed([](simplebuffer* b) { P::pack_simplebuffer_uint32(b, 1); })), "ce00000001");
    QCOMPARE(hex(packed([](simplebuffer* b) { P::pack_simplebuffer_uint64(b, 1); })), "cf0000000000000001");
    QCOMPARE(hex(packed([](simplebuffer* b) { P::pack_simplebuffer_fixint(b, -32); })), "e0");
    QCOMPARE(hex(packed([](simplebuffer* b) { P::pack_simplebuffer_fixuint(b, 127); })), "7f");
}

void tst_cpack::unsignedInts()
{
    using P = CPack_Simplebuffer;
    QCOMPARE(packed([](simplebuffer* b) { P::pack_simplebuffer_uint(b, 127); }).toHex(), "7f");
    QCOMPARE(packed([](simplebuffer* b) { P::pack_simplebuffer_uint(b, 128); }).toHex(), "cc80");
    QCOMPARE(packed([](simplebuffer* b) { P::pack_simplebuffer_uint(b, UINT_MAX); }).toHex(), "ceffffffff");
}

void tst_cpack::floatsAndConstants()
{
    using P = CPack_Simplebuffer;
    QCOMPARE(packed([](simplebuffer* b) { P::pack_simplebuffer_double(b, 1.0); }).toHex(),
             "cb3ff0000000000000");
    QCOMPARE(packed([](simplebuffer* b) { P::pack_simplebuffer_float(b, 1.0F); }).toHex(), "ca3f800000");
    QCOMPARE(packed([](simplebuffer* b) { P::pack_simplebuffer_nil(b); }).toHex(), "c0");
    QCOMPARE(packed([](simplebuffer* b) { P::pack_simplebuffer_bool(b, false); }).toHex(), "c2");
    QCOMPARE(packed([](simplebuffer* b) { P::pack_simplebuffer_bool(b, true); }).toHex(), "c3");
    unpack_info_t info;
    QCOMPARE(readValue(QByteArray::fromHex("cbc000000000000000"), &info), 9UL);
    QCOMPARE(info.type, UNPACK_DOUBLE);
    QCOMPARE(info.value.d, -2.0);
    QCOMPARE(readValue(QByteArray::fromHex("ca40400000"), &info), 5UL);
    QCOMPARE(info.type, UNPACK_FLOAT);
    QCOMPARE(info.value.f, 3.0F);
}

void tst_cpack::rawHeaders()
{
    using P = CPack_Simplebuffer;
    const auto header = [](std::uint32_t length) {
        return packed([=](simplebuffer* b) { P::pack_simplebuffer_raw_header(b, length); }).toHex();
    };
    QCOMPARE(header(0), "a0");
    QCOMPARE(header(31), "bf");
    QCOMPARE(header(32), "da0020");
    QCOMPARE(header(65535), "daffff");
    QCOMPARE(header(65536), "db00010000");
    QCOMPARE(packed([](simplebuffer* b) { P::pack_simplebuffer_raw(b, nullptr, 0); }).toHex(), "a0");
    QCOMPARE(packed([](simplebuffer* b) { P::pack_simplebuffer_raw(b, "ab", 2); }).toHex(), "a26162");
}

void tst_cpack::stringsCountTheirNul()
{
    using P = CPack_Simplebuffer;
    const auto string = [](const std::string& text) {
        return packed([&](simplebuffer* b) { P::pack_simplebuffer_string(b, text); });
    };
    QCOMPARE(string("").toHex(), "a100");
    QCOMPARE(string("a").toHex(), "a26100");
    QCOMPARE(string(std::string(30, 'x')).left(1).toHex(), "bf");
    QCOMPARE(string(std::string(31, 'x')).left(3).toHex(), "da0020");
    QCOMPARE(string(std::string(31, 'x')).size(), 3 + 32);
    QCOMPARE(string(std::string(65535, 'x')).left(5).toHex(), "db00010000");
}

void tst_cpack::wideStrings()
{
    const std::wstring texts[] = {L"",        L"A",         L"\u00e9", L"\u901f\u5831", L"\uc18d\ubcf4",
                                  L"e\u0301", L"\U0001F600"};
    for (const std::wstring& text : texts) {
        const QByteArray bytes =
            packed([&](simplebuffer* b) { CPack_Simplebuffer::pack_simplebuffer_wstring(b, text); });
        const QByteArray utf8 = QString::fromStdWString(text).toUtf8();
        QCOMPARE(bytes.size(), 1 + utf8.size() + 1);
        QCOMPARE(bytes.mid(1, utf8.size()), utf8);
        QCOMPARE(bytes.back(), '\0');
        QVERIFY(s2ws(bytes.constData() + 1, static_cast<unsigned long>(bytes.size() - 1)) == text);
    }
}

void tst_cpack::wideStringStopsAtWhatCannotBeExpressed()
{
    std::wstring text = L"ab";
    text += static_cast<wchar_t>(0xD800);
    text += L"cd";
    QCOMPARE(packed([&](simplebuffer* b) { CPack_Simplebuffer::pack_simplebuffer_wstring(b, text); }).toHex(),
             "a3616200");
    QVERIFY(s2ws("ab\xff"
                 "cd",
                 5) == L"ab");
    QVERIFY(s2ws("ab\xe9\x80", 4) == L"ab");
}

void tst_cpack::emptyHeaders()
{
    unsigned char byte = 0x55;
    QCOMPARE(CPack::pack_array_header(&byte, 3), 0UL);
    QCOMPARE(CPack::pack_map_header(&byte, 3), 0UL);
    QCOMPARE(byte, static_cast<unsigned char>(0x55));
    simplebuffer buffer;
    QCOMPARE(CPack_Simplebuffer::pack_simplebuffer_array_header(&buffer, 3), 0UL);
    QCOMPARE(buffer.size, 0UL);
}

void tst_cpack::unpackTable_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<int>("type");
    QTest::addColumn<qint64>("value");
    QTest::addColumn<int>("consumed");
    const auto row = [](const char* hex, int type, qint64 value) {
        const QByteArray bytes = QByteArray::fromHex(hex);
        QTest::newRow(hex) << bytes << type << value << static_cast<int>(bytes.size());
    };
    row("c2", UNPACK_BOOL, 0);
    row("c3", UNPACK_BOOL, 1);
    row("00", UNPACK_UNSIGNED, 0);
    row("7f", UNPACK_UNSIGNED, 127);
    row("ccff", UNPACK_UNSIGNED, 255);
    row("cdffff", UNPACK_UNSIGNED, 65535);
    row("ceffffffff", UNPACK_UNSIGNED, 4294967295LL);
    row("cf7fffffffffffffff", UNPACK_UNSIGNED, std::numeric_limits<qint64>::max());
    row("e0", UNPACK_SIGNED, -32);
    row("ff", UNPACK_SIGNED, -1);
    row("d07f", UNPACK_SIGNED, 127);
    row("d080", UNPACK_SIGNED, -128);
    row("d18000", UNPACK_SIGNED, -32768);
    row("d280000000", UNPACK_SIGNED, -2147483648LL);
    row("d38000000000000000", UNPACK_SIGNED, std::numeric_limits<qint64>::min());
    row("a0", UNPACK_RAW, 0);
    row("a3616263", UNPACK_RAW, 3);
    row("da0002aabb", UNPACK_RAW, 2);
    row("db00000001ff", UNPACK_RAW, 1);
}

void tst_cpack::unpackTable()
{
    QFETCH(QByteArray, bytes);
    QFETCH(int, type);
    QFETCH(qint64, value);
    QFETCH(int, consumed);
    unpack_info_t info;
    QCOMPARE(readValue(bytes, &info), static_cast<unsigned long>(consumed));
    QCOMPARE(info.type, type);
    QCOMPARE(static_cast<qint64>(info.value.i64), value);
    for (qsizetype cut = 0; cut < bytes.size(); ++cut) {
        unpack_info_t untouched;
        untouched.type = 77;
        QCOMPARE(readValue(bytes.left(cut), &untouched), 0UL);
        QCOMPARE(untouched.type, 77);
    }
}

void tst_cpack::unknownTagsConsumeNothing()
{
    int unknown = 0;
    for (int tag = 0; tag < 256; ++tag) {
        const QByteArray message = QByteArray(1, static_cast<char>(tag)) +
                                   QByteArray(32, '\0'); // room for the longest raw of one byte's header
        unpack_info_t info;
        info.type = 77;
        info.value.u64 = 12345;
        if (readValue(message, &info) == 0) {
            ++unknown;
            QCOMPARE(info.type, 77);
            QCOMPARE(info.value.u64, std::uint64_t(12345));
            QVERIFY((tag >= 0x80 && tag <= 0x9F) || (tag >= 0xC1 && tag <= 0xDF));
        } else if (tag < 0xA0 || tag > 0xBF) {
            QVERIFY(info.type != 77);
        }
    }
    // 0x80 to 0x9F, and of 0xC0 to 0xDF all but the fifteen in use.
    QCOMPARE(unknown, 32 + 17);
}

void tst_cpack::nilLeavesTheValue()
{
    unpack_info_t info;
    info.type = 77;
    info.value.u64 = 9;
    QCOMPARE(readValue(QByteArray::fromHex("c0"), &info), 1UL);
    QCOMPARE(info.type, UNPACK_NIL);
    QCOMPARE(info.value.u64, std::uint64_t(9));
}

void tst_cpack::boundedReadRefusesWhatIsCut()
{
    unpack_info_t info;
    QCOMPARE(readValue(QByteArray::fromHex("dbffffffff00"), &info), 0UL);
    QCOMPARE(readValue(QByteArray::fromHex("daffff00"), &info), 0UL);
    QCOMPARE(readValue(QByteArray::fromHex("a2ff"), &info), 0UL);
    QCOMPARE(CUnpack::unpack(&info, nullptr, 0), 0UL);
    QCOMPARE(CUnpack::unpack(&info, nullptr, 10), 0UL);
}

void tst_cpack::unboundedReadOfAWholeMessage()
{
    unsigned char message[] = {0xDA, 0x00, 0x02, 'x', 0x00, 0x05};
    unpack_info_t info;
    QCOMPARE(CUnpack::unpack(&info, message), 5UL);
    QCOMPARE(info.type, UNPACK_RAW);
    QVERIFY(info.raw == message + 3);
    QCOMPARE(CUnpack::unpack(&info, message + 5), 1UL);
    QCOMPARE(info.value.u64, std::uint64_t(5));
    CUnpack reader;
    QCOMPARE(reader.unpack_base(message), 3UL);
}

void tst_cpack::s2wsEndsAtNulAndAtLength()
{
    QVERIFY(s2ws("abc", 2) == L"ab");
    QVERIFY(s2ws("a\0c", 3) == L"a");
    QVERIFY(s2ws("", 0).empty());
    QVERIFY(s2ws(nullptr, 5).empty());
}

void tst_cpack::bufferGrowth()
{
    simplebuffer buffer;
    CSimpleBuffer::simplebuffer_init(&buffer, nullptr, 0);
    QVERIFY(CSimpleBuffer::simplebuffer_checksize(&buffer, 1) == buffer.data);
    QCOMPARE(buffer.size, 1UL);
    QCOMPARE(buffer.capacity, 5UL); // 0 + 1 + the unit of 4
    QVERIFY(CSimpleBuffer::simplebuffer_checksize(&buffer, 4) == buffer.data + 1);
    QCOMPARE(buffer.capacity, 5UL);
    QCOMPARE(allocations, 1);
    QVERIFY(CSimpleBuffer::simplebuffer_checksize(&buffer, 10) == buffer.data + 5);
    QCOMPARE(buffer.capacity, 25UL); // 5 + 10 + 10
    QCOMPARE(releases, 1);
    CSimpleBuffer::simplebuffer_destroy(&buffer);
    QCOMPARE(releases, 2);
    QCOMPARE(buffer.capacity, 0UL);
    QVERIFY(buffer.data == nullptr);
}

void tst_cpack::bufferOfForeignData()
{
    unsigned char foreign[] = {1, 2, 3};
    simplebuffer buffer;
    CSimpleBuffer::simplebuffer_init(&buffer, foreign, 3);
    QCOMPARE(buffer.size, 3UL);
    QCOMPARE(buffer.capacity, 0UL);
    CPack_Simplebuffer::pack_simplebuffer_int(&buffer, 4);
    QVERIFY(buffer.data != foreign);
    QCOMPARE(bytesOf(buffer).toHex(), "01020304");
    QCOMPARE(releases, 0);
    CSimpleBuffer::simplebuffer_destroy(&buffer);
    CSimpleBuffer::simplebuffer_init(&buffer, foreign, 3);
    CSimpleBuffer::simplebuffer_destroy(&buffer);
    QCOMPARE(releases, 1);
}

void tst_cpack::bufferRelease()
{
    simplebuffer buffer;
    CPack_Simplebuffer::pack_simplebuffer_int(&buffer, 7);
    unsigned char* data = CSimpleBuffer::simplebuffer_release(&buffer);
    QCOMPARE(*data, static_cast<unsigned char>(7));
    QVERIFY(buffer.data == nullptr);
    QCOMPARE(buffer.size, 0UL);
    QCOMPARE(releases, 0);
    countingFree(data);
}

void tst_cpack::bufferWithoutMemory()
{
    simplebuffer buffer;
    CPack_Simplebuffer::pack_simplebuffer_int(&buffer, 7);
    const simplebuffer before = buffer;
    allocationsFail = true;
    QVERIFY(CSimpleBuffer::simplebuffer_checksize(&buffer, 100) == nullptr);
    QVERIFY(!CPack_Simplebuffer::pack_simplebuffer_string(&buffer, std::string(100, 'x')));
    QVERIFY(CSimpleBuffer::simplebuffer_checksize(&buffer, ULONG_MAX) == nullptr);
    QCOMPARE(buffer.size, before.size);
    QCOMPARE(buffer.capacity, before.capacity);
    QVERIFY(buffer.data == before.data);
    allocationsFail = false;
    CSimpleBuffer::simplebuffer_destroy(&buffer);
}

QTEST_GUILESS_MAIN(tst_cpack)
#include "tst_cpack.moc"
