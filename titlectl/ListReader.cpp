#include "titlectl/ListReader.h"

#include "titlectl/CsvReader.h"
#include "titlectl/JsonListReader.h"
#include "titlectl/XlsxReader.h"

#include <QFile>
#include <QFileInfo>
#include <QString>

ListReader::Format ListReader::formatOf(const QString& path)
{
    const QString ending = QFileInfo(path).suffix().toLower();
    if (ending == QLatin1String("json"))
        return Format::Json;
    return ending == QLatin1String("xlsx") ? Format::Xlsx : Format::Csv;
}

ListTable ListReader::read(const QString& path)
{
    ListTable refused;
    // Opening a pipe would wait for its other end.
    const QFileInfo info(path);
    QFile file(path);
    if (!info.isFile()) {
        refused.fail(info.exists() ? QStringLiteral("It is not a file")
                                   : QStringLiteral("There is no such file"));
    } else if (info.size() > ListTable::FILE_LIMIT) {
        refused.fail(QStringLiteral("The file is longer than %1 bytes").arg(ListTable::FILE_LIMIT));
    } else if (!file.open(QIODevice::ReadOnly)) {
        refused.fail(file.errorString());
    } else {
        switch (formatOf(path)) {
        case Format::Json:
            // The file may grow while it is read.
            return JsonListReader::read(file.read(ListTable::FILE_LIMIT));
        case Format::Xlsx:
            return XlsxReader::read(path);
        case Format::Csv:
            return CsvReader::read(file);
        }
    }
    return refused;
}
