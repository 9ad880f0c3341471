#pragma once

#include "support/FolderLookup.h"

#include <string>

// Confines paths that come from outside to the folders they are meant for. Requests of other processes, rows
// of order files and names in title files are not trusted: a path is checked after all links in it are
// resolved. All functions may be called from any thread.
class ConfinedPath
{
public:
    ConfinedPath() = delete;

    // Returns whether path is below folder, at any depth, after the links in both are resolved; false for the
    // folder itself. Components that do not exist yet are compared by name; a dangling link is refused.
    static bool isBelow(const std::string& folder, const std::string& path);

    // As above for a folder of the appliance, such as &IPathManagerEx::getTitleResourcesPath. Returns false
    // while that folder is unknown.
    static bool isBelow(FolderLookup::Getter root, const std::string& path);

    // Returns the path of a picture that a title file in folder names. Logs and returns an empty string if
    // the picture is neither below folder nor below the folders of titles and templates.
    static std::string namedByTitle(const std::string& folder, const std::string& path);

    // Returns the path of a title that the order file of a folder names. Logs and returns an empty string if
    // the name contains "..", or if a link leads outside the folder and outside the folders of titles and
    // templates. An empty name is refused without logging.
    static std::string namedByOrder(const std::string& folder, const std::string& name);

    // Writes a refusal to the debug log. what is the beginning of the text and describes the source of the
    // path. The two functions above log each path only once.
    static void logRefusal(const std::wstring& what, const std::string& path);
};
