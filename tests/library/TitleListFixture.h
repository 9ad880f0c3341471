#pragma once

#include "LibraryFixture.h"
#include "tests/support/Patience.h"

#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/ArchiveMenu.h"
#include "tests/fakes/ManualClock.h"
#include "tests/touchui/TouchDevice.h"
#include "touchui/KSAppEventFilter.h"
#include "touchui/KSMenu.h"

#include <QCoreApplication>
#include <QLabel>
#include <QScrollBar>
#include <QTest>
#include <QUndoStack>
#include <QWidget>

// The title list in a window with the application's event filter, fingers of a touch screen, a clock that the
// test advances, and an undo stack for the commands of the list.
class TitleListFixture : public QObject
{
public:
    static constexpr int ROW = 143;             // height with the gap
    static constexpr int HANDLE_X = 523;        // in list coordinates
    static constexpr int PICTURE_X = 150;       // in list coordinates; on the picture of a title
    static constexpr int TEXT_X = 400;          // in list coordinates; on the text of a title
    static constexpr int HOLD_TIME = 700;       // ms
    static constexpr int LIFT_TIME = 50;        // ms
    static constexpr int TICK = 33;             // ms between two steps of a flick
    static constexpr int EDGE_SCROLL_TIME = 40; // ms

    explicit TitleListFixture(TouchDevice& device) : m_device(device)
    {
        m_filter.registerLockObject(&m_filter, nullptr, LOCKOBJECT_DEFAULTMUTEX, nullptr);
        QCoreApplication::instance()->installEventFilter(&m_filter);
        window.setGeometry(0, 0, 1200, 1080);
        KSScrollViewerWidget::s_mainWnd = &window;
        KSMenu::setMainWindow(&window);
        list = new ArchiveList(&label, false, &window);
        list->setFixedSize(549, 997);
        list->move(14, 66);
        for (auto signal : {&ArchiveList::deleteCommandSignal, &ArchiveList::pasteCommandSignal,
                            &ArchiveList::focusCommandSignal, &ArchiveList::moveCommandSignal})
            connect(list, signal, &stack, &QUndoStack::push);
        connect(list, &ArchiveList::signalUpdateCanvas, this, [this](const Archive* archive) {
            canvas.append(archive ? QString::fromStdString(archive->getName()) : QStringLiteral("null"));
        });
        window.show();
        if (!QTest::qWaitForWindowExposed(&window, PATIENCE_MS))
            qFatal("no window");
    }
    ~TitleListFixture() override
    {
        stack.clear();
        QCoreApplication::instance()->removeEventFilter(&m_filter);
        KSScrollViewerWidget::s_mainWnd.clear();
        KSMenu::setMainWindow(nullptr);
    }

    // Opens the folder and waits until every title has its picture.
    void open(const QString& folder)
    {
        list->refreshArchiveList(folder);
        const bool complete = QTest::qWaitFor(
            [this] {
                const ArchiveItem* last = item(list->count() - 1);
                return !last || last->hasChildWidgets();
            },
            PATIENCE_MS);
        if (!complete)
            qFatal("the titles have no pictures");
        canvas.clear();
    }

    // Fingers in list coordinates
    void press(int x, int y, int finger = 0) { touch().press(finger, QPoint(x, y), list); }
    void move(int x, int y, int finger = 0) { touch().move(finger, QPoint(x, y), list); }
    void release(int x, int y, int finger = 0) { touch().release(finger, QPoint(x, y), list); }
    void tap(int x, int y)
    {
        press(x, y);
        release(x, y);
    }
    void tapTitle(int row) { tap(PICTURE_X, row * ROW + 60); }
    void hold(int x, int y)
    {
        press(x, y);
        clock.advance(HOLD_TIME);
        release(x, y);
    }
    // Moves the finger at constant speed, with one step of the flick timer after each step.
    void drag(int x, int fromY, int toY, int steps)
    {
        for (int i = 1; i <= steps; ++i) {
            move(x, fromY + (toY - fromY) * i / steps);
            clock.advance(TICK);
        }
    }
    // Lifts the title in this row of the widget by its handle and moves the finger to y in small steps.
    void liftTo(int row, int y)
    {
        const int from = row * ROW + 65;
        press(HANDLE_X, from);
        clock.advance(LIFT_TIME);
        for (int i = 1; i <= 8; ++i)
            move(HANDLE_X, from + (y - from) * i / 8);
    }
    void carry(int row, int y)
    {
        liftTo(row, y);
        release(HANDLE_X, y);
    }

    ArchiveMenu* menu() const { return list->findChild<ArchiveMenu*>(); }
    // Taps an entry of the open menu.
    void choose(ArchiveAction::ARCHIVE_ACTION_TYPE type)
    {
        ArchiveMenu* open = menu();
        const QPoint row =
            open->getMenuItemRect(static_cast<int>(open->actions().indexOf(open->action(type)))).center();
        m_device.tap(open, row);
    }
    void holdAndChoose(int row, ArchiveAction::ARCHIVE_ACTION_TYPE type)
    {
        hold(PICTURE_X, row * ROW + 60);
        choose(type);
    }

    int value() const { return list->verticalScrollBar()->value(); }
    int maximum() const { return list->verticalScrollBar()->maximum(); }
    int selected() const { return list->getItemIndex(list->getSelectedArchive()); }
    ArchiveItem* item(int index) const { return list->archiveItem(index); }
    QStringList stems() const
    {
        QStringList result;
        for (int i = 0; i < list->count(); ++i)
            result.append(QFileInfo(item(i)->getArchiveDataPath()).completeBaseName());
        return result;
    }
    bool isLocked() const { return !const_cast<KSAppEventFilter&>(m_filter).activateLockObjects().isEmpty(); }
    QStringList takeCanvas() { return std::exchange(canvas, {}); }

    ManualClock clock; // declared before all widgets, which use it
    KSAppEventFilter m_filter;
    QUndoStack stack;
    QLabel label;
    QWidget window;
    ArchiveList* list = nullptr; // owned by window
    QStringList canvas;          // stems sent to the canvas; "null" for none

private:
    QTest::QTouchEventWidgetSequence touch() { return QTest::touchEvent(&window, m_device); }

    TouchDevice& m_device;
};
