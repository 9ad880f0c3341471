#pragma once

#include "titlectl/CommandOption.h"

#include <QHash>
#include <QList>
#include <QString>
#include <QStringList>
#include <optional>

// The words behind the name of a command, as options and operands.
class Arguments
{
public:
    // Splits the words: "--name VALUE" and "--name=VALUE" for options with a value, "--name" for switches,
    // and operands between them; behind "--" all words are operands. Returns nothing, with a reason in error,
    // for an option that is not known, one without its value, and a switch with a value.
    static std::optional<Arguments> parse(const QStringList& words, const QList<CommandOption>& options,
                                          QString& error);

    const QStringList& operands() const { return m_operands; }
    bool has(const QString& option) const { return m_values.contains(option); }
    // Returns the value of the option; empty if it is not given. The last one counts.
    QString value(const QString& option) const { return m_values.value(option); }

private:
    QStringList m_operands;
    QHash<QString, QString> m_values;
};
