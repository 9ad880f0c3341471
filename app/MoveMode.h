#pragma once

class KSPushbutton;
class QEvent;
class QObject;
class QWidget;

// The mode in which titles are dragged to other places in the list, with its button, which is labelled "Move"
// outside the mode and "Done" in it. GUI thread.
class MoveMode
{
public:
    // Makes the button, which the parent owns.
    explicit MoveMode(QWidget* parent);

    KSPushbutton* button() const { return m_button; }
    bool isOn() const { return m_state == State::On; }
    void setOn(bool on);

    // Set the look of the button when it is pressed and released.
    void showPressed();
    void showReleased();
    void translateText();

    // Returns whether the event, sent to the receiver, is a press or a wheel event that ends the mode: one
    // outside the button and the list.
    bool isEndedBy(const QObject* receiver, const QEvent* event, const QWidget* list) const;

private:
    enum class State { Off, On };

    KSPushbutton* m_button;
    State m_state = State::Off;
};
