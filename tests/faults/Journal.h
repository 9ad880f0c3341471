// What an operator has done and seen, as one JSON object a line on standard output. A line is out before the
// next thing is done, so that it is there when the process is killed.
#pragma once

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QMap>
#include <QString>
#include <QStringList>
#include <cstdio>

class Journal
{
public:
    // The texts of the titles of a folder by the stem of their files, and their order in the list.
    struct Folder {
        QStringList order;
        QMap<QString, QStringList> texts;
        bool operator==(const Folder&) const = default;
    };
    using Folders = QMap<QString, Folder>;

    static void write(const QJsonObject& line)
    {
        const QByteArray text = QJsonDocument(line).toJson(QJsonDocument::Compact) + '\n';
        std::fwrite(text.constData(), 1, std::size_t(text.size()), stdout);
        std::fflush(stdout);
    }

    static QJsonObject toJson(const Folders& folders)
    {
        QJsonObject all;
        for (auto folder = folders.begin(); folder != folders.end(); ++folder) {
            QJsonArray titles;
            for (const QString& stem : folder->order)
                titles.append(QJsonObject{{"stem", stem},
                                          {"texts", QJsonArray::fromStringList(folder->texts.value(stem))}});
            all.insert(folder.key(), titles);
        }
        return all;
    }
};
