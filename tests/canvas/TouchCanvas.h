#pragma once

#include "CanvasFixture.h"
#include "tests/support/Patience.h"

#include "tests/touchui/TouchDevice.h"
#include "touchui/KSAppEventFilter.h"
#include "touchui/TouchEventButton.h"

#include <QApplication>
#include <QWidget>

// The canvas at the left of a window, with a button to its right, for tests with fingers. The application's
// event filter decides which of them may be touched.
class TouchCanvas : public Canvas
{
public:
    explicit TouchCanvas(TouchDevice& device) : m_device(device)
    {
        m_filter.registerLockObject(&m_filter, nullptr, LOCKOBJECT_DEFAULTMUTEX, nullptr);
        qApp->installEventFilter(&m_filter);
        window.resize(1500, 720);
        view.setParent(&window);
        view.setGeometry(0, 0, 1280, 720);
        button = new TouchEventButton(QStringLiteral("button"), &window);
        button->setGeometry(1300, 20, 160, 80);
    }
    ~TouchCanvas()
    {
        qApp->removeEventFilter(&m_filter);
        view.setParent(nullptr);
    }
    TouchCanvas(const TouchCanvas&) = delete;
    TouchCanvas& operator=(const TouchCanvas&) = delete;

    void show()
    {
        window.show();
        QVERIFY(QTest::qWaitForWindowActive(&window, PATIENCE_MS));
        view.setFocus();
    }

    void press(QPoint point) { touch(QEventPoint::Pressed, point); }
    void move(QPoint point) { touch(QEventPoint::Updated, point); }
    void release(QPoint point) { touch(QEventPoint::Released, point); }
    // Presses and moves in small steps like a finger, without a release.
    void pressAndDrag(QPoint from, QPoint to)
    {
        constexpr int STEPS = 40;
        press(from);
        for (int step = 1; step <= STEPS; ++step)
            move(from + (to - from) * step / STEPS);
    }
    // Taps without starting a double tap.
    void touchTap(QPoint point)
    {
        quickTap(point);
        view.mouseClick();
    }
    void quickTap(QPoint point) { m_device.tap(view.viewport(), point); }
    // Presses at the first point and moves to the second, without a release.
    void slide(QPoint from, QPoint to)
    {
        press(from);
        slideOn(from, to);
    }
    void slideOn(QPoint from, QPoint to)
    {
        constexpr int Steps = 8;
        for (int i = 1; i <= Steps; ++i)
            move(from + (to - from) * i / Steps);
    }
    void touchDrag(QPoint from, QPoint to)
    {
        slide(from, to);
        release(to);
        view.mouseClick();
    }
    // Selects the object and starts editing, with the cursor at the point.
    void edit(int id, QPoint point)
    {
        touchTap(point);
        if (text(id)->getFocusFlag() == TextObjectConstants::FocusObject)
            touchTap(point);
    }

    QPoint inView(const GraphicsText& item, QPointF place) const
    {
        return view.mapFromScene(item.mapToScene(place));
    }
    // Returns the middle of the caret of a position.
    QPoint caretIn(GraphicsText& item, int position) const
    {
        QLineF line;
        QPointF point;
        int block = 0;
        CaretGeometry(*item.document()).caretPoint(line, point, block, position);
        return inView(item, line.center());
    }
    // Returns the middle of the character at a position.
    QPoint characterIn(GraphicsText& item, int position) const
    {
        return (caretIn(item, position) + caretIn(item, position + 1)) / 2;
    }
    // Returns the top left of the handle of a position, in item coordinates.
    static QPointF handleOf(GraphicsText& item, int position)
    {
        QLineF line;
        QPointF point;
        int block = 0;
        CaretGeometry(*item.document()).caretPoint(line, point, block, position);
        return point;
    }
    QPoint handleIn(GraphicsText& item, int position) const
    {
        return inView(item, handleOf(item, position) + QPointF(12.0, 13.5));
    }

    QWidget window;
    TouchEventButton* button = nullptr;

private:
    void touch(QEventPoint::State state, QPoint point)
    {
        auto sequence = QTest::touchEvent(view.viewport(), m_device, false);
        if (state == QEventPoint::Pressed)
            sequence.press(1, point, view.viewport());
        else if (state == QEventPoint::Released)
            sequence.release(1, point, view.viewport());
        else
            sequence.move(1, point, view.viewport());
        sequence.commit();
    }

    KSAppEventFilter m_filter;
    TouchDevice& m_device;
};
