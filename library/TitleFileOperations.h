#pragma once

#include <QByteArray>
#include <QDateTime>
#include <QString>
#include <memory>

class Archive;
class ArchiveController;

// The pictures of a copied title as the bytes of their files, which remain when the source is deleted.
struct TitlePictures {
    QByteArray big;
    QByteArray middle;
    QByteArray black;
    QByteArray small;
};

// Makes the files of a new title in a folder, from a template or from a copy held in memory, and the files of
// a user template. Has no widgets. GUI thread; nothing here waits until the disk has synced.
class TitleFileOperations
{
public:
    static const QString TIME_FORMATE;
    static const QString THUMBNAIL_BIG;
    static const QString THUMBNAIL_MIDDLE;
    static const QString THUMBNAIL_SMALL;
    static const QString THUMBNAIL_BLACK;
    static const QString THUMBNAIL_SOURCE;
    static const QString BG_SOURCE;
    static const QString BG_SOURCE_BIG;
    static const QString XML_EXTENSION;
    static const QString TEMPLATE_STEM; // stem of the file names of a user template

    // The controller is not owned and must outlive this object.
    explicit TitleFileOperations(ArchiveController& controller);

    // Returns a stem that no title of the folder has: the time of creation, increased by milliseconds while
    // it is in use.
    static QString freeStem(const QString& folder, const QDateTime& now = QDateTime::currentDateTime());

    // Copies the template's pictures under new names and writes the title file. Returns null, and leaves no
    // files, when the folder is empty or the title file or its background cannot be written. Other pictures
    // that cannot be written are made when the title is opened.
    std::unique_ptr<Archive> createFromTemplate(const QString& folder, const Archive& source) const;

    // Loads the pictures for createFromCopy(); unreadable ones stay empty.
    static TitlePictures loadPictures(const Archive& archive);

    // Writes the held pictures under new names, copies the background files if they still exist and writes
    // the title file. Returns null as createFromTemplate() does.
    std::unique_ptr<Archive> createFromCopy(const QString& folder, const Archive& copy,
                                            const TitlePictures& pictures) const;

    // Creates the folder of a user template of this name in the root, with the title file and copies of the
    // small picture and the background. The record's name is "<name>/Titler". Returns null as
    // createFromTemplate() does, or when the folder cannot be created.
    std::unique_ptr<Archive> createUserTemplate(const QString& root, const QString& name,
                                                const Archive& source) const;

private:
    void renameRecord(Archive& archive, const QString& folder) const;

    ArchiveController& m_controller;
};
