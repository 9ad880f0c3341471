// Types of the file manager service, which is told of changes to titles and tells of changes to files.
#pragma once

#include <QMetaType>
#include <string>

namespace FileManagerDefine
{

enum emTITLECHANGE_TYPE : int {
    TITLE_PICTURES_CHANGED = 1,
    TITLE_DELETED = 2,
    TITLE_ADDED = 4,
    TITLE_TEMPLATE_ADDED = 5,
};

// File types that this program looks at in notices; all others are of no interest to it.
enum emFILE_TYPE : int { FILE_TYPE_FONT = 6, FILE_TYPE_TITLER_TEMPLATE = 8 };

// Wire: client id (int32), path (wide), change type (int).
struct tagTitleChangeStatusParam {
    int clientId = -1;
    std::wstring path;
    int changeType = 0;
};

// Wire: client id (int32), path (wide). Of titlerEditStatus, titlerEditEndStatus, renameFolderStart and
// updateTitlerOrder.
struct tagTitlerPathParam {
    int clientId = -1;
    std::wstring path;
};

// Wire: client id (int32), old path (wide), new path (wide).
struct tagChangeFolderNameParam {
    int clientId = -1;
    std::wstring oldPath;
    std::wstring newPath;
};

// Wire: file type, two ints, then four wide strings.
struct tagRenameNotify {
    int fileType = 0;
    int second = 0;
    int third = 0;
    std::wstring strings[4];
};

// Wire: file type, int, int, long, int, wide path, int, int, wide, wide, wide, int, bool, seven ints.
struct tagImportNotify {
    int fileType = 0;
    int fileTypeHigh = 0; // compared together with fileType as one 64-bit value
    int third = 0;
    long fourth = 0;
    int fifth = 0;
    std::wstring path;
    int seventh = 0;
    int eighth = 0;
    std::wstring strings[3];
    int twelfth = 0;
    bool thirteenth = false;
    int last[7] = {};
};

// Wire: int, file type, result, wide path, int, long, int.
struct tagDeleteNotify {
    int first = 0;
    int fileType = 0;
    int result = 0;
    std::wstring path;
    int fifth = 0;
    long sixth = 0;
    int seventh = 0;
};

} // namespace FileManagerDefine

Q_DECLARE_METATYPE(FileManagerDefine::tagChangeFolderNameParam)
