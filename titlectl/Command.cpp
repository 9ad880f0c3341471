#include "titlectl/Command.h"

const QString Command::FORCE = QStringLiteral("force");

CommandOption Command::forceOption()
{
    return {FORCE, QString(), QStringLiteral("go on even if the titler has the folder open")};
}
