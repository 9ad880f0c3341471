#pragma once

#include "titlectl/ListTable.h"

class QByteArray;
class QString;

// Reads an array of JSON objects: each object is a row, its keys are the columns, whose values are texts,
// numbers, true, false or null. An object that cannot be used does not stop the others; what is wrong with
// the array itself refuses the list. Any thread.
class JsonListReader
{
public:
    // bytes: UTF-8, with or without a byte order mark. Only one object at a time is parsed, so that the
    // memory is bounded whatever the bytes contain.
    static ListTable read(const QByteArray& bytes);

    // Returns a number as it is usually written: 12, 1.5 or 0.001.
    static QString numberText(double number);
};
