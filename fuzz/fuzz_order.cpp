// Reads an order file of random bytes in a folder with titles, lists the titles, and checks that the file can
// be written again with the same rows.
#include "FuzzFolder.h"
#include "document/Archive.h"
#include "document/ArchiveController.h"
#include "document/ArchiveOrder.h"
#include "document/TitleParser.h"

#include <cstdio>
#include <memory>
#include <stdexcept>
#include <vector>

namespace
{

using Rows = std::vector<std::unique_ptr<ArchiveOrder>>;

Rows rowsOf(const std::string& folder)
{
    const std::vector<ArchiveOrder*> rows = TitleParser().readFileOrderInFolder(folder);
    return {rows.begin(), rows.end()};
}

bool isSame(const Rows& a, const Rows& b)
{
    if (a.size() != b.size())
        return false;
    for (std::size_t i = 0; i < a.size(); ++i)
        if (a[i]->getArchiveIndex() != b[i]->getArchiveIndex() ||
            a[i]->getArchivePath() != b[i]->getArchivePath())
            return false;
    return true;
}

std::string makeFolder()
{
    const std::string folder = FuzzFolder::instance().base() + "/titles/fuzz";
    FuzzFolder::empty(folder);
    for (const char* stem : {"/a.xml", "/b.xml", "/c.xml"})
        FuzzFolder::write(folder + stem,
                          "<?xml version=\"1.0\" encoding=\"UTF-8\"?><manifest type=\"archive\"/>");
    return folder;
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    static const std::string folder = makeFolder();
    FuzzFolder::write(folder + "/.order.xml", FuzzFolder::view(data, size));
    const Rows rows = rowsOf(folder);
    try {
        for (Archive* archive : TitleParser().getFilsByOrderInFolder(folder))
            delete archive;
    } catch (const std::out_of_range&) {
        // the documented result for a name that cannot be that of a title file
    }
    ArchiveController controller;
    const QString name = QString::fromStdString(folder);
    qDeleteAll(controller.getArchiveList(name));
    controller.getFreeNameInUserTemplate(name);
    if (rows.empty())
        return 0;
    std::vector<ArchiveOrder> copies;
    for (const auto& row : rows)
        copies.push_back(*row);
    TitleParser().writeFileOrderInFolder(folder, copies);
    if (!isSame(rows, rowsOf(folder))) {
        std::fprintf(stderr, "other rows when written again\n");
        std::abort();
    }
    return 0;
}
