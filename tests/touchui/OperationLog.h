// The operation log of one test program, in a folder of its own. Make it before QApplication, with which the
// logging starts.
#pragma once

#include <QFile>
#include <QStringList>
#include <QTemporaryDir>

class OperationLog
{
public:
    OperationLog() { qputenv("K2SYS_LOG_DIR", m_folder.path().toLocal8Bit()); }

    // "number: text" of the area's entries. What was written before the last call, in whatever area, is gone.
    QStringList take(const QString& area)
    {
        QFile file(m_folder.filePath(QStringLiteral("k2_ope.log")));
        if (!file.open(QIODevice::ReadOnly) || !file.seek(m_position))
            return {QStringLiteral("no log")};
        const QStringList lines =
            QString::fromUtf8(file.readAll()).split(QLatin1Char('\n'), Qt::SkipEmptyParts);
        m_position = file.pos();
        const QString mark = QStringLiteral("]: [") + area + QStringLiteral("] ");
        QStringList entries;
        for (const QString& line : lines) {
            const qsizetype begin = line.indexOf(mark);
            if (begin >= 0)
                entries.append(line.mid(begin + mark.size()));
        }
        return entries;
    }

private:
    QTemporaryDir m_folder;
    qint64 m_position = 0;
};
