#include "ScrollViewerTest.h"

void ScrollViewerTest::init()
{
    m = std::make_unique<ScrollViewerFixture>(m_device);
}

void ScrollViewerTest::cleanup()
{
    const bool locked = !m->mFilter.activateLockObjects().isEmpty();
    m.reset();
    QVERIFY2(!locked, "a touch lock is left");
}

// With a finger on the row's handle until it is off the list.
void ScrollViewerTest::lift(int row)
{
    m->mList->setItemsDragFlagAlignment(DRAGFLAG_LEFT);
    m->fill(20);
    m->mList->slotItemsCanDrag(true);
    m->press(50, row * ScrollViewerFixture::ROW + 50);
    m->clock.advance(50);
    QVERIFY(m->mList->isDragging());
    QCOMPARE(m->takeLog(), QStringList{QStringLiteral("lifted %1").arg(row)});
    QCOMPARE(m->mList->count(), 19);
}
