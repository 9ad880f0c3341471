#pragma once

#include <QByteArray>
#include <QObject>
#include <QSocketNotifier>

// Reads a descriptor line by line while the event loop runs.
class LineReader : public QObject
{
    Q_OBJECT

public:
    // Longer lines are split at this length in bytes.
    static constexpr qsizetype MAX_LINE = 1 << 20;

    // descriptor must be readable; it is not closed here.
    explicit LineReader(int descriptor, QObject* parent = nullptr);

Q_SIGNALS:
    // Emitted for each line, decoded from UTF-8 and without the line feed.
    void lineRead(const QString& line);
    void ended();

private:
    void readMore();
    void emitLines();

    int m_descriptor;
    QSocketNotifier m_notifier;
    QByteArray m_buffer;
};
