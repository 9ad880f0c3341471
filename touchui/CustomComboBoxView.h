#pragma once

#include "touchui/Flicker.h"
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

    virtual void setAutoFlick(bool on) { m_flicker.setGliding(on); }
    virtual void setStartPoint(const QPoint& point) { m_flicker.setStart(point); }
    virtual void setEndPoint(const QPoint& point) { m_flicker.setEnd(point); }
    virtual bool isFlickEnd() const { return m_flicker.isEnd(); }
    virtual bool hasFlicked() const { return m_flicker.hasFlicked(); }
    virtual void stopFlick() { m_flicker.stop(); }
    virtual bool isAutoFilck() const { return m_flicker.isGliding(); }
    // By how much the list moves in this tick; the start point moves along.
    virtual QPoint getDistance();
    virtual QPoint getFlickDistance() { return FlickMotion::pixels(m_flicker.glide()); }
    virtual QPoint getDragDistance() { return FlickMotion::pixels(m_flicker.drag()); }
    // A positive offset moves the rows down.
    virtual void changeScrollBarValue(int offset);

Q_SIGNALS:
    // An enabled row was tapped.
    void signalTapped(const QModelIndex& index);

protected:
    bool viewportEvent(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    // Rules a line under the row; rect is the row's.
    virtual void drawSeparator(QPainter& painter, const QRect& rect);

private:
    bool viewportMouseEvent(QEvent* event);
    void rest();
    void showLastRowWhole();
    QPoint fingerPosition() const;
    void setPressedIndex(const QModelIndex& index);

    QPoint m_pressPoint;
    QPersistentModelIndex m_pressedIndex;
    QPixmap m_separator;
    OneFinger m_finger{this};
    Flicker m_flicker{this, FlickMotion::comboList()};
};
