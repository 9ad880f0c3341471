#pragma once

#include "appliance/SampleTitles.h"

#include <QString>
#include <vector>

class ThumbnailRender;

// Fills the data path for a titler that runs without an appliance: the path file, the checker pictures,
// preset templates and folders of sample titles with their pictures.
//
// Only missing files are written; existing ones, including the user's changes, stay unchanged. Sets of titles
// are prepared in a temporary folder and renamed when they are complete, so an interrupted run leaves no
// incomplete set. GUI thread only, because the pictures are laid out with text items. Needs a QApplication.
class TitlerProvision
{
public:
    // basePath ends with "/" and is the folder that the paths in the path file are relative to. It must be
    // that of the environment, because the reduction of pictures looks there for the checker picture.
    explicit TitlerProvision(QString basePath);

    // Returns the base path of the platform library, or an empty string if there is none.
    static QString basePathOfEnvironment();

    // Returns whether everything is present afterwards; otherwise error() returns the reason.
    bool writeMissing();
    QString error() const { return m_error; }

private:
    bool writePathFile();
    bool writeCheckers();
    bool writeTemplates();
    bool writeTemplateSet(ThumbnailRender& render, const QString& folder, bool chinese);
    bool writeTitles();
    bool writeFolder(ThumbnailRender& render, const QString& folder,
                     std::vector<SampleTitles::Sample>& samples, const QString& backgroundFolder);
    bool writeTitle(ThumbnailRender& render, const QString& folder, SampleTitles::Sample& sample,
                    const QString& backgroundFolder);
    bool writePicture(const QImage& picture, const QString& path);
    bool makeFolder(const QString& path);
    bool moveIntoPlace(const QString& from, const QString& to);
    bool fail(const QString& what);

    QString m_base;
    QString m_error;
};
