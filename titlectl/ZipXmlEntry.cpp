#include "titlectl/ZipXmlEntry.h"

#include <QFile>
#include <algorithm>
#include <unzip.h>

namespace
{

constexpr int IGNORE_CASE = 2;
constexpr uLong ENCRYPTED = 1;
constexpr uLong STORED = 0;
constexpr qint64 LONGEST_READ = 64 * 1024;

} // namespace

ZipXmlEntry::ZipXmlEntry(const QString& zipPath, const QString& name)
    : m_zip(unzOpen64(QFile::encodeName(zipPath).constData()))
{
    if (!m_zip)
        fail(QStringLiteral("It is not a zip file"));
    else if (openEntry(name.toUtf8()))
        QIODevice::open(QIODevice::ReadOnly | QIODevice::Unbuffered);
}

ZipXmlEntry::~ZipXmlEntry()
{
    if (m_isEntryOpen)
        unzCloseCurrentFile(m_zip);
    if (m_zip)
        unzClose(m_zip);
}

qint64 ZipXmlEntry::fail(const QString& reason)
{
    if (m_failure.isEmpty())
        m_failure = reason;
    m_isAtEnd = true;
    return -1;
}

bool ZipXmlEntry::openEntry(const QByteArray& name)
{
    unz_global_info64 zip = {};
    if (unzGetGlobalInfo64(m_zip, &zip) != UNZ_OK || zip.number_entry > COUNT_LIMIT) {
        fail(QStringLiteral("It has more than %1 entries").arg(COUNT_LIMIT));
        return false;
    }
    if (unzLocateFile(m_zip, name.constData(), IGNORE_CASE) != UNZ_OK) {
        m_isMissing = true;
        fail(QStringLiteral("%1 is missing in it").arg(QString::fromUtf8(name)));
        return false;
    }
    unz_file_info64 entry = {};
    if (unzGetCurrentFileInfo64(m_zip, &entry, nullptr, 0, nullptr, 0, nullptr, 0) != UNZ_OK)
        fail(QStringLiteral("It is damaged"));
    else if (entry.flag & ENCRYPTED)
        fail(QStringLiteral("It is encrypted"));
    else if (entry.compression_method != STORED && entry.compression_method != Z_DEFLATED)
        fail(QStringLiteral("It is packed in an unknown way"));
    else if (entry.uncompressed_size > ZPOS64_T(ENTRY_LIMIT))
        fail(
            QStringLiteral("%1 in it is longer than %2 bytes").arg(QString::fromUtf8(name)).arg(ENTRY_LIMIT));
    else if (unzOpenCurrentFile(m_zip) != UNZ_OK)
        fail(QStringLiteral("It is damaged"));
    else
        m_isEntryOpen = true;
    return m_isEntryOpen;
}

qint64 ZipXmlEntry::readData(char* data, qint64 maximum)
{
    if (!m_failure.isEmpty())
        return -1;
    if (m_isAtEnd)
        return 0;
    const int count = unzReadCurrentFile(m_zip, data, unsigned(std::min(maximum, LONGEST_READ)));
    if (count < 0)
        return fail(QStringLiteral("It is damaged"));
    if (count == 0) {
        m_isAtEnd = true;
        m_isEntryOpen = false;
        // The checksum is compared here.
        return unzCloseCurrentFile(m_zip) == UNZ_OK ? 0 : fail(QStringLiteral("It is damaged"));
    }
    // The size in the directory may be wrong.
    m_total += count;
    if (m_total > ENTRY_LIMIT)
        return fail(QStringLiteral("An entry in it is longer than %1 bytes").arg(ENTRY_LIMIT));
    if (!std::all_of(data, data + count, [this](char byte) { return accepts(byte); }))
        return fail(QStringLiteral("Its XML is not that of a workbook"));
    return count;
}

qint64 ZipXmlEntry::writeData(const char*, qint64)
{
    return -1;
}

// Refuses tags with very many attributes, which the XML reader compares with each other; very long texts;
// comments, document types and entities, which no workbook has; and encodings in which the signs of XML are
// not single bytes.
bool ZipXmlEntry::accepts(char byte)
{
    const Place before = m_place;
    switch (m_place) {
    case Place::Text:
        if (byte == '<')
            m_place = Place::TagBegin;
        break;
    case Place::TagBegin:
        if (byte == '!')
            return false;
        [[fallthrough]];
    case Place::Tag:
        if (byte == '>')
            m_place = Place::Text;
        else if (byte == '"')
            m_place = Place::DoubleQuoted;
        else if (byte == '\'')
            m_place = Place::SingleQuoted;
        else
            m_place = Place::Tag;
        break;
    case Place::SingleQuoted:
        if (byte == '\'')
            m_place = Place::Tag;
        break;
    case Place::DoubleQuoted:
        if (byte == '"')
            m_place = Place::Tag;
        break;
    }
    const bool isNewRun = (before == Place::Text) != (m_place == Place::Text);
    m_run = isNewRun ? 0 : m_run + 1;
    return byte != '\0' && m_run < (m_place == Place::Text ? TEXT_LIMIT : TAG_LIMIT);
}
