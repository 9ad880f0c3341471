// Reads packed values one after the other from a message that need not be well formed.
//
// A value that is not there, is cut off or has an unknown tag reads as zero or empty, and nothing behind the
// message's end is looked at.
#pragma once

#include <string>

struct unpack_info_t;

class RecordReader
{
public:
    // size below 0 reads as 0. The message must outlive the reader.
    RecordReader(void* data, long size);

    int readInt();
    long readLong();
    bool readBool();
    std::wstring readWide();
    // The bytes of a raw inside the message, and their number; null and 0 for anything else.
    unsigned char* readRaw(unsigned long* length);
    bool atEnd() const { return m_left == 0; }
    // Whether the last value could not be read.
    bool failed() const { return m_failed; }

private:
    unpack_info_t next();

    unsigned char* m_position;
    unsigned long m_left;
    bool m_failed = false;
};
