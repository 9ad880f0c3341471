#include "bench/PeerProcess.h"

#include <signal.h>
#include <sys/prctl.h>

namespace
{
constexpr int START_TIME = 10000; // milliseconds
}

PeerProcess::PeerProcess()
{
    mProcess.setChildProcessModifier([] { prctl(PR_SET_PDEATHSIG, SIGKILL); });
    mProcess.setProcessChannelMode(QProcess::ForwardedErrorChannel);
}

PeerProcess::~PeerProcess()
{
    if (mProcess.state() == QProcess::NotRunning)
        return;
    mProcess.kill();
    mProcess.waitForFinished();
}

bool PeerProcess::startRole(const QString& role)
{
    return startAndAwait(QStringLiteral("/proc/self/exe"), {role}, "ready\n");
}

bool PeerProcess::startAndAwait(const QString& program, const QStringList& arguments, const QByteArray& line)
{
    mProcess.start(program, arguments);
    QByteArray read;
    while (!read.endsWith('\n')) {
        if (!mProcess.waitForReadyRead(START_TIME))
            return false;
        read += mProcess.readAllStandardOutput();
    }
    return read == line;
}

bool PeerProcess::start(const QString& program, const QStringList& arguments)
{
    mProcess.setStandardOutputFile(QProcess::nullDevice());
    mProcess.start(program, arguments);
    return mProcess.waitForStarted(START_TIME);
}

bool PeerProcess::finished(int milliseconds)
{
    return mProcess.waitForFinished(milliseconds) && mProcess.exitStatus() == QProcess::NormalExit &&
           mProcess.exitCode() == 0;
}
