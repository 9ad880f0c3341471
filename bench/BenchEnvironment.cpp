#include "bench/BenchEnvironment.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <unistd.h>

namespace
{

// Outside the fixed ports and the range that the system assigns to clients.
constexpr int FIRST_PORT_OFFSET = 10000;
constexpr int PORT_OFFSETS = 2000;
constexpr int PORTS_OF_ONE_RUN = 8;

void setDefault(const char* name, const QString& value)
{
    if (qEnvironmentVariableIsEmpty(name))
        qputenv(name, value.toLocal8Bit());
}

} // namespace

BenchEnvironment::BenchEnvironment()
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    qputenv("LC_ALL", "C.UTF-8");
    setDefault("FONTCONFIG_FILE",
               QFileInfo(binaryFolder() + QStringLiteral("/../fonts/fonts.conf")).absoluteFilePath());
    for (const char* name :
         {"K2SYS_AC_DATA", "K2SYS_LOG_DIR", "HOME", "XDG_DATA_HOME", "XDG_CONFIG_HOME", "XDG_RUNTIME_DIR"})
        qputenv(name, makeFolder(QString::fromLatin1(name)).toLocal8Bit());
    const QString runtime = makeFolder(QStringLiteral("runtime"));
    QFile::setPermissions(runtime, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    qputenv("XDG_RUNTIME_DIR", runtime.toLocal8Bit());
    qunsetenv("K2SYS_AC_ROOT");
    qunsetenv("K2SYS_FS_REMAIN");
    qputenv("K2SYS_PORT_OFFSET",
            QByteArray::number(FIRST_PORT_OFFSET + getpid() % PORT_OFFSETS * PORTS_OF_ONE_RUN));
}

QString BenchEnvironment::makeFolder(const QString& name) const
{
    QDir(m_folder.path()).mkpath(name);
    return m_folder.filePath(name);
}

QString BenchEnvironment::binaryFolder()
{
    return QFileInfo(QFile::symLinkTarget(QStringLiteral("/proc/self/exe"))).absolutePath();
}
