#pragma once

#include <QByteArray>
#include <QIODevice>
#include <QString>

// One XML file inside a zip file, unpacked while it is read and never held as a whole. Made for an
// XML reader: what could keep that busy for long, or could take much memory, ends the file with an error.
// Any thread.
class ZipXmlEntry : public QIODevice
{
    Q_OBJECT

public:
    // Bytes of an entry when it is unpacked.
    static constexpr qint64 ENTRY_LIMIT = 64LL * 1024 * 1024;
    // Entries of a zip file.
    static constexpr int COUNT_LIMIT = 10000;
    // Bytes between "<" and ">", and between two tags.
    static constexpr int TAG_LIMIT = 16 * 1024;
    static constexpr int TEXT_LIMIT = 1024 * 1024;

    // Opens the entry for reading; isOpen() says whether it could be. The name ignores case.
    ZipXmlEntry(const QString& zipPath, const QString& name);
    ~ZipXmlEntry() override;

    // Returns why the entry could not be opened or not be read to its end.
    const QString& failure() const { return m_failure; }
    // Returns whether the zip file can be read and just has no such entry.
    bool isMissing() const { return m_isMissing; }

    bool isSequential() const override { return true; }
    bool atEnd() const override { return m_isAtEnd && QIODevice::atEnd(); }

protected:
    qint64 readData(char* data, qint64 maximum) override;
    qint64 writeData(const char* data, qint64 size) override;

private:
    // Where the last byte was.
    enum class Place { Text, TagBegin, Tag, SingleQuoted, DoubleQuoted };

    bool openEntry(const QByteArray& name);
    bool accepts(char byte);
    qint64 fail(const QString& reason);

    void* m_zip = nullptr;
    QString m_failure;
    qint64 m_total = 0;
    int m_run = 0; // bytes since the tag or the text began
    Place m_place = Place::Text;
    bool m_isMissing = false;
    bool m_isEntryOpen = false;
    bool m_isAtEnd = false;
};
