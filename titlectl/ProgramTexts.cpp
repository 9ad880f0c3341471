#include "titlectl/ProgramTexts.h"

#include "titlectl/Command.h"
#include "titlectl/CommandTable.h"

#include <QStringList>
#include <algorithm>

namespace
{

const QString SUMMARY = QStringLiteral("makes, renders, checks, shows and changes titles without a window");
const QString EXIT_CODES =
    QStringLiteral("0: done; 1: something was found or could not be done; 2: wrong use, or a "
                   "folder that the titler has open");

// Protects what the language of manual pages would interpret.
QString forMan(QString text)
{
    text.replace(QLatin1Char('\\'), QLatin1String("\\e"));
    text.replace(QLatin1Char('-'), QLatin1String("\\-"));
    return text.startsWith(QLatin1Char('.')) || text.startsWith(QLatin1Char('\''))
               ? QStringLiteral("\\&") + text
               : text;
}

QString columns(const QString& left, const QString& right, int width)
{
    return QStringLiteral("  ") + left.leftJustified(width) + QStringLiteral("  ") + right +
           QLatin1Char('\n');
}

} // namespace

std::optional<QString> ProgramTexts::textFor(const QString& word) const
{
    if (word == QLatin1String("--help"))
        return help();
    if (word == QLatin1String("--man-page"))
        return manPage();
    if (word == QLatin1String("--completion"))
        return completion();
    if (word == QLatin1String("--version"))
        return QStringLiteral("titlectl " TITLER_VERSION "\n");
    return std::nullopt;
}

QString ProgramTexts::help() const
{
    QString text =
        QStringLiteral("titlectl %1.\n\nUsage: titlectl COMMAND [OPTIONS] OPERANDS\n\n").arg(SUMMARY);
    int width = 0;
    for (const auto& command : m_table.commands())
        width = std::max(width, static_cast<int>(command->name().size()));
    for (const auto& command : m_table.commands())
        text += columns(command->name(), command->summary(), width);
    return text + QStringLiteral(
                      "\ntitlectl COMMAND --help explains one of them; --man-page and --completion write the "
                      "manual page and\nthe completion of bash.\nExit codes: %1.\n")
                      .arg(EXIT_CODES);
}

QString ProgramTexts::synopsisOf(const Command& command)
{
    QString text = QStringLiteral("titlectl ") + command.name();
    for (const CommandOption& option : CommandTable::optionsOf(command))
        text += QStringLiteral(" [%1]").arg(option.synopsis());
    return text + QLatin1Char(' ') + command.operands().synopsis;
}

QString ProgramTexts::helpFor(const Command& command)
{
    QString text =
        synopsisOf(command) + QStringLiteral("\n\n  ") + command.summary() + QStringLiteral("\n\n");
    const QList<CommandOption> options = CommandTable::optionsOf(command);
    int width = 0;
    for (const CommandOption& option : options)
        width = std::max(width, static_cast<int>(option.synopsis().size()));
    for (const CommandOption& option : options)
        text += columns(option.synopsis(), option.help, width);
    return text;
}

QString ProgramTexts::manPage() const
{
    QString text =
        QStringLiteral(".TH TITLECTL 1\n.SH NAME\ntitlectl \\- %1\n.SH SYNOPSIS\n").arg(forMan(SUMMARY));
    for (const auto& command : m_table.commands())
        text += forMan(synopsisOf(*command)) + QStringLiteral("\n.br\n");
    text += QStringLiteral(".SH COMMANDS\n");
    for (const auto& command : m_table.commands()) {
        text += QStringLiteral(".TP\n.B %1\n%2.\n").arg(forMan(command->name()), forMan(command->summary()));
        for (const CommandOption& option : CommandTable::optionsOf(*command))
            text += QStringLiteral(".RS\n.TP\n.B %1\n%2\n.RE\n")
                        .arg(forMan(option.synopsis()), forMan(option.help));
    }
    return text + QStringLiteral(".SH EXIT STATUS\n%1.\n").arg(forMan(EXIT_CODES));
}

QString ProgramTexts::completion() const
{
    QStringList names;
    QString cases;
    for (const auto& command : m_table.commands()) {
        names.append(command->name());
        QStringList options;
        for (const CommandOption& option : CommandTable::optionsOf(*command))
            options.append(QStringLiteral("--") + option.name);
        cases += QStringLiteral("        %1) options=\"%2\" ;;\n")
                     .arg(command->name(), options.join(QLatin1Char(' ')));
    }
    return QStringLiteral("_titlectl()\n{\n"
                          "    local word=${COMP_WORDS[COMP_CWORD]} options=\n"
                          "    if [ \"$COMP_CWORD\" = 1 ]; then\n"
                          "        COMPREPLY=($(compgen -W \"%1 --help --version\" -- \"$word\"))\n"
                          "        return\n    fi\n"
                          "    case ${COMP_WORDS[1]} in\n%2    esac\n"
                          "    case $word in\n"
                          "        -*) COMPREPLY=($(compgen -W \"$options --help\" -- \"$word\")) ;;\n"
                          "        *) COMPREPLY=($(compgen -f -- \"$word\")) ;;\n"
                          "    esac\n}\n"
                          "complete -o filenames -F _titlectl titlectl\n")
        .arg(names.join(QLatin1Char(' ')), cases);
}
