#include "titlectl/TitleInk.h"

#include "canvas/BackgroundPicture.h"
#include "canvas/GraphicsText.h"
#include "canvas/TextObjectConstants.h"
#include "document/Archive.h"

#include <QGraphicsDropShadowEffect>
#include <QGraphicsItem>
#include <QPainter>
#include <QPixmap>
#include <QTextBlock>
#include <QTextDocument>
#include <algorithm>
#include <cstdlib>
#include <utility>

using namespace TextObjectConstants;

namespace
{

constexpr int FAINT = 16; // alpha of pixels that only smooth an edge
constexpr QRect RASTER(QPoint(0, 0), RasterScene::SIZE);

void showOnly(QGraphicsScene& scene, const QGraphicsItem* shown)
{
    for (QGraphicsItem* item : scene.items())
        item->setVisible(item == shown);
}

void showAllBut(QGraphicsScene& scene, const QGraphicsItem* hidden)
{
    for (QGraphicsItem* item : scene.items())
        item->setVisible(item != hidden);
}

} // namespace

TitleInk::TitleInk(const Archive& archive)
{
    const QString background = archive.getFullPathOfBgResourceBig();
    m_raster.show(archive, background.isEmpty() ? QPixmap() : BackgroundPicture::load(background)->pixmap());
    for (qsizetype i = 0; i < m_raster.texts().size(); ++i)
        m_texts.push_back(measure(i));
    m_raster.clear();
}

TitleInk::Text TitleInk::measure(qsizetype index)
{
    GraphicsText* item = m_raster.texts().at(index);
    QGraphicsScene& scene = m_raster.scene();
    Text text;
    // The margins at the sides leave room for the handles of the canvas.
    const double side = BIG_DOCUMENT_MARGIN + item->document()->begin().blockFormat().leftMargin();
    text.layout = item->layoutRect()
                      .translated(item->scenePos())
                      .adjusted(side, BIG_DOCUMENT_MARGIN, -side, -BIG_DOCUMENT_MARGIN);

    const bool hasShadow = item->shadowEffect()->isEnabled();
    item->shadowEffect()->setEnabled(false);
    showOnly(scene, item);
    const QRect area = RASTER.adjusted(-BORDER, -BORDER, BORDER, BORDER);
    text.ink = inkIn(draw(area)).translated(area.topLeft());
    item->shadowEffect()->setEnabled(hasShadow);

    if (const QRect seen = text.ink.intersected(RASTER); !seen.isEmpty()) {
        showAllBut(scene, item);
        const QImage without = draw(seen);
        showAllBut(scene, nullptr);
        text.contrast = largestDifference(draw(seen), without);
    }
    showAllBut(scene, nullptr);
    return text;
}

// Draws a part of the scene, which may extend beyond the raster.
QImage TitleInk::draw(const QRect& area)
{
    QImage image(area.size(), QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    m_raster.scene().render(&painter, QRectF(QPointF(0, 0), QSizeF(area.size())), area,
                            Qt::IgnoreAspectRatio);
    return image;
}

QRect TitleInk::inkIn(const QImage& image)
{
    int left = image.width();
    int right = -1;
    int top = -1;
    int bottom = -1;
    for (int y = 0; y < image.height(); ++y) {
        const auto* line = reinterpret_cast<const QRgb*>(image.constScanLine(y));
        for (int x = 0; x < image.width(); ++x) {
            if (qAlpha(line[x]) <= FAINT)
                continue;
            left = std::min(left, x);
            right = std::max(right, x);
            top = top < 0 ? y : top;
            bottom = y;
        }
    }
    return right < 0 ? QRect() : QRect(QPoint(left, top), QPoint(right, bottom));
}

int TitleInk::largestDifference(const QImage& a, const QImage& b)
{
    int largest = 0;
    for (int y = 0; y < std::min(a.height(), b.height()); ++y) {
        const uchar* first = a.constScanLine(y);
        const uchar* second = b.constScanLine(y);
        for (int i = 0; i < 4 * std::min(a.width(), b.width()); ++i)
            largest = std::max(largest, std::abs(first[i] - second[i]));
    }
    return largest;
}
