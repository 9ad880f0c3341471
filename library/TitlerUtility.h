#pragma once

#include <string>

// Names and paths of the pictures in the folder of a title file. Thread-safe.
class TitlerUtility
{
public:
    // For "/a/b/title.xml" and "_960.png" returns "title_960.png".
    static std::string getThumbnailNameFromTitlePath(std::string title, std::string suffix);
    // For "/a/b/title.xml" and "x.png" returns "/a/b/x.png".
    static std::string getThumbnailPathFromTitlePath(std::string title, std::string name);
    // Returns the path for a picture that is written or removed. Empty for a name in a title file that is not
    // a valid picture name, see ArchiveManager::isPictureName().
    static std::string getPicturePathFromTitlePath(std::string title, std::string name);
};
