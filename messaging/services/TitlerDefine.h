// Records of the service that this program offers, and of its callback.
#pragma once

#include <string>

// Who asked; stored and echoed, its values belong to the callers.
using _CALL_TITLER_TYPE = int;

// Wire: type (int), path (wide).
struct _SHOW_TITLER_PARAMTER {
    _CALL_TITLER_TYPE type = 0;
    std::wstring path;
};

// Wire: type (int), path (wide), data (raw of size bytes), size (int), count (int).
// data is itself packed: the paths of the titles made, one wide string after the other. The sender owns it.
struct _CALLBACK_TITLER_PARAMTER {
    _CALL_TITLER_TYPE type = 0;
    std::wstring path;
    unsigned char* data = nullptr;
    int size = 0;
    int count = 0;
};

// Wire: adapter id (int32), receiver identity (int32).
struct _tagCallBackInfo {
    long adapterId = -1;
    long receiverIdentity = -1;
};

// Wire: adapter id (int32), receiver identity (int32), client id (int32).
struct _tagNotifyInfo {
    long adapterId = -1;
    long receiverIdentity = -1;
    int clientId = -1;
};
