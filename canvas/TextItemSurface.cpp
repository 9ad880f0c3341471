#include "canvas/TextItemSurface.h"

#include "canvas/TextObjectConstants.h"
#include "canvas/TextPainter.h"
#include "canvas/TouchTextItem.h"
#include "document/TShadow.h"

#include <QAbstractTextDocumentLayout>
#include <QGraphicsDropShadowEffect>
#include <QTextBlock>
#include <QTextDocument>
#include <QTextOption>
#include <utility>

using namespace TextObjectConstants;

TextItemSurface::TextItemSurface(TouchTextItem& item, TextPainter& painter,
                                 QGraphicsDropShadowEffect& shadowEffect)
    : m_item(item), m_painter(painter), m_shadowEffect(shadowEffect)
{
    // Qt's item would repaint the object without what is painted around its glyphs.
    QAbstractTextDocumentLayout* layout = m_item.document()->documentLayout();
    const QObjectList parts = m_item.children();
    for (QObject* part : parts)
        QObject::disconnect(layout, &QAbstractTextDocumentLayout::update, part, nullptr);
    QObject::connect(layout, &QAbstractTextDocumentLayout::update, &m_item,
                     [this](const QRectF& area) { repaintLayout(area); });
}

TouchTextItem* TextItemSurface::parentOfPair() const
{
    return qgraphicsitem_cast<TouchTextItem*>(m_item.parentItem());
}

QTextCursor TextItemSurface::selection() const
{
    return m_item.textCursor();
}

void TextItemSurface::select(const QTextCursor& cursor)
{
    m_item.setTextCursor(cursor);
}

int TextItemSurface::getFocusFlag() const
{
    return m_item.getFocusFlag();
}

void TextItemSurface::setFocusFlag(int flag)
{
    m_item.setFocusFlag(flag);
}

bool TextItemSurface::isWritable() const
{
    return m_item.textInteractionFlags() == Qt::TextEditorInteraction;
}

void TextItemSurface::setWritable(bool writable)
{
    m_item.setTextInteractionFlags(writable ? Qt::TextEditorInteraction : Qt::NoTextInteraction);
}

void TextItemSurface::takeFocus()
{
    m_item.setFocus();
}

void TextItemSurface::giveUpFocus()
{
    m_item.clearFocus();
}

double TextItemSurface::canvasRatio() const
{
    return m_painter.ratio();
}

void TextItemSurface::handleByTextItem(QEvent::Type type, QEvent& event)
{
    m_item.handleByTextItem(type, event);
}

void TextItemSurface::announceGeometryChange()
{
    if (TouchTextItem* parent = parentOfPair())
        parent->announceGeometryChange();
}

void TextItemSurface::layoutChanged()
{
    parentFollows();
    m_painter.invalidate();
    m_item.update();
}

void TextItemSurface::parentFollows()
{
    TouchTextItem* parent = parentOfPair();
    if (!parent)
        return;
    parent->setFocusFlag(m_item.getFocusFlag());
    if (parent->textInteractionFlags() != m_item.textInteractionFlags())
        parent->setTextInteractionFlags(m_item.textInteractionFlags());
    const QTextOption option = m_item.document()->defaultTextOption();
    QTextDocument& frame = *parent->document();
    if (frame.defaultTextOption().alignment() != option.alignment())
        frame.setDefaultTextOption(option);
    // The child has no text width of its own while its lines begin at the left margin.
    if (frame.textWidth() != m_item.layoutRect().width())
        frame.setTextWidth(m_item.layoutRect().width());
    parent->update();
}

void TextItemSurface::repaint()
{
    m_item.update();
}

void TextItemSurface::repaintBlock(int position)
{
    const QTextDocument& document = *m_item.document();
    const QTextBlock block = document.findBlock(position);
    if (!block.isValid()) {
        m_item.update();
        return;
    }
    const QRectF whole = m_item.layoutRect();
    const QRectF lines = document.documentLayout()->blockBoundingRect(block);
    const double reach = lines.height() / 2.0 + HANDLEPIXMAPHEIGHT;
    // The frame behind it is painted again with the scene.
    m_item.QGraphicsTextItem::update(QRectF(whole.left(), lines.top(), whole.width(), lines.height())
                                         .adjusted(-reach, -reach, reach, reach));
}

void TextItemSurface::blockChanged(int position)
{
    const QTextBlock block = m_item.document()->findBlock(position);
    if (m_painter.invalidateParagraph(block.blockNumber()))
        repaintBlock(position);
    else
        m_item.update();
    m_isBlockRepainted = true;
}

// At the end of an edit the layout requests a repaint of everything, because it finds nothing left to do: the
// block was laid out when its formats were applied. That is the request after blockChanged().
void TextItemSurface::repaintLayout(const QRectF& area)
{
    const bool isEverything = area.topLeft().isNull() && area.height() > m_item.layoutRect().height();
    if (!std::exchange(m_isBlockRepainted, false) || !isEverything)
        m_item.QGraphicsTextItem::update(area);
}

void TextItemSurface::showShadow(const TShadow& shadow)
{
    const QPointF direction(shadow.getShadowDirectionX(), shadow.getShadowDirectionY());
    m_shadowEffect.setOffset(direction * canvasRatio());
    m_shadowEffect.setBlurRadius(shadow.getShadowBlurRadius());
    m_shadowEffect.setEnabled(!direction.isNull());
}
