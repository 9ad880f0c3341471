#include "support/FolderLookup.h"

#include "support/IPathManagerEx.h"
#include "support/LocaleText.h"

#include <boost/filesystem/exception.hpp>

std::wstring FolderLookup::wide(Getter getter)
{
    try {
        return (IPathManagerEx::getInstance()->*getter)();
    } catch (const boost::filesystem::filesystem_error&) {
        return {};
    }
}

std::string FolderLookup::multiByte(Getter getter)
{
    return wideToMultiByte(wide(getter));
}
