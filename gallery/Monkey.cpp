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
constexpr int REACH = 140;            // how far a finger goes in one step
constexpr int MARGIN = 30;            // how far beside a window a finger may be
constexpr qint64 SETTLE_TIME = 15000; // a flick may run that long, in milliseconds
constexpr int STEPS_PER_REST = 500;   // now and then everything comes to rest

template <class Widget>
QList<Widget*> widgets()
{
    QList<Widget*> result;
    for (QWidget* widget : QApplication::allWidgets()) {
        if (auto* found = qobject_cast<Widget*>(widget)) {
            result.append(found);
        }
    }
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
    for (int i = 1; i <= steps; ++i) {
        step(page);
        QCoreApplication::processEvents();
        if (i % STEPS_PER_REST == 0) {
            m_fingers.liftAll();
        }
    }
    m_fingers.liftAll();
    QStringList problems;
    QDeadlineTimer deadline(SETTLE_TIME);
    do {
        QCoreApplication::processEvents(QEventLoop::AllEvents | QEventLoop::WaitForMoreEvents, 20);
        problems = leftovers(page);
    } while (!problems.isEmpty() && !deadline.hasExpired());
    return problems;
}

void Monkey::step(GalleryPage& page)
{
    const int dice = number(100);
    if (m_fingers.count() == 0) {
        if (dice < 8) {
            mouse(page);
        } else {
            press(page);
        }
    } else if (dice < 55) {
        move();
    } else if (dice < 70) {
        press(page); // a second finger
    } else if (dice < 97) {
        int finger = number(MOST_FINGERS);
        for (int i = 0; i < MOST_FINGERS && !m_fingers.isDown(finger); ++i) {
            finger = (finger + 1) % MOST_FINGERS;
        }
        m_fingers.lift(finger);
    } else {
        m_fingers.cancel();
    }
}

// In an order that is the same in each run.
QList<QWidget*> Monkey::windows(const GalleryPage& page) const
{
    QList<QWidget*> result;
    for (QWidget* window : QApplication::topLevelWidgets()) {
        if (window != page.window.get() && window->isVisible() &&
            !(window->windowFlags() & Qt::WindowTransparentForInput)) {
            result.append(window);
        }
    }
    std::sort(result.begin(), result.end(), [](const QWidget* a, const QWidget* b) {
        return std::make_tuple(a->x(), a->y(), a->width()) < std::make_tuple(b->x(), b->y(), b->width());
    });
    result.prepend(page.window.get());
    return result;
}

QPoint Monkey::anyPoint(QWidget* window)
{
    const QPoint place(number(window->width() + 2 * MARGIN) - MARGIN,
                       number(window->height() + 2 * MARGIN) - MARGIN);
    return window->mapToGlobal(place);
}

void Monkey::press(GalleryPage& page)
{
    const QList<QWidget*> list = windows(page);
    QWidget* window = list.at(number(static_cast<int>(list.size())));
    const int finger = number(MOST_FINGERS);
    // More often on something than beside everything.
    const QList<QWidget*> children = window->findChildren<QWidget*>();
    QPoint place = anyPoint(window);
    if (!children.isEmpty() && number(4) != 0) {
        const QWidget* child = children.at(number(static_cast<int>(children.size())));
        if (child->isVisible() && child->window() == window && !child->size().isEmpty()) {
            place = child->mapToGlobal(QPoint(number(child->width()), number(child->height())));
        }
    }
    // A finger presses the window that lies on top there.
    for (QWidget* other : list) {
        if (other != page.window.get() && other->geometry().contains(place)) {
            window = other;
        }
    }
    m_fingers.press(finger, window, place);
}

void Monkey::move()
{
    for (int finger = 0; finger < MOST_FINGERS; ++finger) {
        if (m_fingers.isDown(finger) && number(2) == 0) {
            const bool small = number(3) == 0;
            const int reach = small ? 8 : REACH;
            m_fingers.move(finger, m_fingers.position(finger) +
                                       QPoint(number(2 * reach + 1) - reach, number(2 * reach + 1) - reach));
        }
    }
}

// A click or a drag with the mouse, or its wheel.
void Monkey::mouse(GalleryPage& page)
{
    const QList<QWidget*> list = windows(page);
    QWidget* window = list.at(number(static_cast<int>(list.size())));
    QWindow* handle = window->windowHandle();
    QPoint place = anyPoint(window);
    const auto send = [window, handle](const QPoint& position, Qt::MouseButtons buttons,
                                       Qt::MouseButton button, QEvent::Type type) {
        QWindowSystemInterface::handleMouseEvent<QWindowSystemInterface::SynchronousDelivery>(
            handle, window->mapFromGlobal(position), position, buttons, button, type);
    };
    if (number(4) == 0) {
        QWindowSystemInterface::handleWheelEvent<QWindowSystemInterface::SynchronousDelivery>(
            handle, window->mapFromGlobal(place), place, QPoint(), QPoint(0, number(2) == 0 ? 120 : -120));
        return;
    }
    QPointer<QWindow> alive(handle);
    send(place, Qt::LeftButton, Qt::LeftButton, QEvent::MouseButtonPress);
    for (int moves = number(4); moves > 0 && alive; --moves) {
        place += QPoint(number(81) - 40, number(81) - 40);
        send(place, Qt::LeftButton, Qt::NoButton, QEvent::MouseMove);
    }
    if (alive) {
        send(place, Qt::NoButton, Qt::LeftButton, QEvent::MouseButtonRelease);
    }
}

QStringList Monkey::leftovers(const GalleryPage&) const
{
    QStringList problems;
    if (m_filter->isLock(nullptr, LOCKMETHOD_TOUCH)) {
        problems.append(QStringLiteral("the touch lock is held"));
    }
    if (QWidget* grabber = QWidget::mouseGrabber()) {
        problems.append(QStringLiteral("the mouse is grabbed by ") + describe(grabber));
    }
    for (const QAbstractButton* button : widgets<QAbstractButton>()) {
        if (button->isDown()) {
            problems.append(QStringLiteral("left down: ") + describe(button));
        }
        const auto* push = qobject_cast<const KSPushbutton*>(button);
        if (push != nullptr && push->objectName() == QStringLiteral("live") &&
            push->buttonState() == KSPushbutton::ButtonPressed) {
            problems.append(QStringLiteral("left with its pressed look: ") + describe(button));
        }
    }
    for (const QAbstractSlider* slider : widgets<QAbstractSlider>()) {
        if (slider->isSliderDown()) {
            problems.append(QStringLiteral("left held: ") + describe(slider));
        }
    }
    for (const KSScrollBar* bar : widgets<KSScrollBar>()) {
        if (bar->isPressed()) {
            problems.append(QStringLiteral("left pressed: ") + describe(bar));
        }
    }
    for (const KSTabBar* bar : widgets<KSTabBar>()) {
        if (bar->pressedTab() >= 0) {
            problems.append(QStringLiteral("a tab is left pressed: ") + describe(bar));
        }
    }
    for (const CustomComboBoxView* view : widgets<CustomComboBoxView>()) {
        if (view->pressedIndex().isValid() || view->isAutoFilck()) {
            problems.append(QStringLiteral("a row is left pressed or the list runs: ") + describe(view));
        }
    }
    for (const KSMenu* menu : widgets<KSMenu>()) {
        if (!menu->isVisible() && menu->currentItem() >= 0) {
            problems.append(QStringLiteral("a row is left marked: ") + describe(menu));
        }
    }
    for (const KSScrollViewerWidget* list : widgets<KSScrollViewerWidget>()) {
        if (list->isDragging() || list->getMoveItem() != nullptr || list->isAutoFilck()) {
            problems.append(QStringLiteral("an item is left lifted or the list runs: ") + describe(list));
        }
    }
    for (KSTreeView* tree : widgets<KSTreeView>()) {
        if (tree->isAutoFilck()) {
            problems.append(QStringLiteral("the tree runs: ") + describe(tree));
        }
    }
    return problems;
}
