#pragma once

#include "touchui/OneFinger.h"

#include <QEvent>
#include <QPoint>
#include <QRect>
#include <QSlider>

class KSSliderStyle;

// A slider that is operated with one finger: touches are converted to mouse events, the handle keeps its
// distance to the finger, and a balloon shows the value while the handle is held. Positions are in widget
// coordinates.
//
// The image string is "<folder>:<handle at rest>:<pressed>:<disabled>:<groove left>:<centre>:<right>"; a name
// stands for ":/<folder>/<name>". For a vertical slider the last three are top, centre and bottom.
class KSSLider : public QSlider
{
    Q_OBJECT
public:
    explicit KSSLider(QWidget* parent = nullptr);
    explicit KSSLider(const QString& images, Qt::Orientation orientation = Qt::Horizontal,
                      QWidget* parent = nullptr);

    // Sets the pictures; an empty string selects the plain look.
    void Initialization(const QString& images, Qt::Orientation orientation = Qt::Horizontal);

    // Shows marks at each interval of the range; 0 or less removes them.
    void setTick(int interval, QSlider::TickPosition position = QSlider::TicksBelow);
    // Returns the mark of a value; null without marks.
    QRect getTickRect(int value) const;
    QRect handleRect() const;

    // If false, presses have no effect; the look does not change.
    void setReponse(bool response);
    bool response() const { return m_response; }

    // Requests the balloon's text with signalDrawTip. Without a receiver the balloon shows the value.
    void ShowTip();
    // Shows the text in the balloon at the handle; an empty text hides the balloon.
    void DrawTipText(const QString& text);

    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

Q_SIGNALS:
    // Emitted when the balloon is to be shown for the held handle; a receiver calls DrawTipText.
    void signalDrawTip(KSSLider* slider);
    void signalDrawTipText(QString text);
    void signalMousePressed();
    void signalMouseRelease();

protected:
    // Enlarges the area in which a press takes the handle.
    virtual void changeHandleRect(QRect& rect) const;

    bool event(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void changeEvent(QEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    void initStyleOption(QStyleOptionSlider* option) const override;

private:
    void sendMouse(QEvent::Type type);
    void letGo();
    int valueAt(const QPoint& position) const;

    KSSliderStyle* m_style; // child of this object
    OneFinger m_finger{this};
    bool m_response = true;
    bool m_pressed = false;  // so that press and release signals come in pairs
    bool m_dragging = false; // the handle is held
    QPoint m_clickOffset;    // vector from the handle's centre to the press
};
