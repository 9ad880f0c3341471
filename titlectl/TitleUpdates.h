#pragma once

#include "document/FolderOrder.h"
#include "titlectl/ListPlan.h"

#include <QList>
#include <QString>
#include <QStringList>
#include <functional>
#include <memory>
#include <string>
#include <vector>

class Archive;
class TitleStage;

// Makes the titles of a plan in their folder, each with all of its files or none, and names the new ones at
// the end of the order of the folder. GUI thread only.
class TitleUpdates
{
public:
    // Titles whose files are completed before the first of them is moved into the folder.
    static constexpr int BATCH = 256;

    // All are kept as references. The folder exists and is locked for this program.
    TitleUpdates(const ListPlan& plan, const Archive& sample, const QString& folder);

    // Makes the titles of all rows that are not wrong, in as many processes. Calls oneDone after each.
    // Returns for each row of the plan what went wrong with it, or an empty string.
    QStringList make(int processes, const std::function<void()>& oneDone);

private:
    void makeBatch(const TitleStage& stage, const QList<int>& rows, int processes,
                   const std::function<void()>& oneDone);
    QString stageTitle(const TitleStage& stage, int row) const;
    QString stageBackground(Archive& title, int row) const;
    std::string fileOf(qsizetype row) const;
    std::vector<ArchiveOrder> orderBefore(bool isWhole) const;
    void nameNewTitles();

    const ListPlan& m_plan;
    const Archive& m_sample;
    const QString& m_folder;
    QStringList m_errors;
};
