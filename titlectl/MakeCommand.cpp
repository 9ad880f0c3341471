#include "titlectl/MakeCommand.h"

#include "document/Archive.h"
#include "document/TText.h"
#include "document/TitleParser.h"
#include "library/TitleFileOperations.h"
#include "titlectl/Arguments.h"
#include "titlectl/FolderLocks.h"
#include "titlectl/ListReader.h"
#include "titlectl/ListTable.h"
#include "titlectl/Output.h"
#include "titlectl/RenderBatch.h"
#include "titlectl/TemplateFields.h"
#include "titlectl/TitleTexts.h"
#include "titlectl/TitleUpdates.h"

#include <QDir>
#include <QFileInfo>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <optional>

namespace
{

const QString KEY = QStringLiteral("key");
const QString DRY_RUN = QStringLiteral("dry-run");
const QString STRICT = QStringLiteral("strict");

// Returns the title file of a template: the file itself, or that in the folder of a user template.
QString titleFileOf(const QString& path)
{
    const QFileInfo info(path);
    const QString file = info.isDir() ? path + QLatin1Char('/') + TitleFileOperations::TEMPLATE_STEM +
                                            TitleFileOperations::XML_EXTENSION
                                      : path;
    return QDir::cleanPath(QFileInfo(file).absoluteFilePath());
}

QString nameOf(ListPlan::Outcome outcome, bool isDone)
{
    switch (outcome) {
    case ListPlan::Outcome::Made:
        return isDone ? QStringLiteral("made") : QStringLiteral("would be made");
    case ListPlan::Outcome::Updated:
        return isDone ? QStringLiteral("updated") : QStringLiteral("would be updated");
    case ListPlan::Outcome::Wrong:
        break;
    }
    return QStringLiteral("wrong");
}

// Returns the texts of a title by their ids, lines joined by "\n" as in the texts of the set command.
QJsonObject textsOf(const Archive& title)
{
    QJsonObject texts;
    for (const TText* text : title.text())
        texts.insert(QString::number(text->getTextObjectID()), TitleTexts::plainText(*text));
    return texts;
}

QString lineOf(const QJsonObject& texts)
{
    QStringList parts;
    for (auto text = texts.begin(); text != texts.end(); ++text)
        parts.append(QStringLiteral("%1=%2").arg(
            text.key(), text.value().toString().replace(QLatin1Char('\n'), QLatin1String("\\n"))));
    return parts.join(QLatin1String("  "));
}

} // namespace

QString MakeCommand::summary() const
{
    return QStringLiteral("makes a title of a template for each row of a list (CSV, TSV, JSON or XLSX)");
}

QList<CommandOption> MakeCommand::options() const
{
    return {{KEY, QStringLiteral("COLUMN"),
             QStringLiteral("recognise a title by this column; without it by the number of its row")},
            {DRY_RUN, QString(), QStringLiteral("show what would be made, and write nothing")},
            {STRICT, QString(), QStringLiteral("make nothing if a row is wrong")},
            RenderBatch::jobsOption(),
            forceOption()};
}

int MakeCommand::run(const Arguments& arguments, Output& output)
{
    const auto refuse = [&output](const QString& reason) {
        output.message(reason);
        return WrongUse;
    };
    const std::optional<int> processes = RenderBatch::processesOf(arguments.value(RenderBatch::JOBS));
    if (!processes)
        return refuse(
            QStringLiteral("--jobs expects a number from 1 to %1").arg(RenderBatch::MOST_PROCESSES));
    const QString file = titleFileOf(arguments.operands().at(0));
    Archive sample;
    if (TitleParser().readOneTitle(file.toStdString(), &sample) != 1)
        return refuse(QStringLiteral("%1: the template cannot be read").arg(file));
    QString error;
    const TemplateFields fields = TemplateFields::read(file, error);
    if (!error.isEmpty())
        return refuse(QStringLiteral("%1: %2").arg(TemplateFields::pathFor(file), error));
    const QString list = QFileInfo(arguments.operands().at(1)).absoluteFilePath();
    const ListTable table = ListReader::read(list);
    const QString folder = QDir::cleanPath(QFileInfo(arguments.operands().at(2)).absoluteFilePath());
    FolderLocks locks;
    const auto lock = [&] {
        const auto inUse = arguments.has(FORCE) ? FolderLocks::InUse::GoOn : FolderLocks::InUse::Refuse;
        return locks.take({folder}, FolderLock::Kind::Exclusive, inUse, output);
    };
    const bool isThere = QFileInfo::exists(folder);
    if (isThere && !arguments.has(DRY_RUN) && !lock())
        return WrongUse;
    const ListPlan plan({table, sample, fields, list, folder, arguments.value(KEY)});
    if (!plan.error().isEmpty())
        return refuse(QStringLiteral("%1: %2").arg(list, plan.error()));
    for (const QString& note : plan.notes())
        output.message(note);
    const int wrong = plan.count(ListPlan::Outcome::Wrong);
    const bool isRefused = wrong > 0 && arguments.has(STRICT);
    if (isRefused && !arguments.has(DRY_RUN))
        output.message(QStringLiteral("nothing was made, since rows are wrong (--strict)"));
    if (isRefused || arguments.has(DRY_RUN))
        return report(plan, QStringList(qsizetype(plan.rows().size())), false, output);
    if (!isThere && (!QDir().mkpath(folder) || !lock()))
        return refuse(QStringLiteral("cannot make the folder %1").arg(folder));
    int done = 0;
    TitleUpdates titles(plan, sample, folder);
    const int total = static_cast<int>(plan.rows().size()) - wrong;
    const QStringList errors = titles.make(*processes, [&] { output.progress(++done, total); });
    return report(plan, errors, true, output);
}

int MakeCommand::report(const ListPlan& plan, const QStringList& errors, bool isDone, Output& output)
{
    QJsonArray rows;
    int bad = 0;
    for (std::size_t i = 0; i < plan.rows().size(); ++i) {
        const ListPlan::Row& row = plan.rows()[i];
        const QString reason = row.reason.isEmpty() ? errors.at(qsizetype(i)) : row.reason;
        const QString outcome = nameOf(reason.isEmpty() ? row.outcome : ListPlan::Outcome::Wrong, isDone);
        QJsonObject object{{QStringLiteral("line"), row.line},
                           {QStringLiteral("title"), row.stem},
                           {QStringLiteral("outcome"), outcome},
                           {QStringLiteral("reason"), reason}};
        if (!isDone && reason.isEmpty()) {
            const QJsonObject texts = textsOf(*plan.title(int(i)));
            object.insert(QStringLiteral("texts"), texts);
            output.line(
                QStringLiteral("line %1 %2: %3").arg(QString::number(row.line), outcome, lineOf(texts)));
        }
        rows.append(object);
        if (reason.isEmpty())
            continue;
        ++bad;
        output.message(QStringLiteral("line %1: %2").arg(row.line).arg(reason));
    }
    const qsizetype good = qsizetype(plan.rows().size()) - bad;
    output.line(QStringLiteral("%1 of %2 rows %3")
                    .arg(good)
                    .arg(plan.rows().size())
                    .arg(isDone ? QStringLiteral("made") : QStringLiteral("can be made")));
    output.json(QJsonDocument(QJsonObject{{QStringLiteral("rows"), rows}, {QStringLiteral("wrong"), bad}}));
    return bad > 0 ? Findings : Success;
}
