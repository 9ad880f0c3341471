#include "document/ArchiveController.h"

#include "document/Archive.h"
#include "document/ArchiveManager.h"
#include "document/ArchiveOrder.h"
#include "document/DocumentConstants.h"
#include "document/FolderTitles.h"
#include "document/ITitleChangeReporter.h"
#include "support/ConfinedPath.h"
#include "support/LogManager.h"
#include "support/SystemInfo.h"

#include <algorithm>
#include <memory>
#include <stdexcept>
#include <string_view>
#include <unordered_set>

namespace
{

constexpr std::string_view USER_TEMPLATE_PREFIX = "UserTemplate_";
constexpr std::size_t NUMBER_LENGTH = 3;
constexpr int LARGEST_NUMBER = 999;
constexpr std::size_t MOST_NUMBERS = 997;

void logDebug(const std::wstring& text)
{
    LOG_DEBUG_OPERATE(L"ArchiveController", 200, text);
}

QString toQString(const std::string& text)
{
    return QString::fromLocal8Bit(text.data(), static_cast<qsizetype>(text.size()));
}

// Empty for a name that leads to where no titles and templates are.
std::string beside(const Archive& archive, const std::string& name)
{
    const std::string path = archive.getPath();
    const std::string folder = path.substr(0, path.rfind('/'));
    return ConfinedPath::namedByTitle(folder, folder + '/' + name);
}

// The number of a row "UserTemplate_NNN/Titler.xml"; 0 for any other.
int userTemplateNumber(const std::string& rowPath)
{
    if (!rowPath.starts_with(USER_TEMPLATE_PREFIX))
        return 0;
    const std::string rest = rowPath.substr(USER_TEMPLATE_PREFIX.size());
    if (rest.find('/') != NUMBER_LENGTH)
        return 0;
    bool isNumber = false;
    const int number = QString::fromStdString(rest.substr(0, NUMBER_LENGTH)).toInt(&isNumber, 10);
    return isNumber && number > 0 ? number : 0;
}

// The first number from 1 on that is not in the list, as long as the list has no number twice; 0 for none.
int firstGap(std::vector<int> numbers)
{
    std::sort(numbers.begin(), numbers.end());
    for (std::size_t position = 0; position < numbers.size(); ++position) {
        if (numbers[position] != static_cast<int>(position) + 1)
            return static_cast<int>(position) + 1;
    }
    return 0;
}

} // namespace

ArchiveController::ArchiveController() : mArchiveManager(ArchiveManager::getInstance())
{
}

ArchiveController::~ArchiveController() = default;

QList<std::string> ArchiveController::getFolderList()
{
    const std::vector<std::string> folders = mArchiveManager->getArchiveFolderList();
    return QList<std::string>(folders.begin(), folders.end());
}

// Row by row, without those that are too short for the name of a title. The others must not be lost with
// them: what the list does not show, the clean-up deletes.
QList<Archive*> ArchiveController::readableArchives(const std::string& folder)
{
    const FolderTitles rows(folder);
    QList<Archive*> titles;
    for (std::unique_ptr<Archive>& title : rows.read(0, rows.count())) {
        if (title)
            titles.append(title.release());
    }
    return titles;
}

QList<Archive*> ArchiveController::getArchiveList(QString folder)
{
    if (folder.isEmpty())
        return {};
    const std::string path = folder.toStdString();
    try {
        const std::vector<Archive*> titles = mArchiveManager->getArchivesUnderFolder(path);
        return QList<Archive*>(titles.begin(), titles.end());
    } catch (const std::out_of_range&) {
        logDebug(L"The order file names what cannot be a title: " + folder.toStdWString());
        return readableArchives(path);
    }
}

bool ArchiveController::getOneArchive(QString path, Archive* archive)
{
    return mArchiveManager->loadArchive(path.toStdString(), archive) != 0;
}

bool ArchiveController::saveNewArchive(QString path, Archive* archive)
{
    if (path.isEmpty() || !archive)
        return false;
    const int result = mArchiveManager->saveArchive(archive->getPath(), archive);
    if (result == 1)
        logDebug(L"Save new Archive Success !");
    else if (result == 0)
        logDebug(L"Save new Archive Path is invalid !");
    else
        logDebug(L"Save new Archive failed !");
    return result == 1;
}

bool ArchiveController::deleteArchive(QString path)
{
    return !path.isEmpty() && mArchiveManager->deleteArchive(path.toStdString()) == 1;
}

bool ArchiveController::saveArchiveListOrder(QString folder, QList<ArchiveOrder*> rows)
{
    if (folder.isEmpty())
        return false;
    std::vector<ArchiveOrder> copies;
    copies.reserve(static_cast<std::size_t>(rows.size()));
    for (const ArchiveOrder* row : rows) {
        if (row)
            copies.push_back(*row);
    }
    return mArchiveManager->setArchivesSortUnderFolder(folder.toStdString(), std::move(copies)) == 1;
}

std::vector<ArchiveOrder*> ArchiveController::getFileOrder(QString folder)
{
    mFileOrder = mArchiveManager->getArchivesSortUnderFolder(folder.toStdString());
    for (ArchiveOrder* row : mFileOrder)
        mFetchedRows.emplace_back(row);
    return mFileOrder;
}

QString ArchiveController::getLastArchivePath()
{
    return toQString(mArchiveManager->loadLastArchive());
}

int ArchiveController::setLastArchivePath(QString path)
{
    return mArchiveManager->saveLastArchive(path.toStdString());
}

QString ArchiveController::getLastFolderPath()
{
    return toQString(mArchiveManager->loadLastFolder());
}

int ArchiveController::setLastFolderPath(QString path)
{
    return mArchiveManager->saveLastFolder(path.toStdString());
}

int ArchiveController::copyArchiveBg(Archive* from, Archive* to)
{
    SystemInfo::copyFolderFile(from->getFullPathOfBgResource().toStdString(),
                               to->getFullPathOfBgResource().toStdString());
    SystemInfo::copyFolderFile(from->getFullPathOfBgResourceBig().toStdString(),
                               to->getFullPathOfBgResourceBig().toStdString());
    return 1;
}

int ArchiveController::copyArchiveThumbnail(Archive* from, Archive* to)
{
    const auto copy = [&](std::string (Archive::*name)() const) {
        const std::string source = (from->*name)();
        const std::string target = (to->*name)();
        if (!source.empty() && !target.empty()) // an empty name would stand for the whole folder
            SystemInfo::copyFolderFile(beside(*from, source), beside(*to, target));
    };
    copy(&Archive::getThumbnailBig);
    copy(&Archive::getThumbnailMiddle);
    copy(&Archive::getThumbnailBlack);
    copy(&Archive::getThumbnailSmall);
    return 1;
}

QString ArchiveController::getFreeNameInUserTemplate(QString folder)
{
    std::vector<int> numbers;
    for (const ArchiveOrder* row : getFileOrder(folder)) {
        if (const int number = userTemplateNumber(row->getArchivePath()))
            numbers.push_back(number);
    }
    const int largest = numbers.empty() ? 0 : *std::max_element(numbers.begin(), numbers.end());
    int number = largest + 1;
    if (largest >= LARGEST_NUMBER) {
        LOG_USER_OPERATE(L"T", 300, L"getFreeNameInUserTemplate() Counter is Max.");
        if (numbers.size() > MOST_NUMBERS) {
            LOG_USER_OPERATE(L"T", 400, L"getFreeNameInUserTemplate() reach INT_MAX. Exit.");
            return {};
        }
        number = firstGap(std::move(numbers));
    }
    return QLatin1String(USER_TEMPLATE_PREFIX.data(), static_cast<qsizetype>(USER_TEMPLATE_PREFIX.size())) +
           QStringLiteral("%1").arg(number, static_cast<int>(NUMBER_LENGTH), 10, QLatin1Char('0'));
}

bool ArchiveController::createNewOrderAccordingToFilesUnderFolder(QString folder)
{
    const std::string path = folder.toStdString();
    const std::vector<std::string> files = mArchiveManager->getFileListUnderFolder(path);
    if (files.empty())
        return false;
    const std::vector<ArchiveOrder*> rows = mArchiveManager->getArchivesSortUnderFolder(path);
    const std::vector<std::unique_ptr<ArchiveOrder>> owner(rows.begin(), rows.end());
    if (!rows.empty())
        return false;
    mArchiveManager->setArchivesSortUnderFolder(path, ArchiveManager::orderRowsFor(files));
    return true;
}

QList<std::string> ArchiveController::reCreateOrderXml()
{
    QList<std::string> changed;
    for (const std::string& folder : getFolderList()) {
        if (createNewOrderAccordingToFilesUnderFolder(toQString(folder)))
            changed.append(folder);
    }
    return changed;
}

void ArchiveController::deleteUnusefulArchives(QString folder)
{
    const std::string path = folder.toStdString();
    std::vector<std::string> victims = mArchiveManager->getFileListUnderFolder(path);
    if (victims.empty())
        return;
    const std::vector<ArchiveOrder*> rows = mArchiveManager->getArchivesSortUnderFolder(path);
    const std::vector<std::unique_ptr<ArchiveOrder>> owner(rows.begin(), rows.end());
    if (!rows.empty()) {
        if (victims.size() - 1 == rows.size()) // one of the files is the order file
            return;
        victims = getDeletedFileList(std::move(victims), getTargetFileList(rows, path));
    }
    for (const std::string& victim : victims) {
        if (mArchiveManager->deleteArchive(victim) != 1) {
            logDebug(L"Delete XML false");
            continue;
        }
        if (ITitleChangeReporter* reporter = ITitleChangeReporter::instance())
            reporter->changeTitlerStatus(FileManagerDefine::TITLE_DELETED, toQString(victim));
        logDebug(L"Delete XML success");
    }
}

std::vector<std::string> ArchiveController::getTargetFileList(std::vector<ArchiveOrder*> rows,
                                                              std::string folder)
{
    std::vector<std::string> targets;
    targets.reserve(rows.size());
    for (const ArchiveOrder* row : rows)
        targets.push_back(folder + STR_SLASH + row->getArchivePath());
    return targets;
}

std::vector<std::string> ArchiveController::getDeletedFileList(std::vector<std::string> files,
                                                               std::vector<std::string> targets)
{
    const std::unordered_set<std::string> kept(targets.begin(), targets.end());
    std::erase_if(files, [&](const std::string& file) {
        return kept.contains(file) || !ArchiveManager::isTitleFile(file);
    });
    return files;
}
