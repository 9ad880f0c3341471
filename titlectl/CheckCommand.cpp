#include "titlectl/CheckCommand.h"

#include "titlectl/Arguments.h"
#include "titlectl/Checker.h"
#include "titlectl/FolderLocks.h"
#include "titlectl/Output.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

namespace
{

const QString RULES = QStringLiteral("rules");
const QString WITHOUT = QStringLiteral("without");

void listRules(const Checker& checker, Output& output)
{
    QJsonArray rules;
    for (const CheckRule& rule : checker.rules()) {
        output.line(QStringLiteral("%1  %2").arg(rule.id, -24).arg(rule.summary));
        rules.append(QJsonObject{{QStringLiteral("id"), rule.id}, {QStringLiteral("summary"), rule.summary}});
    }
    output.json(QJsonDocument(rules));
}

void report(const FindingList& findings, qsizetype titles, Output& output)
{
    QJsonArray list;
    for (const Finding& finding : findings) {
        output.line(CheckCommand::lineOf(finding));
        list.append(QJsonObject{{QStringLiteral("file"), finding.file},
                                {QStringLiteral("object"), finding.object},
                                {QStringLiteral("rule"), finding.rule},
                                {QStringLiteral("reason"), finding.reason}});
    }
    output.line(QStringLiteral("%1 titles, %2 findings").arg(titles).arg(findings.size()));
    output.json(
        QJsonDocument(QJsonObject{{QStringLiteral("titles"), titles}, {QStringLiteral("findings"), list}}));
}

} // namespace

QString CheckCommand::summary() const
{
    return QStringLiteral("reports what is wrong with titles and folders, before they go on air");
}

QList<CommandOption> CheckCommand::options() const
{
    return {{RULES, QString(), QStringLiteral("list the rules and check nothing")},
            {WITHOUT, QStringLiteral("RULE,..."), QStringLiteral("switch these rules off")},
            forceOption()};
}

QString CheckCommand::lineOf(const Finding& finding)
{
    const QString object = finding.object.isEmpty() ? QString() : finding.object + QStringLiteral(": ");
    return QStringLiteral("%1: %2%3 [%4]").arg(finding.file, object, finding.reason, finding.rule);
}

int CheckCommand::run(const Arguments& arguments, Output& output)
{
    const auto refuse = [&output](const QString& reason) {
        output.message(reason);
        return WrongUse;
    };
    Checker checker;
    const QStringList off = arguments.value(WITHOUT).split(QLatin1Char(','), Qt::SkipEmptyParts);
    for (const QString& id : off)
        if (!checker.switchOff(id))
            return refuse(QStringLiteral("there is no rule %1; --rules lists them").arg(id));
    if (arguments.has(RULES)) {
        listRules(checker, output);
        return Success;
    }
    if (arguments.operands().isEmpty())
        return refuse(QStringLiteral("check expects %1").arg(operands().synopsis));
    const TitlePaths paths(arguments.operands());
    if (!paths.isValid())
        return refuse(paths.error());
    FolderLocks locks;
    const auto inUse = arguments.has(FORCE) ? FolderLocks::InUse::GoOn : FolderLocks::InUse::Refuse;
    if (!locks.take(paths.folderPaths(), FolderLock::Kind::Shared, inUse, output))
        return WrongUse;
    const int total = static_cast<int>(paths.titles().size());
    const FindingList findings =
        checker.check(paths.folders(), [&output, total](int done) { output.progress(done, total); });
    report(findings, total, output);
    return findings.isEmpty() ? Success : Findings;
}
