#pragma once

#include <QObject>
#include <QPointer>

class KSAppEventFilter;
class QEvent;
class QWidget;

// Closes temporary windows: reports the first press or touch of this process outside a window, and swallows
// that press up to its lift, so that it has no other effect. It runs after the application's
// KSAppEventFilter: a touch that the filter refuses, such as that of a second finger, closes nothing, and one
// that it accepts holds its lock until the lift.
//
// Such windows have the type Qt::ToolTip instead of Qt::Popup: while a popup is open, Qt delivers no touches,
// and the widget under the finger that opened it would never receive the lift.
class OutsidePressFilter : public QObject
{
    Q_OBJECT
public:
    // window is not owned and may be destroyed first. Registers with the KSAppEventFilter, so that this
    // filter is called before those that are created later. GUI thread only.
    explicit OutsidePressFilter(QWidget* window, QObject* parent = nullptr);

    // Presses are watched between start() and stop(). A press that is being swallowed is swallowed up to its
    // lift even after stop().
    void start();
    void stop();

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
    QPointer<KSAppEventFilter> m_gate; // the filter with which this object is registered, if any
    bool m_swallowsTouch = false;
    bool m_swallowsMouse = false;
    QPointer<QObject> m_swallowed; // the object that does not receive the press
};
