#pragma once

#include "titlectl/Command.h"
#include "titlectl/RenderJob.h"
#include "titlectl/TitlePaths.h"

#include <QList>
#include <QStringList>
#include <optional>

// titlectl render: makes the pictures of titles anew.
class RenderCommand : public Command
{
public:
    QString name() const override { return QStringLiteral("render"); }
    QString summary() const override;
    Operands operands() const override { return {QStringLiteral("PATH..."), 1, ANY_NUMBER}; }
    QList<CommandOption> options() const override;
    int run(const Arguments& arguments, Output& output) override;

    // Returns the pictures that a value of --only stands for; nothing for any other text.
    static std::optional<PictureFiles::Pictures> picturesOf(const QString& only);
    // Returns one job for each title. With a folder for the pictures, each of several title folders gets a
    // folder of its name in it.
    static QList<RenderJob> jobsFor(const QList<TitlePaths::Folder>& folders, const QString& out,
                                    PictureFiles::Pictures pictures);

private:
    static int report(const QList<RenderJob>& jobs, const QStringList& errors, Output& output);
};
