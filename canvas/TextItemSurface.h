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
    void repaintBlock(int position) override;
    void blockChanged(int position) override;
    void showShadow(const TShadow& shadow) override;

private:
    TouchTextItem* parentOfPair() const;
    // Called when the layout requests to repaint an area, in item coordinates.
    void repaintLayout(const QRectF& area);

    TouchTextItem& m_item;
    TextPainter& m_painter;
    QGraphicsDropShadowEffect& m_shadowEffect;
    bool m_isBlockRepainted = false; // until the layout requests to repaint everything
};
