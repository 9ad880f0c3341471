#pragma once

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QMap>
#include <QString>
#include <QStringList>
#include <cstdio>

// The record of an operator's actions and of what the window showed, one JSON object per line on standard
// output. Each line is written before the next action, so that it is complete when the process is killed.
class Journal
{
public:
    // The texts of a folder's titles by the stem of their files, and the order of the stems in the list.
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
