#pragma once

#include <QTemporaryFile>

// Sets up a screen of 1920x1080 without a display, identical on every machine, for pictures and random tests.
// Make it before the application and keep it as long as that. The environment variable GALLERY_PLATFORM
// selects another platform.
class GalleryScreen
{
public:
    GalleryScreen();

private:
    QTemporaryFile m_file;
};
