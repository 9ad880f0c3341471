#pragma once

#include "support/IPathManagerEx.h"

#include <mutex>

// Reads the folders from "PathInfo.xml": one element per kind, with a "path" attribute relative to the base
// path, which is the appliance's data path followed by "/defaultuser/". Answers are cached by the instance.
class PathManagerEx : public IPathManagerEx
{
public:
    PathManagerEx();
    ~PathManagerEx() override;

    static IPathManagerEx* getInstance();
    static void clearUp();

    std::wstring CreateNewFolder(std::wstring parent) override;
    std::wstring getDataPath() override;
    std::wstring getResourcesPath() override;
    std::wstring getTmpPath() override;
    std::wstring getTiltesPath() override;
    std::wstring getLogosPath() override;
    std::wstring getMXFsPath() override;
    std::wstring getVODsPath() override;
    std::wstring getFontsPath() override;
    std::wstring getAudiosPath() override;
    std::wstring getSystemSettingPath() override;
    std::wstring getProjectsPath() override;
    std::wstring getCurrentStatusPath() override;
    std::wstring getTemplatesPath() override;
    std::wstring getProjectPath() override;
    std::wstring getTitlerPath() override;
    std::wstring getStreamKeyPath() override;
    std::wstring getTitleResourcesPath() override;
    std::wstring getTitleImagesPath() override;
    std::wstring getMPMoviesPath() override;
    std::wstring getTitlerTemplatesPath() override;
    std::wstring getMoviesPath();

    // Returns the base path, with a final "/".
    std::wstring getDefaultPath();

private:
    std::wstring cached(std::wstring& cache, const char* node);
    std::wstring getFolderPath(const std::string& node);
    static std::string get_uuid();
    static std::string char_to_string(unsigned char byte);

    std::mutex mMutex; // guards the members below
    std::wstring mBasePath;
    std::string mPathFile;
    std::string mScratchPath;
    std::wstring mDataPath;
    std::wstring mResourcesPath;
    std::wstring mTmpPath;
    std::wstring mTitlesPath;
    std::wstring mLogosPath;
    std::wstring mMXFsPath;
    std::wstring mVODsPath;
    std::wstring mFontsPath;
    std::wstring mAudiosPath;
    std::wstring mSystemSettingPath;
    std::wstring mProjectsPath;
    std::wstring mCurrentStatusPath;
    std::wstring mTemplatesPath;
    std::wstring mProjectPath;
    std::wstring mTitlerPath;
    std::wstring mStreamKeyPath;
    std::wstring mTitleResourcesPath;
    std::wstring mTitleImagesPath;
    std::wstring mMPMoviesPath;
    std::wstring mTitlerTemplatesPath;
    std::wstring mMoviesPath;
};
