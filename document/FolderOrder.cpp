#include "document/FolderOrder.h"

#include "document/ArchiveManager.h"
#include "document/DocumentConstants.h"
#include "document/TitleParser.h"
#include "document/TitleParserUtility.h"
#include "support/AtomicFile.h"
#include "support/RefusedWrites.h"
#include "support/XmlFile.h"
#include "support/XmlFileGuard.h"

#include <algorithm>
#include <cerrno>
#include <tinyxml.h>

namespace
{

// Accepts leading blanks and any text behind the number.
bool readInt(const TiXmlElement& element, const char* key, int& value)
{
    return element.QueryIntAttribute(key, &value) == TIXML_SUCCESS;
}

bool isMissing()
{
    return errno == ENOENT || errno == ENOTDIR;
}

} // namespace

std::string FolderOrder::pathIn(const std::string& folder)
{
    return folder + STR_SLASH + TitleParser::ORDER_FILEPATH;
}

FolderOrder::State FolderOrder::read(const std::string& folder, std::vector<ArchiveOrder>& rows)
{
    rows.clear();
    const std::string path = pathIn(folder);
    TiXmlDocument document;
    if (!XmlFile::load(path, document)) {
        std::string bytes;
        errno = 0;
        if (AtomicFile::read(path, XmlFileGuard::MAX_BYTES, bytes))
            return State::Torn;
        return isMissing() ? State::Missing : State::Unreadable;
    }
    const TiXmlElement* root = document.RootElement();
    if (!root)
        return State::Torn;
    const TiXmlElement* index = root->FirstChildElement(TitleParser::ORDER_NODE_INDEX);
    for (; index; index = index->NextSiblingElement(TitleParser::ORDER_NODE_INDEX)) {
        int value = 0;
        if (!readInt(*index, TitleParser::ORDER_INDEX_VAL, value))
            continue;
        ArchiveOrder row;
        row.setArchiveIndex(value);
        const std::string file = TitleParserUtility::getAttribute(index, TitleParser::ORDER_INDEX_FILEPATH);
        if (!file.empty())
            row.setArchivePath(file);
        rows.push_back(std::move(row));
    }
    return State::Whole;
}

FolderOrder::State FolderOrder::stateOf(const std::string& folder)
{
    std::vector<ArchiveOrder> rows;
    return read(folder, rows);
}

std::vector<ArchiveOrder> FolderOrder::rowsToShow(const std::string& folder)
{
    std::vector<ArchiveOrder> rows;
    if (read(folder, rows) != State::Whole)
        rows = rowsByName(TitleParserUtility::queryFilesInFolder(folder));
    return rows;
}

std::vector<ArchiveOrder> FolderOrder::rowsByName(const std::vector<std::string>& files)
{
    std::vector<std::string> names;
    for (const std::string& file : files)
        if (ArchiveManager::isTitleFile(file))
            names.push_back(file.substr(file.rfind('/') + 1));
    std::sort(names.begin(), names.end());
    std::vector<ArchiveOrder> rows;
    for (const std::string& name : names) {
        ArchiveOrder row;
        row.setArchiveIndex(static_cast<int>(rows.size()));
        row.setArchivePath(name);
        rows.push_back(std::move(row));
    }
    return rows;
}

std::string FolderOrder::toBytes(const std::vector<ArchiveOrder>& rows)
{
    TiXmlDocument document;
    document.LinkEndChild(new TiXmlDeclaration(XML_VERSION, XML_ENCODING, STR_EMPTY));
    auto* root = new TiXmlElement(TitleParser::ORDER_NODE_ROOT); // the document owns linked elements
    root->SetAttribute(TitleParser::ORDER_TYPE, TitleParser::ORDER_TYPE_VAL);
    root->SetAttribute(TitleParser::ORDER_INDEX_COUNT, static_cast<int>(rows.size()));
    document.LinkEndChild(root);
    for (const ArchiveOrder& row : rows) {
        auto* index = new TiXmlElement(TitleParser::ORDER_NODE_INDEX);
        index->SetAttribute(TitleParser::ORDER_INDEX_VAL, row.getArchiveIndex());
        index->SetAttribute(TitleParser::ORDER_INDEX_FILEPATH, row.getArchivePath().c_str());
        root->LinkEndChild(index);
    }
    return XmlFile::toBytes(document);
}

bool FolderOrder::write(const std::string& folder, const std::vector<ArchiveOrder>& rows)
{
    return AtomicFile::write(pathIn(folder), toBytes(rows));
}

bool FolderOrder::writeOrKeep(const std::string& folder, const std::vector<ArchiveOrder>& rows)
{
    if (write(folder, rows))
        return true;
    RefusedWrites::keep(pathIn(folder), toBytes(rows), errno);
    return false;
}

bool FolderOrder::isKept(const std::string& folder)
{
    std::string bytes;
    return RefusedWrites::find(pathIn(folder), bytes);
}
