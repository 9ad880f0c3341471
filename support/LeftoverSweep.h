// Tidies up after a process that was killed, or a machine that lost its power, in the middle of a save.
#pragma once

#include <string>

class LeftoverSweep
{
public:
    // Looks through one folder, not its sub-folders: removes what dead processes left half-written, and where
    // a file is torn puts back the version that was kept for it. A file that is whole, and one that is gone
    // because someone deleted it, stay as they are. Run it at the start, before files of the folder are read;
    // it may run on any thread, beside saves of this process.
    static void sweep(const std::string& folder);

    // The same for a folder and the folders directly in it.
    static void sweepWithChildren(const std::string& folder);

    // The same for the program's folders: settings, user templates and presets. The list of titles sweeps
    // the folders of titles when it is first opened.
    static void sweepProgramFolders();

    // Whether a file can be read to its end: as XML or PNG by its extension; of others only that they are not
    // empty.
    static bool isWhole(const std::string& path);
};
