// A touch tree of 40 folders with three files each, under a touch screen and the application's filter.
#pragma once

#include "TreeFixture.h"

#include "touchui/CustomTreeDelegete.h"
#include "touchui/KSAppEventFilter.h"
#include "touchui/KSScrollBar.h"
#include "touchui/KSToolTip.h"
#include "touchui/KSTreeHeaderView.h"
#include "touchui/KSTreeModel.h"
#include "touchui/KSTreeView.h"

#include <QApplication>
#include <QLineEdit>
#include <QPointingDevice>
#include <QSignalSpy>
#include <QTest>

// Lets the tests see the ticks of the motion.
class ProbeTree : public KSTreeView
{
public:
    using KSTreeView::KSTreeView;
    int ticks = 0;
    int bottoms = 0;
    QList<int> offsets;

    void changeScrollBarValue(int offset) override
    {
        ++ticks;
        offsets.append(offset);
        KSTreeView::changeScrollBarValue(offset);
    }
};

class SelfEndingSource : public TreeSource
{
public:
    bool isControlSelfEnding() const override { return true; }
};

class TreeViewFixture
{
public:
    static constexpr int ROW = 48;

    TreeViewFixture() : m_device(QTest::createTouchDevice()) { qRegisterMetaType<QLineEdit*>(); }

protected:
    void open()
    {
        m_filter = std::make_unique<KSAppEventFilter>();
        m_filter->registerLockObject(m_filter.get(), nullptr, LOCKOBJECT_DEFAULTMUTEX, nullptr);
        qApp->installEventFilter(m_filter.get());
        m_source = std::make_unique<SelfEndingSource>();
        m_source->fill(40, 3);
        m_model = std::make_unique<KSTreeModel>(m_source.get(), 2);
        m_model->createDataItems();
        m_tree = std::make_unique<ProbeTree>();
        m_tree->setModel(m_model.get());
        m_tree->resize(802, 570);
        m_tree->header()->resizeSection(0, 520);
        m_tree->show();
        QVERIFY(QTest::qWaitForWindowExposed(m_tree.get()));
        m_area = m_tree->viewport();
    }

    void close()
    {
        m_tree.reset();
        m_model.reset();
        m_source.reset();
        m_filter.reset();
    }

    QPoint rowPoint(int row, int x = 300) const { return QPoint(x, row * ROW + ROW / 2); }

    void touchTap(const QPoint& point)
    {
        QTest::touchEvent(m_area, m_device.get()).press(0, point, m_area);
        QTest::touchEvent(m_area, m_device.get()).release(0, point, m_area);
    }

    // Leaves the finger up. The list lags behind the finger, so it glides.
    void swipe(const QPoint& from, int distance, int steps)
    {
        QTest::touchEvent(m_area, m_device.get()).press(0, from, m_area);
        for (int step = 1; step <= steps; ++step) {
            QTest::touchEvent(m_area, m_device.get())
                .move(0, from + QPoint(0, distance * step / steps), m_area);
        }
        QTest::touchEvent(m_area, m_device.get()).release(0, from + QPoint(0, distance), m_area);
    }

    QImage shot() { return m_tree->grab().toImage().convertToFormat(QImage::Format_RGB32); }

    std::unique_ptr<QPointingDevice> m_device;
    std::unique_ptr<KSAppEventFilter> m_filter;
    std::unique_ptr<SelfEndingSource> m_source;
    std::unique_ptr<KSTreeModel> m_model;
    std::unique_ptr<ProbeTree> m_tree;
    QWidget* m_area = nullptr;
};
