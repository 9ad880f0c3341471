// Says where the appliance's files of each kind live. Paths are absolute and without a final "/"; a getter
// gives an empty string while the path file or its entry is missing, and makes the folder when it does not
// exist. Any thread; file-system errors of making a folder are thrown.
#pragma once

#include <string>

class PathManagerEx;

class IPathManagerEx
{
public:
    virtual ~IPathManagerEx() = default;

    // Makes a folder with a new unique name in parent and returns its path.
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

    // The one instance, made on first use. clearUp deletes it; the next use makes a new one, with empty
    // caches.
    static IPathManagerEx* getInstance();
    static void clearUp();

protected:
    static IPathManagerEx* mpPathManagerEx;
};
