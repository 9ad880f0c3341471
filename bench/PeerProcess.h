// A process that ends with this object, and with this program whatever way that ends.
#pragma once

#include <QProcess>
#include <QString>
#include <QStringList>

class PeerProcess
{
public:
    PeerProcess();
    // Kills the process if it still runs.
    ~PeerProcess();
    PeerProcess(const PeerProcess&) = delete;
    PeerProcess& operator=(const PeerProcess&) = delete;

    // Starts this program in one of its other roles and waits for the line "ready".
    bool startRole(const QString& role);
    // Starts a program and waits for its first line. False when that does not come or is another one.
    bool startAndAwait(const QString& program, const QStringList& arguments, const QByteArray& line);
    // Starts any program, its output discarded. False when it cannot be started.
    bool start(const QString& program, const QStringList& arguments = {});
    // Waits for the end of the process; whether it ended by itself with 0.
    bool finished(int milliseconds);

    qint64 id() const { return mProcess.processId(); }
    QProcess& process() { return mProcess; }

private:
    QProcess mProcess;
};
