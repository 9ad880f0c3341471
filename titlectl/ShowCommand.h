#pragma once

#include "titlectl/Command.h"

// titlectl show: a title as lines or JSON.
class ShowCommand : public Command
{
public:
    QString name() const override { return QStringLiteral("show"); }
    QString summary() const override;
    Operands operands() const override { return {QStringLiteral("PATH"), 1, 1}; }
    QList<CommandOption> options() const override { return {}; }
    int run(const Arguments& arguments, Output& output) override;
};
