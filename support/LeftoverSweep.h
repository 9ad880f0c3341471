#pragma once

#include <string>

// Cleans up after a save that was interrupted by a killed process or a power cut.
class LeftoverSweep
{
public:
    // Cleans up one folder without its sub-folders: removes temporary files of dead processes and replaces a
    // truncated file by the version that was kept for it. Complete files are not changed, and deleted ones
    // are not restored. Call before files of the folder are read. May run in any thread, beside saves of this
    // process.
    static void sweep(const std::string& folder);

    // Sweeps a folder and the folders directly in it.
    static void sweepWithChildren(const std::string& folder);

    // Sweeps the program's folders: settings, user templates and presets. The list of titles sweeps the
    // folders of titles when it is first opened.
    static void sweepProgramFolders();
};
