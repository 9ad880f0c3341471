// What signals do to a process that has registered the handler.
#include <QProcess>
#include <QTest>

#include <csignal>

class tst_systemsignalhandler : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void terminationCallsBack_data();
    void terminationCallsBack();
    void withoutAnEventLoopTheHandlerCallsBack();
    void faultsLeaveATrace_data();
    void faultsLeaveATrace();
    void faultAfterTheTableWasFreed();
    void harmlessSignalsChangeNothing();
    void anAbortLeavesOneTrace_data();
    void anAbortLeavesOneTrace();
    void aFullStackLeavesATrace_data();
    void aFullStackLeavesATrace();

private:
    static QByteArray readUntil(QProcess& process, const QByteArray& text);
    static void start(QProcess& process, const QString& mode);
};

void tst_systemsignalhandler::start(QProcess& process, const QString& mode)
{
    process.start(SIGNAL_PROBE, {mode});
    QVERIFY(process.waitForStarted());
}

QByteArray tst_systemsignalhandler::readUntil(QProcess& process, const QByteArray& text)
{
    QByteArray output;
    while (!output.contains(text) && process.waitForReadyRead(20000))
        output += process.readAllStandardOutput();
    return output;
}

void tst_systemsignalhandler::terminationCallsBack_data()
{
    QTest::addColumn<int>("number");
    QTest::addColumn<QString>("mode");
    QTest::newRow("SIGTERM") << SIGTERM << "loop";
    QTest::newRow("SIGINT") << SIGINT << "loop";
    QTest::newRow("the second registration counts") << SIGTERM << "twice";
}

void tst_systemsignalhandler::terminationCallsBack()
{
    QFETCH(int, number);
    QFETCH(QString, mode);
    QProcess probe;
    start(probe, mode);
    QCOMPARE(readUntil(probe, "ready"), QByteArray("ready\n"));
    kill(static_cast<pid_t>(probe.processId()), number);
    QVERIFY(probe.waitForFinished());
    QCOMPARE(probe.readAllStandardOutput(),
             QByteArray("callback in the main thread\nafter the event loop\n"));
    QCOMPARE(probe.exitStatus(), QProcess::NormalExit);
    QCOMPARE(probe.exitCode(), 0);
}

void tst_systemsignalhandler::withoutAnEventLoopTheHandlerCallsBack()
{
    QProcess probe;
    start(probe, "plain");
    QCOMPARE(readUntil(probe, "ready"), QByteArray("ready\n"));
    kill(static_cast<pid_t>(probe.processId()), SIGTERM);
    QVERIFY(probe.waitForFinished());
    QCOMPARE(probe.readAllStandardOutput(), QByteArray("callback in the handler\n"));
    QCOMPARE(probe.exitCode(), 7);
}

void tst_systemsignalhandler::faultsLeaveATrace_data()
{
    QTest::addColumn<int>("number");
    QTest::newRow("SIGSEGV") << SIGSEGV;
    QTest::newRow("SIGBUS") << SIGBUS;
    QTest::newRow("SIGFPE") << SIGFPE;
    QTest::newRow("SIGQUIT") << SIGQUIT;
}

void tst_systemsignalhandler::faultsLeaveATrace()
{
    QFETCH(int, number);
    QProcess probe;
    start(probe, "plain");
    QCOMPARE(readUntil(probe, "ready"), QByteArray("ready\n"));
    kill(static_cast<pid_t>(probe.processId()), number);
    QVERIFY(probe.waitForFinished());
    QCOMPARE(probe.exitStatus(), QProcess::CrashExit);
    QCOMPARE(probe.exitCode(), SIGABRT);
    QVERIFY(probe.readAllStandardError().contains("libk2sys.so.1"));
}

void tst_systemsignalhandler::faultAfterTheTableWasFreed()
{
    QProcess probe;
    start(probe, "again");
    QVERIFY(probe.waitForFinished());
    QCOMPARE(probe.readAllStandardOutput(), QByteArray("aborted once\n"));
    QCOMPARE(probe.exitStatus(), QProcess::CrashExit);
    QCOMPARE(probe.exitCode(), SIGABRT);
}

void tst_systemsignalhandler::harmlessSignalsChangeNothing()
{
    QProcess probe;
    start(probe, "harmless");
    QVERIFY(probe.waitForFinished());
    QCOMPARE(probe.readAllStandardOutput(), QByteArray("alive\n"));
    QCOMPARE(probe.exitStatus(), QProcess::NormalExit);
}

void tst_systemsignalhandler::anAbortLeavesOneTrace_data()
{
    QTest::addColumn<QString>("mode");
    QTest::newRow("the program gives up") << "abort";
    QTest::newRow("in another thread") << "abort-thread";
    QTest::newRow("sent by another process") << "plain";
    QTest::newRow("a fault") << "fault";
}

void tst_systemsignalhandler::anAbortLeavesOneTrace()
{
    QFETCH(QString, mode);
    QProcess probe;
    start(probe, mode);
    if (mode == "plain") {
        QCOMPARE(readUntil(probe, "ready"), QByteArray("ready\n"));
        kill(static_cast<pid_t>(probe.processId()), SIGABRT);
    }
    QVERIFY(probe.waitForFinished());
    QCOMPARE(probe.exitStatus(), QProcess::CrashExit);
    QCOMPARE(probe.exitCode(), SIGABRT);
    const QByteArray trace = probe.readAllStandardError();
    QCOMPARE(trace.count("k2sys_print_backtrace"), 1);
}

void tst_systemsignalhandler::aFullStackLeavesATrace_data()
{
    QTest::addColumn<QString>("mode");
    QTest::newRow("main thread") << "overflow";
    QTest::newRow("another thread") << "overflow-thread";
}

void tst_systemsignalhandler::aFullStackLeavesATrace()
{
    QFETCH(QString, mode);
    QProcess probe;
    start(probe, mode);
    QVERIFY(probe.waitForFinished());
    QCOMPARE(probe.exitStatus(), QProcess::CrashExit);
    QCOMPARE(probe.exitCode(), SIGABRT);
    QVERIFY(probe.readAllStandardError().contains("libk2sys.so.1"));
}

QTEST_GUILESS_MAIN(tst_systemsignalhandler)
#include "tst_systemsignalhandler.moc"
