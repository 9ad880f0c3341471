#include "ScrollViewerTest.h"

void ScrollViewerTest::init()
{
    m = std::make_unique<ScrollViewerFixture>(m_device);
}

void ScrollViewerTest::cleanup()
{
    const bool locked = !m->m_filter.activateLockObjects().isEmpty();
    m.reset();
    QVERIFY2(!locked, "a touch lock is left");
}

// With a finger on the row's handle until it is off the list.
void ScrollViewerTest::lift(int row)
{
    m->m_list->setItemsDragFlagAlignment(DRAGFLAG_LEFT);
    m->fill(20);
    m->m_list->slotItemsCanDrag(true);
    m->press(50, row * ScrollViewerFixture::ROW + 50);
    m->clock.advance(50);
    QVERIFY(m->m_list->isDragging());
    QCOMPARE(m->takeLog(), QStringList{QStringLiteral("lifted %1").arg(row)});
    QCOMPARE(m->m_list->count(), 19);
}
