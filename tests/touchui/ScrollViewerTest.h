#pragma once

#include "ScrollViewerFixture.h"
#include "TouchDevice.h"

#include <QTest>

#include <memory>

// Makes a list in a window with the application's event filter for each test, and checks afterwards that no
// lock is left.
class ScrollViewerTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

protected:
    void lift(int row);

    TouchDevice m_device;
    TouchDevice m_other; // another touch screen
    std::unique_ptr<ScrollViewerFixture> m;
};
