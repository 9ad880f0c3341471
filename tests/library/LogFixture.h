// Log files of the test's own, and what is written to them.
#pragma once

#include "support/LogManager.h"

#include <QFile>
#include <QString>
#include <QStringList>
#include <QTemporaryDir>

// One at a time.
class LogFixture
{
public:
    LogFixture()
    {
        qputenv("K2SYS_LOG_DIR", mDir.path().toLocal8Bit());
        INIT_LOGGING(L"test");
    }
    ~LogFixture() { UNINIT_LOGGING(); }

    // "[area] number: text" of the lines since the last call, in the operation log and in the debug log.
    QStringList takeOperations() { return take(QStringLiteral("k2_ope.log"), mOperationsEnd); }
    QStringList takeDebugLines() { return take(QStringLiteral("k2_ope_debug.log"), mDebugEnd); }

private:
    QStringList take(const QString& name, qint64& end) const
    {
        QFile file(mDir.filePath(name));
        if (!file.open(QIODevice::ReadOnly) || !file.seek(end))
            return {QStringLiteral("no ") + name};
        QStringList lines;
        for (const QString& line :
             QString::fromUtf8(file.readAll()).split(QLatin1Char('\n'), Qt::SkipEmptyParts))
            lines.append(line.mid(line.indexOf(QLatin1String("]: [")) + 3));
        end = file.pos();
        return lines;
    }

    QTemporaryDir mDir;
    qint64 mOperationsEnd = 0;
    qint64 mDebugEnd = 0;
};
