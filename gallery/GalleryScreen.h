#pragma once

#include <QTemporaryFile>

// A screen of 1920x1080 without a display, the same on every machine: for pictures and games. To be made
// before the application, and to be kept as long. GALLERY_PLATFORM in the environment names another platform.
class GalleryScreen
{
public:
    GalleryScreen();

private:
    QTemporaryFile m_file;
};
