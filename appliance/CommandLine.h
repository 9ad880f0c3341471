// One line of the appliance's line protocol: a word and its arguments.
#pragma once

#include <QString>
#include <QStringList>

class CommandLine
{
public:
    explicit CommandLine(const QString& line);

    QString line() const { return m_line; }
    QString word() const { return m_word; }
    // Separated by blanks; double quotes keep blanks, and within them \" \\ and \n stand for a quote, a
    // backslash, a line end.
    QStringList arguments() const { return m_arguments; }
    // Everything behind the word as it stands, or the text between quotes when all of it is quoted.
    QString rest() const { return m_rest; }
    // The argument as a number, or the fallback where there is none. valid becomes false for something else.
    int number(int index, bool* valid) const;
    int number(int index, int fallback, bool* valid) const;

private:
    QString m_line;
    QString m_word;
    QString m_rest;
    QStringList m_arguments;
};
