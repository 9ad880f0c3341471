// A list in a window under the application's filter, made anew for each test; no test may leave a lock
// behind.
#pragma once

#include "ScrollViewerFixture.h"

#include <QPointingDevice>
#include <QTest>

#include <memory>

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
    QPointingDevice* m_other = nullptr; // a second screen
    std::unique_ptr<ScrollViewerFixture> m;
};
