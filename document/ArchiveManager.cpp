#include "document/ArchiveManager.h"

#include "document/Archive.h"
#include "document/FolderOrder.h"
#include "document/LastSettingParser.h"
#include "document/TitleParser.h"
#include "document/TitleParserUtility.h"
#include "support/FolderLookup.h"
#include "support/IPathManagerEx.h"
#include "support/RefusedWrites.h"
#include "support/Utf8.h"

#include <QFileInfo>
#include <boost/filesystem.hpp>
#include <cstdio>
#include <iostream>
#include <memory>
#include <mutex>

ArchiveManager* ArchiveManager::mInstance = nullptr;

namespace
{

std::mutex gInstanceMutex;
std::mutex gRootMutex;

// Returns the part behind the last "/", or the whole path if there is none.
std::string fileNameOf(const std::string& path)
{
    const std::size_t slash = path.rfind('/');
    return slash == std::string::npos ? path : path.substr(slash + 1);
}

template <typename T>
std::vector<std::unique_ptr<T>> own(const std::vector<T*>& records)
{
    return {records.begin(), records.end()};
}

} // namespace

ArchiveManager* ArchiveManager::getInstance()
{
    const std::lock_guard lock(gInstanceMutex);
    if (!mInstance)
        mInstance = new ArchiveManager;
    return mInstance;
}

void ArchiveManager::cleanUp()
{
    const std::lock_guard lock(gInstanceMutex);
    delete mInstance;
    mInstance = nullptr;
}

std::string ArchiveManager::getTitleRootFolderPath()
{
    const std::lock_guard lock(gRootMutex);
    mTitleRootFolderPath = FolderLookup::multiByte(&IPathManagerEx::getTitleResourcesPath);
    return mTitleRootFolderPath;
}

std::vector<std::string> ArchiveManager::getArchiveFolderList()
{
    std::string root;
    {
        const std::lock_guard lock(gRootMutex);
        root = mTitleRootFolderPath;
    }
    if (root.empty()) {
        root = getTitleRootFolderPath();
        if (!root.empty())
            std::cout << "mTitleRootFolderPath = " << root << std::endl;
    }
    return TitleParserUtility::queryChildFolders(root);
}

std::vector<Archive*> ArchiveManager::getAllArchives()
{
    std::vector<Archive*> all;
    for (const std::string& folder : getArchiveFolderList()) {
        const std::vector<Archive*> titles = getArchivesUnderFolder(folder);
        all.insert(all.end(), titles.begin(), titles.end());
    }
    return all;
}

std::vector<Archive*> ArchiveManager::getArchivesUnderFolder(std::string folder)
{
    return TitleParser().getFilsByOrderInFolder(std::move(folder));
}

std::vector<std::string> ArchiveManager::getFileListUnderFolder(std::string folder)
{
    return TitleParserUtility::queryFilesInFolder(folder);
}

std::vector<ArchiveOrder*> ArchiveManager::getArchivesSortUnderFolder(std::string folder)
{
    return TitleParser().readFileOrderInFolder(std::move(folder));
}

int ArchiveManager::setArchivesSortUnderFolder(std::string folder, std::vector<ArchiveOrder> rows)
{
    if (folder.empty())
        return 0;
    return TitleParser().writeFileOrderInFolder(std::move(folder), std::move(rows));
}

int ArchiveManager::saveArchive(std::string path, Archive* archive)
{
    if (path.empty() || !archive)
        return 0;
    return TitleParser().writeOneTitle(archive);
}

int ArchiveManager::saveArchive(Archive* archive)
{
    return archive ? saveArchive(archive->getPath(), archive) : 0;
}

int ArchiveManager::loadArchive(std::string path, Archive* archive)
{
    if (!archive)
        return 0;
    TitleParser parser;
    const int result = parser.readOneTitle(path, archive);
    const std::string folder = path.substr(0, path.rfind('/'));
    const std::string fileName = fileNameOf(path);
    const auto rows = own(parser.readFileOrderInFolder(folder));
    for (std::size_t position = 0; position < rows.size(); ++position) {
        if (rows[position]->getArchivePath() == fileName) {
            archive->setOrder(std::to_string(position + 1));
            break;
        }
    }
    return result;
}

int ArchiveManager::deleteArchive(std::string path)
{
    Archive archive;
    // the return value 1 or higher; the position does not matter
    if (TitleParser().readOneTitle(path, &archive) < 1)
        return 0;
    const bool isRemoved = std::remove(path.c_str()) == 0;
    if (!isRemoved)
        return 0; // keep its pictures as well
    RefusedWrites::forget(path);
    const std::string folder = path.substr(0, path.rfind('/') + 1);
    // Errors are ignored: most titles lack some of these pictures.
    for (const std::string& name :
         {archive.getThumbnailBig(), archive.getThumbnailSmall(), archive.getThumbnailMiddle(),
          archive.getThumbnailBlack(), archive.getBgResource(), archive.getBgResourceBig()}) {
        if (isPictureName(name)) {
            std::remove((folder + name).c_str());
            RefusedWrites::forget(folder + name);
        }
    }
    return 1;
}

int ArchiveManager::checkFilesUnderFolder(std::string folder)
{
    const auto titles = own(TitleParser().getFilesByOrderInFolderWithoutCheck(folder));
    for (const auto& title : titles) {
        boost::system::error_code error;
        if (!boost::filesystem::exists(title->getPath(), error)) {
            createNewOrderXML(std::move(folder));
            return 1;
        }
    }
    return 0;
}

bool ArchiveManager::isTitleFile(const std::string& path)
{
    const QFileInfo file(QString::fromStdString(path));
    // A name that is not UTF-8 would make the order file unreadable, which would hide all other titles.
    return Utf8::isValid(path) && file.suffix().compare(QLatin1String("xml"), Qt::CaseInsensitive) == 0 &&
           file.fileName().compare(QLatin1String(TitleParser::ORDER_FILEPATH), Qt::CaseInsensitive) != 0;
}

bool ArchiveManager::isPictureName(const std::string& name)
{
    // System calls would treat a NUL as the end of the name.
    return !name.empty() && name.find('/') == std::string::npos && name.find('\0') == std::string::npos &&
           QFileInfo(QString::fromStdString(name))
                   .suffix()
                   .compare(QLatin1String("xml"), Qt::CaseInsensitive) != 0;
}

int ArchiveManager::createNewOrderXML(std::string folder)
{
    const std::vector<std::string> files = TitleParserUtility::queryFilesInFolder(folder);
    setArchivesSortUnderFolder(std::move(folder), FolderOrder::rowsByName(files));
    return 1;
}

int ArchiveManager::saveLastFolder(std::string path)
{
    return LastSettingParser("").editTempFile(TEMP_LASTFOLDER, TEMP_PATH, path);
}

std::string ArchiveManager::loadLastFolder()
{
    return LastSettingParser("").getTempAttribute(TEMP_LASTFOLDER, TEMP_PATH);
}

int ArchiveManager::saveLastArchive(std::string path)
{
    return LastSettingParser("").editTempFile(TEMP_LASTARCHIVE, TEMP_PATH, path);
}

std::string ArchiveManager::loadLastArchive()
{
    return LastSettingParser("").getTempAttribute(TEMP_LASTARCHIVE, TEMP_PATH);
}

int ArchiveManager::modifyClip(std::string path, std::string value)
{
    return TitleParser().modifyClip(std::move(path), std::move(value));
}

int ArchiveManager::modifyGain(std::string path, std::string value)
{
    return TitleParser().modifyGain(std::move(path), std::move(value));
}

int ArchiveManager::modifyDensity(std::string path, std::string value)
{
    return TitleParser().modifyDensity(std::move(path), std::move(value));
}

int ArchiveManager::modifyProp(KeyDefine::TITLE_PROP_ID_t id, std::string path, std::string value)
{
    return TitleParser().modifyProp(id, std::move(path), std::move(value));
}
