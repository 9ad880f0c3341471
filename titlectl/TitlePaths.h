#pragma once

#include <QList>
#include <QString>
#include <QStringList>

// Turns the paths of a command line into title files, folder by folder. Any thread.
class TitlePaths
{
public:
    struct Folder {
        QString path;         // absolute, without a final "/"
        QStringList titles;   // full paths, those of a whole folder in its order
        bool isWhole = false; // whether the folder itself was named, not single titles in it
    };

    // Resolves the paths: a title file, a folder of titles, or a folder of such folders. A folder that is
    // named in several ways appears once. If a path does not exist or is neither, isValid() is false and
    // error() says which.
    explicit TitlePaths(const QStringList& paths);

    bool isValid() const { return m_error.isEmpty(); }
    QString error() const { return m_error; }
    const QList<Folder>& folders() const { return m_folders; }
    QStringList folderPaths() const;
    // Returns the titles of all folders.
    QStringList titles() const;

    // Returns the titles of a folder in its order; by name if it has none that can be read. Rows that lead
    // elsewhere are left out, those whose files are missing are not.
    static QStringList titlesIn(const QString& folder);

private:
    void add(const QString& path);
    void addTitle(const QString& path);
    void addFolder(const QString& path);
    Folder& folder(const QString& path);

    QList<Folder> m_folders;
    QString m_error;
};
