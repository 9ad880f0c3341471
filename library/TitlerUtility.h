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
};
