#pragma once

#include <QColor>
#include <QGraphicsDropShadowEffect>
#include <QPixmap>
#include <QPointF>
#include <QRect>
#include <QTransform>

class GraphicsText;

// The shadow of a text object. Moving an object does not change its look, so the picture for a window is
// cached until its text, its styles or its shadow change; while the object is edited it is drawn anew each
// time. Nothing is cached for other devices, which are painted once. GUI thread only.
class TextShadowEffect : public QGraphicsDropShadowEffect
{
    Q_OBJECT
public:
    // The item owns the effect and outlives it.
    explicit TextShadowEffect(GraphicsText& item);

protected:
    void draw(QPainter* painter) override;

private:
    // Everything that the picture depends on.
    struct Key {
        quint64 content = 0;
        // Includes the fractional part of the item's position.
        QTransform transform;
        QPointF offset;
        double blurRadius = 0.0;
        QColor color;

        bool operator==(const Key&) const = default;
    };

    bool isWorthKeeping(const QPainter& painter) const;
    void drawOnce(QPainter& painter);
    void drawPicture(const QPainter& painter, QRect area);

    GraphicsText& m_item;
    Key m_key;
    QPixmap m_picture;
    // Rectangle of the picture in device pixels, relative to the item's position rounded to whole pixels.
    QRect m_area;
};
