// Reads the field names of a template from random bytes. Checks that they are kept when they are written.
#include "titlectl/TemplateFields.h"

#include <QByteArray>
#include <QString>
#include <cstdint>
#include <cstdlib>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    QString error;
    const TemplateFields fields =
        TemplateFields::fromJson(QByteArray(reinterpret_cast<const char*>(data), qsizetype(size)), error);
    const TemplateFields again = TemplateFields::fromJson(fields.toJson(), error);
    if (!error.isEmpty() || !(again == fields))
        std::abort();
    return 0;
}
