#pragma once

#include <QColor>
#include <QGraphicsDropShadowEffect>
#include <QPixmap>
#include <QPointF>
#include <QRect>
#include <QTransform>

class GraphicsText;

// The shadow of a text object. An object that is only moved looks as before, so what it shows in a window is
// kept as a picture until its text, its styles or its shadow change; while it is edited it is drawn anew each
// time. Other devices get no picture of their own: they are painted once. GUI thread only.
class TextShadowEffect : public QGraphicsDropShadowEffect
{
    Q_OBJECT
public:
    // The item outlives its effect.
    explicit TextShadowEffect(GraphicsText& item);

protected:
    void draw(QPainter* painter) override;

private:
    // All that the picture depends on.
    struct Key {
        quint64 content = 0;
        // With the fractions of a pixel of its place.
        QTransform transform;
        QPointF offset;
        double blurRadius = 0.0;
        QColor color;

        bool operator==(const Key&) const = default;
    };

    bool isWorthKeeping(const QPainter& painter) const;
    void drawPicture(const QPainter& painter, QRect area);

    GraphicsText& m_item;
    Key m_key;
    QPixmap m_picture;
    // Place of the picture, in device pixels from the whole pixels of the item's place.
    QRect m_area;
};
