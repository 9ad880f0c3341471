#include "document/ImageResizer.h"

#include "document/PictureReader.h"
#include "document/PngWriter.h"
#include "support/LocaleText.h"
#include "support/k2sys/k2sys.h"

#include <QFileInfo>
#include <QPainter>
#include <algorithm>
#include <mutex>

std::string ImageResizer::checkerFname_in_title;
std::string ImageResizer::checkerFname_in_logo;

namespace
{

constexpr int REDUCTION = 4;

std::mutex gCheckerMutex;

std::wstring extensionOf(const std::wstring& path)
{
    const std::size_t slash = path.rfind(L'/');
    const std::size_t dot = path.rfind(L'.');
    const bool isInName = dot != std::wstring::npos && (slash == std::wstring::npos || dot > slash);
    return isInName ? path.substr(dot) : std::wstring();
}

QImage loadImage(const std::wstring& path)
{
    return PictureReader::read(QString::fromStdWString(path));
}

// Converts to 32 bits per pixel: the reduction works on colour bytes, and QPainter cannot paint on a palette
// image.
QImage with32Bits(const QImage& image)
{
    if (image.isNull() || image.format() == QImage::Format_RGB32 || image.format() == QImage::Format_ARGB32)
        return image;
    return image.convertToFormat(image.hasAlphaChannel() ? QImage::Format_ARGB32 : QImage::Format_RGB32);
}

// Reads the checker picture. If it exists but cannot be read at the moment, returns the last one that was
// read, because the small picture of this save is not generated again later.
QImage readChecker(const QString& path)
{
    static QString lastPath;
    static QImage last;
    const QImage checker = PictureReader::read(path);
    const std::lock_guard lock(gCheckerMutex);
    if (!checker.isNull()) {
        lastPath = path;
        last = checker;
    }
    return checker.isNull() && lastPath == path && QFileInfo::exists(path) ? last : checker;
}

} // namespace

ImageResizer::ImageResizer()
{
    char root[1024] = {};
    char data[1024] = {};
    std::string base;
    if (k2sys_getenv_ac_root(root, sizeof root) >= 0 && k2sys_getenv_ac_data(data, sizeof data) >= 0)
        base = QString::fromLocal8Bit(std::string(root).append(data).c_str()).trimmed().toStdString();
    const std::lock_guard lock(gCheckerMutex);
    checkerFname_in_title = base + "/defaultuser/resources/Templates/checker_240x135.png";
    checkerFname_in_logo = base + "/defaultuser/resources/Templates/checker_135x135.png";
}

bool ImageResizer::resizeImageToThumbnail(std::wstring& source, std::wstring& blackPath,
                                          std::wstring& smallPath, unsigned width, unsigned height)
{
    return resizeImageToThumbnail(loadImage(source), blackPath, smallPath, width, height);
}

bool ImageResizer::resizeImageToThumbnail(const QImage& source, const std::wstring& blackPath,
                                          const std::wstring& smallPath, unsigned width, unsigned height)
{
    QImage picture = with32Bits(source);
    QImage reduced(static_cast<int>(width), static_cast<int>(height), QImage::Format_ARGB32);
    reduced.fill(Qt::transparent);
    scaledToQuaterSizeWithAAF(picture, reduced);
    if (!picture.hasAlphaChannel()) {
        const bool isBlackSaved = resizeImageToThumbnailImageWithNotAlpha(blackPath, reduced);
        return resizeImageToThumbnailTitlerWithNotAlpha(smallPath, reduced) && isBlackSaved;
    }
    const bool isBlackSaved = resizeImageToThumbnailImageWithAlpha(blackPath, reduced);
    QString checkerPath;
    {
        const std::lock_guard lock(gCheckerMutex);
        checkerPath = QString::fromStdString(checkerFname_in_title);
    }
    QImage checker = with32Bits(readChecker(checkerPath));
    if (!checker.isNull()) {
        QPainter painter(&checker);
        painter.setCompositionMode(QPainter::CompositionMode_SourceOver);
        painter.drawImage(0, 0, reduced);
    }
    return resizeImageToThumbnailTitlerWithAlpha(smallPath, checker) && isBlackSaved;
}

void ImageResizer::scaledToQuaterSizeWithAAF(QImage& source, QImage& target)
{
    if (source.depth() != 32 || target.depth() != 32)
        return;
    const int columns = std::min(source.width() / REDUCTION, target.width());
    const int rows = std::min(source.height() / REDUCTION, target.height());
    for (int row = 0; row < rows; ++row) {
        const uchar* first = source.constScanLine(row * REDUCTION);
        const uchar* second = source.constScanLine(row * REDUCTION + 1);
        auto* out = reinterpret_cast<QRgb*>(target.scanLine(row));
        for (int column = 0; column < columns; ++column) {
            unsigned sums[4] = {};
            for (int i = 0; i < REDUCTION * 4; ++i)
                sums[i % 4] += first[i] + second[i];
            first += REDUCTION * 4;
            second += REDUCTION * 4;
            // The bytes in memory are blue, green, red, alpha.
            out[column] = qRgba(static_cast<int>(sums[2] >> 3), static_cast<int>(sums[1] >> 3),
                                static_cast<int>(sums[0] >> 3), static_cast<int>(sums[3] >> 3));
        }
    }
}

bool ImageResizer::resizeImageToThumbnailImageWithNotAlpha(const std::wstring& path, const QImage& reduced)
{
    return save(reduced.convertToFormat(QImage::Format_RGB32), path);
}

bool ImageResizer::resizeImageToThumbnailTitlerWithNotAlpha(const std::wstring& path, const QImage& reduced)
{
    return save(reduced.convertToFormat(QImage::Format_RGB32), path);
}

bool ImageResizer::resizeImageToThumbnailImageWithAlpha(const std::wstring& path, const QImage& reduced)
{
    // Drops the alpha channel but not the colours: transparent pixels show their stored colour.
    return save(reduced.convertToFormat(QImage::Format_RGB32), path);
}

bool ImageResizer::resizeImageToThumbnailTitlerWithAlpha(const std::wstring& path, const QImage& composed)
{
    return save(composed, path);
}

bool ImageResizer::save(const QImage& image, const std::wstring& path)
{
    const QString file = QString::fromStdWString(path);
    return m_title.empty() ? PngWriter::save(image, file) : PngWriter::saveOrKeep(image, file, m_title);
}

bool ImageResizer::isAvailableImage(std::wstring path)
{
    return loadImage(path).format() != QImage::Format_Invalid;
}

int ImageResizer::getImageWidth(std::wstring& path)
{
    return loadImage(path).width();
}

int ImageResizer::getImageHeight(std::wstring& path)
{
    return loadImage(path).height();
}

bool ImageResizer::checkJPE(std::wstring path)
{
    const std::wstring extension = extensionOf(path);
    static constexpr std::wstring_view JPE = L".jpe";
    return std::equal(extension.begin(), extension.end(), JPE.begin(), JPE.end(), [](wchar_t a, wchar_t b) {
        return a == b || (a >= L'A' && a <= L'Z' && a - L'A' + L'a' == b);
    });
}

std::wstring ImageResizer::changeJPEToJPEG(std::wstring path)
{
    const std::wstring extension = extensionOf(path);
    const std::size_t last = path.find_last_of(extension);
    if (extension.empty() || last == std::wstring::npos)
        return {};
    return path.substr(0, last) + L".jpeg";
}
