#include "bench/PeerProcess.h"

#include <QDeadlineTimer>
#include <signal.h>
#include <sys/prctl.h>

namespace
{
constexpr int START_TIME = 60000; // milliseconds
}

PeerProcess::PeerProcess()
{
    m_process.setChildProcessModifier([] { prctl(PR_SET_PDEATHSIG, SIGKILL); });
    m_process.setProcessChannelMode(QProcess::ForwardedErrorChannel);
}

PeerProcess::~PeerProcess()
{
    if (m_process.state() == QProcess::NotRunning)
        return;
    m_process.kill();
    m_process.waitForFinished();
}

bool PeerProcess::startRole(const QString& role)
{
    return startAndAwait(QStringLiteral("/proc/self/exe"), {role}, "ready\n");
}

bool PeerProcess::startAndAwait(const QString& program, const QStringList& arguments, const QByteArray& line)
{
    m_process.start(program, arguments);
    QByteArray read;
    while (!read.endsWith('\n')) {
        if (!m_process.waitForReadyRead(START_TIME))
            return false;
        read += m_process.readAllStandardOutput();
    }
    return read == line;
}

bool PeerProcess::awaitLine(const QByteArray& text)
{
    const QDeadlineTimer deadline(START_TIME);
    while (true) {
        while (m_process.canReadLine())
            if (m_process.readLine().contains(text))
                return true;
        if (!m_process.waitForReadyRead(static_cast<int>(deadline.remainingTime())))
            return false;
    }
}

QByteArray PeerProcess::ask(const QByteArray& line)
{
    m_process.write(line);
    QByteArray read;
    while (!read.endsWith('\n')) {
        if (!m_process.waitForReadyRead(START_TIME))
            return {};
        read += m_process.readAllStandardOutput();
    }
    return read.chopped(1);
}

bool PeerProcess::start(const QString& program, const QStringList& arguments)
{
    m_process.setStandardOutputFile(QProcess::nullDevice());
    m_process.start(program, arguments);
    return m_process.waitForStarted(START_TIME);
}

bool PeerProcess::finished(int milliseconds)
{
    return m_process.waitForFinished(milliseconds) && m_process.exitStatus() == QProcess::NormalExit &&
           m_process.exitCode() == 0;
}
