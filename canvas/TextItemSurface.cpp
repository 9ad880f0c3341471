#include "canvas/TextItemSurface.h"

#include "canvas/TextPainter.h"
#include "canvas/TouchState.h"
#include "canvas/TouchTextItem.h"
#include "document/TShadow.h"

#include <QAbstractTextDocumentLayout>
#include <QGraphicsDropShadowEffect>
#include <QTextDocument>
#include <QTextOption>

namespace
{

// How far the caret is painted beyond its line.
constexpr double CARET_REACH = 6.0;

} // namespace

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
    QObject::connect(m_item.document(), &QTextDocument::contentsChanged, &m_item, [this] {
        if (m_requests == LayoutRequests::LastIgnored)
            m_requests = LayoutRequests::Followed; // the edit has ended without a request
    });
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

void TextItemSurface::repaintCaret(int position)
{
    TouchState::End caret;
    if (!m_painter.carets().caretPoint(caret.line, caret.point, caret.block, position))
        return;
    // The frame behind it is painted again with the scene.
    m_item.QGraphicsTextItem::update(QRectF(caret.line.p1(), caret.line.p2())
                                         .adjusted(-CARET_REACH, -CARET_REACH, CARET_REACH, CARET_REACH));
}

void TextItemSurface::blockChanged(int block, const QRectF& area)
{
    if (m_painter.invalidateParagraph(block))
        m_item.QGraphicsTextItem::update(area);
    else
        m_item.update();
}

void TextItemSurface::beginChange()
{
    m_requests = LayoutRequests::Ignored;
}

void TextItemSurface::endChange(bool isRepainted)
{
    m_requests = isRepainted ? LayoutRequests::LastIgnored : LayoutRequests::Followed;
}

void TextItemSurface::repaintLayout(const QRectF& area)
{
    switch (m_requests) {
    case LayoutRequests::Followed:
        m_item.QGraphicsTextItem::update(area);
        break;
    case LayoutRequests::Ignored:
        break;
    case LayoutRequests::LastIgnored:
        m_requests = LayoutRequests::Followed;
        break;
    }
}

void TextItemSurface::showShadow(const TShadow& shadow)
{
    const QPointF direction(shadow.getShadowDirectionX(), shadow.getShadowDirectionY());
    m_shadowEffect.setOffset(direction * canvasRatio());
    m_shadowEffect.setBlurRadius(shadow.getShadowBlurRadius());
    m_shadowEffect.setEnabled(!direction.isNull());
}
