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
    : mBasePath(getDefaultPath()), mPathFile(wideToMultiByte(mBasePath) + "PathInfo.xml")
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
    mScratchPath.clear();
    if (!loader->load(mPathFile))
        return {};
    loader->selectRootNode();
    if (!loader->selectNode(node))
        return {};
    loader->selectRootNode();
    mScratchPath = wideToMultiByte(mBasePath) + loader->getAttribute(node, "path");
    if (!boost::filesystem::exists(mScratchPath))
        boost::filesystem::create_directories(mScratchPath);
    return multiByteToWide(mScratchPath);
}

std::wstring PathManagerEx::cached(std::wstring& cache, const char* node)
{
    const std::lock_guard lock(mMutex);
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
    return cached(mTitlerPath, "Titler");
}

std::wstring PathManagerEx::getProjectPath()
{
    return cached(mProjectPath, "Project");
}

std::wstring PathManagerEx::getProjectsPath()
{
    return cached(mProjectsPath, "Projects");
}

std::wstring PathManagerEx::getTemplatesPath()
{
    return cached(mTemplatesPath, "Template");
}

std::wstring PathManagerEx::getCurrentStatusPath()
{
    return cached(mCurrentStatusPath, "CurrentStatus");
}

std::wstring PathManagerEx::getStreamKeyPath()
{
    return cached(mStreamKeyPath, "StreamKey");
}

std::wstring PathManagerEx::getSystemSettingPath()
{
    return cached(mSystemSettingPath, "SystemSetting");
}

std::wstring PathManagerEx::getTitlerTemplatesPath()
{
    return cached(mTitlerTemplatesPath, "TitlerTemplate");
}

std::wstring PathManagerEx::getMPMoviesPath()
{
    return cached(mMPMoviesPath, "Movie");
}

std::wstring PathManagerEx::getTitleImagesPath()
{
    return cached(mTitleImagesPath, "TitleImage");
}

std::wstring PathManagerEx::getTitleResourcesPath()
{
    return cached(mTitleResourcesPath, "TitleResource");
}

std::wstring PathManagerEx::getMoviesPath()
{
    return cached(mMoviesPath, "Movie");
}

std::wstring PathManagerEx::getAudiosPath()
{
    return cached(mAudiosPath, "Audio");
}

std::wstring PathManagerEx::getFontsPath()
{
    return cached(mFontsPath, "Font");
}

std::wstring PathManagerEx::getVODsPath()
{
    return cached(mVODsPath, "VOD");
}

std::wstring PathManagerEx::getMXFsPath()
{
    return cached(mMXFsPath, "MXF");
}

std::wstring PathManagerEx::getLogosPath()
{
    return cached(mLogosPath, "Logo");
}

std::wstring PathManagerEx::getTiltesPath()
{
    return cached(mTitlesPath, "Title");
}

std::wstring PathManagerEx::getTmpPath()
{
    return cached(mTmpPath, "tmp");
}

std::wstring PathManagerEx::getResourcesPath()
{
    return cached(mResourcesPath, "Resource");
}

std::wstring PathManagerEx::getDataPath()
{
    return cached(mDataPath, "Data");
}
