// Reads a workbook of random bytes. An input that is not a zip file becomes the worksheet of one, so that the
// checksums of the zip file are not in the way.
#include "FuzzFolder.h"
#include "ListCheck.h"
#include "titlectl/XlsxReader.h"

#include <QString>
#include <algorithm>
#include <utility>
#include <vector>
#include <zip.h>

namespace
{

const std::string LINKS =
    "<Relationships>"
    "<Relationship Id=\"a\" Type=\"x/officeDocument\" Target=\"b.xml\"/></Relationships>";
const std::string BOOK_LINKS =
    "<Relationships><Relationship Id=\"a\" Type=\"x/worksheet\" Target=\"s.xml\"/>"
    "<Relationship Id=\"b\" Type=\"x/sharedStrings\" Target=\"t.xml\"/></Relationships>";
const std::string BOOK = "<workbook xmlns:r=\"r\"><sheet r:id=\"a\"/></workbook>";

// The shared strings are the part of the input before the first line break.
void writeWorkbook(const std::string& path, std::string_view input)
{
    const std::size_t middle = std::min(input.find('\n'), input.size());
    const std::vector<std::pair<const char*, std::string_view>> parts = {
        {"_rels/.rels", LINKS},
        {"b.xml", BOOK},
        {"_rels/b.xml.rels", BOOK_LINKS},
        {"t.xml", input.substr(0, middle)},
        {"s.xml", input.substr(std::min(middle + 1, input.size()))}};
    const zipFile file = zipOpen64(path.c_str(), APPEND_STATUS_CREATE);
    for (const auto& [name, bytes] : parts) {
        const zip_fileinfo info = {};
        zipOpenNewFileInZip64(file, name, &info, nullptr, 0, nullptr, 0, nullptr, 0, 0, 0);
        zipWriteInFileInZip(file, bytes.data(), static_cast<unsigned>(bytes.size()));
        zipCloseFileInZip(file);
    }
    zipClose(file, nullptr);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    const std::string path = FuzzFolder::instance().base() + "/list.xlsx";
    const std::string_view input = FuzzFolder::view(data, size);
    if (input.starts_with("PK"))
        FuzzFolder::write(path, input);
    else
        writeWorkbook(path, input);
    checkList(XlsxReader::read(QString::fromStdString(path)));
    ::unlink(path.c_str());
    return 0;
}
