#pragma once

#include "titlectl/Command.h"
#include "titlectl/Finding.h"

// titlectl check: what is wrong with titles, before they go on air.
class CheckCommand : public Command
{
public:
    QString name() const override { return QStringLiteral("check"); }
    QString summary() const override;
    Operands operands() const override { return {QStringLiteral("PATH..."), 0, ANY_NUMBER}; }
    QList<CommandOption> options() const override;
    int run(const Arguments& arguments, Output& output) override;

    // Returns "FILE: OBJECT: REASON [RULE]".
    static QString lineOf(const Finding& finding);
};
