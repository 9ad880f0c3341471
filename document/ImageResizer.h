// Makes the small variants of a picture. Paths are wide strings; formats are those of Qt, chosen by
// extension, and JPEG under the extension ".jpe" besides. Any thread; made on the stack for a job.
#pragma once

#include <QImage>
#include <string>
#include <utility>

class ImageResizer
{
public:
    // Looks the folder of the checker pictures up.
    ImageResizer();

    // From here on pictures that the disk refuses are kept for this title (PngWriter::saveOrKeep), and no
    // save waits for the disk to sync.
    void keepRefusedFor(std::string title) { mTitle = std::move(title); }

    // Reduces the picture at source by four in each direction and saves it twice: over black to blackPath,
    // and over the checker picture to smallPath (opaque pictures are the same in both). width and height are
    // those of the result. True when both files are written; a missing checker makes the second save fail.
    bool resizeImageToThumbnail(std::wstring& source, std::wstring& blackPath, std::wstring& smallPath,
                                unsigned width, unsigned height);

    // The same for a picture in memory, with the result that saving and loading it as PNG first would give.
    bool resizeImageToThumbnail(const QImage& source, const std::wstring& blackPath,
                                const std::wstring& smallPath, unsigned width, unsigned height);

    // Whether Qt can load the file.
    bool isAvailableImage(std::wstring path);

    // Size in pixels; 0 when the picture cannot be loaded.
    int getImageWidth(std::wstring& path);
    int getImageHeight(std::wstring& path);

    // Each target pixel is the mean of the first two lines of its block of 4 x 4 source pixels, channel by
    // channel. For RGB32 and ARGB32 pictures; blocks that do not lie in both pictures are left out.
    void scaledToQuaterSizeWithAAF(QImage& source, QImage& target);

    // Whether the file name ends in ".jpe", whatever the case of its letters.
    bool checkJPE(std::wstring path);

    // The name under which a ".jpe" file is saved before it is renamed; empty when the path has no extension.
    std::wstring changeJPEToJPEG(std::wstring path);

private:
    bool resizeImageToThumbnailImageWithNotAlpha(const std::wstring& path, const QImage& reduced);
    bool resizeImageToThumbnailTitlerWithNotAlpha(const std::wstring& path, const QImage& reduced);
    bool resizeImageToThumbnailImageWithAlpha(const std::wstring& path, const QImage& reduced);
    bool resizeImageToThumbnailTitlerWithAlpha(const std::wstring& path, const QImage& composed);
    bool save(const QImage& image, const std::wstring& path);

    std::string mTitle; // empty: what the disk refuses is not kept

    static std::string checkerFname_in_title;
    static std::string checkerFname_in_logo;
};
