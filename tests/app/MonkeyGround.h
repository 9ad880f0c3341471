// What the monkeys of this folder stand on: the numbers that a run takes from the environment, an application
// whose clock stands still, a place for the data, and who holds the touch.
#pragma once

#include "app/APPEventFilter.h"
#include "app/EarlyRequests.h"
#include "app/TitlerWindow.h"
#include "touchui/KSInputContext.h"

#include <QApplication>
#include <QDir>
#include <QEvent>
#include <QFileInfo>
#include <QString>
#include <QStringList>
#include <QTest>
#include <cstdio>

// The hidden window of the program, as it is when it waits for requests. The caller deletes it.
inline TitlerWindow* makeWaitingWindow()
{
    APPEventFilter::instance();
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
    pMainWindow = new TitlerWindow(true, nullptr);
    pMainWindow->setRealClose(false);
    EarlyRequests::clearInstance(); // requests would wait for client ids, which no sibling of these tests
                                    // gives
    return pMainWindow;
}

namespace MonkeyGround
{

inline int number(const char* variable, int otherwise)
{
    bool ok = false;
    const int value = qEnvironmentVariableIntValue(variable, &ok);
    return ok && value > 0 ? value : otherwise;
}

// An application whose timers stand still when told to, so that a run does not depend on the speed of the
// machine.
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
    // A long run is bounded by who started it.
    if (!qEnvironmentVariableIsSet("QTEST_FUNCTION_TIMEOUT"))
        qputenv("QTEST_FUNCTION_TIMEOUT", "7200000");
    KSInputContext::install();
    Application application(argc, argv);
    Test test;
    return QTest::qExec(&test, argc, argv);
}

// Every step saves the title; in memory that does not wait for a disk.
inline QString dataFolder()
{
    const QString memory = QStringLiteral("/dev/shm");
    return QFileInfo(memory).isWritable() ? memory : QDir::tempPath();
}

// Put before a fixture that asks where temporary folders are.
struct DataInMemory {
    DataInMemory() { qputenv("TMPDIR", dataFolder().toLocal8Bit()); }
};

// A line for every save would be all that is to be seen.
inline void showErrorsOnly()
{
    qInstallMessageHandler([](QtMsgType type, const QMessageLogContext&, const QString& text) {
        if (type == QtCriticalMsg || type == QtFatalMsg)
            fprintf(stderr, "%s\n", qPrintable(text));
    });
}

// Who holds the touch; empty when nobody does.
inline QString heldLocks()
{
    // The gate frees what is left once the widgets have had their turn.
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
