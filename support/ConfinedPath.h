// Keeps paths that come from outside below the folders that they are for. A request of another process, a row
// of an order file and a name in a title file are all written by somebody else: what they lead to is looked
// at after all links are resolved. All functions may be called from any thread.
#pragma once

#include "support/FolderLookup.h"

#include <string>

class ConfinedPath
{
public:
    ConfinedPath() = delete;

    // Whether a path lies below the folder, at any depth, once the links in both are resolved. The folder
    // itself does not. What does not exist yet is taken by its name; a link to nothing is refused.
    static bool isBelow(const std::string& folder, const std::string& path);

    // The same for a folder of the appliance, such as &IPathManagerEx::getTitleResourcesPath. False while
    // that folder is not known.
    static bool isBelow(FolderLookup::Getter root, const std::string& path);

    // Returns the path of a picture that a title file in the folder names; empty, with a line in the log, for
    // one that lies neither below the folder nor below the folders of titles and templates.
    static std::string namedByTitle(const std::string& folder, const std::string& path);

    // Returns the path of a title that the order file of a folder names. Empty, with a line in the log, for
    // one that leaves the folder by its name, or by a link to where no titles and templates are. An empty
    // name is refused without a line.
    static std::string namedByOrder(const std::string& folder, const std::string& name);

    // Writes the line of a refusal to the debug log; the same refusal is not repeated by the two functions
    // above. what says who named the path.
    static void logRefusal(const std::wstring& what, const std::string& path);
};
