// The operation log and the debug log of one test program, in a folder of its own. Make it before
// QApplication, with which the logging starts.
#pragma once

#include <QFile>
#include <QStringList>
#include <QTemporaryDir>

class OperationLog
{
public:
    OperationLog() { qputenv("K2SYS_LOG_DIR", m_folder.path().toLocal8Bit()); }

    // "number: text" of the area's entries. What was written before the last call, in whatever area, is gone.
    QStringList take(const QString& area) { return read(QStringLiteral("k2_ope.log"), m_position, area); }
    QStringList takeDebug(const QString& area)
    {
        return read(QStringLiteral("k2_ope_debug.log"), m_debugPosition, area);
    }

private:
    QStringList read(const QString& name, qint64& position, const QString& area) const
    {
        QFile file(m_folder.filePath(name));
        if (!file.open(QIODevice::ReadOnly) || !file.seek(position))
            return {QStringLiteral("no log")};
        const QStringList lines =
            QString::fromUtf8(file.readAll()).split(QLatin1Char('\n'), Qt::SkipEmptyParts);
        position = file.pos();
        const QString mark = QStringLiteral("]: [") + area + QStringLiteral("] ");
        QStringList entries;
        for (const QString& line : lines) {
            const qsizetype begin = line.indexOf(mark);
            if (begin >= 0)
                entries.append(line.mid(begin + mark.size()));
        }
        return entries;
    }

    QTemporaryDir m_folder;
    qint64 m_position = 0;
    qint64 m_debugPosition = 0;
};
