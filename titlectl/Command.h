#pragma once

#include "titlectl/CommandOption.h"

#include <QList>
#include <QString>

class Arguments;
class Output;

// A command of titlectl. Help, manual page and completion are made from what it says about itself. GUI thread
// only; needs a QApplication while it runs.
class Command
{
public:
    enum ExitCode {
        Success = 0,
        Findings = 1, // something is wrong with the titles, or could not be done
        WrongUse =
            2, // nothing was done: a wrong command line, a path that does not exist, or a folder in use
    };
    // What stands behind the options.
    struct Operands {
        QString synopsis; // as in the help
        int least = 0;
        int most = 0;
    };
    static constexpr int ANY_NUMBER = 1000000;

    virtual ~Command() = default;

    virtual QString name() const = 0;
    virtual QString summary() const = 0; // one line without a full stop
    virtual Operands operands() const = 0;
    virtual QList<CommandOption> options() const = 0;

    // Runs the command. The number of operands and the names of the options are checked already.
    virtual int run(const Arguments& arguments, Output& output) = 0;

protected:
    // The option of all commands that need a folder for themselves.
    static CommandOption forceOption();
    static const QString FORCE;
};
