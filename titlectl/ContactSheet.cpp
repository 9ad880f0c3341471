#include "titlectl/ContactSheet.h"

#include "document/Archive.h"
#include "document/PictureReader.h"
#include "document/PngWriter.h"
#include "document/TitleParser.h"
#include "library/PictureFiles.h"
#include "titlectl/SheetLayout.h"
#include "titlectl/TitleRenderer.h"

#include <QFileInfo>
#include <QFont>
#include <QFontMetricsF>
#include <QImage>
#include <QMarginsF>
#include <QPageLayout>
#include <QPageSize>
#include <QPainter>
#include <QPdfWriter>
#include <QSaveFile>
#include <utility>

namespace
{

constexpr int DOTS_PER_INCH = 150;
constexpr QSize PAGE(1754, 1240); // A4 across at this resolution
const QColor GROUND(72, 72, 72);  // behind transparent pictures
const QString FAMILY = QStringLiteral("KST");

// Returns the 960x540 picture of the title, from its file or drawn anew; null if neither can be read.
QImage pictureOf(const QString& title)
{
    Archive archive;
    if (TitleParser().readOneTitle(title.toStdString(), &archive) != 1)
        return {};
    const QString path = PictureFiles::path(archive, archive.getThumbnailMiddle());
    const QImage picture = path.isEmpty() ? QImage() : PictureReader::read(path);
    return picture.isNull() ? TitleRenderer().draw(archive).at(1) : picture;
}

void setTextSize(QPainter& painter, double height)
{
    QFont font(FAMILY);
    font.setPixelSize(qMax(1, static_cast<int>(height * 0.75)));
    painter.setFont(font);
    painter.setPen(Qt::black);
}

void drawElided(QPainter& painter, const QRectF& place, Qt::Alignment align, const QString& text)
{
    const QString shown =
        QFontMetricsF(painter.font(), painter.device()).elidedText(text, Qt::ElideMiddle, place.width());
    painter.drawText(place, static_cast<int>(align | Qt::AlignVCenter) | Qt::TextSingleLine, shown);
}

} // namespace

ContactSheet::ContactSheet(QString heading, QStringList titles)
    : m_heading(std::move(heading)), m_titles(std::move(titles))
{
}

int ContactSheet::pages() const
{
    return SheetLayout::pages(static_cast<int>(m_titles.size()));
}

QString ContactSheet::pagePath(const QString& path, int page, int pages)
{
    if (pages == 1)
        return path;
    const QFileInfo file(path);
    const QString suffix = file.suffix().isEmpty() ? QString() : QLatin1Char('.') + file.suffix();
    return path.chopped(suffix.size()) + QStringLiteral("-%1").arg(page + 1) + suffix;
}

QString ContactSheet::write(const QString& path, const Drawn& drawn)
{
    m_unreadable.clear();
    const bool isPdf = QFileInfo(path).suffix().compare(QLatin1String("pdf"), Qt::CaseInsensitive) == 0;
    return isPdf ? writePdf(path, drawn) : writePictures(path, drawn);
}

QString ContactSheet::writePdf(const QString& path, const Drawn& drawn)
{
    QSaveFile file(path);
    if (!file.open(QIODevice::WriteOnly))
        return QStringLiteral("%1: %2").arg(path, file.errorString());
    {
        QPdfWriter writer(&file);
        writer.setResolution(DOTS_PER_INCH);
        writer.setTitle(m_heading);
        writer.setPageLayout(
            QPageLayout(QPageSize(QPageSize::A4), QPageLayout::Landscape, QMarginsF(0, 0, 0, 0)));
        QPainter painter(&writer);
        painter.setRenderHint(QPainter::SmoothPixmapTransform);
        for (int page = 0; page < pages(); ++page) {
            if (page > 0)
                writer.newPage();
            drawPage(painter, page, drawn);
        }
    }
    return file.commit() ? QString() : QStringLiteral("%1: %2").arg(path, file.errorString());
}

QString ContactSheet::writePictures(const QString& path, const Drawn& drawn)
{
    for (int page = 0; page < pages(); ++page) {
        QImage image(PAGE, QImage::Format_RGB32);
        image.fill(Qt::white);
        QPainter painter(&image);
        painter.setRenderHint(QPainter::SmoothPixmapTransform);
        drawPage(painter, page, drawn);
        painter.end();
        const QString file = pagePath(path, page, pages());
        if (!PngWriter::save(image, file, AtomicFile::Durability::SyncNow))
            return QStringLiteral("%1 cannot be written").arg(file);
    }
    return {};
}

void ContactSheet::drawPage(QPainter& painter, int page, const Drawn& drawn)
{
    const SheetLayout layout{QSizeF(PAGE)};
    setTextSize(painter, layout.heading().height());
    drawElided(painter, layout.heading(), Qt::AlignLeft, m_heading);
    drawElided(painter, layout.heading(), Qt::AlignRight,
               QStringLiteral("%1 / %2").arg(page + 1).arg(pages()));
    setTextSize(painter, layout.nameHeight());
    const int first = page * SheetLayout::PER_PAGE;
    const int behind = qMin(first + SheetLayout::PER_PAGE, static_cast<int>(m_titles.size()));
    for (int index = first; index < behind; ++index) {
        drawTitle(painter, index, index - first);
        drawn(index + 1);
    }
}

void ContactSheet::drawTitle(QPainter& painter, int index, int place)
{
    const SheetLayout layout{QSizeF(PAGE)};
    const QString& title = m_titles.at(index);
    const QImage picture = pictureOf(title);
    if (picture.isNull()) {
        m_unreadable.append(title);
        painter.drawRect(layout.picture(place));
    } else {
        painter.fillRect(layout.picture(place), GROUND);
        painter.drawImage(layout.picture(place), picture);
    }
    drawElided(painter, layout.name(place), Qt::AlignLeft,
               QStringLiteral("%1. %2").arg(QString::number(index + 1), QFileInfo(title).completeBaseName()));
}
