// titler_pngdiff: what the end-to-end tests ask about pictures. Each answer is one JSON object on standard
// output.
//
//   size FILE                        width and height
//   alpha FILE                       bounding box and number of the pixels that are not wholly transparent
//   changed OLD NEW                  bounding box and number of the pixels that differ
//   pictures A B DIFF                how far two pictures of the same size are from each other, on mid grey,
//   where
//                                    either is not transparent; answer and DIFF as with screen
//   screen SHOT X Y W H TITLE DIFF   how far the screenshot's rectangle is from the title picture scaled to W
//   x H.
//                                    Differences are per pixel the largest of the three channels, 0 to 255.
//                                    DIFF gets the screenshot, the picture and the difference, side by side.
// Ends 2 on wrong use or an unreadable picture.

#include <QCoreApplication>
#include <QImage>
#include <QJsonDocument>
#include <QJsonObject>
#include <QPainter>
#include <QRect>
#include <QStringList>
#include <QTextStream>
#include <algorithm>
#include <array>
#include <cstdlib>
#include <functional>
#include <optional>

namespace
{

constexpr int WRONG_USE = 2;
constexpr int VISIBLE_DIFFERENCE = 32;

std::optional<QImage> load(const QString& path)
{
    const QImage image(path);
    if (image.isNull()) {
        QTextStream(stderr) << "titler_pngdiff: cannot read " << path << "\n";
        return std::nullopt;
    }
    return image.convertToFormat(QImage::Format_ARGB32);
}

int distance(QRgb a, QRgb b)
{
    return std::max(
        {std::abs(qRed(a) - qRed(b)), std::abs(qGreen(a) - qGreen(b)), std::abs(qBlue(a) - qBlue(b))});
}

// By how much a pixel of one picture leaves the range of the colours within one pixel of it in the other.
int distanceToNeighbourhood(QRgb pixel, const QImage& other, int x, int y)
{
    std::array<int, 3> low{255, 255, 255};
    std::array<int, 3> high{0, 0, 0};
    for (int row = std::max(y - 1, 0); row <= std::min(y + 1, other.height() - 1); ++row) {
        const auto* line = reinterpret_cast<const QRgb*>(other.constScanLine(row));
        for (int column = std::max(x - 1, 0); column <= std::min(x + 1, other.width() - 1); ++column) {
            const std::array<int, 3> near{qRed(line[column]), qGreen(line[column]), qBlue(line[column])};
            for (std::size_t channel = 0; channel < near.size(); ++channel) {
                low.at(channel) = std::min(low.at(channel), near.at(channel));
                high.at(channel) = std::max(high.at(channel), near.at(channel));
            }
        }
    }
    const std::array<int, 3> value{qRed(pixel), qGreen(pixel), qBlue(pixel)};
    int distance = 0;
    for (std::size_t channel = 0; channel < value.size(); ++channel) {
        distance =
            std::max({distance, low.at(channel) - value.at(channel), value.at(channel) - high.at(channel)});
    }
    return distance;
}

QJsonObject boxWhere(const QImage& image, const std::function<bool(int, int)>& counts)
{
    QRect box;
    int count = 0;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (counts(x, y)) {
                box |= QRect(x, y, 1, 1);
                ++count;
            }
        }
    }
    return {
        {"x", box.x()}, {"y", box.y()}, {"width", box.width()}, {"height", box.height()}, {"count", count}};
}

std::optional<QJsonObject> sizeOf(const QStringList& arguments)
{
    const auto image = load(arguments.at(0));
    if (!image)
        return std::nullopt;
    return QJsonObject{{"width", image->width()}, {"height", image->height()}};
}

std::optional<QJsonObject> alphaOf(const QStringList& arguments)
{
    const auto image = load(arguments.at(0));
    if (!image)
        return std::nullopt;
    return boxWhere(*image, [&image](int x, int y) { return qAlpha(image->pixel(x, y)) > 0; });
}

std::optional<QJsonObject> changedBetween(const QStringList& arguments)
{
    const auto before = load(arguments.at(0));
    const auto after = load(arguments.at(1));
    if (!before || !after || before->size() != after->size())
        return std::nullopt;
    return boxWhere(*after, [&](int x, int y) {
        const QRgb a = before->pixel(x, y);
        const QRgb b = after->pixel(x, y);
        return qAlpha(a) != qAlpha(b) || (qAlpha(b) > 0 && distance(a, b) > 0);
    });
}

// Both pictures have one size; pixels for which skip is true do not count.
QJsonObject compare(const QImage& shown, const QImage& wanted, const QString& sheetPath,
                    const std::function<bool(int, int)>& skip)
{
    const QSize size = wanted.size();
    QImage difference(size, QImage::Format_RGB32);
    difference.fill(Qt::black);
    std::array<qint64, 256> histogram{};
    qint64 compared = 0;
    qint64 sum = 0;
    for (int y = 0; y < size.height(); ++y) {
        for (int x = 0; x < size.width(); ++x) {
            if (skip(x, y))
                continue;
            const int level = std::max(distanceToNeighbourhood(wanted.pixel(x, y), shown, x, y),
                                       distanceToNeighbourhood(shown.pixel(x, y), wanted, x, y));
            ++histogram.at(static_cast<std::size_t>(level));
            ++compared;
            sum += level;
            difference.setPixel(x, y, qRgb(level, level, level));
        }
    }
    qint64 visible = 0;
    int largest = 0;
    for (int level = 0; level < 256; ++level) {
        const qint64 count = histogram.at(static_cast<std::size_t>(level));
        visible += level > VISIBLE_DIFFERENCE ? count : 0;
        largest = count > 0 ? level : largest;
    }

    QImage sheet(size.width() * 3, size.height(), QImage::Format_RGB32);
    sheet.fill(Qt::darkGray);
    QPainter painter(&sheet);
    painter.drawImage(0, 0, shown);
    painter.drawImage(size.width(), 0, wanted);
    painter.drawImage(size.width() * 2, 0, difference);
    painter.end();
    sheet.save(sheetPath);

    const double pixels = static_cast<double>(std::max<qint64>(compared, 1));
    return QJsonObject{{"compared", compared},
                       {"mean", static_cast<double>(sum) / pixels},
                       {"largest", largest},
                       {"visible", static_cast<double>(visible) / pixels}};
}

std::optional<QJsonObject> compareWithScreen(const QStringList& arguments)
{
    const auto screen = load(arguments.at(0));
    const QRect rect(arguments.at(1).toInt(), arguments.at(2).toInt(), arguments.at(3).toInt(),
                     arguments.at(4).toInt());
    const auto title = load(arguments.at(5));
    if (!screen || !title || !screen->rect().contains(rect))
        return std::nullopt;
    const QImage shown = screen->copy(rect);
    // Where the title is transparent, the screen shows what lies under the canvas; it is not compared.
    const QImage wanted = title->scaled(rect.size(), Qt::IgnoreAspectRatio, Qt::SmoothTransformation)
                              .convertToFormat(QImage::Format_ARGB32);
    return compare(shown, wanted, arguments.at(6),
                   [&wanted](int x, int y) { return qAlpha(wanted.pixel(x, y)) < 255; });
}

QImage onGrey(const QImage& picture)
{
    QImage result(picture.size(), QImage::Format_ARGB32);
    result.fill(Qt::gray);
    QPainter painter(&result);
    painter.drawImage(0, 0, picture);
    return result;
}

std::optional<QJsonObject> comparePictures(const QStringList& arguments)
{
    const auto one = load(arguments.at(0));
    const auto other = load(arguments.at(1));
    if (!one || !other || one->size() != other->size())
        return std::nullopt;
    return compare(onGrey(*one), onGrey(*other), arguments.at(2), [&](int x, int y) {
        return qAlpha(one->pixel(x, y)) == 0 && qAlpha(other->pixel(x, y)) == 0;
    });
}

} // namespace

int main(int argc, char* argv[])
{
    const QCoreApplication application(argc, argv);
    QStringList arguments = QCoreApplication::arguments().mid(1);
    const QString command = arguments.isEmpty() ? QString() : arguments.takeFirst();
    std::optional<QJsonObject> answer;
    if (command == QLatin1String("size") && arguments.size() == 1)
        answer = sizeOf(arguments);
    else if (command == QLatin1String("alpha") && arguments.size() == 1)
        answer = alphaOf(arguments);
    else if (command == QLatin1String("changed") && arguments.size() == 2)
        answer = changedBetween(arguments);
    else if (command == QLatin1String("pictures") && arguments.size() == 3)
        answer = comparePictures(arguments);
    else if (command == QLatin1String("screen") && arguments.size() == 7)
        answer = compareWithScreen(arguments);
    if (!answer) {
        QTextStream(stderr) << "titler_pngdiff: wrong use, or pictures that cannot be compared\n";
        return WRONG_USE;
    }
    QTextStream(stdout) << QJsonDocument(*answer).toJson(QJsonDocument::Compact) << "\n";
    return 0;
}
