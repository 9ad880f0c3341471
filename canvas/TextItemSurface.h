#pragma once

#include "canvas/ITextSurface.h"

#include <QTextCursor>

class QGraphicsDropShadowEffect;
class QRectF;
class TextPainter;
class TouchTextItem;

// The item of a text object as its units see it: its cursor and focus, what of it has to be repainted, and
// its parent, which follows it. GUI thread only.
class TextItemSurface : public ITextSurface
{
public:
    // All of them outlive this object.
    TextItemSurface(TouchTextItem& item, TextPainter& painter, QGraphicsDropShadowEffect& shadowEffect);

    QTextCursor selection() const override;
    void select(const QTextCursor& cursor) override;
    int getFocusFlag() const override;
    void setFocusFlag(int flag) override;
    bool isWritable() const override;
    void setWritable(bool writable) override;
    void takeFocus() override;
    void giveUpFocus() override;
    double canvasRatio() const override;
    void handleByTextItem(QEvent::Type type, QEvent& event) override;
    void announceGeometryChange() override;
    void layoutChanged() override;
    void parentFollows() override;
    void repaint() override;
    void repaintCaret(int position) override;
    void blockChanged(int block, const QRectF& area) override;
    void showShadow(const TShadow& shadow) override;

    // Call when the document reports a change, before and after it is read back: what the layout requests to
    // repaint in between, and at the end of the edit, is left to layoutChanged() and blockChanged().
    // isRepainted: whether one of them was called.
    void beginChange();
    void endChange(bool isRepainted);

private:
    // What happens when the layout requests a repaint.
    enum class LayoutRequests {
        Followed,
        Ignored,    // while a change is read back
        LastIgnored // at the end of the edit the layout requests everything, since it finds nothing left to
                    // do
    };

    TouchTextItem* parentOfPair() const;
    // Called when the layout requests to repaint an area, in item coordinates.
    void repaintLayout(const QRectF& area);

    TouchTextItem& m_item;
    TextPainter& m_painter;
    QGraphicsDropShadowEffect& m_shadowEffect;
    LayoutRequests m_requests = LayoutRequests::Followed;
};
