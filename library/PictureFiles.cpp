#include "library/PictureFiles.h"

#include "document/Archive.h"
#include "document/ImageResizer.h"
#include "document/PngWriter.h"
#include "library/PictureThread.h"
#include "library/TitlerUtility.h"

#include <future>

QString PictureFiles::path(const Archive& archive, const std::string& name)
{
    return QString::fromStdString(TitlerUtility::getPicturePathFromTitlePath(archive.getPath(), name));
}

bool PictureFiles::write(const Archive& archive, const QImage& big, const QImage& middle, Pictures pictures)
{
    const std::string title = archive.getPath();
    bool isWritten = true;
    // The big picture takes four fifths of the time, so it is written in a thread of its own. A picture that
    // cannot be written is kept or skipped; the others are still useful.
    std::future<bool> bigWritten;
    if (pictures.testFlag(Big)) {
        bigWritten = std::async(std::launch::async, [&] {
            return PngWriter::saveOrKeep(big, path(archive, archive.getThumbnailBig()), title);
        });
    }
    if (pictures.testFlag(Middle))
        isWritten = PngWriter::saveOrKeep(middle, path(archive, archive.getThumbnailMiddle()), title);
    if (pictures.testFlag(Reduced)) {
        const QSize size = PictureThread::THUMBNAIL_SMALL_SIZE;
        ImageResizer resizer;
        resizer.keepRefusedFor(title);
        const bool areReduced = resizer.resizeImageToThumbnail(
            middle, path(archive, archive.getThumbnailBlack()).toStdWString(),
            path(archive, archive.getThumbnailSmall()).toStdWString(), static_cast<unsigned>(size.width()),
            static_cast<unsigned>(size.height()));
        isWritten = areReduced && isWritten;
    }
    return (!bigWritten.valid() || bigWritten.get()) && isWritten;
}
