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
    explicit Row(const QString& name, bool hasClone = true) : m_hasClone(hasClone)
    {
        setObjectName(name);
        setFixedHeight(100);
    }
    KSBaseItemWidget* clone() override
    {
        if (!m_hasClone)
            return nullptr;
        auto* copy = new Row(objectName() + QStringLiteral(" clone"));
        copy->setFixedSize(size());
        return copy;
    }
    bool m_hasClone;
};

// A list of rows in a window with the application's event filter, fingers of a touch device, and a clock that
// the test advances.
class ScrollViewerFixture : public QObject
{
public:
    static constexpr int WIDTH = 400;
    static constexpr int HEIGHT = 500;
    static constexpr int ROW = 104; // height with the gap

    explicit ScrollViewerFixture(TouchDevice& device) : m_device(device)
    {
        m_filter.registerLockObject(&m_filter, nullptr, LOCKOBJECT_DEFAULTMUTEX, nullptr);
        QCoreApplication::instance()->installEventFilter(&m_filter);
        m_window.resize(800, 700);
        m_list = new KSScrollViewerWidget(&m_window);
        m_list->move(100, 100);
        m_list->setSize(WIDTH, HEIGHT);
        m_list->setHEffectiveArea(38, 362);
        KSScrollViewerWidget::s_mainWnd = &m_window;
        record();
        m_window.show();
        if (!QTest::qWaitForWindowExposed(&m_window, PATIENCE_MS))
            qFatal("no window");
    }
    ~ScrollViewerFixture() override
    {
        QCoreApplication::instance()->removeEventFilter(&m_filter);
        KSScrollViewerWidget::s_mainWnd.clear();
    }

    void fill(int rows, bool withClones = true)
    {
        QList<KSBaseItemWidget*> items;
        for (int i = 0; i < rows; ++i)
            items.append(new Row(QString::number(i), withClones));
        m_list->addWidgetItems(&items, -1);
        log.clear();
    }

    // Fingers in coordinates of the list
    void press(int x, int y, int id = 0) { touch().press(id, QPoint(x, y), m_list); }
    void move(int x, int y, int id = 0) { touch().move(id, QPoint(x, y), m_list); }
    void release(int x, int y, int id = 0) { touch().release(id, QPoint(x, y), m_list); }
    QTest::QTouchEventWidgetSequence touch() { return QTest::touchEvent(&m_window, m_device); }
    // Returns a sequence for several fingers, which keeps their positions. Each step ends with commit().
    QTest::QTouchEventWidgetSequence fingers() { return QTest::touchEvent(&m_window, m_device, false); }
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

    int value() const { return m_list->verticalScrollBar()->value(); }
    int maximum() const { return m_list->verticalScrollBar()->maximum(); }
    QStringList order() const
    {
        QStringList names;
        for (int i = 0; i < m_list->count(); ++i)
            names.append(m_list->getWidgetItem(i)->objectName());
        return names;
    }
    QStringList takeLog() { return std::exchange(log, {}); }

    ManualClock clock; // declared before all widgets, which use it
    KSAppEventFilter m_filter;
    QWidget m_window;
    KSScrollViewerWidget* m_list = nullptr;
    TouchDevice& m_device;
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
        connect(m_list, &List::widgetItemPressed, this, noteAs("pressed"));
        connect(m_list, &List::widgetItemReleased, this, noteAs("released"));
        connect(m_list, &List::widgetItemClicked, this, noteAs("clicked"));
        connect(m_list, &List::widgetItemLongHold, this, noteAs("held"));
        connect(m_list, &List::widgetItemRightPressed, this, noteAs("right"));
        connect(m_list, &List::widgetItemChangeColor, this, noteAs("colour"));
        connect(m_list, &List::signalItemDrop, this, [this] { log.append(QStringLiteral("dropped")); });
        connect(m_list, &List::signalDragOneItem, this,
                [this](KSBaseItemWidget* item, int, KSScrollViewerWidget*) { note("lifted", item); });
        connect(m_list, &List::signalFlick, this,
                [this](KSBaseItemWidget*, QPoint, KSScrollViewerWidget*, bool& willFlick) {
                    willFlick = willFlick || answerWillFlick;
                });
    }
};
