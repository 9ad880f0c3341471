#pragma once

#include "ScrollViewerFixture.h"

#include <QPointingDevice>
#include <QTest>

#include <memory>

// Makes a list in a window with the application's event filter for each test, and checks afterwards that no
// lock is left.
class ScrollViewerTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();

protected:
    void lift(int row);

    QPointingDevice* m_device = nullptr;
    QPointingDevice* m_other = nullptr; // another touch screen
    std::unique_ptr<ScrollViewerFixture> m;
};
