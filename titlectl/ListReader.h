#pragma once

#include "titlectl/ListTable.h"

class QString;

// Reads a list file into a table. Any thread.
class ListReader
{
public:
    enum class Format { Csv, Json, Xlsx };

    // Reads a regular file of at most ListTable::FILE_LIMIT bytes. What cannot be read gives a table with an
    // error.
    static ListTable read(const QString& path);

    // Returns the format that the ending of the name says: .json or .xlsx, ignoring case, else comma
    // separated values.
    static Format formatOf(const QString& path);
};
