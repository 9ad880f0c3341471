// Storage as the canvas uses it: saves a title and loads the last text style. A cheap object; saves may run
// on a worker thread that has one of its own.
#pragma once

#include "document/SettingManager.h"

#include <QString>

class Archive;
class ArchiveManager;
class FontStyle;

class CanvasController
{
public:
    CanvasController();

    // Writes the title to the path in its record. What the disk refuses is kept and written when the disk
    // takes it (RefusedWrites). Returns whether the file is written; an empty path does nothing.
    bool saveArchiveChange(QString path, Archive* archive);

    // 1 when the style was read; 0 leaves it as it was.
    int getTextStyle(FontStyle* style);

private:
    ArchiveManager* mArchiveManager; // shared, not owned
    SettingManager mSettingManager;
};
