#pragma once

#include <QPixmap>
#include <QWidget>

// Shows a picture in its upper left corner, over a checker pattern where the picture is transparent or does
// not reach. GUI thread only.
class CheckeredPicture : public QWidget
{
    Q_OBJECT

public:
    explicit CheckeredPicture(QWidget* parent = nullptr);

    // Null for the pattern alone.
    void setPicture(const QPixmap& picture);
    const QPixmap& picture() const { return m_picture; }

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QPixmap m_picture;
};
