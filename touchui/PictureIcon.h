#pragma once

#include <QIcon>
#include <QIconEngine>
#include <QString>

// The engine of an icon with one picture, which is read and decoded when it is first needed: a window that is
// made hidden does not decode the icons of states that it may never show. The icon owns the engine:
// QIcon(new PictureIcon(path)). Unlike an icon that is given a path, it does not read the database of MIME
// types for a name without suffix. A missing picture makes an empty icon. GUI thread only.
class PictureIcon : public QIconEngine
{
public:
    explicit PictureIcon(const QString& path) : m_path(path) {}

    void paint(QPainter* painter, const QRect& rect, QIcon::Mode mode, QIcon::State state) override;
    QPixmap pixmap(const QSize& size, QIcon::Mode mode, QIcon::State state) override;
    QSize actualSize(const QSize& size, QIcon::Mode mode, QIcon::State state) override;
    QList<QSize> availableSizes(QIcon::Mode mode, QIcon::State state) override;
    bool isNull() override;
    QIconEngine* clone() const override;

private:
    const QIcon& picture();

    QString m_path;
    QIcon m_picture;
    bool m_isRead = false;
};
