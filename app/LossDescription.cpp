#include "app/LossDescription.h"

#include "document/Archive.h"
#include "document/ArchiveController.h"
#include "document/TText.h"
#include "document/TitleParser.h"

#include <QFileInfo>
#include <QStringList>

namespace
{

constexpr int MOST_NAMED = 5;
constexpr int LONGEST_TEXT = 40; // characters

} // namespace

QString LossDescription::titleName(const std::string& path)
{
    const QString file = QString::fromStdString(path);
    Archive title;
    if (ArchiveController().getOneArchive(file, &title)) {
        for (const TText* text : title.text()) {
            const QString words = QString::fromStdString(text->getText()).simplified();
            if (words.size() > LONGEST_TEXT)
                return words.left(LONGEST_TEXT) + QStringLiteral("...");
            if (!words.isEmpty())
                return words;
        }
    }
    return QFileInfo(file).completeBaseName();
}

QString LossDescription::of(const std::vector<RefusedWrites::File>& files)
{
    QStringList items;
    for (const RefusedWrites::File& file : files) {
        const QFileInfo info(QString::fromStdString(file.path));
        QString item;
        if (!file.title.empty())
            item = tr("the pictures of \"%1\"").arg(titleName(file.title));
        else if (info.fileName() == QLatin1String(TitleParser::ORDER_FILEPATH))
            item = tr("the order of the titles in \"%1\"").arg(QFileInfo(info.path()).fileName());
        else
            item = tr("the title \"%1\"").arg(titleName(file.path));
        if (!items.contains(item))
            items.append(item);
    }
    const qsizetype count = items.size();
    if (count > MOST_NAMED) {
        items = items.mid(0, MOST_NAMED);
        items.append(tr("%1 more").arg(count - MOST_NAMED));
    }
    return tr("Not saved: %1").arg(items.join(QStringLiteral(", ")));
}
