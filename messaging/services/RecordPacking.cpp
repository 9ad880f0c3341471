#include "messaging/services/RecordPacking.h"

#include "messaging/ptc/CPack_Simplebuffer.h"

#include <algorithm>

namespace RecordPacking
{

namespace
{

void putInt(simplebuffer* buffer, int value)
{
    CPack_Simplebuffer::pack_simplebuffer_int(buffer, value);
}

void putInt32(simplebuffer* buffer, int value)
{
    CPack_Simplebuffer::pack_simplebuffer_int32(buffer, value);
}

void putWide(simplebuffer* buffer, const std::wstring& text)
{
    CPack_Simplebuffer::pack_simplebuffer_wstring(buffer, text);
}

} // namespace

void pack(simplebuffer* buffer, int value)
{
    putInt(buffer, value);
}

void pack(simplebuffer* buffer, bool value)
{
    putInt(buffer, value ? 1 : 0);
}

void pack(simplebuffer* buffer, const std::wstring& value)
{
    putWide(buffer, value);
}

void unpack(RecordReader& reader, int& value)
{
    value = reader.readInt();
}

void unpack(RecordReader& reader, bool& value)
{
    value = reader.readBool();
}

void unpack(RecordReader& reader, std::wstring& value)
{
    value = reader.readWide();
}

void pack(simplebuffer* buffer, const APPEventDefine::_tagAPPEvent& record)
{
    putInt32(buffer, record.clientId);
    putInt32(buffer, record.lockType);
    putInt(buffer, record.flag ? 1 : 0);
    putInt(buffer, record.eventReceiver);
}

void unpack(RecordReader& reader, APPEventDefine::_tagAPPEvent& record)
{
    record.clientId = reader.readInt();
    record.lockType = reader.readInt();
    record.flag = reader.readBool();
    record.eventReceiver = reader.readInt();
}

void pack(simplebuffer* buffer, const FileManagerDefine::tagTitleChangeStatusParam& record)
{
    putInt32(buffer, record.clientId);
    putWide(buffer, record.path);
    putInt(buffer, record.changeType);
}

void unpack(RecordReader& reader, FileManagerDefine::tagTitleChangeStatusParam& record)
{
    record.clientId = reader.readInt();
    record.path = reader.readWide();
    record.changeType = reader.readInt();
}

void pack(simplebuffer* buffer, const FileManagerDefine::tagTitlerPathParam& record)
{
    putInt32(buffer, record.clientId);
    putWide(buffer, record.path);
}

void unpack(RecordReader& reader, FileManagerDefine::tagTitlerPathParam& record)
{
    record.clientId = reader.readInt();
    record.path = reader.readWide();
}

void pack(simplebuffer* buffer, const FileManagerDefine::tagChangeFolderNameParam& record)
{
    putInt32(buffer, record.clientId);
    putWide(buffer, record.oldPath);
    putWide(buffer, record.newPath);
}

void unpack(RecordReader& reader, FileManagerDefine::tagChangeFolderNameParam& record)
{
    record.clientId = reader.readInt();
    record.oldPath = reader.readWide();
    record.newPath = reader.readWide();
}

void pack(simplebuffer* buffer, const FileManagerDefine::tagRenameNotify& record)
{
    putInt(buffer, record.fileType);
    putInt(buffer, record.second);
    putInt(buffer, record.third);
    for (const std::wstring& text : record.strings) {
        putWide(buffer, text);
    }
}

void unpack(RecordReader& reader, FileManagerDefine::tagRenameNotify& record)
{
    record.fileType = reader.readInt();
    record.second = reader.readInt();
    record.third = reader.readInt();
    for (std::wstring& text : record.strings) {
        text = reader.readWide();
    }
}

void pack(simplebuffer* buffer, const FileManagerDefine::tagImportNotify& record)
{
    putInt(buffer, record.fileType);
    putInt(buffer, record.fileTypeHigh);
    putInt(buffer, record.third);
    CPack_Simplebuffer::pack_simplebuffer_int64(buffer, record.fourth);
    putInt(buffer, record.fifth);
    putWide(buffer, record.path);
    putInt(buffer, record.seventh);
    putInt(buffer, record.eighth);
    for (const std::wstring& text : record.strings) {
        putWide(buffer, text);
    }
    putInt(buffer, record.twelfth);
    CPack_Simplebuffer::pack_simplebuffer_bool(buffer, record.thirteenth);
    for (const int value : record.last) {
        putInt(buffer, value);
    }
}

void unpack(RecordReader& reader, FileManagerDefine::tagImportNotify& record)
{
    record.fileType = reader.readInt();
    record.fileTypeHigh = reader.readInt();
    record.third = reader.readInt();
    record.fourth = reader.readLong();
    record.fifth = reader.readInt();
    record.path = reader.readWide();
    record.seventh = reader.readInt();
    record.eighth = reader.readInt();
    for (std::wstring& text : record.strings) {
        text = reader.readWide();
    }
    record.twelfth = reader.readInt();
    record.thirteenth = reader.readBool();
    for (int& value : record.last) {
        value = reader.readInt();
    }
}

void pack(simplebuffer* buffer, const FileManagerDefine::tagDeleteNotify& record)
{
    putInt(buffer, record.first);
    putInt(buffer, record.fileType);
    putInt(buffer, record.result);
    putWide(buffer, record.path);
    putInt(buffer, record.fifth);
    CPack_Simplebuffer::pack_simplebuffer_int64(buffer, record.sixth);
    putInt(buffer, record.seventh);
}

void unpack(RecordReader& reader, FileManagerDefine::tagDeleteNotify& record)
{
    record.first = reader.readInt();
    record.fileType = reader.readInt();
    record.result = reader.readInt();
    record.path = reader.readWide();
    record.fifth = reader.readInt();
    record.sixth = reader.readLong();
    record.seventh = reader.readInt();
}

void pack(simplebuffer* buffer, const MessageDefine::_tagTopWindowParam& record)
{
    putInt(buffer, record.clientId);
    putInt(buffer, record.topWindow);
}

void unpack(RecordReader& reader, MessageDefine::_tagTopWindowParam& record)
{
    record.clientId = reader.readInt();
    record.topWindow = reader.readInt();
}

void pack(simplebuffer* buffer, const MessageDefine::_tagMessageParam& record)
{
    putInt(buffer, record.clientId);
    putInt(buffer, record.boxKind);
    putInt(buffer, record.boxType);
    putWide(buffer, record.first);
    putWide(buffer, record.text);
    putInt(buffer, record.messageId);
}

void unpack(RecordReader& reader, MessageDefine::_tagMessageParam& record)
{
    record.clientId = reader.readInt();
    record.boxKind = reader.readInt();
    record.boxType = reader.readInt();
    record.first = reader.readWide();
    record.text = reader.readWide();
    record.messageId = reader.readInt();
}

void pack(simplebuffer* buffer, const MessageDefine::_tagCloseParam& record)
{
    putInt(buffer, record.clientId);
    putInt(buffer, record.closeType);
    putInt(buffer, record.messageId);
}

void unpack(RecordReader& reader, MessageDefine::_tagCloseParam& record)
{
    record.clientId = reader.readInt();
    record.closeType = reader.readInt();
    record.messageId = reader.readInt();
}

void pack(simplebuffer* buffer, const SubCommonDefine::tagFOLDER_TYPE& record)
{
    putInt(buffer, record.type);
    putWide(buffer, record.path);
}

void unpack(RecordReader& reader, SubCommonDefine::tagFOLDER_TYPE& record)
{
    record.type = reader.readInt();
    record.path = reader.readWide();
}

void pack(simplebuffer* buffer, const SubCommonDefine::tagSoftKeyBoardInitData& record)
{
    putInt32(buffer, record.fieldKind);
    putWide(buffer, record.title);
    putInt32(buffer, record.keyboardType);
    putInt32(buffer, record.maxLength);
    putWide(buffer, record.text);
    putInt32(buffer, record.textLength);
    putInt32(buffer, record.selectionStart);
    putInt32(buffer, record.selectionEnd);
    putInt32(buffer, record.selectionMode);
    putWide(buffer, record.limitCondition);
    putInt32(buffer, record.lastValue);
}

void unpack(RecordReader& reader, SubCommonDefine::tagSoftKeyBoardInitData& record)
{
    record.fieldKind = reader.readInt();
    record.title = reader.readWide();
    record.keyboardType = reader.readInt();
    record.maxLength = reader.readInt();
    record.text = reader.readWide();
    record.textLength = reader.readInt();
    record.selectionStart = reader.readInt();
    record.selectionEnd = reader.readInt();
    record.selectionMode = reader.readInt();
    record.limitCondition = reader.readWide();
    record.lastValue = reader.readInt();
}

void pack(simplebuffer* buffer, const SubCommonDefine::tagSoftKeyBoardKeyData& record)
{
    putInt32(buffer, record.eventType);
    putInt32(buffer, record.key);
    putInt32(buffer, record.modifiers);
    putWide(buffer, record.text);
    putInt(buffer, record.autoRepeat ? 1 : 0);
    putInt32(buffer, record.nativeVirtualKey);
}

void unpack(RecordReader& reader, SubCommonDefine::tagSoftKeyBoardKeyData& record)
{
    record.eventType = reader.readInt();
    record.key = reader.readInt();
    record.modifiers = reader.readInt();
    record.text = reader.readWide();
    record.autoRepeat = reader.readBool();
    record.nativeVirtualKey = reader.readInt();
}

void pack(simplebuffer* buffer, const SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos& record)
{
    putInt32(buffer, record.begin);
    putInt32(buffer, record.end);
    putInt32(buffer, record.current);
    putInt32(buffer, record.mode);
}

void unpack(RecordReader& reader, SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos& record)
{
    record.begin = reader.readInt();
    record.end = reader.readInt();
    record.current = reader.readInt();
    record.mode = reader.readInt();
}

void pack(simplebuffer* buffer, const SubCommonDefine::taLimitInfo& record)
{
    putWide(buffer, record.text);
    putWide(buffer, record.secondText);
    putInt(buffer, record.code);
}

void unpack(RecordReader& reader, SubCommonDefine::taLimitInfo& record)
{
    record.text = reader.readWide();
    record.secondText = reader.readWide();
    record.code = reader.readInt();
}

void pack(simplebuffer* buffer, const SystemSetupDef::tagSystemLanguageParam& record)
{
    putInt(buffer, record.first);
    putInt(buffer, record.systemLanguage);
    putInt(buffer, record.inputLanguage);
}

void unpack(RecordReader& reader, SystemSetupDef::tagSystemLanguageParam& record)
{
    record.first = reader.readInt();
    record.systemLanguage = reader.readInt();
    record.inputLanguage = reader.readInt();
}

void pack(simplebuffer* buffer, const SystemSetupDef::tagSystemInformation& record)
{
    putInt(buffer, record.model);
}

void unpack(RecordReader& reader, SystemSetupDef::tagSystemInformation& record)
{
    record.model = reader.readInt();
}

void pack(simplebuffer* buffer, const _SHOW_TITLER_PARAMTER& record)
{
    putInt(buffer, record.type);
    putWide(buffer, record.path);
}

void unpack(RecordReader& reader, _SHOW_TITLER_PARAMTER& record)
{
    record.type = reader.readInt();
    record.path = reader.readWide();
}

void pack(simplebuffer* buffer, const _CALLBACK_TITLER_PARAMTER& record)
{
    const int size = record.data != nullptr ? std::max(record.size, 0) : 0;
    putInt(buffer, record.type);
    putWide(buffer, record.path);
    CPack_Simplebuffer::pack_simplebuffer_raw(buffer, record.data, static_cast<std::uint32_t>(size));
    putInt(buffer, size);
    putInt(buffer, record.count);
}

void unpack(RecordReader& reader, _CALLBACK_TITLER_PARAMTER& record)
{
    unsigned long length = 0;
    record.type = reader.readInt();
    record.path = reader.readWide();
    record.data = reader.readRaw(&length);
    record.size = std::clamp(reader.readInt(), 0, static_cast<int>(length));
    record.count = std::max(reader.readInt(), 0);
}

void pack(simplebuffer* buffer, const _tagCallBackInfo& record)
{
    putInt32(buffer, static_cast<int>(record.adapterId));
    putInt32(buffer, static_cast<int>(record.receiverIdentity));
}

void unpack(RecordReader& reader, _tagCallBackInfo& record)
{
    record.adapterId = reader.readInt();
    record.receiverIdentity = reader.readInt();
}

void pack(simplebuffer* buffer, const _tagNotifyInfo& record)
{
    putInt32(buffer, static_cast<int>(record.adapterId));
    putInt32(buffer, static_cast<int>(record.receiverIdentity));
    putInt32(buffer, record.clientId);
}

void unpack(RecordReader& reader, _tagNotifyInfo& record)
{
    record.adapterId = reader.readInt();
    record.receiverIdentity = reader.readInt();
    record.clientId = reader.readInt();
}

} // namespace RecordPacking
