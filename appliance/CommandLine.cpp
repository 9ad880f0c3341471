#include "appliance/CommandLine.h"

namespace
{

struct Token {
    QString text;
    qsizetype end; // behind the token
    bool quoted;
};

Token nextToken(const QString& line, qsizetype at)
{
    Token token{QString(), at, false};
    bool inQuotes = false;
    for (; token.end < line.size(); ++token.end) {
        const QChar c = line.at(token.end);
        if (c == '"') {
            inQuotes = !inQuotes;
            token.quoted = true;
        } else if (inQuotes && c == '\\' && token.end + 1 < line.size()) {
            ++token.end;
            token.text += line.at(token.end) == 'n' ? QChar('\n') : line.at(token.end);
        } else if (!inQuotes && c.isSpace()) {
            break;
        } else {
            token.text += c;
        }
    }
    return token;
}

} // namespace

CommandLine::CommandLine(const QString& line) : m_line(line)
{
    const QString trimmed = line.trimmed();
    const qsizetype wordEnd = trimmed.indexOf(' ');
    m_word = trimmed.left(wordEnd);
    if (wordEnd == -1)
        return;
    // Keep blanks at the end of the line; they belong to a text argument.
    const QString behind = line.mid(line.indexOf(m_word) + m_word.size() + 1);
    qsizetype at = 0;
    bool onlyOneQuoted = false;
    while (at < behind.size()) {
        if (behind.at(at).isSpace()) {
            ++at;
            continue;
        }
        const Token token = nextToken(behind, at);
        at = token.end;
        m_arguments.append(token.text);
        onlyOneQuoted = m_arguments.size() == 1 && token.quoted;
    }
    m_rest = onlyOneQuoted ? m_arguments.first() : behind;
}

int CommandLine::number(int index, bool* valid) const
{
    bool isNumber = false;
    const int value = m_arguments.value(index).toInt(&isNumber);
    *valid = *valid && isNumber;
    return value;
}

int CommandLine::number(int index, int fallback, bool* valid) const
{
    return index < m_arguments.size() ? number(index, valid) : fallback;
}
