#pragma once

#include <string>

struct unpack_info_t;

// Reads packed values one after the other from a message that may be malformed.
//
// A value that is missing, truncated or has an unknown tag is read as zero or empty. Nothing beyond the end
// of the message is accessed.
class RecordReader
{
public:
    // A negative size is treated as 0. The message must outlive the reader.
    RecordReader(void* data, long size);

    int readInt();
    long readLong();
    bool readBool();
    std::wstring readWide();
    // Returns a pointer to raw data inside the message and stores its length; null and 0 if the value is of
    // another kind.
    unsigned char* readRaw(unsigned long* length);
    bool atEnd() const { return m_left == 0; }
    // Returns whether the last value could not be read.
    bool failed() const { return m_failed; }

private:
    unpack_info_t next();

    unsigned char* m_position;
    unsigned long m_left;
    bool m_failed = false;
};
