#pragma once

#include "MonkeyFingers.h"
#include "app/TitlerWindow.h"
#include "canvas/CanvasScene.h"
#include "canvas/GraphicsText.h"
#include "canvas/GraphicsView.h"

#include <QAction>
#include <QInputMethodEvent>

// Random fingers on the canvas and the panel of the window, and on the popups that these open.
class CanvasFingers : public MonkeyFingers
{
public:
    CanvasFingers(TitlerWindow& window, QPointingDevice* device, quint32 seed)
        : MonkeyFingers(device, seed)
        , m_window(window)
        , m_view(*window.findChild<GraphicsView*>())
        , m_scene(*window.findChild<CanvasScene*>())
    {
        const QList<QAction*> actions = window.findChildren<QAction*>(QString(), Qt::FindDirectChildrenOnly);
        for (QAction* action : actions)
            if (action->text().startsWith(QLatin1String("Undo")) ||
                action->text().startsWith(QLatin1String("Redo")))
                m_undoAndRedo.append(action);
    }

    // Returns the actions of the window's undo stack.
    const QList<QAction*>& undoAndRedo() const { return m_undoAndRedo; }

protected:
    Aim aim() override
    {
        const QWidgetList windows = windowsBeside(&m_window);
        QWidget* touched = !windows.isEmpty() && below(2) == 0 ? windows.first() : &m_window;
        return {touched, pointOf(touched)};
    }
    QPoint pointOf(QWidget* window) override
    {
        if (window != &m_window)
            return within(window->rect());
        return below(10) < 7 ? pointOnCanvas() : within(TitlerWindow::TEXT_PROPERTY_RECT);
    }

    // Calls at random what timers would call: the timers are stopped, so that a run does not depend on the
    // speed of the machine.
    void betweenTouches() override
    {
        const int kind = below(60);
        if (kind < 40)
            m_view.mouseClick(); // the next tap will not be part of a double tap
        else if (kind < 44)
            type();
        else if (kind == 44)
            m_window.slotNewTextButtonClicked();
        else if (kind == 45)
            undoOrRedo();
        else if (kind < 50)
            passTime();
    }

    QPoint pointOnCanvas()
    {
        const QList<GraphicsText*> texts = m_scene.getTextItemList();
        QRect area = m_view.rect();
        if (!texts.isEmpty() && below(4) != 0) {
            const QRectF object = anyOf(texts)->sceneBoundingRect();
            area = m_view.mapFromScene(object).boundingRect().adjusted(-20, -20, 20, 20).intersected(area);
        }
        return m_view.mapTo(&m_window, within(area));
    }
    void undoOrRedo()
    {
        if (!m_undoAndRedo.isEmpty())
            anyOf(m_undoAndRedo)->trigger();
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
        commit.setCommitString(anyOf(pieces));
        QCoreApplication::sendEvent(&m_view, &commit);
    }

    TitlerWindow& m_window;
    GraphicsView& m_view;
    CanvasScene& m_scene;

private:
    void passTime()
    {
        const QList<GraphicsText*> texts = m_scene.getTextItemList();
        for (GraphicsText* text : texts)
            if (below(2) == 0)
                text->slotLongPressed();
            else
                text->pushLastEditTextIntoStack();
    }

    QList<QAction*> m_undoAndRedo;
};
