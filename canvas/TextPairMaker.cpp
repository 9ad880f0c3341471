#include "canvas/TextPairMaker.h"

#include "canvas/CanvasScene.h"
#include "canvas/GraphicsText.h"
#include "canvas/InputLanguageFonts.h"
#include "canvas/NewTextStyle.h"
#include "document/TText.h"

#include <QTextDocument>
#include <QTransform>

namespace
{

// More steps than any number of objects can require.
constexpr int MAXIMUM_CASCADE = 1000;

} // namespace

TextPairMaker::TextPairMaker(CanvasScene& scene) : m_scene(scene)
{
}

GraphicsText* TextPairMaker::makeItems(TText& record) const
{
    auto* parent = new GraphicsText(true, nullptr, &m_scene);
    auto* child = new GraphicsText(&record, 0, parent, nullptr);
    const TText& shown = *child->getItemTText();
    parent->setPos(shown.getXValue(), shown.getYValue());
    parent->setZValue(shown.getZValue());
    child->setZValue(shown.getZValue());
    connectToScene(child);
    return child;
}

GraphicsText* TextPairMaker::make(TText& record) const
{
    GraphicsText* child = makeItems(record);
    child->initShowText();
    return child;
}

GraphicsText* TextPairMaker::make(TText& record, TText& lastAlpha, int ensureMode) const
{
    GraphicsText* child = makeItems(record);
    child->setLastAlpaTextStyleValue(lastAlpha);
    child->setFontFamilyEnsureMode(ensureMode);
    child->initShowText();
    return child;
}

GraphicsText* TextPairMaker::makeNew(int id, QPointF place, int z, NewTextStyle& style) const
{
    TText record;
    record.setText(std::string());
    style.applyTo(record);
    record.setTextObjectID(id);
    record.setXValue(float(place.x()));
    record.setYValue(float(place.y()));
    record.setZValue(float(z));
    InputLanguageFonts::mInputLanguage = style.languageRow();
    NewTextStyle::FirstCharacter first = style.firstCharacter();
    GraphicsText* child = make(record, first.record, first.ensureMode);

    GraphicsText* parent = child->parentTextItem();
    const QRectF area = parent->layoutRect();
    parent->moveBy(-area.width() / 2.0, -area.height() / 2.0);
    child->getItemTText()->setXValue(float(parent->x()));
    child->getItemTText()->setYValue(float(parent->y()));
    return child;
}

QPointF TextPairMaker::getInitItemScenePosition() const
{
    QPointF place = m_scene.sceneRect().center();
    for (int i = 0; i < MAXIMUM_CASCADE; ++i) {
        const QGraphicsItem* under = m_scene.itemAt(place, QTransform());
        if (!under || under->type() != GraphicsText::Type)
            break;
        place += QPointF(CanvasScene::OFFSET, -CanvasScene::OFFSET);
    }
    return place;
}

void TextPairMaker::connectToScene(GraphicsText* item) const
{
    using Text = GraphicsText;
    CanvasScene* const scene = &m_scene;
    const QTextDocument* document = item->document();
    QObject::connect(item, &Text::signalSoftWareClosedWhenEditObject, scene,
                     &CanvasScene::signalSceneSoftWareClosedWhenEditObject);
    QObject::connect(item, &Text::signalNotifyIfExistSelectedObject, scene,
                     &CanvasScene::signalSceneNotifyIfExistSelectedObject);
    QObject::connect(item, &Text::signalGetSceneInputLanguage, scene, &CanvasScene::slotSetItemInputlanguage);
    QObject::connect(item, &Text::signalObjectHasLostFocus, scene, &CanvasScene::slotObjectLostFocus);
    QObject::connect(item, &Text::signalObjectSelectedHasChanged, scene, &CanvasScene::signalItemSelected);
    QObject::connect(document, &QTextDocument::contentsChange, item, &Text::slotObjectDocumentChange);
    QObject::connect(item, &Text::signalNotifyPropertyAreaObjectSelectionStyleChange, scene,
                     &CanvasScene::signalNotifyPropertyAreaUpdateCurrentTextStyle);
    QObject::connect(document, &QTextDocument::contentsChange, scene, &CanvasScene::slotObjectContentsChange);
    QObject::connect(item, &Text::xChanged, item, &Text::slotObjectPositionChanged);
    QObject::connect(item, &Text::yChanged, item, &Text::slotObjectPositionChanged);
    QObject::connect(item, &Text::signalObjectPositionChanged, scene,
                     &CanvasScene::slotCreateMoveUndoCommand);
    QObject::connect(item, &Text::signalNotifySceneCurrentMousePressedObjectId, scene,
                     &CanvasScene::slotSetCurrentMousePressedObjectId);
    QObject::connect(item, &Text::signalObjectContentsEdited, scene, &CanvasScene::slotCreateEditUndoCommand);
    QObject::connect(item, &Text::signalNotifySceneCurrentObjectInEditMode, scene,
                     &CanvasScene::slotSendCustomEvent);
    QObject::connect(item, &Text::signalNotifyTextPropertyAreaObjectSelectionMode, scene,
                     &CanvasScene::signalSceneNotifyTextPropertyAreaObjectSelectionMode);
    QObject::connect(item, &Text::signalSaveArchive, scene, &CanvasScene::slotSaveArchive);
    QObject::connect(item, &Text::signalEndPreview, scene, &CanvasScene::endPreview);
    QObject::connect(item, &Text::signalDeleteItem, scene, &CanvasScene::slotDeleteEmptyItems);
    QObject::connect(item, &Text::signalShowMessageWhenUsingDefaultFont, scene,
                     &CanvasScene::slotShowMessageWhenUsingDefaultFont);
}
