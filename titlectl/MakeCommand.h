#pragma once

#include "titlectl/Command.h"
#include "titlectl/ListPlan.h"

#include <QStringList>

// titlectl make: makes a title of a template for each row of a list.
class MakeCommand : public Command
{
public:
    QString name() const override { return QStringLiteral("make"); }
    QString summary() const override;
    Operands operands() const override { return {QStringLiteral("TEMPLATE LIST FOLDER"), 3, 3}; }
    QList<CommandOption> options() const override;
    int run(const Arguments& arguments, Output& output) override;

private:
    // What comes of the rows: as planned, or with what went wrong when they were made.
    static int report(const ListPlan& plan, const QStringList& errors, bool isDone, Output& output);
};
