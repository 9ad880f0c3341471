#include "canvas/GraphicsView.h"
#include "tests/support/Patience.h"
#include "tests/touchui/TouchDevice.h"

#include <QApplication>
#include <QGraphicsScene>
#include <QGraphicsSceneMouseEvent>
#include <QSignalSpy>
#include <QTest>

namespace
{

// Writes down the mouse events that reach the scene.
class RecordingScene : public QGraphicsScene
{
public:
    QStringList events;
    QList<QPointF> points;
    Qt::MouseButtons buttonsOfMove;

protected:
    void mousePressEvent(QGraphicsSceneMouseEvent* event) override { record("press", event); }
    void mouseDoubleClickEvent(QGraphicsSceneMouseEvent* event) override { record("double", event); }
    void mouseReleaseEvent(QGraphicsSceneMouseEvent* event) override { record("release", event); }
    void mouseMoveEvent(QGraphicsSceneMouseEvent* event) override
    {
        buttonsOfMove = event->buttons();
        record("move", event);
    }

private:
    void record(const char* name, const QGraphicsSceneMouseEvent* event)
    {
        events.append(name);
        points.append(event->scenePos());
    }
};

} // namespace

class tst_graphicsview : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void tapIsAClick();
    void jitterIsDropped();
    void dragIsMoved();
    void threeQuickTouches();
    void slowTouchesAreClicks();
    void onlyTheFirstFingerCounts();
    void mouseWorksAsEver();
    void acceptsTouch();

private:
    void touch(QEventPoint::State state, QPoint point);

    TouchDevice m_device;
    RecordingScene* m_scene = nullptr;
    GraphicsView* m_view = nullptr;
};

void tst_graphicsview::init()
{
    m_scene = new RecordingScene;
    m_scene->setSceneRect(0, 0, 400, 300);
    m_view = new GraphicsView(m_scene);
    m_view->setFrameStyle(0);
    m_view->resize(400, 300);
    m_view->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_view, PATIENCE_MS));
}

void tst_graphicsview::cleanup()
{
    delete m_view;
    delete m_scene;
}

void tst_graphicsview::touch(QEventPoint::State state, QPoint point)
{
    auto sequence = QTest::touchEvent(m_view->viewport(), m_device, false);
    if (state == QEventPoint::Pressed)
        sequence.press(1, point, m_view->viewport());
    else if (state == QEventPoint::Released)
        sequence.release(1, point, m_view->viewport());
    else
        sequence.move(1, point, m_view->viewport());
    sequence.commit();
}

void tst_graphicsview::tapIsAClick()
{
    QSignalSpy empty(m_view, &GraphicsView::deleteEmptyItem);
    touch(QEventPoint::Pressed, QPoint(50, 61));
    touch(QEventPoint::Released, QPoint(50, 61));
    QCOMPARE(m_scene->events, QStringList({"press", "release"}));
    QCOMPARE(m_scene->points.at(0), QPointF(50, 61));
    QCOMPARE(empty.count(), 1);
}

void tst_graphicsview::jitterIsDropped()
{
    const int limit = QApplication::startDragDistance();
    touch(QEventPoint::Pressed, QPoint(50, 60));
    touch(QEventPoint::Updated, QPoint(50 + limit, 60));
    touch(QEventPoint::Updated, QPoint(50, 60 - limit));
    touch(QEventPoint::Released, QPoint(50, 60));
    QCOMPARE(m_scene->events, QStringList({"press", "release"}));
}

void tst_graphicsview::dragIsMoved()
{
    touch(QEventPoint::Pressed, QPoint(50, 60));
    touch(QEventPoint::Updated, QPoint(51 + QApplication::startDragDistance(), 60));
    QCOMPARE(m_scene->events, QStringList({"press", "move"}));
    QCOMPARE(m_scene->buttonsOfMove, Qt::LeftButton);
    touch(QEventPoint::Released, QPoint(100, 60));
    QCOMPARE(m_scene->events.last(), QStringLiteral("release"));
}

void tst_graphicsview::threeQuickTouches()
{
    for (int i = 0; i < 3; ++i) {
        touch(QEventPoint::Pressed, QPoint(50, 60));
        touch(QEventPoint::Released, QPoint(50, 60));
    }
    QCOMPARE(m_scene->events, QStringList({"press", "release", "double", "release", "press", "release"}));
}

void tst_graphicsview::slowTouchesAreClicks()
{
    touch(QEventPoint::Pressed, QPoint(50, 60));
    touch(QEventPoint::Released, QPoint(50, 60));
    m_view->mouseClick();
    touch(QEventPoint::Pressed, QPoint(50, 60));
    touch(QEventPoint::Released, QPoint(50, 60));
    QCOMPARE(m_scene->events, QStringList({"press", "release", "press", "release"}));
}

void tst_graphicsview::onlyTheFirstFingerCounts()
{
    auto sequence = QTest::touchEvent(m_view->viewport(), m_device, false);
    sequence.press(1, QPoint(10, 20), m_view->viewport()).press(2, QPoint(200, 200), m_view->viewport());
    sequence.commit();
    QCOMPARE(m_scene->points, QList<QPointF>({QPointF(10, 20)}));
    QTest::touchEvent(m_view->viewport(), m_device)
        .release(1, QPoint(10, 20), m_view->viewport())
        .release(2, QPoint(200, 200), m_view->viewport());
}

void tst_graphicsview::mouseWorksAsEver()
{
    QTest::mouseClick(m_view->viewport(), Qt::LeftButton, {}, QPoint(5, 5));
    QTest::mouseDClick(m_view->viewport(), Qt::LeftButton, {}, QPoint(5, 5));
    QVERIFY(m_scene->events.contains("double"));
    QCOMPARE(m_scene->events.first(), QStringLiteral("press"));
}

void tst_graphicsview::acceptsTouch()
{
    QVERIFY(m_view->testAttribute(Qt::WA_AcceptTouchEvents));
    QVERIFY(m_view->viewport()->testAttribute(Qt::WA_AcceptTouchEvents));
}

QTEST_MAIN(tst_graphicsview)
#include "tst_graphicsview.moc"
