#pragma once

#include <QString>

// An option of a command: "--name", or "--name VALUE" if it has a value.
struct CommandOption {
    QString name;  // without the dashes
    QString value; // how the help calls the value; empty for a switch
    QString help;  // one line without a full stop

    bool hasValue() const { return !value.isEmpty(); }
    // Returns "--name" or "--name VALUE".
    QString synopsis() const
    {
        return QStringLiteral("--") + name + (hasValue() ? QLatin1Char(' ') + value : QString());
    }
};
