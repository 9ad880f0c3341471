#include "titlectl/SetCommand.h"

#include "canvas/TextObjectConstants.h"
#include "document/Archive.h"
#include "document/TitleParser.h"
#include "support/FileSyncQueue.h"
#include "titlectl/Arguments.h"
#include "titlectl/FolderLocks.h"
#include "titlectl/Output.h"
#include "titlectl/TitleDescription.h"
#include "titlectl/TitlePaths.h"
#include "titlectl/TitleRenderer.h"
#include "titlectl/TitleStage.h"
#include "titlectl/TitleTexts.h"

#include <QFileInfo>
#include <QJsonDocument>
#include <cerrno>
#include <chrono>
#include <cstring>

namespace
{

constexpr std::chrono::seconds SYNC_LIMIT(60);

// Returns the text with "\n" and "\\" replaced by what they stand for.
QString unescaped(const QString& text)
{
    QString result;
    for (qsizetype i = 0; i < text.size(); ++i) {
        const bool isEscape = text.at(i) == QLatin1Char('\\') && i + 1 < text.size();
        const QChar next = isEscape ? text.at(i + 1) : QChar();
        if (next == QLatin1Char('n') || next == QLatin1Char('\\')) {
            result += next == QLatin1Char('n') ? QLatin1Char('\n') : next;
            ++i;
        } else {
            result += text.at(i);
        }
    }
    return result;
}

// Line breaks are not counted, as on the canvas.
bool isTooLong(const QString& text)
{
    return text.size() - text.count(QLatin1Char('\n')) > TextObjectConstants::CHARACTER_LIMIT;
}

} // namespace

QString SetCommand::summary() const
{
    return QStringLiteral("changes texts of a title, keeps their styles, and makes the pictures");
}

std::optional<SetCommand::Changes> SetCommand::parse(const QStringList& words, QString& error)
{
    Changes changes;
    for (const QString& word : words) {
        const qsizetype equals = word.indexOf(QLatin1Char('='));
        bool isNumber = false;
        const int id = word.left(qMax<qsizetype>(equals, 0)).toInt(&isNumber);
        const QString text = unescaped(word.mid(equals + 1));
        if (!isNumber)
            error = QStringLiteral("%1 is not of the form ID=TEXT").arg(word);
        else if (text.trimmed().isEmpty())
            error = QStringLiteral("text %1 would be blank; such a text is deleted in the titler").arg(id);
        else if (isTooLong(text))
            error = QStringLiteral("text %1 has more than %2 characters")
                        .arg(id)
                        .arg(TextObjectConstants::CHARACTER_LIMIT);
        else
            changes.insert(id, text);
        if (!error.isEmpty())
            return std::nullopt;
    }
    return changes;
}

int SetCommand::run(const Arguments& arguments, Output& output)
{
    const auto refuse = [&output](const QString& reason) {
        output.message(reason);
        return WrongUse;
    };
    QString error;
    const std::optional<Changes> changes = parse(arguments.operands().mid(1), error);
    if (!changes)
        return refuse(error);
    const TitlePaths paths(QStringList{arguments.operands().first()});
    if (!paths.isValid())
        return refuse(paths.error());
    if (paths.folders().first().isWhole)
        return refuse(QStringLiteral("%1 is a folder, not a title").arg(arguments.operands().first()));
    FolderLocks locks;
    const auto inUse = arguments.has(FORCE) ? FolderLocks::InUse::GoOn : FolderLocks::InUse::Refuse;
    if (!locks.take(paths.folderPaths(), FolderLock::Kind::Exclusive, inUse, output))
        return WrongUse;
    const QString file = paths.titles().first();
    Archive archive;
    if (TitleParser().readOneTitle(file.toStdString(), &archive) != 1) {
        output.message(QStringLiteral("%1: the title cannot be read").arg(file));
        return Findings;
    }
    for (auto change = changes->begin(); change != changes->end(); ++change) {
        TText* text = TitleTexts::find(archive, change.key());
        if (!text)
            return refuse(QStringLiteral("%1 has no text %2").arg(file).arg(change.key()));
        TitleTexts::replace(*text, change.value());
    }
    return save(archive, output);
}

QString SetCommand::stageTitle(Archive archive, const TitleStage& stage)
{
    if (!stage.isValid())
        return stage.error();
    // Drawn first, since the record names its background beside the title.
    const QList<QImage> images = TitleRenderer().draw(archive);
    const QString file = QFileInfo(QString::fromStdString(archive.getPath())).fileName();
    archive.setPath((stage.path() + QLatin1Char('/') + file).toStdString());
    if (TitleParser().writeOneTitle(&archive) != 1)
        return QString::fromLocal8Bit(std::strerror(errno));
    return TitleRenderer::write(archive, images, PictureFiles::Pictures(PictureFiles::ALL));
}

int SetCommand::save(const Archive& archive, Output& output)
{
    const QFileInfo file(QString::fromStdString(archive.getPath()));
    const TitleStage newFiles(file.path());
    QString error = stageTitle(archive, newFiles);
    if (error.isEmpty() && !FileSyncQueue::flush(SYNC_LIMIT))
        error = QStringLiteral("the disk does not take the files");
    if (error.isEmpty())
        error = newFiles.place();
    if (!error.isEmpty()) {
        output.message(QStringLiteral("%1: %2").arg(file.filePath(), error));
        return Findings;
    }
    const TitleDescription title(archive);
    const QStringList lines = title.lines();
    for (const QString& line : lines)
        output.line(line);
    output.json(QJsonDocument(title.json()));
    return Success;
}
