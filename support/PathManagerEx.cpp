#include "support/PathManagerEx.h"

#include "support/IXMLLoader.h"
#include "support/LocaleText.h"
#include "support/k2sys/k2sys.h"

#include <boost/filesystem.hpp>
#include <mutex>
#include <uuid/uuid.h>

IPathManagerEx* IPathManagerEx::mpPathManagerEx = nullptr;

namespace
{

std::mutex gInstanceMutex;

}

IPathManagerEx* IPathManagerEx::getInstance()
{
    return PathManagerEx::getInstance();
}

void IPathManagerEx::clearUp()
{
    PathManagerEx::clearUp();
}

IPathManagerEx* PathManagerEx::getInstance()
{
    const std::lock_guard lock(gInstanceMutex);
    if (!mpPathManagerEx)
        mpPathManagerEx = new PathManagerEx;
    return mpPathManagerEx;
}

void PathManagerEx::clearUp()
{
    const std::lock_guard lock(gInstanceMutex);
    delete mpPathManagerEx;
    mpPathManagerEx = nullptr;
}

PathManagerEx::PathManagerEx()
    : m_basePath(getDefaultPath()), m_pathFile(wideToMultiByte(m_basePath) + "PathInfo.xml")
{
}

PathManagerEx::~PathManagerEx() = default;

std::wstring PathManagerEx::getDefaultPath()
{
    char data[128] = {};
    char root[128] = {};
    k2sys_getenv_ac_data(data, sizeof data);
    std::string path = data;
    // If the root path is "/", the data path is used without its leading "/".
    if (k2sys_getenv_ac_root(root, sizeof root) == 1 && !path.empty())
        path.erase(0, 1);
    return multiByteToWide(path + "/defaultuser/");
}

std::wstring PathManagerEx::getFolderPath(const std::string& node)
{
    IXMLLoader* const loader = IXMLLoader::getInstance();
    m_scratchPath.clear();
    if (!loader->load(m_pathFile))
        return {};
    loader->selectRootNode();
    if (!loader->selectNode(node))
        return {};
    loader->selectRootNode();
    m_scratchPath = wideToMultiByte(m_basePath) + loader->getAttribute(node, "path");
    if (!boost::filesystem::exists(m_scratchPath))
        boost::filesystem::create_directories(m_scratchPath);
    return multiByteToWide(m_scratchPath);
}

std::wstring PathManagerEx::cached(std::wstring& cache, const char* node)
{
    const std::lock_guard lock(m_mutex);
    if (cache.empty())
        cache = getFolderPath(node);
    return cache;
}

std::wstring PathManagerEx::CreateNewFolder(std::wstring parent)
{
    if (parent.empty() || parent.back() != L'/')
        parent += L'/';
    parent += multiByteToWide(get_uuid());
    boost::filesystem::create_directories(wideToMultiByte(parent));
    return parent;
}

std::string PathManagerEx::get_uuid()
{
    uuid_t bytes;
    uuid_generate(bytes);
    std::string text;
    for (const unsigned char byte : bytes)
        text += char_to_string(byte);
    return text;
}

std::string PathManagerEx::char_to_string(unsigned char byte)
{
    static constexpr char DIGITS[] = "0123456789ABCDEF";
    return {DIGITS[byte >> 4], DIGITS[byte & 15]};
}

std::wstring PathManagerEx::getTitlerPath()
{
    return cached(m_titlerPath, "Titler");
}

std::wstring PathManagerEx::getProjectPath()
{
    return cached(m_projectPath, "Project");
}

std::wstring PathManagerEx::getProjectsPath()
{
    return cached(m_projectsPath, "Projects");
}

std::wstring PathManagerEx::getTemplatesPath()
{
    return cached(m_templatesPath, "Template");
}

std::wstring PathManagerEx::getCurrentStatusPath()
{
    return cached(m_currentStatusPath, "CurrentStatus");
}

std::wstring PathManagerEx::getStreamKeyPath()
{
    return cached(m_streamKeyPath, "StreamKey");
}

std::wstring PathManagerEx::getSystemSettingPath()
{
    return cached(m_systemSettingPath, "SystemSetting");
}

std::wstring PathManagerEx::getTitlerTemplatesPath()
{
    return cached(m_titlerTemplatesPath, "TitlerTemplate");
}

std::wstring PathManagerEx::getMPMoviesPath()
{
    return cached(m_mpMoviesPath, "Movie");
}

std::wstring PathManagerEx::getTitleImagesPath()
{
    return cached(m_titleImagesPath, "TitleImage");
}

std::wstring PathManagerEx::getTitleResourcesPath()
{
    return cached(m_titleResourcesPath, "TitleResource");
}

std::wstring PathManagerEx::getMoviesPath()
{
    return cached(m_moviesPath, "Movie");
}

std::wstring PathManagerEx::getAudiosPath()
{
    return cached(m_audiosPath, "Audio");
}

std::wstring PathManagerEx::getFontsPath()
{
    return cached(m_fontsPath, "Font");
}

std::wstring PathManagerEx::getVODsPath()
{
    return cached(m_vodsPath, "VOD");
}

std::wstring PathManagerEx::getMXFsPath()
{
    return cached(m_mxfsPath, "MXF");
}

std::wstring PathManagerEx::getLogosPath()
{
    return cached(m_logosPath, "Logo");
}

std::wstring PathManagerEx::getTiltesPath()
{
    return cached(m_titlesPath, "Title");
}

std::wstring PathManagerEx::getTmpPath()
{
    return cached(m_tmpPath, "tmp");
}

std::wstring PathManagerEx::getResourcesPath()
{
    return cached(m_resourcesPath, "Resource");
}

std::wstring PathManagerEx::getDataPath()
{
    return cached(m_dataPath, "Data");
}
