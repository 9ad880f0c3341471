#pragma once

#include "titlectl/Command.h"

#include <QMap>
#include <QString>
#include <QStringList>
#include <optional>

class Archive;
class TitleStage;

// titlectl set: changes texts of a title and makes its pictures.
class SetCommand : public Command
{
public:
    using Changes = QMap<int, QString>; // the new characters by the text's id

    QString name() const override { return QStringLiteral("set"); }
    QString summary() const override;
    Operands operands() const override { return {QStringLiteral("PATH ID=TEXT..."), 2, ANY_NUMBER}; }
    QList<CommandOption> options() const override { return {forceOption()}; }
    int run(const Arguments& arguments, Output& output) override;

    // Reads words like "1=First line\nsecond line"; "\\" stands for a backslash. Returns nothing, with a
    // reason in error, if one is not of this form, or its text is blank or too long.
    static std::optional<Changes> parse(const QStringList& words, QString& error);

private:
    // Writes the title and its pictures to the stage. Returns what went wrong, or an empty string.
    static QString stageTitle(Archive archive, const TitleStage& stage);
    static int save(const Archive& archive, Output& output);
};
