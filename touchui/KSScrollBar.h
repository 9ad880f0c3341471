#pragma once

#include "touchui/OneFinger.h"

#include <QEvent>
#include <QPixmap>
#include <QScrollBar>

class QPainter;

// A scroll bar that is painted from pictures and operated with a finger or the mouse. GUI thread only.
class KSScrollBar : public QScrollBar
{
    Q_OBJECT
public:
    explicit KSScrollBar(QWidget* parent = nullptr);
    explicit KSScrollBar(Qt::Orientation orientation, QWidget* parent = nullptr);

    bool isPressed() const { return m_pressed; }
    // Returns the rectangle of the handle in widget coordinates.
    QRect handleRect() const;

    // handle is the rectangle of the handle in widget coordinates.
    virtual void paintHorizontal(QPainter* painter, QRect& handle);
    virtual void paintVertical(QPainter* painter, QRect& handle);

protected:
    bool event(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void keyReleaseEvent(QKeyEvent* event) override;

private:
    // The pictures of a handle: both ends, the centre, and the grip drawn over its middle.
    struct Handle {
        QPixmap first;
        QPixmap center;
        QPixmap last;
        QPixmap grip;
        QPixmap stretched; // the centre in the size in which it was painted last
    };
    void init();
    Handle& handlePictures();
    const QPixmap& track();
    static const QPixmap& stretchedCenter(Handle& handle, QSize size);
    void followFinger(QEvent::Type type);
    void sendMouse(QEvent::Type type, const QPoint& position);
    void letGo();

    OneFinger m_finger{this};
    bool m_pressed = false;
    Handle m_handles[2]; // at rest and pressed; loaded on first use
    QPixmap m_track;     // in the size of the bar
    bool m_loaded[2] = {false, false};
};
