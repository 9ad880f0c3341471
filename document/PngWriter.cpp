#include "document/PngWriter.h"

#include "document/PngEncoder.h"
#include "support/RefusedWrites.h"

#include <QBuffer>
#include <QColorSpace>
#include <QFileInfo>
#include <QImageWriter>
#include <cerrno>

namespace
{

QByteArray encodeByQt(const QImage& image, const QByteArray& format)
{
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    QImageWriter writer(&buffer, format);
    return writer.write(image) ? bytes : QByteArray();
}

} // namespace

QByteArray PngWriter::encode(const QImage& image)
{
    if (image.isNull())
        return {};
    if (image.colorSpace().isValid() || !image.textKeys().isEmpty() || !image.offset().isNull())
        return encodeByQt(image, "png"); // Qt writes data other than pixels
    const QByteArray bytes = PngEncoder::encode(image);
    return bytes.isEmpty() ? encodeByQt(image, "png") : bytes;
}

QByteArray PngWriter::encodeFor(const QImage& image, const QString& path)
{
    const QByteArray format = QFileInfo(path).suffix().toLower().toLatin1();
    if (image.isNull() || format.isEmpty())
        return {};
    if (format == "jpe") // unknown to Qt
        return encodeByQt(image, "jpeg");
    return format == "png" ? encode(image) : encodeByQt(image, format);
}

bool PngWriter::save(const QImage& image, const QString& path, AtomicFile::Durability durability)
{
    const QByteArray bytes = encodeFor(image, path);
    return !bytes.isEmpty() &&
           AtomicFile::write(path.toStdString(), {bytes.constData(), static_cast<std::size_t>(bytes.size())},
                             durability, AtomicFile::Links::Replace);
}

bool PngWriter::saveOrKeep(const QImage& image, const QString& path, const std::string& title)
{
    const QByteArray bytes = encodeFor(image, path);
    if (bytes.isEmpty())
        return false;
    const std::string file = path.toStdString();
    if (AtomicFile::write(file, {bytes.constData(), static_cast<std::size_t>(bytes.size())},
                          AtomicFile::Durability::SyncLater, AtomicFile::Links::Replace))
        return true;
    const int error = errno;
    RefusedWrites::keep(file, bytes.toStdString(), error, title);
    return false;
}
