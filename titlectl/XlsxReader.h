#pragma once

#include "titlectl/ListTable.h"

class QString;

// Reads the first worksheet of an .xlsx workbook: its first row with text is the header. Texts, numbers and
// truth values are read as they are stored; a number that is shown as a date or in percent is read as a
// number. A row with an error value, such as #N/A, is kept as one that cannot be used. Any thread.
//
// The parts of the workbook are unpacked while they are read (see ZipXmlEntry for the limits). What is wrong
// with the workbook itself refuses the list.
class XlsxReader
{
public:
    static ListTable read(const QString& path);
};
