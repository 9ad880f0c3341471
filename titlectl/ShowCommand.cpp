#include "titlectl/ShowCommand.h"

#include "document/Archive.h"
#include "document/TitleParser.h"
#include "titlectl/Arguments.h"
#include "titlectl/Output.h"
#include "titlectl/TitleDescription.h"
#include "titlectl/TitlePaths.h"

#include <QJsonArray>
#include <QJsonDocument>

QString ShowCommand::summary() const
{
    return QStringLiteral("shows a title, or the titles of a folder, as text or JSON");
}

int ShowCommand::run(const Arguments& arguments, Output& output)
{
    const TitlePaths paths(arguments.operands());
    if (!paths.isValid()) {
        output.message(paths.error());
        return WrongUse;
    }
    int code = Success;
    QJsonArray titles;
    const QStringList files = paths.titles();
    for (const QString& file : files) {
        Archive archive;
        if (TitleParser().readOneTitle(file.toStdString(), &archive) != 1) {
            output.message(QStringLiteral("%1: the title cannot be read").arg(file));
            code = Findings;
            continue;
        }
        const TitleDescription title(archive);
        titles.append(title.json());
        const QStringList lines = title.lines();
        for (const QString& line : lines)
            output.line(line);
    }
    const bool isOneFile = !paths.folders().isEmpty() && !paths.folders().first().isWhole;
    if (!isOneFile)
        output.json(QJsonDocument(titles));
    else if (!titles.isEmpty())
        output.json(QJsonDocument(titles.first().toObject()));
    return code;
}
