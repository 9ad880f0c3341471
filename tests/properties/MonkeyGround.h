#pragma once

#include "app/APPEventFilter.h"
#include "app/EarlyRequests.h"
#include "app/TitlerWindow.h"
#include "touchui/KSInputContext.h"

#include <QApplication>
#include <QEvent>
#include <QString>
#include <QStringList>
#include <QTest>
#include <cstdio>

// Returns the hidden window of the program in the state in which it waits for requests. The caller deletes
// it.
inline TitlerWindow* makeWaitingWindow()
{
    APPEventFilter::instance();
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
    pMainWindow = new TitlerWindow(true, nullptr);
    pMainWindow->setRealClose(false);
    // Requests would wait for client ids, which the siblings of these tests do not give.
    EarlyRequests::clearInstance();
    return pMainWindow;
}

// Shared parts of the tests that play with the window: an application whose timers can be stopped, a folder
// for the data, and a report of the touch locks.
namespace MonkeyGround
{

// An application whose timers can be stopped, so that a run does not depend on the speed of the machine.
class Application : public QApplication
{
public:
    Application(int& argc, char** argv) : QApplication(argc, argv)
    {
        setObjectName(QStringLiteral("Titler"));
        setQuitOnLastWindowClosed(false);
    }
    static Application* instance() { return static_cast<Application*>(QCoreApplication::instance()); }
    bool notify(QObject* receiver, QEvent* event) override
    {
        if (frozen && event->type() == QEvent::Timer)
            return true;
        return QApplication::notify(receiver, event);
    }
    bool frozen = false;
};

template <class Test>
int run(int argc, char** argv)
{
    // The limit for a long run is set by its caller.
    if (!qEnvironmentVariableIsSet("QTEST_FUNCTION_TIMEOUT"))
        qputenv("QTEST_FUNCTION_TIMEOUT", "7200000");
    KSInputContext::install();
    Application application(argc, argv);
    Test test;
    return QTest::qExec(&test, argc, argv);
}

// Hides the log lines for saving, which would fill the output.
inline void showErrorsOnly()
{
    qInstallMessageHandler([](QtMsgType type, const QMessageLogContext&, const QString& text) {
        if (type == QtCriticalMsg || type == QtFatalMsg)
            fprintf(stderr, "%s\n", qPrintable(text));
    });
}

// Returns the objects that hold a touch lock; empty when there are none.
inline QString heldLocks()
{
    // The event filter releases remaining locks in a posted call, after the widgets have handled their
    // events.
    QCoreApplication::sendPostedEvents(APPEventFilter::instance(), QEvent::MetaCall);
    QStringList held;
    const auto locks = APPEventFilter::instance()->activateLockObjects();
    for (auto lock = locks.begin(); lock != locks.end(); ++lock) {
        held += QString("a lock of %1 objects is held by").arg(lock.key()->registeredObj().size());
        for (const QObject* holder : lock.value())
            held += QString::fromLatin1(holder->metaObject()->className()) + ' ' + holder->objectName();
    }
    return held.join('\n');
}

} // namespace MonkeyGround
