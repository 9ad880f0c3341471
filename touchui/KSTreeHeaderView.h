#pragma once

#include "touchui/OneFinger.h"

#include <QEvent>
#include <QHeaderView>

class KSTreeView;
class KSViewStyle;
class QTouchEvent;

// The header of a KSTreeView, which a finger operates like a mouse: a tap on a section sorts by it.
class KSTreeHeaderView : public QHeaderView
{
    Q_OBJECT
public:
    // The view owns the header and the style.
    KSTreeHeaderView(KSTreeView* view, const KSViewStyle* style);

    virtual bool onTouchEvent(QTouchEvent* event);

protected:
    bool event(QEvent* event) override;
    bool viewportEvent(QEvent* event) override;
    void paintSection(QPainter* painter, const QRect& rect, int logicalIndex) const override;
    void paintEvent(QPaintEvent* event) override;
    QSize sizeHint() const override;

private:
    bool takes(QEvent* event);
    void sendMouse(QEvent::Type type, const QPointF& globalPosition);

    KSTreeView* m_view;
    const KSViewStyle* m_style;
    OneFinger m_finger{this};
};
