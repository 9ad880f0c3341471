#pragma once

#include <QObject>
#include <QPointer>

class KSAppEventFilter;
class QEvent;
class QWidget;

// Closes what is open for the moment: tells of the first press or touch of this process outside a window, and
// swallows that press and all that follows from it up to the lift, so that it presses nothing else. It stands
// behind the application's gate for touches: a touch that the gate refuses, such as a second finger's, closes
// nothing, and one that it lets through holds its lock up to the lift.
//
// Such windows are of the type Qt::ToolTip and not Qt::Popup: while a popup is open, Qt delivers no touches,
// and the finger that opened it would never be lifted for the widget under it.
class OutsidePressFilter : public QObject
{
    Q_OBJECT
public:
    // window is not owned and may go first. Registers with the application's gate, so that it is asked before
    // those that are made later. GUI thread only.
    explicit OutsidePressFilter(QWidget* window, QObject* parent = nullptr);

    // Between these the presses are watched. A press that is being swallowed is swallowed to its end.
    void start();
    void stop();
    bool isWatching() const { return m_watching; }

    bool eventFilter(QObject* obj, QEvent* event) override;

Q_SIGNALS:
    void pressedOutside();

private:
    void registerWithGate();
    bool isOutside(QEvent* event) const;
    bool swallowPress(QObject* obj, QEvent* event);
    void endSwallowing();

    QPointer<QWidget> m_window;
    bool m_watching = false;
    QPointer<KSAppEventFilter> m_gate; // where it is registered, if there is one
    bool m_swallowsTouch = false;
    bool m_swallowsMouse = false;
    QPointer<QObject> m_swallowed; // the object that the press is kept from
};
