#include "titlectl/Output.h"

#include <QIODevice>
#include <QJsonDocument>
#include <algorithm>

namespace
{

constexpr int BAR_WIDTH = 40;

} // namespace

Output::Output(QIODevice& result, QIODevice& messages, Format format, Progress progress)
    : m_result(result), m_messages(messages), m_format(format), m_progress(progress)
{
}

Output::~Output()
{
    clearProgress();
}

void Output::line(const QString& text)
{
    if (isJson())
        return;
    clearProgress();
    m_result.write(text.toUtf8() + '\n');
}

void Output::json(const QJsonDocument& document)
{
    if (!isJson())
        return;
    clearProgress();
    m_result.write(document.toJson(QJsonDocument::Indented));
}

void Output::message(const QString& text)
{
    clearProgress();
    m_messages.write("titlectl: " + text.toUtf8() + '\n');
}

void Output::progress(int done, int total)
{
    if (m_progress == Progress::Hidden)
        return;
    m_messages.write('\r' + bar(done, total, BAR_WIDTH).toUtf8());
    m_isProgressOnScreen = true;
}

QString Output::bar(int done, int total, int width)
{
    const int full = static_cast<int>(static_cast<qint64>(std::clamp(done, 0, total)) * width / total);
    return QStringLiteral("[%1%2] %3/%4")
        .arg(QString(full, QLatin1Char('#')), QString(width - full, QLatin1Char(' ')))
        .arg(done)
        .arg(total);
}

void Output::clearProgress()
{
    if (m_isProgressOnScreen)
        m_messages.write("\r\x1b[K"); // back to the beginning of the line, which is erased
    m_isProgressOnScreen = false;
}
