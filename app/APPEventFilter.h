#pragma once

#include "touchui/KSAppEventFilter.h"

// The application's one event filter: the gate of the touch library with the lock between the processes of
// the appliance.
class APPEventFilter : public KSAppEventFilter
{
    Q_OBJECT
public:
    // Made at the first call, with the controller of the touch locks, and installed on the application; null
    // without an application.
    static APPEventFilter* instance();
    // Takes it off the application and deletes it.
    static void release();

    using KSAppEventFilter::createLockObject;
    using KSAppEventFilter::registerLockObject;
    KSLockObject* createLockObject(QObject* obj, KSLockObject* lock, LOCKOBJECT_TYPE type,
                                   void* param) override;
    KSLockObject* registerLockObject(QObject* obj, KSLockObject* lock, LOCKOBJECT_TYPE type,
                                     void* param) override;

private:
    APPEventFilter();
    ~APPEventFilter() override;
    KSLockObject* processLock();

    static APPEventFilter* mInstance;
};
