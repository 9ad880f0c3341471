#include "TreeViewFixture.h"
#include "tests/support/Patience.h"

void TreeViewFixture::initTestCase()
{
    Q_INIT_RESOURCE(UILibrary);
    qRegisterMetaType<QLineEdit*>();
}

void TreeViewFixture::init()
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
    QVERIFY(QTest::qWaitForWindowExposed(m_tree.get(), PATIENCE_MS));
    m_area = m_tree->viewport();
}

void TreeViewFixture::cleanup()
{
    m_tree.reset();
    m_model.reset();
    m_source.reset();
    m_filter.reset();
}

void TreeViewFixture::touchTap(const QPoint& point)
{
    m_device.tap(m_area, point);
}

// Leaves the finger up. The list lags behind the finger, so it glides.
void TreeViewFixture::swipe(const QPoint& from, int distance, int steps)
{
    QTest::touchEvent(m_area, m_device).press(0, from, m_area);
    for (int step = 1; step <= steps; ++step)
        QTest::touchEvent(m_area, m_device).move(0, from + QPoint(0, distance * step / steps), m_area);
    QTest::touchEvent(m_area, m_device).release(0, from + QPoint(0, distance), m_area);
}

QImage TreeViewFixture::shot()
{
    return m_tree->grab().toImage().convertToFormat(QImage::Format_RGB32);
}
