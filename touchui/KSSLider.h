#pragma once

#include "touchui/OneFinger.h"

#include <QEvent>
#include <QPoint>
#include <QRect>
#include <QSlider>

class KSSliderStyle;

// A slider for one finger: touches become mouse events of the slider, its handle keeps its distance to the
// finger, and a balloon tells the value while it is held. Positions are in widget coordinates.
//
// The image string is "<folder>:<handle at rest>:<pressed>:<disabled>:<groove left>:<centre>:<right>"; a name
// stands for ":/<folder>/<name>". A vertical slider takes the last three as top, centre and bottom.
class KSSLider : public QSlider
{
    Q_OBJECT
public:
    explicit KSSLider(QWidget* parent = nullptr);
    explicit KSSLider(const QString& images, Qt::Orientation orientation = Qt::Horizontal,
                      QWidget* parent = nullptr);

    // Takes new pictures; an empty string the plain look.
    void Initialization(const QString& images, Qt::Orientation orientation = Qt::Horizontal);

    // Marks at each interval of the range; 0 or less takes them off.
    void setTick(int interval, QSlider::TickPosition position = QSlider::TicksBelow);
    // The mark of a value; null without marks.
    QRect getTickRect(int value) const;
    QRect handleRect() const;

    // While off, presses do nothing; the look stays.
    void setReponse(bool response);
    bool response() const { return m_response; }

    // Asks for the balloon's text with signalDrawTip. Without a receiver the balloon tells the value.
    void ShowTip();
    // Shows the text in the balloon at the handle; an empty one hides it.
    void DrawTipText(const QString& text);

    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

Q_SIGNALS:
    // The handle is held and its balloon is due: a receiver calls DrawTipText.
    void signalDrawTip(KSSLider* slider);
    void signalDrawTipText(QString text);
    void signalMousePressed();
    void signalMouseRelease();

protected:
    // Widens what counts as a press on the handle.
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

    KSSliderStyle* m_style; // child of this
    OneFinger m_finger{this};
    bool m_response = true;
    bool m_pressed = false;  // press and release signals come in pairs
    bool m_dragging = false; // the handle is held
    QPoint m_clickOffset;    // from the handle's centre to the press
};
