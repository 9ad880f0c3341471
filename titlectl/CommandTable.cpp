#include "titlectl/CommandTable.h"

#include "titlectl/Arguments.h"
#include "titlectl/CheckCommand.h"
#include "titlectl/Command.h"
#include "titlectl/MakeCommand.h"
#include "titlectl/Output.h"
#include "titlectl/ProgramTexts.h"
#include "titlectl/RenderCommand.h"
#include "titlectl/SetCommand.h"
#include "titlectl/SheetCommand.h"
#include "titlectl/ShowCommand.h"

#include <QIODevice>
#include <optional>

const QString CommandTable::JSON = QStringLiteral("json");

CommandTable::CommandTable()
{
    // In the order of the help.
    m_commands.push_back(std::make_unique<RenderCommand>());
    m_commands.push_back(std::make_unique<MakeCommand>());
    m_commands.push_back(std::make_unique<CheckCommand>());
    m_commands.push_back(std::make_unique<ShowCommand>());
    m_commands.push_back(std::make_unique<SetCommand>());
    m_commands.push_back(std::make_unique<SheetCommand>());
}

CommandTable::~CommandTable() = default;

Command* CommandTable::find(const QString& name) const
{
    for (const std::unique_ptr<Command>& command : m_commands)
        if (command->name() == name)
            return command.get();
    return nullptr;
}

QList<CommandOption> CommandTable::optionsOf(const Command& command)
{
    return command.options() +
           QList<CommandOption>{{JSON, QString(), QStringLiteral("write the result as JSON")}};
}

int CommandTable::run(const QStringList& words, QIODevice& result, QIODevice& messages, bool isTerminal) const
{
    const auto refuse = [&messages](const QString& reason) {
        messages.write("titlectl: " + reason.toUtf8() + "\ntitlectl --help explains the use\n");
        return Command::WrongUse;
    };
    const QString first = words.value(0);
    if (const std::optional<QString> text = ProgramTexts(*this).textFor(first)) {
        result.write(text->toUtf8());
        return Command::Success;
    }
    if (words.isEmpty())
        return refuse(QStringLiteral("a command is missing"));
    Command* command = find(first);
    if (!command)
        return refuse(QStringLiteral("there is no command %1").arg(first));
    if (words.contains(QStringLiteral("--help"))) {
        result.write(ProgramTexts::helpFor(*command).toUtf8());
        return Command::Success;
    }
    QString error;
    const std::optional<Arguments> arguments = Arguments::parse(words.mid(1), optionsOf(*command), error);
    if (!arguments)
        return refuse(error);
    const Command::Operands wanted = command->operands();
    if (arguments->operands().size() < wanted.least || arguments->operands().size() > wanted.most)
        return refuse(QStringLiteral("%1 expects %2").arg(first, wanted.synopsis));
    const bool isJson = arguments->has(JSON);
    Output output(result, messages, isJson ? Output::Format::Json : Output::Format::Lines,
                  isTerminal && !isJson ? Output::Progress::Shown : Output::Progress::Hidden);
    return command->run(*arguments, output);
}
