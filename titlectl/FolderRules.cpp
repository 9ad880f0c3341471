#include "titlectl/FolderRules.h"

#include "document/TitleParser.h"
#include "support/HiddenName.h"
#include "titlectl/CheckedFolder.h"
#include "titlectl/TitleStage.h"

#include <QFileInfo>
#include <QSet>
#include <QStringList>

namespace
{

const QString ORDER = QString::fromLatin1(TitleParser::ORDER_FILEPATH);

void checkOrderReadable(const CheckedFolder& folder, FindingList& findings)
{
    if (folder.orderState() == FolderOrder::State::Torn)
        findings.append({folder.pathOf(ORDER), {}, {}, QStringLiteral("the order file is torn")});
    else if (folder.orderState() == FolderOrder::State::Unreadable)
        findings.append({folder.pathOf(ORDER), {}, {}, QStringLiteral("the order file cannot be read")});
}

void checkOrderNames(const CheckedFolder& folder, FindingList& findings)
{
    QSet<QString> seen;
    for (const QString& row : folder.rows()) {
        if (!QFileInfo::exists(folder.pathOf(row)) || row.isEmpty())
            findings.append(
                {folder.pathOf(ORDER), row, {}, QStringLiteral("the order names a title that is not there")});
        else if (seen.contains(row))
            findings.append({folder.pathOf(ORDER), row, {}, QStringLiteral("the order names a title twice")});
        seen.insert(row);
    }
}

void checkOrderOmits(const CheckedFolder& folder, FindingList& findings)
{
    if (folder.orderState() == FolderOrder::State::Missing && !folder.titleFiles().isEmpty())
        findings.append({folder.path(), {}, {}, QStringLiteral("there is no order file")});
    if (folder.orderState() != FolderOrder::State::Whole)
        return;
    for (const QString& name : folder.titleFiles())
        if (!folder.rows().contains(name))
            findings.append({folder.pathOf(name),
                             {},
                             {},
                             QStringLiteral("the order does not name the title; the titler will remove it")});
}

// Returns what kind of leftover the file is; empty if it is none.
QString leftoverKind(const CheckedFolder& folder, const QString& name)
{
    static const QSet<QString> PICTURES = {
        QStringLiteral("png"), QStringLiteral("jpg"), QStringLiteral("jpeg"), QStringLiteral("jpe"),
        QStringLiteral("bmp"), QStringLiteral("gif"), QStringLiteral("tif"),  QStringLiteral("tiff")};
    const std::string bytes = name.toStdString();
    if (HiddenName::isTemporary(bytes))
        return HiddenName::hasLivingOwner(bytes)
                   ? QString()
                   : QStringLiteral("a save that was interrupted left this file");
    if (!HiddenName::keptTarget(bytes).empty())
        return QStringLiteral("an earlier version that a save kept was not removed");
    if (PICTURES.contains(QFileInfo(name).suffix().toLower()) && !folder.isNamedByTitle(name))
        return QStringLiteral("the picture belongs to no title");
    return {};
}

void checkLeftovers(const CheckedFolder& folder, FindingList& findings)
{
    for (const QString& name : folder.otherFiles())
        if (const QString kind = leftoverKind(folder, name); !kind.isEmpty())
            findings.append({folder.pathOf(name), {}, {}, kind});
    const QStringList stages = TitleStage::abandonedIn(folder.path());
    for (const QString& stage : stages)
        findings.append({folder.pathOf(stage),
                         {},
                         {},
                         QStringLiteral("a titlectl that was interrupted left this folder")});
}

} // namespace

QList<CheckRule> FolderRules::table()
{
    return {{QStringLiteral("order-unreadable"), QStringLiteral("the order file is torn or cannot be read"),
             checkOrderReadable, nullptr},
            {QStringLiteral("order-names-missing"),
             QStringLiteral("the order file names a title that is not there, or one twice"), checkOrderNames,
             nullptr},
            {QStringLiteral("order-omits"),
             QStringLiteral("the order file omits a title that is there, or is missing"), checkOrderOmits,
             nullptr},
            {QStringLiteral("leftover"),
             QStringLiteral("a file that belongs to no title or that a save left behind"), checkLeftovers,
             nullptr}};
}
