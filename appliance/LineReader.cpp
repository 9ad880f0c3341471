#include "appliance/LineReader.h"

#include <unistd.h>

#include <cerrno>
#include <utility>

LineReader::LineReader(int descriptor, QObject* parent)
    : QObject(parent), m_descriptor(descriptor), m_notifier(descriptor, QSocketNotifier::Read)
{
    connect(&m_notifier, &QSocketNotifier::activated, this, &LineReader::readMore);
}

void LineReader::readMore()
{
    char bytes[4096];
    const ssize_t count = read(m_descriptor, bytes, sizeof bytes);
    if (count > 0) {
        m_buffer.append(bytes, count);
        emitLines();
    } else if (count == 0 || (errno != EINTR && errno != EAGAIN)) {
        m_notifier.setEnabled(false);
        if (!m_buffer.isEmpty())
            Q_EMIT lineRead(QString::fromUtf8(std::exchange(m_buffer, QByteArray())));
        Q_EMIT ended();
    }
}

void LineReader::emitLines()
{
    qsizetype end = m_buffer.indexOf('\n');
    while (end != -1 || m_buffer.size() > MAX_LINE) {
        const QByteArray line = m_buffer.left(end != -1 ? end : MAX_LINE);
        m_buffer.remove(0, end != -1 ? end + 1 : MAX_LINE);
        Q_EMIT lineRead(QString::fromUtf8(line));
        end = m_buffer.indexOf('\n');
    }
}
