#pragma once

#include "touchui/OneFinger.h"

#include <QEvent>
#include <QHeaderView>

class KSTreeView;
class QTouchEvent;

// The header of a KSTreeView, which a finger operates like a mouse: a tap on a section sorts by it.
class KSTreeHeaderView : public QHeaderView
{
    Q_OBJECT
public:
    explicit KSTreeHeaderView(KSTreeView* view);

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
    OneFinger m_finger{this};
};
