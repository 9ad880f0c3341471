#include "titlectl/Arguments.h"

#include <algorithm>

std::optional<Arguments> Arguments::parse(const QStringList& words, const QList<CommandOption>& options,
                                          QString& error)
{
    Arguments arguments;
    for (qsizetype i = 0; i < words.size(); ++i) {
        const QString& word = words.at(i);
        if (word == QLatin1String("--")) {
            arguments.m_operands += words.mid(i + 1);
            break;
        }
        if (!word.startsWith(QLatin1Char('-')) || word == QLatin1String("-")) {
            arguments.m_operands.append(word);
            continue;
        }
        const QString name = word.section(QLatin1Char('='), 0, 0);
        const auto option = std::find_if(options.begin(), options.end(), [&](const CommandOption& known) {
            return name == QStringLiteral("--") + known.name;
        });
        if (option == options.end()) {
            error = QStringLiteral("there is no option %1").arg(name);
            return std::nullopt;
        }
        const bool isJoined = name.size() < word.size();
        QString value = word.mid(name.size() + 1);
        if (option->hasValue() && !isJoined) {
            if (++i == words.size()) {
                error = QStringLiteral("%1 needs a value").arg(name);
                return std::nullopt;
            }
            value = words.at(i);
        } else if (!option->hasValue() && isJoined) {
            error = QStringLiteral("%1 takes no value").arg(name);
            return std::nullopt;
        }
        arguments.m_values.insert(option->name, value);
    }
    return arguments;
}
