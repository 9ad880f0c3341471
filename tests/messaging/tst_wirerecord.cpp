// The wire form of the records: round trips, and messages that are truncated or malformed.
#include "messaging/services/RecordPacking.h"
#include "messaging/services/TitlerParams.h"
#include "tests/support/RandomSeed.h"

#include <QByteArray>
#include <QTest>

#include <cstring>
#include <functional>
#include <memory>
#include <random>
#include <vector>

namespace
{

// Heap memory of exactly the message's size, so that a sanitizer reports any read beyond it.
class Message
{
public:
    explicit Message(const QByteArray& bytes)
        : m_size(bytes.size()), m_data(new unsigned char[m_size > 0 ? m_size : 1])
    {
        std::memcpy(m_data.get(), bytes.constData(), static_cast<std::size_t>(m_size));
    }
    void* data() const { return m_data.get(); }
    long size() const { return m_size; }

private:
    long m_size;
    std::unique_ptr<unsigned char[]> m_data;
};

QByteArray take(simplebuffer buffer)
{
    const QByteArray bytes(reinterpret_cast<const char*>(buffer.data), static_cast<qsizetype>(buffer.size));
    CSimpleBuffer::simplebuffer_destroy(&buffer);
    return bytes;
}

template <typename Record>
QByteArray pack(const Record& record)
{
    return take(RecordPacking::serialize(record));
}

const std::wstring SCRIPTS = L"Breaking 快讯 速報 속보 é e\u0301 \U0001F600";

struct Case {
    const char* name;
    QByteArray whole;
    QByteArray empty; // what a message without a byte reads as, packed again
    std::function<QByteArray(void* data, long size)> again; // reads a message and packs what was read
};

template <typename Record>
Case makeCase(const char* name, const Record& record)
{
    const auto again = [](void* data, long size) {
        Record read{};
        RecordPacking::deserialize(read, data, size);
        return pack(read);
    };
    return {name, pack(record), again(nullptr, 0), again};
}

std::vector<Case> makeCases()
{
    FileManagerDefine::tagRenameNotify rename{8, -2, 3, {L"a", SCRIPTS, L"", L"d"}};
    FileManagerDefine::tagImportNotify import{8,
                                              0,
                                              1,
                                              -5000000000L,
                                              4,
                                              SCRIPTS,
                                              70000,
                                              -70000,
                                              {L"x", L"", SCRIPTS},
                                              12,
                                              true,
                                              {1, -2, 3, 400, 5, -60000, 7}};
    return {
        makeCase("_tagAPPEvent", APPEventDefine::_tagAPPEvent{5, 2, true, 3}),
        makeCase("tagTitleChangeStatusParam", FileManagerDefine::tagTitleChangeStatusParam{7, SCRIPTS, 4}),
        makeCase("tagTitlerPathParam", FileManagerDefine::tagTitlerPathParam{-1, SCRIPTS}),
        makeCase("tagChangeFolderNameParam", FileManagerDefine::tagChangeFolderNameParam{1, SCRIPTS, L"new"}),
        makeCase("tagRenameNotify", rename),
        makeCase("tagImportNotify", import),
        makeCase("tagDeleteNotify", FileManagerDefine::tagDeleteNotify{1, 8, 0, SCRIPTS, 5, 1L << 40, -7}),
        makeCase("_tagTopWindowParam", MessageDefine::_tagTopWindowParam{300, 1}),
        makeCase("_tagMessageParam", MessageDefine::_tagMessageParam{3, 2, -1, L"", SCRIPTS, 117}),
        makeCase("_tagCloseParam", MessageDefine::_tagCloseParam{3, 2, 117}),
        makeCase("tagFOLDER_TYPE", SubCommonDefine::tagFOLDER_TYPE{9, SCRIPTS}),
        makeCase("tagSoftKeyBoardInitData",
                 SubCommonDefine::tagSoftKeyBoardInitData{1, SCRIPTS, 2, 20, L"text", 4, 1, 3, 2,
                                                          L"^[a-z]{0,20}$", 300}),
        makeCase("tagSoftKeyBoardKeyData",
                 SubCommonDefine::tagSoftKeyBoardKeyData{6, 0x01000004, 0x02000000, L"\r", true, 65293}),
        makeCase("tagSoftKeyBoardKeyTextSelectionPos",
                 SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos{1, 2, -3, 1}),
        makeCase("taLimitInfo", SubCommonDefine::taLimitInfo{SCRIPTS, L"two", 4001}),
        makeCase("tagSystemLanguageParam", SystemSetupDef::tagSystemLanguageParam{-1, 2, 9}),
        makeCase("tagSystemInformation", SystemSetupDef::tagSystemInformation{1}),
        makeCase("_SHOW_TITLER_PARAMTER", _SHOW_TITLER_PARAMTER{4, SCRIPTS}),
        makeCase("_tagCallBackInfo", _tagCallBackInfo{12, 1003}),
        makeCase("_tagNotifyInfo", _tagNotifyInfo{12, 1003, 5}),
        makeCase("int", -70000),
        makeCase("bool", true),
        makeCase("wide", SCRIPTS),
    };
}

} // namespace

class tst_wirerecord : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { m_cases = makeCases(); }
    void thereAndBack();
    void fieldsArriveInTheirPlaces();
    void formsOfTheFields();
    void everyTruncation();
    void randomPayloads();
    void damagedPayloads();
    void unreadableFieldsAreZero();
    void stringsWithoutNul();
    void hugeLengths();
    void wrongTypesReadAsTheyStand();
    void sessionResult();
    void sessionResultThatLies();

private:
    std::vector<Case> m_cases;
};

void tst_wirerecord::thereAndBack()
{
    for (const Case& c : m_cases) {
        const Message message(c.whole);
        QVERIFY2(c.again(message.data(), message.size()) == c.whole, c.name);
        QVERIFY2(c.whole != c.empty, c.name);
    }
}

void tst_wirerecord::fieldsArriveInTheirPlaces()
{
    const SubCommonDefine::tagSoftKeyBoardInitData sent{1, SCRIPTS, 2, 20,       L"text", 4,
                                                        1, 3,       2, L"limit", 300};
    const Message message(pack(sent));
    SubCommonDefine::tagSoftKeyBoardInitData read;
    RecordPacking::deserialize(read, message.data(), message.size());
    QCOMPARE(read.fieldKind, 1);
    QVERIFY(read.title == SCRIPTS);
    QCOMPARE(read.keyboardType, 2);
    QCOMPARE(read.maxLength, 20);
    QVERIFY(read.text == L"text");
    QCOMPARE(read.textLength, 4);
    QCOMPARE(read.selectionStart, 1);
    QCOMPARE(read.selectionEnd, 3);
    QCOMPARE(read.selectionMode, 2);
    QVERIFY(read.limitCondition == L"limit");
    QCOMPARE(read.lastValue, 300);
}

void tst_wirerecord::formsOfTheFields()
{
    QCOMPARE(pack(APPEventDefine::_tagAPPEvent{1, 2, true, 3}).toHex(), "d200000001d2000000020103");
    QCOMPARE(pack(MessageDefine::_tagCloseParam{3, 2, 117}).toHex(), "030275");
    QCOMPARE(pack(MessageDefine::_tagMessageParam{3, 2, -1, L"", L"a", 196}).toHex(), "0302ffa100a26100ccc4");
    QCOMPARE(pack(_tagNotifyInfo{1, 1003, 2}).toHex(), "d200000001d2000003ebd200000002");
    QCOMPARE(pack(_SHOW_TITLER_PARAMTER{0, L"/t"}).toHex(), "00a32f7400");
    QCOMPARE(pack(SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos{0, 1, 2, 0}).toHex(),
             "d200000000d200000001d200000002d200000000");
    FileManagerDefine::tagDeleteNotify notice{1, 8, 0, L"p", 5, 6, 7};
    QCOMPARE(pack(notice).toHex(), "010800a2700005d3000000000000000607");
    QCOMPARE(pack(false).toHex(), "00");
}

void tst_wirerecord::everyTruncation()
{
    for (const Case& c : m_cases) {
        for (qsizetype length = 0; length < c.whole.size(); ++length) {
            const Message cut(c.whole.left(length));
            const QByteArray read = c.again(cut.data(), cut.size());
            QVERIFY2(read != c.whole, c.name);
            if (length == 0)
                QVERIFY2(read == c.empty, c.name);
        }
        QVERIFY2(c.again(nullptr, 100) == c.empty, c.name);
        const Message whole(c.whole);
        QVERIFY2(c.again(whole.data(), -1) == c.empty, c.name);
        QVERIFY2(c.again(whole.data(), std::numeric_limits<long>::min()) == c.empty, c.name);
    }
}

void tst_wirerecord::randomPayloads()
{
    const RandomSeed seed(12345);
    std::mt19937 random(seed);
    for (const Case& c : m_cases) {
        for (int round = 0; round < 2000; ++round) {
            QByteArray noise(static_cast<qsizetype>(random() % 64), '\0');
            for (char& byte : noise)
                byte = static_cast<char>(random());
            const Message message(noise);
            const QByteArray read = c.again(message.data(), message.size());
            const Message packedAgain(read);
            QVERIFY2(c.again(packedAgain.data(), packedAgain.size()) == read, c.name);
        }
    }
}

void tst_wirerecord::damagedPayloads()
{
    const RandomSeed seed(99);
    std::mt19937 random(seed);
    for (const Case& c : m_cases) {
        for (qsizetype at = 0; at < c.whole.size(); ++at) {
            QByteArray damaged = c.whole;
            damaged[at] = static_cast<char>(random());
            const Message message(damaged);
            const QByteArray read = c.again(message.data(), message.size());
            QVERIFY2(!read.isEmpty(), c.name);
        }
    }
}

void tst_wirerecord::unreadableFieldsAreZero()
{
    MessageDefine::_tagMessageParam param; // its defaults are not zero
    RecordPacking::deserialize(param, nullptr, 0);
    QCOMPARE(param.clientId, 0);
    QCOMPARE(param.boxKind, 0);
    QCOMPARE(param.boxType, 0);
    const Message unknownTag(QByteArray::fromHex("05c10707"));
    RecordPacking::deserialize(param, unknownTag.data(), unknownTag.size());
    QCOMPARE(param.clientId, 5);
    QCOMPARE(param.boxKind, 0);
    QVERIFY(param.text.empty());
    QCOMPARE(param.messageId, 0);
}

void tst_wirerecord::stringsWithoutNul()
{
    const Message message(QByteArray::fromHex("00a3616263"));
    _SHOW_TITLER_PARAMTER param;
    RecordPacking::deserialize(param, message.data(), message.size());
    QVERIFY(param.path == L"abc");
}

void tst_wirerecord::hugeLengths()
{
    for (const char* hex : {"00dbffffffff61", "00db7fffffff61", "00daffff61", "00bf61"}) {
        const Message message(QByteArray::fromHex(hex));
        _SHOW_TITLER_PARAMTER param;
        param.path = L"before";
        RecordPacking::deserialize(param, message.data(), message.size());
        QVERIFY(param.path.empty());
    }
}

void tst_wirerecord::wrongTypesReadAsTheyStand()
{
    // Reading a number from a raw gives its length, reading a text from a number gives an empty text.
    const Message message(QByteArray::fromHex("a3616263"
                                              "05"));
    _SHOW_TITLER_PARAMTER param;
    RecordPacking::deserialize(param, message.data(), message.size());
    QCOMPARE(param.type, 3);
    QVERIFY(param.path.empty());
    const Message truth(QByteArray::fromHex("c3"));
    int number = 0;
    RecordPacking::deserialize(number, truth.data(), truth.size());
    QCOMPARE(number, 1);
}

void tst_wirerecord::sessionResult()
{
    simplebuffer paths;
    RecordPacking::pack(&paths, std::wstring(L"/a/1.xml"));
    RecordPacking::pack(&paths, SCRIPTS);
    const _CALLBACK_TITLER_PARAMTER sent{6, L"/a", paths.data, static_cast<int>(paths.size), 2};
    const Message message(take(TitlerParams::serialize_finishTitlerCreateCallback_param(sent)));
    CSimpleBuffer::simplebuffer_destroy(&paths);
    _CALLBACK_TITLER_PARAMTER read;
    TitlerParams::deserialize_finishTitlerCreateCallback_param(read, message.data(), message.size());
    QCOMPARE(read.type, 6);
    QVERIFY(read.path == L"/a");
    QCOMPARE(read.count, 2);
    const std::vector<std::wstring> unpacked = TitlerParams::unpackPaths(read);
    QCOMPARE(unpacked.size(), std::size_t(2));
    QVERIFY(unpacked[0] == L"/a/1.xml");
    QVERIFY(unpacked[1] == SCRIPTS);

    const Message nothing(pack(_CALLBACK_TITLER_PARAMTER{1, L"/a", nullptr, 0, 0}));
    TitlerParams::deserialize_finishTitlerCreateCallback_param(read, nothing.data(), nothing.size());
    QCOMPARE(read.size, 0);
    QVERIFY(TitlerParams::unpackPaths(read).empty());
}

void tst_wirerecord::sessionResultThatLies()
{
    const QByteArray onePath = QByteArray::fromHex("a2a161"
                                                   "");
    for (const char* sizeAndCount : {"ce7fffffff"
                                     "ce7fffffff",
                                     "ff"
                                     "ff",
                                     "d280000000"
                                     "cd0100",
                                     "02"
                                     "ce7fffffff"}) {
        const Message message(QByteArray::fromHex("00a100") + onePath + QByteArray::fromHex(sizeAndCount));
        _CALLBACK_TITLER_PARAMTER read;
        TitlerParams::deserialize_finishTitlerCreateCallback_param(read, message.data(), message.size());
        QVERIFY(read.size >= 0 && read.size <= 2);
        QVERIFY(read.count >= 0);
        QVERIFY(TitlerParams::unpackPaths(read).size() <= 1);
    }
    for (qsizetype length = 0; length < 8; ++length) {
        const Message cut(QByteArray::fromHex("00a100a2a1610201").left(length));
        _CALLBACK_TITLER_PARAMTER read;
        TitlerParams::deserialize_finishTitlerCreateCallback_param(read, cut.data(), cut.size());
        QVERIFY(TitlerParams::unpackPaths(read).size() <= 1);
    }
}

QTEST_GUILESS_MAIN(tst_wirerecord)
#include "tst_wirerecord.moc"
