#pragma once

#include "touchui/OneFinger.h"

#include <QListView>
#include <QPersistentModelIndex>
#include <QPixmap>

class QTouchEvent;

// The list of a combo box, for one finger: it follows the finger, runs on after it and takes a tap as a
// choice. The mouse drags and taps it the same way. Points are in viewport coordinates.
class CustomComboBoxView : public QListView
{
    Q_OBJECT
public:
    explicit CustomComboBoxView(QWidget* parent = nullptr);
    ~CustomComboBoxView() override;

    // The row under a finger that may yet become a tap; invalid otherwise.
    QModelIndex pressedIndex() const { return m_pressedIndex; }

    virtual bool onTouchEvent(QTouchEvent* event);
    virtual void onTouchBeginEvent(QTouchEvent* event);
    virtual void onTouchUpdateEvent(QTouchEvent* event);
    virtual void onTouchEndEvent(QTouchEvent* event);

    // A finger's life; the mouse lives it, too.
    void pressAt(const QPoint& position);
    void moveTo(const QPoint& position);
    void releaseAt(const QPoint& position);
    // Ends it without a tap and without a flick.
    void cancelTouch();

    virtual void setAutoFlick(bool on);
    virtual void setStartPoint(const QPoint& point);
    virtual void setEndPoint(const QPoint& point);
    virtual bool isFlickEnd() const;
    virtual bool hasFlicked() const { return m_hasFlicked; }
    virtual void stopFlick();
    virtual bool isAutoFilck() const { return m_autoFlick; }
    // By how much the list moves in this tick; the start point moves along.
    virtual QPoint getDistance();
    virtual QPoint getFlickDistance();
    virtual QPoint getDragDistance();
    // A positive offset moves the rows down.
    virtual void changeScrollBarValue(int offset);

Q_SIGNALS:
    // An enabled row was tapped.
    void signalTapped(const QModelIndex& index);

protected:
    bool viewportEvent(QEvent* event) override;
    void timerEvent(QTimerEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    // Rules a line under the row; rect is the row's.
    virtual void drawSeparator(QPainter& painter, const QRect& rect);

private:
    bool viewportMouseEvent(QEvent* event);
    void rest();
    QPoint fingerPosition() const;
    void setPressedIndex(const QModelIndex& index);

    QPoint m_startPoint;
    QPoint m_endPoint;
    QPoint m_pressPoint;
    int m_flickTimerId = 0; // 0 is not running
    QPersistentModelIndex m_pressedIndex;
    QPixmap m_separator;
    OneFinger m_finger{this};
    int m_scrollValue = 0;
    bool m_down = false;
    bool m_autoFlick = false;
    bool m_hasFlicked = false;
    bool m_brake = false; // this touch stopped a flick
};
