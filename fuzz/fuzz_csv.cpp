// Reads comma separated values of random bytes. Checks that the rows have the columns of the header.
#include "ListCheck.h"
#include "titlectl/CsvReader.h"

#include <QBuffer>
#include <QByteArray>
#include <cstdint>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    const QByteArray bytes(reinterpret_cast<const char*>(data), qsizetype(size));
    QBuffer buffer;
    buffer.setData(bytes);
    buffer.open(QIODevice::ReadOnly);
    checkList(CsvReader::read(buffer));
    return 0;
}
