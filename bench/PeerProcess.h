#pragma once

#include <QProcess>
#include <QString>
#include <QStringList>

// A process that ends when this object is destroyed, and when this program ends in any way.
class PeerProcess
{
public:
    PeerProcess();
    // Kills the process if it is still running.
    ~PeerProcess();
    PeerProcess(const PeerProcess&) = delete;
    PeerProcess& operator=(const PeerProcess&) = delete;

    // Starts this program in one of its other roles and waits for the line "ready".
    bool startRole(const QString& role);
    // Starts a program and waits for its first line. Returns false when that is missing or different.
    bool startAndAwait(const QString& program, const QStringList& arguments, const QByteArray& line);
    // Waits for a line of the process that contains the text; discards the lines before it. Returns false
    // when it does not come.
    bool awaitLine(const QByteArray& text);
    // Writes a line to the process and returns the line that it answers, without its end; empty when none
    // comes.
    QByteArray ask(const QByteArray& line);
    // Starts a program and discards its output. Returns false when it cannot be started.
    bool start(const QString& program, const QStringList& arguments = {});
    // Waits for the end of the process. Returns whether it ended by itself with exit code 0.
    bool finished(int milliseconds);

    qint64 id() const { return m_process.processId(); }
    QProcess& process() { return m_process; }

private:
    QProcess m_process;
};
