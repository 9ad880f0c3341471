#pragma once

#include <QGraphicsPixmapItem>
#include <QString>

// Background picture of a title: selectable, never movable, painted without a selection frame.
class GraphicsPixmap : public QGraphicsPixmapItem
{
public:
    enum { Type = UserType + 20 };

    // Loads the picture at path; one that cannot be read gives an empty item.
    explicit GraphicsPixmap(const QString& path, QGraphicsItem* parent = nullptr);

    QString getPixmapPath() const { return m_path; }

    int type() const override { return Type; }
    QRectF boundingRect() const override;
    void paint(QPainter* painter, const QStyleOptionGraphicsItem* option, QWidget* widget) override;

private:
    QString m_path;
};
