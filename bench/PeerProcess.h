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

    // Starts this program in one of its other roles and waits for the line "ready". False when it does not
    // come.
    bool startRole(const QString& role);
    // Starts any program, its output discarded. False when it cannot be started.
    bool start(const QString& program, const QStringList& arguments = {});
    // Waits for the end of the process; whether it ended by itself with 0.
    bool finished(int milliseconds);

    qint64 id() const { return mProcess.processId(); }
    QProcess& process() { return mProcess; }

private:
    QProcess mProcess;
};
