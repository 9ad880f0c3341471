#pragma once

#include "messaging/services/ServiceFamilies.h"

#include <string>
#include <vector>

// The parameters of ITitler and ITitlerCallBack, and the list of titles in a result.
struct TitlerParams : TitlerAnswerParams {
    static constexpr std::size_t MOST_PATHS = 65535;

    // Returns a new buffer with the first MOST_PATHS paths, each packed as a wide string. The caller destroys
    // it.
    static simplebuffer packPaths(const std::vector<std::wstring>& paths);
    // Returns the paths in a result's data; reads no more than the data contains, whatever the result's count
    // is. The data of a received result points into its message.
    static std::vector<std::wstring> unpackPaths(const _CALLBACK_TITLER_PARAMTER& result);
};
