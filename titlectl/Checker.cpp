#include "titlectl/Checker.h"

#include "titlectl/CheckedFolder.h"
#include "titlectl/CheckedTitle.h"
#include "titlectl/FolderRules.h"
#include "titlectl/PictureRules.h"
#include "titlectl/TextRules.h"

Checker::Checker() : m_rules(FolderRules::table() + TextRules::table() + PictureRules::table())
{
}

bool Checker::switchOff(const QString& id)
{
    return m_rules.removeIf([&id](const CheckRule& rule) { return rule.id == id; }) > 0;
}

template <typename Subject>
void Checker::apply(void (*CheckRule::*function)(const Subject&, FindingList&), const Subject& subject,
                    FindingList& all) const
{
    for (const CheckRule& rule : m_rules) {
        if (!(rule.*function))
            continue;
        FindingList findings;
        (rule.*function)(subject, findings);
        for (Finding& finding : findings)
            finding.rule = rule.id;
        all += findings;
    }
}

FindingList Checker::check(const QList<TitlePaths::Folder>& folders, const Checked& checked) const
{
    FindingList all;
    int done = 0;
    for (const TitlePaths::Folder& folder : folders) {
        if (folder.isWhole)
            apply(&CheckRule::checkFolder, CheckedFolder(folder.path), all);
        for (const QString& title : folder.titles) {
            apply(&CheckRule::checkTitle, CheckedTitle(title), all);
            checked(++done);
        }
    }
    return all;
}
