#include "document/PictureReader.h"

#include "document/PictureGuard.h"
#include "support/AtomicFile.h"

#include <QBuffer>
#include <QFile>
#include <QImageReader>

namespace
{

// Raises Qt's memory limit, which is lower and applies to every format.
void setAllocationLimit()
{
    static const bool isSet = [] {
        QImageReader::setAllocationLimit(static_cast<int>(PictureGuard::MAX_DECODED_BYTES / (1024 * 1024)));
        return true;
    }();
    Q_UNUSED(isSet);
}

} // namespace

PictureReader::PictureReader(const QString& path)
{
    if (path.isEmpty() || !AtomicFile::read(QFile::encodeName(path).toStdString(), MAX_FILE_BYTES, m_bytes))
        return;
    const PictureGuard guard(bytes());
    m_format = guard.format();
    m_size = guard.size();
    if (!guard.isAccepted())
        m_bytes = std::string();
}

QByteArray PictureReader::bytes() const
{
    return QByteArray::fromRawData(m_bytes.data(), static_cast<qsizetype>(m_bytes.size()));
}

QImage PictureReader::read(const QSize& scaledSize) const
{
    if (m_format.isEmpty())
        return {};
    setAllocationLimit();
    QByteArray shared = bytes();
    QBuffer buffer(&shared);
    buffer.open(QIODevice::ReadOnly);
    QImageReader reader(&buffer, m_format);
    reader.setAutoDetectImageFormat(false);
    if (scaledSize.isValid())
        reader.setScaledSize(scaledSize);
    return reader.read();
}

QImage PictureReader::read(const QString& path)
{
    return PictureReader(path).read();
}
