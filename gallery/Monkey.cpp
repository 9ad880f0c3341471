#include "gallery/Monkey.h"

#include "touchui/CustomComboBoxView.h"
#include "touchui/KSAppEventFilter.h"
#include "touchui/KSMenu.h"
#include "touchui/KSPushbutton.h"
#include "touchui/KSScrollBar.h"
#include "touchui/KSScrollViewerWidget.h"
#include "touchui/KSTabBar.h"
#include "touchui/KSTreeView.h"

#include <QAbstractSlider>
#include <QApplication>
#include <QDeadlineTimer>
#include <QtGui/qpa/qwindowsysteminterface.h>

#include <algorithm>
#include <tuple>

namespace
{

constexpr int MOST_FINGERS = 3;
constexpr int REACH = 140; // pixels that a finger moves at most in one step
constexpr int SMALL_REACH = 8;
constexpr int WHEEL_STEP = 120;
constexpr int MARGIN = 30;            // pixels that a finger may be outside a window
constexpr qint64 SETTLE_TIME = 15000; // milliseconds that a flick may run
constexpr int STEPS_PER_REST = 500;   // all fingers are lifted after this number of steps

template <class Widget>
QList<Widget*> widgets()
{
    QList<Widget*> result;
    for (QWidget* widget : QApplication::allWidgets())
        if (auto* found = qobject_cast<Widget*>(widget))
            result.append(found);
    return result;
}

QString describe(const QWidget* widget)
{
    const QPoint place = widget->mapTo(widget->window(), QPoint(0, 0));
    return QStringLiteral("%1 \"%2\" at %3,%4")
        .arg(QLatin1String(widget->metaObject()->className()), widget->objectName())
        .arg(place.x())
        .arg(place.y());
}

} // namespace

Monkey::Monkey(KSAppEventFilter* filter, quint32 seed) : m_filter(filter), m_random(seed)
{
}

QStringList Monkey::play(GalleryPage& page, int steps)
{
    m_targets.clear();
    for (const QWidget* child : page.window->findChildren<QWidget*>())
        if (child->isVisibleTo(page.window.get()) && !child->isWindow() && !child->size().isEmpty())
            m_targets.append(QRect(child->mapTo(page.window.get(), QPoint(0, 0)), child->size()));
    for (int i = 1; i <= steps; ++i) {
        step(page);
        QCoreApplication::processEvents();
        if (i % STEPS_PER_REST == 0 || i == steps) {
            m_fingers.liftAll();
            QCoreApplication::processEvents();
            // Checked at once, before the watchdog can release the lock.
            if (m_filter->isLock(nullptr, LOCKMETHOD_TOUCH))
                return {QStringLiteral("step %1: the touch lock is held by %2").arg(i).arg(holders())};
        }
    }
    QStringList problems;
    QDeadlineTimer deadline(SETTLE_TIME);
    do {
        QCoreApplication::processEvents(QEventLoop::AllEvents | QEventLoop::WaitForMoreEvents, 20);
        problems = leftovers();
    } while (!problems.isEmpty() && !deadline.hasExpired());
    return problems;
}

void Monkey::step(const GalleryPage& page)
{
    const int dice = number(100);
    if (m_fingers.count() == 0) {
        if (dice < 8)
            mouse(page);
        else
            press(page);
    } else if (dice < 55) {
        move();
    } else if (dice < 70) {
        press(page); // a second finger
    } else if (dice < 97) {
        lift();
    } else {
        note(6, 0, QPoint());
        m_fingers.cancel();
    }
}

// Returns the windows that the page has opened, the topmost one last.
QList<QWidget*> Monkey::windows(const GalleryPage& page) const
{
    QList<QWidget*> result;
    for (QWidget* window : QApplication::topLevelWidgets())
        if (window != page.window.get() && window->isVisible() &&
            !(window->windowFlags() & Qt::WindowTransparentForInput))
            result.append(window);
    std::sort(result.begin(), result.end(), [](const QWidget* a, const QWidget* b) {
        return std::make_tuple(a->x(), a->y(), a->width()) < std::make_tuple(b->x(), b->y(), b->width());
    });
    return result;
}

// Chooses a position independently of the state of the page, so that a seed always gives the same input.
QPoint Monkey::anyPoint(const GalleryPage& page)
{
    // Three of four positions are on a widget.
    const QRect area = number(4) != 0 && !m_targets.isEmpty()
                           ? m_targets.at(number(static_cast<int>(m_targets.size())))
                           : page.window->rect().adjusted(-MARGIN, -MARGIN, MARGIN, MARGIN);
    return page.window->mapToGlobal(area.topLeft() + QPoint(number(area.width()), number(area.height())));
}

// Returns the topmost window at the place.
QWidget* Monkey::windowAt(const GalleryPage& page, const QPoint& place) const
{
    QWidget* window = page.window.get();
    for (QWidget* other : windows(page))
        if (other->geometry().contains(place))
            window = other;
    return window;
}

void Monkey::press(const GalleryPage& page)
{
    const int finger = number(MOST_FINGERS);
    const QPoint place = anyPoint(page);
    note(1, finger, place);
    m_fingers.press(finger, windowAt(page, place), place);
}

void Monkey::move()
{
    for (int finger = 0; finger < MOST_FINGERS; ++finger) {
        if (m_fingers.isDown(finger) && number(2) == 0) {
            const int reach = number(3) == 0 ? SMALL_REACH : REACH;
            const QPoint place = m_fingers.position(finger) +
                                 QPoint(number(2 * reach + 1) - reach, number(2 * reach + 1) - reach);
            note(2, finger, place);
            m_fingers.move(finger, place);
        }
    }
}

void Monkey::lift()
{
    int finger = number(MOST_FINGERS);
    for (int i = 0; i < MOST_FINGERS && !m_fingers.isDown(finger); ++i)
        finger = (finger + 1) % MOST_FINGERS;
    note(3, finger, QPoint());
    m_fingers.lift(finger);
}

// Clicks or drags with the mouse, or turns its wheel.
void Monkey::mouse(const GalleryPage& page)
{
    QPoint place = anyPoint(page);
    const bool wheel = number(4) == 0;
    const int turn = number(2) == 0 ? WHEEL_STEP : -WHEEL_STEP;
    const int moves = number(4);
    QWidget* window = windowAt(page, place);
    const QPointer<QWindow> handle = window->windowHandle();
    note(wheel ? 4 : 5, turn, place);
    const auto send = [&](Qt::MouseButtons buttons, Qt::MouseButton button, QEvent::Type type) {
        if (handle)
            QWindowSystemInterface::handleMouseEvent<QWindowSystemInterface::SynchronousDelivery>(
                handle, handle->mapFromGlobal(place), place, buttons, button, type);
    };
    if (wheel) {
        QWindowSystemInterface::handleWheelEvent(handle, handle->mapFromGlobal(place), place, QPoint(),
                                                 QPoint(0, turn));
        return;
    }
    send(Qt::LeftButton, Qt::LeftButton, QEvent::MouseButtonPress);
    for (int i = 0; i < moves; ++i) {
        place += QPoint(number(81) - 40, number(81) - 40);
        send(Qt::LeftButton, Qt::NoButton, QEvent::MouseMove);
    }
    send(Qt::NoButton, Qt::LeftButton, QEvent::MouseButtonRelease);
}

void Monkey::note(int action, int finger, const QPoint& place)
{
    for (const int value : {action, finger, place.x(), place.y()})
        m_input = (m_input ^ static_cast<quint32>(value)) * 16777619U;
}

QString Monkey::holders() const
{
    QStringList names;
    const QMap<KSLockObject*, QList<QObject*>> active = m_filter->activateLockObjects();
    for (const QList<QObject*>& objects : active) {
        for (QWidget* widget : QApplication::allWidgets())
            if (objects.contains(widget))
                names.append(describe(widget));
    }
    return names.isEmpty() ? QStringLiteral("what is gone") : names.join(QStringLiteral(", "));
}

QStringList Monkey::leftovers()
{
    QStringList problems;
    if (QWidget* grabber = QWidget::mouseGrabber())
        problems.append(QStringLiteral("the mouse is grabbed by ") + describe(grabber));
    for (const QAbstractButton* button : widgets<QAbstractButton>()) {
        if (button->isDown())
            problems.append(QStringLiteral("left down: ") + describe(button));
        const auto* push = qobject_cast<const KSPushbutton*>(button);
        if (push != nullptr && push->objectName() == QStringLiteral("live") &&
            push->buttonState() == KSPushbutton::ButtonPressed)
            problems.append(QStringLiteral("left with its pressed look: ") + describe(button));
    }
    for (const QAbstractSlider* slider : widgets<QAbstractSlider>())
        if (slider->isSliderDown())
            problems.append(QStringLiteral("left held: ") + describe(slider));
    for (const KSScrollBar* bar : widgets<KSScrollBar>())
        if (bar->isPressed())
            problems.append(QStringLiteral("left pressed: ") + describe(bar));
    for (const KSTabBar* bar : widgets<KSTabBar>())
        if (bar->pressedTab() >= 0)
            problems.append(QStringLiteral("a tab is left pressed: ") + describe(bar));
    for (const CustomComboBoxView* view : widgets<CustomComboBoxView>())
        if (view->pressedIndex().isValid() || view->isAutoFilck())
            problems.append(QStringLiteral("a row is left pressed or the list runs: ") + describe(view));
    for (const KSMenu* menu : widgets<KSMenu>())
        if (!menu->isVisible() && menu->currentItem() >= 0)
            problems.append(QStringLiteral("a row is left marked: ") + describe(menu));
    for (const KSScrollViewerWidget* list : widgets<KSScrollViewerWidget>())
        if (list->isDragging() || list->getMoveItem() != nullptr || list->isAutoFilck())
            problems.append(QStringLiteral("an item is left lifted or the list runs: ") + describe(list));
    for (KSTreeView* tree : widgets<KSTreeView>())
        if (tree->isAutoFilck())
            problems.append(QStringLiteral("the tree runs: ") + describe(tree));
    return problems;
}
