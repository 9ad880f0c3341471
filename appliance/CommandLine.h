#pragma once

#include <QString>
#include <QStringList>

// One line of the appliance's line protocol: a command word and its arguments.
class CommandLine
{
public:
    explicit CommandLine(const QString& line);

    QString line() const { return m_line; }
    QString word() const { return m_word; }
    // Returns the arguments, which are separated by blanks. Double quotes protect blanks; a quote, a
    // backslash and a line feed are written within them as \", \\ and \n.
    QStringList arguments() const { return m_arguments; }
    // Returns everything behind the command word unchanged, or without its quotes if it is a single quoted
    // text.
    QString rest() const { return m_rest; }
    // Return the argument as a number, or the fallback if it is missing. valid becomes false if it is not a
    // number.
    int number(int index, bool* valid) const;
    int number(int index, int fallback, bool* valid) const;

private:
    QString m_line;
    QString m_word;
    QString m_rest;
    QStringList m_arguments;
};
