#pragma once

#include "titlectl/CheckRule.h"
#include "titlectl/TitlePaths.h"

#include <QList>
#include <QStringList>
#include <functional>

// Checks titles and folders by the rules that are switched on. GUI thread only.
class Checker
{
public:
    // Called after each title with how many are done.
    using Checked = std::function<void(int done)>;

    // Switches all rules on.
    Checker();

    const QList<CheckRule>& rules() const { return m_rules; }
    // Switches a rule off. Returns false if there is none with this id.
    bool switchOff(const QString& id);

    // Returns the findings of all rules, folder by folder and title by title.
    FindingList check(const QList<TitlePaths::Folder>& folders, const Checked& checked) const;

private:
    template <typename Subject>
    void apply(void (*CheckRule::*function)(const Subject&, FindingList&), const Subject& subject,
               FindingList& all) const;

    QList<CheckRule> m_rules;
};
