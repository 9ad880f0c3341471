#include "bench/PeerBatch.h"

#include "bench/BareFiles.h"
#include "bench/BenchTitles.h"
#include "bench/PlainTitle.h"
#include "document/TText.h"
#include "document/TextStyle.h"
#include "document/TitleParser.h"
#include "library/ThumbnailRender.h"
#include "support/FileSyncQueue.h"

#include <QCoreApplication>
#include <QImage>
#include <chrono>

namespace
{

constexpr int CHARACTERS = 24;
constexpr int SIZE = 96; // pixels of the 1920 raster
constexpr int EDGE_WIDTH = 4;
constexpr int SHADOW = 4; // pixels of the 1920 raster
constexpr int LEFT = 30;
constexpr int LINE = 255;        // from one text to the next
constexpr double BASELINE = 1.0; // of the size, below the top of a text
constexpr double CANVAS = 2.0 / 3.0;
constexpr int UNWRITTEN = 2; // titles that may wait for the thread that writes
constexpr std::chrono::seconds SYNC_TIME(30);
constexpr int FIRST_NUMBER = 100;

QString pathOf(const QString& folder, int number, const char* suffix)
{
    return QStringLiteral("%1/20240101090000%2%3")
        .arg(folder)
        .arg(FIRST_NUMBER + number)
        .arg(QLatin1String(suffix));
}

// The text of one title for a file of XML, without line breaks.
QString markup(const TText& text)
{
    return QString::fromStdString(text.getText()).toHtmlEscaped();
}

int top(std::size_t text)
{
    return LEFT / 2 + LINE * static_cast<int>(text);
}

QByteArray clip(const Archive& title)
{
    QString xml =
        QStringLiteral("<kdenlivetitle duration=\"1\" LC_NUMERIC=\"C\" width=\"1920\" height=\"1080\" "
                       "out=\"0\">\n");
    for (std::size_t i = 0; i < title.text().size(); ++i)
        xml +=
            QStringLiteral(
                " <item type=\"QGraphicsTextItem\" z-index=\"%1\"><position x=\"%2\" y=\"%3\">"
                "<transform>1,0,0,0,1,0,0,0,1</transform></position><content font=\"KST\" "
                "font-pixel-size=\"%4\" font-color=\"255,255,255,255\" font-weight=\"50\" font-italic=\"0\" "
                "font-underline=\"0\" font-outline=\"%5\" font-outline-color=\"16,32,64,255\" "
                "letter-spacing=\"0\" line-spacing=\"0\" box-width=\"1800\" box-height=\"140\" "
                "alignment=\"1\" shadow=\"%6;#ff000000;%7;%7;%7\">%8</content></item>\n")
                .arg(i + 1)
                .arg(LEFT)
                .arg(top(i))
                .arg(SIZE)
                .arg(i == 0 ? EDGE_WIDTH : 0)
                .arg(i == 1 ? 1 : 0)
                .arg(SHADOW)
                .arg(markup(*title.text()[i]));
    xml += QStringLiteral(" <startviewport rect=\"0,0,1920,1080\"/><endviewport rect=\"0,0,1920,1080\"/>"
                          "<background color=\"0,0,0,0\"/>\n</kdenlivetitle>\n");
    return xml.toUtf8();
}

QByteArray svg(const Archive& title)
{
    QString xml =
        QStringLiteral("<svg xmlns=\"http://www.w3.org/2000/svg\" width=\"1920\" height=\"1080\" "
                       "viewBox=\"0 0 1920 1080\">\n<filter id=\"shadow\"><feGaussianBlur in=\"SourceAlpha\" "
                       "stdDeviation=\"%1\"/><feOffset dx=\"%2\" dy=\"%2\"/><feMerge><feMergeNode/>"
                       "<feMergeNode in=\"SourceGraphic\"/></feMerge></filter>\n"
                       "<g font-family=\"KST\" font-size=\"%3\" fill=\"#fff\">\n")
            .arg(SHADOW / 2)
            .arg(SHADOW)
            .arg(SIZE);
    for (std::size_t i = 0; i < title.text().size(); ++i) {
        QString look;
        if (i == 0)
            look = QStringLiteral(" stroke=\"#102040\" stroke-width=\"%1\" paint-order=\"stroke\"")
                       .arg(EDGE_WIDTH);
        else if (i == 1)
            look = QStringLiteral(" filter=\"url(#shadow)\"");
        xml += QStringLiteral("<text x=\"%1\" y=\"%2\"%3>%4</text>\n")
                   .arg(LEFT)
                   .arg(top(i) + SIZE * BASELINE)
                   .arg(look, markup(*title.text()[i]));
    }
    return (xml + QStringLiteral("</g>\n</svg>\n")).toUtf8();
}

} // namespace

Archive PeerBatch::title(const QString& folder, int number)
{
    Archive archive = BenchTitles::title(titlePath(folder, number).toStdString(), 0, SIZE, 0);
    std::vector<TText*> texts;
    for (int i = 0; i < BenchTitles::TEXTS; ++i) {
        const BenchTitles::Look look{.characters = CHARACTERS,
                                     .size = SIZE,
                                     .edgeWidth = i == 0 ? EDGE_WIDTH : 0,
                                     .shadow = i == 1,
                                     .mixed = false,
                                     .firstLetter = number * BenchTitles::TEXTS + i};
        const auto y = static_cast<float>(top(static_cast<std::size_t>(i)) * CANVAS);
        texts.push_back(BenchTitles::text(i + 1, static_cast<float>(LEFT * CANVAS), y, look).release());
    }
    archive.setText(std::move(texts));
    return archive;
}

QString PeerBatch::titlePath(const QString& folder, int number)
{
    return pathOf(folder, number, ".xml");
}

QString PeerBatch::clipPath(const QString& folder, int number)
{
    return pathOf(folder, number, ".kdenlivetitle");
}

QString PeerBatch::svgPath(const QString& folder, int number)
{
    return pathOf(folder, number, ".svg");
}

QString PeerBatch::picturePath(const QString& folder, const QString& program, int number, int picture)
{
    return QStringLiteral("%1/%2_%3_%4.png").arg(folder, program).arg(picture).arg(number);
}

bool PeerBatch::writeTitles(const QString& folder, int count)
{
    BenchTitles::writeChecker();
    TitleParser parser;
    for (int i = 0; i < count; ++i) {
        Archive archive = title(folder, i);
        if (parser.writeOneTitle(&archive) != 1 || !BareFiles::write(clipPath(folder, i), clip(archive)) ||
            !BareFiles::write(svgPath(folder, i), svg(archive)))
            return false;
    }
    return true;
}

int PeerBatch::drawOurs(const QString& folder, int first, int end)
{
    ThumbnailRender render;
    TitleParser parser;
    const auto waitForRoom = [&render](int unwritten) {
        while (render.unfinishedTitles() > unwritten)
            QCoreApplication::processEvents(QEventLoop::AllEvents, 1);
    };
    for (int i = first; i < end; ++i) {
        Archive archive;
        if (parser.readOneTitle(titlePath(folder, i).toStdString(), &archive) != 1)
            return 1;
        render.makeThumbnail(&archive, true);
        waitForRoom(UNWRITTEN);
    }
    waitForRoom(0);
    return FileSyncQueue::flush(SYNC_TIME) ? 0 : 1;
}

int PeerBatch::drawByQt(const QString& folder, int first, int end)
{
    for (int i = first; i < end; ++i) {
        const QImage big = PlainTitle(title(folder, i), 1).draw(ThumbnailRender::THUMBNAIL_BIG_SIZE, {});
        int picture = 0;
        for (const QImage& image : QList<QImage>{big} + PlainTitle::reduced(big))
            if (!image.save(picturePath(folder, QStringLiteral("qt"), i, picture++)))
                return 1;
    }
    return 0;
}
