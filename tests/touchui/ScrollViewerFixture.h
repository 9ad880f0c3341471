#pragma once

#include "TouchDevice.h"
#include "tests/fakes/ManualClock.h"
#include "tests/support/Patience.h"
#include "touchui/KSAppEventFilter.h"
#include "touchui/KSBaseItemWidget.h"
#include "touchui/KSEventDefaultMutexLockObject.h"
#include "touchui/KSScrollViewerWidget.h"

#include <QApplication>
#include <QScrollBar>
#include <QStringList>
#include <QTest>
#include <QTouchEvent>

#include <memory>

// A row that can be identified by its name. Its clone is shown during a drag.
class Row : public KSBaseItemWidget
{
public:
    explicit Row(const QString& name, bool hasClone = true) : mHasClone(hasClone)
    {
        setObjectName(name);
        setFixedHeight(100);
    }
    KSBaseItemWidget* clone() override
    {
        if (!mHasClone)
            return nullptr;
        auto* copy = new Row(objectName() + QStringLiteral(" clone"));
        copy->setFixedSize(size());
        return copy;
    }
    bool mHasClone;
};

// A list of rows in a window with the application's event filter, fingers of a touch device, and a clock that
// the test advances.
class ScrollViewerFixture : public QObject
{
public:
    static constexpr int WIDTH = 400;
    static constexpr int HEIGHT = 500;
    static constexpr int ROW = 104; // height with the gap

    explicit ScrollViewerFixture(TouchDevice& device) : mDevice(device)
    {
        mFilter.registerLockObject(&mFilter, nullptr, LOCKOBJECT_DEFAULTMUTEX, nullptr);
        QCoreApplication::instance()->installEventFilter(&mFilter);
        mWindow.resize(800, 700);
        mList = new KSScrollViewerWidget(&mWindow);
        mList->move(100, 100);
        mList->setSize(WIDTH, HEIGHT);
        mList->setHEffectiveArea(38, 362);
        KSScrollViewerWidget::s_mainWnd = &mWindow;
        record();
        mWindow.show();
        if (!QTest::qWaitForWindowExposed(&mWindow, PATIENCE_MS))
            qFatal("no window");
    }
    ~ScrollViewerFixture() override
    {
        QCoreApplication::instance()->removeEventFilter(&mFilter);
        KSScrollViewerWidget::s_mainWnd.clear();
    }

    void fill(int rows, bool withClones = true)
    {
        QList<KSBaseItemWidget*> items;
        for (int i = 0; i < rows; ++i)
            items.append(new Row(QString::number(i), withClones));
        mList->addWidgetItems(&items, -1);
        log.clear();
    }

    // Fingers in coordinates of the list
    void press(int x, int y, int id = 0) { touch().press(id, QPoint(x, y), mList); }
    void move(int x, int y, int id = 0) { touch().move(id, QPoint(x, y), mList); }
    void release(int x, int y, int id = 0) { touch().release(id, QPoint(x, y), mList); }
    QTest::QTouchEventWidgetSequence touch() { return QTest::touchEvent(&mWindow, mDevice); }
    // Returns a sequence for several fingers, which keeps their positions. Each step ends with commit().
    QTest::QTouchEventWidgetSequence fingers() { return QTest::touchEvent(&mWindow, mDevice, false); }
    void tap(int x, int y)
    {
        press(x, y);
        release(x, y);
    }
    // Moves the finger at constant speed, with one tick of the clock after each step.
    void drag(int x, int fromY, int toY, int steps)
    {
        for (int i = 1; i <= steps; ++i) {
            move(x, fromY + (toY - fromY) * i / steps);
            clock.advance(33);
        }
    }

    int value() const { return mList->verticalScrollBar()->value(); }
    int maximum() const { return mList->verticalScrollBar()->maximum(); }
    QStringList order() const
    {
        QStringList names;
        for (int i = 0; i < mList->count(); ++i)
            names.append(mList->getWidgetItem(i)->objectName());
        return names;
    }
    QStringList takeLog() { return std::exchange(log, {}); }

    ManualClock clock; // declared before all widgets, which use it
    KSAppEventFilter mFilter;
    QWidget mWindow;
    KSScrollViewerWidget* mList = nullptr;
    TouchDevice& mDevice;
    QStringList log;
    bool answerWillFlick = true;

private:
    void note(const char* what, const KSBaseItemWidget* item)
    {
        log.append(QString::fromLatin1(what) + QLatin1Char(' ') +
                   (item ? item->objectName() : QStringLiteral("-")));
    }
    void record()
    {
        using List = KSScrollViewerWidget;
        const auto noteAs = [this](const char* what) {
            return [this, what](KSBaseItemWidget* item, QPoint, KSScrollViewerWidget*) { note(what, item); };
        };
        connect(mList, &List::widgetItemPressed, this, noteAs("pressed"));
        connect(mList, &List::widgetItemReleased, this, noteAs("released"));
        connect(mList, &List::widgetItemClicked, this, noteAs("clicked"));
        connect(mList, &List::widgetItemLongHold, this, noteAs("held"));
        connect(mList, &List::widgetItemRightPressed, this, noteAs("right"));
        connect(mList, &List::widgetItemChangeColor, this, noteAs("colour"));
        connect(mList, &List::signalItemDrop, this, [this] { log.append(QStringLiteral("dropped")); });
        connect(mList, &List::signalDragOneItem, this,
                [this](KSBaseItemWidget* item, int, KSScrollViewerWidget*) { note("lifted", item); });
        connect(mList, &List::signalFlick, this,
                [this](KSBaseItemWidget*, QPoint, KSScrollViewerWidget*, bool& willFlick) {
                    willFlick = willFlick || answerWillFlick;
                });
    }
};
