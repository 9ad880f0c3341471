#pragma once

#include "SignalLog.h"
#include "app/APPEventFilter.h"
#include "gallery/Fingers.h"
#include "gallery/Monkey.h"
#include "tests/fakes/ManualClock.h"
#include "touchui/KSBaseItemWidget.h"
#include "touchui/KSEventDefaultMutexLockObject.h"
#include "touchui/KSEventProcessLockObject.h"
#include "touchui/KSMenu.h"

#include <QAbstractScrollArea>
#include <QAbstractSlider>
#include <QApplication>
#include <QLineEdit>
#include <QStringList>
#include <QWidget>
#include <algorithm>
#include <functional>
#include <tuple>

// Tests of interrupted touches: each widget that accepts touches is pressed, held, flicked, dragged or
// edited, and interrupted by a lock, the watchdog, hiding, disabling or destruction. The interrupted touch
// must have no effect, and a tap must work afterwards.
class Interruptions
{
public:
    enum Phase { Press, Hold, Flick, Carry, Edit };
    enum Cause { Lock, Watchdog, Hide, Disable, Destroy };
    static constexpr Phase PHASES[] = {Press, Hold, Flick, Carry, Edit};
    static constexpr Cause CAUSES[] = {Lock, Watchdog, Hide, Disable, Destroy};

    explicit Interruptions(ManualClock& clock) : m_clock(clock) { APPEventFilter::instance(); }

    // Brings the widgets into their initial state.
    std::function<void()> restore = [] {};
    // Returns whether a visible widget is tested.
    std::function<bool(const QWidget*)> concerns = [](const QWidget*) { return true; };
    // Destroys the widget; while not set, destruction is not tested.
    std::function<void(QWidget*)> destroy;

    // Returns one name for each kind of widget that accepts touches and emits a signal when tapped.
    QStringList kinds()
    {
        QStringList result;
        restore();
        QStringList names;
        for (QWidget* widget : touchable())
            if (!names.contains(nameOf(widget)))
                names.append(nameOf(widget));
        for (const QString& name : std::as_const(names)) {
            restore();
            QWidget* widget = find(name);
            if (widget != nullptr && !answerOf(widget).isEmpty())
                result.append(name);
        }
        restore();
        return result;
    }

    // Tests the widget of this name. Returns one line for each problem.
    QStringList problems(const QString& name)
    {
        restore();
        QWidget* untouched = find(name);
        if (untouched == nullptr)
            return {QStringLiteral("it is not there")};
        const QStringList answer = answerOf(untouched);
        QStringList result;
        for (const Phase phase : PHASES) {
            for (const Cause cause : CAUSES) {
                if (cause == Destroy && !destroy)
                    continue;
                for (const QString& problem : problemsOf(name, phase, cause, answer))
                    result.append(QStringLiteral("%1 in %2: %3").arg(text(cause), text(phase), problem));
            }
        }
        return result;
    }

private:
    static QString text(Phase phase)
    {
        return QStringList{"a press", "a hold", "a flick", "carrying", "editing"}.at(phase);
    }
    static QString text(Cause cause)
    {
        return QStringList{"a lock", "the watchdog", "hiding", "disabling", "destruction"}.at(cause);
    }

    // --- Widgets

    static QList<QWidget*> windows()
    {
        QList<QWidget*> result;
        for (QWidget* window : QApplication::topLevelWidgets())
            if (window->isVisible() && !(window->windowFlags() & Qt::WindowTransparentForInput))
                result.append(window);
        std::sort(result.begin(), result.end(), [](const QWidget* a, const QWidget* b) {
            return std::make_tuple(a->x(), a->y(), a->width(), a->height()) <
                   std::make_tuple(b->x(), b->y(), b->width(), b->height());
        });
        return result;
    }
    QList<QWidget*> touchable() const
    {
        QList<QWidget*> result;
        for (QWidget* window : windows()) {
            if (QApplication::activeModalWidget() != nullptr && window != QApplication::activeModalWidget())
                continue;
            QList<QWidget*> inside = window->findChildren<QWidget*>();
            inside.prepend(window);
            for (QWidget* widget : std::as_const(inside))
                if (widget->window() == window && widget->isVisible() && widget->isEnabled() &&
                    concerns(widget) && widget->testAttribute(Qt::WA_AcceptTouchEvents) &&
                    !placeOn(widget).isNull())
                    result.append(widget);
        }
        return result;
    }
    // Returns a place where a touch reaches this widget and no other one; null when there is none.
    static QPoint placeOn(const QWidget* widget)
    {
        const QRect area = widget->visibleRegion().boundingRect();
        const auto* row = qobject_cast<const KSBaseItemWidget*>(widget);
        QList<QPoint> places{area.center()};
        if (const auto* menu = qobject_cast<const KSMenu*>(widget))
            places.prepend(menu->getMenuItemRect(1).center()); // this row is enabled in all menus
        if (row != nullptr && row->hasDragFlag() && !row->getDragArea().isNull())
            places.prepend(row->getDragArea().center());
        for (const int part : {1, 3, 5, 7})
            places.append(area.topLeft() + QPoint(area.width() * part / 8, area.height() * part / 8));
        for (const QPoint& place : places) {
            const QWidget* hit = widget->window()->childAt(widget->mapTo(widget->window(), place));
            while (hit != nullptr && !hit->testAttribute(Qt::WA_AcceptTouchEvents))
                hit = hit->parentWidget();
            if (area.contains(place) && (hit == widget || (hit == nullptr && widget->isWindow())))
                return place;
        }
        return {};
    }
    static QString nameOf(const QWidget* widget)
    {
        QStringList parts;
        for (const QWidget* part = widget; part != nullptr; part = part->parentWidget()) {
            parts.prepend(QString::fromLatin1(part->metaObject()->className()));
            if (part->isWindow())
                break;
        }
        const auto* row = qobject_cast<const KSBaseItemWidget*>(widget);
        if (row != nullptr && row->hasDragFlag())
            parts.append(QStringLiteral("movable"));
        if (const auto* button = qobject_cast<const QAbstractButton*>(widget); button && !row)
            parts.append(button->isCheckable() ? QStringLiteral("checkable") : QString());
        return parts.mid(qMax(qsizetype(0), parts.size() - 4)).join(QLatin1Char('/'));
    }
    QWidget* find(const QString& name) const
    {
        for (QWidget* widget : touchable())
            if (nameOf(widget) == name)
                return widget;
        return nullptr;
    }
    // Closes the other popups, since a press outside an open popup would only close it.
    static void closePopupsBeside(const QWidget* widget)
    {
        for (QWidget* window : windows())
            if (window->windowType() == Qt::ToolTip && window != widget->window())
                window->close();
        QCoreApplication::processEvents();
    }

    // --- Fingers

    void touch(QWidget* widget)
    {
        const QPoint place = widget->mapToGlobal(placeOn(widget));
        m_fingers.press(0, widget->window(), place);
    }
    void moveBy(const QPoint& way)
    {
        constexpr int STEPS = 6;
        const QPoint from = m_fingers.position(0);
        for (int i = 1; i <= STEPS; ++i) {
            m_fingers.move(0, from + way * i / STEPS);
            m_clock.advance(10);
        }
    }
    void tap(QWidget* widget)
    {
        touch(widget);
        m_fingers.lift(0);
    }
    // Taps the widget and returns the signals that it and its ancestors emit.
    QStringList answerOf(QWidget* widget)
    {
        closePopupsBeside(widget);
        if (auto* edit = qobject_cast<QLineEdit*>(widget))
            edit->setCursorPosition(0); // moved away, so that the tap changes the cursor position
        const QPointer<QWidget> kept = widget;
        SignalLog log;
        touch(widget);
        QStringList names = log.take(widget);
        m_fingers.lift(0);
        if (kept != nullptr)
            names += log.take(widget);
        static const QStringList looks{"windowIconChanged",  "customContextMenuRequested",
                                       "destroyed",          "iconSizeChanged",
                                       "windowTitleChanged", "objectNameChanged"};
        erase_if(names, [](const QString& name) { return looks.contains(name); });
        return names;
    }
    void begin(QWidget* widget, Phase phase)
    {
        constexpr int HOLD_TIME = 800;
        constexpr int LIFT_TIME = 60;
        constexpr int WAY = 70;
        if (phase == Edit) {
            tap(widget);
            m_clock.advance(HOLD_TIME);
            if (!widget->isVisible())
                return;
        }
        touch(widget);
        switch (phase) {
        case Press:
            break;
        case Hold:
            m_clock.advance(HOLD_TIME);
            break;
        case Flick:
            moveBy(QPoint(0, -WAY));
            break;
        case Carry:
            m_clock.advance(LIFT_TIME);
            moveBy(QPoint(0, WAY));
            break;
        case Edit:
            moveBy(QPoint(WAY, 0));
            break;
        }
    }

    // --- What comes between

    static void lock(bool on)
    {
        APPEventDefine::_tagAPPEvent event;
        event.lockType = APPEventDefine::LOCKTYPE_TOUCH;
        event.flag = on;
        KSEventProcessLockObject::s_instance->slotGetAppEvent(event);
    }
    void interrupt(QWidget* widget, Cause cause)
    {
        switch (cause) {
        case Lock:
            lock(true);
            break;
        case Watchdog:
            m_clock.advance(KSEventDefaultMutexLockObject::WATCHDOG_MSEC);
            break;
        case Hide:
            widget->window()->hide();
            break;
        case Disable:
            widget->setEnabled(false);
            break;
        case Destroy:
            destroy(widget);
            break;
        }
    }
    static void endInterruption(QWidget* widget, Cause cause)
    {
        if (cause == Lock)
            lock(false);
        else if (cause == Disable && widget != nullptr)
            widget->setEnabled(true);
    }

    QStringList problemsOf(const QString& name, Phase phase, Cause cause, const QStringList& answer)
    {
        restore();
        const QPointer<QWidget> widget = find(name);
        if (widget == nullptr)
            return {QStringLiteral("it is not there")};
        closePopupsBeside(widget);
        begin(widget, phase);
        if (widget == nullptr || !widget->isVisible()) { // the tap has closed it
            m_fingers.liftAll();
            return {};
        }
        const bool lockHeld = APPEventFilter::instance()->isTouched(widget);
        interrupt(widget, cause);
        QStringList result;
        if (lockHeld && APPEventFilter::instance()->isTouched(widget))
            result.append(QStringLiteral("the touch goes on"));
        SignalLog log;
        result += Monkey::leftovers();
        m_clock.advance(2000);
        m_fingers.liftAll();
        m_clock.advance(2000);
        QCoreApplication::processEvents();
        endInterruption(widget, cause);
        static const QStringList deeds{
            "clicked",     "widgetItemClicked",  "widgetItemReleased",  "pressed",      "sectionClicked",
            "triggered",   "tabBarClicked",      "aboutToShow",         "signalTapped", "itemPressed",
            "editorEvent", "widgetItemLongHold", "signalPressedAndHold"};
        for (const QString& signal : log.take())
            if (deeds.contains(signal))
                result.append(signal + QStringLiteral(" followed"));
        return result + problemsAfterwards(widget, name, cause, answer);
    }
    QStringList problemsAfterwards(QWidget* widget, const QString& name, Cause cause,
                                   const QStringList& answer)
    {
        QStringList result = Monkey::leftovers();
        if (APPEventFilter::instance()->isLock(nullptr, LOCKMETHOD_TOUCH))
            result.append(QStringLiteral("the touch lock is held"));
        if (m_clock.running() != 0)
            result.append(QStringLiteral("%1 timers run on").arg(m_clock.running()));
        if (cause == Hide || cause == Destroy) {
            restore();
            widget = find(name);
        }
        if (widget == nullptr || !widget->isVisible())
            return result + QStringList(QStringLiteral("it is not there afterwards"));
        const QStringList now = answerOf(widget);
        // The effect of a tap on a slider depends on the place of its handle, that of a tap in a list on how
        // far it is scrolled.
        const bool isMovable = qobject_cast<const QAbstractSlider*>(widget) != nullptr ||
                               qobject_cast<const QAbstractScrollArea*>(widget->parentWidget()) != nullptr;
        const bool answers = std::any_of(now.cbegin(), now.cend(), [&](const QString& signal) {
            return isMovable || answer.contains(signal);
        });
        if (!answers)
            result.append(QStringLiteral("a tap afterwards gives only: ") + now.join(QLatin1Char(' ')));
        return result;
    }

    ManualClock& m_clock;
    Fingers m_fingers;
};
