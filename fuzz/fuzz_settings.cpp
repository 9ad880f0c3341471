// Reads the stored text style and the stored paths from random bytes. Checks that what was read can be saved
// and read again unchanged.
#include "FuzzFolder.h"
#include "document/FontStyle.h"
#include "document/LastSettingParser.h"
#include "document/SettingManager.h"

#include <cstdio>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    const std::string folder = FuzzFolder::instance().base() + "/settings";
    const std::string styleFile = folder + SettingManager::SETTING_FILENAME;
    const std::string pathFile = folder + LastSettingParser::TEMP_FILENAME;
    FuzzFolder::write(styleFile, FuzzFolder::view(data, size));
    FuzzFolder::write(pathFile, FuzzFolder::view(data, size));

    LastSettingParser paths(folder);
    paths.getTempAttribute("last-archive", "path");
    if (paths.editTempFile("last-folder", "path", "/titles/a & b") &&
        paths.getTempAttribute("last-folder", "path") != "/titles/a & b") {
        std::fprintf(stderr, "a path was not kept\n");
        std::abort();
    }

    FontStyle style;
    SettingManager settings;
    if (settings.loadLastTextParameter(&style) != 1)
        return 0;
    settings.saveLastTextParameter(&style);
    const std::string first = FuzzFolder::read(styleFile);
    FontStyle again;
    if (settings.loadLastTextParameter(&again) != 1) {
        std::fprintf(stderr, "cannot be read again:\n%s\n", first.c_str());
        std::abort();
    }
    settings.saveLastTextParameter(&again);
    if (FuzzFolder::read(styleFile) != first) {
        std::fprintf(stderr, "changes when it is saved again:\n%s\n", first.c_str());
        std::abort();
    }
    return 0;
}
