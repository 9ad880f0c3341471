// Asks where a folder of the appliance lies, for callers that can go on without it: a folder that cannot be
// made, on a read-only disk or because a file has its name, is as good as one that nobody told of.
#pragma once

#include <string>

class IPathManagerEx;

class FolderLookup
{
public:
    using Getter = std::wstring (IPathManagerEx::*)();

    FolderLookup() = delete;

    // The path of IPathManagerEx's getter, empty where it would throw. Any thread.
    static std::wstring wide(Getter getter);
    // The same in the encoding of file names.
    static std::string multiByte(Getter getter);
};
