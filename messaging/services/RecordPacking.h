// The wire form of every record: which fields, in which order, in which form.
#pragma once

#include "messaging/ptc/CSimpleBuffer.h"
#include "messaging/services/APPEventDefine.h"
#include "messaging/services/FileManagerDefine.h"
#include "messaging/services/MessageDefine.h"
#include "messaging/services/RecordReader.h"
#include "messaging/services/SubCommonDefine.h"
#include "messaging/services/SystemSetupDef.h"
#include "messaging/services/TitlerDefine.h"

#include <string>

namespace RecordPacking
{

void pack(simplebuffer* buffer, int value);
void pack(simplebuffer* buffer, bool value);
void pack(simplebuffer* buffer, const std::wstring& value);
void pack(simplebuffer* buffer, const APPEventDefine::_tagAPPEvent& record);
void pack(simplebuffer* buffer, const FileManagerDefine::tagTitleChangeStatusParam& record);
void pack(simplebuffer* buffer, const FileManagerDefine::tagTitlerPathParam& record);
void pack(simplebuffer* buffer, const FileManagerDefine::tagChangeFolderNameParam& record);
void pack(simplebuffer* buffer, const FileManagerDefine::tagRenameNotify& record);
void pack(simplebuffer* buffer, const FileManagerDefine::tagImportNotify& record);
void pack(simplebuffer* buffer, const FileManagerDefine::tagDeleteNotify& record);
void pack(simplebuffer* buffer, const MessageDefine::_tagTopWindowParam& record);
void pack(simplebuffer* buffer, const MessageDefine::_tagMessageParam& record);
void pack(simplebuffer* buffer, const MessageDefine::_tagCloseParam& record);
void pack(simplebuffer* buffer, const SubCommonDefine::tagFOLDER_TYPE& record);
void pack(simplebuffer* buffer, const SubCommonDefine::tagSoftKeyBoardInitData& record);
void pack(simplebuffer* buffer, const SubCommonDefine::tagSoftKeyBoardKeyData& record);
void pack(simplebuffer* buffer, const SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos& record);
void pack(simplebuffer* buffer, const SubCommonDefine::taLimitInfo& record);
void pack(simplebuffer* buffer, const SystemSetupDef::tagSystemLanguageParam& record);
void pack(simplebuffer* buffer, const SystemSetupDef::tagSystemInformation& record);
void pack(simplebuffer* buffer, const _SHOW_TITLER_PARAMTER& record);
void pack(simplebuffer* buffer, const _CALLBACK_TITLER_PARAMTER& record);
void pack(simplebuffer* buffer, const _tagCallBackInfo& record);
void pack(simplebuffer* buffer, const _tagNotifyInfo& record);

void unpack(RecordReader& reader, int& value);
void unpack(RecordReader& reader, bool& value);
void unpack(RecordReader& reader, std::wstring& value);
void unpack(RecordReader& reader, APPEventDefine::_tagAPPEvent& record);
void unpack(RecordReader& reader, FileManagerDefine::tagTitleChangeStatusParam& record);
void unpack(RecordReader& reader, FileManagerDefine::tagTitlerPathParam& record);
void unpack(RecordReader& reader, FileManagerDefine::tagChangeFolderNameParam& record);
void unpack(RecordReader& reader, FileManagerDefine::tagRenameNotify& record);
void unpack(RecordReader& reader, FileManagerDefine::tagImportNotify& record);
void unpack(RecordReader& reader, FileManagerDefine::tagDeleteNotify& record);
void unpack(RecordReader& reader, MessageDefine::_tagTopWindowParam& record);
void unpack(RecordReader& reader, MessageDefine::_tagMessageParam& record);
void unpack(RecordReader& reader, MessageDefine::_tagCloseParam& record);
void unpack(RecordReader& reader, SubCommonDefine::tagFOLDER_TYPE& record);
void unpack(RecordReader& reader, SubCommonDefine::tagSoftKeyBoardInitData& record);
void unpack(RecordReader& reader, SubCommonDefine::tagSoftKeyBoardKeyData& record);
void unpack(RecordReader& reader, SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos& record);
void unpack(RecordReader& reader, SubCommonDefine::taLimitInfo& record);
void unpack(RecordReader& reader, SystemSetupDef::tagSystemLanguageParam& record);
void unpack(RecordReader& reader, SystemSetupDef::tagSystemInformation& record);
void unpack(RecordReader& reader, _SHOW_TITLER_PARAMTER& record);
void unpack(RecordReader& reader, _CALLBACK_TITLER_PARAMTER& record);
void unpack(RecordReader& reader, _tagCallBackInfo& record);
void unpack(RecordReader& reader, _tagNotifyInfo& record);

// A new buffer with the packed record; the caller destroys it.
template <typename Record>
simplebuffer serialize(const Record& record)
{
    simplebuffer buffer;
    CSimpleBuffer::simplebuffer_init(&buffer, nullptr, 0);
    pack(&buffer, record);
    return buffer;
}

template <typename Record>
void deserialize(Record& record, void* data, long size)
{
    RecordReader reader(data, size);
    unpack(reader, record);
}

} // namespace RecordPacking
