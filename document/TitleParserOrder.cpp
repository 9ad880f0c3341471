// The order file of a folder, and the titles of a folder in its order.
#include "document/Archive.h"
#include "document/FolderOrder.h"
#include "document/FolderTitles.h"
#include "document/TitleParser.h"

#include <memory>
#include <stdexcept>
#include <utility>

std::vector<ArchiveOrder*> TitleParser::readFileOrderInFolder(std::string folder)
{
    std::vector<ArchiveOrder> rows;
    FolderOrder::read(folder, rows);
    std::vector<ArchiveOrder*> result;
    result.reserve(rows.size());
    for (ArchiveOrder& row : rows)
        result.push_back(new ArchiveOrder(std::move(row)));
    return result;
}

int TitleParser::writeFileOrderInFolder(std::string folder, std::vector<ArchiveOrder> rows)
{
    return FolderOrder::write(folder, rows) ? 1 : -1;
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
