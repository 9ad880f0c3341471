#pragma once

#include "touchui/KSAppEventFilter.h"

// The application-wide event filter: the touch gate of the touch library, extended by the lock between the
// processes of the appliance.
class APPEventFilter : public KSAppEventFilter
{
    Q_OBJECT
public:
    // Returns the filter, which the first call creates, with the controller of the touch locks, and installs
    // on the application. Null without an application.
    static APPEventFilter* instance();
    // Removes the filter from the application and deletes it.
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
