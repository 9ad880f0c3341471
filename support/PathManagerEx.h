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

    std::mutex m_mutex; // guards the members below
    std::wstring m_basePath;
    std::string m_pathFile;
    std::string m_scratchPath;
    std::wstring m_dataPath;
    std::wstring m_resourcesPath;
    std::wstring m_tmpPath;
    std::wstring m_titlesPath;
    std::wstring m_logosPath;
    std::wstring m_mxfsPath;
    std::wstring m_vodsPath;
    std::wstring m_fontsPath;
    std::wstring m_audiosPath;
    std::wstring m_systemSettingPath;
    std::wstring m_projectsPath;
    std::wstring m_currentStatusPath;
    std::wstring m_templatesPath;
    std::wstring m_projectPath;
    std::wstring m_titlerPath;
    std::wstring m_streamKeyPath;
    std::wstring m_titleResourcesPath;
    std::wstring m_titleImagesPath;
    std::wstring m_mpMoviesPath;
    std::wstring m_titlerTemplatesPath;
    std::wstring m_moviesPath;
};
