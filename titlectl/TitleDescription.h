#pragma once

#include <QJsonObject>
#include <QString>
#include <QStringList>

class Archive;

// A title's record as JSON and as lines of text.
class TitleDescription
{
public:
    // Keeps a reference to the record.
    explicit TitleDescription(const Archive& archive) : m_archive(archive) {}

    // Places are canvas pixels (1280x720), sizes and outline widths pixels of the 1920 raster. Characters of
    // the same style make one run.
    QJsonObject json() const;
    QStringList lines() const;

private:
    const Archive& m_archive;
};
