// Reads a path file of random bytes.
#include "FuzzFolder.h"
#include "support/FolderLookup.h"
#include "support/IPathManagerEx.h"
#include "support/PathManagerEx.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    const std::string_view bytes = FuzzFolder::view(data, size);
    // Skips input with dots in any notation: the program creates the folders named in the file, and none may
    // be outside the fuzz folder.
    if (bytes.find("..") != std::string_view::npos || bytes.find("&#") != std::string_view::npos)
        return 0;
    const std::string base = FuzzFolder::instance().base();
    FuzzFolder::empty(base);
    FuzzFolder::write(base + "/PathInfo.xml", bytes);
    PathManagerEx::clearUp();
    for (const FolderLookup::Getter getter :
         {&IPathManagerEx::getDataPath, &IPathManagerEx::getResourcesPath, &IPathManagerEx::getTmpPath,
          &IPathManagerEx::getTiltesPath, &IPathManagerEx::getFontsPath,
          &IPathManagerEx::getSystemSettingPath, &IPathManagerEx::getTemplatesPath,
          &IPathManagerEx::getTitleResourcesPath, &IPathManagerEx::getTitlerTemplatesPath,
          &IPathManagerEx::getTitlerPath}) {
        const std::wstring path = FolderLookup::wide(getter);
        if (path != FolderLookup::wide(getter)) // the second call returns the stored path
            std::abort();
    }
    return 0;
}
