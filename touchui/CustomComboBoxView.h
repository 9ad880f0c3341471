#pragma once

#include "touchui/Flicker.h"
#include "touchui/OneFinger.h"

#include <QListView>
#include <QPersistentModelIndex>
#include <QPixmap>

class QTouchEvent;

// The list of a combo box, operated with one finger: a drag scrolls it, a flick lets it glide, and a tap
// chooses a row. The mouse works in the same way. Points are in viewport coordinates.
class CustomComboBoxView : public QListView
{
    Q_OBJECT
public:
    explicit CustomComboBoxView(QWidget* parent = nullptr);

    // Returns the row under a press that may still become a tap; invalid otherwise.
    QModelIndex pressedIndex() const { return m_pressedIndex; }

    virtual bool onTouchEvent(QTouchEvent* event);
    virtual void onTouchBeginEvent(QTouchEvent* event);
    virtual void onTouchUpdateEvent(QTouchEvent* event);
    virtual void onTouchEndEvent(QTouchEvent* event);

    // Report the steps of a press, by a finger or the mouse.
    void pressAt(const QPoint& position);
    void moveTo(const QPoint& position);
    void releaseAt(const QPoint& position);
    // Ends the press without a tap and without a flick.
    void cancelTouch();

    virtual void setAutoFlick(bool on) { m_flicker.setGliding(on); }
    virtual void setStartPoint(const QPoint& point) { m_flicker.setStart(point); }
    virtual void setEndPoint(const QPoint& point) { m_flicker.setEnd(point); }
    virtual bool isFlickEnd() const { return m_flicker.isEnd(); }
    virtual bool hasFlicked() const { return m_flicker.hasFlicked(); }
    virtual void stopFlick() { m_flicker.stop(); }
    virtual bool isAutoFilck() const { return m_flicker.isGliding(); }
    // Returns the distance by which the list moves in this tick, and advances the start point.
    virtual QPoint getDistance();
    virtual QPoint getFlickDistance() { return FlickMotion::pixels(m_flicker.glide()); }
    virtual QPoint getDragDistance() { return FlickMotion::pixels(m_flicker.drag()); }
    // Moves the rows down by offset pixels.
    virtual void changeScrollBarValue(int offset);

Q_SIGNALS:
    // Emitted when an enabled row was tapped.
    void signalTapped(const QModelIndex& index);

protected:
    bool viewportEvent(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    // Draws a line at the bottom of a row; rect is that of the row.
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
