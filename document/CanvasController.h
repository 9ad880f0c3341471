#pragma once

#include "document/SettingManager.h"

#include <QString>

class Archive;
class ArchiveManager;
class FontStyle;

// Provides the canvas with storage: saves a title and loads the last text style. Cheap to construct: a worker
// thread that saves constructs its own.
class CanvasController
{
public:
    CanvasController();

    // Writes the title to the path in its record. If the write fails, the title is kept and written later
    // (RefusedWrites). Returns whether it was written; does nothing if path is empty.
    bool saveArchiveChange(QString path, Archive* archive);

    // Returns 1 if the style was read; 0 leaves style unchanged.
    int getTextStyle(FontStyle* style);

private:
    ArchiveManager* m_archiveManager; // shared, not owned
    SettingManager m_settingManager;
};
