#pragma once

#include "document/Archive.h"

#include <QDateTime>
#include <QString>
#include <memory>

class TitleInk;
class PictureStates;

// A title as it is on the disk, for the rules of the check. GUI thread only.
class CheckedTitle
{
public:
    explicit CheckedTitle(QString path);
    ~CheckedTitle();
    CheckedTitle(const CheckedTitle&) = delete;
    CheckedTitle& operator=(const CheckedTitle&) = delete;

    const QString& path() const { return m_path; }
    // Returns whether the file could be read; if not, the record is empty.
    bool isReadable() const { return m_isReadable; }
    const Archive& archive() const { return m_archive; }
    // Return what the texts draw and what is wrong with the picture files; found out when it is first asked
    // for.
    const TitleInk& ink() const;
    const PictureStates& pictures() const;

private:
    QString m_path;
    Archive m_archive;
    QDateTime m_changed;
    bool m_isReadable = false;
    mutable std::unique_ptr<TitleInk> m_ink;
    mutable std::unique_ptr<PictureStates> m_pictures;
};
