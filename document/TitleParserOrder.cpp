// The order file of a folder, and the titles of a folder in its order.
#include "document/Archive.h"
#include "document/ArchiveOrder.h"
#include "document/DocumentConstants.h"
#include "document/TitleParser.h"
#include "document/TitleParserUtility.h"
#include "support/XmlFile.h"

#include <algorithm>
#include <atomic>
#include <cstdio>
#include <future>
#include <memory>
#include <thread>
#include <tinyxml.h>

namespace
{

constexpr std::size_t EXTENSION_LENGTH = 4; // of ".xml"

// An int attribute as TinyXML reads it: leading blanks and what follows the number do not matter.
bool readInt(const TiXmlElement& element, const char* key, int& value)
{
    return element.QueryIntAttribute(key, &value) == TIXML_SUCCESS;
}

// Calls job(0) to job(count - 1), each once, and returns when all are done. The calling thread takes part.
template <typename Job>
void onAllCores(std::size_t count, const Job& job)
{
    constexpr std::size_t WORTH_A_THREAD = 8;
    std::atomic<std::size_t> next = 0;
    const auto work = [&] {
        for (std::size_t k = next++; k < count; k = next++)
            job(k);
    };
    const std::size_t cores = std::max(std::thread::hardware_concurrency(), 1U);
    std::vector<std::future<void>> helpers;
    for (std::size_t i = 1; i < std::min(cores, count / WORTH_A_THREAD); ++i)
        helpers.push_back(std::async(std::launch::async, work));
    work();
    for (std::future<void>& helper : helpers)
        helper.get();
}

} // namespace

std::vector<ArchiveOrder*> TitleParser::readFileOrderInFolder(std::string folder)
{
    std::vector<ArchiveOrder*> rows;
    TiXmlDocument document;
    if (!XmlFile::load(folder + STR_SLASH + ORDER_FILEPATH, document))
        return rows;
    const TiXmlElement* root = document.RootElement();
    const TiXmlElement* index = root ? root->FirstChildElement(ORDER_NODE_INDEX) : nullptr;
    for (; index; index = index->NextSiblingElement(ORDER_NODE_INDEX)) {
        int value = 0;
        if (!readInt(*index, ORDER_INDEX_VAL, value))
            continue;
        auto row = std::make_unique<ArchiveOrder>();
        row->setArchiveIndex(value);
        const std::string path = TitleParserUtility::getAttribute(index, ORDER_INDEX_FILEPATH);
        if (!path.empty())
            row->setArchivePath(path);
        rows.push_back(row.release());
    }
    return rows;
}

int TitleParser::writeFileOrderInFolder(std::string folder, std::vector<ArchiveOrder> rows)
{
    TiXmlDocument document;
    document.LinkEndChild(new TiXmlDeclaration(XML_VERSION, XML_ENCODING, STR_EMPTY));
    auto* root = new TiXmlElement(ORDER_NODE_ROOT); // linked elements belong to the document
    root->SetAttribute(ORDER_TYPE, ORDER_TYPE_VAL);
    root->SetAttribute(ORDER_INDEX_COUNT, static_cast<int>(rows.size()));
    document.LinkEndChild(root);
    for (const ArchiveOrder& row : rows) {
        auto* index = new TiXmlElement(ORDER_NODE_INDEX);
        index->SetAttribute(ORDER_INDEX_VAL, row.getArchiveIndex());
        index->SetAttribute(ORDER_INDEX_FILEPATH, row.getArchivePath().c_str());
        root->LinkEndChild(index);
    }
    // A folder whose order could not be written has no order file, rather than one that names other titles:
    // the start makes a new one for it from what the folder holds.
    const std::string path = folder + STR_SLASH + ORDER_FILEPATH;
    std::remove(path.c_str());
    if (!XmlFile::saveInPlace(document, path))
        std::remove(path.c_str());
    return 1;
}

std::vector<Archive*> TitleParser::getFilsByOrderInFolder(std::string folder)
{
    const std::vector<ArchiveOrder*> rows = readFileOrderInFolder(folder);
    std::vector<std::unique_ptr<ArchiveOrder>> owner(rows.begin(), rows.end());
    std::vector<std::unique_ptr<Archive>> titles;
    for (std::size_t k = 0; k < rows.size(); ++k) {
        auto archive = std::make_unique<Archive>();
        const std::string& path = rows[k]->getArchivePath();
        if (!path.empty()) {
            // Throws std::out_of_range for a name that cannot be that of a title file.
            std::string name = path;
            name.erase(name.size() - EXTENSION_LENGTH);
            archive->setName(std::move(name));
            archive->setOrder(std::to_string(k + 1));
        }
        titles.push_back(std::move(archive));
    }
    // Each is read on its own; a row without a path makes an empty title.
    onAllCores(titles.size(), [&](std::size_t k) {
        const std::string& path = rows[k]->getArchivePath();
        if (!path.empty() && TitleParser().readOneTitle(folder + STR_SLASH + path, titles[k].get()) < 1)
            titles[k].reset();
    });
    std::vector<Archive*> result;
    result.reserve(titles.size());
    for (std::unique_ptr<Archive>& title : titles) {
        if (title)
            result.push_back(title.release());
    }
    return result;
}

std::vector<Archive*> TitleParser::getFilesByOrderInFolderWithoutCheck(std::string folder)
{
    return getFilsByOrderInFolder(std::move(folder));
}
