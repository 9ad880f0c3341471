#pragma once

#include <string>

class IPathManagerEx;

// Asks where a folder of the appliance is, for callers that can do without it: a folder that cannot be
// created, on a read-only disk or because a file has its name, is treated like one that is not configured.
class FolderLookup
{
public:
    using Getter = std::wstring (IPathManagerEx::*)();

    FolderLookup() = delete;

    // Returns the result of an IPathManagerEx getter, or an empty string if the getter throws. Any thread.
    static std::wstring wide(Getter getter);
    // As wide(), in the encoding of file names.
    static std::string multiByte(Getter getter);
};
