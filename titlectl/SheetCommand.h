#pragma once

#include "titlectl/Command.h"

// titlectl sheet: the contact sheet of a folder, for the producer's desk.
class SheetCommand : public Command
{
public:
    QString name() const override { return QStringLiteral("sheet"); }
    QString summary() const override;
    Operands operands() const override { return {QStringLiteral("FOLDER OUT.pdf|OUT.png"), 2, 2}; }
    QList<CommandOption> options() const override { return {forceOption()}; }
    int run(const Arguments& arguments, Output& output) override;
};
