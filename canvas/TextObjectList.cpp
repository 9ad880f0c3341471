#include "canvas/TextObjectList.h"

#include "canvas/GraphicsText.h"
#include "canvas/TextObjectConstants.h"
#include "document/TText.h"
#include "touchui/KSInputContext.h"

#include <QGraphicsScene>
#include <QTextCursor>
#include <algorithm>

using namespace TextObjectConstants;

TextObjectList::TextObjectList(const QGraphicsScene& scene) : m_scene(scene)
{
}

QList<QGraphicsItem*> TextObjectList::enableItems() const
{
    QList<QGraphicsItem*> enabled = m_scene.items();
    enabled.removeIf([](const QGraphicsItem* item) { return !item->isEnabled(); });
    return enabled;
}

QList<GraphicsText*> TextObjectList::enabledTexts() const
{
    QList<GraphicsText*> texts;
    const QList<QGraphicsItem*> enabled = enableItems();
    for (QGraphicsItem* item : enabled) {
        if (item->type() != GraphicsText::Type)
            continue;
        auto* text = static_cast<GraphicsText*>(item);
        if (!text->isParentObject())
            texts.append(text);
    }
    return texts;
}

GraphicsText* TextObjectList::find(int id) const
{
    const QList<GraphicsText*> texts = enabledTexts();
    const auto found = std::find_if(texts.begin(), texts.end(), [id](const GraphicsText* item) {
        return item->getItemTText()->getTextObjectID() == id;
    });
    return found == texts.end() ? nullptr : *found;
}

GraphicsText* TextObjectList::findTheActiveItem() const
{
    const auto found = std::find_if(m_listed.begin(), m_listed.end(),
                                    [](const GraphicsText* item) { return item->getStatusId() >= 0; });
    return found == m_listed.end() ? nullptr : *found;
}

int TextObjectList::freeId(int highest) const
{
    for (int id = 1; id <= highest; ++id) {
        const bool taken = std::any_of(m_listed.begin(), m_listed.end(), [id](const GraphicsText* item) {
            return item->getItemTText()->getTextObjectID() == id;
        });
        if (!taken)
            return id;
    }
    return -1;
}

double TextObjectList::maxZValue() const
{
    double top = 0.0;
    for (const GraphicsText* item : m_listed)
        top = std::max(top, double(item->getItemTText()->getZValue()));
    return top;
}

bool TextObjectList::isSelectionMode() const
{
    const QList<GraphicsText*> texts = enabledTexts();
    return std::any_of(texts.begin(), texts.end(),
                       [](const GraphicsText* item) { return item->getFocusFlag() == FocusObject; });
}

bool TextObjectList::isEditorInteraction() const
{
    const QList<GraphicsText*> texts = enabledTexts();
    return std::any_of(texts.begin(), texts.end(), [](const GraphicsText* item) {
        return item->textInteractionFlags() == Qt::TextEditorInteraction;
    });
}

void TextObjectList::restoreZ(GraphicsText* item)
{
    const double z = item->getItemTText()->getZValue();
    item->setZValue(z);
    if (GraphicsText* parent = item->parentTextItem())
        parent->setZValue(z);
}

void TextObjectList::release(GraphicsText* item)
{
    // An input method may still hold uncommitted input for the text.
    KSInputContext* context = KSInputContext::instance();
    if (context && item->textInteractionFlags() == Qt::TextEditorInteraction)
        context->commit();
    item->pushLastEditTextIntoStack();
    QTextCursor cursor = item->textCursor();
    if (cursor.hasSelection()) {
        cursor.clearSelection();
        item->setTextCursor(cursor);
    }
    item->setFocusFlag(FocusNone);
    item->setTextInteractionFlags(Qt::NoTextInteraction);
    item->parentFollows();
}

void TextObjectList::releaseAllBut(int id)
{
    const QList<GraphicsText*> texts = enabledTexts();
    for (GraphicsText* item : texts) {
        if (item->getItemTText()->getTextObjectID() != id)
            release(item);
        restoreZ(item);
        item->update();
    }
}

void TextObjectList::clearSelectionMode()
{
    const QList<GraphicsText*> texts = enabledTexts();
    for (GraphicsText* item : texts) {
        item->setFocusFlag(FocusNone);
        item->parentFollows();
        restoreZ(item);
        item->update();
    }
}

void TextObjectList::hide(GraphicsText* item)
{
    m_listed.removeAll(item);
    item->discardBurst();
    GraphicsText* parent = item->parentTextItem();
    if (!parent)
        return;
    parent->setFlag(QGraphicsItem::ItemHasNoContents);
    parent->setEnabled(false);
    parent->setVisible(false);
    parent->setTextInteractionFlags(Qt::NoTextInteraction);
}
