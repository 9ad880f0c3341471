// The parameters of ITitler and ITitlerCallBack, and the list of titles in a result.
#pragma once

#include "messaging/services/ServiceFamilies.h"

#include <string>
#include <vector>

struct TitlerParams : TitlerAnswerParams {
    static constexpr std::size_t MOST_PATHS = 65535;

    // Returns a new buffer with the first MOST_PATHS paths, one wide after the other. The caller destroys it.
    static simplebuffer packPaths(const std::vector<std::wstring>& paths);
    // Returns the paths in a result's data; no more than the data holds, whatever the result's count says. A
    // result that was read points into its message, with a size that is no more than the message holds.
    static std::vector<std::wstring> unpackPaths(const _CALLBACK_TITLER_PARAMTER& result);
};
