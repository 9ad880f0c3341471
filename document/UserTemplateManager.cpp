#include "document/UserTemplateManager.h"

#include "document/Archive.h"
#include "document/ArchiveController.h"
#include "document/ArchiveManager.h"
#include "document/ArchiveOrder.h"
#include "document/DocumentConstants.h"
#include "document/FolderOrder.h"
#include "document/LastSettingParser.h"
#include "document/TitleParserUtility.h"
#include "support/ConfinedPath.h"
#include "support/FolderLookup.h"
#include "support/HiddenName.h"
#include "support/IPathManagerEx.h"
#include "support/Utf8.h"

#include <algorithm>
#include <boost/filesystem.hpp>
#include <iostream>
#include <map>
#include <sys/stat.h>

namespace fs = boost::filesystem;

UserTemplateManager* UserTemplateManager::mInstance = nullptr;

namespace
{

const std::string TITLE_STEM = "Titler";

// Returns an empty string if the folder is not configured or cannot be created.
std::string userTemplatesRoot()
{
    return FolderLookup::multiByte(&IPathManagerEx::getTitlerTemplatesPath);
}

bool exists(const std::string& path)
{
    boost::system::error_code error;
    return fs::exists(path, error);
}

bool isFolder(const std::string& path)
{
    boost::system::error_code error;
    return fs::is_directory(path, error);
}

// Returns whether name is a direct entry of a folder and can be written to an XML file.
bool isEntryName(const std::string& name)
{
    return !name.empty() && name != "." && name != ".." && name.find('/') == std::string::npos &&
           name.find('\0') == std::string::npos && Utf8::isValid(name);
}

// Returns the names of all entries of a folder, in the directory's order.
std::vector<std::string> entriesOf(const std::string& folder)
{
    std::vector<std::string> names;
    boost::system::error_code error;
    for (fs::directory_iterator entry(folder, error), end; !error && entry != end; entry.increment(error))
        names.push_back(entry->path().filename().string());
    return names;
}

// Returns the extension of the first entry that has one: the creator of a template's folder puts the pictures
// there first, and they all have the same extension.
std::string pictureExtensionIn(const std::string& folder)
{
    for (const std::string& name : entriesOf(folder)) {
        const std::size_t dot = name.rfind('.');
        if (dot != std::string::npos && !HiddenName::isHidden(name))
            return name.substr(dot);
    }
    return {};
}

// Returns the time of the last change as a sort key: seconds in the upper, nanoseconds in the lower 32 bits.
long long timeKey(const struct stat& status)
{
    const auto seconds = static_cast<unsigned long long>(status.st_mtim.tv_sec);
    return static_cast<long long>((seconds << 32) | static_cast<unsigned long long>(status.st_mtim.tv_nsec));
}

} // namespace

UserTemplateManager* UserTemplateManager::getInstance()
{
    if (!mInstance) {
        mInstance = new UserTemplateManager;
        mInstance->m_rootFolder = userTemplatesRoot();
        mInstance->m_settingFolder = mInstance->m_rootFolder;
        mInstance->reCreateNewOrderXml();
    }
    return mInstance;
}

void UserTemplateManager::cleanUp()
{
    delete mInstance;
    mInstance = nullptr;
}

std::vector<Archive*> UserTemplateManager::getTemplates(emTemplateLanguage)
{
    const QList<Archive*> templates =
        ArchiveController().getArchiveList(QString::fromStdString(m_rootFolder));
    return {templates.begin(), templates.end()};
}

std::string UserTemplateManager::loadLastTemplatePath()
{
    return LastSettingParser(m_settingFolder).getTempAttribute(TEMP_LAST_TEMPLATE, TEMP_PATH);
}

int UserTemplateManager::saveLastTemplatePath(std::string path)
{
    return LastSettingParser(m_settingFolder).editTempFile(TEMP_LAST_TEMPLATE, TEMP_PATH, path);
}

int UserTemplateManager::reCreateNewOrderXml()
{
    makeFolderList();
    return createNewOrderXml();
}

int UserTemplateManager::makeFolderList()
{
    m_folderList.clear();
    if (!isFolder(m_rootFolder)) {
        std::cout << "S16 folderPath not a directory." << m_rootFolder << std::endl;
        return 0;
    }
    std::multimap<long long, std::string> byTime;
    for (const std::string& name : entriesOf(m_rootFolder)) {
        // A single name that XML cannot contain would make the whole order file unreadable.
        if (!isEntryName(name) || !isFolder(m_rootFolder + STR_SLASH + name) ||
            !isTemplatePath(titlePathOf(name)))
            continue;
        if (!exists(m_rootFolder + STR_SLASH + name + STR_SLASH + name + XML_EXTENSION) &&
            !exists(titlePathOf(name)))
            continue;
        struct stat status = {};
        if (::stat(titlePathOf(name).c_str(), &status) != 0) {
            std::cout << "ERROR ERROR." << std::endl;
            continue;
        }
        byTime.emplace(timeKey(status), name);
    }
    for (const auto& [time, name] : byTime)
        m_folderList.push_back(name);
    return 1;
}

int UserTemplateManager::createNewOrderXml()
{
    std::vector<ArchiveOrder> rows;
    rows.reserve(m_folderList.size());
    for (const std::string& name : m_folderList) {
        ArchiveOrder row;
        row.setArchiveIndex(static_cast<int>(rows.size()));
        row.setArchivePath(name + STR_SLASH + TITLE_STEM + XML_EXTENSION);
        rows.push_back(row);
    }
    if (!isFolder(m_rootFolder))
        return 0;
    return FolderOrder::writeOrKeep(m_rootFolder, rows) ? 1 : -1;
}

int UserTemplateManager::renameInOrderXml(std::string oldName, std::string newName)
{
    const auto entry = std::find(m_folderList.begin(), m_folderList.end(), oldName);
    if (entry == m_folderList.end() || !isEntryName(newName))
        return 0;
    *entry = std::move(newName);
    return createNewOrderXml();
}

int UserTemplateManager::addNewTemplateToLastInOrderXml(std::string name)
{
    std::erase(m_folderList, name);
    if (isEntryName(name))
        m_folderList.push_back(std::move(name));
    createNewOrderXml();
    return 1;
}

int UserTemplateManager::removeFromOrderXml(std::string name)
{
    return std::erase(m_folderList, name) == 0 ? 0 : createNewOrderXml();
}

int UserTemplateManager::loadTemplate(std::string name, Archive* archive)
{
    if (!archive)
        return 0;
    const std::string path = titlePathOf(name);
    const int result = isTemplatePath(path) ? ArchiveManager().loadArchive(path, archive) : 0;
    archive->setName(std::move(name));
    return result;
}

int UserTemplateManager::createNewTemplateXml(std::string name, Archive* archive)
{
    if (!archive)
        return 0;
    const std::string folder = m_rootFolder + STR_SLASH + name;
    if (m_rootFolder.empty() || !isEntryName(name) || !exists(folder)) {
        std::cout << "S16 folderPath not found. " << folder << std::endl;
        return 0;
    }
    if (!isFolder(folder)) {
        std::cout << "S16 folderPath not a directory. " << folder << std::endl;
        return 0;
    }
    const std::string titlePath = titlePathOf(name);
    if (!isTemplatePath(titlePath)) {
        ConfinedPath::logRefusal(L"a template lies outside: ", titlePath);
        return 0;
    }
    if (exists(titlePath))
        std::cout << "S16 File is already exist. " << titlePath << std::endl;
    const std::string extension = pictureExtensionIn(folder);
    archive->setName(std::move(name));
    archive->setPath(titlePath);
    archive->setThumbnailSmall(TITLE_STEM + THUMBNAIL_SMALL + extension);
    archive->setBgResource(TITLE_STEM + BG_SOURCE + extension);
    archive->setBgResourceBig(TITLE_STEM + BG_SOURCE_BIG + extension);
    return ArchiveManager().saveArchive(archive);
}

int UserTemplateManager::deleteTemplatePath(std::string path)
{
    if (!isTemplatePath(path)) {
        ConfinedPath::logRefusal(L"a template lies outside: ", path);
        return 0;
    }
    const int result = ArchiveManager().deleteArchive(path);
    const std::string folder = fs::path(path).lexically_normal().parent_path().string();
    if (isTemplateFolder(folder)) {
        boost::system::error_code error;
        fs::remove_all(folder, error);
    }
    reCreateNewOrderXml();
    return result;
}

std::string UserTemplateManager::titlePathOf(const std::string& name) const
{
    return m_rootFolder + STR_SLASH + name + STR_SLASH + TITLE_STEM + XML_EXTENSION;
}

bool UserTemplateManager::isTemplatePath(const std::string& path) const
{
    const bool isAbsolute = path.starts_with('/');
    return !m_rootFolder.empty() &&
           ConfinedPath::isBelow(m_rootFolder, isAbsolute ? path : m_rootFolder + STR_SLASH + path);
}

// Paths come from files and other processes, so make sure that only a template's folder is deleted.
bool UserTemplateManager::isTemplateFolder(const std::string& folder) const
{
    const fs::path root = fs::path(m_rootFolder).lexically_normal();
    return !root.empty() && fs::path(folder).parent_path() == root &&
           isEntryName(fs::path(folder).filename().string());
}
