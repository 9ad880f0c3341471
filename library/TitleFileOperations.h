// Makes the files of a new title in a folder, from a template or from a copy held in memory, and those of a
// user template. Has no widgets. GUI thread; nothing here waits for the disk to have written.
#pragma once

#include <QByteArray>
#include <QDateTime>
#include <QString>
#include <memory>

class Archive;
class ArchiveController;

// The pictures of a copied title as the bytes of their files, so that the copy survives its source.
struct TitlePictures {
    QByteArray big;
    QByteArray middle;
    QByteArray black;
    QByteArray small;
};

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
    static const QString TEMPLATE_STEM; // of the files of a user template

    // The controller is not owned and must outlive this object.
    explicit TitleFileOperations(ArchiveController& controller);

    // A stem that no title of the folder has: the time of creation, moved on by milliseconds when taken.
    static QString freeStem(const QString& folder, const QDateTime& now = QDateTime::currentDateTime());

    // Copies the template's pictures under new names and writes the title file. Null when the folder is empty
    // or the disk refuses the title file or its background; then nothing of it is left. A picture that is
    // refused is made when the title is opened.
    std::unique_ptr<Archive> createFromTemplate(const QString& folder, const Archive& source) const;

    // What createFromCopy needs besides the record; unreadable pictures stay empty.
    static TitlePictures loadPictures(const Archive& archive);

    // Writes the held pictures under new names, copies the background files while they still exist and writes
    // the title file. Null as above.
    std::unique_ptr<Archive> createFromCopy(const QString& folder, const Archive& copy,
                                            const TitlePictures& pictures) const;

    // Makes the folder of a user template of this name in the root and in it the title file, with copies of
    // the small picture and the background. The record's name is "<name>/Titler". Null as above, or when
    // there is no folder for it.
    std::unique_ptr<Archive> createUserTemplate(const QString& root, const QString& name,
                                                const Archive& source) const;

private:
    void renameRecord(Archive& archive, const QString& folder) const;

    ArchiveController& mController;
};
