// Fills the data path that a titler without an appliance around it works on: the path file, the checker
// pictures, preset templates and folders of sample titles with their pictures.
//
// Only what is missing is written; what is there, the user's changes included, stays as it is. Sets of titles
// are made aside and moved into place when they are whole, so an interrupted run leaves nothing half done.
// GUI thread only: the pictures are laid out with text items. Needs a QApplication.
#pragma once

#include "appliance/SampleTitles.h"

#include <QString>
#include <vector>

class ThumbnailRender;

class TitlerProvision
{
public:
    // basePath ends with "/": the folder that the paths in the path file are relative to. It has to be that
    // of the environment, where the reduction of pictures looks for its checker.
    explicit TitlerProvision(QString basePath);

    // The base path that the platform library names; empty when it names none.
    static QString basePathOfEnvironment();

    // True when all is there in the end; error() tells what failed otherwise.
    bool writeMissing();
    QString error() const { return mError; }

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

    QString mBase;
    QString mError;
};
