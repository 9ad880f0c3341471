// Reads the records of the wire from random bytes: checks that nothing is read beyond the end of the message,
// and that a record can be packed and read again unchanged. The first byte selects the record.
#include "messaging/services/RecordPacking.h"
#include "messaging/services/TitlerParams.h"

#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <iterator>
#include <string>
#include <vector>

namespace
{

// Heap memory of exactly this size, so that the sanitizer detects every byte read beyond it.
using Message = std::vector<unsigned char>;

template <typename Record>
std::string pack(const Record& record)
{
    simplebuffer buffer = RecordPacking::serialize(record);
    std::string bytes(reinterpret_cast<const char*>(buffer.data), buffer.size);
    CSimpleBuffer::simplebuffer_destroy(&buffer);
    return bytes;
}

template <typename Record>
void readAndPack(Message& message)
{
    Record record{};
    RecordPacking::deserialize(record, message.data(), static_cast<long>(message.size()));
    const std::string first = pack(record);
    std::vector<char> packed(first.begin(), first.end());
    Record again{};
    RecordPacking::deserialize(again, packed.data(), static_cast<long>(packed.size()));
    if (pack(again) != first) {
        std::fprintf(stderr, "reads otherwise when packed again\n");
        std::abort();
    }
}

void readAnswer(Message& message)
{
    _CALLBACK_TITLER_PARAMTER answer;
    RecordPacking::deserialize(answer, message.data(), static_cast<long>(message.size()));
    TitlerParams::unpackPaths(answer);
}

using Reader = void (*)(Message&);
const Reader READERS[] = {readAndPack<APPEventDefine::_tagAPPEvent>,
                          readAndPack<FileManagerDefine::tagTitleChangeStatusParam>,
                          readAndPack<FileManagerDefine::tagTitlerPathParam>,
                          readAndPack<FileManagerDefine::tagChangeFolderNameParam>,
                          readAndPack<FileManagerDefine::tagRenameNotify>,
                          readAndPack<FileManagerDefine::tagImportNotify>,
                          readAndPack<FileManagerDefine::tagDeleteNotify>,
                          readAndPack<MessageDefine::_tagTopWindowParam>,
                          readAndPack<MessageDefine::_tagMessageParam>,
                          readAndPack<MessageDefine::_tagCloseParam>,
                          readAndPack<SubCommonDefine::tagFOLDER_TYPE>,
                          readAndPack<SubCommonDefine::tagSoftKeyBoardInitData>,
                          readAndPack<SubCommonDefine::tagSoftKeyBoardKeyData>,
                          readAndPack<SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos>,
                          readAndPack<SubCommonDefine::taLimitInfo>,
                          readAndPack<SystemSetupDef::tagSystemLanguageParam>,
                          readAndPack<SystemSetupDef::tagSystemInformation>,
                          readAndPack<_SHOW_TITLER_PARAMTER>,
                          readAndPack<_tagCallBackInfo>,
                          readAndPack<_tagNotifyInfo>,
                          readAndPack<int>,
                          readAndPack<bool>,
                          readAndPack<std::wstring>,
                          readAnswer};

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    if (size == 0)
        return 0;
    Message message(data + 1, data + size);
    READERS[data[0] % std::size(READERS)](message);
    return 0;
}
