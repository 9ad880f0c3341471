#pragma once

#include <QGraphicsPixmapItem>
#include <QString>
#include <memory>

class BackgroundPicture;

// Background picture of a title: selectable, never movable, painted without a selection frame.
class GraphicsPixmap : public QGraphicsPixmapItem
{
public:
    enum { Type = UserType + 20 };

    // Loads the picture at path; one that cannot be read gives an empty item.
    explicit GraphicsPixmap(const QString& path, QGraphicsItem* parent = nullptr);

    // Shows the given picture of the file at path.
    GraphicsPixmap(const QString& path, const QPixmap& picture, QGraphicsItem* parent = nullptr);

    // Returns the picture that was loaded, even if another pixmap is shown now; null if none was loaded.
    std::shared_ptr<const BackgroundPicture> source() const { return m_source; }
    QString getPixmapPath() const { return m_path; }

    int type() const override { return Type; }
    QRectF boundingRect() const override;
    void paint(QPainter* painter, const QStyleOptionGraphicsItem* option, QWidget* widget) override;

private:
    QString m_path;
    std::shared_ptr<const BackgroundPicture> m_source;
};
