#pragma once

#include <QImage>
#include <QWidget>

// Shows a picture in its upper left corner, over a checker pattern where the picture is transparent or does
// not reach. GUI thread only.
class CheckeredPicture : public QWidget
{
    Q_OBJECT

public:
    explicit CheckeredPicture(QWidget* parent = nullptr);

    // Null for the pattern alone.
    void setPicture(const QImage& picture);
    const QImage& picture() const { return m_picture; }

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    void prepare();

    QImage m_picture;
    bool m_isPrepared = true; // for painting
};
