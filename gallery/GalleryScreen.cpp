#include "gallery/GalleryScreen.h"

#include <QFile>

GalleryScreen::GalleryScreen()
{
    if (qEnvironmentVariableIsSet("GALLERY_PLATFORM")) {
        qputenv("QT_QPA_PLATFORM", qgetenv("GALLERY_PLATFORM"));
        return;
    }
    if (!m_file.open())
        return;
    m_file.write(R"({"screens":[{"name":"gallery","x":0,"y":0,"width":1920,"height":1080,)"
                 R"("logicalDpi":96,"logicalBaseDpi":96,"dpr":1}]})");
    m_file.flush();
    qputenv("QT_QPA_PLATFORM", "offscreen:configfile=" + QFile::encodeName(m_file.fileName()));
}
