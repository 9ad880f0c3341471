#pragma once

#include <QString>
#include <optional>

class Command;
class CommandTable;

// The texts about the program, made from the table of commands: help, manual page and shell completion.
class ProgramTexts
{
public:
    // Keeps a reference to the table.
    explicit ProgramTexts(const CommandTable& table) : m_table(table) {}

    // Returns the text that an option of the program asks for ("--help", "--man-page", "--completion",
    // "--version"); nothing for any other word.
    std::optional<QString> textFor(const QString& word) const;

    QString help() const;
    // Returns the manual page in the language of man(7).
    QString manPage() const;
    // Returns the completion of bash.
    QString completion() const;

    static QString helpFor(const Command& command);
    // Returns "titlectl NAME [--option]... OPERANDS".
    static QString synopsisOf(const Command& command);

private:
    const CommandTable& m_table;
};
