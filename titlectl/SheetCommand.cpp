#include "titlectl/SheetCommand.h"

#include "titlectl/Arguments.h"
#include "titlectl/ContactSheet.h"
#include "titlectl/FolderLocks.h"
#include "titlectl/Output.h"
#include "titlectl/TitlePaths.h"

#include <QFileInfo>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

QString SheetCommand::summary() const
{
    return QStringLiteral("makes a contact sheet of a folder: its pictures with their names");
}

int SheetCommand::run(const Arguments& arguments, Output& output)
{
    const auto refuse = [&output](const QString& reason) {
        output.message(reason);
        return WrongUse;
    };
    const QString out = arguments.operands().at(1);
    const QString suffix = QFileInfo(out).suffix().toLower();
    if (suffix != QLatin1String("pdf") && suffix != QLatin1String("png"))
        return refuse(QStringLiteral("%1 ends neither in .pdf nor in .png").arg(out));
    const TitlePaths paths(QStringList{arguments.operands().first()});
    if (!paths.isValid())
        return refuse(paths.error());
    if (paths.folders().size() != 1 || !paths.folders().first().isWhole)
        return refuse(QStringLiteral("%1 is not a folder of titles").arg(arguments.operands().first()));
    FolderLocks locks;
    const auto inUse = arguments.has(FORCE) ? FolderLocks::InUse::GoOn : FolderLocks::InUse::Refuse;
    if (!locks.take(paths.folderPaths(), FolderLock::Kind::Shared, inUse, output))
        return WrongUse;

    const int total = static_cast<int>(paths.titles().size());
    ContactSheet sheet(QFileInfo(paths.folders().first().path).fileName(), paths.titles());
    const QString error = sheet.write(out, [&](int done) { output.progress(done, total); });
    if (!error.isEmpty()) {
        output.message(error);
        return Findings;
    }
    for (const QString& title : sheet.unreadable())
        output.message(QStringLiteral("%1: the title cannot be read").arg(title));
    output.line(QStringLiteral("titles: %1, pages: %2").arg(total).arg(sheet.pages()));
    output.json(QJsonDocument(
        QJsonObject{{QStringLiteral("titles"), total},
                    {QStringLiteral("pages"), sheet.pages()},
                    {QStringLiteral("unreadable"), QJsonArray::fromStringList(sheet.unreadable())}}));
    return sheet.unreadable().isEmpty() ? Success : Findings;
}
