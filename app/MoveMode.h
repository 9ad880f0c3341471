#pragma once

class KSPushbutton;
class QEvent;
class QObject;
class QWidget;

// The mode in which titles are dragged to other places of the list, and its button: it reads "Move" outside
// of the mode and "Done" in it. GUI thread.
class MoveMode
{
public:
    // Makes the button. The parent owns it.
    explicit MoveMode(QWidget* parent);

    KSPushbutton* button() const { return m_button; }
    bool isOn() const { return m_state == State::On; }
    void setOn(bool on);

    // The looks of the button under a finger and after it.
    void showPressed();
    void showReleased();
    void translateText();

    // Returns whether the event is a press or a turn of the wheel, on its way to the receiver, that ends the
    // mode: one beside the button and the list.
    bool isEndedBy(const QObject* receiver, const QEvent* event, const QWidget* list) const;

private:
    enum class State { Off, On };

    KSPushbutton* m_button;
    State m_state = State::Off;
};
