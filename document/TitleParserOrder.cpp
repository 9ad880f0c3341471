// The order file of a folder, and the titles of a folder in its order.
#include "document/Archive.h"
#include "document/ArchiveOrder.h"
#include "document/DocumentConstants.h"
#include "document/FolderTitles.h"
#include "document/TitleParser.h"
#include "document/TitleParserUtility.h"
#include "support/XmlFile.h"

#include <cstdio>
#include <memory>
#include <stdexcept>
#include <tinyxml.h>

namespace
{

// An int attribute as TinyXML reads it: leading blanks and what follows the number do not matter.
bool readInt(const TiXmlElement& element, const char* key, int& value)
{
    return element.QueryIntAttribute(key, &value) == TIXML_SUCCESS;
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
    const FolderTitles titles(std::move(folder));
    for (std::size_t row = 0; row < titles.count(); ++row) {
        if (!titles.canBeTitle(row))
            throw std::out_of_range("a row too short for the name of a title file");
    }
    std::vector<Archive*> result;
    for (std::unique_ptr<Archive>& title : titles.read(0, titles.count())) {
        if (title)
            result.push_back(title.release());
    }
    return result;
}

std::vector<Archive*> TitleParser::getFilesByOrderInFolderWithoutCheck(std::string folder)
{
    return getFilsByOrderInFolder(std::move(folder));
}
