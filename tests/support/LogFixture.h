#pragma once

#include "support/LogManager.h"

#include <QFile>
#include <QString>
#include <QStringList>
#include <QTemporaryDir>

// Log files for one test, and the lines written to them. Only one may exist at a time.
class LogFixture
{
public:
    LogFixture()
    {
        qputenv("K2SYS_LOG_DIR", m_dir.path().toLocal8Bit());
        UNINIT_LOGGING(); // the input context of an application has started the log in another folder
        INIT_LOGGING(L"test");
    }
    ~LogFixture() { UNINIT_LOGGING(); }

    // Return the lines since the last call: takeOperations() of the operation log, takeDebugLines() of the
    // debug log. With an area as "number: text", only those of the area; lines of other areas are dropped.
    // Without one as "[area] number: text".
    QStringList takeOperations(const QString& area = {})
    {
        return take(QStringLiteral("k2_ope.log"), m_operationsEnd, area);
    }
    QStringList takeDebugLines(const QString& area = {})
    {
        return take(QStringLiteral("k2_ope_debug.log"), m_debugEnd, area);
    }

private:
    QStringList take(const QString& name, qint64& end, const QString& area) const
    {
        QFile file(m_dir.filePath(name));
        if (!file.open(QIODevice::ReadOnly) || !file.seek(end))
            return {QStringLiteral("no ") + name};
        const QStringList lines =
            QString::fromUtf8(file.readAll()).split(QLatin1Char('\n'), Qt::SkipEmptyParts);
        end = file.pos();
        const QString before = QStringLiteral("]: ");
        const QString mark =
            area.isEmpty() ? before : before + QLatin1Char('[') + area + QStringLiteral("] ");
        QStringList result;
        for (const QString& line : lines) {
            const qsizetype begin = line.indexOf(mark);
            if (begin >= 0)
                result.append(line.mid(begin + mark.size()));
        }
        return result;
    }

    QTemporaryDir m_dir;
    qint64 m_operationsEnd = 0;
    qint64 m_debugEnd = 0;
};
