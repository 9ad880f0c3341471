#pragma once

#include "titlectl/CommandOption.h"

#include <QList>
#include <QString>
#include <QStringList>
#include <memory>
#include <vector>

class Command;
class QIODevice;

// The commands of titlectl, and how a command line becomes a call of one of them.
class CommandTable
{
public:
    static const QString JSON; // the option of all commands

    // Registers all commands.
    CommandTable();
    ~CommandTable();
    CommandTable(const CommandTable&) = delete;
    CommandTable& operator=(const CommandTable&) = delete;

    const std::vector<std::unique_ptr<Command>>& commands() const { return m_commands; }
    // Returns the command, or null.
    Command* find(const QString& name) const;
    // Returns the options of the command and those of all commands.
    static QList<CommandOption> optionsOf(const Command& command);

    // Runs the command that the words name, which do not begin with the name of the program, and returns its
    // exit code. What needs no titles, such as the help, is written here. With a terminal the messages show
    // progress.
    int run(const QStringList& words, QIODevice& result, QIODevice& messages, bool isTerminal) const;

private:
    std::vector<std::unique_ptr<Command>> m_commands;
};
