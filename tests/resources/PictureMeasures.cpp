#include "tests/resources/PictureMeasures.h"

#include <QHash>
#include <QPainter>

#include <cmath>

namespace
{

double linear(double channel)
{
    return channel <= 0.04045 ? channel / 12.92 : std::pow((channel + 0.055) / 1.055, 2.4);
}

double luminance(const QColor& color)
{
    return 0.2126 * linear(color.redF()) + 0.7152 * linear(color.greenF()) + 0.0722 * linear(color.blueF());
}

struct Lab {
    double lightness;
    double a;
    double b;
};

double labCurve(double value)
{
    return value > 216.0 / 24389.0 ? std::cbrt(value) : (24389.0 / 27.0 * value + 16.0) / 116.0;
}

Lab toLab(const QColor& color)
{
    const double red = linear(color.redF());
    const double green = linear(color.greenF());
    const double blue = linear(color.blueF());
    const double x = labCurve((0.4124 * red + 0.3576 * green + 0.1805 * blue) / 0.9505);
    const double y = labCurve(0.2126 * red + 0.7152 * green + 0.0722 * blue);
    const double z = labCurve((0.0193 * red + 0.1192 * green + 0.9505 * blue) / 1.089);
    return {116 * y - 16, 500 * (x - y), 200 * (y - z)};
}

int step(QRgb one, QRgb other)
{
    return qMax(qMax(qAbs(qRed(one) - qRed(other)), qAbs(qGreen(one) - qGreen(other))),
                qMax(qAbs(qBlue(one) - qBlue(other)), qAbs(qAlpha(one) - qAlpha(other))));
}

QImage canvas(const QSize& size)
{
    QImage image(size, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    return image;
}

void setScaling(QPainter& painter, PictureMeasures::Scaling scaling)
{
    painter.setRenderHint(QPainter::SmoothPixmapTransform, scaling == PictureMeasures::Scaling::Smooth);
}

} // namespace

double PictureMeasures::contrast(const QColor& one, const QColor& other)
{
    const double first = luminance(one) + 0.05;
    const double second = luminance(other) + 0.05;
    return qMax(first, second) / qMin(first, second);
}

double PictureMeasures::difference(const QColor& one, const QColor& other)
{
    const Lab first = toLab(one);
    const Lab second = toLab(other);
    return std::hypot(first.lightness - second.lightness, first.a - second.a, first.b - second.b);
}

QColor PictureMeasures::mean(const QImage& image, const QRect& area)
{
    const QRect part = area & image.rect();
    qint64 red = 0;
    qint64 green = 0;
    qint64 blue = 0;
    for (int y = part.top(); y <= part.bottom(); ++y) {
        for (int x = part.left(); x <= part.right(); ++x) {
            const QRgb pixel = image.pixel(x, y);
            red += qRed(pixel);
            green += qGreen(pixel);
            blue += qBlue(pixel);
        }
    }
    const qint64 count = qMax(qint64(1), qint64(part.width()) * part.height());
    return QColor(int(red / count), int(green / count), int(blue / count));
}

double PictureMeasures::largestDifference(const QImage& one, const QImage& other, int side)
{
    double largest = 0;
    for (int y = 0; y + side <= one.height(); ++y) {
        for (int x = 0; x + side <= one.width(); ++x) {
            const QRect square(x, y, side, side);
            largest = qMax(largest, difference(mean(one, square), mean(other, square)));
        }
    }
    return largest;
}

QImage PictureMeasures::on(const QColor& ground, const QImage& picture)
{
    QImage image(picture.size(), QImage::Format_RGB32);
    image.fill(ground);
    QPainter painter(&image);
    painter.drawImage(0, 0, picture);
    return image;
}

QColor PictureMeasures::inkOf(const QImage& picture)
{
    QHash<QRgb, int> counts;
    QRgb most = 0;
    for (int y = 0; y < picture.height(); ++y) {
        for (int x = 0; x < picture.width(); ++x) {
            const QRgb pixel = picture.pixel(x, y);
            if (qAlpha(pixel) == 255 && ++counts[pixel] > counts.value(most))
                most = pixel;
        }
    }
    return counts.isEmpty() ? QColor() : QColor(most);
}

QRect PictureMeasures::inkRect(const QImage& picture)
{
    QRect rect;
    for (int y = 0; y < picture.height(); ++y) {
        for (int x = 0; x < picture.width(); ++x)
            if (qAlpha(picture.pixel(x, y)) >= 128)
                rect |= QRect(x, y, 1, 1);
    }
    return rect;
}

QImage PictureMeasures::threePieces(const QString& base, const QStringList& names, const QSize& size,
                                    Scaling scaling)
{
    const QImage first(base + names.at(0));
    const QImage last(base + names.at(2));
    QImage image = canvas(size);
    QPainter painter(&image);
    setScaling(painter, scaling);
    const int room = size.width() - first.width() - last.width();
    painter.drawImage(QRect(0, 0, first.width(), size.height()), first);
    if (room > 0)
        painter.drawImage(QRect(first.width(), 0, room, size.height()), QImage(base + names.at(1)));
    painter.drawImage(QRect(size.width() - last.width(), 0, last.width(), size.height()), last);
    return image;
}

QImage PictureMeasures::threePiecesDown(const QString& base, const QStringList& names, const QSize& size,
                                        Scaling scaling)
{
    const QImage first(base + names.at(0));
    const QImage last(base + names.at(2));
    QImage image = canvas(size);
    QPainter painter(&image);
    setScaling(painter, scaling);
    const int room = size.height() - first.height() - last.height();
    painter.drawImage(QRect(0, 0, size.width(), first.height()), first);
    if (room > 0)
        painter.drawImage(QRect(0, first.height(), size.width(), room), QImage(base + names.at(1)));
    painter.drawImage(QRect(0, size.height() - last.height(), size.width(), last.height()), last);
    return image;
}

QImage PictureMeasures::ninePieces(const QString& prefix, const QSize& size, Scaling scaling)
{
    const QStringList columns{QStringLiteral("_Left"), QStringLiteral("_Center"), QStringLiteral("_Right")};
    const QString lower = prefix.startsWith(QLatin1String(":/dialog_base")) ? QStringLiteral("bottom")
                                                                            : QStringLiteral("Bottom");
    const int corner = QImage(prefix + QStringLiteral("Upper_Left")).height();
    const int room = size.height() - 2 * corner;
    QImage image = canvas(size);
    QPainter painter(&image);
    painter.drawImage(
        0, 0, threePieces(prefix + QStringLiteral("Upper"), columns, QSize(size.width(), corner), scaling));
    if (room > 0) {
        painter.drawImage(
            0, corner,
            threePieces(prefix + QStringLiteral("Middle"), columns, QSize(size.width(), room), scaling));
    }
    painter.drawImage(0, size.height() - corner,
                      threePieces(prefix + lower, columns, QSize(size.width(), corner), scaling));
    return image;
}

int PictureMeasures::largestStepAcross(const QImage& image, int from, int to)
{
    int largest = 0;
    for (int y = 0; y < image.height(); ++y)
        for (int x = from; x < to; ++x)
            largest = qMax(largest, step(image.pixel(x, y), image.pixel(x + 1, y)));
    return largest;
}

int PictureMeasures::largestStepDown(const QImage& image, int from, int to)
{
    int largest = 0;
    for (int y = from; y < to; ++y)
        for (int x = 0; x < image.width(); ++x)
            largest = qMax(largest, step(image.pixel(x, y), image.pixel(x, y + 1)));
    return largest;
}
