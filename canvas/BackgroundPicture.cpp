#include "canvas/BackgroundPicture.h"

#include "document/PictureReader.h"

#include <QFile>
#include <cstring>
#include <vector>

namespace
{

// The pictures in use: one or two.
std::vector<std::weak_ptr<const BackgroundPicture>>& pictures()
{
    static std::vector<std::weak_ptr<const BackgroundPicture>> list;
    return list;
}

// Fails for all but regular files: opening a pipe blocks until somebody writes to it, and reading a device
// may never end.
bool statusOf(const QString& path, struct stat& status)
{
    return ::stat(QFile::encodeName(path).constData(), &status) == 0 && S_ISREG(status.st_mode);
}

bool isSameFile(const struct stat& a, const struct stat& b)
{
    return a.st_dev == b.st_dev && a.st_ino == b.st_ino && a.st_size == b.st_size &&
           a.st_mtim.tv_sec == b.st_mtim.tv_sec && a.st_mtim.tv_nsec == b.st_mtim.tv_nsec &&
           a.st_ctim.tv_sec == b.st_ctim.tv_sec && a.st_ctim.tv_nsec == b.st_ctim.tv_nsec;
}

// Compares the bytes of two files, which is fifty times faster than decoding one.
bool haveSameBytes(const QString& one, const QString& other)
{
    QFile a(one);
    QFile b(other);
    if (!a.open(QIODevice::ReadOnly) || !b.open(QIODevice::ReadOnly))
        return false;
    constexpr qsizetype BLOCK = 64 * 1024;
    QByteArray left(BLOCK, Qt::Uninitialized);
    QByteArray right(BLOCK, Qt::Uninitialized);
    for (;;) {
        const qint64 size = a.read(left.data(), BLOCK);
        if (size < 0 || b.read(right.data(), BLOCK) != size)
            return false;
        if (size == 0)
            return true;
        if (std::memcmp(left.constData(), right.constData(), static_cast<std::size_t>(size)) != 0)
            return false;
    }
}

} // namespace

BackgroundPicture::BackgroundPicture(const Decoded& decoded)
    : m_path(decoded.path), m_status(decoded.status), m_pixmap(QPixmap::fromImage(decoded.image))
{
}

std::shared_ptr<const BackgroundPicture> BackgroundPicture::find(const QString& path)
{
    std::erase_if(pictures(), [](const auto& picture) { return picture.expired(); });
    struct stat status = {};
    if (!statusOf(path, status))
        return nullptr;
    for (const auto& known : pictures()) {
        std::shared_ptr<const BackgroundPicture> picture = known.lock();
        if (picture && picture->isThatOf(path, status))
            return picture;
    }
    return nullptr;
}

std::shared_ptr<const BackgroundPicture> BackgroundPicture::load(const QString& path)
{
    std::shared_ptr<const BackgroundPicture> known = find(path);
    return known ? known : load(decode(path));
}

std::shared_ptr<const BackgroundPicture> BackgroundPicture::load(const Decoded& decoded)
{
    const std::shared_ptr<const BackgroundPicture> picture(new BackgroundPicture(decoded));
    if (!picture->m_pixmap.isNull())
        pictures().push_back(picture);
    return picture;
}

BackgroundPicture::Decoded BackgroundPicture::decode(const QString& path)
{
    Decoded decoded;
    decoded.path = path;
    statusOf(path, decoded.status);
    decoded.image = read(path);
    return decoded;
}

bool BackgroundPicture::isThatOf(const QString& path, const struct stat& status) const
{
    if (isSameFile(m_status, status))
        return true;
    struct stat now = {};
    return m_status.st_size == status.st_size && statusOf(m_path, now) && isSameFile(m_status, now) &&
           haveSameBytes(m_path, path);
}

// Bypasses the application's picture cache: a background takes four megabytes and is not needed again once
// its title has left the canvas.
QImage BackgroundPicture::read(const QString& path)
{
    QImage image = PictureReader::read(path);
    if (!image.isNull())
        image.convertTo(image.hasAlphaChannel() ? QImage::Format_ARGB32_Premultiplied : QImage::Format_RGB32);
    return image;
}
