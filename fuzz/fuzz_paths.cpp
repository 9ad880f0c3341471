// A path file of any bytes.
#include "FuzzFolder.h"
#include "support/FolderLookup.h"
#include "support/IPathManagerEx.h"
#include "support/PathManagerEx.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    const std::string_view bytes = FuzzFolder::view(data, size);
    // The folders that it names are made: none outside the fuzz folder, however the dots are written.
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
        if (path != FolderLookup::wide(getter)) // the second is remembered
            std::abort();
    }
    return 0;
}
