// Reads a JSON list of random bytes. Checks that the rows have the columns that were found.
#include "ListCheck.h"
#include "titlectl/JsonListReader.h"

#include <QByteArray>
#include <cstdint>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    checkList(JsonListReader::read(QByteArray(reinterpret_cast<const char*>(data), qsizetype(size))));
    return 0;
}
