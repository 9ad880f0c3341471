#include "document/ArchiveController.h"

#include "document/Archive.h"
#include "document/ArchiveManager.h"
#include "document/ArchiveOrder.h"
#include "document/DocumentConstants.h"
#include "document/FolderOrder.h"
#include "document/FolderTitles.h"
#include "document/ITitleChangeReporter.h"
#include "support/ConfinedPath.h"
#include "support/LogManager.h"
#include "support/SystemInfo.h"

#include <algorithm>
#include <memory>
#include <string_view>
#include <sys/stat.h>
#include <unordered_map>
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

// Returns the path of a file beside the title; empty if it leads outside the folders that a title may refer
// to.
std::string beside(const Archive& archive, const std::string& name)
{
    const std::string path = archive.getPath();
    const std::string folder = path.substr(0, path.rfind('/'));
    return ConfinedPath::namedByTitle(folder, folder + '/' + name);
}

// Returns the number of a row "UserTemplate_NNN/Titler.xml", or 0 for any other row.
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

// Returns the smallest positive number that is not in the list, or 0 if there is no gap. Expects no
// duplicates.
int firstGap(std::vector<int> numbers)
{
    std::sort(numbers.begin(), numbers.end());
    for (std::size_t position = 0; position < numbers.size(); ++position)
        if (numbers[position] != static_cast<int>(position) + 1)
            return static_cast<int>(position) + 1;
    return 0;
}

// Copies the file; succeeds without copying if the source does not exist. Titles may lack pictures, which are
// generated when the title is opened.
bool copyIfThere(const std::string& source, const std::string& target)
{
    struct stat status = {};
    if (source.empty() || target.empty() || ::stat(source.c_str(), &status) != 0 || !S_ISREG(status.st_mode))
        return true;
    struct stat targetStatus = {};
    if (::stat(target.c_str(), &targetStatus) == 0 && targetStatus.st_dev == status.st_dev &&
        targetStatus.st_ino == status.st_ino)
        return true; // the same file
    return SystemInfo::copyFolderFile(source, target);
}

// Inserts those old rows that are missing in rows and not in known, each behind its previous neighbour, if
// their files exist. Returns whether there were any.
bool insertUnknownRows(const std::string& folder, const std::vector<ArchiveOrder>& oldRows,
                       const std::unordered_set<std::string>& known, std::vector<ArchiveOrder>& rows)
{
    std::unordered_map<std::string, std::vector<ArchiveOrder>>
        unknownBehind; // key: the row before; "" for rows at the top
    std::string before;
    std::unordered_set<std::string> listed;
    for (const ArchiveOrder& row : rows)
        listed.insert(row.getArchivePath());
    for (const ArchiveOrder& row : oldRows) {
        const std::string& name = row.getArchivePath();
        struct stat status = {};
        if (listed.contains(name))
            before = name;
        else if (!name.empty() && !known.contains(name) &&
                 ::lstat((folder + STR_SLASH + name).c_str(), &status) == 0)
            unknownBehind[before].push_back(row);
    }
    if (unknownBehind.empty())
        return false;
    std::vector<ArchiveOrder> merged = std::move(unknownBehind[std::string()]);
    for (ArchiveOrder& row : rows) {
        const std::string name = row.getArchivePath();
        merged.push_back(std::move(row));
        if (const auto unknown = unknownBehind.find(name); !name.empty() && unknown != unknownBehind.end()) {
            merged.insert(merged.end(), unknown->second.begin(), unknown->second.end());
            unknownBehind.erase(unknown);
        }
    }
    for (std::size_t k = 0; k < merged.size(); ++k)
        merged[k].setArchiveIndex(static_cast<int>(k));
    rows = std::move(merged);
    return true;
}

} // namespace

ArchiveController::ArchiveController() : m_archiveManager(ArchiveManager::getInstance())
{
}

ArchiveController::~ArchiveController() = default;

QList<std::string> ArchiveController::getFolderList()
{
    const std::vector<std::string> folders = m_archiveManager->getArchiveFolderList();
    return QList<std::string>(folders.begin(), folders.end());
}

// Returns all titles of the list that can be read. A row that cannot be a title is skipped alone: if the
// others were lost with it, the clean-up would delete their files.
QList<Archive*> ArchiveController::getArchiveList(QString folder)
{
    const FolderTitles rows(folder.toStdString(), FolderTitles::WithoutOrder::ByName);
    QList<Archive*> titles;
    for (std::unique_ptr<Archive>& title : rows.read(0, rows.count()))
        if (title)
            titles.append(title.release());
    return titles;
}

bool ArchiveController::getOneArchive(QString path, Archive* archive)
{
    return m_archiveManager->loadArchive(path.toStdString(), archive) != 0;
}

bool ArchiveController::saveNewArchive(QString path, Archive* archive)
{
    if (path.isEmpty() || !archive)
        return false;
    const int result = m_archiveManager->saveArchive(archive->getPath(), archive);
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
    return !path.isEmpty() && m_archiveManager->deleteArchive(path.toStdString()) == 1;
}

bool ArchiveController::saveArchiveListOrder(QString folder, QList<ArchiveOrder*> rows)
{
    if (folder.isEmpty())
        return false;
    std::vector<ArchiveOrder> copies;
    copies.reserve(static_cast<std::size_t>(rows.size()));
    for (const ArchiveOrder* row : rows)
        if (row)
            copies.push_back(*row);
    return m_archiveManager->setArchivesSortUnderFolder(folder.toStdString(), std::move(copies)) == 1;
}

bool ArchiveController::prepareOrder(QString folder)
{
    const std::string path = folder.toStdString();
    const FolderOrder::State state = FolderOrder::stateOf(path);
    if (state == FolderOrder::State::Whole)
        return !FolderOrder::isKept(path);
    if (state == FolderOrder::State::Unreadable)
        return false; // it may be intact, so do not overwrite it
    const std::vector<ArchiveOrder> rows =
        FolderOrder::rowsByName(m_archiveManager->getFileListUnderFolder(path));
    if (rows.empty())
        return state == FolderOrder::State::Missing;
    FolderOrder::writeOrKeep(path, rows);
    return false;
}

bool ArchiveController::saveListedOrder(QString folder, QList<ArchiveOrder*> listed,
                                        const std::unordered_set<std::string>& known)
{
    if (folder.isEmpty())
        return false;
    const std::string path = folder.toStdString();
    const bool isWhole = FolderOrder::stateOf(path) == FolderOrder::State::Whole;
    std::vector<ArchiveOrder> rows;
    rows.reserve(static_cast<std::size_t>(listed.size()));
    for (const ArchiveOrder* row : listed)
        rows.push_back(*row);
    const bool hasUnknown = insertUnknownRows(path, FolderOrder::rowsToShow(path), known, rows);
    return FolderOrder::writeOrKeep(path, rows) && (isWhole || !hasUnknown);
}

std::vector<ArchiveOrder*> ArchiveController::getFileOrder(QString folder)
{
    m_fileOrder = m_archiveManager->getArchivesSortUnderFolder(folder.toStdString());
    for (ArchiveOrder* row : m_fileOrder)
        m_fetchedRows.emplace_back(row);
    return m_fileOrder;
}

QString ArchiveController::getLastArchivePath()
{
    return toQString(m_archiveManager->loadLastArchive());
}

int ArchiveController::setLastArchivePath(QString path)
{
    return m_archiveManager->saveLastArchive(path.toStdString());
}

QString ArchiveController::getLastFolderPath()
{
    return toQString(m_archiveManager->loadLastFolder());
}

int ArchiveController::setLastFolderPath(QString path)
{
    return m_archiveManager->saveLastFolder(path.toStdString());
}

int ArchiveController::copyArchiveBg(Archive* from, Archive* to)
{
    const bool isCopied = copyIfThere(from->getFullPathOfBgResource().toStdString(),
                                      to->getFullPathOfBgResource().toStdString());
    const bool isBigCopied = copyIfThere(from->getFullPathOfBgResourceBig().toStdString(),
                                         to->getFullPathOfBgResourceBig().toStdString());
    return isCopied && isBigCopied ? 1 : 0;
}

int ArchiveController::copyArchiveThumbnail(Archive* from, Archive* to)
{
    bool isCopied = true;
    const auto copy = [&](std::string (Archive::*name)() const) {
        const std::string source = (from->*name)();
        const std::string target = (to->*name)();
        if (!source.empty() && !target.empty()) // with an empty name the path would be the folder
            isCopied = copyIfThere(beside(*from, source), beside(*to, target)) && isCopied;
    };
    copy(&Archive::getThumbnailBig);
    copy(&Archive::getThumbnailMiddle);
    copy(&Archive::getThumbnailBlack);
    copy(&Archive::getThumbnailSmall);
    return isCopied ? 1 : 0;
}

QString ArchiveController::getFreeNameInUserTemplate(QString folder)
{
    std::vector<int> numbers;
    for (const ArchiveOrder* row : getFileOrder(folder))
        if (const int number = userTemplateNumber(row->getArchivePath()))
            numbers.push_back(number);
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
    const std::vector<std::string> files = m_archiveManager->getFileListUnderFolder(path);
    if (files.empty())
        return false;
    std::vector<ArchiveOrder> rows;
    const FolderOrder::State state = FolderOrder::read(path, rows);
    if (!rows.empty() || state == FolderOrder::State::Unreadable)
        return false;
    return FolderOrder::write(path, FolderOrder::rowsByName(files));
}

QList<std::string> ArchiveController::reCreateOrderXml()
{
    QList<std::string> changed;
    for (const std::string& folder : getFolderList())
        if (createNewOrderAccordingToFilesUnderFolder(toQString(folder)))
            changed.append(folder);
    return changed;
}

void ArchiveController::deleteUnusefulArchives(QString folder)
{
    const std::string path = folder.toStdString();
    std::vector<std::string> victims = m_archiveManager->getFileListUnderFolder(path);
    if (victims.empty())
        return;
    std::vector<ArchiveOrder> rows;
    if (FolderOrder::read(path, rows) != FolderOrder::State::Whole || FolderOrder::isKept(path))
        return;
    if (!rows.empty()) {
        if (victims.size() - 1 == rows.size()) // the order file is counted, too
            return;
        std::vector<std::string> targets;
        for (const ArchiveOrder& row : rows)
            targets.push_back(path + STR_SLASH + row.getArchivePath());
        victims = getDeletedFileList(std::move(victims), std::move(targets));
    }
    for (const std::string& victim : victims) {
        if (m_archiveManager->deleteArchive(victim) != 1) {
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
