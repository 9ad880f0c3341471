// Fingers that touch the canvas and the panel of a window anywhere and in any order, for tests: seeded, so
// that a run can be repeated.
#pragma once

#include "app/TitlerWindow.h"
#include "canvas/CanvasScene.h"
#include "canvas/GraphicsText.h"
#include "canvas/GraphicsView.h"

#include <QAction>
#include <QApplication>
#include <QInputMethodEvent>
#include <QPointer>
#include <QPointingDevice>
#include <QRandomGenerator>
#include <QTest>
#include <QWindow>
#include <array>
#include <qpa/qwindowsysteminterface.h>

class MonkeyFingers
{
public:
    MonkeyFingers(TitlerWindow& window, QPointingDevice* device, quint32 seed)
        : m_window(window)
        , m_view(*window.findChild<GraphicsView*>())
        , m_scene(*window.findChild<CanvasScene*>())
        , m_device(device)
        , m_random(seed)
    {
        const QList<QAction*> actions = window.findChildren<QAction*>(QString(), Qt::FindDirectChildrenOnly);
        for (QAction* action : actions) {
            if (action->text().startsWith(QLatin1String("Undo")) ||
                action->text().startsWith(QLatin1String("Redo")))
                m_undoAndRedo.append(action);
        }
    }

    int touches() const { return m_touches; }
    bool isTouching() const { return m_fingers[0].down || m_fingers[1].down; }
    // What the last touches were, for the report of a failure.
    QStringList lastTouches() const { return m_last; }

    // One touch event, and now and then what an operator does between touches.
    void act()
    {
        if (!m_fingers[0].down) {
            betweenTouches();
            pressFirst();
            return;
        }
        const int kind = below(100);
        if (kind < 50)
            moveOne();
        else if (kind < 85)
            releaseOne();
        else if (kind < 98)
            useSecond();
        else
            cancel();
    }

    void liftAll()
    {
        while (m_fingers[0].down || m_fingers[1].down)
            releaseOne();
    }

private:
    struct Finger {
        bool down = false;
        QPoint point; // of the touched window
    };

    int below(int limit) { return m_random.bounded(limit); }
    QPoint within(const QRect& area)
    {
        return area.topLeft() + QPoint(below(qMax(area.width(), 1)), below(qMax(area.height(), 1)));
    }

    // Other windows that are open: popups of the panel, its palette, its slider.
    QWidget* openPopup() const
    {
        const QWidgetList windows = QApplication::topLevelWidgets();
        for (QWidget* widget : windows) {
            if (widget != &m_window && widget->isVisible() && widget->windowHandle())
                return widget;
        }
        return nullptr;
    }
    QPoint pointOnCanvas()
    {
        const QList<GraphicsText*> texts = m_scene.getTextItemList();
        QRect area = m_view.rect();
        if (!texts.isEmpty() && below(4) != 0) {
            const GraphicsText* text = texts.at(below(int(texts.size())));
            const QRect object = m_view.mapFromScene(text->sceneBoundingRect()).boundingRect();
            area = object.adjusted(-20, -20, 20, 20).intersected(m_view.rect());
        }
        return m_view.mapTo(&m_window, within(area));
    }
    QPoint anyPoint() { return below(10) < 7 ? pointOnCanvas() : within(TitlerWindow::TEXT_PROPERTY_RECT); }

    void pressFirst()
    {
        QWidget* popup = openPopup();
        m_touched = popup && below(2) == 0 ? popup : &m_window;
        m_fingers[0] = {true, m_touched == &m_window ? anyPoint() : within(m_touched->rect())};
        send(0, QEventPoint::Pressed);
    }
    void useSecond()
    {
        Finger& finger = m_fingers[1];
        if (finger.down) {
            finger.point = near(finger.point);
            send(1, QEventPoint::Updated);
            return;
        }
        if (!touchedIsOpen())
            return releaseOne();
        finger = {true, m_touched == &m_window ? anyPoint() : within(m_touched->rect())};
        send(1, QEventPoint::Pressed);
    }
    QPoint near(QPoint point) { return point + QPoint(below(121) - 60, below(81) - 40); }
    void moveOne()
    {
        const int index = m_fingers[1].down && below(2) == 0 ? 1 : 0;
        Finger& finger = m_fingers[size_t(index)];
        // Small steps as a finger makes them, and leaps.
        finger.point = below(5) == 0 && m_touched == &m_window ? anyPoint() : near(finger.point);
        send(index, QEventPoint::Updated);
    }
    void releaseOne()
    {
        const int index = m_fingers[1].down && (!m_fingers[0].down || below(2) == 0) ? 1 : 0;
        m_fingers[size_t(index)].down = false;
        send(index, QEventPoint::Released);
        // Without the first finger the second goes on as the first.
        if (index == 0 && m_fingers[1].down) {
            m_fingers[1].down = false;
            send(1, QEventPoint::Released);
        }
    }
    void cancel()
    {
        m_fingers = {};
        ++m_touches;
        note(QStringLiteral("cancel"));
        if (touchedIsOpen())
            QWindowSystemInterface::handleTouchCancelEvent<QWindowSystemInterface::SynchronousDelivery>(
                m_touched->windowHandle(), m_device);
    }
    bool touchedIsOpen() const { return m_touched && m_touched->isVisible() && m_touched->windowHandle(); }

    void send(int index, QEventPoint::State state)
    {
        ++m_touches;
        // A popup may close under the finger; its touch ends with it.
        if (!touchedIsOpen()) {
            m_fingers = {};
            return;
        }
        QWindow* window = m_touched->windowHandle();
        auto sequence = QTest::touchEvent(window, m_device, false);
        for (int i = 0; i < int(m_fingers.size()); ++i) {
            const Finger& finger = m_fingers[size_t(i)];
            if (i != index) {
                if (finger.down)
                    sequence.stationary(i + 1);
            } else if (state == QEventPoint::Pressed) {
                sequence.press(i + 1, finger.point, window);
            } else if (state == QEventPoint::Released) {
                sequence.release(i + 1, finger.point, window);
            } else {
                sequence.move(i + 1, finger.point, window);
            }
        }
        note(QString("finger %1 %2 at %3,%4 of %5")
                 .arg(index)
                 .arg(state == QEventPoint::Pressed    ? "down"
                      : state == QEventPoint::Released ? "up"
                                                       : "moves")
                 .arg(m_fingers[size_t(index)].point.x())
                 .arg(m_fingers[size_t(index)].point.y())
                 .arg(m_touched->metaObject()->className()));
        sequence.commit(false);
    }
    void note(const QString& touch)
    {
        constexpr int Noted = 12;
        m_last.append(touch);
        if (m_last.size() > Noted)
            m_last.removeFirst();
    }

    // Timers stand still here, so that a run does not depend on the speed of the machine; what they would
    // have done happens at random instead.
    void betweenTouches()
    {
        const int kind = below(60);
        if (kind < 40)
            m_view.mouseClick(); // the next tap is no double tap
        else if (kind < 44)
            type();
        else if (kind == 44)
            m_window.slotNewTextButtonClicked();
        else if (kind == 45 && !m_undoAndRedo.isEmpty())
            m_undoAndRedo.at(below(int(m_undoAndRedo.size())))->trigger();
        else if (kind < 50)
            passTime();
    }
    void type()
    {
        static const QStringList pieces{QStringLiteral("a"),     QStringLiteral("B c"),
                                        QString::fromUtf8("快"), QString::fromUtf8("속"),
                                        QString::fromUtf8("😀"),  QString::fromUtf8("e\u0301"),
                                        QStringLiteral("\n")};
        if (!m_scene.itemIsEditorInteraction())
            return;
        QInputMethodEvent commit;
        commit.setCommitString(pieces.at(below(int(pieces.size()))));
        QCoreApplication::sendEvent(&m_view, &commit);
    }
    void passTime()
    {
        const QList<GraphicsText*> texts = m_scene.getTextItemList();
        for (GraphicsText* text : texts) {
            if (below(2) == 0)
                text->slotLongPressed();
            else
                text->pushLastEditTextIntoStack();
        }
    }

    TitlerWindow& m_window;
    GraphicsView& m_view;
    CanvasScene& m_scene;
    QPointingDevice* m_device;
    QRandomGenerator m_random;
    QList<QAction*> m_undoAndRedo;
    std::array<Finger, 2> m_fingers;
    QPointer<QWidget> m_touched;
    QStringList m_last;
    int m_touches = 0;
};
