// Reads a title file of random bytes. Checks that a readable one can be written, and then read and written
// again unchanged.
#include "FuzzFolder.h"
#include "document/Archive.h"
#include "document/TitleParser.h"

#include <cstdio>

namespace
{

// Reads the title file at path, saves it under the name again and returns the bytes of the new file.
bool saveAgain(const std::string& path, const std::string& again, std::string& bytes)
{
    Archive archive;
    if (TitleParser().readOneTitle(path, &archive) != 1)
        return false;
    archive.setPath(again);
    if (TitleParser().writeOneTitle(&archive) != 1)
        return false;
    bytes = FuzzFolder::read(again);
    return true;
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    const std::string folder = FuzzFolder::instance().base() + "/titles";
    FuzzFolder::write(folder + "/a.xml", FuzzFolder::view(data, size));
    std::string first;
    std::string second;
    if (!saveAgain(folder + "/a.xml", folder + "/b.xml", first))
        return 0;
    // The program must be able to read what it writes, without any change.
    if (!saveAgain(folder + "/b.xml", folder + "/c.xml", second)) {
        std::fprintf(stderr, "cannot be read again:\n%s\n", first.c_str());
        std::abort();
    }
    std::string third;
    if (!saveAgain(folder + "/c.xml", folder + "/b.xml", third) || second != third) {
        std::fprintf(stderr, "changes when it is saved again:\n%s\n%s\n", second.c_str(), third.c_str());
        std::abort();
    }
    TitleParser().modifyClip(folder + "/c.xml", "1");
    return 0;
}
