#include "library/RasterScene.h"

#include "canvas/GraphicsPixmap.h"
#include "canvas/GraphicsText.h"
#include "document/Archive.h"
#include "document/TText.h"

#include <utility>

namespace
{

// Positions are converted from the 1280 canvas to the 1920 raster: times three to 3840, then half of it.
const double TO_DOUBLE_RASTER = 3.0;
const double TO_RASTER = 0.5;
const double RASTER_RATIO = 1.0;

} // namespace

RasterScene::RasterScene()
{
    m_scene.setSceneRect(QRectF(QPointF(0, 0), SIZE));
    // The scene is filled, drawn a few times and cleared, so an index would not pay off.
    m_scene.setItemIndexMethod(QGraphicsScene::NoIndex);
}

void RasterScene::show(const Archive& archive, const QPixmap& background)
{
    auto* picture = new GraphicsPixmap(archive.getFullPathOfBgResourceBig(), background);
    m_scene.addItem(picture);
    picture->setPos(0, 0);
    picture->setZValue(archive.getBgPointZ());
    for (TText* record : archive.text()) {
        auto* text = new GraphicsText(record, record->getTextObjectID());
        text->setRadio(RASTER_RATIO, true);
        text->setPos(record->getXValue() * TO_DOUBLE_RASTER * TO_RASTER,
                     record->getYValue() * TO_DOUBLE_RASTER * TO_RASTER);
        text->setZValue(record->getZValue());
        text->initShowText();
        m_scene.addItem(text);
        m_texts.append(text);
    }
    // A text far outside the raster takes no time to paint.
    for (GraphicsText* text : std::as_const(m_texts))
        text->setBoundingRectFlag(true);
}

void RasterScene::clear()
{
    m_texts.clear();
    m_scene.clear();
}
