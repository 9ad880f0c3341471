// Names and paths of the pictures that lie beside a title file. Thread-safe.
#pragma once

#include <string>

class TitlerUtility
{
public:
    // "/a/b/title.xml" and "_960.png" give "title_960.png".
    static std::string getThumbnailNameFromTitlePath(std::string title, std::string suffix);
    // "/a/b/title.xml" and "x.png" give "/a/b/x.png".
    static std::string getThumbnailPathFromTitlePath(std::string title, std::string name);
    // The same for a name that a title file gives and at whose place something is written or removed: empty
    // for one that is no picture's, see ArchiveManager::isPictureName.
    static std::string getPicturePathFromTitlePath(std::string title, std::string name);
};
