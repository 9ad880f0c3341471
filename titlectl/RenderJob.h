#pragma once

#include "library/PictureFiles.h"

#include <QByteArray>
#include <QString>
#include <optional>

// A title whose pictures are to be made.
struct RenderJob {
    QString title;  // path of the title file
    QString folder; // where the pictures go; empty: beside the title
    PictureFiles::Pictures pictures = PictureFiles::Pictures(PictureFiles::ALL);

    // Convert to and from one line of text, as it is passed to a worker. Returns nothing for a line that is
    // not a job.
    QByteArray toLine() const;
    static std::optional<RenderJob> fromLine(const QByteArray& line);
};
