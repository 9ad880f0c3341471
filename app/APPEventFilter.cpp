#include "app/APPEventFilter.h"

#include "app/TitlerAPPEventFilterController.h"
#include "touchui/KSEventProcessLockObject.h"

#include <QCoreApplication>

APPEventFilter* APPEventFilter::mInstance = nullptr;

APPEventFilter* APPEventFilter::instance()
{
    if (mInstance == nullptr && QCoreApplication::instance() != nullptr) {
        mInstance = new APPEventFilter;
        mInstance->setObjectName(QStringLiteral("TitlerToolEventFilter"));
        QCoreApplication::instance()->installEventFilter(mInstance);
    }
    return mInstance;
}

void APPEventFilter::release()
{
    if (mInstance == nullptr)
        return;
    if (QCoreApplication::instance() != nullptr)
        QCoreApplication::instance()->removeEventFilter(mInstance);
    delete mInstance;
    mInstance = nullptr;
}

APPEventFilter::APPEventFilter()
{
    APPEventFilter::registerLockObject(this, nullptr, LOCKOBJECT_DEFAULTMUTEX, nullptr);
    APPEventFilter::registerLockObject(this, nullptr, LOCKOBJECT_PROCESS, nullptr);
}

APPEventFilter::~APPEventFilter() = default;

KSLockObject* APPEventFilter::processLock()
{
    if (KSEventProcessLockObject::s_instance == nullptr) {
        auto* lock = new KSEventProcessLockObject(this);
        KSEventProcessLockObject::s_instance = lock;
        TitlerAPPEventFilterController* controller = TitlerAPPEventFilterController::getInstance();
        connect(controller, &ITitlerAPPEventFilterController::signalSendAPPEvent, lock,
                &KSEventProcessLockObject::slotGetAppEvent, Qt::DirectConnection);
        connect(this, &KSAppEventFilter::signalEventBegin, lock,
                &KSEventProcessLockObject::slotRestoreOriginal, Qt::DirectConnection);
        connect(controller, &ITitlerAPPEventFilterController::signalRestoreOriginal, lock,
                &KSEventProcessLockObject::slotRestoreAll);
    }
    return KSEventProcessLockObject::s_instance;
}

KSLockObject* APPEventFilter::createLockObject(QObject* obj, KSLockObject* lock, LOCKOBJECT_TYPE type,
                                               void* param)
{
    return KSAppEventFilter::createLockObject(obj, type == LOCKOBJECT_PROCESS ? processLock() : lock, type,
                                              param);
}

KSLockObject* APPEventFilter::registerLockObject(QObject* obj, KSLockObject* lock, LOCKOBJECT_TYPE type,
                                                 void* param)
{
    if (type != LOCKOBJECT_PROCESS)
        return KSAppEventFilter::registerLockObject(obj, lock, type, param);
    KSLockObject* process = processLock();
    keepNewLockObject(process);
    if (initLockObject(obj, process, type, param) == 0)
        addRegLockObject(obj, process, type, param);
    return process;
}
