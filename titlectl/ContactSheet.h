#pragma once

#include <QSize>
#include <QString>
#include <QStringList>
#include <functional>

class QPainter;

// The contact sheet of a folder: its titles with their names, in order, on pages of A4 across. GUI thread
// only.
class ContactSheet
{
public:
    // Called after each title that was drawn.
    using Drawn = std::function<void(int done)>;

    // heading stands on every page; titles are paths of title files.
    ContactSheet(QString heading, QStringList titles);

    // Writes the sheet, as PDF or, for any other suffix, as pictures: one file, or for several pages one for
    // each with its number before the suffix. Files are replaced when they are complete. Returns what went
    // wrong, or an empty string.
    QString write(const QString& path, const Drawn& drawn);

    // Returns the titles that were drawn as an empty box, since neither a picture nor the title could be
    // read.
    const QStringList& unreadable() const { return m_unreadable; }
    int pages() const;
    // Returns the path of a page among several that are pictures.
    static QString pagePath(const QString& path, int page, int pages);

private:
    QString writePdf(const QString& path, const Drawn& drawn);
    QString writePictures(const QString& path, const Drawn& drawn);
    void drawPage(QPainter& painter, int page, const Drawn& drawn);
    void drawTitle(QPainter& painter, int index, int place);

    QString m_heading;
    QStringList m_titles;
    QStringList m_unreadable;
};
