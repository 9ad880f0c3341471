#pragma once

#include <string>

class PathManagerEx;

// Reports where the appliance's files of each kind are. Paths are absolute and have no final "/". A getter
// returns an empty string if the path file or its entry is missing, and creates the folder if it does not
// exist; file-system errors are thrown. Any thread.
class IPathManagerEx
{
public:
    virtual ~IPathManagerEx() = default;

    // Creates a folder with a new unique name in parent and returns its path.
    virtual std::wstring CreateNewFolder(std::wstring parent) = 0;
    virtual std::wstring getDataPath() = 0;
    virtual std::wstring getResourcesPath() = 0;
    virtual std::wstring getTmpPath() = 0;
    virtual std::wstring getTiltesPath() = 0;
    virtual std::wstring getLogosPath() = 0;
    virtual std::wstring getMXFsPath() = 0;
    virtual std::wstring getVODsPath() = 0;
    virtual std::wstring getFontsPath() = 0;
    virtual std::wstring getAudiosPath() = 0;
    virtual std::wstring getSystemSettingPath() = 0;
    virtual std::wstring getProjectsPath() = 0;
    virtual std::wstring getCurrentStatusPath() = 0;
    virtual std::wstring getTemplatesPath() = 0;
    virtual std::wstring getProjectPath() = 0;
    virtual std::wstring getTitlerPath() = 0;
    virtual std::wstring getStreamKeyPath() = 0;
    virtual std::wstring getTitleResourcesPath() = 0;
    virtual std::wstring getTitleImagesPath() = 0;
    virtual std::wstring getMPMoviesPath() = 0;
    virtual std::wstring getTitlerTemplatesPath() = 0;

    // Returns the only instance, which is created on first use. clearUp deletes it; the next use creates a
    // new one with empty caches.
    static IPathManagerEx* getInstance();
    static void clearUp();

protected:
    static IPathManagerEx* mpPathManagerEx;
};
