#pragma once

#include "TouchDevice.h"
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
#include <QSignalSpy>
#include <QTest>
#include <QVBoxLayout>

#include <memory>

inline constexpr int ROW = 48;
inline const QColor BACKGROUND(51, 51, 51);

// Makes the steps of the motion visible to the tests.
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

// A source whose editors end themselves.
class SelfEndingSource : public TreeSource
{
public:
    bool isControlSelfEnding() const override { return true; }
};

// A tree with a source, the application's event filter and fingers.
class TreeViewFixture : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();

protected:
    QPoint rowPoint(int row, int x = 300) const { return QPoint(x, row * ROW + ROW / 2); }
    void touchTap(const QPoint& point);
    void swipe(const QPoint& from, int distance, int steps);
    QImage shot();

    TouchDevice m_device;
    std::unique_ptr<KSAppEventFilter> m_filter;
    std::unique_ptr<SelfEndingSource> m_source;
    std::unique_ptr<KSTreeModel> m_model;
    std::unique_ptr<ProbeTree> m_tree;
    QWidget* m_area = nullptr;
};
