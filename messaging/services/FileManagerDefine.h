#pragma once

#include "messaging/ptc/WireRecord.h"

#include <QMetaType>

// Types of the file manager service, to which changes to titles are reported and which reports changes to
// files.
namespace FileManagerDefine
{

enum emTITLECHANGE_TYPE : int {
    TITLE_PICTURES_CHANGED = 1,
    TITLE_DELETED = 2,
    TITLE_ADDED = 4,
    TITLE_TEMPLATE_ADDED = 5,
};

// The file types that this program handles in notifications; all others are ignored.
enum emFILE_TYPE : int { FILE_TYPE_FONT = 6, FILE_TYPE_TITLER_TEMPLATE = 8 };

// clang-format off

// A change to a title; changeType is an emTITLECHANGE_TYPE.
#define tagTitleChangeStatusParam_FIELDS(FIELD) \
    FIELD(Int32, clientId, -1) \
    FIELD(Wide, path) \
    FIELD(Int, changeType, 0)

#define tagTitlerPathParam_FIELDS(FIELD) \
    FIELD(Int32, clientId, -1) \
    FIELD(Wide, path)

#define tagChangeFolderNameParam_FIELDS(FIELD) \
    FIELD(Int32, clientId, -1) \
    FIELD(Wide, oldPath) \
    FIELD(Wide, newPath)

#define tagRenameNotify_FIELDS(FIELD) \
    FIELD(Int, fileType, 0) \
    FIELD(Int, second, 0) \
    FIELD(Int, third, 0) \
    FIELD(FourWide, strings)

// fileType and fileTypeHigh are the two halves of one 64-bit value.
#define tagImportNotify_FIELDS(FIELD) \
    FIELD(Int, fileType, 0) \
    FIELD(Int, fileTypeHigh, 0) \
    FIELD(Int, third, 0) \
    FIELD(Long, fourth, 0) \
    FIELD(Int, fifth, 0) \
    FIELD(Wide, path) \
    FIELD(Int, seventh, 0) \
    FIELD(Int, eighth, 0) \
    FIELD(ThreeWide, strings) \
    FIELD(Int, twelfth, 0) \
    FIELD(Bool, thirteenth, false) \
    FIELD(SevenInt, last)

// result is 0 if the file was deleted.
#define tagDeleteNotify_FIELDS(FIELD) \
    FIELD(Int, first, 0) \
    FIELD(Int, fileType, 0) \
    FIELD(Int, result, 0) \
    FIELD(Wide, path) \
    FIELD(Int, fifth, 0) \
    FIELD(Long, sixth, 0) \
    FIELD(Int, seventh, 0)

// clang-format on
WIRE_RECORD(tagTitleChangeStatusParam);
WIRE_RECORD(tagTitlerPathParam);
WIRE_RECORD(tagChangeFolderNameParam);
WIRE_RECORD(tagRenameNotify);
WIRE_RECORD(tagImportNotify);
WIRE_RECORD(tagDeleteNotify);

} // namespace FileManagerDefine

Q_DECLARE_METATYPE(FileManagerDefine::tagChangeFolderNameParam)
