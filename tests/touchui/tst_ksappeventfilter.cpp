// Who may hold the touch: the lock kinds, the filter that asks them, and the lock between processes.
#include "TouchDevice.h"
#include "tests/fakes/FakeTitlerAPPEventFilterController.h"
#include "tests/fakes/ManualClock.h"
#include "tests/support/Patience.h"
#include "touchui/KSAppEventFilter.h"
#include "touchui/KSEventClusterLockObject.h"
#include "touchui/KSEventDefaultMutexLockObject.h"
#include "touchui/KSEventMultiMutexLockObject.h"
#include "touchui/KSEventMutexLockObject.h"
#include "touchui/KSEventProcessLockObject.h"
#include "touchui/TouchEventButton.h"

#include <QDialog>
#include <QSignalSpy>
#include <QTest>
#include <QTouchEvent>

#include <functional>

using namespace APPEventDefine;

namespace
{

// Counts what reaches it, and swallows what it is told to.
class Listener : public QObject
{
public:
    bool eventFilter(QObject* obj, QEvent* event) override
    {
        if (obj->isWidgetType() && event->type() == type) {
            ++count;
            return swallow;
        }
        return false;
    }
    QEvent::Type type = QEvent::None;
    int count = 0;
    bool swallow = false;
};

class EventCounter : public QObject
{
public:
    bool event(QEvent* event) override
    {
        types.append(event->type());
        return QObject::event(event);
    }
    QList<int> types;
};

_tagAPPEvent remoteEvent(int type, bool flag)
{
    _tagAPPEvent event;
    event.lockType = type;
    event.flag = flag;
    return event;
}

} // namespace

class tst_ksappeventfilter : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void mutexHasOneHolder();
    void clusterTakesFive();
    void multiMutexForwards();
    void multiMutexRefusesOtherObjects();
    void defaultMutexWatchdog();
    void priorities();
    void createAndRegister();

    void secondButtonIsLockedOut();
    void sameWidgetTakesASecondFinger();
    void updateWithoutLockIsSwallowed();
    void aStrangersEndIsSwallowed();
    void aVanishedHolderIsCutOff();
    void sixthObjectOfAClusterIsSwallowed();
    void disabledWidgetIsShut();
    void disabledUnderTheFingerFreesTheLock();
    void gestureIsSwallowed();
    void cancelFreesTheLock();
    void anIgnoredTouchFreesTheLock();
    void forcedLockBreaksTheTouch();
    void whatEndsATouchCancelsItAtItsHolder_data();
    void whatEndsATouchCancelsItAtItsHolder();
    void theEndOfATouchOnADisabledWidgetIsOnlySwallowed();
    void anEndThatAFilterSwallowsIsCancelled();
    void registeredFiltersHearInOrder();
    void deletedFilterLeaves();

    void processLockAnnounces();
    void remoteLockShutsEveryTouch();
    void pressAsksTheOtherProcessToGiveWay();
    void restoreAllReachesTheRememberedObject();

private:
    void touch(TouchEventButton* button, int id);
    void lift(TouchEventButton* button, int id);

    TouchDevice m_device;
    std::unique_ptr<KSAppEventFilter> m_filter;
    std::unique_ptr<FakeTitlerAPPEventFilterController> m_controller;
    std::unique_ptr<QWidget> m_window;
    TouchEventButton* m_first = nullptr;
    TouchEventButton* m_second = nullptr;
    std::unique_ptr<KSLockObject> m_forced;
    std::unique_ptr<QDialog> m_dialog;
};

void tst_ksappeventfilter::init()
{
    m_controller = std::make_unique<FakeTitlerAPPEventFilterController>();
    m_filter = std::make_unique<KSAppEventFilter>();
    m_filter->registerLockObject(m_filter.get(), nullptr, LOCKOBJECT_DEFAULTMUTEX, nullptr);
    qApp->installEventFilter(m_filter.get());
    m_forced.reset(KSEventMutexLockObject::createFactory(nullptr));
    m_window = std::make_unique<QWidget>();
    m_window->resize(400, 200);
    m_first = new TouchEventButton(QStringLiteral("first"), m_window.get());
    m_first->setGeometry(10, 10, 100, 60);
    m_second = new TouchEventButton(QStringLiteral("second"), m_window.get());
    m_second->setGeometry(200, 10, 100, 60);
    m_window->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_window.get(), PATIENCE_MS));
}

void tst_ksappeventfilter::cleanup()
{
    m_dialog.reset();
    m_window.reset();
    m_filter.reset();
    m_controller.reset();
    QVERIFY(ITitlerAPPEventFilterController::getInstance() == nullptr);
}

void tst_ksappeventfilter::mutexHasOneHolder()
{
    const std::unique_ptr<KSLockObject> lock(KSEventMutexLockObject::createFactory(nullptr));
    QObject a;
    QObject b;
    QCOMPARE(lock->tryLock(&a, LOCKMETHOD_TOUCH, nullptr), -1);
    QCOMPARE(lock->tryUnlock(&a, LOCKMETHOD_TOUCH), -1);
    QCOMPARE(lock->registerObj(&a), 0);
    QCOMPARE(lock->registerObj(&a), 0);
    QCOMPARE(lock->registerObj(&b), 0);
    QCOMPARE(lock->registeredObj().size(), 2);
    QCOMPARE(lock->tryUnlock(&a, LOCKMETHOD_TOUCH), 0); // free already
    QCOMPARE(lock->tryLock(&a, LOCKMETHOD_TOUCH, nullptr), 0);
    QCOMPARE(lock->tryLock(&a, LOCKMETHOD_TOUCH, nullptr), 0);
    QCOMPARE(lock->tryLock(&b, LOCKMETHOD_TOUCH, nullptr), -1);
    QVERIFY(lock->isLocked());
    QVERIFY(lock->isLockedObj(&a, LOCKMETHOD_TOUCH));
    QVERIFY(!lock->isLockedObj(&b, LOCKMETHOD_TOUCH));
    QCOMPARE(lock->tryUnlock(&b, LOCKMETHOD_TOUCH), -1);
    QCOMPARE(lock->tryUnlock(&a, LOCKMETHOD_TOUCH), 0);
    QVERIFY(!lock->isLocked());
    lock->unregisterObj(&a);
    QVERIFY(!lock->isRegisterObj(&a));
}

void tst_ksappeventfilter::clusterTakesFive()
{
    const std::unique_ptr<KSLockObject> lock(KSEventClusterLockObject::createFactory(nullptr));
    QObject objects[6];
    QObject stranger;
    QCOMPARE(lock->tryLock(&stranger, LOCKMETHOD_TOUCH, nullptr), -1);
    for (QObject& object : objects)
        lock->registerObj(&object);
    for (int i = 0; i < 5; ++i)
        QCOMPARE(lock->tryLock(&objects[i], LOCKMETHOD_TOUCH, nullptr), 0);
    QCOMPARE(lock->tryLock(&objects[5], LOCKMETHOD_TOUCH, nullptr), -1);
    QVERIFY(!lock->isLockedObj(&objects[5], LOCKMETHOD_TOUCH));
    QCOMPARE(lock->tryUnlock(&stranger, LOCKMETHOD_TOUCH), -1);
    QCOMPARE(lock->tryUnlock(&objects[0], LOCKMETHOD_TOUCH), 0);
    QVERIFY(lock->isLocked());
    QCOMPARE(lock->tryLock(&objects[5], LOCKMETHOD_TOUCH, nullptr), 0);
    for (int i = 1; i < 6; ++i)
        QCOMPARE(lock->tryUnlock(&objects[i], LOCKMETHOD_TOUCH), 0);
    QVERIFY(!lock->isLocked());
}

void tst_ksappeventfilter::multiMutexForwards()
{
    const std::unique_ptr<KSLockObject> group(KSEventMultiMutexLockObject::createFactory(nullptr));
    const std::unique_ptr<KSLockObject> one(KSEventMutexLockObject::createFactory(nullptr));
    const std::unique_ptr<KSLockObject> two(KSEventMutexLockObject::createFactory(nullptr));
    QObject a;
    QObject b;
    one->registerObj(&a);
    two->registerObj(&b);
    QVERIFY(group->isLocked()); // an empty group
    QCOMPARE(group->tryLock(&a, LOCKMETHOD_TOUCH, nullptr), -1);
    QCOMPARE(group->registerObj(one.get()), 0);
    QCOMPARE(group->registerObj(two.get()), 0);
    QVERIFY(group->isRegisterObj(&a));
    QVERIFY(!group->isLocked());
    QCOMPARE(group->tryLock(&a, LOCKMETHOD_TOUCH, nullptr), 0);
    QVERIFY(group->isLockedObj(&a, LOCKMETHOD_TOUCH));
    QVERIFY(!group->isLocked());
    QCOMPARE(group->tryLock(&b, LOCKMETHOD_TOUCH, nullptr), 0);
    QVERIFY(group->isLocked());
    group->reset();
    QVERIFY(!one->isLocked());
    QVERIFY(!two->isLocked());
    QCOMPARE(group->unregisterObj(one.get()), 0);
    QVERIFY(!group->isRegisterObj(&a));
}

void tst_ksappeventfilter::multiMutexRefusesOtherObjects()
{
    const std::unique_ptr<KSLockObject> group(KSEventMultiMutexLockObject::createFactory(nullptr));
    QObject plain;
    QCOMPARE(group->registerObj(&plain), -1);
    QCOMPARE(group->registerObj(m_first), -1);
    QCOMPARE(group->registerObj(nullptr), -1);
    QCOMPARE(group->registerObj(group.get()), -1);
    QCOMPARE(group->registerObj(KSEventDefaultMutexLockObject::createFactory(m_filter.get(), nullptr)), -1);
    QCOMPARE(group->unregisterObj(&plain), -1);
    QVERIFY(group->registeredObj().isEmpty());
}

void tst_ksappeventfilter::defaultMutexWatchdog()
{
    auto* lock = KSEventDefaultMutexLockObject::createFactory(m_filter.get(), nullptr);
    ManualClock clock;
    touch(m_first, 0);
    clock.advance(9999);
    QVERIFY(lock->isLocked());
    // Each update of the holder starts the time anew; a second begin does not.
    QTest::touchEvent(m_first, m_device).move(0, QPoint(22, 20));
    clock.advance(9999);
    QVERIFY(lock->isLocked());
    QVERIFY(m_first->isDown());
    QCOMPARE(lock->tryLock(m_first, LOCKMETHOD_TOUCH, nullptr), 0);
    clock.advance(1);
    QVERIFY(!m_filter->isLock(nullptr, LOCKMETHOD_TOUCH));
    QVERIFY(!lock->isLocked());
    QVERIFY(!m_first->isDown());
    // The finger that held it is shut out until its next touch.
    QSignalSpy clicked(m_first, &QAbstractButton::clicked);
    lift(m_first, 0);
    QCOMPARE(clicked.count(), 0);
}

void tst_ksappeventfilter::priorities()
{
    auto* mutex = static_cast<KSEventMutexLockObject*>(
        m_filter->registerLockObject(m_first, nullptr, LOCKOBJECT_MUTEX, nullptr));
    QVERIFY(mutex != nullptr);
    touch(m_first, 0);
    QVERIFY(mutex->isLocked()); // asked before the lock of last resort
    QVERIFY(!KSEventDefaultMutexLockObject::createFactory(m_filter.get(), nullptr)->isLocked());
    QCOMPARE(m_filter->activateLockObjects().value(mutex), QList<QObject*>{m_first});
    lift(m_first, 0);
    QVERIFY(!mutex->isLocked());
    m_filter->removeRegLockObject(mutex);
    touch(m_first, 0);
    QVERIFY(!mutex->isLocked());
    lift(m_first, 0);
}

void tst_ksappeventfilter::createAndRegister()
{
    QObject a;
    QObject b;
    KSLockObject* cluster =
        m_filter->registerLockObject(QList<QObject*>{&a, &b}, nullptr, LOCKOBJECT_CLUSTER, nullptr);
    QVERIFY(cluster->isRegisterObj(&a));
    QVERIFY(cluster->isRegisterObj(&b));
    QCOMPARE(m_filter->unregisterLockObject(&a, cluster), 0);
    QVERIFY(!cluster->isRegisterObj(&a));
    QCOMPARE(m_filter->unregisterLockObject(&a, nullptr), 0);
    // A multi mutex takes only locks, so making one for another object is refused.
    QVERIFY(m_filter->createLockObject(&a, nullptr, LOCKOBJECT_MULTIMUTEX, nullptr) == nullptr);
    QVERIFY(m_filter->createLockObject(&a, nullptr, LOCKOBJECT_PROCESS, nullptr) == nullptr);
    QVERIFY(m_filter->createLockObject(&a, nullptr, static_cast<LOCKOBJECT_TYPE>(9), nullptr) == nullptr);
    QCOMPARE(m_filter->createLockObject(&a, cluster, LOCKOBJECT_DEFAULTMUTEX, nullptr),
             KSEventDefaultMutexLockObject::createFactory(m_filter.get(), nullptr));
}

void tst_ksappeventfilter::touch(TouchEventButton* button, int id)
{
    QTest::touchEvent(button, m_device).press(id, QPoint(20, 20));
}

void tst_ksappeventfilter::lift(TouchEventButton* button, int id)
{
    QTest::touchEvent(button, m_device).release(id, QPoint(20, 20));
}

void tst_ksappeventfilter::secondButtonIsLockedOut()
{
    QSignalSpy first(m_first, &QAbstractButton::clicked);
    QSignalSpy second(m_second, &QAbstractButton::clicked);
    auto fingers = QTest::touchEvent(m_window.get(), m_device, false);
    fingers.press(0, QPoint(20, 20), m_first).commit();
    fingers.stationary(0).press(1, QPoint(20, 20), m_second).commit();
    QVERIFY(m_first->isDown());
    QVERIFY(!m_second->isDown());
    fingers.stationary(0).release(1, QPoint(20, 20), m_second).commit();
    QVERIFY(m_first->isDown());
    fingers.release(0, QPoint(20, 20), m_first).commit();
    QCOMPARE(first.count(), 1);
    QCOMPARE(second.count(), 0);
    touch(m_second, 0);
    lift(m_second, 0);
    QCOMPARE(second.count(), 1);
}

void tst_ksappeventfilter::sameWidgetTakesASecondFinger()
{
    QSignalSpy points(m_first, &TouchEventButton::signalPressedPoint);
    touch(m_first, 0);
    QCOMPARE(points.count(), 1);
    // A begin of its own for the holder passes.
    QTouchEvent begin(QEvent::TouchBegin, m_device, Qt::NoModifier,
                      {QEventPoint(1, QEventPoint::Pressed, QPointF(30, 30), QPointF(30, 30))});
    QCoreApplication::sendEvent(m_first, &begin);
    QCOMPARE(points.count(), 2);
    lift(m_first, 0);
}

void tst_ksappeventfilter::updateWithoutLockIsSwallowed()
{
    QTouchEvent update(QEvent::TouchUpdate, m_device);
    QVERIFY(m_filter->doEventFilter(m_first, &update));
    QTouchEvent end(QEvent::TouchEnd, m_device);
    QVERIFY(m_filter->doEventFilter(m_first, &end));
    QEvent other(QEvent::User);
    QCOMPARE(m_filter->doLock(m_first, &other), 1);
    QCOMPARE(m_filter->getLockMethod(&update), LOCKMETHOD_TOUCH);
    QCOMPARE(m_filter->getLockMethod(&other), LOCKMETHOD_OTHER);
    const QEvent press(QEvent::MouseButtonPress);
    QCOMPARE(m_filter->getLockMethod(const_cast<QEvent*>(&press)), LOCKMETHOD_MOUSE);
}

void tst_ksappeventfilter::aStrangersEndIsSwallowed()
{
    touch(m_first, 0);
    QTouchEvent end(QEvent::TouchEnd, m_device, Qt::NoModifier,
                    {QEventPoint(1, QEventPoint::Released, QPointF(30, 30), QPointF(30, 30))});
    QVERIFY(m_filter->doEventFilter(m_second, &end));
    QVERIFY(m_filter->isLock(nullptr, LOCKMETHOD_TOUCH));
    QVERIFY(m_first->isDown());
    lift(m_first, 0);
    QVERIFY(!m_filter->isLock(nullptr, LOCKMETHOD_TOUCH));
}

// Those who come later need not wait for the watchdog.
void tst_ksappeventfilter::aVanishedHolderIsCutOff()
{
    auto* gone = new TouchEventButton;
    gone->setGeometry(600, 400, 100, 100);
    gone->show();
    QVERIFY(QTest::qWaitForWindowExposed(gone, PATIENCE_MS));
    QTest::touchEvent(gone, m_device).press(0, QPoint(20, 20));
    QVERIFY(gone->isDown());
    delete gone;
    QVERIFY(!m_filter->isLock(nullptr, LOCKMETHOD_TOUCH));
    QSignalSpy clicked(m_second, &QAbstractButton::clicked);
    touch(m_second, 1);
    lift(m_second, 1);
    QCOMPARE(clicked.count(), 1);
}

void tst_ksappeventfilter::sixthObjectOfAClusterIsSwallowed()
{
    EventCounter objects[6];
    QList<QObject*> all;
    for (EventCounter& object : objects)
        all.append(&object);
    KSLockObject* cluster = m_filter->registerLockObject(all, nullptr, LOCKOBJECT_CLUSTER, nullptr);
    const auto send = [this](QObject* object, QEvent::Type type) {
        QTouchEvent event(type, m_device);
        return QCoreApplication::sendEvent(object, &event);
    };
    for (EventCounter& object : objects)
        send(&object, QEvent::TouchBegin);
    QCOMPARE(m_filter->activateLockObjects().value(cluster).size(), 5);
    QCOMPARE(objects[4].types, QList<int>{QEvent::TouchBegin});
    QVERIFY(objects[5].types.isEmpty());
    send(&objects[5], QEvent::TouchUpdate);
    send(&objects[5], QEvent::TouchEnd);
    QVERIFY(objects[5].types.isEmpty());
    // The finger that lifts frees a place.
    send(&objects[0], QEvent::TouchEnd);
    QCOMPARE(objects[0].types.constLast(), int(QEvent::TouchEnd));
    send(&objects[5], QEvent::TouchBegin);
    QCOMPARE(objects[5].types, QList<int>{QEvent::TouchBegin});
    for (int i = 1; i < 6; ++i) {
        QVERIFY(m_filter->isLock(nullptr, LOCKMETHOD_TOUCH));
        send(&objects[i], QEvent::TouchEnd);
    }
    QVERIFY(!m_filter->isLock(nullptr, LOCKMETHOD_TOUCH));
    m_filter->removeRegLockObject(cluster);
}

void tst_ksappeventfilter::disabledWidgetIsShut()
{
    QSignalSpy begun(m_filter.get(), &KSAppEventFilter::signalEventBegin);
    QSignalSpy points(m_first, &TouchEventButton::signalPressedPoint);
    m_first->setEnabled(false);
    touch(m_first, 0);
    QCOMPARE(begun.count(), 1);
    QCOMPARE(points.count(), 0);
    QVERIFY(!m_filter->isLock(nullptr, LOCKMETHOD_TOUCH));
    lift(m_first, 0);
}

void tst_ksappeventfilter::gestureIsSwallowed()
{
    QEvent gesture(QEvent::Gesture);
    QVERIFY(m_filter->doEventFilter(m_first, &gesture));
    QEvent other(QEvent::Timer);
    QVERIFY(!m_filter->doEventFilter(m_first, &other));
}

void tst_ksappeventfilter::disabledUnderTheFingerFreesTheLock()
{
    QSignalSpy clicked(m_first, &QAbstractButton::clicked);
    touch(m_first, 0);
    m_first->setEnabled(false);
    lift(m_first, 0);
    QVERIFY(!m_filter->isLock(nullptr, LOCKMETHOD_TOUCH));
    m_first->setEnabled(true);
    QCOMPARE(clicked.count(), 0);
}

void tst_ksappeventfilter::cancelFreesTheLock()
{
    touch(m_first, 0);
    QVERIFY(m_filter->isLock(nullptr, LOCKMETHOD_TOUCH));
    QTouchEvent cancel(QEvent::TouchCancel, m_device);
    QCoreApplication::sendEvent(m_first, &cancel);
    QVERIFY(!m_filter->isLock(nullptr, LOCKMETHOD_TOUCH));
    lift(m_first, 0);
}

// A widget that takes touches and does nothing with them, as a window beside its buttons.
void tst_ksappeventfilter::anIgnoredTouchFreesTheLock()
{
    QWidget ground;
    ground.setAttribute(Qt::WA_AcceptTouchEvents);
    ground.setGeometry(600, 400, 100, 100);
    ground.show();
    QVERIFY(QTest::qWaitForWindowExposed(&ground, PATIENCE_MS));
    QSignalSpy clicked(m_first, &QAbstractButton::clicked);
    QTest::touchEvent(&ground, m_device).press(0, QPoint(50, 50));
    QVERIFY(m_filter->isLock(nullptr, LOCKMETHOD_TOUCH));
    QTest::touchEvent(&ground, m_device).press(1, QPoint(20, 20)).stationary(0);
    QTest::touchEvent(&ground, m_device).release(0, QPoint(50, 50)).stationary(1);
    QTest::touchEvent(&ground, m_device).release(1, QPoint(20, 20));
    QTRY_VERIFY(!m_filter->isLock(nullptr, LOCKMETHOD_TOUCH));
    touch(m_first, 0);
    QCoreApplication::processEvents();
    QVERIFY(m_filter->isLock(nullptr, LOCKMETHOD_TOUCH));
    QTest::touchEvent(m_first, m_device).move(0, QPoint(12, 12));
    QCoreApplication::processEvents();
    QVERIFY(m_filter->isLock(nullptr, LOCKMETHOD_TOUCH));
    lift(m_first, 0);
    QCOMPARE(clicked.count(), 1);
}

void tst_ksappeventfilter::forcedLockBreaksTheTouch()
{
    const std::unique_ptr<KSLockObject> forced(KSEventMutexLockObject::createFactory(nullptr));
    QSignalSpy clicked(m_first, &QAbstractButton::clicked);
    touch(m_first, 0);
    m_filter->lock(forced.get());
    QCOMPARE(m_filter->activateLockObjects().keys(), QList<KSLockObject*>{forced.get()});
    QVERIFY(m_filter->activateLockObjects().value(forced.get()).isEmpty());
    lift(m_first, 0);
    QCOMPARE(clicked.count(), 0);
    touch(m_second, 0);
    QVERIFY(!m_second->isDown());
    lift(m_second, 0);
    m_filter->unlock();
    QVERIFY(!m_filter->isLock(nullptr, LOCKMETHOD_TOUCH));
}

void tst_ksappeventfilter::whatEndsATouchCancelsItAtItsHolder_data()
{
    QTest::addColumn<std::function<void()>>("end");
    const auto row = [](const char* name, std::function<void()> end) { QTest::newRow(name) << end; };
    row("a forced lock", [this] { m_filter->lock(m_forced.get()); });
    row("unlocking", [this] { m_filter->unlock(); });
    row("a reset, as by the watchdog", [this] { m_filter->resetLock(); });
    row("disabling", [this] { m_first->setEnabled(false); });
    row("disabling the window", [this] { m_window->setEnabled(false); });
    row("hiding", [this] { m_first->hide(); });
    row("hiding the window", [this] { m_window->hide(); });
    row("a modal dialog", [this] {
        m_dialog = std::make_unique<QDialog>();
        m_dialog->setModal(true);
        m_dialog->show();
    });
}

void tst_ksappeventfilter::whatEndsATouchCancelsItAtItsHolder()
{
    QFETCH(std::function<void()>, end);
    QSignalSpy clicked(m_first, &QAbstractButton::clicked);
    touch(m_first, 0);
    QVERIFY(m_first->isDown());
    end();
    QVERIFY(!m_first->isDown());
    for (const QList<QObject*>& holders : m_filter->activateLockObjects())
        QVERIFY(holders.isEmpty());
    // Whatever it was is over; the finger is still there.
    m_filter->unlock();
    m_dialog.reset();
    m_window->setEnabled(true);
    m_window->show();
    m_first->setEnabled(true);
    m_first->show();
    lift(m_first, 0);
    QCOMPARE(clicked.count(), 0);
    touch(m_first, 1);
    QVERIFY(m_first->isDown());
    lift(m_first, 1);
    QCOMPARE(clicked.count(), 1);
    QVERIFY(!m_filter->isLock(nullptr, LOCKMETHOD_TOUCH));
}

void tst_ksappeventfilter::theEndOfATouchOnADisabledWidgetIsOnlySwallowed()
{
    touch(m_second, 0);
    m_first->setEnabled(false);
    QTouchEvent end(QEvent::TouchEnd, m_device, Qt::NoModifier,
                    {QEventPoint(1, QEventPoint::Released, QPointF(30, 30), QPointF(30, 30))});
    QVERIFY(m_filter->doEventFilter(m_first, &end));
    QVERIFY(m_filter->isLock(nullptr, LOCKMETHOD_TOUCH));
    QVERIFY(m_second->isDown());
    lift(m_second, 0);
    QVERIFY(!m_filter->isLock(nullptr, LOCKMETHOD_TOUCH));
}

// A filter that comes to life while the finger is down.
void tst_ksappeventfilter::anEndThatAFilterSwallowsIsCancelled()
{
    QSignalSpy clicked(m_first, &QAbstractButton::clicked);
    touch(m_first, 0);
    Listener eater;
    eater.type = QEvent::TouchEnd;
    eater.swallow = true;
    m_filter->registerEventFilter(&eater);
    lift(m_first, 0);
    QCOMPARE(eater.count, 1);
    QVERIFY(!m_first->isDown());
    QCOMPARE(clicked.count(), 0);
    m_filter->unegisterEventFilter(&eater);
    touch(m_first, 0);
    lift(m_first, 0);
    QCOMPARE(clicked.count(), 1);
}

void tst_ksappeventfilter::registeredFiltersHearInOrder()
{
    Listener one;
    Listener two;
    one.type = two.type = QEvent::MouseButtonPress;
    m_filter->registerEventFilter(&one);
    m_filter->registerEventFilter(&one);
    m_filter->registerEventFilter(&two);
    m_filter->registerEventFilter(nullptr);
    QTest::mouseClick(m_first, Qt::LeftButton);
    QCOMPARE(one.count, 1);
    QCOMPARE(two.count, 1);
    one.swallow = true;
    QSignalSpy clicked(m_first, &QAbstractButton::clicked);
    QTest::mouseClick(m_first, Qt::LeftButton);
    QCOMPARE(one.count, 2);
    QCOMPARE(two.count, 1);
    QCOMPARE(clicked.count(), 0);
    m_filter->unegisterEventFilter(&one);
    QTest::mouseClick(m_first, Qt::LeftButton);
    QCOMPARE(one.count, 2);
    QCOMPARE(two.count, 2);
}

void tst_ksappeventfilter::deletedFilterLeaves()
{
    auto gone = std::make_unique<Listener>();
    gone->type = QEvent::MouseButtonPress;
    gone->swallow = true;
    m_filter->registerEventFilter(gone.get());
    gone.reset();
    QSignalSpy clicked(m_first, &QAbstractButton::clicked);
    QTest::mouseClick(m_first, Qt::LeftButton);
    QCOMPARE(clicked.count(), 1);
}

void tst_ksappeventfilter::processLockAnnounces()
{
    auto* process = new KSEventProcessLockObject(m_filter.get());
    QCOMPARE(m_filter->registerLockObject(m_filter.get(), process, LOCKOBJECT_PROCESS, nullptr), process);
    touch(m_first, 0);
    QCOMPARE(m_controller->sent, (QList<QPair<int, bool>>{{1, true}}));
    lift(m_first, 0);
    QCOMPARE(m_controller->sent, (QList<QPair<int, bool>>{{1, true}, {1, false}}));
    m_filter->resetLock();
    QCOMPARE(m_controller->sent.size(), 3);
    QCOMPARE(m_controller->sent.constLast(), (QPair<int, bool>{1, false}));
    // Asked directly it never takes the touch, and it can never be passed.
    QCOMPARE(process->tryLock(m_first, LOCKMETHOD_TOUCH, nullptr), -1);
    QCOMPARE(m_controller->sent.constLast(), (QPair<int, bool>{2, true}));
    QCOMPARE(process->tryUnlock(m_first, LOCKMETHOD_TOUCH), -1);
    QCOMPARE(m_controller->sent.constLast(), (QPair<int, bool>{2, false}));
    QVERIFY(!process->isRegisterObj(m_filter.get()));
    QVERIFY(!process->isLocked());
    QVERIFY(process->registeredObj().isEmpty());
}

void tst_ksappeventfilter::remoteLockShutsEveryTouch()
{
    auto* process = new KSEventProcessLockObject(m_filter.get());
    m_filter->registerLockObject(m_filter.get(), process, LOCKOBJECT_PROCESS, nullptr);
    QSignalSpy clicked(m_first, &QAbstractButton::clicked);
    touch(m_first, 0);
    m_controller->sent.clear();
    process->slotGetAppEvent(remoteEvent(1, true));
    QVERIFY(m_controller->sent.isEmpty()); // its own lock is no news
    lift(m_first, 0);
    QCOMPARE(clicked.count(), 0);
    touch(m_second, 0);
    QVERIFY(!m_second->isDown());
    lift(m_second, 0);
    // Both kinds must be given up.
    process->slotGetAppEvent(remoteEvent(2, true));
    process->slotGetAppEvent(remoteEvent(1, false));
    QVERIFY(m_filter->isLock(nullptr, LOCKMETHOD_TOUCH));
    process->slotGetAppEvent(remoteEvent(2, false));
    QVERIFY(!m_filter->isLock(nullptr, LOCKMETHOD_TOUCH));
    touch(m_second, 0);
    QVERIFY(m_second->isDown());
    lift(m_second, 0);
}

void tst_ksappeventfilter::pressAsksTheOtherProcessToGiveWay()
{
    auto* process = new KSEventProcessLockObject(m_filter.get());
    m_filter->registerLockObject(m_filter.get(), process, LOCKOBJECT_PROCESS, nullptr);
    connect(m_filter.get(), &KSAppEventFilter::signalEventBegin, process,
            &KSEventProcessLockObject::slotRestoreOriginal, Qt::DirectConnection);
    QTest::mouseClick(m_first, Qt::LeftButton);
    QVERIFY(m_controller->informed.isEmpty());
    process->slotGetAppEvent(remoteEvent(2, true));
    touch(m_first, 0);
    lift(m_first, 0);
    QCOMPARE(m_controller->informed, QList<int>{0});
    process->slotGetAppEvent(remoteEvent(1, true));
    QTest::mouseClick(m_first, Qt::LeftButton);
    QCOMPARE(m_controller->informed.size(), 1);
    // Without a controller nothing is sent and nothing breaks.
    ITitlerAPPEventFilterController::setInstance(nullptr);
    process->slotGetAppEvent(remoteEvent(1, false));
    QTest::mouseClick(m_first, Qt::LeftButton);
    QCOMPARE(m_controller->informed.size(), 1);
}

void tst_ksappeventfilter::restoreAllReachesTheRememberedObject()
{
    KSEventProcessLockObject process(m_filter.get());
    auto object = std::make_unique<EventCounter>();
    process.tryLock(object.get(), LOCKMETHOD_TOUCH, nullptr);
    process.tryLock(nullptr, LOCKMETHOD_TOUCH, nullptr); // keeps what is remembered
    process.slotRestoreAll();
    QCOMPARE(object->types, QList<int>{1001});
    QObject other;
    process.tryUnlock(&other, LOCKMETHOD_TOUCH);
    process.slotRestoreAll();
    QCOMPARE(object->types.size(), 2);
    process.tryUnlock(object.get(), LOCKMETHOD_TOUCH);
    process.slotRestoreAll();
    QCOMPARE(object->types.size(), 2);
    process.tryLock(object.get(), LOCKMETHOD_TOUCH, nullptr);
    object.reset();
    process.slotRestoreAll(); // a closed popup is forgotten
}

QTEST_MAIN(tst_ksappeventfilter)
#include "tst_ksappeventfilter.moc"
