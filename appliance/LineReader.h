// Reads a descriptor line by line while the event loop runs.
#pragma once

#include <QByteArray>
#include <QObject>
#include <QSocketNotifier>

class LineReader : public QObject
{
    Q_OBJECT

public:
    // A line longer than this is cut there.
    static constexpr qsizetype MAX_LINE = 1 << 20;

    // The descriptor stays the caller's and must be readable.
    explicit LineReader(int descriptor, QObject* parent = nullptr);

Q_SIGNALS:
    // UTF-8 without the line end.
    void lineRead(const QString& line);
    void ended();

private:
    void readMore();
    void emitLines();

    int m_descriptor;
    QSocketNotifier m_notifier;
    QByteArray m_buffer;
};
